#include "CtDetailViewGenlistItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtSimMgr.h"
#include "ui_extension.h"


#include <algorithm>
#include <cstdint>
#include <cstring>
#include <functional>

namespace {

const char* const kHighlightOpen = "<backing=on backing_color=#BFF6FF linesize=20>";
const char* const kHighlightClose = "</backing>";
const char* const kIconEdj = "contacts/image_layout.edj";
const char* const kDefaultIconColor = "A03O004";
const int kCopyAreaMaxW = 656;
const int kCopyAreaMaxH = 54;
// Tags on a content object: the row that made it, for which part, and when.
const char* const kContentRowKey = "ct.content.row";
const char* const kContentPartKey = "ct.content.part";
const char* const kContentGenerationKey = "ct.content.generation";
// On a copy area: the text part it covers; on a list: its rows' copy areas are sized.
const char* const kCopyTextPartKey = "ct.copy.part";
const char* const kCopyAreaSizingKey = "ct.copy.sizing";

uintptr_t partTag(const char* part)
{
	return std::hash<std::string>()(part ? part : "") | 1;
}

// The swallow part of the icon layout that a touch part covers.
const char* iconPartOf(const char* touchPart)
{
	if (strcmp(touchPart, "touch.call") == 0)
		return "elm.icon1";
	if (strcmp(touchPart, "touch.message") == 0)
		return "elm.icon3";
	return "elm.icon";
}

void recolorIcon(Evas_Object* layout, const char* touchPart, const std::string& code)
{
	Evas_Object* button = elm_object_part_content_get(layout, iconPartOf(touchPart));
	Evas_Object* image = button ? elm_object_content_get(button) : nullptr;
	if (image)
		ctCommonSetImageColor(image, code.c_str());
}

unsigned nextContentGeneration()
{
	static unsigned generation = 0;
	return ++generation;
}

} // namespace

CtDetailViewGenlistItem::CtDetailViewGenlistItem(CtDetailDataBase* data)
	: m_data(data), m_contentGeneration(nextContentGeneration())
{
}

void CtDetailViewGenlistItem::invalidateContent()
{
	m_contentGeneration = nextContentGeneration();
}

CtDetailViewGenlistItem::~CtDetailViewGenlistItem() = default;

std::string CtDetailViewGenlistItem::getCopyText()
{
	return std::string();
}

int CtDetailViewGenlistItem::getItemType()
{
	return DETAIL_ITEM_NONE;
}

std::string CtDetailViewGenlistItem::getIconColorCode()
{
	CtSimMgr* sim = CtSimMgr::getInstance();
	const char* code = sim ? sim->getSimColor(sim->getAvailableSimForIcon()) : nullptr;
	return code && *code ? code : kDefaultIconColor;
}

const std::string& CtDetailViewGenlistItem::iconColorCode()
{
	// Settings reads cost a database query; the SIM state is read again
	// when the contents are invalidated.
	if (m_iconColorGeneration != m_contentGeneration) {
		m_iconColor = getIconColorCode();
		m_iconColorGeneration = m_contentGeneration;
	}
	return m_iconColor;
}

Elm_Genlist_Item_Class* CtDetailViewGenlistItem::getItemClassNew()
{
	Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
	WPRET_VM(!itc, nullptr, "elm_genlist_item_class_new() is fail");
	itc->item_style = getItemStyle();
	itc->func.text_get = __textGetCb;
	itc->func.content_get = __contentGetCb;
	// The list realizes a row once to measure it and again to show it: the
	// second time takes the contents of the first.
	itc->func.reusable_content_get = __reusableContentGetCb;
	return itc;
}

std::string CtDetailViewGenlistItem::getText(const char*)
{
	return std::string();
}

Evas_Object* CtDetailViewGenlistItem::getContent(Evas_Object*, const char*)
{
	return nullptr;
}

void CtDetailViewGenlistItem::onIconClicked(const char*)
{
}

std::string CtDetailViewGenlistItem::highlightMain(const std::string& markup) const
{
	if (!highlighted || markup.empty())
		return markup;
	return kHighlightOpen + markup + kHighlightClose;
}

std::string CtDetailViewGenlistItem::toMarkup(const char* text)
{
	return ctCommonUtf8ToMarkup(text);
}

std::string CtDetailViewGenlistItem::translate(const char* textId)
{
	return ContactsCommon::translate(textId);
}

std::string CtDetailViewGenlistItem::typeLabel(const char* label)
{
	if (!label || !*label)
		return std::string();
	// A type label is drawn on one line, and the toolkit's one-line ellipsis
	// breaks on a line break; custom labels are stored as the user typed them.
	std::string line = ContactsCommon::translate(label);
	std::replace_if(line.begin(), line.end(), [](char c) { return c == '\n' || c == '\r' || c == '\t'; }, ' ');
	return toMarkup(line.c_str());
}

Evas_Object* CtDetailViewGenlistItem::createCopyArea(Evas_Object* genlist, const char* textPart)
{
	Evas_Object* area = evas_object_rectangle_add(evas_object_evas_get(genlist));
	evas_object_color_set(area, 0, 0, 0, 0);
	evas_object_pass_events_set(area, EINA_TRUE);
	evas_object_data_set(area, kCopyTextPartKey, textPart);
	evas_object_show(area);
	if (!evas_object_data_get(genlist, kCopyAreaSizingKey)) {
		evas_object_smart_callback_add(genlist, "realized", __rowRealizedCb, nullptr);
		evas_object_data_set(genlist, kCopyAreaSizingKey, genlist);
	}
	return area;
}

