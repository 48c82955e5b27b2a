#include "CtDetailView.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtDetailData.h"
#include "CtDetailImageView.h"
#include "CtDetailMarkAsDefaultView.h"
#include "CtDetailPersonActions.h"
#include "CtDetailViewAddressItem.h"
#include "CtDetailViewCtxPopup.h"
#include "CtDetailViewEmailItem.h"
#include "CtDetailViewEventItem.h"
#include "CtDetailViewFacebookItem.h"
#include "CtDetailViewGroupsItem.h"
#include "CtDetailViewLinkItem.h"
#include "CtDetailViewMessengerItem.h"
#include "CtDetailViewMultiImageItem.h"
#include "CtDetailViewNoteItem.h"
#include "CtDetailViewNumberItem.h"
#include "CtDetailViewRelationItem.h"
#include "CtDetailViewRingtoneItem.h"
#include "CtDetailViewStatusItem.h"
#include "CtDetailViewUtil.h"
#include "CtDetailViewVideoCallItem.h"
#include "CtDetailViewWebsiteItem.h"
#include "CtDllViewFactory.h"
#include "CtEditTabView.h"
#include "CtEsuAgentMgr.h"
#include "CtInputView.h"
#include "CtRegistryMgr.h"
#include "CtSimMgr.h"
#include "CtThemeMgr.h"
#include "WMenuPopup.h"
#include "WNaviframe.h"
#include "WPopup.h"

#include <glib.h>
#include <notification.h>

#include <app_control.h>
#include <csc_feature.h>
#include <ui_extension.h>

#include <cerrno>
#include <cstdint>
#include <climits>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

// Row kinds in the order the list shows them.
enum RowKind {
	KIND_PICTURE = 0,
	KIND_STATUS,
	KIND_NUMBERS,
	KIND_EMAILS,
	KIND_SOCIAL_ACCOUNT,
	KIND_ADDRESSES,
	KIND_MESSENGERS,
	KIND_WEBSITES,
	KIND_RELATIONSHIPS,
	KIND_EVENTS,
	KIND_NOTES,
	KIND_RINGTONE,
	KIND_GROUPS,
	KIND_LINKED_ACCOUNTS,
	KIND_DONE,
};

constexpr int kFirstFrameRows = 6;
constexpr double kChangeCoalescingSeconds = 2.0;
constexpr double kFavoriteSettleSeconds = 0.7;
constexpr const char* kInputNaviItemKey = "input_navi_item";
constexpr const char* kSelectedPersonIdKey = "selected_personid";

// Base-10 strtol as the request gives it; a value outside int is no id.
int parseId(const char* text)
{
	if (!text)
		return 0;
	errno = 0;
	long value = strtol(text, nullptr, 10);
	if (errno == ERANGE || value > INT_MAX || value < INT_MIN) {
		WERROR("id out of range : %s", text);
		return 0;
	}
	return static_cast<int>(value);
}

int readExtraId(app_control_h request, const char* key, bool* present = nullptr)
{
	char* value = nullptr;
	int err = app_control_get_extra_data(request, key, &value);
	if (present)
		*present = err == APP_CONTROL_ERROR_NONE && value;
	int id = parseId(value);
	free(value);
	return id;
}

bool isListKind(int kind)
{
	switch (kind) {
	case KIND_NUMBERS:
	case KIND_EMAILS:
	case KIND_ADDRESSES:
	case KIND_MESSENGERS:
	case KIND_WEBSITES:
	case KIND_RELATIONSHIPS:
	case KIND_EVENTS:
	case KIND_NOTES:
		return true;
	default:
		return false;
	}
}

bool hasText(const char* text)
{
	return text && *text;
}

// A person of several contacts chooses which one gives the name or picture.
bool hasDefaultChoice(CtDetailData* data)
{
	return eina_list_count(data->getNameList()) >= 2 || eina_list_count(data->getImageList()) >= 2;
}

// The one-line choice list of a popup.
Evas_Object* createPopupList(Evas_Object* parent)
{
	Evas_Object* list = elm_genlist_add(parent);
	elm_object_style_set(list, "popup");
	elm_genlist_homogeneous_set(list, EINA_TRUE);
	elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
	// A popup sizes its content by the content's minimum: the list's rows.
	elm_scroller_content_min_limit(list, EINA_FALSE, EINA_TRUE);
	evas_object_size_hint_weight_set(list, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(list, EVAS_HINT_FILL, EVAS_HINT_FILL);
	return list;
}

// Rows whose data is a translation id.
const Elm_Genlist_Item_Class* translatedRowClass()
{
	static Elm_Genlist_Item_Class itc = [] {
		Elm_Genlist_Item_Class c = {};
		c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
		c.item_style = "1line";
		c.func.text_get = [](void* data, Evas_Object*, const char* part) -> char* {
			if (strcmp(part, "elm.text") != 0 || !data)
				return nullptr;
			return strdup(ContactsCommon::translate(static_cast<const char*>(data)));
		};
		return c;
	}();
	return &itc;
}

} // namespace

