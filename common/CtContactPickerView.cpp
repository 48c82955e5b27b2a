#include "CtContactPickerView.h"

#include "ContactsDebug.h"

#include <contacts.h>

#include <cstdlib>
#include <string>

namespace {

// The extra as a number; `fallback` when absent or not a whole number.
int intExtra(app_control_h request, const char* key, int fallback)
{
	char* text = nullptr;
	if (!request || app_control_get_extra_data(request, key, &text) != APP_CONTROL_ERROR_NONE || !text)
		return fallback;
	char* end = nullptr;
	long value = strtol(text, &end, 10);
	bool whole = end != text && *end == '\0' && value >= INT32_MIN && value <= INT32_MAX;
	if (!whole)
		WERROR("extra %s is not a number: %s", key, text);
	free(text);
	return whole ? static_cast<int>(value) : fallback;
}

} // namespace

CtContactPickerView::CtContactPickerView(app_control_h request)
	: CtPersonPickerView("IDS_PB_TMBODY_LINK_CONTACTS")
{
	if (request) {
		int err = app_control_clone(&m_request, request);
		if (err != APP_CONTROL_ERROR_NONE)
			WFAILED("app_control_clone", err);
	}
	m_type = intExtra(m_request, "type", -1);
	m_basePersonId = intExtra(m_request, "ct_selected_person_id", 0);
	m_maxCount = intExtra(m_request, "ct_max", -1);
	WDEBUG("type %d, person %d, max %d", m_type, m_basePersonId, m_maxCount);
}

CtContactPickerView::~CtContactPickerView()
{
	if (m_request)
		app_control_destroy(m_request);
}

std::vector<CtPersonPickerView::Entry> CtContactPickerView::loadEntries()
{
	return loadPersons(m_basePersonId);
}

void CtContactPickerView::onChosen(const Entry& entry)
{
	if (m_maxCount == 0) {
		WERROR("no more contacts may be chosen (ct_max 0)");
		return;
	}
	if (m_type == kTypeLinkContacts && !__linkIntoBasePerson(entry.id))
		return;
	__reply(entry.id);
	popOut();
}

bool CtContactPickerView::__linkIntoBasePerson(int personId)
{
	if (m_basePersonId < 1) {
		WERROR("Invalid param : ct_selected_person_id %d", m_basePersonId);
		return false;
	}
	int err = contacts_person_link_person(m_basePersonId, personId);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_person_link_person", err);
		return false;
	}
	return true;
}

void CtContactPickerView::__reply(int personId)
{
	bool requested = false;
	// Requests built by a screen of this application wait for nothing.
	if (!m_request || app_control_is_reply_requested(m_request, &requested) != APP_CONTROL_ERROR_NONE || !requested)
		return;
	app_control_h reply = nullptr;
	app_control_create(&reply);
	std::string id = std::to_string(personId);
	const char* ids[] = {id.c_str()};
	app_control_add_extra_data_array(reply, APP_CONTROL_DATA_SELECTED, ids, 1);
	app_control_add_extra_data(reply, APP_CONTROL_DATA_ID, id.c_str());
	int err = app_control_reply_to_launch_request(reply, m_request, APP_CONTROL_RESULT_SUCCEEDED);
	if (err != APP_CONTROL_ERROR_NONE)
		WFAILED("app_control_reply_to_launch_request", err);
	app_control_destroy(reply);
}
