#include "CtInputViewControl.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtAddressbookPopup.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"
#include "CtDatePicker.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtGroupGroupInfo.h"
#include "CtInputData.h"
#include "CtInputView.h"
#include "CtInputViewAddrBookItem.h"
#include "CtInputViewAddressItem.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewEmailItem.h"
#include "CtInputViewEventItem.h"
#include "CtInputViewGroupsItem.h"
#include "CtInputViewImportantFieldsItem.h"
#include "CtInputViewImportantSubItem.h"
#include "CtInputViewMessengerItem.h"
#include "CtInputViewNoteItem.h"
#include "CtInputViewNumberItem.h"
#include "CtInputViewRelationItem.h"
#include "CtInputViewRingtoneItem.h"
#include "CtInputViewStatusItem.h"
#include "CtInputViewWebsiteItem.h"
#include "CtPredictionListTrigger.h"
#include "CtPrimaryInputViewNameItem.h"
#include "CtPrimaryInputViewNumberItem.h"
#include "CtRegistryMgr.h"
#include "CtThemeMgr.h"
#include "WPopup.h"

#include <glib.h>
#include <ui_extension.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <sys/stat.h>

namespace {

const int kPrimaryEditType = 112;
const int kEmergencyType = 126;
const double kNameKeypadDelay = 0.01;
const double kRingtonePopupCloseDelay = 2.0;
const int kPopupRowHeight = 56;
const int kPopupVisibleRows = 6;
const int kAddressBytes = 1024;
const int kMorePopupEntries = 11;
const int kRingtoneEntry = 11;
const char* const kProfileSharingId = "IDS_PB_MBODY_PROFILE_SHARING";
const char* const kPsmodeKey = "db/setting/psmode";
const char* const kRegionFormatKey = "db/menu_widget/regionformat";
const char* const kRingtoneFolder = "/usr/share/sounds/ringtones";
const char* const kGroupsPickerType = "36";

// What an add button or an add-field entry makes.
struct AddedField {
	int kind;
	int addKind;
	const char* usageFeature;
	const char* usageExtra;
};
const AddedField kAddedFields[] = {
	{ CtInputViewControl::INPUT_NUMBER, CtInputViewNumberItem::kAddKind, "CT08", "Phone" },
	{ CtInputViewControl::INPUT_EMAIL, CtInputViewEmailItem::kAddKind, "CT08", "Email" },
	{ CtInputViewControl::INPUT_NOTE, CtInputViewNoteItem::kAddKind, "CT08", "Notes" },
	{ CtInputViewControl::INPUT_ADDRESS, CtInputViewAddressItem::kAddKind, nullptr, nullptr },
	{ CtInputViewControl::INPUT_WEBSITE, CtInputViewWebsiteItem::kAddKind, nullptr, nullptr },
	{ CtInputViewControl::INPUT_MESSENGER, CtInputViewMessengerItem::kAddKind, nullptr, nullptr },
	{ CtInputViewControl::INPUT_RELATIONSHIP, CtInputViewRelationItem::kAddKind, nullptr, nullptr },
};

const char* const kMoreUsageExtras[kMorePopupEntries] = { "Save_contacts_to", "Groups", "Organisation", "Address",
	"Web_address", "IM_account", "Event", "Nickname", "Phonetic_name", "Relationship", "Ringtone" };

int readVconfInt(const char* key)
{
	int value = 0;
	if (vconf_get_int(key, &value) != VCONF_OK && vconf_get_bool(key, &value) != VCONF_OK)
		return 0;
	return value;
}

bool isEmpty(const char* text)
{
	return !text || !*text;
}

std::string extraOf(app_control_h reply, const char* key)
{
	char* value = nullptr;
	if (!reply || app_control_get_extra_data(reply, key, &value) != APP_CONTROL_ERROR_NONE)
		return std::string();
	std::string out = value ? value : "";
	free(value);
	return out;
}

// The first value of the array extra `key` (or of a plain text extra).
std::string firstOf(app_control_h reply, const char* key)
{
	if (!reply)
		return std::string();
	char** values = nullptr;
	int count = 0;
	std::string out;
	if (app_control_get_extra_data_array(reply, key, &values, &count) == APP_CONTROL_ERROR_NONE && values) {
		if (count > 0 && values[0])
			out = values[0];
		for (int i = 0; i < count; ++i)
			free(values[i]);
		free(values);
		return out;
	}
	return extraOf(reply, key);
}

// Whether `path` is a regular file the toolkit can show as a picture.
bool isPictureFile(Evas* canvas, const std::string& path)
{
	struct stat st;
	if (path.empty() || stat(path.c_str(), &st) != 0 || !S_ISREG(st.st_mode) || !canvas)
		return false;
	Evas_Object* image = evas_object_image_add(canvas);
	evas_object_image_file_set(image, path.c_str(), nullptr);
	bool loaded = evas_object_image_load_error_get(image) == EVAS_LOAD_ERROR_NONE;
	evas_object_del(image);
	return loaded;
}

// Group ids as consecutive 32-bit integers in the device's byte order, in Base64.
std::string encodeGroupIds(const std::vector<int>& ids)
{
	std::vector<int32_t> raw(ids.begin(), ids.end());
	gchar* text = g_base64_encode(reinterpret_cast<const guchar*>(raw.data()), raw.size() * sizeof(int32_t));
	std::string out = text ? text : "";
	g_free(text);
	return out;
}

// The ids of a Base64 list; false for a text that is not a whole list.
bool decodeGroupIds(const std::string& text, std::vector<int>& ids)
{
	static const char* const kAlphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/=";
	if (text.size() % 4 != 0 || text.find_first_not_of(kAlphabet) != std::string::npos)
		return false;
	gsize length = 0;
	guchar* bytes = g_base64_decode(text.c_str(), &length);
	bool whole = bytes && length % sizeof(int32_t) == 0;
	for (gsize i = 0; whole && i < length; i += sizeof(int32_t)) {
		int32_t id = 0;
		memcpy(&id, bytes + i, sizeof(id));
		ids.push_back(id);
	}
	g_free(bytes);
	return whole;
}

struct tm today()
{
	time_t now = time(nullptr);
	struct tm date = {};
	localtime_r(&now, &date);
	date.tm_hour = 12;
	date.tm_min = date.tm_sec = 0;
	return date;
}

// The lunar conversion takes a date whose week and year days are filled in.
struct tm withWeekDays(struct tm date)
{
	date.tm_hour = 12;
	date.tm_min = date.tm_sec = 0;
	date.tm_isdst = -1;
	mktime(&date);
	return date;
}

void untrackCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto** slot = static_cast<Evas_Object**>(data);
	if (*slot == obj)
		*slot = nullptr;
}

void track(Evas_Object** slot, Evas_Object* obj)
{
	if (*slot)
		evas_object_event_callback_del_full(*slot, EVAS_CALLBACK_DEL, untrackCb, slot);
	*slot = obj;
	if (obj)
		evas_object_event_callback_add(obj, EVAS_CALLBACK_DEL, untrackCb, slot);
}

bool hasItem(Evas_Object* genlist, Elm_Object_Item* wanted)
{
	for (Elm_Object_Item* it = genlist ? elm_genlist_first_item_get(genlist) : nullptr; it;
			it = elm_genlist_item_next_get(it))
		if (it == wanted)
			return true;
	return false;
}

// The entries of a row, top to bottom (the basic info row has several).
std::vector<Evas_Object*> entriesOf(CtInputViewGenlistItem* row)
{
	std::vector<Evas_Object*> entries;
	if (auto* basic = dynamic_cast<CtInputViewBasicInfoItem*>(row)) {
		for (int i = 0; i < CtInputViewBasicInfoItem::FIELD_COUNT; ++i)
			if (Evas_Object* entry = basic->getFieldEntry(static_cast<CtInputViewBasicInfoItem::Field>(i)))
				entries.push_back(entry);
	} else if (auto* field = dynamic_cast<CtInputViewFieldItem*>(row)) {
		if (field->getEntry())
			entries.push_back(field->getEntry());
	} else if (auto* name = dynamic_cast<CtPrimaryInputViewNameItem*>(row)) {
		if (name->getEntry())
			entries.push_back(name->getEntry());
	}
	return entries;
}

// The rows of the picture popup (the last only when there is a picture).
const char* const kPictureChoices[] = { "IDS_PB_OPT_FROM_GALLERY_ABB2", "IDS_PB_OPT_TAKE_PICTURE_ABB",
	"IDS_PB_OPT_FROM_PRESET_STYLES_ABB", "IDS_PB_OPT_REMOVE" };

char* popupRowTextCb(void* data, Evas_Object*, const char* part)
{
	if (strcmp(part, "elm.text.main.left") != 0)
		return nullptr;
	return strdup(ContactsCommon::translate(static_cast<const char*>(data)));
}

Elm_Genlist_Item_Class* popupRowClass()
{
	static Elm_Genlist_Item_Class* itc = [] {
		Elm_Genlist_Item_Class* c = elm_genlist_item_class_new();
		c->item_style = "1line";
		c->func.text_get = popupRowTextCb;
		return c;
	}();
	return itc;
}

// A popup list: a box whose minimum height shows up to kPopupVisibleRows rows.
Evas_Object* createPopupList(Evas_Object* parent, Evas_Object** genlistOut)
{
	Evas_Object* box = elm_box_add(parent);
	Evas_Object* genlist = elm_genlist_add(box);
	CtThemeMgr::getInstance()->setObjectTheme(genlist);
	elm_object_style_set(genlist, "popup");
	elm_genlist_homogeneous_set(genlist, EINA_TRUE);
	elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(genlist);
	elm_box_pack_end(box, genlist);
	evas_object_show(box);
	*genlistOut = genlist;
	return box;
}

// Whether a stored contact's picture is the file at `path`.
bool isStoredPicture(const std::string& path)
{
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	int count = 1; // when the store cannot tell, the file is kept
	if (contacts_query_create(_contacts_image._uri, &query) == CONTACTS_ERROR_NONE
			&& contacts_filter_create(_contacts_image._uri, &filter) == CONTACTS_ERROR_NONE
			&& contacts_filter_add_str(filter, _contacts_image.path, CONTACTS_MATCH_EXACTLY, path.c_str()) == CONTACTS_ERROR_NONE
			&& contacts_query_set_filter(query, filter) == CONTACTS_ERROR_NONE) {
		int err = contacts_db_get_count_with_query(query, &count);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_db_get_count_with_query", err);
			count = 1;
		}
	}
	if (filter)
		contacts_filter_destroy(filter);
	if (query)
		contacts_query_destroy(query);
	return count > 0;
}