CtDetailView::CtDetailView(CtLaunchRequest* request)
{
	WENTER();
	__initialize(request);
	__createData(personIdFromRequest(request));
	__listenToPowerSaving();
}

CtDetailView::CtDetailView(int personId, CtLaunchRequest* request)
{
	WENTER();
	__initialize(request);
	__createData(personId);
	__listenToPowerSaving();
}

CtDetailView::CtDetailView(const CtGalSearchData* galData)
{
	WENTER();
	__initialize(nullptr);
	if (galData) {
		m_galData = galData;
		m_detailData.reset(new CtDetailData(galData));
		m_isSimContact = m_detailData->isSimContact();
	} else {
		WERROR("Invalid param : galData");
		__createData(0);
	}
	__listenToPowerSaving();
}

CtDetailView::~CtDetailView()
{
	WENTER();
	__stopAddingRows();
	__closePopup();
	CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, __powerSavingModeChangedCb, this);
	if (!m_galData) {
		CtSimMgr::getInstance()->detach(this);
		__disconnectCallBlock();
	}
	if (m_detailData)
		m_detailData->detachListener();
	m_detailData.reset();
}

int CtDetailView::personIdFromRequest(CtLaunchRequest* request)
{
	WPRET_VM(!request || !request->appControl, 0, "Invalid param : request");
	char* operation = nullptr;
	app_control_get_operation(request->appControl, &operation);
	int personId = 0;
	if (!operation || strcmp(operation, APP_CONTROL_OPERATION_DEFAULT) == 0) {
		personId = readExtraId(request->appControl, "person_id");
		bool present = false;
		int ctPersonId = readExtraId(request->appControl, "ct_person_id", &present);
		if (present)
			personId = ctPersonId;
	} else if (strcmp(operation, APP_CONTROL_OPERATION_VIEW) == 0) {
		personId = readExtraId(request->appControl, APP_CONTROL_DATA_ID);
	} else {
		WERROR("wrong operation requested %s", operation);
	}
	free(operation);
	return personId;
}

int CtDetailView::getPersoinId()
{
	WPRET_VM(!m_detailData, 0, "WASSERT! __detailData is null");
	return m_detailData->getPersonId();
}

const char* CtDetailView::getClassName()
{
	return "CtDetailView";
}

void CtDetailView::__initialize(CtLaunchRequest* request)
{
	m_request = request;
	int powerSaving = 0;
	int err = vconf_get_int(VCONFKEY_SETAPPL_PSMODE, &powerSaving);
	if (err != VCONF_OK)
		WWARNING("vconf_get_int() Failed(%d)", err);
	m_isPowerSaving = powerSaving != 0;
}

// Last in every constructor: a constructor that throws runs no destructor,
// which would leave the listener with a dead screen.
void CtDetailView::__listenToPowerSaving()
{
	CtRegistryMgr::getInstance()->registerVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, __powerSavingModeChangedCb, this);
}

void CtDetailView::__createData(int personId)
{
	if (personId < 1)
		WERROR("no person to show : %d", personId);
	m_detailData.reset(new CtDetailData(personId));
	m_isSimContact = m_detailData->isSimContact();
	m_isCompactLayout = ctDetailHasCompactRows(m_detailData.get());
}

Evas_Object* CtDetailView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "createBaseLayout() failed");
	ctDetailAddExtensionThemes();
	CtThemeMgr::getInstance()->setObjectTheme(layout);

	m_genlist = elm_genlist_add(layout);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	elm_genlist_homogeneous_set(m_genlist, m_isCompactLayout ? EINA_TRUE : EINA_FALSE);
	elm_object_part_content_set(layout, "elm.swallow.content", m_genlist);

	if (!m_galData)
		__connectCallBlock();
	evas_object_smart_callback_add(m_genlist, "longpressed", __genlistLongpressedCb, this);
	evas_object_smart_callback_add(m_genlist, "pressed", __genlistPressedCb, this);
	evas_object_smart_callback_add(m_genlist, "released", __genlistReleasedCb, this);
	return layout;
}

void CtDetailView::__connectCallBlock()
{
	int err = phone_misc_connect(&m_callBlock);
	if (err != PHONE_MISC_ERROR_NONE) {
		WERROR("phone_misc_connect failed (%d)", err);
		m_callBlock = nullptr;
		return;
	}
	err = phone_misc_add_block_db_change_cb(m_callBlock, __blockListChangedCb, this);
	if (err != PHONE_MISC_ERROR_NONE)
		WWARNING("phone_misc_add_block_db_change_cb() Failed(%d)", err);
}

void CtDetailView::__disconnectCallBlock()
{
	if (!m_callBlock)
		return;
	// A UI-gadget host tears the gadget down with its own connections.
	if (!m_request || !m_request->ug)
		phone_misc_remove_block_db_change_cb(m_callBlock, __blockListChangedCb);
	phone_misc_disconnect(m_callBlock);
	m_callBlock = nullptr;
}

void CtDetailView::onDestroy()
{
	WENTER();
	if (m_naviframeObj)
		evas_object_smart_callback_del_full(m_naviframeObj, "transition,finished", __naviTransitionFinishedCb, this);
	m_naviframeObj = nullptr;
}

