#include "CtProfileSharingView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtLoadingPopup.h"
#include "CtProfileOptionSelectControl.h"
#include "CtProfileShareWithView.h"
#include "CtProfileSharingPreviewItem.h"
#include "CtProfileSharingRow.h"
#include "CtRegistryMgr.h"
#include "CtSimMgr.h"
#include "CtThemeMgr.h"
#include "WNaviframe.h"
#include "WToastPopup.h"

#include <notification.h>

namespace {

const char* const kTitleId = "IDS_PB_MBODY_PROFILE_SHARING";
constexpr int kPersonalProfile = 0;
constexpr int kBusinessProfile = 1;
constexpr int kSharingStatusChanged = 0;
constexpr int kProfileChanged = 2;

const char* privacyTextId(int level)
{
	switch (level) {
	case 0:
	case 1: return "IDS_PB_SBODY_ALL_CONTACTS";
	case 2: return "IDS_PB_HEADER_FAVOURITES";
	case 3: return "IDS_PB_MBODY_SELECTED_CONTACTS";
	default:
		WERROR("invalid privacy level!!! set default privacy!!!");
		return "";
	}
}

void postNotice(const char* textId)
{
	int err = notification_status_message_post(ContactsCommon::translate(textId));
	if (err != NOTIFICATION_ERROR_NONE)
		WWARNING("notification_status_message_post() Failed(%d)", err);
}

} // namespace

CtProfileSharingView::CtProfileSharingView()
{
	WENTER();
}

CtProfileSharingView::~CtProfileSharingView()
{
	WENTER();
	__stopListening();
}

// Signals may come while the widgets are already gone: both listeners end
// with the widgets, and again (harmlessly) with the object.
void CtProfileSharingView::__stopListening()
{
	if (m_registryListenerId)
		CtRegistryMgr::getInstance()->removeChangeListener(m_registryListenerId);
	m_registryListenerId = 0;
	if (m_networkListening)
		CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(CT_NETWORK_STATUS_KEY, __networkChangedCb, this);
	m_networkListening = false;
}

Evas_Object* CtProfileSharingView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	setTitle(ContactsCommon::translate(kTitleId));
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	std::string path;
	ContactsCommon::getAppEdjePath("contacts/contacts.edj", path, true);
	CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	CtThemeMgr::getInstance()->setObjectTheme(layout);
	m_genlist = elm_genlist_add(layout);
	WPRET_VM(!m_genlist, layout, "elm_genlist_add failed");
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	elm_genlist_homogeneous_set(m_genlist, EINA_TRUE);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_object_part_content_set(layout, "elm.swallow.content", m_genlist);

	m_radioGroup = elm_radio_add(m_genlist);
	elm_object_style_set(m_radioGroup, "default");
	elm_radio_state_value_set(m_radioGroup, -1);
	elm_radio_value_set(m_radioGroup, CtContactsAgentUtil::getPreferenceProfileType());
	evas_object_hide(m_radioGroup);
	evas_object_data_set(m_genlist, "radioGroup", m_radioGroup);

	m_sharingOn = CtEsuAgentMgr::getInstance()->getProfileSharingStatus() && ctCommonCheckNetworkEnable();
	__appendModeRow();
	__appendProfileTypeRows();
	CtProfileOptionSelectControl options;
	options.setOnChanged([this] { __refreshPreview(); });
	options.append(m_genlist);
	__appendPreviewRows();
	profileSharingModeChangedCb(m_sharingOn);
	return layout;
}

void CtProfileSharingView::onCreated()
{
	WENTER();
	m_registryListenerId = CtRegistryMgr::getInstance()->addChangeListener(
		[this](ctRegistryKey key, int value) { __onRegistryChanged(key, value); });
	m_networkListening = CtRegistryMgr::getInstance()->registerVconfChangedCb(
		CT_NETWORK_STATUS_KEY, __networkChangedCb, this) == 0;
}

void CtProfileSharingView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
}

void CtProfileSharingView::onDestroy()
{
	WENTER();
	__stopListening();
	m_genlist = nullptr;
	m_modeRow = m_myProfileRow = m_bizProfileRow = nullptr;
	m_previewRow = nullptr;
}

void CtProfileSharingView::onLanguageChanged()
{
	WENTER();
	setTitle(ContactsCommon::translate(kTitleId));
	if (Elm_Object_Item* naviItem = getNaviItem())
		elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
	if (m_genlist)
		elm_genlist_realized_items_update(m_genlist);
}

CtProfileSharingRow* CtProfileSharingView::__append(CtProfileSharingRow* row)
{
	row = CtProfileSharingRow::append(m_genlist, row);
	if (row)
		row->attachToView(this);
	return row;
}

