#include "CtDetailMarkAsDefaultItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

#include <cstdlib>
#include <cstring>

namespace {

const char* const kProfileSharingId = "IDS_PB_MBODY_PROFILE_SHARING";
const char* const kUnknownId = "IDS_LOGS_MBODY_UNKNOWN";
constexpr int kThumbnailSize = 48;

// The translated text as markup; "Unknown" for an empty one.
std::string shownText(const std::string& text)
{
	const char* translated = ContactsCommon::translate(text.empty() ? kUnknownId : text.c_str());
	char* markup = elm_entry_utf8_to_markup(translated);
	std::string out = markup ? markup : "";
	free(markup);
	return out;
}

} // namespace

CtDetailMarkAsDefaultItem::CtDetailMarkAsDefaultItem(const Entry& entry, Evas_Object* groupRadio,
		std::function<void(CtDetailMarkAsDefaultItem*)> onSelected)
	: m_entry(entry), m_groupRadio(groupRadio), m_onSelected(std::move(onSelected))
{
}

const char* CtDetailMarkAsDefaultItem::getItemStyle() const
{
	if (m_entry.kind == Kind::GroupIndex)
		return "group_index";
	if (m_entry.kind == Kind::Picture && m_entry.text2 == kProfileSharingId)
		return "1line";
	return "2line.top";
}

Elm_Genlist_Item_Class* CtDetailMarkAsDefaultItem::getItemClassNew()
{
	Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
	WPRET_VM(!itc, nullptr, "elm_genlist_item_class_new() is fail");
	itc->item_style = getItemStyle();
	itc->func.text_get = __textGetCb;
	itc->func.content_get = __contentGetCb;
	return itc;
}

std::string CtDetailMarkAsDefaultItem::getText(const char* part) const
{
	if (!part)
		return "";
	bool oneLine = strcmp(getItemStyle(), "2line.top") != 0;
	if (oneLine)
		return strcmp(part, "elm.text") ? "" : shownText(m_entry.text1);
	if (!strcmp(part, "elm.text.main.left.top"))
		return shownText(m_entry.text1);
	if (!strcmp(part, "elm.text.sub.left.bottom"))
		return shownText(m_entry.text2);
	return "";
}

Evas_Object* CtDetailMarkAsDefaultItem::__getContent(Evas_Object* genlist, const char* part)
{
	if (m_entry.kind == Kind::GroupIndex || !part)
		return nullptr;
	if (!strcmp(part, "elm.swallow.icon") && m_entry.kind == Kind::Picture)
		return __createThumbnail(genlist);
	if (!strcmp(part, "elm.swallow.end"))
		return __createRadio(genlist);
	return nullptr;
}

Evas_Object* CtDetailMarkAsDefaultItem::__createThumbnail(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "list/A/contact/thumbnail");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* image = m_entry.path.empty()
		? nullptr : ctCommonCreateMaskImageForCallerId(layout, m_entry.path.c_str(), kThumbnailSize);
	if (!image)
		image = ctCommonCreateImage(layout, "contacts/image_layout.edj", "contacts_caller_id_default_02.png");
	if (image)
		elm_object_part_content_set(layout, "elm.swallow.content", image);
	return layout;
}

Evas_Object* CtDetailMarkAsDefaultItem::__createRadio(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "list/C/type.2");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* radio = elm_radio_add(layout);
	elm_object_style_set(radio, "default");
	elm_radio_state_value_set(radio, m_entry.index);
	if (m_groupRadio) {
		elm_radio_group_add(radio, m_groupRadio);
		elm_radio_value_set(radio, elm_radio_value_get(m_groupRadio));
	}
	evas_object_propagate_events_set(radio, EINA_FALSE);
	evas_object_smart_callback_add(radio, "changed", __radioChangedCb, this);
	elm_object_part_content_set(layout, "elm.swallow.content", radio);
	return layout;
}

void CtDetailMarkAsDefaultItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_entry.kind != Kind::GroupIndex && m_onSelected)
		m_onSelected(this);
}

char* CtDetailMarkAsDefaultItem::__textGetCb(void* data, Evas_Object*, const char* part)
{
	std::string text = static_cast<CtDetailMarkAsDefaultItem*>(data)->getText(part);
	return text.empty() ? nullptr : strdup(text.c_str());
}

Evas_Object* CtDetailMarkAsDefaultItem::__contentGetCb(void* data, Evas_Object* obj, const char* part)
{
	return static_cast<CtDetailMarkAsDefaultItem*>(data)->__getContent(obj, part);
}

void CtDetailMarkAsDefaultItem::__radioChangedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* row = static_cast<CtDetailMarkAsDefaultItem*>(data);
	if (row->m_onSelected)
		row->m_onSelected(row);
}