void CtDetailView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	__addAllItems();
	if (app_assist::WNaviframe* naviframe = getNaviframe()) {
		m_naviframeObj = naviframe->getEvasObj();
		evas_object_smart_callback_add(m_naviframeObj, "transition,finished", __naviTransitionFinishedCb, this);
	}
	__updateTitle();
	__updateFavoriteBtn();
	__showBackButton();
	if (!m_galData) {
		m_detailData->attachListener(this);
		CtSimMgr::getInstance()->attach(this);
	}
	enableMoreButton(naviItem, __moreButtonCb, this);
}

bool CtDetailView::onPop()
{
	return true;
}

void CtDetailView::__addAllItems()
{
	if (m_galData) {
		int budget = INT_MAX;
		__appendItem(__makeSingleItem(KIND_PICTURE));
		for (m_currentKind = KIND_NUMBERS; m_currentKind <= KIND_EMAILS; ++m_currentKind) {
			while (__addNextListItem(budget))
				continue;
		}
		m_currentKind = KIND_DONE;
		return;
	}
	m_numberIndex = m_emailIndex = m_noteIndex = m_addressIndex = 0;
	m_eventIndex = m_relationshipIndex = m_websiteIndex = m_messengerIndex = 0;
	m_currentKind = KIND_PICTURE;
	__stopAddingRows();
	// The first rows go in at once, so the screen's first frame shows them.
	if (__addItemsForFrame())
		__waitForDrawnRows();
}

// The rest follow one per drawn frame. A running animator holds the canvas's
// next frame back to its tick, so it starts only once the first frame is
// drawn; and a tick that comes before the last row was drawn adds nothing.
void CtDetailView::__waitForDrawnRows()
{
	m_drawnRows = std::make_unique<app_assist::WNextFrame>(m_genlist, [this] {
		if (!app_assist::WUiTimer::isAlive(m_rowAnimator))
			m_rowAnimator = app_assist::WUiTimer::addAnimator([this](void*) { return __onRowTick(); }, nullptr, this);
	});
}

bool CtDetailView::__onRowTick()
{
	if (m_drawnRows && m_drawnRows->isPending())
		return true;
	if (!__addItemsForFrame())
		return false;
	__waitForDrawnRows();
	return true;
}

void CtDetailView::__stopAddingRows()
{
	m_drawnRows.reset();
	app_assist::WUiTimer::destroy(m_rowAnimator);
}

bool CtDetailView::isBuildingRows() const
{
	return (m_drawnRows && m_drawnRows->isPending()) || app_assist::WUiTimer::isAlive(m_rowAnimator);
}

bool CtDetailView::__addItemsForFrame()
{
	if (m_currentKind >= KIND_DONE)
		return false;
	int budget = m_currentKind == KIND_PICTURE ? kFirstFrameRows : 1;
	while (budget > 0 && m_currentKind < KIND_DONE) {
		if (!__addItemOfKind(budget))
			break;
	}
	return true;
}

// Adds the next row of the current kind, or moves past the kind. Returns
// false when the frame must end now.
bool CtDetailView::__addItemOfKind(int& budget)
{
	if (isListKind(m_currentKind)) {
		if (__addNextListItem(budget))
			return true;
		if (m_currentKind == KIND_NUMBERS && m_numberIndex > 0 && !m_galData) {
			__appendItem(new CtDetailViewVideoCallItem(this, m_detailData.get(), m_isPowerSaving));
			--budget;
		}
	} else if (CtDetailViewGenlistItem* row = __makeSingleItem(m_currentKind)) {
		__appendItem(row);
		--budget;
	}
	bool endsFrame = m_currentKind == KIND_LINKED_ACCOUNTS;
	++m_currentKind;
	return !endsFrame;
}

bool CtDetailView::__addNextListItem(int& budget)
{
	CtDetailData* data = m_detailData.get();
	switch (m_currentKind) {
	case KIND_NUMBERS:
		return __addListItem(data->getNumberList(), m_numberIndex, budget, &CtDetailView::__makeNumberItem);
	case KIND_EMAILS:
		return __addListItem(data->getEmailList(), m_emailIndex, budget, &CtDetailView::__makeEmailItem);
	case KIND_ADDRESSES:
		return __addListItem(data->getAddressList(), m_addressIndex, budget, &CtDetailView::__makeAddressItem);
	case KIND_MESSENGERS:
		return __addListItem(data->getMessengerList(), m_messengerIndex, budget, &CtDetailView::__makeMessengerItem);
	case KIND_WEBSITES:
		return __addListItem(data->getUrlList(), m_websiteIndex, budget, &CtDetailView::__makeWebsiteItem);
	case KIND_RELATIONSHIPS:
		return __addListItem(data->getRelationshipList(), m_relationshipIndex, budget, &CtDetailView::__makeRelationItem);
	case KIND_EVENTS:
		return __addListItem(data->getEventList(), m_eventIndex, budget, &CtDetailView::__makeEventItem);
	case KIND_NOTES:
		return __addListItem(data->getNoteList(), m_noteIndex, budget, &CtDetailView::__makeNoteItem);
	default:
		return false;
	}
}

