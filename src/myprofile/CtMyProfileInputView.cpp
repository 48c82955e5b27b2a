#include "CtMyProfileInputView.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonTextUtil.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtEsuAgentMgr.h"
#include "CtInputViewAddressItem.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewEmailItem.h"
#include "CtInputViewEventItem.h"
#include "CtInputViewImportantFieldsItem.h"
#include "CtInputViewImportantSubItem.h"
#include "CtInputViewMessengerItem.h"
#include "CtInputViewMsisdnItem.h"
#include "CtInputViewMultiImageItem.h"
#include "CtInputViewNoteItem.h"
#include "CtInputViewNumberItem.h"
#include "CtInputViewStatusItem.h"
#include "CtInputViewWebsiteItem.h"
#include "CtMyProfileDatePopup.h"
#include "CtMyProfileInputData.h"
#include "CtProfileChangeOrderView.h"
#include "CtRegistryMgr.h"
#include "CtThemeMgr.h"
#include "WNaviframe.h"
#include "WPopup.h"
#include "WUiTimer.h"

#include <app_preference.h>
#include <bundle.h>
#include <notification.h>
#include <ui-gadget.h>
#include <velmora_log_manager.h>

#include <cstdio>
#include <cstring>
#include <vector>

namespace {

const char* const kCreateTitleId = "IDS_PB_HEADER_CREATE_PROFILE_ABB";
const char* const kEditTitleId = "IDS_PB_OPT_EDIT";
const char* const kPowerSavingKey = "db/setting/psmode";
const char* const kHasInfoPreference = "has_myprofile_info";
const char* const kHostName = "contacts-details";
constexpr int kMaxAddressBytes = 4096;

enum MoreEntry { MORE_ADDRESS = 1, MORE_EVENT, MORE_NICKNAME, MORE_ORGANISATION, MORE_WEBSITE, MORE_MESSENGER, MORE_PHONETIC };
enum PictureAction { PICTURE_GALLERY, PICTURE_CAMERA, PICTURE_PRESET, PICTURE_REMOVE };

const char* const kPictureActionIds[] = {
	"IDS_PB_OPT_FROM_GALLERY_ABB2", "IDS_PB_OPT_TAKE_PICTURE_ABB", "IDS_PB_OPT_FROM_PRESET_STYLES_ABB", "IDS_PB_OPT_REMOVE",
};

using RowKind = CtMyProfileInputView::RowKind;

CtInputViewGenlistItem* rowOf(Elm_Object_Item* item)
{
	auto* base = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
	return dynamic_cast<CtInputViewGenlistItem*>(base);
}

template <class Row>
bool is(CtInputViewGenlistItem* row)
{
	return dynamic_cast<Row*>(row) != nullptr;
}

int rowKindOf(Elm_Object_Item* item)
{
	CtInputViewGenlistItem* row = rowOf(item);
	if (is<CtInputViewMultiImageItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_IMAGE;
	if (is<CtInputViewBasicInfoItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_BASIC_INFO;
	if (is<CtInputViewStatusItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_STATUS;
	if (is<CtInputViewMsisdnItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_MSISDN;
	if (is<CtInputViewNumberItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_NUMBER;
	if (is<CtInputViewEmailItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_EMAIL;
	if (is<CtInputViewNoteItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_NOTE;
	if (is<CtInputViewAddressItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_ADDRESS;
	if (is<CtInputViewEventItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_EVENT;
	if (is<CtInputViewWebsiteItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_WEBSITE;
	if (is<CtInputViewMessengerItem>(row)) return CtMyProfileInputView::MYPROFILE_INPUT_MESSENGER;
	return CtMyProfileInputView::MYPROFILE_INPUT_ADD_FIELD;
}

std::string text(const char* value)
{
	return value ? value : "";
}

std::string storedText(CtData& data, RowKind kind, contacts_record_h record)
{
	switch (kind) {
	case CtMyProfileInputView::MYPROFILE_INPUT_NUMBER: return text(data.getNumberNumber(record));
	case CtMyProfileInputView::MYPROFILE_INPUT_EMAIL: return text(data.getEmailEmail(record));
	case CtMyProfileInputView::MYPROFILE_INPUT_NOTE: return text(data.getNote(record));
	case CtMyProfileInputView::MYPROFILE_INPUT_WEBSITE: return text(data.getWebsiteWebsite(record));
	case CtMyProfileInputView::MYPROFILE_INPUT_MESSENGER: return text(data.getMessengerMessenger(record));
	case CtMyProfileInputView::MYPROFILE_INPUT_ADDRESS: {
		char buffer[kMaxAddressBytes] = {0};
		data.getAddressAddress(record, buffer, sizeof(buffer));
		return buffer;
	}
	default: return std::string();
	}
}

bool isLunarCountry()
{
	char* country = vconf_get_str(VCONFKEY_CSC_COUNTRY_ISO);
	bool lunar = country && (strcmp(country, "CN") == 0 || strcmp(country, "KR") == 0);
	free(country);
	return lunar;
}

bool hasBirthday(CtData& data)
{
	bool found = false;
	Eina_List* events = data.getEventList();
	void* record = nullptr;
	Eina_List* node = nullptr;
	EINA_LIST_FOREACH(events, node, record)
		if (data.getDataType(static_cast<contacts_record_h>(record), _contacts_event.type) == CONTACTS_EVENT_TYPE_BIRTH)
			found = true;
	eina_list_free(events);
	return found;
}

void postNotice(const char* textId)
{
	int err = notification_status_message_post(ContactsCommon::translate(textId));
	if (err != NOTIFICATION_ERROR_NONE)
		WWARNING("notification_status_message_post() Failed(%d)", err);
}

// A record of the status survey (the picture count of saved profiles).
void insertStatusUsageLog(const char* feature, const char* extra)
{
	bundle* b = bundle_create();
	WPRET_M(!b, "bundle_create() is fail");
	bundle_add_str(b, "app_id", CONTACTS_APP_ID);
	bundle_add_str(b, "feature", feature);
	bundle_add_str(b, "extra", extra);
	velmora_log_manager_h handle = nullptr;
	if (velmora_log_manager_create(&handle) == 0) {
		velmora_log_manager_insert(handle, USAGE_LOG_STATUS_URI, b, 0, 0, nullptr);
		velmora_log_manager_destroy(handle);
	}
	bundle_free(b);
}

char* popupTextGetCb(void* data, Evas_Object*, const char* part)
{
	if (strcmp(part, "elm.text.main.left") != 0)
		return nullptr;
	return strdup(ContactsCommon::translate(static_cast<const char*>(data)));
}

Elm_Genlist_Item_Class* popupItemClass()
{
	static Elm_Genlist_Item_Class* itc = [] {
		Elm_Genlist_Item_Class* c = elm_genlist_item_class_new();
		c->item_style = "1line";
		c->func.text_get = popupTextGetCb;
		return c;
	}();
	return itc;
}

Evas_Object* createPopupGenlist(Evas_Object* parent)
{
	Evas_Object* genlist = elm_genlist_add(parent);
	elm_object_style_set(genlist, "popup");
	elm_genlist_homogeneous_set(genlist, EINA_TRUE);
	elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
	elm_scroller_content_min_limit(genlist, EINA_FALSE, EINA_TRUE);
	evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	return genlist;
}

app_control_h createRequest()
{
	app_control_h request = nullptr;
	int err = app_control_create(&request);
	if (err != APP_CONTROL_ERROR_NONE) {
		WWARNING("app_control_create() Failed(%d)", err);
		return nullptr;
	}
	return request;
}

} // namespace

CtMyProfileInputView::CtMyProfileInputView(contacts_record_h record, CtLaunchRequest* request)
	: m_request(request), m_inputData(std::make_shared<CtMyProfileInputData>(record))
{
	WENTER();
	__init();
}

CtMyProfileInputView::CtMyProfileInputView(WizardCallback wizardCallback, void* wizardView)
	: m_inputData(std::make_shared<CtMyProfileInputData>()), m_wizardMode(true), m_wizardView(wizardView),
	  m_wizardCallback(std::move(wizardCallback))
{
	WENTER();
	__init();
}

CtMyProfileInputView::~CtMyProfileInputView()
{
	WENTER();
	if (m_psmodeListening)
		CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(kPowerSavingKey, __onNotifyUPSModeChangedCb, this);
}

void CtMyProfileInputView::__init()
{
	m_isNew = m_inputData->getContactId() < 1;
	m_lunarAllowed = isLunarCountry();
	m_hasBirthday = std::make_shared<bool>(false);
	m_initialStatus = text(m_inputData->getStatus());
	__readKnownImagePaths();
}

std::shared_ptr<CtData> CtMyProfileInputView::getInputData() const
{
	return m_inputData;
}

Elm_Object_Item* CtMyProfileInputView::getFirstItem(RowKind kind) const
{
	for (Elm_Object_Item* item = m_genlist ? elm_genlist_first_item_get(m_genlist) : nullptr; item;
			item = elm_genlist_item_next_get(item))
		if (rowKindOf(item) == kind)
			return item;
	return nullptr;
}

Evas_Object* CtMyProfileInputView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	// The toolkit translates the texts of this screen with the catalogue bound here.
	ContactsCommon::bindTextDomain();
	setTitle(ContactsCommon::translate(m_isNew || m_wizardMode ? kCreateTitleId : kEditTitleId));
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	for (const char* edj : {"contacts/contacts.edj", "contacts/detail_layout.edj"}) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
	CtThemeMgr::getInstance()->setObjectTheme(layout);
	m_genlist = elm_genlist_add(layout);
	WPRET_VM(!m_genlist, layout, "elm_genlist_add() is failed");
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	// Every row only displays; set once for the list, as a change per row
	// makes the list measure that row again.
	elm_genlist_select_mode_set(m_genlist, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_object_part_content_set(layout, "elm.swallow.content", m_genlist);
	m_psmodeListening = CtRegistryMgr::getInstance()->registerVconfChangedCb(kPowerSavingKey,
		__onNotifyUPSModeChangedCb, this) == 0;
	return layout;
}

void CtMyProfileInputView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
	__addTitleButtons(naviItem);
	__addAllItems();
	if (getWindow())
		m_windowObj = getWindow()->getConformantEvasObj();
	if (m_windowObj) {
		evas_object_smart_callback_add(m_windowObj, "virtualkeypad,state,on", __onSipUpCb, this);
		evas_object_smart_callback_add(m_windowObj, "virtualkeypad,state,off", __onSipDownCb, this);
	}
}

void CtMyProfileInputView::onDestroy()
{
	WENTER();
	if (m_windowObj) {
		evas_object_smart_callback_del_full(m_windowObj, "virtualkeypad,state,on", __onSipUpCb, this);
		evas_object_smart_callback_del_full(m_windowObj, "virtualkeypad,state,off", __onSipDownCb, this);
		m_windowObj = nullptr;
	}
	if (m_psmodeListening)
		CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(kPowerSavingKey, __onNotifyUPSModeChangedCb, this);
	m_psmodeListening = false;
	m_genlist = nullptr;
	m_doneButton = m_cancelButton = nullptr;
	m_basicInfoRow = nullptr;
	m_addFieldRow = nullptr;
}

void CtMyProfileInputView::onLanguageChanged()
{
	setTitle(ContactsCommon::translate(m_isNew || m_wizardMode ? kCreateTitleId : kEditTitleId));
	if (Elm_Object_Item* naviItem = getNaviItem())
		elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
	if (m_genlist)
		elm_genlist_realized_items_update(m_genlist);
}

// The profile record is edited in memory only: nothing to follow here.
void CtMyProfileInputView::onDbChanged(const char*)
{
}

void CtMyProfileInputView::__addTitleButtons(Elm_Object_Item* naviItem)
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is NULL");
	Evas_Object* parent = naviframe->getEvasObj();
	m_cancelButton = ctCommonCreateButton(parent, "naviframe/title_left", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB",
		__cancelCb, this);
	if (Evas_Object* back = elm_object_item_part_content_unset(naviItem, "elm.swallow.prev_btn"))
		evas_object_del(back);
	elm_object_item_part_content_set(naviItem, "title_left_btn", m_cancelButton);
	m_doneButton = ctCommonCreateButton(parent, "naviframe/title_right", "IDS_TPLATFORM_ACBUTTON_DONE_ABB",
		__saveCb, this);
	elm_object_disabled_set(m_doneButton, m_isNew ? EINA_TRUE : EINA_FALSE);
	elm_object_item_part_content_set(naviItem, "title_right_btn", m_doneButton);
}

// Rows

void CtMyProfileInputView::__addAllItems()
{
	bool hasInfo = false;
	preference_get_boolean(kHasInfoPreference, &hasInfo);
	for (int index = MYPROFILE_INPUT_IMAGE; index <= MYPROFILE_INPUT_MAX; ++index)
		__addItem(index, hasInfo);
}

void CtMyProfileInputView::__addItem(int index, bool)
{
	CtContactsAgentMgr* agent = CtContactsAgentMgr::getInstance();
	CtEsuAgentMgr* esu = CtEsuAgentMgr::getInstance();
	switch (index) {
	case MYPROFILE_INPUT_IMAGE: {
		auto* row = new CtInputViewMultiImageItem(m_inputData, [this](int order) { __onPictureClicked(order); },
			[this] { __pushChangeOrder(); });
		if (m_inputData->getImageCount() > 0) {
			row->updateChangedState(m_inputData->getImagePath(1) ? m_inputData->getImagePath(1) : "picture");
			row->setIsChanged(false);
		}
		__insertRow(MYPROFILE_INPUT_IMAGE, row);
		__updateImageItem();
		break;
	}
	case MYPROFILE_INPUT_BASIC_INFO:
		__addBasicInfoItem();
		break;
	case MYPROFILE_INPUT_STATUS:
		if (esu->getEasySignUpCscFeatureEnabled() && esu->getEasySignUpStatus())
			__insertRow(MYPROFILE_INPUT_STATUS, new CtInputViewStatusItem(m_inputData, m_inputData->getProfileRecord(), 0,
				__fieldCallbacks(MYPROFILE_INPUT_STATUS), m_initialStatus.c_str()));
		break;
	case MYPROFILE_INPUT_MSISDN:
		// Without a number of its own the row would show a type and nothing else.
		if (contacts_record_h number = m_inputData->getDefaultNumber())
			__insertRow(MYPROFILE_INPUT_MSISDN, new CtInputViewMsisdnItem(m_inputData, number));
		break;
	case MYPROFILE_INPUT_NUMBER:
		__addFieldItems(MYPROFILE_INPUT_NUMBER, m_inputData->getNumberList());
		break;
	case MYPROFILE_INPUT_EMAIL:
		__addFieldItems(MYPROFILE_INPUT_EMAIL, m_inputData->getEmailList());
		if (m_wizardMode && agent->getProfileProperty(CT_PROFILE_PROPERTY_EMAIL) && !getFirstItem(MYPROFILE_INPUT_EMAIL))
			__addFieldRow(MYPROFILE_INPUT_EMAIL, m_inputData->addEmail(nullptr), false);
		break;
	case MYPROFILE_INPUT_NOTE:
		__addFieldItems(MYPROFILE_INPUT_NOTE, m_inputData->getNoteList());
		break;
	case MYPROFILE_INPUT_ADDRESS:
		__addFieldItems(MYPROFILE_INPUT_ADDRESS, m_inputData->getAddressList());
		if (m_wizardMode && agent->getProfileProperty(CT_PROFILE_PROPERTY_ADDRESS) && !getFirstItem(MYPROFILE_INPUT_ADDRESS))
			__addFieldRow(MYPROFILE_INPUT_ADDRESS, m_inputData->addAddress(nullptr), false);
		break;
	case MYPROFILE_INPUT_EVENT:
		__addEventItems();
		if (m_wizardMode && agent->getProfileProperty(CT_PROFILE_PROPERTY_BIRTHDAY) && !getFirstItem(MYPROFILE_INPUT_EVENT))
			__appendEventItem(0, 0, false, false);
		break;
	case MYPROFILE_INPUT_WEBSITE:
		__addFieldItems(MYPROFILE_INPUT_WEBSITE, m_inputData->getWebsiteList());
		break;
	case MYPROFILE_INPUT_MESSENGER:
		__addFieldItems(MYPROFILE_INPUT_MESSENGER, m_inputData->getMessengerList());
		break;
	case MYPROFILE_INPUT_ADD_FIELD:
		m_addFieldRow = new CtInputViewImportantFieldsItem({[this] { __addNumberClickedCb(); },
			[this] { __addEmailClickedCb(); }, [this] { __addNoteClickedCb(); }, [this] { __addMoreClickedCb(); }});
		m_addFieldRow->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, getFirstItem(MYPROFILE_INPUT_NOTE) != nullptr);
		if (!__insertRow(MYPROFILE_INPUT_ADD_FIELD, m_addFieldRow))
			m_addFieldRow = nullptr;
		break;
	default:
		break;
	}
}

void CtMyProfileInputView::__addBasicInfoItem()
{
	CtInputViewBasicInfoItem::Callbacks callbacks;
	callbacks.changed = [this] { __updateSaveBtn(); };
	callbacks.groupDeleted = [this](CtInputViewBasicInfoItem::ITEM_DELETED group) { __basicInfoItemDeleted(group); };
	callbacks.activated = [this](Evas_Object*, Elm_Object_Item* item) { __focusNextEntry(item); };
	m_basicInfoRow = new CtInputViewBasicInfoItem(m_inputData, nullptr, std::move(callbacks), 0,
		CtInputViewBasicInfoItem::Mode::MyProfile, false);
	if (m_wizardMode && CtContactsAgentMgr::getInstance()->getProfileProperty(CT_PROFILE_PROPERTY_ORGANIZATION))
		m_basicInfoRow->setOrganisationShown(true);
	if (!__insertRow(MYPROFILE_INPUT_BASIC_INFO, m_basicInfoRow))
		m_basicInfoRow = nullptr;
}

void CtMyProfileInputView::__addFieldItems(RowKind kind, Eina_List* records)
{
	void* record = nullptr;
	Eina_List* node = nullptr;
	EINA_LIST_FOREACH(records, node, record)
		__addFieldRow(kind, static_cast<contacts_record_h>(record), false);
	eina_list_free(records);
}

void CtMyProfileInputView::__addEventItems()
{
	*m_hasBirthday = hasBirthday(*m_inputData);
	Eina_List* events = m_inputData->getEventList();
	void* record = nullptr;
	Eina_List* node = nullptr;
	EINA_LIST_FOREACH(events, node, record) {
		auto* event = static_cast<contacts_record_h>(record);
		std::string date = std::to_string(m_inputData->getEventEvent(event));
		__insertRow(MYPROFILE_INPUT_EVENT, new CtInputViewEventItem(m_inputData, event, date.c_str(), m_hasBirthday,
			__fieldCallbacks(MYPROFILE_INPUT_EVENT), [this] { __updateEventItems(); }));
	}
	eina_list_free(events);
}

// A new row goes after the rows of its kind and of the kinds before it.
Elm_Object_Item* CtMyProfileInputView::__insertRow(RowKind kind, CtInputViewGenlistItem* row)
{
	WPRET_VM(!m_genlist || !row, nullptr, "data is NULL");
	Elm_Object_Item* before = nullptr;
	for (Elm_Object_Item* item = elm_genlist_first_item_get(m_genlist); item && !before;
			item = elm_genlist_item_next_get(item))
		if (rowKindOf(item) > kind)
			before = item;
	Elm_Object_Item* item = before
		? elm_genlist_item_insert_before(m_genlist, row->getItemClass(), row, nullptr, before, ELM_GENLIST_ITEM_NONE,
			row->getSelectCb(), nullptr)
		: elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr, ELM_GENLIST_ITEM_NONE,
			row->getSelectCb(), nullptr);
	if (!item) {
		WERROR("elm_genlist_item_append() is failed");
		delete row;
		return nullptr;
	}
	row->setElmObjectItem(item);
	row->attachToView(this);
	return item;
}

CtInputViewItemCallbacks CtMyProfileInputView::__fieldCallbacks(RowKind kind)
{
	CtInputViewItemCallbacks callbacks;
	callbacks.changed = [this] { __updateSaveBtn(); };
	callbacks.deleted = [this, kind](Elm_Object_Item*, bool heldText, contacts_record_h record) {
		__itemDeleted(kind, heldText, record);
	};
	callbacks.activated = [this](Evas_Object*, Elm_Object_Item* item) { __focusNextEntry(item); };
	return callbacks;
}

CtInputViewGenlistItem* CtMyProfileInputView::__createFieldRow(RowKind kind, contacts_record_h record, bool addedByUser)
{
	std::string stored = storedText(*m_inputData, kind, record);
	const char* initial = addedByUser ? nullptr : stored.c_str();
	CtInputViewItemCallbacks callbacks = __fieldCallbacks(kind);
	switch (kind) {
	case MYPROFILE_INPUT_NUMBER:
		return new CtInputViewNumberItem(m_inputData, record, addedByUser ? CtInputViewNumberItem::kAddKind : 0,
			callbacks, initial);
	case MYPROFILE_INPUT_EMAIL:
		return new CtInputViewEmailItem(m_inputData, record, addedByUser ? CtInputViewEmailItem::kAddKind : 0,
			callbacks, initial);
	case MYPROFILE_INPUT_NOTE:
		return new CtInputViewNoteItem(m_inputData, record, addedByUser ? CtInputViewNoteItem::kAddKind : 0,
			callbacks, initial);
	case MYPROFILE_INPUT_WEBSITE:
		return new CtInputViewWebsiteItem(m_inputData, record, addedByUser ? CtInputViewWebsiteItem::kAddKind : 0,
			callbacks, initial);
	case MYPROFILE_INPUT_MESSENGER:
		return new CtInputViewMessengerItem(m_inputData, record,
			addedByUser ? CtInputViewMessengerItem::kAddKind : 0, callbacks, initial);
	case MYPROFILE_INPUT_ADDRESS: {
		auto* row = new CtInputViewAddressItem(m_inputData, record,
			addedByUser ? CtInputViewAddressItem::kAddKind : 0, callbacks, initial);
		row->setLocationCallback([this](contacts_record_h address) { __launchMapsApp(address); });
		return row;
	}
	default:
		WERROR("Not handled case =%d", kind);
		return nullptr;
	}
}

Elm_Object_Item* CtMyProfileInputView::__addFieldRow(RowKind kind, contacts_record_h record, bool addedByUser)
{
	WPRET_VM(!record, nullptr, "record is NULL");
	return __insertRow(kind, __createFieldRow(kind, record, addedByUser));
}

void CtMyProfileInputView::__appendEventItem(int date, int calendarType, int isLeapMonth, bool addedByUser)
{
	contacts_record_h event = m_inputData->addEvent(date);
	WPRET_M(!event, "addEvent() is failed");
	if (m_lunarAllowed) {
		m_inputData->setCalendarType(event, calendarType);
		m_inputData->setIsLeapMonth(event, isLeapMonth != 0);
	}
	if (m_inputData->getDataType(event, _contacts_event.type) == CONTACTS_EVENT_TYPE_BIRTH)
		*m_hasBirthday = true;
	auto* row = new CtInputViewEventItem(m_inputData, event, nullptr, m_hasBirthday,
		__fieldCallbacks(MYPROFILE_INPUT_EVENT), [this] { __updateEventItems(); });
	if (addedByUser) {
		row->updateChangedState(std::to_string(date).c_str());
		m_rowsAddedOrDeleted = true;
	}
	__insertRow(MYPROFILE_INPUT_EVENT, row);
	__updateEventItems();
	__updateSaveBtn();
}

// Birthday is offered on one event row at most: every row's menu follows.
void CtMyProfileInputView::__updateEventItems()
{
	*m_hasBirthday = hasBirthday(*m_inputData);
	for (Elm_Object_Item* item = m_genlist ? elm_genlist_first_item_get(m_genlist) : nullptr; item;
			item = elm_genlist_item_next_get(item))
		if (rowKindOf(item) == MYPROFILE_INPUT_EVENT)
			elm_genlist_item_fields_update(item, "elm.icon.1", ELM_GENLIST_ITEM_FIELD_CONTENT);
}

void CtMyProfileInputView::__itemDeleted(RowKind kind, bool, contacts_record_h record)
{
	switch (kind) {
	case MYPROFILE_INPUT_NUMBER: m_inputData->removeNumber(record); break;
	case MYPROFILE_INPUT_EMAIL: m_inputData->removeEmail(record); break;
	case MYPROFILE_INPUT_ADDRESS: m_inputData->removeAddress(record); break;
	case MYPROFILE_INPUT_WEBSITE: m_inputData->removeWebsite(record); break;
	case MYPROFILE_INPUT_MESSENGER: m_inputData->removeMessenger(record); break;
	case MYPROFILE_INPUT_NOTE:
		m_inputData->removeNote(record);
		if (m_addFieldRow)
			m_addFieldRow->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, false);
		break;
	case MYPROFILE_INPUT_EVENT:
		m_inputData->removeEvent(record);
		*m_hasBirthday = hasBirthday(*m_inputData);
		app_assist::WUiTimer::addIdler([this](void*) {
			__updateEventItems();
			return false;
		}, nullptr, this);
		break;
	default:
		WERROR("Not handled case =%d", kind);
		return;
	}
	m_rowsAddedOrDeleted = true;
	__updateSaveBtn();
}

void CtMyProfileInputView::__basicInfoItemDeleted(int group)
{
	WPRET_M(!m_basicInfoRow, "data is NULL");
	m_basicInfoRow->removeGroup(static_cast<CtInputViewBasicInfoItem::ITEM_DELETED>(group));
	m_rowsAddedOrDeleted = true;
	__updateSaveBtn();
}

bool CtMyProfileInputView::__isAllEmpty()
{
	for (Elm_Object_Item* item = m_genlist ? elm_genlist_first_item_get(m_genlist) : nullptr; item;
			item = elm_genlist_item_next_get(item)) {
		CtInputViewGenlistItem* row = rowOf(item);
		if (row && rowKindOf(item) != MYPROFILE_INPUT_ADD_FIELD && !row->getIsEmpty())
			return false;
	}
	return true;
}

bool CtMyProfileInputView::__isChanged()
{
	for (Elm_Object_Item* item = m_genlist ? elm_genlist_first_item_get(m_genlist) : nullptr; item;
			item = elm_genlist_item_next_get(item)) {
		CtInputViewGenlistItem* row = rowOf(item);
		if (row && rowKindOf(item) != MYPROFILE_INPUT_ADD_FIELD && row->getIsChanged())
			return true;
	}
	return false;
}

void CtMyProfileInputView::__updateSaveBtn()
{
	WPRET_M(!m_doneButton, "done button is NULL");
	if (__isAllEmpty()) {
		WERROR("all fields are empty, can't save");
		elm_object_disabled_set(m_doneButton, EINA_TRUE);
		return;
	}
	if (!m_isNew) {
		WERROR("don't need to update save button");
		return;
	}
	elm_object_disabled_set(m_doneButton, __isChanged() ? EINA_FALSE : EINA_TRUE);
}

void CtMyProfileInputView::__focusNextEntry(Elm_Object_Item* item)
{
	for (Elm_Object_Item* next = item ? elm_genlist_item_next_get(item) : nullptr; next;
			next = elm_genlist_item_next_get(next)) {
		auto* row = dynamic_cast<CtInputViewFieldItem*>(rowOf(next));
		if (row && row->getEntry() && !elm_object_disabled_get(row->getEntry())) {
			elm_object_focus_set(row->getEntry(), EINA_TRUE);
			return;
		}
	}
	if (m_genlist)
		elm_object_focus_set(m_genlist, EINA_FALSE);
}

// Add-field actions

void CtMyProfileInputView::__addNumberClickedCb()
{
	WHIT();
	if (__addFieldRow(MYPROFILE_INPUT_NUMBER, m_inputData->addNumber(nullptr), true))
		m_rowsAddedOrDeleted = true;
}

void CtMyProfileInputView::__addEmailClickedCb()
{
	WHIT();
	if (__addFieldRow(MYPROFILE_INPUT_EMAIL, m_inputData->addEmail(nullptr), true))
		m_rowsAddedOrDeleted = true;
}

void CtMyProfileInputView::__addNoteClickedCb()
{
	WHIT();
	WPRET_M(getFirstItem(MYPROFILE_INPUT_NOTE), "note already is added");
	if (__addFieldRow(MYPROFILE_INPUT_NOTE, m_inputData->addNote(nullptr), true)) {
		m_rowsAddedOrDeleted = true;
		if (m_addFieldRow)
			m_addFieldRow->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, true);
	}
}

// The popup would open under the keypad: it waits until the keypad is down.
void CtMyProfileInputView::__addMoreClickedCb()
{
	WHIT();
	if (m_keypadUp)
		m_morePending = true;
	else
		__showMorePopup();
}

void CtMyProfileInputView::__showMorePopup()
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_BUTTON_MORE");
	popup->setContent([this](Evas_Object* parent) {
		Evas_Object* genlist = createPopupGenlist(parent);
		for (int entry = MORE_ADDRESS; entry <= MORE_PHONETIC; ++entry) {
			if (m_basicInfoRow && ((entry == MORE_NICKNAME && m_basicInfoRow->getNicknameShown())
					|| (entry == MORE_ORGANISATION && m_basicInfoRow->getOrganisationShown())
					|| (entry == MORE_PHONETIC && m_basicInfoRow->getPhoneticShown())))
				continue;
			auto* row = new CtInputViewImportantSubItem(entry, CtInputViewImportantSubItem::Mode::MyProfile);
			Elm_Object_Item* item = elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, __moreItemSelectedCb, this);
			row->setElmObjectItem(item);
		}
		return genlist;
	});
	attachPopup(popup);
}

void CtMyProfileInputView::__moreItemSelectedCb(void* data, Evas_Object*, void* eventInfo)
{
	WHIT();
	auto* view = static_cast<CtMyProfileInputView*>(data);
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	WPRET_M(!view || !item, "data is NULL");
	auto* row = dynamic_cast<CtInputViewImportantSubItem*>(
		static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item)));
	WPRET_M(!row, "data is NULL");
	int entry = row->getEntry();
	// The popup's list is still running this callback: it goes afterwards.
	app_assist::WUiTimer::addIdler([view, entry](void*) {
		view->destroyPopup();
		view->__importantSubitemSelected(entry);
		return false;
	}, nullptr, view);
}