void fitPopupList(Evas_Object* genlist)
{
	int rows = std::min<int>(elm_genlist_items_count(genlist), kPopupVisibleRows);
	evas_object_size_hint_min_set(elm_object_parent_widget_get(genlist), 0,
			static_cast<int>(rows * kPopupRowHeight * ctCommonGetScale()));
}

} // namespace

CtInputViewControl::CtInputViewControl(std::shared_ptr<CtData> inputData, CtInputView* view,
		ExistingContactCallback onExistingContact, std::function<void()> onSelectRelationContact,
		std::function<void()> onKeypadDown)
	: m_inputData(std::move(inputData)), m_view(view), m_onExistingContact(std::move(onExistingContact)),
	  m_onSelectRelationContact(std::move(onSelectRelationContact)), m_onKeypadDown(std::move(onKeypadDown)),
	  m_hasBirthday(std::make_shared<bool>(false)), m_alive(std::make_shared<bool>(true))
{
	WENTER();
	if (m_view)
		m_viewRef = m_view->getWeakPtr();
	CtRegistryMgr::getInstance()->registerVconfChangedCb(kRegionFormatKey, __regionFormatChangedCb, this);
	CtRegistryMgr::getInstance()->registerVconfChangedCb(kPsmodeKey, __powerSavingChangedCb, this);
	m_isLunarSupported = CtInputViewEventItem::isLunarSupported();
	m_isPowerSaving = __isPowerSaving();
	if (!m_inputData)
		return;
	const char* name = m_inputData->getAddressbookName();
	if (__isPowerSaving() && m_inputData->getContactId() <= 0 && !isEmpty(name)
			&& m_inputData->getAddressbookId() != 0 && !m_inputData->checkAddressbookIsSimOrNot(m_inputData->getAddressbookId()))
		m_inputData->setAddressbookInfo(0);
}

CtInputViewControl::~CtInputViewControl()
{
	*m_alive = false;
	CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(kRegionFormatKey, __regionFormatChangedCb, this);
	CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(kPsmodeKey, __powerSavingChangedCb, this);
	if (m_registryListenerId)
		CtRegistryMgr::getInstance()->removeChangeListener(m_registryListenerId);
	app_control_cancel_replies(this);
}

const char* CtInputViewControl::getClassName()
{
	return "CtInputViewControl";
}

Elm_Object_Item* CtInputViewControl::getLastItem(InputItemKind kind) const
{
	return kind >= 0 && kind < kItemKindCount ? m_genlistItems[kind] : nullptr;
}

// Lifecycle

Evas_Object* CtInputViewControl::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	WPRET_VM(!m_inputData, nullptr, "data is NULL");
	m_genlist = elm_genlist_add(parent);
	WPRET_VM(!m_genlist, nullptr, "elm_genlist_add() failed");
	CtThemeMgr::getInstance()->setObjectTheme(m_genlist);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	elm_genlist_homogeneous_set(m_genlist, m_inputData->getContactId() == 0 ? EINA_TRUE : EINA_FALSE);
	evas_object_show(m_genlist);
	int launchType = m_view ? m_view->getInputType() : -1;
	if (m_inputData->getContactId() > 0 && launchType != kPrimaryEditType)
		uxt_scroller_set_auto_scroll_enabled(m_genlist, EINA_FALSE);

	evas_object_smart_callback_add(m_genlist, "realized", __genlistRealizedCb, this);
	evas_object_smart_callback_add(m_genlist, "pressed", __genlistPressedCb, this);
	evas_object_smart_callback_add(m_genlist, "scroll", __genlistScrollCb, this);
	evas_object_event_callback_add(m_genlist, EVAS_CALLBACK_RESIZE, __genlistResizeCb, this);
	evas_object_event_callback_add(m_genlist, EVAS_CALLBACK_MOUSE_DOWN, __genlistMouseDownCb, this);

	m_prediction = std::make_unique<CtPredictionListTrigger>(m_genlist, m_genlist, m_inputData->getContactId() <= 0,
			[this](contacts_record_h record) {
				if (m_onExistingContact)
					m_onExistingContact(record);
			});
	__addAllItems(m_genlist);

	if (m_view && m_view->getWindow()) {
		m_conformant = m_view->getWindow()->getConformantEvasObj();
		evas_object_smart_callback_add(m_conformant, "virtualkeypad,state,on", __sipUpCb, this);
		evas_object_smart_callback_add(m_conformant, "virtualkeypad,state,off", __sipDownCb, this);
	}
	m_registryListenerId = CtRegistryMgr::getInstance()->addChangeListener([this](ctRegistryKey key, int value) {
		if (key == CT_REGISTRY_KEY_RELATIONSHIP_PERSON && m_relationItem)
			__onRelationshipPersonPicked(value);
	});
	return m_genlist;
}

void CtInputViewControl::onDestroy()
{
	WENTER();
	*m_alive = false;
	if (m_conformant) {
		evas_object_smart_callback_del_full(m_conformant, "virtualkeypad,state,on", __sipUpCb, this);
		evas_object_smart_callback_del_full(m_conformant, "virtualkeypad,state,off", __sipDownCb, this);
		m_conformant = nullptr;
	}
	if (m_registryListenerId) {
		CtRegistryMgr::getInstance()->removeChangeListener(m_registryListenerId);
		m_registryListenerId = 0;
	}
	app_control_cancel_replies(this);
	// Popups of this control call back into it: they end with it.
	for (auto* popup : { &m_morePopup, &m_picturePopup, &m_changeLocationPopup, &m_storagePopup, &m_datePopup })
		if (auto open = popup->lock())
			open->destroy();
	m_prediction.reset();
	// A picture copied for a form that closes unsaved is not left behind.
	auto view = m_viewRef.lock();
	if (!m_copiedImagePath.empty() && (!view || view->isDestroying()) && !isStoredPicture(m_copiedImagePath))
		ctCommonUnlinkFile(m_copiedImagePath.c_str());
	if (m_genlist) {
		evas_object_smart_callback_del_full(m_genlist, "realized", __genlistRealizedCb, this);
		evas_object_event_callback_del_full(m_genlist, EVAS_CALLBACK_RESIZE, __genlistResizeCb, this);
		evas_object_event_callback_del_full(m_genlist, EVAS_CALLBACK_MOUSE_DOWN, __genlistMouseDownCb, this);
	}
	m_genlist = nullptr;
	m_genlistItems.fill(nullptr);
}

// List building

void CtInputViewControl::__addAllItems(Evas_Object*)
{
	int launchType = m_view ? m_view->getInputType() : -1;
	if (launchType == kPrimaryEditType || launchType == kEmergencyType) {
		CtPrimaryInputViewNameItem::Callbacks nameCallbacks;
		nameCallbacks.activated = [this](Evas_Object* entry, Elm_Object_Item* item) { __activateNextEntry(entry, item); };
		nameCallbacks.nameChanged = [this](Evas_Object*) {};
		nameCallbacks.pictureClicked = [this] { __basicInfoItemImageClicked(); };
		auto* nameRow = new CtPrimaryInputViewNameItem(m_inputData, nameCallbacks, launchType);
		m_genlistItems[INPUT_BASIC_INFO] = __appendRow(nameRow);
		m_nameEntry = nullptr;
		contacts_record_h number = m_inputData->getEmergencyNumber();
		if (!number)
			number = m_inputData->addNumber("");
		CtInputViewItemCallbacks callbacks;
		callbacks.activated = [this](Evas_Object* entry, Elm_Object_Item* item) { __activateNextEntry(entry, item); };
		const char* text = m_inputData->getNumberNumber(number);
		auto* numberRow = new CtPrimaryInputViewNumberItem(m_inputData, number, callbacks, isEmpty(text) ? nullptr : text);
		m_genlistItems[INPUT_NUMBER] = __appendRow(numberRow);
		return;
	}
	if (!(__isEasySignUpStorage() && m_inputData->getFullName().empty())) {
		CtInputViewBasicInfoItem::Callbacks callbacks;
		callbacks.changed = [this, launchType] {
			if (launchType != kPrimaryEditType && launchType != kEmergencyType)
				__updateSaveBtn();
		};
		callbacks.groupDeleted = [this](CtInputViewBasicInfoItem::ITEM_DELETED group) { __basicInfoItemDeleted(group); };
		callbacks.activated = [this](Evas_Object* entry, Elm_Object_Item* item) { __activateNextEntry(entry, item); };
		callbacks.showKeypad = [this] { basicInfoItemShowCreateKeypad(); };
		callbacks.nameChanged = [this](Evas_Object* entry) { __createPredictionList(entry); };
		callbacks.pictureClicked = [this] { __basicInfoItemImageClicked(); };
		auto* row = new CtInputViewBasicInfoItem(m_inputData, &m_nameEntry, callbacks, launchType);
		m_genlistItems[INPUT_BASIC_INFO] = __appendRow(row);
	}
	if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled() && __isEasySignUpStorage()) {
		const char* status = m_inputData->getStatus();
		std::string text = status ? status : "";
		if (dynamic_cast<CtInputData*>(m_inputData.get()))
			free(const_cast<char*>(status)); // the ordinary contact hands out a copy
		if (!text.empty())
			m_genlistItems[INPUT_STATUS] = __appendRow(__makeFieldRow(INPUT_STATUS, nullptr, 0));
	}
	__appendRemainingItems();
}

