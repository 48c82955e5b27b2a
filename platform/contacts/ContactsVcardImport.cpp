#include "ContactsVcardImport.h"

#include "ContactsDebug.h"
#include "ContactsVcardLexer.h"
#include "DataDir.h"
#include "contacts_record.h"
#include "contacts_views.h"

#include <glib.h>
#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

namespace ct::contacts {
namespace {

const char kPictureFolder[] = "images";

std::string extensionOf(const char* format)
{
	std::string ext = format;
	for (char& c : ext)
		c = static_cast<char>(tolower(static_cast<unsigned char>(c)));
	return ext == "jpeg" ? ".jpg" : "." + ext;
}

// "card 3 (line 40, Anna)": the FN as written, when it is short and readable.
std::string cardLabel(int index, const VcardRawCard& card, const std::string& name)
{
	std::string label = "card " + std::to_string(index) + " (line " + std::to_string(card.line);
	std::string fn = name;
	for (const VcardProperty& p : card.properties)
		if (fn.empty() && p.name == "FN" && p.value.size() <= 80 && p.param("ENCODING").empty()
			&& g_utf8_validate(p.value.c_str(), static_cast<gssize>(p.value.size()), nullptr))
			fn = p.value;
	return label + (fn.empty() ? "" : ", " + fn) + ")";
}

int writeAll(int fd, const std::string& bytes)
{
	for (size_t done = 0; done < bytes.size();) {
		ssize_t n = write(fd, bytes.data() + done, bytes.size() - done);
		if (n < 0 && errno == EINTR)
			continue;
		if (n <= 0)
			return n < 0 ? -errno : -EIO;
		done += static_cast<size_t>(n);
	}
	return 0;
}

int contactsErrorOfErrno(int err)
{
	return err == -ENOSPC ? CONTACTS_ERROR_FILE_NO_SPACE
		: err == -EACCES || err == -EROFS ? CONTACTS_ERROR_PERMISSION_DENIED
										  : CONTACTS_ERROR_SYSTEM;
}

std::string writeFailure(int err)
{
	switch (err) {
	case CONTACTS_ERROR_FILE_NO_SPACE: return "the disk is full";
	case CONTACTS_ERROR_DB_LOCKED: return "another program holds the contacts database";
	case CONTACTS_ERROR_PERMISSION_DENIED: return "the contacts database or the picture folder cannot be written";
	default: return "the contacts database refused the write (" + std::to_string(err) + ")";
	}
}

VcardImportReport failedReport(int error, const std::string& text)
{
	VcardImportReport report;
	report.error = error;
	report.errorText = text;
	return report;
}

} // namespace

ContactsVcardImport::ContactsVcardImport(ContactsConnection& conn, int addressBookId)
	: m_conn(conn), m_addressBookId(addressBookId)
{
}

ContactsVcardImport::~ContactsVcardImport() = default;

VcardImportReport ContactsVcardImport::importFile(const std::string& path, int addressBookId)
{
	GError* error = nullptr;
	GMappedFile* file = g_mapped_file_new(path.c_str(), FALSE, &error);
	if (!file) {
		std::string why = error ? error->message : "cannot be read";
		g_clear_error(&error);
		WFAILED("g_mapped_file_new", CONTACTS_ERROR_INVALID_PARAMETER);
		return failedReport(CONTACTS_ERROR_INVALID_PARAMETER, why);
	}
	size_t size = g_mapped_file_get_length(file);
	VcardImportReport report = size > kMaxFileBytes
		? failedReport(CONTACTS_ERROR_INVALID_PARAMETER,
			"the file is larger than " + std::to_string(kMaxFileBytes >> 20) + " MB")
		: importText(std::string_view(g_mapped_file_get_contents(file) ? g_mapped_file_get_contents(file) : "", size),
			addressBookId);
	g_mapped_file_unref(file);
	return report;
}

VcardImportReport ContactsVcardImport::importText(std::string_view text, int addressBookId)
{
	WENTER();
	ContactsConnection* conn = ContactsConnection::current();
	if (!conn)
		return failedReport(CONTACTS_ERROR_DB, "the contacts database is not open");
	size_t cards = ContactsVcardLexer::countCards(text);
	if (cards == 0)
		return failedReport(CONTACTS_ERROR_INVALID_PARAMETER, "the file holds no vCard");
	if (cards > kMaxCards)
		return failedReport(CONTACTS_ERROR_INVALID_PARAMETER, "the file holds " + std::to_string(cards)
			+ " cards; at most " + std::to_string(kMaxCards) + " are imported at once");
	ContactsVcardImport import(*conn, addressBookId);
	std::string why;
	if (int err = import.__checkAddressBook(&why); err != CONTACTS_ERROR_NONE)
		return failedReport(err, why);
	VcardImportReport report;
	int err = conn->write([&](WriteContext& ctx) { return import.__importAll(text, ctx, report); });
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("import", err);
		import.__removeSavedPictures();
		VcardImportReport failed = failedReport(err, "nothing was stored: " + writeFailure(err));
		failed.cards = report.cards;
		return failed;
	}
	return report;
}

