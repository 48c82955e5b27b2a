#include "CtInputViewImportantFieldsItem.h"

#include "CtCommonWidgetUtil.h"

#include <ui_extension.h>

#include <cstring>

namespace {

struct ButtonInfo {
	const char* part;
	const char* textId;
	const char* icon;
};

const ButtonInfo kButtons[] = {
	{"elm.icon.1", "IDS_PB_BUTTON_PHONE", "contacts_circle_btn_ic_call.png"},
	{"elm.icon.2", "IDS_PB_BUTTON_EMAIL_ABB3", "contacts_circle_btn_ic_email.png"},
	{"elm.icon.3", "IDS_PB_BUTTON_NOTES", "contacts_circle_btn_ic_note.png"},
	{"elm.icon.4", "IDS_PB_BUTTON_MORE", "contacts_circle_btn_ic_more.png"},
};

} // namespace

CtInputViewImportantFieldsItem::CtInputViewImportantFieldsItem(std::array<std::function<void()>, BUTTON_COUNT> pressed)
	: m_pressed(std::move(pressed))
{
	for (int i = 0; i < BUTTON_COUNT; ++i)
		m_slots[i] = {this, static_cast<Button>(i)};
}

CtInputViewImportantFieldsItem::~CtInputViewImportantFieldsItem()
{
	// The list deletes a row before its contents.
	for (int i = 0; i < BUTTON_COUNT; ++i)
		if (m_buttons[i])
			evas_object_event_callback_del_full(m_buttons[i], EVAS_CALLBACK_DEL, __buttonDelCb, &m_slots[i]);
}

Elm_Genlist_Item_Class* CtInputViewImportantFieldsItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.4icon");
	return itc;
}

void CtInputViewImportantFieldsItem::setButtonDisabled(Button button, bool disabled)
{
	m_disabled[button] = disabled;
	if (m_buttons[button])
		elm_object_disabled_set(m_buttons[button], disabled ? EINA_TRUE : EINA_FALSE);
}

Evas_Object* CtInputViewImportantFieldsItem::getContent(Evas_Object* genlist, const char* part)
{
	for (int i = 0; i < BUTTON_COUNT; ++i) {
		if (strcmp(part, kButtons[i].part) != 0)
			continue;
		Evas_Object* button = uxt_button_add(genlist, "circle");
		elm_object_domain_translatable_text_set(button, "contacts", kButtons[i].textId);
		Evas_Object* icon = ctCommonCreateImage(button, "contacts/image_layout.edj", kButtons[i].icon, "F032L3");
		elm_object_part_content_set(button, "icon", icon);
		elm_object_disabled_set(button, m_disabled[i] ? EINA_TRUE : EINA_FALSE);
		evas_object_smart_callback_add(button, "clicked", __clickedCb, &m_slots[i]);
		if (m_buttons[i])
			evas_object_event_callback_del_full(m_buttons[i], EVAS_CALLBACK_DEL, __buttonDelCb, &m_slots[i]);
		m_buttons[i] = button;
		evas_object_event_callback_add(button, EVAS_CALLBACK_DEL, __buttonDelCb, &m_slots[i]);
		return button;
	}
	return nullptr;
}

void CtInputViewImportantFieldsItem::__clickedCb(void* data, Evas_Object*, void*)
{
	auto* slot = static_cast<Slot*>(data);
	if (slot->row->m_pressed[slot->button])
		slot->row->m_pressed[slot->button]();
}

void CtInputViewImportantFieldsItem::__buttonDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* slot = static_cast<Slot*>(data);
	if (slot->row->m_buttons[slot->button] == obj)
		slot->row->m_buttons[slot->button] = nullptr;
}
