#include "CtDetailImageView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtDetailDataBase.h"
#include "CtThemeMgr.h"

#include <ui_extension.h>
#include <vconf.h>

#include <cstdint>
#include <cstdlib>

namespace {

const char* const kDetailEdj = "contacts/detail_layout.edj";
const char* const kImageEdj = "contacts/image_layout.edj";
constexpr const char* kEdjFiles[] = {"contacts/contacts.edj", "contacts/detail_layout.edj"};
const char* const kDefaultImageKey = "db/deco-contact-image-editor/contact_default_image_path";
const char* const kMultiImageGroup = "layout/detail_image/multi_image";
const char* const kPageGroup = "layout/detail_image/multi_image/page";

std::string takeString(char* text)
{
	std::string out = text ? text : "";
	free(text);
	return out;
}

void* pageKey(int page)
{
	return reinterpret_cast<void*>(static_cast<intptr_t>(page + 1));
}

// The setting's picture when it is set and loads, else the theme's.
Evas_Object* createDefaultPicture(Evas_Object* parent)
{
	std::string custom = takeString(vconf_get_str(kDefaultImageKey));
	Evas_Object* image = custom.empty() ? nullptr : ctCommonCreateImage(parent, custom.c_str(), nullptr);
	return image ? image : ctCommonCreateImage(parent, kImageEdj, "contacts_caller_id_default_full.png");
}

// A style the theme lacks costs a failed theme search on every use: it is
// looked for once.
bool hasScrollerEffectStyle()
{
	static const bool found = elm_theme_group_path_find(nullptr, "elm/scroller/base/effect") != nullptr;
	return found;
}

// Reads the file's header only: the pixels are decoded when a page is drawn.
bool isLoadablePicture(Evas_Object* parent, const std::string& path)
{
	Evas_Object* probe = evas_object_image_add(evas_object_evas_get(parent));
	evas_object_image_file_set(probe, path.c_str(), nullptr);
	bool loadable = evas_object_image_load_error_get(probe) == EVAS_LOAD_ERROR_NONE;
	evas_object_del(probe);
	if (!loadable)
		WERROR("not a picture : %s", path.c_str());
	return loadable;
}

} // namespace

CtDetailImageView::CtDetailImageView(CtDetailDataBase* data, bool isMyProfile, int page)
	: m_isMyProfile(isMyProfile), m_page(page)
{
	WENTER();
	WPRET_M(!data, "Invalid param : data");
	for (int order = 1; order <= kMaxPictures; ++order) {
		// Both data kinds hand out copies; the flag only says which screen opened us.
		std::string path = takeString(data->getImagePath(order));
		if (!path.empty())
			m_pictures.emplace_back(order, path);
	}
}

CtDetailImageView::~CtDetailImageView()
{
	WENTER();
}

Evas_Object* CtDetailImageView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	Evas_Object* base = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!base, nullptr, "createBaseLayout() failed");
	for (const char* edj : kEdjFiles) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
	CtThemeMgr::getInstance()->setObjectTheme(base);

	// A picture whose file is gone or is no picture does not count.
	std::vector<std::pair<int, std::string>> loadable;
	for (const auto& picture : m_pictures)
		if (isLoadablePicture(base, picture.second))
			loadable.push_back(picture);
	m_pictures = loadable;
	m_content = m_pictures.size() < 2 ? __createSingle(base, m_pictures.empty() ? "" : m_pictures.front().second)
									  : __createPager(base);
	elm_object_part_content_set(base, "elm.swallow.content", m_content);
	return base;
}

Evas_Object* CtDetailImageView::__createSingle(Evas_Object* parent, const std::string& path)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, kDetailEdj, kMultiImageGroup);
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* image = path.empty() ? createDefaultPicture(layout) : __createPicture(layout, path);
	if (image)
		elm_object_part_content_set(layout, "scroller", image);
	return layout;
}

Evas_Object* CtDetailImageView::__createPicture(Evas_Object* parent, const std::string& path)
{
	Evas_Object* image = ctCommonCreateImage(parent, path.c_str(), nullptr);
	if (!image)
		WERROR("ctCommonCreateImage() is fail");
	return image;
}

