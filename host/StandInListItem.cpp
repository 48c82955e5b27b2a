#include "StandInListItem.h"

#include <algorithm>
#include <cstring>

namespace ct::demo {

namespace {

constexpr int kPictureSize = 44;

Elm_Genlist_Item_Class makeClass(const char* style, Elm_Gen_Item_Text_Get_Cb text, Elm_Gen_Item_Content_Get_Cb content)
{
	Elm_Genlist_Item_Class c = {};
	c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
	c.item_style = style;
	c.func.text_get = text;
	c.func.content_get = content;
	return c;
}

// One line of plain text as markup: control characters become spaces.
char* lineMarkup(std::string line)
{
	std::replace_if(line.begin(), line.end(), [](char c) { return c >= 0 && c < ' '; }, ' ');
	return elm_entry_utf8_to_markup(line.c_str());
}

} // namespace

StandInListItem::StandInListItem(std::string text, std::string subText, std::string picturePath, SelectHandler onSelect)
	: m_text(std::move(text))
	, m_subText(std::move(subText))
	, m_picturePath(std::move(picturePath))
	, m_onSelect(std::move(onSelect))
{
}

void StandInListItem::setMark(Mark mark, bool marked)
{
	m_mark = mark;
	m_marked = marked;
	if (getElmObjectItem())
		elm_genlist_item_fields_update(getElmObjectItem(), "elm.swallow.end", ELM_GENLIST_ITEM_FIELD_CONTENT);
}

Elm_Genlist_Item_Class* StandInListItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class oneLine = makeClass("1line", __getTextCb, __getContentCb);
	static Elm_Genlist_Item_Class twoLines = makeClass("2line.top", __getTextCb, __getContentCb);
	return m_subText.empty() ? &oneLine : &twoLines;
}

void StandInListItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_mark == Mark::Check)
		setMark(Mark::Check, !m_marked);
	if (m_onSelect)
		m_onSelect(*this);
}

char* StandInListItem::__getTextCb(void* data, Evas_Object*, const char* part)
{
	auto* self = static_cast<StandInListItem*>(data);
	if (strcmp(part, "elm.text") == 0 || strcmp(part, "elm.text.main.left.top") == 0)
		return lineMarkup(self->m_text);
	if (strcmp(part, "elm.text.sub.left.bottom") == 0 && !self->m_subText.empty())
		return lineMarkup(self->m_subText);
	return nullptr;
}

Evas_Object* StandInListItem::__getContentCb(void* data, Evas_Object* obj, const char* part)
{
	auto* self = static_cast<StandInListItem*>(data);
	if (strcmp(part, "elm.swallow.icon") == 0)
		return self->__makePicture(obj);
	if (strcmp(part, "elm.swallow.end") == 0)
		return self->__makeMark(obj);
	return nullptr;
}

Evas_Object* StandInListItem::__makePicture(Evas_Object* parent) const
{
	if (m_picturePath.empty())
		return nullptr;
	Evas_Object* image = elm_image_add(parent);
	if (!elm_image_file_set(image, m_picturePath.c_str(), nullptr)) {
		evas_object_del(image);
		return nullptr;
	}
	elm_image_aspect_fixed_set(image, EINA_TRUE);
	evas_object_size_hint_min_set(image, ELM_SCALE_SIZE(kPictureSize), ELM_SCALE_SIZE(kPictureSize));
	evas_object_size_hint_max_set(image, ELM_SCALE_SIZE(kPictureSize), ELM_SCALE_SIZE(kPictureSize));
	return image;
}

Evas_Object* StandInListItem::__makeMark(Evas_Object* parent) const
{
	if (m_mark == Mark::Check) {
		Evas_Object* check = elm_check_add(parent);
		elm_check_state_set(check, m_marked ? EINA_TRUE : EINA_FALSE);
		// The row's selection flips it: a tap on the check goes to the row.
		evas_object_pass_events_set(check, EINA_TRUE);
		return check;
	}
	if (m_mark == Mark::Radio) {
		Evas_Object* radio = elm_radio_add(parent);
		elm_radio_state_value_set(radio, 1);
		elm_radio_value_set(radio, m_marked ? 1 : 0);
		evas_object_pass_events_set(radio, EINA_TRUE);
		return radio;
	}
	return nullptr;
}

} // namespace ct::demo
