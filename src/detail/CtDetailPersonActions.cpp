#include "CtDetailPersonActions.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "CtContactPickerView.h"
#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtRegistryMgr.h"

#include <contacts.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <sstream>
#include <string>
#include <vector>

namespace {

constexpr const char* kContactCardMime = "application/vnd.velmora.contact";
constexpr const char* kLinkPickerViewId = "50";

// The phone's and the SIM cards' books keep their contacts on the device.
bool isDeviceAddressbookName(const char* name)
{
	return strstr(name, "addressbook/phone") || strstr(name, "addressbook/sim");
}

std::vector<int> parseIds(const char* text)
{
	std::vector<int> ids;
	std::istringstream in(text ? text : "");
	int id = 0;
	while (in >> id)
		ids.push_back(id);
	return ids;
}

std::string readAddressbookIds(int personId)
{
	contacts_record_h person = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, personId, &person);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_record", err);
		return "";
	}
	char* ids = nullptr;
	contacts_record_get_str_p(person, _contacts_person.addressbook_ids, &ids);
	std::string result = ids ? ids : "";
	contacts_record_destroy(person, true);
	return result;
}

bool sendShare(app_control_h request, Evas_Object* owner)
{
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	bool sent = ContactsAppControlLauncher::getInstance()->sendAsyncLaunchRequest(request, nullptr, nullptr, owner);
	if (!sent)
		WERROR("launch Failed");
	app_control_destroy(request);
	return sent;
}

app_control_h createRequest(const char* operation)
{
	app_control_h request = nullptr;
	int err = app_control_create(&request);
	if (err != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_create", err);
		return nullptr;
	}
	app_control_set_operation(request, operation);
	return request;
}

} // namespace

CtDetailPersonActions::CtDetailPersonActions(int personId)
	: m_personId(personId)
{
}

bool CtDetailPersonActions::isSyncedToAnyAccount() const
{
	for (int id : parseIds(readAddressbookIds(m_personId).c_str())) {
		char* name = ctCommonGetAddressBookName(id);
		bool synced = !name || !isDeviceAddressbookName(name);
		free(name);
		if (synced)
			return true;
	}
	return false;
}

const char* CtDetailPersonActions::getDeleteMessageId(bool synced, bool readOnly, int linkedCount)
{
	bool one = linkedCount < 2;
	if (!synced)
		return one ? "IDS_PB_POP_THIS_CONTACT_WILL_BE_DELETED"
			: "IDS_PB_POP_THIS_CONTACT_AND_ALL_ITS_LINKED_CONTACTS_WILL_BE_DELETED";
	if (!readOnly)
		return one ? "IDS_PB_POP_WHEN_SYNC_IS_ENABLED_THIS_CONTACT_WILL_BE_DELETED_FROM_ANY_SYNCED_ACCOUNTS_IT_IS_SAVED_IN"
			: "IDS_PB_POP_WHEN_SYNC_IS_ENABLED_THIS_CONTACT_AND_ALL_ITS_LINKED_CONTACTS_IN_OTHER_SYNCED_ACCOUNTS_WILL_BE_DELETED";
	return one ? "IDS_PB_POP_YOU_CANNOT_DELETE_CONTACTS_FROM_READ_ONLY_ACCOUNTS_BUT_YOU_CAN_HIDE_THEM_IN_CONTACTS"
		: "IDS_PB_POP_WHEN_SYNC_IS_ENABLED_THIS_CONTACT_AND_ALL_ITS_LINKED_CONTACTS_IN_OTHER_SYNCED_ACCOUNTS_WILL_BE_DELETED_OR_HIDDEN_IF_THE_INFORMATION_MSG";
}

// Other screens hear of the deletion only when there was one: a person
// announced as deleted but still stored would vanish from their lists.
int CtDetailPersonActions::deleteContacts() const
{
	WENTER();
	bool sim = ctCommonIsSimContact(m_personId);
	int err = sim ? contacts_sim_delete(m_personId) : contacts_db_delete_record(_contacts_person._uri, m_personId);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_db_delete_record() fail(%d)", err);
		return err;
	}
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PERSON_DELETED, m_personId);
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_CONTACT_LIST_CHANGED, 0);
	if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled() && !sim)
		CtContactsAgentMgr::getInstance()->syncStart(nullptr, nullptr);
	return err;
}

void CtDetailPersonActions::removeFromPermittedList() const
{
	int* ids = nullptr;
	int count = CtContactsAgentUtil::getPreferenceSelectedContactsList(&ids);
	std::vector<int> list(ids, ids + std::max(count, 0));
	free(ids);
	auto kept = std::remove(list.begin(), list.end(), m_personId);
	if (kept == list.end())
		return;
	list.erase(kept, list.end());
	if (!CtContactsAgentMgr::getInstance()->setPermittedList(list.data(), static_cast<int>(list.size())))
		WERROR("setPermittedList failed");
}

bool CtDetailPersonActions::shareAsVcard(Evas_Object* owner) const
{
	app_control_h request = createRequest(APP_CONTROL_OPERATION_SHARE);
	WPRET_VM(!request, false, "no request");
	app_control_set_mime(request, kContactCardMime);
	app_control_add_extra_data(request, APP_CONTROL_DATA_ID, std::to_string(m_personId).c_str());
	app_control_add_extra_data(request, APP_CONTROL_DATA_TYPE, "person");
	return sendShare(request, owner);
}

bool CtDetailPersonActions::shareAsText(Evas_Object* owner) const
{
	char* text = CtCommonGetShareText(m_personId);
	WPRET_VM(!text, false, "no text to share for person %d", m_personId);
	app_control_h request = createRequest(APP_CONTROL_OPERATION_SHARE_TEXT);
	if (request)
		app_control_add_extra_data(request, APP_CONTROL_DATA_TEXT, text);
	free(text);
	WPRET_VM(!request, false, "no request");
	return sendShare(request, owner);
}

app_control_h CtDetailPersonActions::createLinkRequest(int linkedCount) const
{
	app_control_h request = nullptr;
	int err = app_control_create(&request);
	WPRET_VM(err != APP_CONTROL_ERROR_NONE, nullptr, "app_control_create() Failed(%d)", err);
	int count = std::max(linkedCount, 0);
	const std::pair<const char*, std::string> extras[] = {
		{"type", std::to_string(CtContactPickerView::kTypeLinkContacts)},
		{"ct_selected_person_id", std::to_string(m_personId)},
		{"ct_max", std::to_string(std::max(0, kMaxLinkedContacts - count))},
		{"person_linked_count", std::to_string(count)},
		{"hide_create_button", "1"},
		{"view_id", kLinkPickerViewId},
	};
	for (const auto& [key, value] : extras)
		app_control_add_extra_data(request, key, value.c_str());
	return request;
}