// The row of a single-row kind, or null when the person does not get it.
CtDetailViewGenlistItem* CtDetailView::__makeSingleItem(int kind)
{
	CtDetailData* data = m_detailData.get();
	switch (kind) {
	case KIND_PICTURE:
		return m_isSimContact ? nullptr : new CtDetailViewMultiImageItem(this, data, ctDetailIsLowSizePicture(data, getEvasObj()));
	case KIND_STATUS:
		return CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled() && hasText(data->getStatus())
			? new CtDetailViewStatusItem(data) : nullptr;
	case KIND_SOCIAL_ACCOUNT:
		return eina_list_count(data->getContactsList()) == 1 && data->getFacebookMode()
			? new CtDetailViewFacebookItem(data) : nullptr;
	case KIND_RINGTONE:
		return !m_isSimContact && hasText(data->getRingtonePath()) ? new CtDetailViewRingtoneItem(data) : nullptr;
	case KIND_GROUPS:
		return !m_isSimContact && data->getGroupNames() != ContactsCommon::translate("IDS_PB_BODY_NOT_ASSIGNED")
			? new CtDetailViewGroupsItem(data) : nullptr;
	case KIND_LINKED_ACCOUNTS:
		return new CtDetailViewLinkItem(data);
	default:
		return nullptr;
	}
}

// Adds the row of the next record from `index` of `list` that gets one (a
// maker returns null for a record with nothing to show); false (adding
// nothing) once the list is done.
bool CtDetailView::__addListItem(Eina_List* list, int& index, int& budget,
		CtDetailViewGenlistItem* (CtDetailView::*make)(contacts_record_h))
{
	while (auto* record = static_cast<contacts_record_h>(eina_list_nth(list, index))) {
		++index;
		if (CtDetailViewGenlistItem* row = (this->*make)(record)) {
			__appendItem(row);
			--budget;
			return true;
		}
	}
	return false;
}

Elm_Object_Item* CtDetailView::__appendItem(CtDetailViewGenlistItem* row)
{
	WPRET_VM(!row, nullptr, "Invalid param : row");
	Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
			ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr);
	if (!item) {
		WERROR("elm_genlist_item_append() failed");
		delete row;
		return nullptr;
	}
	row->setElmObjectItem(item);
	row->attachToView(this);
	if (row->getItemType() == DETAIL_ITEM_NUMBER) {
		if (!m_firstNumberItem)
			m_firstNumberItem = item;
		m_lastNumberItem = item;
	}
	if (ctDetailPowerSavingIconPart(row->getItemType()))
		elm_object_item_disabled_set(item, m_isPowerSaving ? EINA_TRUE : EINA_FALSE);
	return item;
}

CtDetailViewGenlistItem* CtDetailView::__makeNumberItem(contacts_record_h record)
{
	return new CtDetailViewNumberItem(m_detailData.get(), record, __getNumberCallBlockStatus(record), m_isSimContact);
}

CtDetailViewGenlistItem* CtDetailView::__makeEmailItem(contacts_record_h record)
{
	return new CtDetailViewEmailItem(m_detailData.get(), record, m_isPowerSaving);
}

CtDetailViewGenlistItem* CtDetailView::__makeAddressItem(contacts_record_h record)
{
	return new CtDetailViewAddressItem(this, m_detailData.get(), record, m_isPowerSaving);
}

