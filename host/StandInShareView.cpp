#include "StandInShareView.h"

#include "ContactsDebug.h"

#include <contacts.h>
#include <notification.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

namespace ct::demo {

namespace {

constexpr size_t kMaxShownBytes = 64 * 1024;

int personIdOf(const std::string& text)
{
	char* end = nullptr;
	long id = strtol(text.c_str(), &end, 10);
	return !text.empty() && *end == '\0' && id > 0 && id <= INT32_MAX ? static_cast<int>(id) : 0;
}

std::string vcardOfPerson(int personId)
{
	contacts_record_h person = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, personId, &person);
	WPRET_VM(err != CONTACTS_ERROR_NONE, "", "contacts_db_get_record() Failed(%d)", err);
	char* stream = nullptr;
	err = contacts_vcard_make_from_person(person, &stream);
	contacts_record_destroy(person, true);
	WPRET_VM(err != CONTACTS_ERROR_NONE, "", "contacts_vcard_make_from_person() Failed(%d)", err);
	std::string vcard = stream ? stream : "";
	free(stream);
	return vcard;
}

// At most `limit` bytes, never ending inside a UTF-8 sequence.
std::string clipped(const std::string& text, size_t limit)
{
	if (text.size() <= limit)
		return text;
	size_t cut = limit;
	while (cut > 0 && (static_cast<unsigned char>(text[cut]) & 0xC0) == 0x80)
		--cut;
	return text.substr(0, cut) + "\n...";
}

} // namespace

StandInShareView::StandInShareView(app_control_h request, ct::appcontrol::Reply reply, std::string saveFolder)
	: StandInView(request, std::move(reply), "Share", "")
	, m_saveFolder(std::move(saveFolder))
{
	__readShared();
}

void StandInShareView::__readShared()
{
	std::string text = getExtra(APP_CONTROL_DATA_TEXT);
	std::string id = getExtra(APP_CONTROL_DATA_ID);
	if (!id.empty() && getExtra(APP_CONTROL_DATA_TYPE) == "person") {
		m_isVcard = true;
		m_personId = personIdOf(id);
		m_shared = m_personId > 0 ? vcardOfPerson(m_personId) : "";
		setCaption(m_shared.empty() ? "There is no contact " + id + " to share."
									: "This contact would be sent as a vCard.");
	} else {
		m_shared = text;
		setCaption(m_shared.empty() ? "Nothing was shared." : "This text would be sent.");
	}
}

std::string StandInShareView::getSavePath() const
{
	return m_isVcard && m_personId > 0 ? m_saveFolder + "/contact-" + std::to_string(m_personId) + ".vcf" : "";
}

Evas_Object* StandInShareView::createContent(Evas_Object* parent)
{
	Evas_Object* entry = createEntry(parent, false);
	char* markup = elm_entry_utf8_to_markup(clipped(m_shared, kMaxShownBytes).c_str());
	elm_object_text_set(entry, markup);
	free(markup);
	addButton("Close", __closeClickedCb);
	if (m_isVcard && !m_shared.empty())
		addButton("Save", __saveClickedCb, true);
	return entry;
}

void StandInShareView::__saveClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInShareView*>(data);
	std::string path = self->getSavePath();
	std::error_code ec;
	std::filesystem::create_directories(self->m_saveFolder, ec);
	// Written beside the target and renamed: a full disk leaves no half file.
	std::string part = path + ".part";
	std::ofstream out(part, std::ios::binary | std::ios::trunc);
	out << self->m_shared;
	out.close();
	bool saved = !out.fail();
	if (saved)
		std::filesystem::rename(part, path, ec);
	saved = saved && !ec;
	if (!saved) {
		std::filesystem::remove(part, ec);
		WERROR("cannot write %s", path.c_str());
	}
	std::string notice = saved ? "Saved to " + path : "Could not save " + path;
	self->setCaption(notice);
	notification_status_message_post(notice.c_str());
}

void StandInShareView::__closeClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<StandInShareView*>(data)->popOut();
}

} // namespace ct::demo