void CtInputViewControl::__appendRemainingItems()
{
	m_remainingItems.clear();
	bool isNew = m_inputData->getContactId() <= 0;
	Eina_List* node = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(m_inputData->getNumberList(), node, data)
		if (data)
			m_remainingItems.emplace_back(INPUT_NUMBER, static_cast<contacts_record_h>(data));
	if (m_remainingItems.empty() && isNew) {
		contacts_record_h number = m_inputData->addNumber("");
		if (number)
			m_genlistItems[INPUT_NUMBER] = __appendRow(__makeFieldRow(INPUT_NUMBER, number, 0));
	}
	const std::pair<int, Eina_List*> lists[] = {
		{ INPUT_EMAIL, m_inputData->getEmailList() },
		{ INPUT_NOTE, m_inputData->getNoteList() },
		{ INPUT_ADDRESS, m_inputData->getAddressList() },
		{ INPUT_EVENT, m_inputData->getEventList() },
		{ INPUT_RELATIONSHIP, m_inputData->getRelationshipList() },
		{ INPUT_WEBSITE, m_inputData->getWebsiteList() },
		{ INPUT_MESSENGER, m_inputData->getMessengerList() },
	};
	for (const auto& list : lists) {
		if (list.first == INPUT_EVENT)
			*m_hasBirthday = false;
		EINA_LIST_FOREACH(list.second, node, data) {
			if (!data)
				continue;
			auto* record = static_cast<contacts_record_h>(data);
			if (list.first == INPUT_EVENT && m_inputData->getDataType(record, _contacts_event.type) == CONTACTS_EVENT_TYPE_BIRTH)
				*m_hasBirthday = true;
			m_remainingItems.emplace_back(list.first, record);
		}
	}
	size_t recordCount = m_remainingItems.size();
	for (int kind : { INPUT_RINGTONE, INPUT_GROUPS, INPUT_ADDRESSBOOK, INPUT_IMPORTANT_FIELDS, INPUT_FINISH })
		m_remainingItems.emplace_back(kind, nullptr);

	if (recordCount > static_cast<size_t>(kDeferredAppendThreshold) && !isNew) {
		m_remainingIndex = 0;
		m_isDeferredAppend = true;
		// The first tick comes before the first frame is drawn: the screen
		// shows first, the rows follow one per frame.
		auto firstTick = std::make_shared<bool>(true);
		m_appendAnimator = app_assist::WUiTimer::addAnimator([this, firstTick](void*) {
			if (*firstTick) {
				*firstTick = false;
				return true;
			}
			return __appendRemainingItemsCb();
		}, nullptr, this);
		return;
	}
	m_isDeferredAppend = false;
	for (const RemainingItem& item : m_remainingItems)
		if (!__appendItem(item.first, item.second, false))
			break;
}

bool CtInputViewControl::__appendRemainingItemsCb()
{
	if (m_remainingIndex >= m_remainingItems.size()) {
		WERROR("__remainingIndex is out of range [%zu / %zu]", m_remainingIndex, m_remainingItems.size());
		m_isDeferredAppend = false;
		return false;
	}
	const RemainingItem& item = m_remainingItems[m_remainingIndex++];
	bool goOn = __appendItem(item.first, item.second, true);
	if (!goOn)
		m_isDeferredAppend = false;
	return goOn;
}

bool CtInputViewControl::__appendItem(int kind, contacts_record_h record, bool deferred)
{
	if (kind < INPUT_NUMBER || kind > INPUT_FINISH || !m_genlist)
		return false;
	if (kind <= INPUT_MESSENGER && !record) {
		WERROR("record is NULL");
		return false;
	}
	switch (kind) {
	case INPUT_EVENT: {
		std::string date = std::to_string(m_inputData->getEventEvent(record));
		m_genlistItems[kind] = __appendRow(__makeEventRow(record, date.c_str()));
		break;
	}
	case INPUT_RINGTONE:
		if (!__isEasySignUpStorage() && !isEmpty(m_inputData->getRingtone()))
			__addRingtonItem();
		break;
	case INPUT_GROUPS:
		if (!__isEasySignUpStorage() && m_inputData->getContactId() > 0)
			__addGroupsItem();
		break;
	case INPUT_ADDRESSBOOK:
		if (!m_inputData->getAddressbookItemShown() && m_inputData->getContactId() <= 0)
			break;
		m_genlistItems[kind] = __appendRow(new CtInputViewAddrBookItem(m_inputData, [this] { __onAddrbookItemSelectedCb(); }));
		break;
	case INPUT_IMPORTANT_FIELDS: {
		if (__isEasySignUpStorage())
			break;
		auto* row = new CtInputViewImportantFieldsItem({ [this] { __addNumberClickedCb(); },
			[this] { __addEmailClickedCb(); }, [this] { __addNoteClickedCb(); }, [this] { __addMoreClickedCb(); } });
		row->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, m_genlistItems[INPUT_NOTE] != nullptr);
		m_genlistItems[kind] = __appendRow(row);
		break;
	}
	case INPUT_FINISH:
		__finishList(deferred);
		return false;
	default:
		m_genlistItems[kind] = __appendRow(__makeFieldRow(kind, record, 0));
		break;
	}
	return true;
}

void CtInputViewControl::__finishList(bool deferred)
{
	int launchType = m_view ? m_view->getInputType() : -1;
	if (launchType >= 0 && launchType != kPrimaryEditType) {
		for (int kind : { INPUT_NUMBER, INPUT_EMAIL })
			if (CtInputViewGenlistItem* row = __rowOf(kind))
				row->setIsPrefilled(true);
	}
	if (auto* buttons = dynamic_cast<CtInputViewImportantFieldsItem*>(__rowOf(INPUT_IMPORTANT_FIELDS)))
		buttons->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, m_genlistItems[INPUT_NOTE] != nullptr);
	__updateEventItems();
	if (deferred && m_genlist)
		uxt_scroller_set_auto_scroll_enabled(m_genlist, EINA_TRUE);
	__updateSaveBtn();
}

CtInputViewGenlistItem* CtInputViewControl::__makeFieldRow(int kind, contacts_record_h record, int addKind)
{
	CtInputViewItemCallbacks callbacks;
	callbacks.changed = [this] { __updateSaveBtn(); };
	callbacks.deleted = [this, kind](Elm_Object_Item* item, bool heldText, contacts_record_h deleted) {
		__itemDeleted(kind, item, heldText, deleted);
	};
	callbacks.activated = [this](Evas_Object* entry, Elm_Object_Item* item) { __activateNextEntry(entry, item); };
	callbacks.focus = [this](bool focused) { __updateEntryReturnTypeByFocusedState(focused); };
	auto stored = [addKind](const char* text) { return addKind == 0 && !isEmpty(text) ? text : nullptr; };
	CtData* data = m_inputData.get();
	switch (kind) {
	case INPUT_STATUS:
		callbacks.deleted = nullptr;
		callbacks.focus = nullptr;
		return new CtInputViewStatusItem(m_inputData, nullptr, 0, callbacks, nullptr);
	case INPUT_NUMBER:
		return new CtInputViewNumberItem(m_inputData, record, addKind, callbacks, stored(data->getNumberNumber(record)));
	case INPUT_EMAIL:
		return new CtInputViewEmailItem(m_inputData, record, addKind, callbacks, stored(data->getEmailEmail(record)));
	case INPUT_NOTE:
		return new CtInputViewNoteItem(m_inputData, record, addKind, callbacks, stored(data->getNote(record)));
	case INPUT_ADDRESS: {
		char address[kAddressBytes] = {};
		data->getAddressAddress(record, address, sizeof(address));
		auto* row = new CtInputViewAddressItem(m_inputData, record, addKind, callbacks, stored(address));
		row->setLocationCallback([this, row](contacts_record_h) { __launchMapsApp(row->getElmObjectItem(), row->getRecord()); });
		return row;
	}
	case INPUT_RELATIONSHIP: {
		auto* row = new CtInputViewRelationItem(m_inputData, record, addKind, callbacks,
				stored(data->getRelationshipRelationship(record)));
		row->setContactSelectCallback([this](CtInputViewRelationItem* picked) { __relationSelectContactClicked(picked); });
		return row;
	}
	case INPUT_WEBSITE:
		return new CtInputViewWebsiteItem(m_inputData, record, addKind, callbacks, stored(data->getWebsiteWebsite(record)));
	case INPUT_MESSENGER:
		return new CtInputViewMessengerItem(m_inputData, record, addKind, callbacks,
				stored(data->getMessengerMessenger(record)));
	default:
		WERROR("Not handled case =%d", kind);
		return nullptr;
	}
}

CtInputViewGenlistItem* CtInputViewControl::__makeEventRow(contacts_record_h record, const char* initialText)
{
	CtInputViewItemCallbacks callbacks;
	callbacks.changed = [this] { __updateSaveBtn(); };
	callbacks.deleted = [this](Elm_Object_Item* item, bool heldText, contacts_record_h deleted) {
		__itemDeleted(INPUT_EVENT, item, heldText, deleted);
	};
	return new CtInputViewEventItem(m_inputData, record, initialText, m_hasBirthday, callbacks,
			[this] { __updateEventItems(); });
}

Elm_Object_Item* CtInputViewControl::__appendRow(CtInputViewGenlistItem* row)
{
	WPRET_VM(!row || !m_genlist, nullptr, "row or genlist is NULL");
	Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr, ELM_GENLIST_ITEM_NONE,
			row->getSelectCb(), nullptr);
	if (!item) {
		delete row;
		return nullptr;
	}
	row->setElmObjectItem(item);
	row->attachToView(m_view);
	if (!dynamic_cast<CtInputViewAddrBookItem*>(row) && !dynamic_cast<CtInputViewRingtoneItem*>(row)
			&& !dynamic_cast<CtInputViewGroupsItem*>(row))
		elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_NONE);
	return item;
}

Elm_Object_Item* CtInputViewControl::__findInsertAfter(int kind) const
{
	for (int k = std::min(kind, kItemKindCount - 1); k >= 0; --k)
		if (m_genlistItems[k])
			return m_genlistItems[k];
	return nullptr;
}

Elm_Object_Item* CtInputViewControl::__insertRow(CtInputViewGenlistItem* row, int kind, bool showTop)
{
	WPRET_VM(!row || !m_genlist, nullptr, "row or genlist is NULL");
	Elm_Object_Item* after = __findInsertAfter(kind);
	Elm_Object_Item* item = after
		? elm_genlist_item_insert_after(m_genlist, row->getItemClass(), row, nullptr, after, ELM_GENLIST_ITEM_NONE,
				row->getSelectCb(), nullptr)
		: elm_genlist_item_prepend(m_genlist, row->getItemClass(), row, nullptr, ELM_GENLIST_ITEM_NONE,
				row->getSelectCb(), nullptr);
	if (!item) {
		delete row;
		return nullptr;
	}
	row->setElmObjectItem(item);
	row->attachToView(m_view);
	m_genlistItems[kind] = item;
	if (kind != INPUT_RINGTONE && kind != INPUT_GROUPS && kind != INPUT_ADDRESSBOOK)
		elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_NONE);
	if (showTop)
		elm_genlist_item_show(item, ELM_GENLIST_ITEM_SCROLLTO_TOP);
	return item;
}