void CtMyProfileInputView::__importantSubitemSelected(int entry)
{
	WENTER();
	Elm_Object_Item* added = nullptr;
	switch (entry) {
	case MORE_ADDRESS: added = __addFieldRow(MYPROFILE_INPUT_ADDRESS, m_inputData->addAddress(nullptr), true); break;
	case MORE_EVENT: __createEventDataPopup(); break;
	case MORE_NICKNAME: __showBasicInfoGroup(CtInputViewBasicInfoItem::NICKNAME); break;
	case MORE_ORGANISATION: __showBasicInfoGroup(CtInputViewBasicInfoItem::ORGANISATION); break;
	case MORE_WEBSITE: added = __addFieldRow(MYPROFILE_INPUT_WEBSITE, m_inputData->addWebsite(nullptr), true); break;
	case MORE_MESSENGER: added = __addFieldRow(MYPROFILE_INPUT_MESSENGER, m_inputData->addMessenger(nullptr), true); break;
	case MORE_PHONETIC: __showBasicInfoGroup(CtInputViewBasicInfoItem::PHONETIC_NAME); break;
	default: WERROR("Not handled case =%d", entry); break;
	}
	if (added) {
		m_rowsAddedOrDeleted = true;
		elm_genlist_item_show(added, ELM_GENLIST_ITEM_SCROLLTO_IN);
	}
}