// The row's own text part is there once the row is realized: the area takes
// its size from what that part draws (the theme's font, text classes, scale).
void CtDetailViewGenlistItem::__rowRealizedCb(void*, Evas_Object*, void* eventInfo)
{
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	Evas_Object* area = item ? elm_object_item_part_content_get(item, "copy.text.area") : nullptr;
	auto* part = area ? static_cast<const char*>(evas_object_data_get(area, kCopyTextPartKey)) : nullptr;
	Evas_Object* row = area ? evas_object_smart_parent_get(area) : nullptr;
	if (!part || !row)
		return;
	edje_object_calc_force(row);
	auto* text = const_cast<Evas_Object*>(edje_object_part_object_get(row, part));
	Evas_Coord w = 0, h = 0;
	if (text)
		evas_object_textblock_size_native_get(text, &w, &h);
	double scale = ctCommonGetScale();
	w = std::min<Evas_Coord>(w, (Evas_Coord)(kCopyAreaMaxW * scale));
	h = std::min<Evas_Coord>(h, (Evas_Coord)(kCopyAreaMaxH * scale));
	evas_object_size_hint_min_set(area, w, h);
}

Evas_Object* CtDetailViewGenlistItem::createIconLayout(Evas_Object* parent, const char* group)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", group);
	if (!layout)
		WERROR("ctCommonCreateLayout() is fail");
	return layout;
}

void CtDetailViewGenlistItem::addIconButton(Evas_Object* layout, const char* part, const char* image,
		const char* touchPart, bool disabled)
{
	WPRET_M(!layout, "Invalid param : layout");
	Evas_Object* button = uxt_button_add(layout, "btn_with_swallow");
	WPRET_M(!button, "uxt_button_add() is fail");
	std::string code = iconColorCode() + (disabled ? "D" : "");
	Evas_Object* icon = ctCommonCreateImage(button, kIconEdj, image, code.c_str());
	elm_object_content_set(button, icon);
	evas_object_propagate_events_set(button, EINA_FALSE);
	elm_object_part_content_set(layout, part, button);
	if (disabled)
		return;
	elm_layout_signal_callback_add(layout, "mouse,clicked,*", touchPart, __iconClickedCb, this);
	elm_layout_signal_callback_add(layout, "mouse,down,*", touchPart, __iconPressedCb, this);
	elm_layout_signal_callback_add(layout, "mouse,up,*", touchPart, __iconReleasedCb, this);
}

void CtDetailViewGenlistItem::insertUsageLog(const char* feature, const char* extra)
{
	ctCommonInsertUsageLog(feature, extra);
}

char* CtDetailViewGenlistItem::__textGetCb(void* data, Evas_Object*, const char* part)
{
	auto* row = static_cast<CtDetailViewGenlistItem*>(data);
	std::string text = row ? row->getText(part) : std::string();
	return text.empty() ? nullptr : strdup(text.c_str());
}

Evas_Object* CtDetailViewGenlistItem::__contentGetCb(void* data, Evas_Object* obj, const char* part)
{
	auto* row = static_cast<CtDetailViewGenlistItem*>(data);
	Evas_Object* content = row ? row->getContent(obj, part) : nullptr;
	if (content) {
		evas_object_data_set(content, kContentRowKey, row);
		evas_object_data_set(content, kContentPartKey, reinterpret_cast<void*>(partTag(part)));
		evas_object_data_set(content, kContentGenerationKey, reinterpret_cast<void*>(uintptr_t(row->m_contentGeneration)));
	}
	return content;
}

Evas_Object* CtDetailViewGenlistItem::__reusableContentGetCb(void* data, Evas_Object*, const char* part, Evas_Object* old)
{
	auto* row = static_cast<CtDetailViewGenlistItem*>(data);
	if (!row || !old || evas_object_data_get(old, kContentRowKey) != row)
		return nullptr;
	bool samePart = reinterpret_cast<uintptr_t>(evas_object_data_get(old, kContentPartKey)) == partTag(part);
	bool current = reinterpret_cast<uintptr_t>(evas_object_data_get(old, kContentGenerationKey)) == row->m_contentGeneration;
	return samePart && current ? old : nullptr;
}

void CtDetailViewGenlistItem::__iconClickedCb(void* data, Evas_Object*, const char*, const char* source)
{
	WHIT();
	static_cast<CtDetailViewGenlistItem*>(data)->onIconClicked(source);
}

void CtDetailViewGenlistItem::__iconPressedCb(void* data, Evas_Object* obj, const char*, const char* source)
{
	recolorIcon(obj, source, static_cast<CtDetailViewGenlistItem*>(data)->iconColorCode() + "P");
}

void CtDetailViewGenlistItem::__iconReleasedCb(void* data, Evas_Object* obj, const char*, const char* source)
{
	recolorIcon(obj, source, static_cast<CtDetailViewGenlistItem*>(data)->iconColorCode());
}