CtInputViewGenlistItem* CtInputViewControl::__rowOf(Elm_Object_Item* item) const
{
	if (!item)
		return nullptr;
	auto* base = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
	return dynamic_cast<CtInputViewGenlistItem*>(base);
}

std::vector<Elm_Object_Item*> CtInputViewControl::__fieldItems(bool fromBasicInfo) const
{
	std::vector<Elm_Object_Item*> items;
	if (!m_genlist)
		return items;
	Elm_Object_Item* start = fromBasicInfo && m_genlistItems[INPUT_BASIC_INFO] ? m_genlistItems[INPUT_BASIC_INFO]
			: elm_genlist_first_item_get(m_genlist);
	for (Elm_Object_Item* it = start; it; it = elm_genlist_item_next_get(it)) {
		if (it == m_genlistItems[INPUT_ADDRESSBOOK] || it == m_genlistItems[INPUT_IMPORTANT_FIELDS])
			break;
		items.push_back(it);
	}
	return items;
}

bool CtInputViewControl::__isEasySignUpStorage()
{
	int book = CtEsuAgentMgr::getInstance()->getEasySignUpAddressBookId();
	return book >= 0 && book == m_inputData->getAddressbookId();
}

bool CtInputViewControl::__isProfileSharingStorage()
{
	const char* name = m_inputData->getAddressbookName();
	return name && strcmp(name, ContactsCommon::translate(kProfileSharingId)) == 0;
}

bool CtInputViewControl::__isPowerSaving() const
{
	return readVconfInt(kPsmodeKey) != 0;
}

// Save button, empty and changed tests

bool CtInputViewControl::__checkIsEmpty()
{
	WPRET_VM(!m_genlist, true, "__genlist is NULL");
	bool sharing = __isProfileSharingStorage();
	for (Elm_Object_Item* item : __fieldItems(false)) {
		CtInputViewGenlistItem* row = __rowOf(item);
		if (!row)
			continue;
		if (!row->getIsEmpty() || sharing)
			return false;
	}
	return true;
}

bool CtInputViewControl::__checkIsInsert()
{
	WPRET_VM(!m_genlist, false, "__genlist is NULL");
	bool sharing = __isProfileSharingStorage();
	for (Elm_Object_Item* item : __fieldItems(false)) {
		if (item == m_genlistItems[INPUT_EVENT] || item == m_genlistItems[INPUT_RINGTONE]
				|| item == m_genlistItems[INPUT_GROUPS])
			return true;
		CtInputViewGenlistItem* row = __rowOf(item);
		if (row && (!row->getIsEmpty() || sharing))
			return true;
	}
	return !isEmpty(m_inputData->getImagePath());
}

bool CtInputViewControl::getIsChanged()
{
	if (m_isItemDeleted || m_isImageChanged)
		return true;
	for (Elm_Object_Item* item : __fieldItems(true)) {
		CtInputViewGenlistItem* row = __rowOf(item);
		if (!row)
			continue;
		if (row->getIsPrefilled() ? !row->getIsEmpty() : row->getIsChanged())
			return true;
	}
	return false;
}

void CtInputViewControl::__updateSaveBtn()
{
	if (!m_genlist || isDestroying())
		return;
	bool empty = __checkIsEmpty();
	if (m_view)
		m_view->updateSaveBtn(empty);
	if (empty)
		WDEBUG("all fields are empty, can't save");
}

bool CtInputViewControl::checkEmergencyGroup()
{
	if (!m_inputData || !m_inputData->isInEmergencyGroup())
		return true;
	Eina_List* node = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(m_inputData->getNumberList(), node, data)
		if (data && !isEmpty(m_inputData->getNumberNumber(static_cast<contacts_record_h>(data))))
			return true;
	return false;
}

// Entries, focus and return keys

void CtInputViewControl::__activateNextEntry(Evas_Object* entry, Elm_Object_Item* item)
{
	WPRET_M(!entry, "obj is NULL");
	if (m_prediction)
		m_prediction->destroyPredictionList();
	std::vector<Elm_Object_Item*> items = __fieldItems(false);
	auto at = std::find(items.begin(), items.end(), item);
	if (at != items.end()) {
		// An entry of the same row below this one comes first.
		std::vector<Evas_Object*> own = entriesOf(__rowOf(item));
		auto self = std::find(own.begin(), own.end(), entry);
		if (self != own.end() && ++self != own.end()) {
			elm_object_focus_set(*self, EINA_TRUE);
			return;
		}
		for (++at; at != items.end(); ++at) {
			std::vector<Evas_Object*> entries = entriesOf(__rowOf(*at));
			if (!entries.empty()) {
				elm_object_focus_set(entries.front(), EINA_TRUE);
				elm_entry_cursor_end_set(entries.front());
				return;
			}
		}
	}
	elm_entry_input_panel_hide(entry);
	elm_object_focus_set(entry, EINA_FALSE);
}

void CtInputViewControl::__updateEntryReturnKeyType(Elm_Object_Item* except)
{
	Evas_Object* last = nullptr;
	for (Elm_Object_Item* item : __fieldItems(true)) {
		if (item == except)
			continue;
		for (Evas_Object* entry : entriesOf(__rowOf(item))) {
			if (!elm_entry_single_line_get(entry))
				continue;
			elm_entry_input_panel_return_key_type_set(entry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_NEXT);
			last = entry;
		}
	}
	if (last)
		elm_entry_input_panel_return_key_type_set(last, ELM_INPUT_PANEL_RETURN_KEY_TYPE_DONE);
}

void CtInputViewControl::__updateEntryReturnTypeByFocusedState(bool focused)
{
	if (focused == m_isSipShown)
		__updateEntryReturnKeyType(nullptr);
}

void CtInputViewControl::basicInfoItemShowCreateKeypad()
{
	WPRET_M(!m_inputData || m_inputData->getContactId() != 0, "__inputData->getContactId() != 0");
	app_assist::WUiTimer::destroy(m_nameKeypadTimer);
	m_nameKeypadTimer = app_assist::WUiTimer::addTimer(kNameKeypadDelay, [this](void*) {
		focusForRename();
		return false;
	}, nullptr, this);
}

void CtInputViewControl::focusForRename()
{
	WPRET_M(!m_nameEntry, "name entry is NULL");
	elm_object_focus_set(m_nameEntry, EINA_TRUE);
	elm_entry_cursor_end_set(m_nameEntry);
}

void CtInputViewControl::hideInputPanel()
{
	for (Elm_Object_Item* item : __fieldItems(false)) {
		for (Evas_Object* entry : entriesOf(__rowOf(item))) {
			if (elm_object_focus_get(entry)) {
				elm_entry_input_panel_hide(entry);
				elm_object_focus_set(entry, EINA_FALSE);
				return;
			}
		}
	}
}

void CtInputViewControl::closeHoversel()
{
	if (m_prediction)
		m_prediction->destroyPredictionList();
	for (Elm_Object_Item* item : __fieldItems(false)) {
		CtInputViewGenlistItem* row = __rowOf(item);
		if (Evas_Object* hoversel = row ? row->getHoverselObj() : nullptr)
			elm_hoversel_hover_end(hoversel);
	}
}

void CtInputViewControl::updateAddrbookItem()
{
	if (auto* row = dynamic_cast<CtInputViewAddrBookItem*>(__rowOf(INPUT_ADDRESSBOOK)))
		row->update();
	__updateBasicInfoItem();
}

void CtInputViewControl::updateRealizedItems()
{
	if (m_genlist)
		elm_genlist_realized_items_update(m_genlist);
}

void CtInputViewControl::__createPredictionList(Evas_Object* entry)
{
	if (m_prediction && entry)
		m_prediction->onNameChanged(entry, m_genlistItems[INPUT_BASIC_INFO], m_inputData->getFullName());
}

// Deleted rows

void CtInputViewControl::__itemDeleted(int kind, Elm_Object_Item* item, bool heldText, contacts_record_h record)
{
	Elm_Object_Item*& last = m_genlistItems[kind];
	if (last == item) {
		Elm_Object_Item* prev = elm_genlist_item_prev_get(item);
		bool sameClass = prev && elm_genlist_item_item_class_get(prev) == elm_genlist_item_item_class_get(item);
		last = sameClass ? prev : nullptr;
	}
	CtData* data = m_inputData.get();
	bool hasValue = false;
	switch (kind) {
	case INPUT_NUMBER: hasValue = !isEmpty(data->getNumberNumber(record)); break;
	case INPUT_EMAIL: hasValue = !isEmpty(data->getEmailEmail(record)); break;
	case INPUT_NOTE: hasValue = !isEmpty(data->getNote(record)); break;
	case INPUT_ADDRESS: {
		char address[kAddressBytes] = {};
		data->getAddressAddress(record, address, sizeof(address));
		hasValue = address[0] != '\0';
		break;
	}
	case INPUT_EVENT: hasValue = data->getEventEvent(record) != 0; break;
	case INPUT_RELATIONSHIP: hasValue = !isEmpty(data->getRelationshipRelationship(record)); break;
	case INPUT_WEBSITE: hasValue = !isEmpty(data->getWebsiteWebsite(record)); break;
	case INPUT_MESSENGER: hasValue = !isEmpty(data->getMessengerMessenger(record)); break;
	default: break;
	}
	CtInputViewGenlistItem* row = __rowOf(item);
	bool prefilledNumber = kind == INPUT_NUMBER && row && row->getIsPrefilled();
	if ((heldText || hasValue) && !prefilledNumber)
		m_isItemDeleted = true;

	switch (kind) {
	case INPUT_NUMBER: data->removeNumber(record); break;
	case INPUT_EMAIL: data->removeEmail(record); break;
	case INPUT_NOTE: data->removeNote(record); break;
	case INPUT_ADDRESS: data->removeAddress(record); break;
	case INPUT_EVENT: data->removeEvent(record); break;
	case INPUT_RELATIONSHIP: data->removeRelationship(record); break;
	case INPUT_WEBSITE: data->removeWebsite(record); break;
	case INPUT_MESSENGER: data->removeMessenger(record); break;
	default: break;
	}
	if (item == m_relationItem)
		m_relationItem = nullptr;
	if (item == m_addressItem)
		m_addressItem = nullptr;

	__updateSaveBtn();
	if (kind == INPUT_EVENT) {
		bool birthday = false;
		Eina_List* node = nullptr;
		void* event = nullptr;
		EINA_LIST_FOREACH(data->getEventList(), node, event)
			if (event && data->getDataType(static_cast<contacts_record_h>(event), _contacts_event.type) == CONTACTS_EVENT_TYPE_BIRTH)
				birthday = true;
		*m_hasBirthday = birthday;
		// The deleted row is still in the list: refresh once it is gone.
		app_assist::WUiTimer::addIdler([this](void*) {
			__updateEventItems();
			return false;
		}, nullptr, this);
	} else {
		__updateEntryReturnKeyType(item);
	}
	m_isAdding = false;
	if (kind == INPUT_NOTE)
		if (auto* buttons = dynamic_cast<CtInputViewImportantFieldsItem*>(__rowOf(INPUT_IMPORTANT_FIELDS)))
			buttons->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, false);
}

