#include "CtEditTabView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "CtInputView.h"
#include "WNaviframe.h"
#include "WPopup.h"

#include <ui_extension.h>

#include <algorithm>
#include <cstdlib>

namespace {

constexpr double kRestPagesDelaySeconds = 1.0;
constexpr const char* kTextDomain = "contacts";

contacts_record_h cloneRecord(contacts_record_h record)
{
	contacts_record_h clone = nullptr;
	int err = contacts_record_clone(record, &clone);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_record_clone() Failed(%d)", err);
		return nullptr;
	}
	return clone;
}

Evas_Object* createTitleButton(Evas_Object* parent, const char* style, const char* textId, Evas_Smart_Cb clicked,
		void* data)
{
	Evas_Object* button = uxt_button_add(parent, style);
	if (!button)
		return nullptr;
	elm_object_domain_translatable_text_set(button, kTextDomain, textId);
	evas_object_smart_callback_add(button, "clicked", clicked, data);
	return button;
}

} // namespace

CtEditTabView::CtEditTabView(Eina_List* contactRecords)
{
	WENTER();
	m_pageCount = std::min(static_cast<int>(eina_list_count(contactRecords)), kMaxPages);
	for (int i = 0; i < m_pageCount; ++i) {
		auto* record = static_cast<contacts_record_h>(eina_list_nth(contactRecords, i));
		contacts_record_h pageRecord = cloneRecord(record);
		contacts_record_h titleRecord = pageRecord ? cloneRecord(record) : nullptr;
		if (!titleRecord) {
			if (pageRecord)
				contacts_record_destroy(pageRecord, true);
			m_pageCount = i;
			break;
		}
		m_pages[i] = new CtInputView(pageRecord, this);
		m_pages[i]->setName(__getTabViewTitle(titleRecord).c_str());
		m_records = eina_list_append(m_records, titleRecord);
	}
}

CtEditTabView::~CtEditTabView()
{
	WENTER();
	for (int i = 0; i < m_pageCount; ++i) {
		if (!m_contentMade[i] && m_pages[i])
			m_pages[i]->destroy();
	}
	ctCommonDestroyRecordList(m_records);
}

CtInputView* CtEditTabView::getPage(int index) const
{
	if (index < 0 || index >= m_pageCount)
		return nullptr;
	if (m_contentMade[index])
		return static_cast<CtInputView*>(getPageContent(index));
	return m_pages[index];
}

bool CtEditTabView::isPageBuilt(int index) const
{
	return index >= 0 && index < m_pageCount && m_contentMade[index];
}

Elm_Object_Item* CtEditTabView::getTabItem(int index) const
{
	return index >= 0 && index < m_pageCount ? m_tabItems[index] : nullptr;
}

void CtEditTabView::updateSaveBtn(bool disabled)
{
	if (disabled)
		WDEBUG("all fields are empty, can't save");
	if (m_doneButton)
		elm_object_disabled_set(m_doneButton, disabled ? EINA_TRUE : EINA_FALSE);
}

Evas_Object* CtEditTabView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "createBaseLayout() failed");
	setOnInitScroller([this](Evas_Object* scroller) {
		elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
		uxt_scroller_set_auto_scroll_enabled(scroller, EINA_FALSE);
		evas_object_smart_callback_add(scroller, "scroll,anim,start", __pageScrollAnimStartCb, this);
		evas_object_smart_callback_add(scroller, "scroll,anim,stop", __pageScrollStopCb, this);
		evas_object_smart_callback_add(scroller, "scroll", __pageScrolledCb, this);
		evas_object_smart_callback_add(scroller, "scroll,drag,start", __pageScrollStartCb, this);
	});
	Evas_Object* content = createPageSlideContent(layout);
	elm_object_part_content_set(layout, "elm.swallow.content", content);
	return layout;
}

void CtEditTabView::onDestroy()
{
	WENTER();
	app_assist::WUiTimer::destroy(m_restIdler);
	app_assist::WUiTimer::destroy(m_restTimer);
	if (Evas_Object* scroller = getScroller()) {
		evas_object_smart_callback_del_full(scroller, "scroll,anim,start", __pageScrollAnimStartCb, this);
		evas_object_smart_callback_del_full(scroller, "scroll,anim,stop", __pageScrollStopCb, this);
		evas_object_smart_callback_del_full(scroller, "scroll", __pageScrolledCb, this);
		evas_object_smart_callback_del_full(scroller, "scroll,drag,start", __pageScrollStartCb, this);
	}
}

