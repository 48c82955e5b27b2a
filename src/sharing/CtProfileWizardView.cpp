#include "CtProfileWizardView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtMyProfileInputView.h"
#include "CtProfileOptionSelectControl.h"
#include "CtProfileSharingRow.h"
#include "CtThemeMgr.h"
#include "WNaviframe.h"

namespace {

const char* const kDetailEdj = "contacts/detail_layout.edj";
const char* const kSharingTitleId = "IDS_PB_MBODY_PROFILE_SHARING";
constexpr int kLastStep = 3;

struct ProfileType {
	int type;
	const char* titleId;
	const char* descriptionId;
};

const ProfileType kProfileTypes[] = {
	{0, "IDS_PB_HEADER_PERSONAL_PROFILE_ABB", "IDS_PB_SBODY_SHARE_YOUR_PROFILE_WITH_SELECTED_CONTACTS"},
	{1, "IDS_PB_HEADER_BUSINESS_PROFILE_ABB", "IDS_PB_BODY_SHARE_YOUR_BUSINESS_PROFILE_WITH_EVERYONE"},
};

const char* stepTitleId(int step)
{
	switch (step) {
	case 1: return "IDS_PB_HEADER_SELF_PROMOTION_MADE_EASY";
	case 2: return "IDS_PB_BODY_SELECT_A_PROFILE_TYPE";
	default: return nullptr;
	}
}

} // namespace

CtProfileWizardView::CtProfileWizardView()
{
	WENTER();
}

CtProfileWizardView::~CtProfileWizardView()
{
	WENTER();
	CtEsuAgentMgr::getInstance()->cancelEnhancedFeature(this);
}

const char* CtProfileWizardView::getTitleAreaText() const
{
	Evas_Object* edje = m_titleLayout ? elm_layout_edje_get(m_titleLayout) : nullptr;
	const char* text = edje ? edje_object_part_text_get(edje, "elm.text.title") : nullptr;
	return text ? text : "";
}

Evas_Object* CtProfileWizardView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	// The toolkit translates the texts of this screen with the catalogue bound here.
	ContactsCommon::bindTextDomain();
	for (const char* edj : {"contacts/contacts.edj", kDetailEdj}) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
	m_baseLayout = ctCommonCreateLayout(parent, kDetailEdj, "profile/wizard/base");
	WPRET_VM(!m_baseLayout, nullptr, "ctCommonCreateLayout() is failed");
	CtThemeMgr::getInstance()->setObjectTheme(m_baseLayout);
	Evas_Object* bottom = ctCommonCreateLayout(m_baseLayout, kDetailEdj, "detail/profile/bottom/layout");
	WPRET_VM(!bottom, m_baseLayout, "ctCommonCreateLayout() is fail");
	m_nextButton = ctCommonCreateButton(bottom, "bottom", "IDS_PB_BUTTON_NEXT_ABB4", __nextButtonClickCb, this);
	WPRET_VM(!m_nextButton, m_baseLayout, "ctCommonCreateButton() is fail");
	elm_object_part_content_set(bottom, "button", m_nextButton);
	elm_object_part_content_set(m_baseLayout, "elm.swallow.button", bottom);
	return m_baseLayout;
}

void CtProfileWizardView::onCreated()
{
	WENTER();
	__showStep(1);
}

void CtProfileWizardView::onPushed(Elm_Object_Item*)
{
	WENTER();
	__updateNaviTitle();
}

void CtProfileWizardView::onDestroy()
{
	WENTER();
	m_baseLayout = m_topLayout = m_titleLayout = m_contentsLayout = nullptr;
	m_genlist = m_radioGroup = m_nextButton = nullptr;
}

bool CtProfileWizardView::onPop()
{
	WENTER();
	if (m_step > 1) {
		__showStep(m_step - 1);
		return false;
	}
	return true;
}

void CtProfileWizardView::__showStep(int step)
{
	WENTER();
	setTitle(step == kLastStep ? ContactsCommon::translate(kSharingTitleId) : "");
	m_topVisible = step != kLastStep;
	m_titleVisible = step != kLastStep;
	m_contentsVisible = step == 1;
	m_listVisible = step != 1;
	m_step = step;
	__updateNaviTitle();
	__updateTopLayout();
	__updateTitleLayout();
	__updateContentsLayout();
	__updateGenlist();
}

// The title bar shows only on the last step, where the areas above the list are gone.
void CtProfileWizardView::__updateNaviTitle()
{
	Elm_Object_Item* naviItem = getNaviItem();
	if (!naviItem)
		return;
	elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
	Eina_Bool shown = m_step == kLastStep ? EINA_TRUE : EINA_FALSE;
	elm_naviframe_item_title_enabled_set(naviItem, shown, EINA_FALSE);
}

// A shown area is made once and kept; a hidden one is taken out and deleted.
Evas_Object* CtProfileWizardView::__updateArea(Evas_Object* area, bool visible, const char* group, const char* part)
{
	WPRET_VM(!m_baseLayout, nullptr, "layout is NULL");
	if (!visible) {
		if (area) {
			elm_object_part_content_unset(m_baseLayout, part);
			evas_object_del(area);
		}
		return nullptr;
	}
	if (area)
		return area;
	area = ctCommonCreateLayout(m_baseLayout, kDetailEdj, group);
	WPRET_VM(!area, nullptr, "ctCommonCreateLayout() is failed");
	elm_object_part_content_set(m_baseLayout, part, area);
	return area;
}