void CtMyProfileInputView::__showBasicInfoGroup(int group)
{
	WPRET_M(!m_basicInfoRow, "data is NULL");
	switch (group) {
	case CtInputViewBasicInfoItem::PHONETIC_NAME:
		m_basicInfoRow->setPhoneticShown(true);
		m_basicInfoRow->setFocusGroup(CtInputViewBasicInfoItem::FOCUS_PHONETIC);
		break;
	case CtInputViewBasicInfoItem::NICKNAME:
		m_basicInfoRow->setNicknameShown(true);
		m_basicInfoRow->setFocusGroup(CtInputViewBasicInfoItem::FOCUS_NICKNAME);
		break;
	default:
		m_basicInfoRow->setOrganisationShown(true);
		m_basicInfoRow->setFocusGroup(CtInputViewBasicInfoItem::FOCUS_ORGANISATION);
		break;
	}
	m_basicInfoRow->refreshFields();
}

void CtMyProfileInputView::__createEventDataPopup()
{
	attachPopup(new CtMyProfileDatePopup(m_lunarAllowed, [this](int date, int calendarType, bool isLeapMonth) {
		__appendEventItem(date, calendarType, isLeapMonth, true);
	}));
}

// Pictures

void CtMyProfileInputView::__readKnownImagePaths()
{
	for (int order = 1; order <= 5; ++order)
		m_knownImagePaths[order - 1] = text(m_inputData->getImagePath(order));
}