void CtEditTabView::onPushToNaviframe(Evas_Object* naviframeObj)
{
	m_toolbar = uxt_toolbar_add(naviframeObj, "tabbar_with_title");
	WPRET_M(!m_toolbar, "uxt_toolbar_add() failed");
	elm_toolbar_shrink_mode_set(m_toolbar, m_pageCount < 5 ? ELM_TOOLBAR_SHRINK_EXPAND : ELM_TOOLBAR_SHRINK_SCROLL);
	elm_toolbar_transverse_expanded_set(m_toolbar, EINA_TRUE);

	Elm_Object_Item* item = elm_naviframe_item_push(naviframeObj, nullptr, nullptr, nullptr, getEvasObj(), "tabbar");
	elm_object_item_domain_translatable_part_text_set(item, "elm.text.title", kTextDomain, "IDS_PB_OPT_EDIT");
	elm_object_item_part_content_set(item, "tabbar", m_toolbar);
	for (int i = 0; i < m_pageCount; ++i)
		m_tabItems[i] = elm_toolbar_item_append(m_toolbar, nullptr, m_pages[i]->getName(), __tabSelectedCb, this);
	// Set last: it selects the first item at once, before any page exists.
	elm_toolbar_select_mode_set(m_toolbar, ELM_OBJECT_SELECT_MODE_ALWAYS);
}

void CtEditTabView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	for (int i = 0; i < m_pageCount; ++i)
		appendPage(m_pages[i]->getName());
	__createTitleButtons(naviItem);
	if (m_pageCount == 0)
		return;
	__buildPage(m_currentPage);
	if (m_tabItems[m_currentPage])
		elm_toolbar_item_selected_set(m_tabItems[m_currentPage], EINA_TRUE);
	showPage(m_currentPage, false);
	m_restTimer = app_assist::WUiTimer::addTimer(kRestPagesDelaySeconds, [this](void*) {
		m_restTimer.reset();
		m_restIdler = app_assist::WUiTimer::addIdler([this](void*) {
			m_restIdler.reset();
			__createRestViews();
			return false;
		}, nullptr, this);
		return false;
	}, nullptr, this);
}

void CtEditTabView::__createTitleButtons(Elm_Object_Item* naviItem)
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviItem || !naviframe, "naviItem or naviframe is nullptr");
	Evas_Object* parent = naviframe->getEvasObj();
	elm_object_item_part_content_set(naviItem, "elm.swallow.prev_btn", nullptr);
	m_doneButton = createTitleButton(parent, "naviframe/title_right", "IDS_TPLATFORM_ACBUTTON_DONE_ABB", __saveCb, this);
	elm_object_item_part_content_set(naviItem, "title_right_btn", m_doneButton);
	Evas_Object* cancel = createTitleButton(parent, "naviframe/title_left", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB", __cancelCb, this);
	elm_object_item_part_content_set(naviItem, "title_left_btn", cancel);
}

void CtEditTabView::__buildPage(int index)
{
	if (index < 0 || index >= m_pageCount || m_contentMade[index] || !m_pages[index])
		return;
	CtInputView* page = m_pages[index];
	m_contentMade[index] = true;
	m_pages[index] = nullptr;
	// A page that cannot be placed is destroyed by the page slide view.
	if (!setPageContent(index, page))
		return;
	__allowFocus(index, index == m_currentPage);
	page->createEditSubViewContent();
}

// A page out of sight takes no focus: the page scroller would follow the
// focus there, away from the chosen tab.
void CtEditTabView::__allowFocus(int index, bool allowed)
{
	CtInputView* page = isPageBuilt(index) ? getPage(index) : nullptr;
	if (page && page->getEvasObj())
		elm_object_tree_focus_allow_set(page->getEvasObj(), allowed ? EINA_TRUE : EINA_FALSE);
}

void CtEditTabView::__createRestViews()
{
	for (int i = 0; i < m_pageCount; ++i)
		__buildPage(i);
}

void CtEditTabView::__tabChanged(Elm_Object_Item* toolbarItem)
{
	WPRET_M(getPageCount() == 0, "page item not added");
	if (toolbarItem == m_tabItems[m_currentPage]) {
		showPage(m_currentPage, false);
		return;
	}
	auto found = std::find(m_tabItems, m_tabItems + m_pageCount, toolbarItem);
	WPRET_M(found == m_tabItems + m_pageCount, "unknown tab");
	if (CtInputView* current = isPageBuilt(m_currentPage) ? getPage(m_currentPage) : nullptr)
		current->onTabUnselect(getNaviItem());
	int index = static_cast<int>(found - m_tabItems);
	__allowFocus(m_currentPage, false);
	m_currentPage = index;
	__buildPage(index);
	__allowFocus(index, true);
	if (CtInputView* page = isPageBuilt(index) ? getPage(index) : nullptr)
		page->onTabSelect(getNaviItem());
	showPage(index, true);
}

// Only a page the user dragged to chooses its tab: a scroll that a chosen
// tab started may stop on its way, over another page.
void CtEditTabView::__onPageScrollStopped()
{
	m_animating = false;
	int shown = getCurrentPage();
	if (!m_dragged) {
		__keepCurrentPage();
		return;
	}
	m_dragged = false;
	if (shown >= 0 && shown < m_pageCount && shown != m_currentPage && m_tabItems[shown])
		elm_toolbar_item_selected_set(m_tabItems[shown], EINA_TRUE);
}