CtDetailViewGenlistItem* CtDetailView::__makeMessengerItem(contacts_record_h record)
{
	return new CtDetailViewMessengerItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtDetailView::__makeWebsiteItem(contacts_record_h record)
{
	return new CtDetailViewWebsiteItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtDetailView::__makeRelationItem(contacts_record_h record)
{
	return new CtDetailViewRelationItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtDetailView::__makeEventItem(contacts_record_h record)
{
	if (!CtDetailViewEventItem::hasCalendarDate(m_detailData.get(), record))
		return nullptr;
	return new CtDetailViewEventItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtDetailView::__makeNoteItem(contacts_record_h record)
{
	return new CtDetailViewNoteItem(m_detailData.get(), record);
}

bool CtDetailView::__getNumberCallBlockStatus(contacts_record_h number)
{
	WPRET_VM(!number, false, "paramter(number) is nullptr");
	if (!m_callBlock)
		return false;
	char* text = nullptr;
	contacts_record_get_str_p(number, _contacts_number.number, &text);
	if (!text || !*text)
		return false;
	std::string digits = ContactsCommon::removeNumberDashes(text);
	int blocked = 0;
	int result = phone_misc_block_find(m_callBlock, PHONE_MISC_BLOCK_TYPE_CALL, digits.c_str(), &blocked);
	return result > 0;
}

void CtDetailView::__updateTitle()
{
	ctDetailUpdateTitle(getNaviItem(), m_detailData.get());
}

// After every rebuild the star shows the stored state: the person may have
// been made a favourite elsewhere, and a tap inverts what the star shows.
void CtDetailView::__updateFavoriteBtn()
{
	Elm_Object_Item* naviItem = getNaviItem();
	WPRET_M(!naviItem, "naviItem is nullptr");
	if (m_isSimContact)
		return;   // SIM cards keep no favourites
	if (m_galData)
		return;
	if (Evas_Object* shown = elm_object_item_part_content_get(naviItem, "title_right_btn")) {
		if (Evas_Object* check = elm_object_part_content_get(shown, "icon.favorite"))
			ctCommonChecktStateSet(check, m_detailData->isFavorite() ? EINA_TRUE : EINA_FALSE, 0);
		return;
	}
	std::string edj;
	ContactsCommon::getAppEdjePath("contacts/detail_layout.edj", edj, true);
	Evas_Object* layout = ctCommonCreateLayout(m_naviframeObj ? m_naviframeObj : getEvasObj(), edj.c_str(), "layout/favorite");
	WPRET_M(!layout, "layout/favorite is missing");
	CtThemeMgr::getInstance()->setObjectTheme(layout);
	Evas_Object* check = elm_check_add(layout);
	elm_object_style_set(check, "favorite_contact");
	ctCommonChecktStateSet(check, m_detailData->isFavorite() ? EINA_TRUE : EINA_FALSE, 0);
	evas_object_smart_callback_add(check, "changed", __favoriteCheckClickedCb, this);
	evas_object_show(check);
	elm_object_part_content_set(layout, "icon.favorite", check);
	elm_object_item_part_content_set(naviItem, "title_right_btn", layout);
}

void CtDetailView::__showBackButton()
{
	Elm_Object_Item* naviItem = getNaviItem();
	WPRET_M(!naviItem || !m_naviframeObj, "naviItem or naviframe is nullptr");
	if (elm_object_item_part_content_get(naviItem, "elm.swallow.prev_btn"))
		return;
	Evas_Object* button = uxt_button_add(m_naviframeObj, "naviframe/back_btn/default");
	WPRET_M(!button, "uxt_button_add() failed");
	evas_object_smart_callback_add(button, "clicked", __backButtonClickedCb, this);
	elm_object_item_part_content_set(naviItem, "elm.swallow.prev_btn", button);
}

void CtDetailView::onDbChanged(const char* viewUri)
{
	WDEBUG("changed : %s", viewUri ? viewUri : "");
	if (m_isClosing || app_assist::WUiTimer::isAlive(m_favoriteSettleTimer))
		return;
	if (m_galData)
		return;
	if (!m_detailData->isCurrentPersonValid()) {
		__closeWithScreensAbove();
		return;
	}
	if (app_assist::WUiTimer::isAlive(m_changeTimer)) {
		++m_pendingChangeCount;
		return;
	}
	// Re-themed only when rebuilt: a counted change redraws nothing.
	ctDetailAddExtensionThemes();
	CtThemeMgr::getInstance()->setObjectTheme(getEvasObj());
	__startChangeTimer();
	__closePopup();
	__updateGenlist();
	m_rebuiltWhileShown = true;
}

void CtDetailView::__startChangeTimer()
{
	m_changeTimer = app_assist::WUiTimer::addTimer(kChangeCoalescingSeconds, [this](void*) {
		m_changeTimer.reset();
		if (m_pendingChangeCount > 0) {
			m_pendingChangeCount = 0;
			onDbChanged(nullptr);
		}
		return false;
	}, nullptr, this);
}

void CtDetailView::__closeWithScreensAbove()
{
	WENTER();
	m_isClosing = true;
	Elm_Object_Item* naviItem = getNaviItem();
	if (naviItem && m_naviframeObj) {
		while (Elm_Object_Item* top = elm_naviframe_top_item_get(m_naviframeObj)) {
			if (top == naviItem)
				break;
			elm_object_item_del(top);
		}
	}
	popOut();
}

void CtDetailView::__updateGenlist()
{
	WENTER();
	if (m_galData)
		return;
	int personId = m_detailData->getPersonId();
	__stopAddingRows();
	m_detailData->detachListener();
	// The rows borrow the old data's records: they go before it does.
	elm_genlist_clear(m_genlist);
	m_firstNumberItem = m_lastNumberItem = nullptr;
	m_detailData.reset(new CtDetailData(personId));
	m_isSimContact = m_detailData->isSimContact();
	m_detailData->attachListener(this);
	__applyCompactLayout();
	++m_rebuildCount;
	__updateTitle();
	__updateFavoriteBtn();
	__addAllItems();
}

void CtDetailView::__applyCompactLayout()
{
	m_isCompactLayout = ctDetailHasCompactRows(m_detailData.get());
	elm_genlist_homogeneous_set(m_genlist, m_isCompactLayout ? EINA_TRUE : EINA_FALSE);
}

void CtDetailView::onCompleteGetContacts()
{
	WHIT();
}

void CtDetailView::onConditionChagned()
{
	WHIT();
}

void CtDetailView::onSimChanged()
{
	WHIT();
	__refreshRows();
}

void CtDetailView::onLanguageChanged()
{
	WHIT();
	__updateTitle();
	__refreshRows();
}

void CtDetailView::__refreshRows()
{
	if (!m_genlist)
		return;
	for (Elm_Object_Item* item = elm_genlist_first_item_get(m_genlist); item; item = elm_genlist_item_next_get(item)) {
		if (CtDetailViewGenlistItem* row = ctDetailRowOf(item))
			row->invalidateContent();
	}
	elm_genlist_realized_items_update(m_genlist);
}

void CtDetailView::__onBlockListChanged()
{
	WHIT();
	if (!m_firstNumberItem || !m_lastNumberItem)
		return;
	for (Elm_Object_Item* item = m_firstNumberItem; item; item = elm_genlist_item_next_get(item)) {
		if (auto* row = dynamic_cast<CtDetailViewNumberItem*>(ctDetailRowOf(item))) {
			row->setBlocked(__getNumberCallBlockStatus(row->getRecord()));
			elm_genlist_item_fields_update(item, "elm.icon.left.bottom", ELM_GENLIST_ITEM_FIELD_CONTENT);
		}
		if (item == m_lastNumberItem)
			break;
	}
}

void CtDetailView::__onPowerSavingChanged(bool on)
{
	m_isPowerSaving = on;
	ctDetailApplyPowerSaving(m_genlist, on);
}

void CtDetailView::__startFavoriteSettleTimer()
{
	app_assist::WUiTimer::destroy(m_favoriteSettleTimer);
	m_favoriteSettleTimer = app_assist::WUiTimer::addTimer(kFavoriteSettleSeconds, [this](void*) {
		m_favoriteSettleTimer.reset();
		CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_FAVORITE_CHANGED, 0);
		return false;
	}, nullptr, this);
}

void CtDetailView::__closePopup()
{
	if (auto popup = m_popup.lock())
		popup->destroy();
	m_popup.reset();
}

void CtDetailView::onVideoCallSelected()
{
	WHIT();
	Eina_List* numbers = m_detailData->getNumberList();
	if (eina_list_count(numbers) == 1)
		__launchVideoCall(m_detailData->getNumber(static_cast<contacts_record_h>(eina_list_data_get(numbers))));
	else if (numbers)
		__showVideoCallPopup();
}

void CtDetailView::__launchVideoCall(const char* number)
{
	WPRET_M(!number || !*number, "number is empty");
	app_control_h request = nullptr;
	int err = app_control_create(&request);
	WPRET_M(err != APP_CONTROL_ERROR_NONE, "app_control_create() Failed(%d)", err);
	std::string uri = std::string("tel:") + number;
	app_control_set_operation(request, VIDEO_CALL_OPERATION);
	app_control_set_uri(request, uri.c_str());
	int personId = m_detailData->getPersonId();
	if (personId > 0)
		app_control_add_extra_data(request, "ctindex", std::to_string(personId).c_str());
	err = app_control_send_launch_request(request, nullptr, nullptr);
	if (err != APP_CONTROL_ERROR_NONE)
		WWARNING("app_control_send_launch_request() Failed(%d)", err);
	app_control_destroy(request);
	ctCommonInsertUsageLog("PH02", "Contacts_detail");
}

void CtDetailView::__showVideoCallPopup()
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_OPT_VIDEO_CALL");
	popup->setOnAddProperties([](Evas_Object* obj) { elm_object_style_set(obj, "theme_bg"); });
	std::weak_ptr<app_assist::WControl> alive = getWeakPtr();
	popup->setContent([this, alive](Evas_Object* parent) {
		Evas_Object* list = createPopupList(parent);
		static Elm_Genlist_Item_Class itc = [] {
			Elm_Genlist_Item_Class c = {};
			c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
			c.item_style = "1line";
			c.func.text_get = [](void* data, Evas_Object*, const char* part) -> char* {
				if (strcmp(part, "elm.text") != 0)
					return nullptr;
				const char* number = nullptr;
				contacts_record_get_str_p(static_cast<contacts_record_h>(data), _contacts_number.number,
						const_cast<char**>(&number));
				return number ? elm_entry_utf8_to_markup(number) : nullptr;
			};
			return c;
		}();
		Eina_List* l = nullptr;
		void* record = nullptr;
		EINA_LIST_FOREACH(m_detailData->getNumberList(), l, record)
			elm_genlist_item_append(list, &itc, record, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
		evas_object_smart_callback_add(list, "selected", [](void* data, Evas_Object*, void* eventInfo) {
			auto* view = static_cast<CtDetailView*>(data);
			auto* record = static_cast<contacts_record_h>(elm_object_item_data_get(static_cast<Elm_Object_Item*>(eventInfo)));
			std::string number = view->m_detailData->getNumber(record) ? view->m_detailData->getNumber(record) : "";
			view->__closePopup();
			view->__launchVideoCall(number.c_str());
		}, this);
		return list;
	});
	attachPopup(popup);
	m_popup = popup->getWeakPtr();
}

void CtDetailView::onAddressSelected(contacts_record_h address)
{
	WHIT();
	ctDetailOpenAddressInMaps(m_detailData.get(), address);
}

void CtDetailView::onImageSelected(int page)
{
	WHIT();
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe || !m_detailData, "naviframe or data is nullptr");
	naviframe->push(new CtDetailImageView(m_detailData.get(), false, page));
}

void CtDetailView::__powerSavingModeChangedCb(keynode_t* node, void* data)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtDetailView*>(data)->__onPowerSavingChanged(node && vconf_keynode_get_int(node) != 0);
}

void CtDetailView::__blockListChangedCb(void* data)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtDetailView*>(data)->__onBlockListChanged();
}

