#include "CtDetailViewMultiImageItem.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtDetailViewItemOwner.h"

#include <vconf.h>

#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <memory>

namespace {

const char* const kDetailEdj = "contacts/detail_layout.edj";
const char* const kImageEdj = "contacts/image_layout.edj";
const char* const kDefaultImageKey = "db/deco-contact-image-editor/contact_default_image_path";
const char* const kIndexKey = "ct_index";

using CString = std::unique_ptr<char, decltype(&free)>;

std::string takeString(char* text)
{
	CString owned(text, free);
	return owned ? std::string(owned.get()) : std::string();
}

// Keeps every page as large as the pager.
void pagerResizeCb(void* data, Evas*, Evas_Object* scroller, void*)
{
	Evas_Coord w = 0, h = 0;
	evas_object_geometry_get(scroller, nullptr, nullptr, &w, &h);
	Eina_List* pages = elm_box_children_get(static_cast<Evas_Object*>(data));
	void* page = nullptr;
	EINA_LIST_FREE(pages, page)
		evas_object_size_hint_min_set(static_cast<Evas_Object*>(page), w, h);
}

Evas_Object* createPicture(Evas_Object* parent, const char* path, bool lowSize)
{
	if (lowSize)
		return ctCommonCreateMaskImageForLowSizeImage(parent, path);
	Evas_Object* image = ctCommonCreateImage(parent, path, nullptr);
	if (image)
		elm_image_fill_outside_set(image, EINA_TRUE);
	return image;
}

} // namespace

CtDetailViewMultiImageItem::CtDetailViewMultiImageItem(CtDetailViewItemOwner* owner, CtDetailDataBase* data,
		bool isLowSize)
	: CtDetailViewGenlistItem(data), m_owner(owner), m_isLowSize(isLowSize)
{
}

CtDetailViewMultiImageItem::~CtDetailViewMultiImageItem()
{
	__forgetPager();
}

const char* CtDetailViewMultiImageItem::getItemStyle()
{
	return m_isLowSize ? "detail.multi.image/low" : "detail.multi.image";
}

int CtDetailViewMultiImageItem::getCurrentPage() const
{
	int page = 0;
	if (m_scroller)
		elm_scroller_current_page_get(m_scroller, &page, nullptr);
	return page < 0 ? 0 : page;
}

std::string CtDetailViewMultiImageItem::getCopyText()
{
	return takeString(getData()->getImagePath(getCurrentPage() + 1));
}

void CtDetailViewMultiImageItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	WPRET_M(!m_owner, "owner is nullptr");
	m_owner->onImageSelected(getCurrentPage());
}

Evas_Object* CtDetailViewMultiImageItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon") != 0)
		return nullptr;
	std::string first = takeString(getData()->getImagePath(1));
	if (first.empty())
		return __createDefaultPicture(genlist);
	std::string second = takeString(getData()->getImagePath(2));
	if (second.empty()) {
		const char* group = m_isLowSize ? "layout/detail/contact_image/low_resolution" : "layout/detail/contact_image";
		return __createSinglePicture(genlist, first.c_str(), group);
	}
	return __createPager(genlist);
}

Evas_Object* CtDetailViewMultiImageItem::__createDefaultPicture(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, kDetailEdj, "layout/detail/contact_image");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	std::string custom = takeString(vconf_get_str(kDefaultImageKey));
	Evas_Object* image = custom.empty()
		? ctCommonCreateImage(layout, kImageEdj, "contacts_caller_id_default_full.png")
		: ctCommonCreateImage(layout, custom.c_str(), nullptr);
	if (image) {
		elm_image_fill_outside_set(image, EINA_TRUE);
		elm_object_part_content_set(layout, "elm.swallow.content", image);
	}
	return layout;
}

Evas_Object* CtDetailViewMultiImageItem::__createSinglePicture(Evas_Object* parent, const char* path,
		const char* group)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, kDetailEdj, group);
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* image = createPicture(layout, path, m_isLowSize);
	if (image)
		elm_object_part_content_set(layout, "elm.swallow.content", image);
	return layout;
}

Evas_Object* CtDetailViewMultiImageItem::__createPager(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, kDetailEdj, "layout/multi_image");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	__forgetPager();
	Evas_Object* scroller = elm_scroller_add(layout);
	elm_object_style_set(scroller, "effect");
	elm_scroller_loop_set(scroller, EINA_FALSE, EINA_FALSE);
	elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
	elm_scroller_page_scroll_limit_set(scroller, 1, 0);
	elm_scroller_page_relative_set(scroller, 1.0, 1.0);
	elm_scroller_movement_block_set(scroller, ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
	Evas_Object* box = elm_box_add(scroller);
	elm_box_horizontal_set(box, EINA_TRUE);
	elm_object_content_set(scroller, box);

	Evas_Object* index = elm_index_add(layout);
	elm_object_style_set(index, "pagecontrol");
	elm_index_horizontal_set(index, EINA_TRUE);
	elm_index_autohide_disabled_set(index, EINA_TRUE);
	intptr_t pageCount = 0;
	for (int order = 1; order <= kMaxPictures; ++order) {
		std::string path = takeString(getData()->getImagePath(order));
		if (path.empty())
			continue;
		Evas_Object* page = ctCommonCreateLayout(box, kDetailEdj, "layout/multi_image/page");
		if (!page)
			continue;
		elm_object_part_content_set(page, "elm.swallow.content", createPicture(page, path.c_str(), false));
		elm_box_pack_end(box, page);
		// Item data is the page number + 1, so a page finds its item.
		elm_index_item_append(index, std::to_string(order).c_str(), nullptr, (void*)++pageCount);
	}
	elm_index_level_go(index, 0);
	if (Elm_Object_Item* first = elm_index_item_find(index, (void*)1))
		elm_index_item_selected_set(first, EINA_TRUE);
	evas_object_data_set(scroller, kIndexKey, index);
	evas_object_event_callback_add(scroller, EVAS_CALLBACK_RESIZE, pagerResizeCb, box);
	evas_object_event_callback_add(scroller, EVAS_CALLBACK_DEL, __pagerDelCb, this);
	evas_object_smart_callback_add(scroller, "scroll,page,changed", __pageChangedCb, index);
	elm_object_part_content_set(layout, "scroller", scroller);
	elm_object_part_content_set(layout, "controller", index);
	m_scroller = scroller;
	return layout;
}

void CtDetailViewMultiImageItem::__forgetPager()
{
	if (m_scroller)
		evas_object_event_callback_del_full(m_scroller, EVAS_CALLBACK_DEL, __pagerDelCb, this);
	m_scroller = nullptr;
}

void CtDetailViewMultiImageItem::__pagerDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* row = static_cast<CtDetailViewMultiImageItem*>(data);
	if (row->m_scroller == obj)
		row->m_scroller = nullptr;
}

void CtDetailViewMultiImageItem::__pageChangedCb(void* data, Evas_Object* obj, void*)
{
	int page = 0;
	elm_scroller_current_page_get(obj, &page, nullptr);
	auto* index = static_cast<Evas_Object*>(data);
	if (Elm_Object_Item* item = elm_index_item_find(index, (void*)(intptr_t)(page + 1)))
		elm_index_item_selected_set(item, EINA_TRUE);
}