void CtMyProfileInputView::__onPictureClicked(int order)
{
	WHIT();
	m_pictureSlot = order;
	__showPicturePopup();
}

void CtMyProfileInputView::__showPicturePopup()
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_BUTTON_SET_PICTURE_ABB");
	bool hasPicture = m_inputData->getImagePath(m_pictureSlot) != nullptr;
	popup->setContent([this, hasPicture](Evas_Object* parent) {
		Evas_Object* genlist = createPopupGenlist(parent);
		for (int action = PICTURE_GALLERY; action <= (hasPicture ? PICTURE_REMOVE : PICTURE_PRESET); ++action)
			elm_genlist_item_append(genlist, popupItemClass(), kPictureActionIds[action], nullptr,
				ELM_GENLIST_ITEM_NONE, __pictureItemSelectedCb, this);
		return genlist;
	});
	attachPopup(popup);
}

void CtMyProfileInputView::__pictureItemSelectedCb(void* data, Evas_Object*, void* eventInfo)
{
	WHIT();
	auto* view = static_cast<CtMyProfileInputView*>(data);
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	WPRET_M(!view || !item, "data is NULL");
	int action = elm_genlist_item_index_get(item) - 1;
	app_assist::WUiTimer::addIdler([view, action](void*) {
		view->destroyPopup();
		view->__pictureActionSelected(action);
		return false;
	}, nullptr, view);
}