void CtDetailView::__favoriteCheckClickedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	auto* view = static_cast<CtDetailView*>(data);
	bool favorite = !view->m_detailData->isFavorite();
	view->m_detailData->setFavorite(favorite);
	ctCommonInsertUsageLog("CT09", favorite ? "On" : "Off");
	view->__startFavoriteSettleTimer();
}

void CtDetailView::__backButtonClickedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtDetailView*>(data)->popOut();
}

void CtDetailView::__naviTransitionFinishedCb(void* data, Evas_Object* obj, void*)
{
	WHIT();
	WPRET_M(!data, "data is nullptr");
	auto* view = static_cast<CtDetailView*>(data);
	if (auto* inputItem = static_cast<Elm_Object_Item*>(evas_object_data_get(obj, kInputNaviItemKey))) {
		evas_object_data_del(obj, kInputNaviItemKey);
		elm_object_item_del(inputItem);
	}
	view->__closePopup();
	if (view->m_rebuiltWhileShown) {
		CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_CONTACT_DATA_CHANGED, 0);
		CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_CONTACT_LIST_CHANGED, 0);
		view->m_rebuiltWhileShown = false;
	}
}

void CtDetailView::__genlistLongpressedCb(void* data, Evas_Object*, void* eventInfo)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	auto* view = static_cast<CtDetailView*>(data);
	view->m_popup = CtDetailViewCtxPopup::open(view, WView_getWindowEvasObj(view),
			static_cast<Elm_Object_Item*>(eventInfo));
}