void CtInputViewControl::__ringtoneItemDeleted(bool heldText)
{
	if (heldText)
		m_isItemDeleted = true;
	m_inputData->setRingtone(nullptr);
	m_genlistItems[INPUT_RINGTONE] = nullptr;
	__updateSaveBtn();
}

void CtInputViewControl::__basicInfoItemDeleted(int group)
{
	auto* row = dynamic_cast<CtInputViewBasicInfoItem*>(__rowOf(INPUT_BASIC_INFO));
	WPRET_M(!row, "basicInfoItem is NULL");
	auto deleted = static_cast<CtInputViewBasicInfoItem::ITEM_DELETED>(group);
	bool held = row->groupHasText(deleted);
	switch (group) {
	case CtInputViewBasicInfoItem::PHONETIC_NAME:
		held = held || !isEmpty(m_inputData->getPhoneticFirstName()) || !isEmpty(m_inputData->getPhoneticMiddleName())
				|| !isEmpty(m_inputData->getPhoneticLastName());
		break;
	case CtInputViewBasicInfoItem::NICKNAME:
		held = held || !isEmpty(m_inputData->getNickname());
		break;
	case CtInputViewBasicInfoItem::ORGANISATION:
		held = held || !m_inputData->getCompany().empty() || !isEmpty(m_inputData->getJobTitle());
		break;
	default:
		WERROR("Not handled case =%d", group);
		return;
	}
	if (held)
		m_isItemDeleted = true;
	row->removeGroup(deleted);
	__updateSaveBtn();
	__updateEntryReturnKeyType(m_genlistItems[INPUT_BASIC_INFO]);
}

void CtInputViewControl::__updateEventItems()
{
	for (Elm_Object_Item* item = m_genlistItems[INPUT_EVENT]; item; item = elm_genlist_item_prev_get(item)) {
		if (!dynamic_cast<CtInputViewEventItem*>(__rowOf(item)))
			break;
		elm_genlist_item_fields_update(item, "elm.icon.1", ELM_GENLIST_ITEM_FIELD_CONTENT);
	}
}

void CtInputViewControl::__updateBasicInfoItem()
{
	__refreshPicture();
	Elm_Object_Item* storage = m_genlistItems[INPUT_ADDRESSBOOK];
	if (storage && CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled())
		elm_object_item_signal_emit(storage, __isProfileSharingStorage() ? "link,contacts,disable" : "link,contacts,enable", "");
}

void CtInputViewControl::__refreshPicture()
{
	if (Elm_Object_Item* item = m_genlistItems[INPUT_BASIC_INFO])
		elm_genlist_item_fields_update(item, "elm.icon", ELM_GENLIST_ITEM_FIELD_CONTENT);
}

// Add buttons and the add-field popup

void CtInputViewControl::__addFieldRow(int kind)
{
	const AddedField* field = std::find_if(std::begin(kAddedFields), std::end(kAddedFields),
			[kind](const AddedField& f) { return f.kind == kind; });
	WPRET_M(field == std::end(kAddedFields), "Not handled case =%d", kind);
	if (kind == INPUT_NOTE && m_genlistItems[INPUT_NOTE]) {
		WERROR("note already is added");
		return;
	}
	CtData* data = m_inputData.get();
	contacts_record_h record = nullptr;
	switch (kind) {
	case INPUT_NUMBER: record = data->addNumber(""); break;
	case INPUT_EMAIL: record = data->addEmail(""); break;
	case INPUT_NOTE: record = data->addNote(""); break;
	case INPUT_ADDRESS: record = data->addAddress(""); break;
	case INPUT_WEBSITE: record = data->addWebsite(""); break;
	case INPUT_MESSENGER: record = data->addMessenger(""); break;
	case INPUT_RELATIONSHIP: record = data->addRelationship(""); break;
	default: break;
	}
	WPRET_M(!record, "record is NULL");
	m_isAdding = true;
	m_addedKind = field->addKind;
	__insertRow(__makeFieldRow(kind, record, m_addedKind), kind, true);
	if (field->usageFeature)
		ctCommonInsertUsageLog(field->usageFeature, field->usageExtra);
	if (kind == INPUT_NOTE)
		if (auto* buttons = dynamic_cast<CtInputViewImportantFieldsItem*>(__rowOf(INPUT_IMPORTANT_FIELDS)))
			buttons->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, true);
}

void CtInputViewControl::__addNumberClickedCb()
{
	__addFieldRow(INPUT_NUMBER);
}

void CtInputViewControl::__addEmailClickedCb()
{
	__addFieldRow(INPUT_EMAIL);
}

void CtInputViewControl::__addNoteClickedCb()
{
	__addFieldRow(INPUT_NOTE);
}

void CtInputViewControl::__addMoreClickedCb()
{
	if (m_isSipShown) {
		m_isMorePopupPending = true;
		return;
	}
	__showMorePopup();
}

void CtInputViewControl::__showMorePopup()
{
	WENTER();
	WPRET_M(!m_view, "view is NULL");
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_OPT_ADD_FIELD");
	popup->setOnAddProperties([](Evas_Object* obj) { elm_object_style_set(obj, "theme_bg"); });
	popup->setContent([this](Evas_Object* parent) { return __createMorePopupContent(parent); });
	m_view->attachPopup(popup);
	m_morePopup = popup->getWeakPtr();
}

Evas_Object* CtInputViewControl::__createMorePopupContent(Evas_Object* parent)
{
	Evas_Object* genlist = nullptr;
	Evas_Object* box = createPopupList(parent, &genlist);
	auto* basic = dynamic_cast<CtInputViewBasicInfoItem*>(__rowOf(INPUT_BASIC_INFO));
	if (!basic) {
		WERROR("basicInfoItem is NULL");
		return box;
	}
	const bool skipped[kMorePopupEntries + 1] = { false,
		m_genlistItems[INPUT_ADDRESSBOOK] != nullptr, m_genlistItems[INPUT_GROUPS] != nullptr,
		basic->getOrganisationShown(), false, false, false, false, basic->getNicknameShown(),
		basic->getPhoneticShown(), false, m_genlistItems[INPUT_RINGTONE] != nullptr };
	for (int entry = 1; entry <= kMorePopupEntries; ++entry) {
		if (skipped[entry])
			continue;
		auto* row = new CtInputViewImportantSubItem(entry, CtInputViewImportantSubItem::Mode::Contact);
		Elm_Object_Item* item = elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, __moreSubitemSelectedCb, this);
		if (!item) {
			delete row;
			continue;
		}
		row->setElmObjectItem(item);
		if (entry == kRingtoneEntry && __isPowerSaving())
			elm_object_item_disabled_set(item, EINA_TRUE);
	}
	fitPopupList(genlist);
	return box;
}

void CtInputViewControl::__moreSubitemSelectedCb(void* data, Evas_Object*, void* eventInfo)
{
	WHIT();
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	auto* row = dynamic_cast<CtInputViewImportantSubItem*>(
			static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item)));
	if (row)
		static_cast<CtInputViewControl*>(data)->__importantSubitemSelectedCb(row->getEntry(), item);
}

void CtInputViewControl::__importantSubitemSelectedCb(int entry, Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (entry >= 1 && entry <= kMorePopupEntries)
		ctCommonInsertUsageLog("CT07", kMoreUsageExtras[entry - 1]);
	if (entry == kRingtoneEntry) {
		if (m_genlistItems[INPUT_RINGTONE]) {
			WERROR("ringtone already is added");
			return;
		}
		elm_object_item_disabled_set(item, EINA_TRUE);
		__onRingtoneSelectedCb();
		app_assist::WUiTimer::destroy(m_ringtonePopupTimer);
		m_ringtonePopupTimer = app_assist::WUiTimer::addTimer(kRingtonePopupCloseDelay, [this](void*) {
			if (auto popup = m_morePopup.lock())
				popup->destroy();
			return false;
		}, nullptr, this);
		return;
	}
	// The popup's list is running this selection: close it and act from the main loop.
	app_assist::WUiTimer::addIdler([this, entry](void*) {
		if (auto popup = m_morePopup.lock())
			popup->destroy();
		switch (entry) {
		case 1: __onAddrbookItemSelectedCb(); break;
		case 2: __launchGroupsUG(); break;
		case 3: __showBasicInfoGroup(CtInputViewBasicInfoItem::FOCUS_ORGANISATION); break;
		case 4: __addFieldRow(INPUT_ADDRESS); break;
		case 5: __addFieldRow(INPUT_WEBSITE); break;
		case 6: __addFieldRow(INPUT_MESSENGER); break;
		case 7: __createEventDataPopup(); break;
		case 8: __showBasicInfoGroup(CtInputViewBasicInfoItem::FOCUS_NICKNAME); break;
		case 9: __showBasicInfoGroup(CtInputViewBasicInfoItem::FOCUS_PHONETIC); break;
		case 10: __addFieldRow(INPUT_RELATIONSHIP); break;
		default: WERROR("Not handled case =%d", entry); break;
		}
		return false;
	}, nullptr, this);
}

void CtInputViewControl::__showBasicInfoGroup(int group)
{
	auto* row = dynamic_cast<CtInputViewBasicInfoItem*>(__rowOf(INPUT_BASIC_INFO));
	WPRET_M(!row, "basicInfoItem is NULL");
	switch (group) {
	case CtInputViewBasicInfoItem::FOCUS_ORGANISATION: row->setOrganisationShown(true); break;
	case CtInputViewBasicInfoItem::FOCUS_NICKNAME: row->setNicknameShown(true); break;
	case CtInputViewBasicInfoItem::FOCUS_PHONETIC: row->setPhoneticShown(true); break;
	default: return;
	}
	row->setFocusGroup(static_cast<CtInputViewBasicInfoItem::FocusGroup>(group));
	row->refreshFields();
}

