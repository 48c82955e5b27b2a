#include "CtInputView.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtAddressbookPopup.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtDetailView.h"
#include "CtDllViewFactory.h"
#include "CtEditTabView.h"
#include "CtEsuAgentMgr.h"
#include "CtInputData.h"
#include "CtInputViewControl.h"
#include "WGenlistItem.h"  // before the SIM control, which uses it
#include "CtInputViewSimControl.h"
#include "CtRegistryMgr.h"
#include "CtSimMgr.h"
#include "CtThemeMgr.h"
#include "CtThread.h"
#include "WNaviframe.h"
#include "WPopup.h"

#include <app_control.h>
#include <app_preference.h>
#include <glib.h>
#include <notification.h>
#include <ui-gadget.h>
#include <ui_extension.h>

#include <algorithm>
#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>
#include <atomic>
#include <string>

namespace {

constexpr const char* kEdjFiles[] = {"contacts/contacts.edj", "contacts/detail_layout.edj"};
constexpr const char* kTextDomain = "contacts";
constexpr const char* kInputNaviItemKey = "input_navi_item";
constexpr const char* kHideStoragePopupKey = "hide_storage_popup";
constexpr const char* kBaseAddressbookKey = "input_base_addressbook";
constexpr const char* kSimPower1Key = "db/telephony/sim_power_state1";
constexpr const char* kSimPower2Key = "db/telephony/sim_power_state2";
constexpr const char* kDetailsAppId = "contacts-details";
constexpr double kStorageQuestionDelay = 0.5;
constexpr double kDetailsLaunchCloseDelay = 2.0;
constexpr int kTypePictureCrop = 41;
constexpr int kTypePrimaryEdit = 112;
constexpr int kTypeEmergency = 126;
constexpr int kTypeSimEmail1 = 22;
constexpr int kTypeSimEmail2 = 123;

// A decimal launch type; anything else (absent, text, out of range) is none.
int parseInputType(const char* text)
{
	if (!text || !*text)
		return -1;
	errno = 0;
	char* end = nullptr;
	long value = strtol(text, &end, 10);
	if (errno == ERANGE || end == text || *end || value > INT_MAX || value < INT_MIN) {
		WERROR("bad type : %.32s", text);
		return -1;
	}
	return static_cast<int>(value);
}

std::string readExtra(CtLaunchRequest* request, const char* key)
{
	if (!request || !request->appControl)
		return std::string();
	char* value = nullptr;
	app_control_get_extra_data(request->appControl, key, &value);
	std::string text = value ? value : "";
	free(value);
	return text;
}

std::string readOperation(CtLaunchRequest* request)
{
	if (!request || !request->appControl)
		return std::string();
	char* operation = nullptr;
	app_control_get_operation(request->appControl, &operation);
	std::string text = operation ? operation : "";
	free(operation);
	return text;
}

// The toolkit composes popup titles in fixed buffers and aborts on very long
// ones: texts of a request are made valid UTF-8 and cut before they are shown.
constexpr glong kShownRequestTextCharacters = 256;

std::string shownMarkup(const std::string& text)
{
	gchar* valid = g_utf8_make_valid(text.c_str(), -1);
	gchar* cut = g_utf8_substring(valid, 0, std::min(g_utf8_strlen(valid, -1), kShownRequestTextCharacters));
	std::string markup = ctCommonUtf8ToMarkup(cut);
	g_free(cut);
	g_free(valid);
	return markup;
}

bool isSimName(const std::string& name)
{
	return name == "SIM" || name == "SIM1" || name == "SIM2";
}

void postToast(const char* textId)
{
	int err = notification_status_message_post(ContactsCommon::translate(textId));
	if (err != NOTIFICATION_ERROR_NONE)
		WWARNING("notification_status_message_post() Failed(%d)", err);
}

bool getPreferenceBool(const char* key)
{
	bool value = false;
	if (preference_get_boolean(key, &value) != PREFERENCE_ERROR_NONE)
		return false;
	return value;
}

bool isPowerSaving()
{
	int mode = 0;
	if (vconf_get_int(VCONFKEY_SETAPPL_PSMODE, &mode) != VCONF_OK)
		return false;
	return mode != 0;
}

int countAddressbooks()
{
	int count = 0;
	int err = contacts_db_get_count(_contacts_address_book._uri, &count);
	if (err != CONTACTS_ERROR_NONE)
		WWARNING("contacts_db_get_count() Failed(%d)", err);
	return count;
}

int personIdOfContact(int contactId)
{
	if (contactId < 1)
		return 0;
	contacts_record_h contact = nullptr;
	int err = contacts_db_get_record(_contacts_contact._uri, contactId, &contact);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_db_get_record() Failed(%d)", err);
		return 0;
	}
	int personId = 0;
	contacts_record_get_int(contact, _contacts_contact.person_id, &personId);
	contacts_record_destroy(contact, true);
	return personId;
}

void storeBaseAddressbook(const char* name)
{
	int err = preference_set_string(kBaseAddressbookKey, name ? name : PHONE_ADDRESSBOOK_NAME);
	if (err != PREFERENCE_ERROR_NONE)
		WWARNING("preference_set_string() Failed(%d)", err);
}

std::string textOf(contacts_record_h record, unsigned int property)
{
	char* text = nullptr;
	contacts_record_get_str_p(record, property, &text);
	return text ? text : "";
}

} // namespace

CtInputView::CtInputView(contacts_record_h record)
{
	WENTER();
	m_data = std::make_shared<CtInputData>(record);
	__initialize(nullptr);
}

CtInputView::CtInputView(contacts_record_h record, CtEditTabView* host)
{
	WENTER();
	m_tabHost = host;
	m_data = std::make_shared<CtInputData>(record);
	__initialize(nullptr);
}

CtInputView::CtInputView(contacts_record_h record, CtLaunchRequest* request)
{
	WENTER();
	if (request && request->appControl)
		m_data = std::make_shared<CtInputData>(record, request->appControl);
	else
		m_data = std::make_shared<CtInputData>(record);
	__initialize(request);
	__trimSimEmail();
}