void CtDetailView::__genlistPressedCb(void*, Evas_Object*, void*)
{
	ctCommonInvokeDbusCpuBoost();
}

void CtDetailView::__genlistReleasedCb(void*, Evas_Object* obj, void*)
{
	elm_scroller_movement_block_set(obj, ELM_SCROLLER_MOVEMENT_NO_BLOCK);
}

void CtDetailView::__moreButtonCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtDetailView*>(data)->__openMoreMenu();
}

void CtDetailView::__openMoreMenu()
{
	if (!m_popup.expired())
		return;
	Eina_List* contacts = m_galData ? nullptr : m_detailData->getContactsList();
	WPRET_M(!contacts, "list is nullptr");
	int count = eina_list_count(contacts);
	WPRET_M(count == 0, "contacts list is empty");
	bool social = m_detailData->getFacebookMode();
	auto* menu = new app_assist::WMenuPopup(getWindow(), getNaviframe());
	menu->setTextTranslatable("contacts");
	auto append = [this, menu](const char* label, void (CtDetailView::*action)(), const char* usage) {
		menu->appendItem(label, [this, action, usage] {
			(this->*action)();
			ctCommonInsertUsageLog("CT06", usage);
		});
	};
	if (!m_detailData->getReadOnlyMode() || m_isSimContact)
		append("IDS_PB_OPT_EDIT", &CtDetailView::__onEditCb, "Edit");
	if (social && count == 1)
		append("IDS_PB_OPT_HIDE", &CtDetailView::__onHideCb, "Hide");
	else
		append("IDS_PB_BUTTON_DELETE_ABB4", &CtDetailView::__onDeleteCb, "Delete");
	if (!social)
		append("IDS_PB_OPT_SHARE", &CtDetailView::__onShareCb, "Share");
	if (count > 1 && hasDefaultChoice(m_detailData.get()))
		append("IDS_PB_OPT_SET_DEFAULT_CONTACT_INFO_ABB", &CtDetailView::__onMarkAsDefaultCb, "Set_default_contact_info");
	if (!m_isSimContact && count == 1)
		append("IDS_PB_TMBODY_LINK_CONTACTS", &CtDetailView::__onLinkCb, "Link");
	if (!m_isSimContact && count > 1)
		append("IDS_PB_OPT_MANAGE_LINKED_CONTACTS_ABB2", &CtDetailView::__onManageLinkedContactsCb, "Manage_linked_contacts");
	attachPopup(menu);
	m_popup = menu->getWeakPtr();
}

void CtDetailView::__pushView(app_assist::WView* view)
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	if (!naviframe || !view) {
		WERROR("no naviframe or view");
		if (view)
			view->destroy();
		return;
	}
	naviframe->push(view);
}

