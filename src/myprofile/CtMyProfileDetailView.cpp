#include "CtMyProfileDetailView.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtDbChangeSubscription.h"
#include "CtDetailImageView.h"
#include "CtDetailViewAddressItem.h"
#include "CtDetailViewEmailItem.h"
#include "CtDetailViewEventItem.h"
#include "CtDetailViewMessengerItem.h"
#include "CtDetailViewNoteItem.h"
#include "CtDetailViewNumberItem.h"
#include "CtDetailViewProfileMultiImageItem.h"
#include "CtDetailViewProfileSharingItem.h"
#include "CtDetailViewRelationItem.h"
#include "CtDetailViewStatusItem.h"
#include "CtDetailViewUtil.h"
#include "CtDetailViewWebsiteItem.h"
#include "CtEsuAgentMgr.h"
#include "CtMyProfileDetailData.h"
#include "CtMyProfileInputView.h"
#include "CtProfileSharingView.h"
#include "CtRegistryMgr.h"
#include "CtThemeMgr.h"
#include "WMenuPopup.h"
#include "WNaviframe.h"

#include <string>

namespace {

// Rows in the order the list shows them.
enum RowIndex {
	ROW_IMAGE = 0,
	ROW_PROFILE_SHARING,
	ROW_STATUS,
	ROW_DEFAULT_NUMBER,
	ROW_NUMBERS,
	ROW_EMAILS,
	ROW_NOTES,
	ROW_ADDRESSES,
	ROW_EVENTS,
	ROW_RELATIONSHIPS,
	ROW_WEBSITES,
	ROW_MESSENGERS,
	ROW_COUNT,
};

constexpr double kChangeCoalescingSeconds = 2.0;
constexpr const char* kDetailEdj = "contacts/detail_layout.edj";
constexpr const char* kShareMime = "application/vnd.velmora.contact";
constexpr int kSharingStatusChanged = 0;
constexpr int kSharingProfileChanged = 2;

bool readPowerSaving()
{
	int value = 0;
	int err = vconf_get_int(VCONFKEY_SETAPPL_PSMODE, &value);
	if (err != VCONF_OK)
		WWARNING("vconf_get_int() Failed(%d)", err);
	return value != 0;
}

} // namespace

CtMyProfileDetailView::CtMyProfileDetailView(bool mode)
	: m_detailData(new CtMyProfileDetailData()), m_mode(mode), m_isPowerSaving(readPowerSaving())
{
	WENTER();
	// Last: a constructor that throws runs no destructor to unregister it.
	CtRegistryMgr::getInstance()->registerVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, __onPowerSavingModeChangedCb, this);
}

CtMyProfileDetailView::~CtMyProfileDetailView()
{
	WENTER();
	ContactsAppControlLauncher::getInstance()->terminate();
	CtEsuAgentMgr::getInstance()->cancelEnhancedFeature(this);
	if (m_registryListenerId)
		CtRegistryMgr::getInstance()->removeChangeListener(m_registryListenerId);
	m_registryListenerId = 0;
	CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, __onPowerSavingModeChangedCb, this);
	if (auto menu = m_menu.lock())
		menu->destroy();
	m_changeCounter.reset();
	m_detailData->detachListener();
}

int CtMyProfileDetailView::getPersoinId()
{
	WPRET_VM(!m_detailData, 0, "WASSERT! __detailData is null");
	return m_detailData->getPersonId();
}

Evas_Object* CtMyProfileDetailView::__getWindow()
{
	Evas_Object* window = WView_getWindowEvasObj(this);
	if (!window)
		WERROR("WASSERT! window null");
	return window;
}

Evas_Object* CtMyProfileDetailView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	Evas_Object* layout = createBaseLayout(parent, kDetailEdj, "detail/profile/base/layout");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	ctDetailAddExtensionThemes();
	CtThemeMgr::getInstance()->setObjectTheme(layout);

	__createGenlist(layout);
	return layout;
}

// A fresh list for every build: rows of another height in a list that kept
// the sizes of the rows it showed before are drawn out of place.
void CtMyProfileDetailView::__createGenlist(Evas_Object* layout)
{
	m_genlist = elm_genlist_add(layout);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	__applyHomogeneity();
	evas_object_show(m_genlist);
	elm_object_part_content_set(layout, "elm.swallow.content", m_genlist);
}

void CtMyProfileDetailView::onCreated()
{
	m_registryListenerId = CtRegistryMgr::getInstance()->addChangeListener(
		[this](ctRegistryKey key, int value) { __onRegistryChanged(key, value); });
}