CtInputView::CtInputView(CtLaunchRequest* request)
{
	WENTER();
	m_data = std::make_shared<CtInputData>(nullptr, request ? request->appControl : nullptr);
	__initialize(request);
}

CtInputView::~CtInputView()
{
	WENTER();
	app_assist::WUiTimer::destroy(m_storageIdler);
	if (!m_tempFile.empty())
		ctCommonUnlinkFile(m_tempFile.c_str());
	ContactsAppControlLauncher::getInstance()->terminate();
	m_simThread.reset();
	__detachFromSim();
	if (m_listensToSimPower) {
		CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(kSimPower1Key, __simPowerChangedCb, this);
		CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(kSimPower2Key, __simPowerChangedCb, this);
	}
	if (m_data)
		m_data->detachListener();
	m_data.reset();
}

void CtInputView::__initialize(CtLaunchRequest* request)
{
	m_alive = std::make_shared<bool>(true);
	m_request = request;
	m_storageId = m_data->getAddressbookId();
	m_isCreateMode = m_data->getContactId() < 1;
	__readRequest();
	if (m_inputType == kTypePictureCrop && m_data->checkAddressbookIsSimOrNot(m_storageId)) {
		m_data->setAddressbookInfo(0);
		m_storageId = m_data->getAddressbookId();
	}
}

void CtInputView::__readRequest()
{
	m_inputType = -1;
	m_numberAlert = false;
	if (!m_request || !m_request->appControl)
		return;
	m_inputType = parseInputType(readExtra(m_request, "type").c_str());
	m_numberAlert = readExtra(m_request, "number_changing_alert") == "1";
}

void CtInputView::__trimSimEmail()
{
	if (m_inputType != kTypeSimEmail2 && m_inputType != kTypeSimEmail1)
		return;
	if (!m_data->checkAddressbookIsSimOrNot(m_storageId) || m_data->getSimUnusedFieldCount(CONTACTS_SIM_FIELD_EMAIL) >= 1)
		return;
	auto* inputData = static_cast<CtInputData*>(m_data.get());
	contacts_record_h email = nullptr;
	contacts_record_h contact = inputData->getContactRecord();
	if (contacts_record_get_child_record_at_p(contact, _contacts_contact.email, 0, &email) != CONTACTS_ERROR_NONE || !email)
		return;
	if (contacts_record_remove_child_record(contact, _contacts_contact.email, email) == CONTACTS_ERROR_NONE)
		contacts_record_destroy(email, true);
}

const char* CtInputView::getClassName()
{
	return "CtInputView";
}

Evas_Object* CtInputView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	m_layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!m_layout, nullptr, "createBaseLayout() failed");
	__addExtensionThemes();
	CtThemeMgr::getInstance()->setObjectTheme(m_layout);
	CtRegistryMgr::getInstance()->registerVconfChangedCb(kSimPower1Key, __simPowerChangedCb, this);
	CtRegistryMgr::getInstance()->registerVconfChangedCb(kSimPower2Key, __simPowerChangedCb, this);
	m_listensToSimPower = true;
	return m_layout;
}

void CtInputView::__addExtensionThemes()
{
	for (const char* edj : kEdjFiles) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
}

void CtInputView::__setTitleText()
{
	Elm_Object_Item* naviItem = getNaviItem();
	if (!naviItem || m_tabHost)
		return;
	const char* title = m_isCreateMode ? "IDS_PB_BUTTON_CREATE_ABB2" : "IDS_PB_OPT_EDIT";
	elm_object_item_part_text_set(naviItem, "elm.text.title", ContactsCommon::translate(title));
}

void CtInputView::onDestroy()
{
	WENTER();
	if (m_naviframeObj)
		evas_object_data_del(m_naviframeObj, kInputNaviItemKey);
	app_assist::WUiTimer::destroy(m_storageTimer);
	app_assist::WUiTimer::destroy(m_detailTimer);
	__detachFromSim();
	*m_alive = false;
}

void CtInputView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	if (app_assist::WNaviframe* naviframe = getNaviframe())
		m_naviframeObj = naviframe->getEvasObj();
	__createTitleButtons(naviItem);
	__setTitleText();
	createInputViewControl(m_layout, m_data->checkAddressbookIsSimOrNot(m_storageId));
	m_isContentMade = true;
	if (m_isCreateMode && !getPreferenceBool(kHideStoragePopupKey) && m_inputType != kTypeEmergency)
		__startStorageTimer();
	m_data->attachListener(this);
	if (m_numberAlert)
		__showNumberChangingAlert();
}

