#include "ContactsPersons.h"

#include "ContactsDebug.h"

#include <glib.h>

#include <set>
#include <vector>

namespace ct::contacts {
namespace {

const contacts_record_s* firstChild(const contacts_record_s& record, const char* prop)
{
	const auto* list = record.children(prop);
	return list && !list->empty() ? list->front() : nullptr;
}

void appendWord(std::string& out, const char* word)
{
	if (!word || !*word)
		return;
	if (!out.empty())
		out += ' ';
	out += word;
}

std::string fullName(const contacts_record_s& name, int order)
{
	std::string out;
	appendWord(out, name.getStr("prefix"));
	if (order == CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST) {
		appendWord(out, name.getStr("last"));
		appendWord(out, name.getStr("first"));
		appendWord(out, name.getStr("addition"));
	} else {
		appendWord(out, name.getStr("first"));
		appendWord(out, name.getStr("addition"));
		appendWord(out, name.getStr("last"));
	}
	const char* suffix = name.getStr("suffix");
	if (suffix && *suffix)
		out += out.empty() ? suffix : std::string(", ") + suffix;
	return out;
}

struct ContactRow {
	int id;
	int addressBookId;
	bool favorite, hasNumber, hasEmail;
	std::string ringtone, vibration, alert, thumbnail;
	bool hasRingtone, hasVibration, hasAlert, hasThumbnail;
	std::string displayName;
};

std::vector<ContactRow> contactRows(ContactsConnection& conn, int personId)
{
	std::vector<ContactRow> rows;
	CachedStatement st(conn.statement(
		"SELECT id, address_book_id, is_favorite, has_phonenumber, has_email, ringtone_path, vibration, "
		"message_alert, image_thumbnail_path, display_name FROM contacts WHERE person_id = ? ORDER BY id"));
	st->bind(1, personId);
	while (st->step() == SQLITE_ROW) {
		ContactRow r;
		r.id = st->columnInt(0);
		r.addressBookId = st->columnInt(1);
		r.favorite = st->columnInt(2);
		r.hasNumber = st->columnInt(3);
		r.hasEmail = st->columnInt(4);
		r.hasRingtone = !st->columnIsNull(5);
		r.ringtone = st->columnText(5);
		r.hasVibration = !st->columnIsNull(6);
		r.vibration = st->columnText(6);
		r.hasAlert = !st->columnIsNull(7);
		r.alert = st->columnText(7);
		r.hasThumbnail = !st->columnIsNull(8);
		r.thumbnail = st->columnText(8);
		r.displayName = st->columnText(9);
		rows.push_back(r);
	}
	return rows;
}

// The value of the display contact, else the first contact's that has one.
template <typename Has, typename Get>
const std::string* pick(const std::vector<ContactRow>& rows, const ContactRow& display, Has has, Get get)
{
	if (has(display))
		return &get(display);
	for (const ContactRow& r : rows)
		if (has(r))
			return &get(r);
	return nullptr;
}

void bindOptional(db::Statement& st, int index, const std::string* text)
{
	if (text)
		st.bind(index, *text);
	else
		st.bindNull(index);
}

} // namespace

DisplayName ContactsPersons::displayNameOf(const contacts_record_s& record, int order)
{
	DisplayName d;
	if (const contacts_record_s* name = firstChild(record, "name")) {
		d.text = fullName(*name, order);
		if (!d.text.empty()) {
			d.source = CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NAME;
			return d;
		}
	}
	struct Fallback {
		const char* child;
		const char* prop;
		int source;
	};
	static const Fallback fallbacks[] = {
		{ "nickname", "name", CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NICKNAME },
		{ "company", "name", CONTACTS_DISPLAY_NAME_SOURCE_TYPE_COMPANY },
		{ "number", "number", CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NUMBER },
		{ "email", "email", CONTACTS_DISPLAY_NAME_SOURCE_TYPE_EMAIL },
	};
	for (const Fallback& f : fallbacks) {
		const contacts_record_s* child = firstChild(record, f.child);
		const char* text = child ? child->getStr(f.prop) : nullptr;
		if (text && *text) {
			d.text = text;
			d.source = f.source;
			return d;
		}
	}
	return d;
}

ContactSummary ContactsPersons::summaryOf(const contacts_record_s& contact, int order)
{
	ContactSummary s;
	s.name = displayNameOf(contact, order);
	s.hasNumber = !contact.children("number")->empty();
	s.hasEmail = !contact.children("email")->empty();
	const auto* images = contact.children("image");
	const char* thumbnail = images->empty() ? nullptr : images->front()->getStr("path");
	for (const contacts_record_s* image : *images)
		if (image->getInt("is_default"))
			thumbnail = image->getStr("path");
	if (thumbnail)
		s.thumbnail = thumbnail;
	return s;
}

std::string ContactsPersons::indexOf(const std::string& displayName)
{
	if (displayName.empty())
		return "#";
	gunichar c = g_utf8_get_char_validated(displayName.c_str(), static_cast<gssize>(displayName.size()));
	if (c == static_cast<gunichar>(-1) || c == static_cast<gunichar>(-2) || !g_unichar_isalpha(c))
		return "#";
	char buf[8] = {};
	g_unichar_to_utf8(g_unichar_toupper(c), buf);
	return buf;
}

int ContactsPersons::create(int* id)
{
	CachedStatement st(m_conn.statement("INSERT INTO persons(changed_ver) VALUES (?)"));
	int rc = st->bind(1, m_ctx.version).run();
	if (rc != SQLITE_DONE)
		return m_conn.failed("insert person", rc);
	*id = static_cast<int>(m_conn.database().lastInsertRowId());
	return CONTACTS_ERROR_NONE;
}

int ContactsPersons::createFor(const contacts_record_s& contact, const ContactSummary& summary, int* id,
	int* displayContactId)
{
	// The contact row is written next, so its id is the next of the
	// contacts' sequence (checked by the caller).
	CachedStatement st(m_conn.statement("INSERT INTO persons(display_name, display_name_index, display_contact_id, "
		"ringtone_path, image_thumbnail_path, vibration, message_alert, is_favorite, link_count, addressbook_ids, "
		"has_phonenumber, has_email, image_id, changed_ver) VALUES (?, ?, "
		"coalesce((SELECT seq FROM sqlite_sequence WHERE name = 'contacts'), 0) + 1, ?, ?, ?, ?, ?, 1, ?, ?, ?, 0, ?) "
		"RETURNING id, display_contact_id"));
	st->bind(1, summary.name.text).bind(2, indexOf(summary.name.text));
	st->bind(3, contact.getStr("ringtone_path")).bind(4, summary.thumbnail ? summary.thumbnail->c_str() : nullptr);
	st->bind(5, contact.getStr("vibration")).bind(6, contact.getStr("message_alert"));
	st->bind(7, contact.getInt("is_favorite") ? 1 : 0).bind(8, std::to_string(contact.getInt("address_book_id")));
	st->bind(9, summary.hasNumber ? 1 : 0).bind(10, summary.hasEmail ? 1 : 0).bind(11, m_ctx.version);
	int rc = st->step();
	if (rc != SQLITE_ROW)
		return m_conn.failed("insert person", rc);
	*id = st->columnInt(0);
	*displayContactId = st->columnInt(1);
	rc = st->step();
	return rc == SQLITE_DONE ? CONTACTS_ERROR_NONE : m_conn.failed("insert person", rc);
}

int ContactsPersons::setDisplayContact(int personId, int contactId)
{
	CachedStatement st(m_conn.statement("UPDATE persons SET display_contact_id = ? WHERE id = ?"));
	int rc = st->bind(1, contactId).bind(2, personId).run();
	return rc == SQLITE_DONE ? CONTACTS_ERROR_NONE : m_conn.failed("update person", rc);
}

int ContactsPersons::__delete(int personId)
{
	const char* sqls[] = {
		"DELETE FROM persons WHERE id = ?",
		"DELETE FROM emergencies WHERE person_id = ?",
		"DELETE FROM ringtones WHERE kind = 0 AND id = ?",
	};
	for (const char* sql : sqls) {
		CachedStatement st(m_conn.statement(sql));
		int rc = st->bind(1, personId).run();
		if (rc != SQLITE_DONE)
			return m_conn.failed("delete person", rc);
	}
	return CONTACTS_ERROR_NONE;
}

int ContactsPersons::refresh(int personId)
{
	std::vector<ContactRow> rows = contactRows(m_conn, personId);
	if (rows.empty())
		return __delete(personId);
	int displayId = 0, imageId = 0;
	{
		CachedStatement st(m_conn.statement("SELECT display_contact_id, image_id FROM persons WHERE id = ?"));
		if (st->bind(1, personId).step() == SQLITE_ROW) {
			displayId = st->columnInt(0);
			imageId = st->columnInt(1);
		}
	}
	const ContactRow* display = &rows.front();
	for (const ContactRow& r : rows)
		if (r.id == displayId)
			display = &r;
	std::string thumbnail;
	bool hasThumbnail = false;
	if (imageId > 0) {
		CachedStatement st(m_conn.statement("SELECT i.path FROM images i JOIN contacts c ON c.id = i.contact_id "
			"WHERE i.id = ? AND i.owner = 0 AND c.person_id = ?"));
		if (st->bind(1, imageId).bind(2, personId).step() == SQLITE_ROW) {
			thumbnail = st->columnText(0);
			hasThumbnail = true;
		} else {
			imageId = 0;
		}
	}
	if (!hasThumbnail) {
		const std::string* t = pick(rows, *display, [](const ContactRow& r) { return r.hasThumbnail; },
			[](const ContactRow& r) -> const std::string& { return r.thumbnail; });
		hasThumbnail = t != nullptr;
		if (t)
			thumbnail = *t;
	}
	std::set<int> books;
	bool favorite = false, hasNumber = false, hasEmail = false;
	for (const ContactRow& r : rows) {
		books.insert(r.addressBookId);
		favorite |= r.favorite;
		hasNumber |= r.hasNumber;
		hasEmail |= r.hasEmail;
	}
	std::string bookIds;
	for (int b : books)
		bookIds += (bookIds.empty() ? "" : " ") + std::to_string(b);

	CachedStatement st(m_conn.statement("UPDATE persons SET display_name = ?, display_name_index = ?, "
		"display_contact_id = ?, ringtone_path = ?, image_thumbnail_path = ?, vibration = ?, message_alert = ?, "
		"is_favorite = ?, link_count = ?, addressbook_ids = ?, has_phonenumber = ?, has_email = ?, image_id = ?, "
		"changed_ver = ? WHERE id = ?"));
	st->bind(1, display->displayName).bind(2, indexOf(display->displayName)).bind(3, display->id);
	bindOptional(*st, 4, pick(rows, *display, [](const ContactRow& r) { return r.hasRingtone; },
		[](const ContactRow& r) -> const std::string& { return r.ringtone; }));
	bindOptional(*st, 5, hasThumbnail ? &thumbnail : nullptr);
	bindOptional(*st, 6, pick(rows, *display, [](const ContactRow& r) { return r.hasVibration; },
		[](const ContactRow& r) -> const std::string& { return r.vibration; }));
	bindOptional(*st, 7, pick(rows, *display, [](const ContactRow& r) { return r.hasAlert; },
		[](const ContactRow& r) -> const std::string& { return r.alert; }));
	st->bind(8, favorite ? 1 : 0).bind(9, static_cast<int>(rows.size())).bind(10, bookIds);
	st->bind(11, hasNumber ? 1 : 0).bind(12, hasEmail ? 1 : 0).bind(13, imageId).bind(14, m_ctx.version);
	st->bind(15, personId);
	int rc = st->run();
	return rc == SQLITE_DONE ? CONTACTS_ERROR_NONE : m_conn.failed("update person", rc);
}

} // namespace ct::contacts