void CtMyProfileInputView::__pictureActionSelected(int action)
{
	switch (action) {
	case PICTURE_GALLERY: __launchGallery(); break;
	case PICTURE_CAMERA: __launchCamera(); break;
	case PICTURE_PRESET: __launchDecorateContactImage(); break;
	case PICTURE_REMOVE: __removeImage(); break;
	default: WERROR("Not handled case =%d", action); break;
	}
}

void CtMyProfileInputView::__launchGallery()
{
	app_control_h request = createRequest();
	WPRET_M(!request, "request is NULL");
	app_control_set_operation(request, APP_CONTROL_OPERATION_PICK);
	app_control_set_app_id(request, GALLERY_APP_ID);
	const char* const extras[][2] = {
		{"hide-personal", "true"}, {"launch-type", "select-setas"}, {"setas-type", "callerid"}, {"View Mode", "SETAS"},
		{"Setas type", "CallerID"}, {"Area Size", "100"}, {"Resolution", "480x480"},
	};
	for (const auto& extra : extras)
		app_control_add_extra_data(request, extra[0], extra[1]);
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	__launch(request);
}

void CtMyProfileInputView::__launchCamera()
{
	app_control_h request = createRequest();
	WPRET_M(!request, "request is NULL");
	app_control_set_operation(request, APP_CONTROL_OPERATION_CREATE_CONTENT);
	app_control_set_mime(request, "image/jpg");
	app_control_add_extra_data(request, "CALLER", "contacts");
	app_control_add_extra_data(request, "selfie_mode", "true");
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	__launch(request);
}