// Storage

void CtInputViewControl::__onAddrbookItemSelectedCb()
{
	WHIT();
	WPRET_M(!m_view, "view is NULL");
	if (Elm_Object_Item* item = m_genlistItems[INPUT_ADDRESSBOOK]) {
		elm_genlist_item_selected_set(item, EINA_FALSE);
		elm_object_item_signal_emit(item, "play_sound", "");
	}
	auto* popup = new CtAddressbookPopup(m_view->getInputType(), m_inputData->getAddressbookId());
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB");
	popup->setOnResultCb([this](int addressbookId) {
		// The popup's list is running this choice: close it and act from the main loop.
		app_assist::WUiTimer::addIdler([this, addressbookId](void*) {
			__onAddrbookPicked(addressbookId);
			return false;
		}, nullptr, this);
	});
	m_view->attachPopup(popup);
	m_storagePopup = popup->getWeakPtr();
}

void CtInputViewControl::__onAddrbookPicked(int addressbookId)
{
	m_view->destroyPopup();
	if (!m_genlistItems[INPUT_ADDRESSBOOK]) {
		m_inputData->setAddressbookInfo(addressbookId);
		m_inputData->setAddressbookItemShown(true);
		__insertRow(new CtInputViewAddrBookItem(m_inputData, [this] { __onAddrbookItemSelectedCb(); }),
				INPUT_ADDRESSBOOK, true);
		__updateBasicInfoItem();
		return;
	}
	if (addressbookId == m_inputData->getAddressbookId())
		return;
	if (__checkIsInsert())
		__createChangeLocationPopup(addressbookId, m_inputData->getAddressbookId());
	else
		__switchAddressbook(addressbookId);
}

void CtInputViewControl::__switchAddressbook(int addressbookId)
{
	WENTER();
	bool isSim = m_inputData->checkAddressbookIsSimOrNot(addressbookId);
	m_inputData->setAddressbookInfo(addressbookId);
	m_inputData->removeAllGroups();
	CtInputView* view = m_view;
	if (view)
		view->createInputViewControl(view->getLayout(), isSim); // destroys this control
}

void CtInputViewControl::__createChangeLocationPopup(int newId, int oldId)
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_HEADER_CHANGE_SAVE_LOCATION_ABB");
	popup->setContent("IDS_PB_POP_SOME_CONTACT_INFORMATION_MAY_BE_LOST");
	std::weak_ptr<bool> alive = m_alive;
	popup->addButton("IDS_PB_BUTTON_CANCEL", [this, alive, oldId](bool*) {
		if (alive.expired() || !*alive.lock())
			return;
		m_inputData->setAddressbookInfo(oldId);
		updateAddrbookItem();
	});
	popup->addButton("IDS_PB_BUTTON_CHANGE_ABB", [this, alive, newId](bool*) {
		if (alive.expired() || !*alive.lock())
			return;
		__switchAddressbook(newId);
	});
	m_view->attachPopup(popup);
	m_changeLocationPopup = popup->getWeakPtr();
}

// Keypad

void CtInputViewControl::__sipUpCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputViewControl*>(data)->__onSipUpCb();
}

void CtInputViewControl::__sipDownCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputViewControl*>(data)->__onSipDownCb();
}

void CtInputViewControl::__onSipUpCb()
{
	WHIT();
	if (m_genlist)
		elm_genlist_homogeneous_set(m_genlist, EINA_FALSE);
	m_isSipShown = true;
	if (m_view)
		m_view->setSipStatus(true);
	__updateEntryReturnKeyType(nullptr);
	m_isAdding = false;
}

void CtInputViewControl::__onSipDownCb()
{
	WHIT();
	m_isSipShown = false;
	if (m_view)
		m_view->setSipStatus(false);
	if (m_isMorePopupPending) {
		m_isMorePopupPending = false;
		__showMorePopup();
	}
	auto onKeypadDown = m_onKeypadDown;
	if (onKeypadDown)
		onKeypadDown(); // may pop the view and so destroy this control
}

bool CtInputViewControl::__isKeypadShown() const
{
	return m_isSipShown;
}

// Genlist callbacks

void CtInputViewControl::__genlistRealizedCb(void* data, Evas_Object*, void* eventInfo)
{
	auto* self = static_cast<CtInputViewControl*>(data);
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	if (!self->m_genlist)
		return;
	if (!self->m_isAdding)
		self->__updateEntryReturnKeyType(nullptr);
	if (item == self->m_genlistItems[INPUT_ADDRESSBOOK] && CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled())
		elm_object_item_signal_emit(item,
				self->__isProfileSharingStorage() ? "link,contacts,disable" : "link,contacts,enable", "");
	if (item == self->m_genlistItems[INPUT_GROUPS])
		self->__updateSaveBtn();
	if (Evas_Object* layout = self->m_view ? self->m_view->getLayout() : nullptr)
		if (Evas_Object* bg = elm_object_part_content_unset(layout, "elm.swallow.bg"))
			evas_object_del(bg);
	if (item == elm_genlist_last_item_get(self->m_genlist) && !self->isAppending()
			&& !uxt_scroller_is_auto_scroll_enabled(self->m_genlist) && !app_assist::WUiTimer::isAlive(self->m_autoScrollIdler))
		self->m_autoScrollIdler = app_assist::WUiTimer::addIdler([self](void*) {
			if (self->m_genlist)
				uxt_scroller_set_auto_scroll_enabled(self->m_genlist, EINA_TRUE);
			return false;
		}, nullptr, self);
}

void CtInputViewControl::__genlistPressedCb(void*, Evas_Object*, void*)
{
	ctCommonInvokeDbusCpuBoost();
}

void CtInputViewControl::__genlistScrollCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<CtInputViewControl*>(data);
	if (self->m_prediction)
		self->m_prediction->resizePredictionList(true);
}

void CtInputViewControl::__genlistResizeCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* self = static_cast<CtInputViewControl*>(data);
	if (self->m_prediction)
		self->m_prediction->resizePredictionList(true);
}

void CtInputViewControl::__genlistMouseDownCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* self = static_cast<CtInputViewControl*>(data);
	if (self->m_prediction)
		self->m_prediction->destroyPredictionList();
}

// Launches

CtInputViewControl* CtInputViewControl::__fromReply(void* data)
{
	// Replies to a control that is gone are cancelled in its destructor.
	auto* self = static_cast<CtInputViewControl*>(data);
	if (!self || !self->m_genlist || self->isDestroying()) {
		WERROR("data is NULL");
		return nullptr;
	}
	return self;
}

// A picker the person backed out of (or that failed) changes nothing.
bool CtInputViewControl::__isSuccess(app_control_result_e result)
{
	if (result == APP_CONTROL_RESULT_SUCCEEDED)
		return true;
	WDEBUG("reply not a success: %d", result);
	return false;
}

bool CtInputViewControl::__sendRequest(app_control_h request, app_control_reply_cb replyCb)
{
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	bool sent = ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request, replyCb, this, m_genlist);
	app_control_destroy(request);
	return sent;
}

// Picture

void CtInputViewControl::__basicInfoItemImageClicked()
{
	WHIT();
	WPRET_M(!m_view, "view is NULL");
	bool hasPicture = !isEmpty(m_inputData->getImagePath());
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle(hasPicture ? "IDS_PB_BUTTON_CHANGE_PICTURE_ABB" : "IDS_PB_BUTTON_SET_PICTURE_ABB");
	popup->setOnAddProperties([](Evas_Object* obj) { elm_object_style_set(obj, "theme_bg"); });
	popup->setContent([this, hasPicture](Evas_Object* parent) {
		Evas_Object* genlist = nullptr;
		Evas_Object* box = createPopupList(parent, &genlist);
		int count = hasPicture ? 4 : 3;
		for (int i = 0; i < count; ++i) {
			Elm_Object_Item* item = elm_genlist_item_append(genlist, popupRowClass(),
					const_cast<char*>(kPictureChoices[i]), nullptr, ELM_GENLIST_ITEM_NONE,
					[](void* data, Evas_Object*, void* eventInfo) {
						auto* self = static_cast<CtInputViewControl*>(data);
						auto* picked = static_cast<Elm_Object_Item*>(eventInfo);
						elm_genlist_item_selected_set(picked, EINA_FALSE);
						int index = elm_genlist_item_index_get(picked) - 1;
						app_assist::WUiTimer::addIdler([self, index](void*) {
							if (auto open = self->m_picturePopup.lock())
								open->destroy();
							self->__onPictureChoice(index);
							return false;
						}, nullptr, self);
					}, this);
			(void)item;
		}
		fitPopupList(genlist);
		return box;
	});
	m_view->attachPopup(popup);
	m_picturePopup = popup->getWeakPtr();
	m_isPicturePopupShown = true;
	m_isPictureLaunched = false;
	__setPictureFocus(false);
	std::weak_ptr<bool> alive = m_alive;
	if (Evas_Object* obj = popup->getEvasObj())
		evas_object_event_callback_add(obj, EVAS_CALLBACK_DEL, [](void* data, Evas*, Evas_Object*, void*) {
			auto* self = static_cast<CtInputViewControl*>(data);
			self->m_isPicturePopupShown = false;
			if (!self->m_isPictureLaunched)
				self->__setPictureFocus(true);
		}, this);
}

void CtInputViewControl::__onPictureChoice(int index)
{
	switch (index) {
	case 0: __launchGallery(); break;
	case 1: __launchCamera(); break;
	case 2: __launchDecorateContactImage(); break;
	case 3: __onRemoveSelCb(); break;
	default: WERROR("Not handled case =%d", index); break;
	}
}

void CtInputViewControl::__setPictureFocus(bool allowed)
{
	if (m_view && m_view->getEvasObj())
		elm_object_tree_focus_allow_set(m_view->getEvasObj(), allowed ? EINA_TRUE : EINA_FALSE);
}

void CtInputViewControl::__launchGallery()
{
	__setPictureFocus(false);
	m_isPictureLaunched = true;
	app_control_h request = nullptr;
	app_control_create(&request);
	app_control_set_operation(request, APP_CONTROL_OPERATION_PICK);
	app_control_set_app_id(request, GALLERY_APP_ID);
	const std::pair<const char*, const char*> extras[] = { { "hide-personal", "true" },
		{ "launch-type", "select-setas" }, { "setas-type", "callerid" }, { "View Mode", "SETAS" },
		{ "Setas type", "CallerID" }, { "Area Size", "100" }, { "Resolution", "720x720" } };
	for (const auto& extra : extras)
		app_control_add_extra_data(request, extra.first, extra.second);
	if (!__sendRequest(request, __galleryReplyCb)) {
		WERROR("launch Failed");
		__setPictureFocus(true);
	}
}