// An entry or row of a page asks its scrollers to show it (a cursor moved,
// a row was realized); the page scroller must not follow it to another page.
void CtEditTabView::__keepCurrentPage()
{
	if (!m_animating && !m_dragged && getCurrentPage() != m_currentPage)
		showPage(m_currentPage, false);
}

// The pages beside the shown one come into view while dragging.
void CtEditTabView::__onPageScrollStarted()
{
	m_dragged = true;
	__buildPage(m_currentPage - 1);
	__buildPage(m_currentPage + 1);
}

void CtEditTabView::__save()
{
	WENTER();
	if (m_closing)
		return;
	m_closing = true;
	for (int i = 0; i < m_pageCount; ++i) {
		CtInputView* page = getPage(i);
		if (page && m_contentMade[i] && !page->checkEmergencyForEditTabSubView()) {
			m_closing = false;
			return;
		}
	}
	for (int i = 0; i < m_pageCount; ++i) {
		CtInputView* page = m_contentMade[i] ? getPage(i) : nullptr;
		bool changed = false;
		if (page)
			page->getChangedForEditTabSubView(&changed);
		if (changed)
			page->saveContactForEditTabSubView();
	}
	__closePopups();
	if (Elm_Object_Item* naviItem = getNaviItem())
		elm_object_item_del(naviItem);
}

void CtEditTabView::__cancel()
{
	WENTER();
	if (m_closing)
		return;
	m_closing = true;
	popOut();
}

bool CtEditTabView::__hasChanges()
{
	bool anyChanged = false;
	for (int i = 0; i < m_pageCount; ++i) {
		CtInputView* page = m_contentMade[i] ? getPage(i) : nullptr;
		if (!page)
			continue;
		page->onTabPop();
		bool changed = false;
		page->getChangedForEditTabSubView(&changed);
		anyChanged = anyChanged || changed;
	}
	return anyChanged;
}

// A refused pop leaves the view working: Done and Cancel must answer again.
bool CtEditTabView::onPop()
{
	WENTER();
	if (m_discarded || !__hasChanges())
		return true;
	m_closing = false;
	__showDiscardPopup();
	return false;
}

void CtEditTabView::__showDiscardPopup()
{
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable(kTextDomain);
	popup->setTitle("IDS_PB_HEADER_DISCARD_CHANGES_ABB");
	popup->setContent("IDS_PB_POP_ALL_CHANGES_WILL_BE_DISCARDED");
	popup->addButton("IDS_PB_BUTTON_CANCEL", nullptr);
	popup->addButton("IDS_PB_BUTTON_DISCARD_ABB", [this](bool*) {
		m_discarded = true;
		popOut();
	});
	attachPopup(popup);
}

void CtEditTabView::__closePopups()
{
	destroyPopup();
	for (int i = 0; i < m_pageCount; ++i) {
		if (CtInputView* page = m_contentMade[i] ? getPage(i) : nullptr)
			page->destroyPopup();
	}
}

void CtEditTabView::onLanguageChanged()
{
	int i = 0;
	Eina_List* l = nullptr;
	void* record = nullptr;
	EINA_LIST_FOREACH(m_records, l, record) {
		if (i >= m_pageCount)
			break;
		std::string title = __getTabViewTitle(static_cast<contacts_record_h>(record));
		if (CtInputView* page = getPage(i))
			page->setName(title.c_str());
		if (m_tabItems[i])
			elm_object_item_text_set(m_tabItems[i], title.c_str());
		++i;
	}
}

std::string CtEditTabView::__getTabViewTitle(contacts_record_h record)
{
	int addressbookId = 0;
	contacts_record_get_int(record, _contacts_contact.address_book_id, &addressbookId);
	char* provider = nullptr;
	char* user = nullptr;
	ctCommonGetProviderNameByAddressbookId(addressbookId, &provider, &user);
	std::string title = provider ? provider : "";
	free(provider);
	free(user);
	return title;
}

void CtEditTabView::__tabSelectedCb(void* data, Evas_Object*, void* eventInfo)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtEditTabView*>(data)->__tabChanged(static_cast<Elm_Object_Item*>(eventInfo));
}

void CtEditTabView::__pageScrollStopCb(void* data, Evas_Object*, void*)
{
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtEditTabView*>(data)->__onPageScrollStopped();
}

void CtEditTabView::__pageScrollAnimStartCb(void* data, Evas_Object*, void*)
{
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtEditTabView*>(data)->m_animating = true;
}

void CtEditTabView::__pageScrolledCb(void* data, Evas_Object*, void*)
{
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtEditTabView*>(data)->__keepCurrentPage();
}

void CtEditTabView::__pageScrollStartCb(void* data, Evas_Object*, void*)
{
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtEditTabView*>(data)->__onPageScrollStarted();
}

void CtEditTabView::__saveCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtEditTabView*>(data)->__save();
}

void CtEditTabView::__cancelCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "Invalid param : data");
	static_cast<CtEditTabView*>(data)->__cancel();
}