void CtInputView::__createTitleButtons(Elm_Object_Item* naviItem)
{
	WPRET_M(!naviItem, "naviItem is nullptr");
	Evas_Object* parent = m_naviframeObj ? m_naviframeObj : m_layout;
	elm_object_item_part_content_set(naviItem, "elm.swallow.prev_btn", nullptr);

	m_doneButton = uxt_button_add(parent, "naviframe/title_right");
	elm_object_text_set(m_doneButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_DONE_ABB"));
	evas_object_smart_callback_add(m_doneButton, "clicked", __saveCb, this);
	if (m_isCreateMode)
		elm_object_disabled_set(m_doneButton, EINA_TRUE);
	elm_object_item_part_content_set(naviItem, "title_right_btn", m_doneButton);

	m_cancelButton = uxt_button_add(parent, "naviframe/title_left");
	elm_object_text_set(m_cancelButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"));
	evas_object_smart_callback_add(m_cancelButton, "clicked", __cancelCb, this);
	elm_object_item_part_content_set(naviItem, "title_left_btn", m_cancelButton);
}

void CtInputView::__startStorageTimer()
{
	m_storageTimer = app_assist::WUiTimer::addTimer(kStorageQuestionDelay, [this](void*) {
		return __onStorageTimer();
	}, nullptr, this);
}

bool CtInputView::__onStorageTimer()
{
	if (getPreferenceBool(kHideStoragePopupKey))
		return false;
	int books = countAddressbooks();
	bool powerSaving = isPowerSaving();
	if (books < 2) {
		if (!powerSaving) {
			m_data->setAddressbookInfo(0);
			m_storageId = 0;
			__showDeviceOnlyPopup();
		}
		return false;
	}
	m_storageIdler = app_assist::WUiTimer::addIdler([this](void*) {
		__showStorageListPopup();
		return false;
	}, nullptr, this);
	return false;
}

void CtInputView::__addStorageButtons(app_assist::WPopup* popup, std::shared_ptr<int> chosen)
{
	if (ctCommoncheckAccountAppEnable()) {
		popup->addButton("IDS_PB_BUTTON_ADD_ACCOUNT_ABB2", [](bool*) {
			ctCommonLaunchAddAccount();
		});
	}
	std::weak_ptr<bool> alive = m_alive;
	popup->addButton("IDS_PB_BUTTON_SAVE", [this, alive, chosen](bool*) {
		if (auto isAlive = alive.lock(); isAlive && *isAlive)
			__applyStorage(*chosen);
	});
}

void CtInputView::__showDeviceOnlyPopup()
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable(kTextDomain);
	popup->setTitle("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB");
	popup->setContent("IDS_PB_POP_NEW_CONTACTS_WILL_BE_SAVED_IN_CONTACTS_ON_YOUR_DEVICE");
	__addStorageButtons(popup, std::make_shared<int>(0));
	attachPopup(popup);
}

void CtInputView::__showStorageListPopup()
{
	auto* popup = new CtAddressbookPopup(m_inputType, m_storageId);
	popup->setTextTranslatable(kTextDomain);
	popup->setTitle("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB");
	auto chosen = std::make_shared<int>(m_storageId);
	std::weak_ptr<bool> alive = m_alive;
	popup->setOnResultCb([this, alive, chosen](int addressbookId) {
		*chosen = addressbookId;
		if (auto isAlive = alive.lock(); isAlive && *isAlive && isPowerSaving())
			__applyStorage(addressbookId);
	});
	__addStorageButtons(popup, chosen);
	attachPopup(popup);
}

void CtInputView::__applyStorage(int storageId)
{
	m_data->setPreferenceHideStoragePopup(true);
	m_data->setAddressbookInfo(storageId);
	m_storageId = m_data->getAddressbookId();
	if (m_data->checkAddressbookIsSimOrNot(m_storageId))
		createInputViewControl(m_layout, true);
	else
		__controlShowCreateKeypad();
	destroyPopup();
}

// The worker may still be attaching when the view goes: the view marks
// itself gone before it detaches, and a worker that attached and then finds
// the mark takes the attachment back. (No lock: the attachment may wait for
// the main loop, which may be in the view's destructor.)
struct CtInputView::SimAttachment {
	std::atomic<bool> viewAlive{true};
};

void CtInputView::__attachToSimInThread()
{
	if (m_simThread || m_simAttachment)
		return;
	m_simAttachment = std::make_shared<SimAttachment>();
	std::shared_ptr<SimAttachment> attachment = m_simAttachment;
	CtSimListener* listener = this;
	m_simThread = std::make_unique<CtThread>([attachment, listener] {
		if (!attachment->viewAlive)
			return;
		CtSimMgr::getInstance()->attach(listener);
		if (!attachment->viewAlive)
			CtSimMgr::getInstance()->detach(listener);
	}, [this] {
		m_simThread.reset();
	});
	if (!m_simThread->start()) {
		WERROR("CtThread start failed");
		m_simThread.reset();
		CtSimMgr::getInstance()->attach(this);
	}
}

void CtInputView::__detachFromSim()
{
	if (m_simAttachment)
		m_simAttachment->viewAlive = false;
	CtSimMgr::getInstance()->detach(this);
}

void CtInputView::__showNumberChangingAlert()
{
	std::string name = shownMarkup(readExtra(m_request, "name"));
	if (name.empty())
		name = "Profile sharing";
	std::string text = "This contact's mobile phone number has changed from "
		+ shownMarkup(readExtra(m_request, "previous_number")) + " to " + shownMarkup(readExtra(m_request, "new_number"))
		+ ". Tap Update to change number.";
	auto* popup = new app_assist::WPopup();
	popup->setTitle(name.c_str());
	popup->setContent(text.c_str());
	popup->addButton("Ok", [](bool*) {});
	attachPopup(popup);
}

void CtInputView::createInputViewControl(Evas_Object* layout, bool sim)
{
	WENTER();
	WPRET_M(!layout, "layout is nullptr");
	if (Evas_Object* old = elm_object_part_content_unset(layout, "elm.swallow.content"))
		evas_object_del(old);
	if (!elm_object_part_content_get(layout, "elm.swallow.bg")) {
		Evas_Object* white = evas_object_rectangle_add(evas_object_evas_get(layout));
		evas_object_color_set(white, 255, 255, 255, 255);
		elm_object_part_content_set(layout, "elm.swallow.bg", white);
	}
	m_control.reset();
	m_simControl.reset();
	m_storageId = m_data->getAddressbookId();
	__createControl(layout, sim);
	if (sim && isCreated())
		__attachToSimInThread();
}

app_assist::WControl* CtInputView::getInputControl() const
{
	if (auto control = m_control.lock())
		return control.get();
	if (auto control = m_simControl.lock())
		return control.get();
	return nullptr;
}

void CtInputView::updateSaveBtn(bool disabled)
{
	if (m_tabHost) {
		m_tabHost->updateSaveBtn(disabled);
		return;
	}
	if (m_doneButton)
		elm_object_disabled_set(m_doneButton, disabled ? EINA_TRUE : EINA_FALSE);
}

void CtInputView::focusOnSaveBtn()
{
	if (m_doneButton)
		elm_object_focus_set(m_doneButton, EINA_TRUE);
}

void CtInputView::setSipStatus(bool shown)
{
	m_isSipShown = shown;
}

void CtInputView::setNeedDiscardPopup(bool need)
{
	m_needDiscardPopup = need;
}

void CtInputView::showDiscardPopup()
{
	WENTER();
	__closeTypeSelectors();
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable(kTextDomain);
	popup->setTitle("IDS_PB_HEADER_DISCARD_CHANGES_ABB");
	popup->setContent("IDS_PB_POP_ALL_CHANGES_WILL_BE_DISCARDED");
	popup->addButton("IDS_PB_BUTTON_CANCEL", [](bool*) {});
	std::weak_ptr<bool> alive = m_alive;
	popup->addButton("IDS_PB_BUTTON_DISCARD_ABB", [this, alive](bool*) {
		auto isAlive = alive.lock();
		if (!isAlive || !*isAlive)
			return;
		m_leaveWithoutAsking = true;
		if (m_cancelButton)
			elm_object_focus_set(m_cancelButton, EINA_TRUE);
		popOut();
	});
	attachPopup(popup);
}

void CtInputView::createEditSubViewContent()
{
	if (m_isContentMade)
		return;
	m_isContentMade = true;
	createInputViewControl(m_layout, m_data->checkAddressbookIsSimOrNot(m_storageId));
	m_data->attachListener(this);
}

void CtInputView::getChangedForEditTabSubView(bool* changed)
{
	WPRET_M(!changed, "Invalid param : changed");
	if (getInputControl())
		*changed = __controlIsChanged();
}

void CtInputView::getEmptyForEditTabSubView(bool* empty)
{
	WPRET_M(!empty, "Invalid param : empty");
	if (getInputControl())
		*empty = __controlIsEmpty();
}

bool CtInputView::checkEmergencyForEditTabSubView()
{
	return __passEmergencyCheck();
}

void CtInputView::saveContactForEditTabSubView()
{
	WENTER();
	__closeTypeSelectors();
	const char* storageName = m_data->getAddressbookName();
	if (!storageName || !*storageName)
		return;
	int err = CONTACTS_ERROR_NONE;
	bool empty = false;
	getEmptyForEditTabSubView(&empty);
	if (empty)
		err = contacts_db_delete_record(_contacts_contact._uri, m_data->getContactId());
	else
		err = m_data->updateContact();
	if (err != CONTACTS_ERROR_NONE) {
		WERROR("update failed %d", err);
		__sendUgResult("is_success", "0");
		m_isSaved = true;
		return;
	}
	if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled())
		CtContactsAgentMgr::getInstance()->syncDataStart(m_data->getPersonId());
	__sendUgResult("is_success", "1");
	m_isSaved = true;
}