int ContactsVcardImport::__checkAddressBook(std::string* why)
{
	CachedStatement st(m_conn.statement("SELECT mode, name FROM address_books WHERE id = ?"));
	if (st->bind(1, m_addressBookId).step() != SQLITE_ROW) {
		*why = "there is no address book " + std::to_string(m_addressBookId);
		return CONTACTS_ERROR_INVALID_PARAMETER;
	}
	std::string name = st->columnText(1);
	if (st->columnInt(0) == CONTACTS_ADDRESS_BOOK_MODE_READONLY) {
		*why = "address book " + std::to_string(m_addressBookId) + " is read-only";
		return CONTACTS_ERROR_PERMISSION_DENIED;
	}
	if (name == CONTACTS_SIM1_ADDRESS_BOOK_NAME || name == CONTACTS_SIM2_ADDRESS_BOOK_NAME) {
		*why = "address book " + std::to_string(m_addressBookId) + " is a SIM card; import into the phone instead";
		return CONTACTS_ERROR_NOT_SUPPORTED;
	}
	return CONTACTS_ERROR_NONE;
}

int ContactsVcardImport::__importAll(std::string_view text, WriteContext& ctx, VcardImportReport& report)
{
	ContactsWriter writer(m_conn, ctx);
	ContactsVcardLexer lexer(text);
	VcardRawCard card;
	VcardEntry entry;
	while (lexer.next(card)) {
		++report.cards;
		std::string refusal;
		if (!ContactsVcardReader::read(card, entry, &refusal)) {
			report.refused.push_back(cardLabel(report.cards, card, "") + ": " + refusal);
			continue;
		}
		int id = 0;
		int err = __store(entry, writer, ctx, &id);
		if (err != CONTACTS_ERROR_NONE)
			return err;
		report.contactIds.push_back(id);
	}
	return CONTACTS_ERROR_NONE;
}

int ContactsVcardImport::__store(VcardEntry& entry, ContactsWriter& writer, WriteContext& ctx, int* id)
{
	contacts_record_h contact = entry.contact.get();
	contacts_record_set_int(contact, _contacts_contact.address_book_id, m_addressBookId);
	std::string path;
	for (const VcardPicture& picture : entry.pictures) {
		if (int err = __savePicture(picture, &path); err != CONTACTS_ERROR_NONE)
			return err;
		contacts_record_h image = nullptr;
		contacts_record_create(_contacts_image._uri, &image);
		contacts_record_set_str(image, _contacts_image.path, path.c_str());
		contacts_record_add_child_record(contact, _contacts_contact.image, image);
	}
	for (const auto& [company, logo] : entry.logos) {
		if (int err = __savePicture(logo, &path); err != CONTACTS_ERROR_NONE)
			return err;
		contacts_record_set_str(company, _contacts_company.logo, path.c_str());
	}
	for (const std::string& group : entry.groups) {
		int groupId = 0;
		if (int err = __groupId(group, writer, &groupId); err != CONTACTS_ERROR_NONE)
			return err;
		contacts_record_h relation = nullptr;
		contacts_record_create(_contacts_group_relation._uri, &relation);
		contacts_record_set_int(relation, _contacts_group_relation.group_id, groupId);
		contacts_record_add_child_record(contact, _contacts_contact.group_relation, relation);
	}
	// The record goes right after this card; what the commit would write
	// back into it (its new ids) must not outlive it.
	size_t hooks = ctx.onCommit.size();
	int err = writer.insert(*contact, id);
	ctx.onCommit.erase(ctx.onCommit.begin() + static_cast<std::ptrdiff_t>(hooks), ctx.onCommit.end());
	return err;
}

int ContactsVcardImport::__savePicture(const VcardPicture& picture, std::string* path)
{
	std::string folder = platform::dataPath(kPictureFolder);
	if (int err = platform::makeDirectories(folder); err < 0) {
		WFAILED("makeDirectories", err);
		return contactsErrorOfErrno(err);
	}
	*path = folder + "/vcard_XXXXXX" + extensionOf(picture.format);
	int fd = g_mkstemp_full(path->data(), O_WRONLY | O_CLOEXEC, 0644);
	if (fd < 0) {
		int err = -errno;
		WFAILED("g_mkstemp", err);
		return contactsErrorOfErrno(err);
	}
	m_savedPictures.push_back(*path);
	int err = writeAll(fd, picture.bytes);
	if (close(fd) != 0 && err == 0)
		err = -errno;
	if (err < 0) {
		WFAILED("write", err);
		return contactsErrorOfErrno(err);
	}
	return CONTACTS_ERROR_NONE;
}

int ContactsVcardImport::__groupId(const std::string& name, ContactsWriter& writer, int* id)
{
	if (auto known = m_groupIds.find(name); known != m_groupIds.end()) {
		*id = known->second;
		return CONTACTS_ERROR_NONE;
	}
	{
		CachedStatement st(m_conn.statement("SELECT id FROM groups WHERE address_book_id = ? AND name = ? ORDER BY id LIMIT 1"));
		if (st->bind(1, m_addressBookId).bind(2, name).step() == SQLITE_ROW) {
			*id = m_groupIds[name] = st->columnInt(0);
			return CONTACTS_ERROR_NONE;
		}
	}
	contacts_record_h group = nullptr;
	contacts_record_create(_contacts_group._uri, &group);
	m_newGroups.emplace_back(group);
	contacts_record_set_int(group, _contacts_group.address_book_id, m_addressBookId);
	contacts_record_set_str(group, _contacts_group.name, name.c_str());
	int err = writer.insert(*group, id);
	if (err == CONTACTS_ERROR_NONE)
		m_groupIds[name] = *id;
	return err;
}

void ContactsVcardImport::__removeSavedPictures()
{
	for (const std::string& path : m_savedPictures)
		unlink(path.c_str());
	m_savedPictures.clear();
}

} // namespace ct::contacts
