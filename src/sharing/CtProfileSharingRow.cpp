#include "CtProfileSharingRow.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

#include <cstdlib>
#include <cstring>

namespace {

const char* const kListEdj = "contacts/detail_layout.edj";

std::string shownText(const std::string& text)
{
	if (text.empty())
		return "";
	char* markup = elm_entry_utf8_to_markup(ContactsCommon::translate(text.c_str()));
	std::string out = markup ? markup : "";
	free(markup);
	return out;
}

} // namespace

CtProfileSharingRow::CtProfileSharingRow(const char* style)
	: m_style(style ? style : "1line")
{
}

void CtProfileSharingRow::setText(const char* part, TextSource source)
{
	if (part)
		m_texts[part] = std::move(source);
}

void CtProfileSharingRow::setTextId(const char* part, const char* textId)
{
	std::string id = textId ? textId : "";
	setText(part, [id] { return id; });
}

void CtProfileSharingRow::setContent(const char* part, ContentSource source)
{
	if (part)
		m_contents[part] = std::move(source);
}

void CtProfileSharingRow::setSelectHandler(SelectHandler handler)
{
	m_onSelect = std::move(handler);
}

CtProfileSharingRow* CtProfileSharingRow::append(Evas_Object* genlist, CtProfileSharingRow* row)
{
	WPRET_VM(!row, nullptr, "Invalid param : row");
	if (!genlist) {
		WERROR("Invalid param : genlist");
		delete row;
		return nullptr;
	}
	Elm_Object_Item* item = elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr,
		ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr);
	if (!item) {
		WERROR("elm_genlist_item_append() failed");
		delete row;
		return nullptr;
	}
	row->setElmObjectItem(item);
	if (row->isDisplayOnly())
		elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
	return row;
}

Evas_Object* CtProfileSharingRow::createSwitch(Evas_Object* parent, bool on, Evas_Smart_Cb changedCb, void* data)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, kListEdj, "list/C/type.3");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* check = elm_check_add(layout);
	elm_object_style_set(check, "on&off");
	elm_check_state_set(check, on ? EINA_TRUE : EINA_FALSE);
	elm_object_signal_emit(check, "elm,event,pass,enabled", "elm");
	evas_object_propagate_events_set(check, EINA_FALSE);
	if (changedCb)
		evas_object_smart_callback_add(check, "changed", changedCb, data);
	elm_object_part_content_set(layout, "elm.swallow.content", check);
	return layout;
}

Evas_Object* CtProfileSharingRow::createRadio(Evas_Object* parent, Evas_Object* group, int state)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, kListEdj, "list/B/type.4");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* radio = elm_radio_add(layout);
	elm_object_style_set(radio, "default");
	elm_radio_state_value_set(radio, state);
	if (group) {
		elm_radio_group_add(radio, group);
		elm_radio_value_set(radio, elm_radio_value_get(group));
	}
	elm_object_signal_emit(radio, "elm,event,pass,enabled", "elm");
	elm_object_part_content_set(layout, "elm.swallow.content", radio);
	return layout;
}

std::string CtProfileSharingRow::getText(const char* part) const
{
	if (!part)
		return "";
	auto it = m_texts.find(part);
	return it == m_texts.end() || !it->second ? "" : shownText(it->second());
}

Evas_Object* CtProfileSharingRow::getHeldContent(const char* part) const
{
	Elm_Object_Item* item = getElmObjectItem();
	Evas_Object* holder = item && part ? elm_object_item_part_content_get(item, part) : nullptr;
	return holder ? elm_object_part_content_get(holder, "elm.swallow.content") : nullptr;
}

Elm_Genlist_Item_Class* CtProfileSharingRow::getItemClassNew()
{
	Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
	WPRET_VM(!itc, nullptr, "elm_genlist_item_class_new() is fail");
	itc->item_style = m_style.c_str();
	itc->func.text_get = __textGetCb;
	itc->func.content_get = __contentGetCb;
	return itc;
}

void CtProfileSharingRow::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_onSelect)
		m_onSelect(this);
}

char* CtProfileSharingRow::__textGetCb(void* data, Evas_Object*, const char* part)
{
	std::string text = static_cast<CtProfileSharingRow*>(data)->getText(part);
	return text.empty() ? nullptr : strdup(text.c_str());
}

Evas_Object* CtProfileSharingRow::__contentGetCb(void* data, Evas_Object* obj, const char* part)
{
	auto* row = static_cast<CtProfileSharingRow*>(data);
	if (!part)
		return nullptr;
	auto it = row->m_contents.find(part);
	return it == row->m_contents.end() || !it->second ? nullptr : it->second(obj);
}