void CtMyProfileInputView::__launchDecorateContactImage()
{
	app_control_h request = createRequest();
	WPRET_M(!request, "request is NULL");
	app_control_set_app_id(request, IMAGE_EDITOR_APP_ID);
	app_control_add_extra_data(request, "type", "individual");
	__launch(request);
}

void CtMyProfileInputView::__launch(app_control_h request)
{
	if (!ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request, __pictureReplyCb, this, getEvasObj()))
		WERROR("launch Failed");
	app_control_destroy(request);
}

void CtMyProfileInputView::__pictureReplyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	WHIT();
	auto* view = static_cast<CtMyProfileInputView*>(data);
	WPRET_M(!view || !reply, "data is NULL");
	if (result != APP_CONTROL_RESULT_SUCCEEDED)
		return;
	char** selected = nullptr;
	int count = 0;
	char* path = nullptr;
	if (app_control_get_extra_data_array(reply, APP_CONTROL_DATA_SELECTED, &selected, &count) == APP_CONTROL_ERROR_NONE
			&& selected) {
		for (int i = 0; i < count; ++i) {
			if (i == 0)
				path = selected[0];
			else
				free(selected[i]);
		}
		free(selected);
	}
	if (!path)
		app_control_get_extra_data(reply, "path", &path);
	view->__updateImageRecord(path);
	free(path);
}