void CtDetailView::__onEditCb()
{
	WHIT();
	Eina_List* contacts = m_detailData->getContactsWithoutFacebook();
	int count = eina_list_count(contacts);
	WERROR("count : %d", count);
	if (count > 1) {
		__pushView(new CtEditTabView(contacts));
	} else if (count == 1) {
		contacts_record_h clone = nullptr;
		int err = contacts_record_clone(static_cast<contacts_record_h>(eina_list_data_get(contacts)), &clone);
		if (err != CONTACTS_ERROR_NONE)
			WWARNING("contacts_record_clone() Failed(%d)", err);
		else
			__pushView(new CtInputView(clone));
	}
	ctCommonDestroyRecordList(contacts);
}

void CtDetailView::__onDeleteCb()
{
	WHIT();
	CtDetailPersonActions actions(getPersoinId());
	const char* textId = CtDetailPersonActions::getDeleteMessageId(actions.isSyncedToAnyAccount(),
			m_detailData->getReadOnlyMode(), eina_list_count(m_detailData->getContactsList()));
	__showDeletePopup("IDS_PB_BUTTON_DELETE_ABB4", textId, "IDS_PB_BUTTON_DELETE_ABB4");
}

void CtDetailView::__onHideCb()
{
	WHIT();
	__showDeletePopup("IDS_PB_OPT_HIDE", "IDS_PB_POP_THIS_ACCOUNT_IS_READ_ONLY_THE_CONTACT_WILL_BE_HIDDEN_FROM_CONTACTS",
			"IDS_PB_OPT_HIDE");
}

// After a deletion the popup stays until the store's change closes the
// screen; a second tap meanwhile finds no person and must not report a failure.
void CtDetailView::__showDeletePopup(const char* titleId, const char* textId, const char* buttonId)
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle(titleId);
	popup->setContent(textId);
	popup->addButton("IDS_PB_BUTTON_CANCEL", nullptr);
	popup->addButton(buttonId, [this](bool* destroyPopup) {
		*destroyPopup = false;
		if (m_isDeleting)
			return;
		*destroyPopup = !__deletePerson();
	});
	attachPopup(popup);
	m_popup = popup->getWeakPtr();
}

bool CtDetailView::__deletePerson()
{
	CtDetailPersonActions actions(getPersoinId());
	if (actions.deleteContacts() != CONTACTS_ERROR_NONE) {
		int err = notification_status_message_post(ContactsCommon::translate("IDS_PB_TPOP_FAILED_TO_DELETE_CONTACTS_TRY_AGAIN"));
		if (err != NOTIFICATION_ERROR_NONE)
			WWARNING("notification_status_message_post() Failed(%d)", err);
		return false;
	}
	m_isDeleting = true;
	actions.removeFromPermittedList();
	return true;
}

void CtDetailView::__onShareCb()
{
	WHIT();
	__showSelectShareTypePopup(getPersoinId());
}

void CtDetailView::__showSelectShareTypePopup(int personId)
{
	static const char* const labels[] = {"IDS_PB_OPT_VCARD_HVCF_ABB", "IDS_PB_OPT_TEXT"};
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_OPT_SHARE");
	popup->setOnAddProperties([](Evas_Object* obj) { elm_object_style_set(obj, "theme_bg"); });
	popup->setContent([this, personId](Evas_Object* parent) {
		Evas_Object* list = createPopupList(parent);
		evas_object_data_set(list, kSelectedPersonIdKey, reinterpret_cast<void*>(static_cast<intptr_t>(personId)));
		for (const char* label : labels)
			elm_genlist_item_append(list, translatedRowClass(), label, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
		evas_object_smart_callback_add(list, "selected", [](void* data, Evas_Object* obj, void* eventInfo) {
			auto* view = static_cast<CtDetailView*>(data);
			int id = static_cast<int>(reinterpret_cast<intptr_t>(evas_object_data_get(obj, kSelectedPersonIdKey)));
			bool asCard = elm_genlist_item_index_get(static_cast<Elm_Object_Item*>(eventInfo)) == 1;
			Evas_Object* owner = view->getEvasObj();
			view->__closePopup();
			CtDetailPersonActions actions(id);
			if (asCard)
				actions.shareAsVcard(owner);
			else
				actions.shareAsText(owner);
		}, this);
		return list;
	});
	attachPopup(popup);
	m_popup = popup->getWeakPtr();
}

void CtDetailView::__onMarkAsDefaultCb()
{
	WHIT();
	__pushView(new CtDetailMarkAsDefaultView(m_detailData.get()));
}

void CtDetailView::__onLinkCb()
{
	WHIT();
	ctCommonInsertUsageLog("0026", nullptr);
	app_control_h request = CtDetailPersonActions(getPersoinId()).createLinkRequest(eina_list_count(m_detailData->getContactsList()));
	WPRET_M(!request, "no link request");
	ContactsData data = {0, request, nullptr, 0};
	app_assist::WView* picker = CtDllViewFactory::getInstance()->getCtListViewClass(&data);
	app_control_destroy(request);
	__pushView(picker);
}

void CtDetailView::__onManageLinkedContactsCb()
{
	WHIT();
	__pushView(CtDllViewFactory::getInstance()->getCtListUnlinkContactViewClass(getPersoinId()));
}