void CtMyProfileDetailView::onDestroy()
{
	WHIT();
}

void CtMyProfileDetailView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	__updateBottomButton();
	__addAllItems();
	__updateTitle();
	enableMoreButton(naviItem, __moreButtonCb, this);
	m_detailData->attachListener(this);
}

void CtMyProfileDetailView::__updateBottomButton()
{
	Evas_Object* bottom = createBaseLayout(getEvasObj(), kDetailEdj, "detail/profile/bottom/layout");
	WPRET_M(!bottom, "ctCommonCreateLayout() is fail");
	elm_object_part_content_set(getEvasObj(), "bottom.button", bottom);
	m_shareButton = ctCommonCreateButton(bottom, "bottom", "IDS_PB_BUTTON_SHARE_ABB6", __onShareCb, this);
	WPRET_M(!m_shareButton, "ctCommonCreateButton() is fail");
	// There is nothing to send until a profile is stored.
	elm_object_disabled_set(m_shareButton, m_detailData->getPersonRecord() ? EINA_FALSE : EINA_TRUE);
	elm_object_part_content_set(bottom, "button", m_shareButton);
}

void CtMyProfileDetailView::__updateTitle()
{
	ctDetailUpdateTitle(getNaviItem(), m_detailData.get());
}

void CtMyProfileDetailView::__addAllItems()
{
	m_profileSharingItem = nullptr;
	m_statusItem = nullptr;
	m_shownProfileId = m_detailData->getPersonRecord() ? m_detailData->getPersonId() : 0;
	for (int index = ROW_IMAGE; index < ROW_COUNT; ++index)
		__addItem(index);
}

void CtMyProfileDetailView::__addItem(int index)
{
	CtMyProfileDetailData* data = m_detailData.get();
	CtEsuAgentMgr* esu = CtEsuAgentMgr::getInstance();
	switch (index) {
	case ROW_IMAGE:
		__appendItem(new CtDetailViewProfileMultiImageItem(this, data, ctDetailIsLowSizePicture(data, getEvasObj())));
		break;
	case ROW_PROFILE_SHARING:
		if (esu->getEasySignUpStatus() != 0)
			m_profileSharingItem = __appendItem(new CtDetailViewProfileSharingItem(data));
		break;
	case ROW_STATUS:
		if (esu->getProfileSharingStatus() && data->getStatus() && *data->getStatus())
			m_statusItem = __appendItem(new CtDetailViewStatusItem(data));
		break;
	case ROW_DEFAULT_NUMBER:
		if (contacts_record_h number = data->getDefaultNumberRecord())
			__appendItem(__makeNumberItem(number));
		break;
	case ROW_NUMBERS:
		__addListItems(data->getNumberList(), &CtMyProfileDetailView::__makeNumberItem);
		break;
	case ROW_EMAILS:
		__addListItems(data->getEmailList(), &CtMyProfileDetailView::__makeEmailItem);
		break;
	case ROW_NOTES:
		__addListItems(data->getNoteList(), &CtMyProfileDetailView::__makeNoteItem);
		break;
	case ROW_ADDRESSES:
		__addListItems(data->getAddressList(), &CtMyProfileDetailView::__makeAddressItem);
		break;
	case ROW_EVENTS:
		__addListItems(data->getEventList(), &CtMyProfileDetailView::__makeEventItem);
		break;
	case ROW_RELATIONSHIPS:
		__addListItems(data->getRelationshipList(), &CtMyProfileDetailView::__makeRelationItem);
		break;
	case ROW_WEBSITES:
		__addListItems(data->getUrlList(), &CtMyProfileDetailView::__makeWebsiteItem);
		break;
	case ROW_MESSENGERS:
		__addListItems(data->getMessengerList(), &CtMyProfileDetailView::__makeMessengerItem);
		break;
	default:
		WERROR("unknown row index %d", index);
		break;
	}
}

void CtMyProfileDetailView::__addListItems(Eina_List* list,
		CtDetailViewGenlistItem* (CtMyProfileDetailView::*make)(contacts_record_h))
{
	Eina_List* node = nullptr;
	void* record = nullptr;
	EINA_LIST_FOREACH(list, node, record) {
		if (CtDetailViewGenlistItem* row = (this->*make)(static_cast<contacts_record_h>(record)))
			__appendItem(row);
	}
}