Evas_Object* CtDetailImageView::__createPager(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, kDetailEdj, kMultiImageGroup);
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	// Pages start at the screen's size, so the first frame already shows
	// them laid out; the pager's own size corrects them when it differs.
	evas_object_geometry_get(elm_object_parent_widget_get(parent), nullptr, nullptr, &m_pageWidth, &m_pageHeight);
	m_scroller = elm_scroller_add(layout);
	if (hasScrollerEffectStyle())
		elm_object_style_set(m_scroller, "effect");
	elm_scroller_loop_set(m_scroller, EINA_FALSE, EINA_FALSE);
	elm_scroller_policy_set(m_scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
	elm_scroller_page_relative_set(m_scroller, 1.0, 1.0);
	elm_scroller_page_scroll_limit_set(m_scroller, 1, 0);
	elm_scroller_movement_block_set(m_scroller, ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
	m_box = elm_box_add(m_scroller);
	elm_box_horizontal_set(m_box, EINA_TRUE);
	elm_object_content_set(m_scroller, m_box);

	m_index = elm_index_add(layout);
	elm_object_style_set(m_index, "pagecontrol");
	elm_index_horizontal_set(m_index, EINA_TRUE);
	elm_index_autohide_disabled_set(m_index, EINA_TRUE);
	int page = 0;
	for (const auto& [order, path] : m_pictures) {
		Evas_Object* pageObj = __createPage(m_box);
		if (!pageObj)
			continue;
		elm_box_pack_end(m_box, pageObj);
		m_pages.emplace_back(pageObj, path);
		elm_index_item_append(m_index, std::to_string(order).c_str(), nullptr, pageKey(page++));
	}
	elm_index_level_go(m_index, 0);
	evas_object_event_callback_add(m_scroller, EVAS_CALLBACK_RESIZE, __scrollerResizeCb, this);
	evas_object_smart_callback_add(m_scroller, "scroll", __scrollCb, this);
	elm_object_part_content_set(layout, "scroller", m_scroller);
	elm_object_part_content_set(layout, "controller", m_index);
	if (m_page < 0 || m_page >= page)
		m_page = 0;
	// The first page shown gets its picture now, the others once it is drawn.
	__fillPage(m_page);
	m_pageFiller = app_assist::WUiTimer::addIdler([this](void*) { return __fillNextPage(); }, nullptr, this);
	return layout;
}

Evas_Object* CtDetailImageView::__createPage(Evas_Object* box)
{
	Evas_Object* page = ctCommonCreateLayout(box, kDetailEdj, kPageGroup);
	if (!page) {
		WERROR("ctCommonCreateLayout() is fail");
		return nullptr;
	}
	Evas_Object* sizer = evas_object_rectangle_add(evas_object_evas_get(box));
	evas_object_color_set(sizer, 0, 0, 0, 0);
	evas_object_size_hint_min_set(sizer, m_pageWidth, m_pageHeight);
	elm_object_part_content_set(page, "sizer", sizer);
	return page;
}

void CtDetailImageView::__fillPage(int page)
{
	if (page < 0 || page >= static_cast<int>(m_pages.size()) || m_pages[page].second.empty())
		return;
	Evas_Object* pageObj = m_pages[page].first;
	if (Evas_Object* image = __createPicture(pageObj, m_pages[page].second))
		elm_object_part_content_set(pageObj, "elm.swallow.content", image);
	m_pages[page].second.clear();
}

bool CtDetailImageView::__fillNextPage()
{
	for (size_t page = 0; page < m_pages.size(); ++page) {
		if (!m_pages[page].second.empty()) {
			__fillPage(static_cast<int>(page));
			return true;
		}
	}
	return false;
}

void CtDetailImageView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_naviframe_item_title_enabled_set(naviItem, EINA_FALSE, EINA_FALSE);
	__showPage(m_page);
	__showBackButton();
	__setIndicatorStyle("elm.swallow.indicator_bg", "indicator/image/viewer");
}

// Pages take the pager's size; the first page to show is shown once they have one.
void CtDetailImageView::__scrollerResizeCb(void* data, Evas*, Evas_Object* scroller, void*)
{
	auto* view = static_cast<CtDetailImageView*>(data);
	Evas_Coord w = 0, h = 0;
	evas_object_geometry_get(scroller, nullptr, nullptr, &w, &h);
	Eina_List* pages = elm_box_children_get(view->m_box);
	void* page = nullptr;
	EINA_LIST_FREE(pages, page) {
		Evas_Object* sizer = elm_object_part_content_get(static_cast<Evas_Object*>(page), "sizer");
		evas_object_size_hint_min_set(sizer, w, h);
	}
	if (w > 0 && h > 0) {
		elm_box_recalculate(view->m_box);
		view->__showPage(view->m_page);
	}
}

void CtDetailImageView::__showPage(int page)
{
	if (!m_scroller)
		return;
	elm_scroller_page_show(m_scroller, page, 0);
	__selectIndexOfPage(page);
}

void CtDetailImageView::__selectIndexOfPage(int page)
{
	if (Elm_Object_Item* item = elm_index_item_find(m_index, pageKey(page)))
		elm_index_item_selected_set(item, EINA_TRUE);
}

void CtDetailImageView::__scrollCb(void* data, Evas_Object* scroller, void*)
{
	auto* view = static_cast<CtDetailImageView*>(data);
	int page = 0;
	elm_scroller_current_page_get(scroller, &page, nullptr);
	view->m_page = page;
	view->__fillPage(page);
	view->__selectIndexOfPage(page);
}

void CtDetailImageView::__showBackButton()
{
	Evas_Object* layout = m_content;
	WPRET_M(!layout, "no content");
	Evas_Object* button = uxt_button_add(layout, "naviframe/back_btn/default");
	WPRET_M(!button, "uxt_button_add() failed");
	Evas_Object* arrow = elm_icon_add(button);
	if (elm_icon_standard_set(arrow, "go-previous"))
		elm_object_content_set(button, arrow);
	else
		evas_object_del(arrow);
	uxt_theme_object_replace_color(button, "B043A", "A08O001A");
	uxt_theme_object_replace_color(button, "B043", "A08O001");
	evas_object_smart_callback_add(button, "clicked", __backClickedCb, this);
	elm_object_part_content_set(layout, "elm.back.btn", button);
}

void CtDetailImageView::__backClickedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtDetailImageView*>(data)->popOut();
}

// The indicator switch of the picture viewer. The host's window has no
// indicator area, so this stays a no-op until it gets one.
void CtDetailImageView::__setIndicatorStyle(const char* part, const char* style)
{
	WDEBUG("indicator %s -> %s (no indicator area)", part, style);
}

bool CtDetailImageView::onPop()
{
	WENTER();
	__setIndicatorStyle("elm.swallow.indicator_bg", "indicator/headerbg");
	return true;
}

void CtDetailImageView::onLanguageChanged()
{
	WENTER();
}

void CtDetailImageView::onDestroy()
{
	WENTER();
	if (!m_scroller)
		return;
	evas_object_event_callback_del_full(m_scroller, EVAS_CALLBACK_RESIZE, __scrollerResizeCb, this);
	evas_object_smart_callback_del_full(m_scroller, "scroll", __scrollCb, this);
}