void CtMyProfileInputView::__updateImageRecord(const char* path)
{
	WPRET_M(!path || !*path, "path is NULL");
	int count = m_inputData->getImageCount();
	int slot = m_pictureSlot;
	// Pictures stay numbered without gaps: a new one follows the last.
	if (!m_inputData->getImagePath(slot) && slot > count + 1)
		slot = count + 1;
	contacts_record_h image = m_inputData->getImageRecord(slot);
	WPRET_M(!image, "getImageRecord() is failed");
	m_inputData->setImage(image, path, CONTACTS_IMAGE_TYPE_OTHER);
	m_pictureChanged = true;
	__updateImageItem();
	__updateSaveBtn();
}

void CtMyProfileInputView::__removeImage()
{
	WPRET_M(!m_inputData->getImagePath(m_pictureSlot), "no picture in slot %d", m_pictureSlot);
	m_inputData->removeImage(m_inputData->getImageRecord(m_pictureSlot));
	m_pictureChanged = true;
	__updateImageItem();
	__updateSaveBtn();
}

void CtMyProfileInputView::__updateImageItem()
{
	Elm_Object_Item* item = getFirstItem(MYPROFILE_INPUT_IMAGE);
	WPRET_M(!item, "__genlistItems[MYPROFILE_INPUT_IMAGE] is NULL");
	auto* row = static_cast<CtInputViewMultiImageItem*>(rowOf(item));
	int count = row->getPictureCount();
	if (m_pictureChanged) {
		row->updateChangedState(count > 0 ? text(m_inputData->getImagePath(1)).c_str() : nullptr);
		row->setIsChanged(true);
	}
	elm_genlist_item_update(item);
	row->onSetElmObjectItem(item);
}

void CtMyProfileInputView::__pushChangeOrder()
{
	WHIT();
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is NULL");
	std::weak_ptr<app_assist::WControl> alive = getWeakPtr();
	naviframe->push(new CtProfileChangeOrderView(m_inputData, getFirstItem(MYPROFILE_INPUT_IMAGE), [this, alive] {
		if (alive.expired())
			return;
		__readKnownImagePaths();
		m_pictureChanged = true;
		__updateImageItem();
	}));
}

void CtMyProfileInputView::__launchMapsApp(contacts_record_h address)
{
	WHIT();
	WPRET_M(!address, "data is NULL");
	std::string mapsAppId;
	ctCommontGetMapsAppId(mapsAppId);
	WPRET_M(mapsAppId.empty(), "mapsAppId is empty");
	std::string addressText = storedText(*m_inputData, MYPROFILE_INPUT_ADDRESS, address);
	app_control_h request = createRequest();
	WPRET_M(!request, "request is NULL");
	if (mapsAppId == MAPS_APP_ID) {
		app_control_set_app_id(request, MAPS_APP_ID);
		app_control_add_extra_data(request, "searchByName", addressText.c_str());
	} else {
		std::string encoded;
		ctCommontEncodeAddress(addressText.c_str(), encoded);
		char uri[kMaxAddressBytes] = {0};
		snprintf(uri, sizeof(uri), "geo:0,0?q=\"%s\"", encoded.c_str());
		app_control_set_operation(request, APP_CONTROL_OPERATION_PICK);
		app_control_set_uri(request, uri);
	}
	if (!ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request))
		WERROR("launch Failed");
	app_control_destroy(request);
}

// Saving and leaving