Elm_Object_Item* CtMyProfileDetailView::__appendItem(CtDetailViewGenlistItem* row)
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
	if (ctDetailPowerSavingIconPart(row->getItemType()))
		elm_object_item_disabled_set(item, m_isPowerSaving ? EINA_TRUE : EINA_FALSE);
	return item;
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeNumberItem(contacts_record_h record)
{
	return new CtDetailViewNumberItem(m_detailData.get(), record, false, false);
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeEmailItem(contacts_record_h record)
{
	return new CtDetailViewEmailItem(m_detailData.get(), record, m_isPowerSaving);
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeNoteItem(contacts_record_h record)
{
	return new CtDetailViewNoteItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeAddressItem(contacts_record_h record)
{
	return new CtDetailViewAddressItem(this, m_detailData.get(), record, m_isPowerSaving);
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeEventItem(contacts_record_h record)
{
	if (!CtDetailViewEventItem::hasCalendarDate(m_detailData.get(), record))
		return nullptr;
	return new CtDetailViewEventItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeRelationItem(contacts_record_h record)
{
	return new CtDetailViewRelationItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeWebsiteItem(contacts_record_h record)
{
	return new CtDetailViewWebsiteItem(m_detailData.get(), record);
}

CtDetailViewGenlistItem* CtMyProfileDetailView::__makeMessengerItem(contacts_record_h record)
{
	return new CtDetailViewMessengerItem(m_detailData.get(), record);
}

void CtMyProfileDetailView::__updateGenlist()
{
	WENTER();
	WPRET_M(!m_genlist, "__genlist is nullptr");
	evas_object_del(m_genlist);
	__createGenlist(getEvasObj());
	++m_rebuildCount;
	__updateTitle();
	__addAllItems();
	if (m_shareButton)
		elm_object_disabled_set(m_shareButton, m_detailData->getPersonRecord() ? EINA_FALSE : EINA_TRUE);
}

void CtMyProfileDetailView::__applyHomogeneity()
{
	// Several addresses or notes, the rows that wrap, make rows of different heights.
	elm_genlist_homogeneous_set(m_genlist, ctDetailHasCompactRows(m_detailData.get()) ? EINA_TRUE : EINA_FALSE);
}

// Called after the data reloaded itself: the rows borrow records that are
// gone, so the list is rebuilt now whatever else happens.
void CtMyProfileDetailView::onDbChanged(const char* viewUri)
{
	WDEBUG("changed : %s", viewUri ? viewUri : "");
	if (m_isClosing)
		return;
	// A screen opened before any profile was stored stays for the one to come.
	if (!m_detailData->getPersonRecord() && m_shownProfileId > 0) {
		m_isClosing = true;
		m_detailData->detachListener();
		popOut();
		return;
	}
	__updateGenlist();
	__startChangeTimer();
}

// Until the timer fires the data stays as the rows show it: it is not told
// of changes, which are only counted, and reloaded once at the end.
void CtMyProfileDetailView::__startChangeTimer()
{
	m_detailData->detachListener();
	m_changeCounter = std::make_unique<CtDbChangeSubscription>(_contacts_my_profile._uri, __profileChangedCb, this);
	m_changeTimer = app_assist::WUiTimer::addTimer(kChangeCoalescingSeconds, [this](void*) {
		__onChangeTimer();
		return false;
	}, nullptr, this);
}

void CtMyProfileDetailView::__onChangeTimer()
{
	m_changeTimer.reset();
	m_changeCounter.reset();
	m_detailData->attachListener(this);
	if (m_pendingChangeCount == 0)
		return;
	m_pendingChangeCount = 0;
	m_detailData->deInit();
	m_detailData->init();
	onDbChanged(nullptr);
}

void CtMyProfileDetailView::__profileChangedCb(const char*, void* data)
{
	WPRET_M(!data, "Invalid param : data");
	++static_cast<CtMyProfileDetailView*>(data)->m_pendingChangeCount;
}

void CtMyProfileDetailView::__onRegistryChanged(int key, int value)
{
	if (key != CT_REGISTRY_KEY_PROFILE_SHARING_STATE)
		return;
	if (value == kSharingStatusChanged || value == kSharingProfileChanged)
		__updateGenlist();
}

void CtMyProfileDetailView::onCompleteGetContacts()
{
	WHIT();
}

void CtMyProfileDetailView::onConditionChagned()
{
	WHIT();
}

void CtMyProfileDetailView::onLanguageChanged()
{
	WHIT();
	if (!m_genlist)
		return;
	__updateTitle();
	for (Elm_Object_Item* item = elm_genlist_first_item_get(m_genlist); item; item = elm_genlist_item_next_get(item)) {
		if (CtDetailViewGenlistItem* row = ctDetailRowOf(item))
			row->invalidateContent();
	}
	elm_genlist_realized_items_update(m_genlist);
}

void CtMyProfileDetailView::onVideoCallSelected()
{
	WHIT();
}

void CtMyProfileDetailView::onAddressSelected(contacts_record_h address)
{
	WHIT();
	ctDetailOpenAddressInMaps(m_detailData.get(), address);
}

void CtMyProfileDetailView::onImageSelected(int page)
{
	WHIT();
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is nullptr");
	naviframe->push(new CtDetailImageView(m_detailData.get(), true, page));
}

void CtMyProfileDetailView::__onPowerSavingChanged(bool on)
{
	m_isPowerSaving = on;
	ctDetailApplyPowerSaving(m_genlist, on);
}

void CtMyProfileDetailView::__showMoreMenu()
{
	if (!m_menu.expired())
		return;
	auto* menu = new app_assist::WMenuPopup(getWindow(), getNaviframe());
	menu->setTextTranslatable("contacts");
	menu->appendItem("IDS_PB_OPT_EDIT", [this] { __pushEditView(); });
	if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled()) {
		auto state = readPowerSaving() ? app_assist::WMenuPopup::ItemState::Disabled
			: app_assist::WMenuPopup::ItemState::Enabled;
		menu->appendItem("IDS_PB_OPT_PROFILE_SHARING_ABB", [this] { __openProfileSharing(); }, state);
	}
	attachPopup(menu);
	m_menu = menu->getWeakPtr();
}

void CtMyProfileDetailView::__pushEditView()
{
	ctCommonInsertUsageLog("CT12", "Edit");
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is nullptr");
	naviframe->push(new CtMyProfileInputView(nullptr, nullptr));
}

void CtMyProfileDetailView::__openProfileSharing()
{
	ctCommonInsertUsageLog("CT12", "Profile sharing");
	CtEsuAgentMgr* esu = CtEsuAgentMgr::getInstance();
	if (esu->getEasySignUpStatus() != 0) {
		__pushProfileSharingView();
		return;
	}
	if (!esu->launchEnhancedFeautre(__signUpResultCb, this, __getWindow()))
		WERROR("launch Failed");
}

void CtMyProfileDetailView::__signUpResultCb(app_control_h, app_control_h, app_control_result_e result, void* data)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	if (result != APP_CONTROL_RESULT_SUCCEEDED)
		return;
	static_cast<CtMyProfileDetailView*>(data)->__onSignUpSucceeded();
}

void CtMyProfileDetailView::__onSignUpSucceeded()
{
	if (m_profileSharingItem)
		elm_genlist_item_update(m_profileSharingItem);
	else
		__updateGenlist();
	__pushProfileSharingView();
}

void CtMyProfileDetailView::__pushProfileSharingView()
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is nullptr");
	naviframe->push(new CtProfileSharingView());
}

void CtMyProfileDetailView::__share()
{
	WENTER();
	app_control_h request = nullptr;
	int err = app_control_create(&request);
	WPRET_M(err != APP_CONTROL_ERROR_NONE, "app_control_create() Failed(%d)", err);
	app_control_set_operation(request, APP_CONTROL_OPERATION_SHARE);
	app_control_set_mime(request, kShareMime);
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	app_control_add_extra_data(request, APP_CONTROL_DATA_ID, std::to_string(getPersoinId()).c_str());
	app_control_add_extra_data(request, APP_CONTROL_DATA_TYPE, "my_profile");
	auto ignoreReply = [](app_control_h, app_control_h, app_control_result_e, void*) {};
	if (!ContactsAppControlLauncher::getInstance()->sendAsyncLaunchRequest(request, ignoreReply, this, nullptr))
		WERROR("launch Failed");
	app_control_destroy(request);
	ctCommonInsertUsageLog("CT16", nullptr);
}

void CtMyProfileDetailView::__onPowerSavingModeChangedCb(keynode_t*, void* data)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtMyProfileDetailView*>(data)->__onPowerSavingChanged(readPowerSaving());
}

void CtMyProfileDetailView::__moreButtonCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtMyProfileDetailView*>(data)->__showMoreMenu();
}

void CtMyProfileDetailView::__onShareCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtMyProfileDetailView*>(data)->__share();
}