void CtProfileSharingView::__appendModeRow()
{
	auto* row = new CtProfileSharingRow("1line");
	row->setTextId("elm.text.main.left", "IDS_PB_MBODY_PROFILE_SHARING_MODE_ABB");
	row->setContent("elm.icon.2", [this](Evas_Object* parent) {
		return CtProfileSharingRow::createSwitch(parent, m_sharingOn, __checkButtonChangedCb, this);
	});
	row->setSelectHandler([this](CtProfileSharingRow*) {
		if (Evas_Object* check = getModeCheck())
			ctCommonChecktStateSet(check, !elm_check_state_get(check), 1);
		__onSwitchTouched();
	});
	m_modeRow = __append(row);
}

void CtProfileSharingView::__appendProfileTypeRows()
{
	auto* group = new CtProfileSharingRow("group_index");
	group->setTextId("elm.text", "IDS_PB_HEADER_PROFILE_TYPE_ABB");
	__append(group);
	auto* info = new CtProfileSharingRow("multiline_sub");
	info->setTextId("elm.text.multiline", "IDS_PB_BODY_SHARE_YOUR_PROFILE_INFO_MSG");
	__append(info);

	auto* personal = new CtProfileSharingRow("2line.top");
	personal->setTextId("elm.text.main.left.top", "IDS_PB_HEADER_PERSONAL_PROFILE_ABB");
	personal->setText("elm.text.sub.left.bottom",
		[] { return std::string(privacyTextId(CtContactsAgentUtil::getPreferenceProfilePrivacyLevel())); });
	personal->setContent("elm.icon.1", [this](Evas_Object* parent) {
		return CtProfileSharingRow::createRadio(parent, m_radioGroup, kPersonalProfile);
	});
	personal->setContent("elm.icon.2", [this](Evas_Object* parent) { return __createShareWithArea(parent); });
	personal->setSelectHandler([this](CtProfileSharingRow*) { __onProfileTypeChosen(kPersonalProfile); });
	m_myProfileRow = __append(personal);

	auto* business = new CtProfileSharingRow("1line");
	business->setTextId("elm.text.main.left", "IDS_PB_HEADER_BUSINESS_PROFILE_ABB");
	business->setContent("elm.icon.1", [this](Evas_Object* parent) {
		return CtProfileSharingRow::createRadio(parent, m_radioGroup, kBusinessProfile);
	});
	business->setSelectHandler([this](CtProfileSharingRow*) { __onProfileTypeChosen(kBusinessProfile); });
	m_bizProfileRow = __append(business);
}

void CtProfileSharingView::__appendPreviewRows()
{
	auto* group = new CtProfileSharingRow("group_index");
	group->setTextId("elm.text", "IDS_PB_HEADER_WHAT_OTHERS_WILL_SEE_ABB");
	__append(group);
	m_previewRow = static_cast<CtProfileSharingPreviewItem*>(__append(new CtProfileSharingPreviewItem()));
}

// While sharing is off the share-with image is shown dimmed and cannot be tapped.
Evas_Object* CtProfileSharingView::__createShareWithArea(Evas_Object* parent)
{
	Evas_Object* holder = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "list/C/type.1");
	WPRET_VM(!holder, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* area = ctCommonCreateLayout(holder, "contacts/detail_layout.edj", "list/C/profile/my_profile");
	if (!area)
		return holder;
	if (!CtEsuAgentMgr::getInstance()->getProfileSharingStatus()) {
		elm_object_signal_emit(area, "btn.disable", "");
		elm_object_part_content_set(holder, "elm.swallow.content", area);
		return holder;
	}
	elm_object_signal_emit(area, "btn.enable", "touch.event.area");
	Evas_Object* button = elm_button_add(holder);
	elm_object_style_set(button, "btn_with_swallow");
	elm_object_part_content_set(button, "elm.swallow.content", area);
	evas_object_propagate_events_set(button, EINA_FALSE);
	evas_object_smart_callback_add(button, "clicked", __profileShareWithButtonClickedCb, this);
	elm_object_part_content_set(holder, "elm.swallow.content", button);
	return holder;
}

Evas_Object* CtProfileSharingView::getModeCheck() const
{
	return m_modeRow ? m_modeRow->getHeldContent("elm.icon.2") : nullptr;
}

void CtProfileSharingView::profileSharingModeChangedCb(bool on)
{
	WENTER();
	WPRET_M(!m_genlist, "genlist is NULL");
	if (Evas_Object* check = getModeCheck())
		ctCommonChecktStateSet(check, on, 1);
	Elm_Object_Item* first = elm_genlist_first_item_get(m_genlist);
	for (Elm_Object_Item* item = first ? elm_genlist_item_next_get(first) : nullptr; item;
			item = elm_genlist_item_next_get(item)) {
		elm_object_item_disabled_set(item, on ? EINA_FALSE : EINA_TRUE);
		elm_genlist_item_update(item);
	}
}