// Save.

void CtInputView::__save()
{
	WENTER();
	if (m_isClosing)
		return;
	__closeTypeSelectors();
	const char* name = m_data->getAddressbookName();
	std::string storageName = name ? name : "";
	if (m_isCreateMode)
		__saveInCreateMode(storageName);
	else
		__saveInEditMode(storageName);
}

void CtInputView::__saveInEditMode(const std::string& storageName)
{
	int err = CONTACTS_ERROR_NONE;
	if (!storageName.empty()) {
		if (isSimName(storageName)) {
			__controlUpdateNameRecordForSim();
			err = m_data->updateSIMContact();
		} else {
			if (!__passEmergencyCheck())
				return;
			err = m_data->updateContact();
		}
	}
	bool success = err == CONTACTS_ERROR_NONE;
	if (success) {
		if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled())
			CtContactsAgentMgr::getInstance()->syncDataStart(m_data->getPersonId());
	} else {
		WERROR("update failed %d", err);
		postToast(err == CONTACTS_ERROR_FILE_NO_SPACE ? "IDS_PB_POP_NOT_ENOUGH_MEMORY" : "IDS_PB_POP_FAILED");
	}
	__replyEdit(success);
	if (!success && !m_request) {
		// What was typed stays on screen: the user may try again.
		return;
	}
	m_isSaved = true;
	__closeAfterEdit();
}

void CtInputView::__saveInCreateMode(const std::string& storageName)
{
	if (m_isSaved)
		return;
	if (!m_nameCheckPassed && __isNameInUse()) {
		__showNameInUsePopup();
		return;
	}
	int err = CONTACTS_ERROR_NONE;
	int contactId = 0;
	if (!storageName.empty()) {
		if (isSimName(storageName)) {
			bool ready = false;
			contacts_sim_is_ready(storageName == "SIM2" ? 1 : 0, &ready);
			if (!ready) {
				postToast("IDS_PB_BODY_SIM_CARD_INITIALISING_ING");
				return;
			}
			if (m_data->getSimUnusedFieldCount(CONTACTS_SIM_FIELD_NAME) < 1) {
				postToast("IDS_PB_POP_SIM_MEMROY_FULL");
				return;
			}
			__controlUpdateNameRecordForSim();
			err = m_data->insertSIMContact(&contactId);
			if (err == CONTACTS_ERROR_NONE)
				CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_CONTACT_LIST_CHANGED, 0);
		} else {
			if (!__passEmergencyCheck())
				return;
			int groupId = ctCommonGetEasDefaultGroupId(m_storageId);
			if (groupId > 0)
				m_data->addGroupRelation(groupId);
			err = m_data->insertContact(&contactId);
			if (err == CONTACTS_ERROR_NONE) {
				CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_CONTACT_LIST_CHANGED, 0);
				if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled())
					CtContactsAgentMgr::getInstance()->syncDataStart(personIdOfContact(contactId));
			}
		}
	}
	if (err != CONTACTS_ERROR_NONE) {
		WERROR("insert failed %d", err);
		postToast(err == CONTACTS_ERROR_FILE_NO_SPACE ? "IDS_PB_POP_NOT_ENOUGH_MEMORY" : "IDS_PB_POP_FAILED");
		__replyCreate(false, 0);
		if (!m_request)
			return;   // the form stays, with what was typed, for another try
		m_isSaved = true;
		__popOutOrWaitForKeypad();
		return;
	}
	int personId = personIdOfContact(contactId);
	if (m_request && m_inputType != kTypePictureCrop)
		__addPrimaryContact(contactId);
	__replyCreate(true, personId);
	char* bookName = ctCommonGetAddressBookName(m_data->getAddressbookId());
	storeBaseAddressbook(bookName);
	free(bookName);
	m_isSaved = true;
	__closeAfterCreate(personId);
}