void CtMyProfileInputView::__save()
{
	WENTER();
	if (m_saved)
		return;
	if (m_genlist)
		elm_object_focus_set(m_genlist, EINA_FALSE);
	if (m_cancelButton)
		elm_object_disabled_set(m_cancelButton, EINA_TRUE);
	__closeHoversel();
	__removeEmptyItems();
	// Unlike a write that is only logged, a failed one keeps the form and
	// what was typed, so that nothing is lost and the user can try again.
	if (!__writeProfile()) {
		postNotice("IDS_PB_TPOP_FAILED_TO_SAVE_PROFILE_TRY_AGAIN");
		if (m_cancelButton)
			elm_object_disabled_set(m_cancelButton, EINA_FALSE);
		return;
	}
	m_saved = true;
	if (m_wizardCallback) {
		WizardCallback callback = std::move(m_wizardCallback);
		m_wizardCallback = nullptr;
		callback(m_wizardView);
	}
	__writeUsageLogs();
	if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled()) {
		CtContactsAgentMgr::getInstance()->syncStartForProfile();
		CtContactsAgentMgr::getInstance()->syncStart(nullptr, nullptr);
	}
	CtRegistryMgr::getInstance()->raiseChangeSignal(
		m_isNew ? CT_REGISTRY_KEY_CONTACT_DATA_CHANGED : CT_REGISTRY_KEY_PROFILE_SAVED, 0);
	int err = preference_set_boolean(kHasInfoPreference, true);
	if (err != PREFERENCE_ERROR_NONE)
		WWARNING("preference_set_boolean() Failed(%d)", err);
	__requestPop();
}

// Rows left empty would be stored as empty e-mails, addresses or dates.
void CtMyProfileInputView::__removeEmptyItems()
{
	std::vector<CtInputViewGenlistItem*> empty;
	for (Elm_Object_Item* item = m_genlist ? elm_genlist_first_item_get(m_genlist) : nullptr; item;
			item = elm_genlist_item_next_get(item)) {
		int kind = rowKindOf(item);
		CtInputViewGenlistItem* row = rowOf(item);
		if (kind >= MYPROFILE_INPUT_NUMBER && kind <= MYPROFILE_INPUT_MESSENGER && row && row->getIsEmpty())
			empty.push_back(row);
	}
	for (CtInputViewGenlistItem* row : empty) {
		if (auto* field = dynamic_cast<CtInputViewFieldItem*>(row))
			field->deleteRow();
		else if (auto* event = dynamic_cast<CtInputViewEventItem*>(row))
			event->deleteRow();
	}
}

bool CtMyProfileInputView::__writeProfile()
{
	if (m_isNew) {
		int id = 0;
		int err = m_inputData->insertContact(&id);
		if (err != CONTACTS_ERROR_NONE)
			WERROR("insert failed %d", err);
		return err == CONTACTS_ERROR_NONE;
	}
	int err = m_inputData->updateContact();
	if (err != CONTACTS_ERROR_NONE)
		WERROR("update failed %d", err);
	return err == CONTACTS_ERROR_NONE;
}

void CtMyProfileInputView::__writeUsageLogs()
{
	ctCommonInsertUsageLog("CT13", "Update");
	if (text(m_inputData->getStatus()) != m_initialStatus)
		ctCommonInsertUsageLog("CT13", "Update status message");
	if (m_pictureChanged)
		ctCommonInsertUsageLog("CT13", "Update multi image");
	char extra[32] = {0};
	snprintf(extra, sizeof(extra), "%d image", m_inputData->getImageCount());
	insertStatusUsageLog("CT23", extra);
}

// With the keypad up the pop waits for it to close.
void CtMyProfileInputView::__requestPop()
{
	if (m_keypadUp) {
		m_popPending = true;
		return;
	}
	m_popRequested = true;
	popOut();
}

bool CtMyProfileInputView::onPop()
{
	WENTER();
	if (m_saved) {
		if (m_request && m_request->ug && (!m_request->callerAppId || strcmp(m_request->callerAppId, kHostName) != 0)) {
			ug_destroy_me(m_request->ug);
			return false;
		}
		return m_popRequested;
	}
	if (m_discardConfirmed) {
		if (m_wizardCallback) {
			WizardCallback callback = std::move(m_wizardCallback);
			m_wizardCallback = nullptr;
			callback(m_wizardView);
		}
		return true;
	}
	__closeHoversel();
	if (__isChanged() || (!m_isNew && m_rowsAddedOrDeleted)) {
		__showDiscardPopup();
		return false;
	}
	return true;
}

void CtMyProfileInputView::__showDiscardPopup()
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_HEADER_DISCARD_CHANGES_ABB");
	popup->setContent("IDS_PB_POP_ALL_CHANGES_WILL_BE_DISCARDED");
	popup->addButton("IDS_PB_BUTTON_CANCEL", nullptr);
	popup->addButton("IDS_PB_BUTTON_DISCARD_ABB", [this](bool*) {
		m_discardConfirmed = true;
		if (m_doneButton)
			elm_object_disabled_set(m_doneButton, EINA_TRUE);
		popOut();
	});
	attachPopup(popup);
}

void CtMyProfileInputView::__closeHoversel()
{
	for (Elm_Object_Item* item = m_genlist ? elm_genlist_first_item_get(m_genlist) : nullptr; item;
			item = elm_genlist_item_next_get(item)) {
		CtInputViewGenlistItem* row = rowOf(item);
		if (Evas_Object* hoversel = row ? row->getHoverselObj() : nullptr)
			elm_hoversel_hover_end(hoversel);
	}
}

void CtMyProfileInputView::__onSipUp()
{
	m_keypadUp = true;
}

void CtMyProfileInputView::__onSipDown()
{
	m_keypadUp = false;
	if (m_morePending) {
		m_morePending = false;
		__showMorePopup();
	}
	if (m_popPending) {
		m_popPending = false;
		app_assist::WUiTimer::addIdler([this](void*) {
			m_popRequested = true;
			popOut();
			return false;
		}, nullptr, this);
	}
}

void CtMyProfileInputView::__saveCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtMyProfileInputView*>(data)->__save();
}

void CtMyProfileInputView::__cancelCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtMyProfileInputView*>(data)->popOut();
}

void CtMyProfileInputView::__onSipUpCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtMyProfileInputView*>(data)->__onSipUp();
}

void CtMyProfileInputView::__onSipDownCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtMyProfileInputView*>(data)->__onSipDown();
}

void CtMyProfileInputView::__onNotifyUPSModeChangedCb(keynode_t*, void* data)
{
	WHIT();
	auto* view = static_cast<CtMyProfileInputView*>(data);
	WPRET_M(!view, "data is NULL");
	view->destroyPopup();
	if (view->m_genlist)
		elm_genlist_realized_items_update(view->m_genlist);
}
