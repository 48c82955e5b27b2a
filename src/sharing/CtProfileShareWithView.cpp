#include "CtProfileShareWithView.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtProfileSettingKeys.h"
#include "CtProfileSharingRow.h"
#include "CtThemeMgr.h"

#include <app_control.h>
#include <app_preference.h>

namespace {

const char* const kTitleId = "IDS_PB_MBODY_PROFILE_SHARING";
const char* const kHeaderId = "IDS_PB_HEADER_SHARE_WITH";
constexpr int kSelectedContacts = 3;
// The contacts list application's mode that picks several persons to share with.
const char* const kPickerType = "65";

const char* logNameOf(int level)
{
	switch (level) {
	case 1: return "All contacts";
	case 2: return "Favourites";
	case 3: return "Selected contacts";
	default: return nullptr;
	}
}

bool selectedContactsChosen()
{
	bool chosen = false;
	preference_get_boolean(CT_PREF_SELECTED_CONTACTS_SET, &chosen);
	return chosen;
}

} // namespace

CtProfileShareWithView::CtProfileShareWithView()
{
	WENTER();
	WDEBUG("privacy level from preference: %d", CtContactsAgentMgr::getInstance()->getPrivacyLevel());
}

CtProfileShareWithView::~CtProfileShareWithView()
{
	WENTER();
}

const char* CtProfileShareWithView::textIdOf(int level)
{
	switch (level) {
	case 1: return "IDS_PB_SBODY_ALL_CONTACTS";
	case 2: return "IDS_PB_HEADER_FAVOURITES";
	case 3: return "IDS_PB_MBODY_SELECTED_CONTACTS";
	default:
		WERROR("invalid privacy level!!! set default privacy!!!(%d)", level);
		return "";
	}
}

Evas_Object* CtProfileShareWithView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	setTitle(ContactsCommon::translate(kTitleId));
	std::string path;
	ContactsCommon::getAppEdjePath("contacts/contacts.edj", path, true);
	CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
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
	elm_radio_value_set(m_radioGroup, CtContactsAgentUtil::getPreferenceProfilePrivacyLevel());
	evas_object_hide(m_radioGroup);
	evas_object_data_set(m_genlist, "radioGroup", m_radioGroup);
	for (int level = 1; level <= kSelectedContacts; ++level)
		__appendLevelRow(level);
	return layout;
}

void CtProfileShareWithView::onCreated()
{
	WENTER();
}

void CtProfileShareWithView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_object_item_part_text_set(naviItem, "elm.text.title", ContactsCommon::translate(kHeaderId));
}

void CtProfileShareWithView::onDestroy()
{
	WENTER();
}

void CtProfileShareWithView::onLanguageChanged()
{
	WENTER();
	setTitle(ContactsCommon::translate(kTitleId));
	if (Elm_Object_Item* naviItem = getNaviItem())
		elm_object_item_part_text_set(naviItem, "elm.text.title", ContactsCommon::translate(kHeaderId));
	__refreshRows();
}

void CtProfileShareWithView::__appendLevelRow(int level)
{
	auto* row = new CtProfileSharingRow("1line");
	row->setText("elm.text.main.left", [level] { return std::string(textIdOf(level)); });
	row->setContent("elm.icon.1", [this, level](Evas_Object* parent) {
		return CtProfileSharingRow::createRadio(parent, m_radioGroup, level);
	});
	if (level == kSelectedContacts)
		row->setContent("elm.icon.2", [this](Evas_Object* parent) { return __createSettingArea(parent); });
	row->setSelectHandler([this, level](CtProfileSharingRow*) { __onLevelChosen(level); });
	if (CtProfileSharingRow::append(m_genlist, row))
		row->attachToView(this);
}

// While sharing is off the setting image is shown dimmed and cannot be tapped.
Evas_Object* CtProfileShareWithView::__createSettingArea(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "list/C/type.1");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* image = ctCommonCreateImage(layout, "contacts/image_layout.edj", "contacts_btn_ic_setting.png");
	if (!CtEsuAgentMgr::getInstance()->getProfileSharingStatus()) {
		if (image)
			elm_object_signal_emit(image, "btn.disable", "image");
		elm_object_part_content_set(layout, "elm.swallow.content", image);
		return layout;
	}
	Evas_Object* button = elm_button_add(layout);
	elm_object_style_set(button, "btn_with_swallow");
	elm_object_part_content_set(button, "elm.swallow.content", image);
	evas_object_propagate_events_set(button, EINA_FALSE);
	evas_object_smart_callback_add(button, "clicked", __selectedContactsButtonClickedCb, this);
	elm_object_part_content_set(layout, "elm.swallow.content", button);
	return layout;
}

void CtProfileShareWithView::__onLevelChosen(int level)
{
	WHIT();
	int previous = CtContactsAgentUtil::getPreferenceProfilePrivacyLevel();
	CtContactsAgentMgr::getInstance()->setPrivacyLevel(level);
	ctCommonInsertUsageLog("CT10", logNameOf(level));
	if (level == kSelectedContacts && !selectedContactsChosen())
		__launchContactsPicker();
	if (level != previous)
		__refreshRows();
}

void CtProfileShareWithView::__refreshRows()
{
	if (!m_genlist)
		return;
	elm_radio_value_set(m_radioGroup, CtContactsAgentUtil::getPreferenceProfilePrivacyLevel());
	elm_genlist_realized_items_update(m_genlist);
}

void CtProfileShareWithView::__launchContactsPicker()
{
	app_control_h request = nullptr;
	int err = app_control_create(&request);
	if (err != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_create", err);
		return;
	}
	app_control_set_app_id(request, CONTACTS_LIST_APP_ID);
	app_control_add_extra_data(request, "type", kPickerType);
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	if (!ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request))
		WERROR("sendLaunchRequest() failed");
	app_control_destroy(request);
}

void CtProfileShareWithView::__selectedContactsButtonClickedCb(void*, Evas_Object*, void*)
{
	WHIT();
	__launchContactsPicker();
}