bool CtInputView::__isNameInUse()
{
	std::string fullName = m_data->getFullName();
	if (fullName.empty())
		return false;
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	int count = 0;
	if (contacts_query_create(_contacts_contact._uri, &query) != CONTACTS_ERROR_NONE)
		return false;
	if (contacts_filter_create(_contacts_contact._uri, &filter) == CONTACTS_ERROR_NONE) {
		contacts_filter_add_str(filter, _contacts_contact.display_name, CONTACTS_MATCH_EXACTLY, fullName.c_str());
		contacts_query_set_filter(query, filter);
		int err = contacts_db_get_count_with_query(query, &count);
		if (err != CONTACTS_ERROR_NONE)
			WWARNING("contacts_db_get_count_with_query() Failed(%d)", err);
		contacts_filter_destroy(filter);
	}
	contacts_query_destroy(query);
	return count > 0;
}

bool CtInputView::__passEmergencyCheck()
{
	if (!m_control.lock() || __controlCheckEmergencyGroup())
		return true;
	m_nameCheckPassed = false;
	destroyPopup();
	postToast("IDS_PB_TPOP_UNABLE_TO_SAVE_CONTACT_AS_EMERGENCY_CONTACT_NO_PHONE_NUMBER_ENTERED");
	return false;
}

void CtInputView::__addPrimaryContact(int contactId)
{
	if (m_inputType != kTypeEmergency)
		return;
	contacts_record_h contact = nullptr;
	int err = contacts_db_get_record(_contacts_contact._uri, contactId, &contact);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_db_get_record() Failed(%d)", err);
		return;
	}
	int personId = 0;
	int numberId = 0;
	contacts_record_get_int(contact, _contacts_contact.person_id, &personId);
	contacts_record_h number = nullptr;
	if (contacts_record_get_child_record_at_p(contact, _contacts_contact.number, 0, &number) == CONTACTS_ERROR_NONE && number)
		contacts_record_get_int(number, _contacts_number.id, &numberId);
	contacts_record_destroy(contact, true);

	contacts_record_h emergency = nullptr;
	if (contacts_record_create(_contacts_emergency._uri, &emergency) != CONTACTS_ERROR_NONE)
		return;
	contacts_record_set_int(emergency, _contacts_emergency.person_id, personId);
	contacts_record_set_int(emergency, _contacts_emergency.number_id, numberId);
	contacts_record_set_int(emergency, _contacts_emergency.value, 1);
	int id = 0;
	err = contacts_db_insert_record(emergency, &id);
	if (err != CONTACTS_ERROR_NONE)
		WWARNING("contacts_db_insert_record() Failed(%d)", err);
	contacts_record_destroy(emergency, true);
}

void CtInputView::__replyEdit(bool success)
{
	if (!m_request)
		return;
	std::string operation = readOperation(m_request);
	std::string personId = std::to_string(m_data->getPersonId());
	bool isEdit = operation == APP_CONTROL_OPERATION_EDIT || operation == APP_CONTROL_OPERATION_SOCIAL_EDIT;
	bool isChoose = operation == APP_CONTROL_OPERATION_SOCIAL_CHOOSE;
	if (!success) {
		if (operation.empty() || operation == APP_CONTROL_OPERATION_DEFAULT)
			__sendUgResult("is_success", "0");
		else if (isEdit || isChoose)
			__sendAppControlReply(nullptr, nullptr, APP_CONTROL_RESULT_FAILED);
		return;
	}
	if (operation.empty())
		__sendUgResult("is_success", "1");
	else if (isEdit)
		__sendAppControlReply(APP_CONTROL_DATA_ID, personId.c_str(), APP_CONTROL_RESULT_SUCCEEDED);
	else if (isChoose)
		__sendAppControlReply(APP_CONTROL_DATA_SOCIAL_ITEM_ID, personId.c_str(), APP_CONTROL_RESULT_SUCCEEDED);
	else if (operation == APP_CONTROL_OPERATION_DEFAULT)
		__sendUgResult("id", personId.c_str(), "is_success", "1");
	else
		WERROR("wrong operation requested %s", operation.c_str());
}

void CtInputView::__replyCreate(bool success, int personId)
{
	if (!m_request)
		return;
	std::string operation = readOperation(m_request);
	bool isAdd = operation == APP_CONTROL_OPERATION_ADD || operation == APP_CONTROL_OPERATION_SOCIAL_ADD;
	if (!success) {
		if (operation.empty() || operation == APP_CONTROL_OPERATION_DEFAULT)
			__sendUgResult("is_success", "0");
		else if (isAdd)
			__sendAppControlReply(nullptr, nullptr, APP_CONTROL_RESULT_FAILED);
		return;
	}
	std::string id = std::to_string(personId);
	if (operation.empty())
		__sendUgResult("is_success", "1");
	else if (isAdd)
		__sendAppControlReply(APP_CONTROL_DATA_ID, id.c_str(), APP_CONTROL_RESULT_SUCCEEDED);
	else if (operation == APP_CONTROL_OPERATION_DEFAULT)
		__sendUgResult("id", id.c_str(), "is_success", "1");
	else
		WERROR("wrong operation requested %s", operation.c_str());
}

void CtInputView::__sendUgResult(const char* key, const char* value, const char* key2, const char* value2)
{
	if (!m_request || !m_request->ug)
		return;
	app_control_h result = nullptr;
	int err = app_control_create(&result);
	if (err != APP_CONTROL_ERROR_NONE) {
		WWARNING("app_control_create() Failed(%d)", err);
		return;
	}
	app_control_add_extra_data(result, key, value);
	if (key2)
		app_control_add_extra_data(result, key2, value2);
	err = ug_send_result(m_request->ug, result);
	if (err != UG_ERROR_NONE)
		WWARNING("ug_send_result() Failed(%d)", err);
	app_control_destroy(result);
}

void CtInputView::__sendAppControlReply(const char* key, const char* value, app_control_result_e result)
{
	if (!m_request || !m_request->appControl)
		return;
	int err = ctCommonSendSimpleAppControlResult(m_request->appControl, key, value, result);
	if (err != APP_CONTROL_ERROR_NONE)
		WWARNING("ctCommonSendSimpleAppControlResult() Failed(%d)", err);
}