void CtProfileSharingView::__onSwitchTouched()
{
	WHIT();
	if (CtSimMgr::getInstance()->getInsertedSimCount() == 0) {
		if (Evas_Object* check = getModeCheck())
			ctCommonChecktStateSet(check, m_sharingOn, 1);
		auto* popup = new app_assist::WPopup();
		popup->setTextTranslatable("contacts");
		popup->setTitle(kTitleId);
		popup->setContent("IDS_PB_POP_NO_SIM_CARD_HAS_BEEN_INSERTED_INSERT_A_SIM_CARD_AND_TRY_AGAIN");
		popup->addButton("IDS_PB_BUTTON_OK_ABB2", [](bool*) {});
		attachPopup(popup);
		return;
	}
	if (!ctCommonCheckNetworkEnable()) {
		if (Evas_Object* check = getModeCheck())
			ctCommonChecktStateSet(check, m_sharingOn, 1);
		attachPopup(new app_assist::WToastPopup(ContactsCommon::translate(
			"IDS_PB_TPOP_UNABLE_TO_ENABLE_PROFILE_SHARING_CHECK_NETWORK_CONNECTION_AND_TRY_AGAIN")));
		return;
	}
	__switchSharing();
}

void CtProfileSharingView::__switchSharing()
{
	bool on = !m_sharingOn;
	if (!CtEsuAgentMgr::getInstance()->setProfileSharingStatus(on)) {
		// Nothing was stored: the switch shows the state that still holds.
		if (Evas_Object* check = getModeCheck())
			ctCommonChecktStateSet(check, m_sharingOn, 1);
		return;
	}
	m_sharingOn = on;
	ctCommonInsertUsageLogValue("CT14", on ? "1000" : "0");
	attachPopup(new CtLoadingPopup("IDS_PB_BODY_PROCESSING_ING"));
}

void CtProfileSharingView::__onProfileTypeChosen(int type)
{
	WHIT();
	ctCommonInsertUsageLog("CT0F", type == kPersonalProfile ? "Personal profile" : "Business profile");
	if (!ctCommonCheckNetworkEnable())
		postNotice("IDS_PB_TPOP_UNABLE_TO_CHANGE_STATUS_CHECK_NETWORK_CONNECTION_AND_TRY_AGAIN");
	else if (CtContactsAgentUtil::getPreferenceProfileType() != type)
		CtContactsAgentMgr::getInstance()->setProfileType(type);
	__updateProfileTypeRows();
}

void CtProfileSharingView::__updateProfileTypeRows()
{
	elm_radio_value_set(m_radioGroup, CtContactsAgentUtil::getPreferenceProfileType());
	for (CtProfileSharingRow* row : {m_myProfileRow, m_bizProfileRow})
		if (row && row->getElmObjectItem())
			elm_genlist_item_update(row->getElmObjectItem());
}

void CtProfileSharingView::__refreshPreview()
{
	if (m_previewRow && m_previewRow->getElmObjectItem())
		elm_genlist_item_update(m_previewRow->getElmObjectItem());
}

void CtProfileSharingView::__onRegistryChanged(int key, int value)
{
	if (key != CT_REGISTRY_KEY_PROFILE_SHARING_STATE)
		return;
	if (value == kSharingStatusChanged) {
		m_sharingOn = CtEsuAgentMgr::getInstance()->getProfileSharingStatus() && ctCommonCheckNetworkEnable();
		profileSharingModeChangedCb(m_sharingOn);
		destroyPopup();
	} else if (value == kProfileChanged) {
		__updateProfileTypeRows();
	}
}

void CtProfileSharingView::__pushShareWith()
{
	if (CtContactsAgentUtil::getPreferenceProfileType() == kBusinessProfile)
		CtContactsAgentMgr::getInstance()->setProfileType(kPersonalProfile);
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is NULL");
	naviframe->push(new CtProfileShareWithView());
}

void CtProfileSharingView::__checkButtonChangedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtProfileSharingView*>(data)->__onSwitchTouched();
}

void CtProfileSharingView::__profileShareWithButtonClickedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtProfileSharingView*>(data)->__pushShareWith();
}

// Network comes and goes from outside; with sharing stored on, the screen follows it.
void CtProfileSharingView::__networkChangedCb(keynode_t*, void* data)
{
	WHIT();
	auto* view = static_cast<CtProfileSharingView*>(data);
	bool on = CtEsuAgentMgr::getInstance()->getProfileSharingStatus() && ctCommonCheckNetworkEnable();
	if (on == view->m_sharingOn)
		return;
	view->m_sharingOn = on;
	view->profileSharingModeChangedCb(on);
}