void CtInputViewControl::__launchCamera()
{
	app_control_h request = nullptr;
	app_control_create(&request);
	app_control_set_operation(request, APP_CONTROL_OPERATION_CREATE_CONTENT);
	app_control_set_mime(request, "image/jpg");
	app_control_add_extra_data(request, "CALLER", "contacts");
	if (!__sendRequest(request, __cameraReplyCb)) {
		WERROR("launch Failed");
		__setPictureFocus(true);
	}
}

void CtInputViewControl::__launchDecorateContactImage()
{
	app_control_h request = nullptr;
	app_control_create(&request);
	app_control_set_app_id(request, IMAGE_EDITOR_APP_ID);
	app_control_add_extra_data(request, "type", "individual");
	if (!__sendRequest(request, __decorateReplyCb)) {
		WERROR("launch Failed");
		__setPictureFocus(true);
	}
}

void CtInputViewControl::__galleryReplyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	if (CtInputViewControl* self = __fromReply(data))
		self->__onPictureReply(result, reply, APP_CONTROL_DATA_SELECTED, true);
}

void CtInputViewControl::__cameraReplyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	if (CtInputViewControl* self = __fromReply(data)) {
		self->m_isPictureLaunched = true;
		self->__onPictureReply(result, reply, APP_CONTROL_DATA_SELECTED, true);
	}
}

void CtInputViewControl::__decorateReplyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	if (CtInputViewControl* self = __fromReply(data))
		self->__onPictureReply(result, reply, "path", false);
}

void CtInputViewControl::__onPictureReply(app_control_result_e result, app_control_h reply, const char* key,
		bool isArray)
{
	__setPictureFocus(true);
	if (!__isSuccess(result))
		return;
	std::string path = isArray ? firstOf(reply, key) : extraOf(reply, key);
	if (path.empty()) {
		WERROR("no picture in the reply");
		return;
	}
	__updateImageData(path.c_str());
}

void CtInputViewControl::__updateImageData(const char* path)
{
	WPRET_M(!m_genlist, "__genlist is NULL");
	if (!isPictureFile(evas_object_evas_get(m_genlist), path ? path : "")) {
		WERROR("not a picture: %s", path ? path : "");
		return;
	}
	std::string copied;
	int err = ctCommonCopyImage(path, copied);
	if (err != 0) {
		WFAILED("ctCommonCopyImage", err);
		return;
	}
	// The copy of an earlier pick of this session is no longer used.
	if (!m_copiedImagePath.empty())
		ctCommonUnlinkFile(m_copiedImagePath.c_str());
	m_copiedImagePath = copied;
	m_inputData->setImage(m_inputData->getImageRecord(), copied.c_str(), 0);
	m_isImageChanged = true;
	__refreshPicture();
	__updateSaveBtn();
}

void CtInputViewControl::__onRemoveSelCb()
{
	WPRET_M(!m_genlistItems[INPUT_BASIC_INFO], "__genlistItems[INPUT_BASIC_INFO] is NULL");
	contacts_record_h image = m_inputData->getImageRecord();
	WPRET_M(!image, "record is NULL");
	const char* path = m_inputData->getImagePath();
	if (!m_copiedImagePath.empty() && path && m_copiedImagePath == path) {
		ctCommonUnlinkFile(m_copiedImagePath.c_str());
		m_copiedImagePath.clear();
	}
	m_inputData->removeImage(image);
	m_isImageChanged = true;
	__refreshPicture();
}

// Ringtone

void CtInputViewControl::__onRingtoneSelectedCb()
{
	WHIT();
	if (Elm_Object_Item* item = m_genlistItems[INPUT_RINGTONE])
		elm_genlist_item_selected_set(item, EINA_FALSE);
	const char* current = m_inputData->getRingtone();
	app_control_h request = nullptr;
	app_control_create(&request);
	app_control_set_app_id(request, RINGTONE_PICKER_APP_ID);
	app_control_add_extra_data(request, "default", "default show");
	app_control_add_extra_data(request, "path", kRingtoneFolder);
	app_control_add_extra_data(request, "marked_mode", isEmpty(current) ? "default" : current);
	m_isRingtonePickerLaunched = __sendRequest(request, __ringtoneReplyCb);
	if (!m_isRingtonePickerLaunched)
		WERROR("launch Failed");
}

void CtInputViewControl::__ringtoneReplyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	if (CtInputViewControl* self = __fromReply(data)) {
		self->m_isRingtonePickerLaunched = false;
		if (__isSuccess(result))
			self->__onRingtoneReply(reply);
	}
}

void CtInputViewControl::__onRingtoneReply(app_control_h reply)
{
	std::string result = extraOf(reply, "result");
	if (result.empty()) {
		WERROR("no ringtone in the reply");
		return;
	}
	if (result == "default") {
		m_inputData->setRingtone(nullptr);
	} else {
		std::string position = extraOf(reply, "position");
		m_inputData->setRingtone(result.c_str(), position.empty() ? nullptr : position.c_str());
	}
	if (!m_genlistItems[INPUT_RINGTONE])
		__addRingtonItem();
	if (auto* row = __rowOf(INPUT_RINGTONE)) {
		row->updateChangedState(m_inputData->getRingtone());
		elm_genlist_item_fields_update(m_genlistItems[INPUT_RINGTONE], "elm.text.main.left.bottom",
				ELM_GENLIST_ITEM_FIELD_TEXT);
	}
	__updateSaveBtn();
}

void CtInputViewControl::__addRingtonItem()
{
	CtInputViewItemCallbacks callbacks;
	callbacks.deleted = [this](Elm_Object_Item*, bool heldText, contacts_record_h) { __ringtoneItemDeleted(heldText); };
	auto* row = new CtInputViewRingtoneItem(m_inputData, callbacks, [this] { __onRingtoneSelectedCb(); });
	Elm_Object_Item* item = __insertRow(row, INPUT_RINGTONE, m_genlistItems[INPUT_IMPORTANT_FIELDS] != nullptr);
	if (item && __isPowerSaving())
		elm_object_item_disabled_set(item, EINA_TRUE);
}

// Groups

void CtInputViewControl::__launchGroupsUG()
{
	WHIT();
	std::vector<int> ids;
	m_inputData->getAllGroupsId(ids);
	app_control_h request = nullptr;
	app_control_create(&request);
	app_control_set_app_id(request, CONTACTS_LIST_APP_ID);
	app_control_add_extra_data(request, "type", kGroupsPickerType);
	if (!ids.empty())
		app_control_add_extra_data(request, "selected_group_id_list", encodeGroupIds(ids).c_str());
	const char* book = m_inputData->getAddressbookName();
	app_control_add_extra_data(request, "addressbook_name", book ? book : "");
	if (!__sendRequest(request, __groupsReplyCb))
		WERROR("launch Failed");
}

void CtInputViewControl::__groupsReplyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	if (CtInputViewControl* self = __fromReply(data); self && __isSuccess(result))
		self->__onGroupsReply(reply);
}

void CtInputViewControl::__onGroupsReply(app_control_h reply)
{
	if (!reply) {
		WERROR("reply is NULL");
		return;
	}
	std::string list = extraOf(reply, "group_id_list");
	if (list.empty()) {
		m_inputData->removeAllGroups();
		m_inputData->updateGroupsName();
	} else {
		std::vector<int> ids;
		if (!decodeGroupIds(list, ids)) {
			WERROR("malformed group_id_list");
			return;
		}
		std::vector<CtGroupGroupInfo> groups = CtGroupGroupInfo::gatherByDisplayName(ids);
		if (groups.empty()) {
			WERROR("no group of the reply exists");
			return;
		}
		int book = m_inputData->getAddressbookId();
		m_inputData->removeAllGroups();
		for (const CtGroupGroupInfo& group : groups) {
			int id = group.getGroupIdInAddressbook(book);
			if (id <= 0)
				id = CtGroupGroupInfo::findGroupInAddressbook(group.getName(), book);
			if (id <= 0)
				id = __createGroup(group.getName(), book);
			if (id > 0)
				m_inputData->addGroupRelation(id);
		}
		m_inputData->updateGroupsName();
	}
	__addGroupsItem();
	if (auto* row = dynamic_cast<CtInputViewGroupsItem*>(__rowOf(INPUT_GROUPS)))
		row->updateGroups();
	__updateSaveBtn();
}

int CtInputViewControl::__createGroup(const std::string& name, int addressbookId)
{
	contacts_record_h group = nullptr;
	int err = contacts_record_create(_contacts_group._uri, &group);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_record_create() Failed(%d)", err);
		return 0;
	}
	contacts_record_set_str(group, _contacts_group.name, name.c_str());
	contacts_record_set_int(group, _contacts_group.address_book_id, addressbookId);
	int id = 0;
	err = contacts_db_insert_record(group, &id);
	contacts_record_destroy(group, true);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_db_insert_record() Failed(%d)", err);
		return 0;
	}
	contacts_record_h stored = nullptr;
	err = contacts_db_get_record(_contacts_group._uri, id, &stored);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_db_get_record() Failed(%d)", err);
		return 0;
	}
	contacts_record_destroy(stored, true);
	return id;
}

void CtInputViewControl::__addGroupsItem()
{
	if (m_genlistItems[INPUT_GROUPS])
		return;
	auto* row = new CtInputViewGroupsItem(m_inputData, [this] { __launchGroupsUG(); });
	Elm_Object_Item* item = __insertRow(row, INPUT_GROUPS, m_genlistItems[INPUT_IMPORTANT_FIELDS] != nullptr);
	if (item && __isProfileSharingStorage())
		elm_object_item_disabled_set(item, EINA_TRUE);
}

// Event date popup

void CtInputViewControl::__createEventDataPopup()
{
	WPRET_M(!m_view, "view is NULL");
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_ST_BODY_SET_DATE");
	popup->setContent([this](Evas_Object* parent) { return __createEventDatePopupContent(parent); });
	popup->addButton("IDS_PB_BUTTON_CANCEL", nullptr);
	std::weak_ptr<bool> alive = m_alive;
	popup->addButton("IDS_PB_SK_SET", [this, alive](bool*) {
		if (!alive.expired() && *alive.lock())
			__onEventDateSet();
	});
	m_view->attachPopup(popup);
	m_datePopup = popup->getWeakPtr();
}