void CtInputView::__closeAfterEdit()
{
	__popOutOrWaitForKeypad();
}

void CtInputView::__popOutOrWaitForKeypad()
{
	if (m_isSipShown) {
		m_isClosing = true;
		m_closeAfterKeypad = true;
		__controlHideInputPanel();
		return;
	}
	m_isClosing = true;
	popOut();
}

void CtInputView::__closeAfterCreate(int personId)
{
	m_savedPersonId = personId;
	if (!m_request) {
		if (m_naviframeObj)
			evas_object_data_set(m_naviframeObj, kInputNaviItemKey, getNaviItem());
		__pushDetailView(personId);
		return;
	}
	if (readExtra(m_request, "show_detail") == "true") {
		__launchDetailsApp(personId);
		return;
	}
	if (m_inputType == kTypePictureCrop) {
		__launchImageCrop();
		return;
	}
	__popOutOrWaitForKeypad();
}

void CtInputView::__pushDetailView(int personId)
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	if (!naviframe || personId < 1) {
		__popOutOrWaitForKeypad();
		return;
	}
	m_isClosing = true;
	naviframe->push(new CtDetailView(personId, nullptr));
}

void CtInputView::__launchDetailsApp(int personId)
{
	app_control_h launch = nullptr;
	if (app_control_create(&launch) == APP_CONTROL_ERROR_NONE) {
		app_control_set_operation(launch, APP_CONTROL_OPERATION_DEFAULT);
		app_control_set_app_id(launch, kDetailsAppId);
		app_control_add_extra_data(launch, "person_id", std::to_string(personId).c_str());
		app_control_add_extra_data(launch, "type", "100");
		ContactsAppControlLauncher::getInstance()->sendLaunchRequest(launch);
		app_control_destroy(launch);
	}
	m_isClosing = true;
	m_detailTimer = app_assist::WUiTimer::addTimer(kDetailsLaunchCloseDelay, [this](void*) {
		popOut();
		return false;
	}, nullptr, this);
}

void CtInputView::__launchImageCrop()
{
	app_control_h launch = nullptr;
	if (app_control_create(&launch) != APP_CONTROL_ERROR_NONE) {
		__popOutOrWaitForKeypad();
		return;
	}
	app_control_set_operation(launch, APP_CONTROL_OPERATION_DEFAULT);
	app_control_set_app_id(launch, IMAGE_VIEWER_APP_ID);
	app_control_set_launch_mode(launch, APP_CONTROL_LAUNCH_MODE_GROUP);
	app_control_add_extra_data(launch, "Path", readExtra(m_request, "ct_path").c_str());
	app_control_add_extra_data(launch, "View Mode", "SETAS");
	app_control_add_extra_data(launch, "Setas type", "CallerID");
	app_control_add_extra_data(launch, "Area Size", "100");
	app_control_add_extra_data(launch, "Resolution", "480x480");
	m_isClosing = true;
	bool sent = ContactsAppControlLauncher::getInstance()->sendLaunchRequest(launch,
		[](app_control_h, app_control_h reply, app_control_result_e, void* data) {
			static_cast<CtInputView*>(data)->__onImageCropReply(reply);
		}, this, getEvasObj());
	app_control_destroy(launch);
	if (!sent)
		popOut();
}

void CtInputView::__onImageCropReply(app_control_h reply)
{
	char** paths = nullptr;
	int count = 0;
	if (reply && app_control_get_extra_data_array(reply, APP_CONTROL_DATA_SELECTED, &paths, &count) == APP_CONTROL_ERROR_NONE
			&& count > 0 && paths[0] && *paths[0]) {
		Eina_List* contacts = ctCommonGetWritableContactList(m_savedPersonId, INT_MAX);
		Eina_List* l = nullptr;
		void* item = nullptr;
		EINA_LIST_FOREACH(contacts, l, item) {
			auto contact = static_cast<contacts_record_h>(item);
			contacts_record_h image = nullptr;
			if (contacts_record_get_child_record_at_p(contact, _contacts_contact.image, 0, &image) != CONTACTS_ERROR_NONE
					|| !image) {
				if (contacts_record_create(_contacts_image._uri, &image) != CONTACTS_ERROR_NONE)
					continue;
				contacts_record_add_child_record(contact, _contacts_contact.image, image);
			}
			contacts_record_set_str(image, _contacts_image.path, paths[0]);
			int err = contacts_db_update_record(contact);
			if (err != CONTACTS_ERROR_NONE)
				WWARNING("contacts_db_update_record() Failed(%d)", err);
		}
		ctCommonDestroyRecordList(contacts);
	}
	for (int i = 0; i < count; ++i)
		free(paths[i]);
	free(paths);
	popOut();
}

// Leaving.

bool CtInputView::onPop()
{
	WENTER();
	bool empty = false;
	bool changed = false;
	__readEmptyAndChanged(&empty, &changed);
	if (m_isSaved) {
		if (m_request && m_request->ug && (!m_request->callerAppId || strcmp(m_request->callerAppId, kDetailsAppId) != 0)) {
			ug_destroy_me(m_request->ug);
			return false;
		}
		return !m_closeAfterKeypad;
	}
	if (m_leaveWithoutAsking || (m_isCreateMode && empty)) {
		__closeTypeSelectors();
		return true;
	}
	bool asks = false;
	if (!m_request || (!m_request->ug && !m_request->appControl))
		asks = m_isCreateMode ? !empty : changed;
	else
		asks = changed;
	if (!asks)
		return true;
	if (m_isSipShown) {
		m_needDiscardPopup = true;
		__controlHideInputPanel();
	} else {
		showDiscardPopup();
	}
	return false;
}

void CtInputView::__readEmptyAndChanged(bool* empty, bool* changed)
{
	*empty = __controlIsEmpty();
	*changed = __controlIsChanged();
}