void CtProfileWizardView::__updateTopLayout()
{
	bool created = !m_topLayout;
	m_topLayout = __updateArea(m_topLayout, m_topVisible, "profile/wizard/top/sharing", "elm.swallow.top");
	if (m_topLayout && created)
		elm_object_domain_translatable_part_text_set(m_topLayout, "elm.text", "contacts", kSharingTitleId);
}

void CtProfileWizardView::__updateTitleLayout()
{
	m_titleLayout = __updateArea(m_titleLayout, m_titleVisible, "profile/wizard/title", "elm.swallow.title");
	if (m_titleLayout)
		elm_object_domain_translatable_part_text_set(m_titleLayout, "elm.text.title", "contacts", stepTitleId(m_step));
}

void CtProfileWizardView::__updateContentsLayout()
{
	bool created = !m_contentsLayout;
	m_contentsLayout = __updateArea(m_contentsLayout, m_contentsVisible, "profile/wizard/contents",
		"elm.swallow.contents");
	if (m_contentsLayout && created)
		elm_object_domain_translatable_part_text_set(m_contentsLayout, "elm.text.contents", "contacts",
			"IDS_PB_BODY_SHARE_YOUR_PROFILE_PICTURE_AND_STATUS_MSG");
}

// The list is made anew for each step: its rows and its place differ.
void CtProfileWizardView::__updateGenlist()
{
	if (m_genlist) {
		evas_object_del(m_genlist);
		m_genlist = m_radioGroup = nullptr;
	}
	if (!m_listVisible || !m_baseLayout)
		return;
	m_genlist = elm_genlist_add(m_baseLayout);
	WPRET_M(!m_genlist, "elm_genlist_add() is failed");
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	if (m_step == 2) {
		__appendProfileItems();
		elm_object_part_content_set(m_baseLayout, "elm.swallow.contents", m_genlist);
	} else {
		CtProfileOptionSelectControl options;
		options.append(m_genlist);
		elm_object_part_content_set(m_baseLayout, "elm.swallows.full", m_genlist);
	}
}

void CtProfileWizardView::__appendProfileItems()
{
	m_radioGroup = elm_radio_add(m_genlist);
	elm_object_style_set(m_radioGroup, "default");
	elm_radio_state_value_set(m_radioGroup, -1);
	elm_radio_value_set(m_radioGroup, CtContactsAgentUtil::getPreferenceProfileType());
	evas_object_hide(m_radioGroup);
	evas_object_data_set(m_genlist, "radioGroup", m_radioGroup);
	for (const ProfileType& profile : kProfileTypes) {
		auto* row = new CtProfileSharingRow("multiline_sub.main.1icon");
		row->setTextId("elm.text.main", profile.titleId);
		row->setTextId("elm.text.multiline", profile.descriptionId);
		int type = profile.type;
		row->setContent("elm.icon", [this, type](Evas_Object* parent) {
			return CtProfileSharingRow::createRadio(parent, m_radioGroup, type);
		});
		row->setSelectHandler([this, type](CtProfileSharingRow*) { __profileTypeItemClicked(type); });
		if (CtProfileSharingRow* appended = CtProfileSharingRow::append(m_genlist, row))
			appended->attachToView(this);
	}
}

void CtProfileWizardView::__profileTypeItemClicked(int type)
{
	WHIT();
	WPRET_M(!m_radioGroup, "obj is NULL");
	if (elm_radio_value_get(m_radioGroup) == type)
		return;
	elm_radio_value_set(m_radioGroup, type);
	CtContactsAgentMgr::getInstance()->setProfileType(type);
}

void CtProfileWizardView::__next()
{
	WENTER();
	CtEsuAgentMgr* esu = CtEsuAgentMgr::getInstance();
	CtContactsAgentMgr* agent = CtContactsAgentMgr::getInstance();
	switch (m_step) {
	case 1:
		if (esu->getEasySignUpStatus() != 0) {
			esu->setProfileSharingStatus(true);
			agent->setProfileType(0);
			__showStep(2);
		} else if (!esu->launchEnhancedFeautre(__signUpResultCb, this, getWindow() ? getWindow()->getEvasObj() : nullptr)) {
			WERROR("launchEnhancedFeautre() is failed");
		}
		break;
	case 2:
		for (int property = CT_PROFILE_PROPERTY_EMAIL; property < CT_PROFILE_PROPERTY_MAX; ++property)
			agent->setProfileProperty(static_cast<CtProfileProperty>(property), true);
		__showStep(3);
		break;
	default:
		__openEditor();
		break;
	}
}

void CtProfileWizardView::__openEditor()
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is NULL");
	naviframe->push(new CtMyProfileInputView(__wizardExitCb, this));
}

void CtProfileWizardView::__nextButtonClickCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtProfileWizardView*>(data)->__next();
}

void CtProfileWizardView::__signUpResultCb(app_control_h, app_control_h, app_control_result_e result, void* data)
{
	WHIT();
	auto* view = static_cast<CtProfileWizardView*>(data);
	WPRET_M(!view, "data is NULL");
	if (result == APP_CONTROL_RESULT_SUCCEEDED && view->m_step == 1)
		view->__showStep(2);
}

void CtProfileWizardView::__wizardExitCb(void* data)
{
	WHIT();
	auto* view = static_cast<CtProfileWizardView*>(data);
	WPRET_M(!view, "data is NULL");
	view->destroy();
}