Evas_Object* CtInputViewControl::__createEventDatePopupContent(Evas_Object* parent)
{
	m_isSolar = true;
	m_isLeapMonth = false;
	Evas_Object* layout = m_isLunarSupported
		? ctCommonCreateLayout(parent, "contacts/contacts.edj", "popup_input_date") : nullptr;
	auto* picker = new CtDatePicker(withWeekDays(today()));
	std::weak_ptr<bool> alive = m_alive;
	picker->setChangedCallback([this, alive] {
		if (!alive.expired() && *alive.lock())
			__datetimeValueChangedCb();
	});
	picker->create(layout ? layout : parent, nullptr);
	m_datePicker = picker->getWeakPtr();
	Evas_Object* content = picker->getEvasObj();
	track(&m_calendarButton, nullptr);
	if (!layout)
		return content;
	elm_object_part_content_set(layout, "elm.swallow.content", content);
	Evas_Object* button = uxt_button_add(layout, "on_gradient_bg");
	elm_object_domain_translatable_text_set(button, "contacts", "IDS_PB_ACBUTTON_SOLAR_ABB");
	evas_object_smart_callback_add(button, "clicked", [](void* data, Evas_Object*, void*) {
		static_cast<CtInputViewControl*>(data)->__calendarBtnClickedCb();
	}, this);
	elm_object_part_content_set(layout, "elm.button", button);
	track(&m_calendarButton, button);
	return layout;
}

CtDatePicker* CtInputViewControl::__datePicker() const
{
	return static_cast<CtDatePicker*>(m_datePicker.lock().get());
}

void CtInputViewControl::__calendarBtnClickedCb()
{
	CtDatePicker* picker = __datePicker();
	WPRET_M(!picker, "picker is NULL");
	struct tm shown = withWeekDays(picker->getDate());
	struct tm converted = {};
	int err;
	if (m_isSolar) {
		int leap = 0;
		err = uxt_util_convert_gregorian_time_to_lunar_time(UXT_CALENDAR_LUNAR_CHINESE, &shown, &converted, &leap);
		if (err == UXT_ERROR_NONE)
			m_isLeapMonth = leap == 1;
	} else {
		err = uxt_util_convert_lunar_time_to_gregorian_time(UXT_CALENDAR_LUNAR_CHINESE, &shown, m_isLeapMonth, &converted);
	}
	if (err != UXT_ERROR_NONE) {
		WWARNING("%s() Failed(%d)", m_isSolar ? "uxt_util_convert_gregorian_time_to_lunar_time"
				: "uxt_util_convert_lunar_time_to_gregorian_time", err);
		return;
	}
	m_isSolar = !m_isSolar;
	picker->setDate(converted);
	if (m_calendarButton)
		elm_object_domain_translatable_text_set(m_calendarButton, "contacts",
				m_isSolar ? "IDS_PB_ACBUTTON_SOLAR_ABB" : "IDS_PB_ACBUTTON_LUNAR_ABB");
}

void CtInputViewControl::__datetimeValueChangedCb()
{
	CtDatePicker* picker = __datePicker();
	if (m_isSolar || !picker)
		return;
	struct tm value = picker->getDate();
	m_isLeapMonth = uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &value) == 1;
}

void CtInputViewControl::__onEventDateSet()
{
	CtDatePicker* picker = __datePicker();
	WPRET_M(!picker, "picker is NULL");
	struct tm value = picker->getDate();
	__appendEventItem(value.tm_year + 1900, value.tm_mon + 1, value.tm_mday);
	__updateSaveBtn();
}

void CtInputViewControl::__appendEventItem(int year, int month, int day)
{
	int date = year * 10000 + month * 100 + day;
	contacts_record_h record = m_inputData->addEvent(date);
	WPRET_M(!record, "record is NULL");
	if (m_isLunarSupported) {
		m_inputData->setCalendarType(record, m_isSolar ? 0 : 1);
		if (!m_isSolar)
			m_inputData->setIsLeapMonth(record, m_isLeapMonth);
	}
	if (!*m_hasBirthday && m_inputData->getDataType(record, _contacts_event.type) == CONTACTS_EVENT_TYPE_BIRTH)
		*m_hasBirthday = true;
	CtInputViewGenlistItem* row = __makeEventRow(record, nullptr);
	Elm_Object_Item* item = __insertRow(row, INPUT_EVENT, true);
	if (item)
		row->updateChangedState(std::to_string(date).c_str());
	__updateEventItems();
}

// Relationship and maps

void CtInputViewControl::__relationSelectContactClicked(CtInputViewRelationItem* row)
{
	WPRET_M(!row, "item is nullptr");
	m_relationItem = row->getElmObjectItem();
	m_relationRecord = row->getRecord();
	if (m_relationItem)
		elm_object_item_signal_emit(m_relationItem, "elm,state,contact,select", "");
	if (m_onSelectRelationContact)
		m_onSelectRelationContact();
}

void CtInputViewControl::__onRelationshipPersonPicked(int personId)
{
	Elm_Object_Item* item = m_relationItem;
	m_relationItem = nullptr;
	WPRET_M(!hasItem(m_genlist, item), "relationship row is gone");
	auto* row = dynamic_cast<CtInputViewRelationItem*>(__rowOf(item));
	WPRET_M(!row || row->getRecord() != m_relationRecord, "relationship row is gone");
	std::string name;
	contacts_record_h person = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, personId, &person);
	if (err == CONTACTS_ERROR_NONE) {
		char* displayName = nullptr;
		contacts_record_get_str_p(person, _contacts_person.display_name, &displayName);
		char* oneLine = ctCommonRemoveNewline(displayName);
		name = oneLine ? oneLine : "";
		free(oneLine);
		contacts_record_destroy(person, true);
	} else {
		WWARNING("contacts_db_get_record() Failed(%d)", err);
	}
	if (name.empty())
		name = ContactsCommon::translate("IDS_LOGS_MBODY_UNKNOWN");
	m_inputData->setRelationshipRelationship(m_relationRecord, name.c_str());
	row->setRelationName(name.c_str());
	elm_genlist_item_fields_update(item, "elm.icon.entry", ELM_GENLIST_ITEM_FIELD_CONTENT);
	__updateSaveBtn();
}

void CtInputViewControl::__launchMapsApp(Elm_Object_Item* item, contacts_record_h record)
{
	WPRET_M(!item || !record, "item is nullptr");
	std::string mapsAppId;
	if (!ctCommontGetMapsAppId(mapsAppId) || mapsAppId.empty()) {
		WERROR("mapsAppId is empty");
		return;
	}
	m_addressItem = item;
	m_addressRecord = record;
	char address[kAddressBytes] = {};
	m_inputData->getAddressAddress(record, address, sizeof(address));
	app_control_h request = nullptr;
	app_control_create(&request);
	if (mapsAppId == MAPS_APP_ID) {
		app_control_set_app_id(request, MAPS_APP_ID);
		app_control_add_extra_data(request, "searchByName", ctCommonUtf8ToMarkup(address).c_str());
	} else {
		std::string encoded;
		ctCommontEncodeAddress(address, encoded);
		std::string uri = "geo:0,0?q=\"" + encoded + "\"";
		app_control_set_operation(request, APP_CONTROL_OPERATION_PICK);
		app_control_set_uri(request, uri.c_str());
	}
	if (!__sendRequest(request, __mapsReplyCb))
		WERROR("launch Failed");
}

void CtInputViewControl::__mapsReplyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	if (CtInputViewControl* self = __fromReply(data); self && __isSuccess(result))
		self->__onMapsReply(reply);
}

void CtInputViewControl::__onMapsReply(app_control_h reply)
{
	std::string text = firstOf(reply, APP_CONTROL_DATA_SELECTED);
	if (text.empty()) {
		WERROR("no address in the reply");
		return;
	}
	Elm_Object_Item* item = m_addressItem;
	m_addressItem = nullptr;
	auto* row = hasItem(m_genlist, item) ? dynamic_cast<CtInputViewAddressItem*>(__rowOf(item)) : nullptr;
	if (!row || row->getRecord() != m_addressRecord) {
		WERROR("p->__addressItem is nullptr");
		return;
	}
	m_inputData->setAddressAddress(m_addressRecord, text.c_str());
	row->updateChangedState(text.c_str());
	elm_genlist_item_fields_update(item, "elm.icon.entry", ELM_GENLIST_ITEM_FIELD_CONTENT);
	__updateSaveBtn();
}

// Settings

void CtInputViewControl::__regionFormatChangedCb(keynode_t*, void* data)
{
	auto* self = static_cast<CtInputViewControl*>(data);
	for (Elm_Object_Item* item = self->m_genlistItems[INPUT_EVENT]; item; item = elm_genlist_item_prev_get(item)) {
		if (!dynamic_cast<CtInputViewEventItem*>(self->__rowOf(item)))
			break;
		elm_genlist_item_update(item);
	}
}

void CtInputViewControl::__powerSavingChangedCb(keynode_t*, void* data)
{
	static_cast<CtInputViewControl*>(data)->__onPowerSavingChanged();
}

void CtInputViewControl::__onPowerSavingChanged()
{
	WHIT();
	bool on = __isPowerSaving();
	// A notice without a change must not close what the person has open.
	if (!m_genlist || on == m_isPowerSaving)
		return;
	m_isPowerSaving = on;
	destroyPopup();
	if (m_view)
		m_view->destroyPopup();
	__updateBasicInfoItem();
	if (m_isRingtonePickerLaunched && on) {
		ContactsAppControlLauncher::getInstance()->terminate();
		m_isRingtonePickerLaunched = false;
	}
	if (Elm_Object_Item* ringtone = m_genlistItems[INPUT_RINGTONE])
		elm_object_item_disabled_set(ringtone, on ? EINA_TRUE : EINA_FALSE);
	const char* name = m_inputData->getAddressbookName();
	int book = m_inputData->getAddressbookId();
	if (on && m_inputData->getContactId() <= 0 && !isEmpty(name) && book != 0
			&& !m_inputData->checkAddressbookIsSimOrNot(book)) {
		m_inputData->setAddressbookInfo(0);
		updateAddrbookItem();
	}
}