void CtInputView::__onKeypadDown()
{
	m_isSipShown = false;
	if (m_closeAfterKeypad) {
		m_closeAfterKeypad = false;
		popOut();
		return;
	}
	if (m_needDiscardPopup) {
		m_needDiscardPopup = false;
		showDiscardPopup();
	}
}

void CtInputView::onTabSelect(Elm_Object_Item*)
{
	if (m_layout)
		elm_object_focus_set(m_layout, EINA_TRUE);
	destroyPopup();
	bool empty = false;
	getEmptyForEditTabSubView(&empty);
	updateSaveBtn(empty);
}

void CtInputView::onTabUnselect(Elm_Object_Item*)
{
	destroyPopup();
}

void CtInputView::onTabPop()
{
	__closeTypeSelectors();
}

void CtInputView::onDbChanged(const char* viewUri)
{
	WDEBUG("changed : %s", viewUri ? viewUri : "");
	if (m_isClosing || m_isSaved)
		return;
	if (__isAboveDetailView())
		return;
	if (!m_data->checkChangedTypeIsDeleted())
		return;
	m_leaveWithoutAsking = true;
	popOut();
}

void CtInputView::__onSimPowerChanged(const char* key)
{
	if (!key || m_isClosing)
		return;
	int simNo = m_data->getSimNo();
	if ((simNo == 1 && strcmp(key, kSimPower1Key) == 0) || (simNo == 2 && strcmp(key, kSimPower2Key) == 0)) {
		storeBaseAddressbook(PHONE_ADDRESSBOOK_NAME);
		m_leaveWithoutAsking = true;
		popOut();
	}
}

void CtInputView::onSimChanged()
{
	__controlUpdateStorageRow();
}

void CtInputView::onLanguageChanged()
{
	destroyPopup();
	if (m_doneButton)
		elm_object_text_set(m_doneButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_DONE_ABB"));
	if (m_cancelButton)
		elm_object_text_set(m_cancelButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"));
	__setTitleText();
	__controlUpdateRealizedItems();
}

void CtInputView::__saveCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtInputView*>(data)->__save();
}

void CtInputView::__cancelCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	auto* view = static_cast<CtInputView*>(data);
	if (view->m_request)
		view->__sendAppControlReply(nullptr, nullptr, APP_CONTROL_RESULT_CANCELED);
	if (!view->m_isClosing)
		view->popOut();
}

void CtInputView::__simPowerChangedCb(keynode_t* node, void* data)
{
	WHIT();
	WPRET_M(!data || !node, "Invalid param : data");
	static_cast<CtInputView*>(data)->__onSimPowerChanged(vconf_keynode_get_name(node));
}

void CtInputView::__closeTypeSelectors()
{
	__controlCloseHoversel();
}

bool CtInputView::__isAboveDetailView()
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	Elm_Object_Item* naviItem = getNaviItem();
	if (!naviframe || !naviItem)
		return false;
	Elm_Object_Item* below = nullptr;
	Eina_List* items = elm_naviframe_items_get(naviframe->getEvasObj());
	for (Eina_List* l = items; l; l = eina_list_next(l)) {
		if (eina_list_data_get(l) == naviItem)
			break;
		below = static_cast<Elm_Object_Item*>(eina_list_data_get(l));
	}
	eina_list_free(items);
	if (!below)
		return false;
	auto* view = WView_getInstanceFromEvasObj(elm_object_item_content_get(below));
	return view && strcmp(view->getClassName(), "CtDetailView") == 0;
}

void CtInputView::__showNameInUsePopup()
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable(kTextDomain);
	popup->setTitle("IDS_PB_HEADER_NAME_ALREADY_IN_USE_ABB3");
	popup->setContent("IDS_PB_POP_A_CONTACT_WITH_THE_SAME_NAME_ALREADY_EXISTS_MSG");
	std::weak_ptr<bool> alive = m_alive;
	popup->addButton("IDS_PB_BUTTON_SAVE_ANYWAY_ABB2", [this, alive](bool*) {
		auto isAlive = alive.lock();
		if (!isAlive || !*isAlive)
			return;
		m_nameCheckPassed = true;
		// After the popup is gone: saving may push or pop views.
		app_assist::WUiTimer::addIdler([this](void*) {
			__save();
			return false;
		}, nullptr, this);
	});
	popup->addButton("IDS_PB_BUTTON_RENAME_ABB4", [this, alive](bool*) {
		if (auto isAlive = alive.lock(); isAlive && *isAlive)
			__controlFocusForRename();
	});
	attachPopup(popup);
}

void CtInputView::__editExistContact(contacts_record_h record)
{
	WENTER();
	WPRET_M(!record, "Invalid param : record");
	contacts_record_h picked = nullptr;
	if (contacts_record_clone(record, &picked) != CONTACTS_ERROR_NONE || !picked) {
		WWARNING("contacts_record_clone() Failed");
		return;
	}
	auto owned = std::shared_ptr<std::remove_pointer_t<contacts_record_h>>(picked, [](contacts_record_h r) {
		if (r)
			contacts_record_destroy(r, true);
	});
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable(kTextDomain);
	popup->setTitle("IDS_KPD_OPT_UPDATE_CONTACT_ABB");
	popup->setContent("IDS_PB_POP_TAP_UPDATE_TO_EDIT_THE_EXISTING_INFO_FOR_THIS_CONTACT");
	popup->addButton("IDS_PB_BUTTON_CANCEL", [](bool*) {});
	std::weak_ptr<bool> alive = m_alive;
	popup->addButton("IDS_ST_BUTTON_UPDATE_ABB4", [this, alive, owned](bool*) {
		auto isAlive = alive.lock();
		if (!isAlive || !*isAlive)
			return;
		contacts_record_h contact = nullptr;
		if (contacts_record_clone(owned.get(), &contact) == CONTACTS_ERROR_NONE && contact)
			app_assist::WUiTimer::addIdler([this, contact](void*) {
				__updateWithExistContact(contact);
				return false;
			}, nullptr, this);
	});
	popup->setOnBack([](bool*) {});
	attachPopup(popup);
}

namespace {

struct ChildKind {
	unsigned int contactProperty;
	unsigned int textProperty;   // 0: copied whatever it holds
};

// Copies every child of `from` with a text into `to`, as new children.
void copyChildren(contacts_record_h from, contacts_record_h to, const ChildKind& kind)
{
	int count = 0;
	contacts_record_get_child_record_count(from, kind.contactProperty, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h child = nullptr;
		if (contacts_record_get_child_record_at_p(from, kind.contactProperty, i, &child) != CONTACTS_ERROR_NONE || !child)
			continue;
		if (kind.textProperty && textOf(child, kind.textProperty).empty())
			continue;
		contacts_record_h copy = nullptr;
		if (contacts_record_clone(child, &copy) != CONTACTS_ERROR_NONE || !copy)
			continue;
		if (contacts_record_add_child_record(to, kind.contactProperty, copy) != CONTACTS_ERROR_NONE)
			contacts_record_destroy(copy, true);
	}
}

} // namespace

void CtInputView::__updateWithExistContact(contacts_record_h picked)
{
	WENTER();
	auto* inputData = static_cast<CtInputData*>(m_data.get());
	contacts_record_h current = inputData->getContactRecord();
	const ChildKind kinds[] = {
		{_contacts_contact.number, _contacts_number.number},
		{_contacts_contact.email, _contacts_email.email},
		{_contacts_contact.address, 0},
		{_contacts_contact.messenger, _contacts_messenger.im_id},
		{_contacts_contact.url, _contacts_url.url},
		{_contacts_contact.relationship, _contacts_relationship.name},
		{_contacts_contact.note, _contacts_note.note},
		{_contacts_contact.event, 0},
	};
	if (current) {
		for (const ChildKind& kind : kinds)
			copyChildren(current, picked, kind);
	}
	if (m_control.lock() || m_simControl.lock())
		destroyPopup();
	m_data->detachListener();
	m_data = std::make_shared<CtInputData>(picked);
	m_isCreateMode = m_data->getContactId() < 1;
	m_storageId = m_data->getAddressbookId();
	createInputViewControl(m_layout, m_data->checkAddressbookIsSimOrNot(m_storageId));
	m_data->attachListener(this);
	__setTitleText();
	updateSaveBtn(false);
}

void CtInputView::__pushRelationshipPicker()
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is nullptr");
	if (app_assist::WView* picker = CtDllViewFactory::getInstance()->getCtListViewClassForRelationship())
		naviframe->push(picker);
}

// List control access.

CtInputViewControl* CtInputView::__control() const
{
	return static_cast<CtInputViewControl*>(m_control.lock().get());
}

CtInputViewSimControl* CtInputView::__simControl() const
{
	return static_cast<CtInputViewSimControl*>(m_simControl.lock().get());
}

void CtInputView::__createControl(Evas_Object* layout, bool sim)
{
	app_assist::WControl* control = nullptr;
	if (sim) {
		control = new CtInputViewSimControl(m_data, this);
		if (!control->create(layout, nullptr)) {
			WERROR("SIM control not created");
			return;
		}
		m_simControl = control->getWeakPtr();
		elm_object_part_content_set(layout, "elm.swallow.content", control->getEvasObj());
		return;
	}
	std::weak_ptr<bool> alive = m_alive;
	control = new CtInputViewControl(m_data, this,
		[this, alive](contacts_record_h record) {
			if (auto isAlive = alive.lock(); isAlive && *isAlive)
				__editExistContact(record);
		},
		[this, alive] {
			if (auto isAlive = alive.lock(); isAlive && *isAlive)
				__pushRelationshipPicker();
		},
		[this, alive] {
			if (auto isAlive = alive.lock(); isAlive && *isAlive)
				__onKeypadDown();
		});
	if (!control->create(layout, nullptr)) {
		WERROR("list control not created");
		return;
	}
	m_control = control->getWeakPtr();
	elm_object_part_content_set(layout, "elm.swallow.content", control->getEvasObj());
}

bool CtInputView::__controlIsEmpty()
{
	if (CtInputViewControl* control = __control())
		return control->__checkIsEmpty();
	if (CtInputViewSimControl* control = __simControl())
		return control->getIsEmpty();
	return true;
}

bool CtInputView::__controlIsChanged()
{
	if (CtInputViewControl* control = __control())
		return control->getIsChanged();
	if (CtInputViewSimControl* control = __simControl())
		return control->getIsChanged();
	return false;
}

bool CtInputView::__controlCheckEmergencyGroup()
{
	CtInputViewControl* control = __control();
	return !control || control->checkEmergencyGroup();
}

void CtInputView::__controlUpdateNameRecordForSim()
{
	if (CtInputViewSimControl* control = __simControl())
		control->updateNameRecordForSim();
}

// The view waits for the keypad to go down before it leaves: the entry that
// holds it also gives up the focus, so the keypad cannot stay up.
void CtInputView::__controlHideInputPanel()
{
	if (CtInputViewControl* control = __control())
		control->hideInputPanel();
	if (Evas_Object* focused = m_layout ? elm_object_focused_object_get(m_layout) : nullptr)
		elm_object_focus_set(focused, EINA_FALSE);
}

void CtInputView::__controlShowCreateKeypad()
{
	if (CtInputViewControl* control = __control())
		control->basicInfoItemShowCreateKeypad();
}

void CtInputView::__controlFocusForRename()
{
	if (CtInputViewControl* control = __control())
		control->focusForRename();
	else if (CtInputViewSimControl* control = __simControl())
		control->focusForRename();
}

void CtInputView::__controlCloseHoversel()
{
	if (CtInputViewControl* control = __control())
		control->closeHoversel();
}

void CtInputView::__controlUpdateStorageRow()
{
	if (CtInputViewSimControl* control = __simControl())
		control->updateAddrBookItem();
}

void CtInputView::__controlUpdateRealizedItems()
{
	if (CtInputViewControl* control = __control())
		control->updateRealizedItems();
	else if (Evas_Object* genlist = elm_object_part_content_get(m_layout, "elm.swallow.content"))
		elm_genlist_realized_items_update(genlist);
}

