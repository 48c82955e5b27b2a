#include "WVirtualKeypad.h"

#include "ContactsDebug.h"

#include <cctype>
#include <string>

namespace app_assist {

namespace {

bool isEntry(Evas_Object* obj)
{
	const char* type = evas_object_type_get(obj);
	std::string name(type ? type : "");
	for (char& c : name)
		c = c == '.' ? '_' : static_cast<char>(tolower(static_cast<unsigned char>(c)));
	return name == "elm_entry";
}

} // namespace

WVirtualKeypad::WVirtualKeypad(Evas_Object* conformant)
	: m_conformant(conformant), m_canvas(conformant ? evas_object_evas_get(conformant) : nullptr)
{
	WPRET_M(!m_canvas, "Invalid param : conformant");
	evas_event_callback_add(m_canvas, EVAS_CALLBACK_CANVAS_OBJECT_FOCUS_IN, __focusChangedCb, this);
	evas_event_callback_add(m_canvas, EVAS_CALLBACK_CANVAS_OBJECT_FOCUS_OUT, __focusChangedCb, this);
	evas_object_event_callback_add(m_conformant, EVAS_CALLBACK_DEL, __conformantDelCb, this);
}

WVirtualKeypad::~WVirtualKeypad()
{
	WUiTimer::destroy(m_settle);
	if (!m_conformant)
		return;
	evas_event_callback_del_full(m_canvas, EVAS_CALLBACK_CANVAS_OBJECT_FOCUS_IN, __focusChangedCb, this);
	evas_event_callback_del_full(m_canvas, EVAS_CALLBACK_CANVAS_OBJECT_FOCUS_OUT, __focusChangedCb, this);
	evas_object_event_callback_del_full(m_conformant, EVAS_CALLBACK_DEL, __conformantDelCb, this);
}

Evas_Object* WVirtualKeypad::findInputPanelEntry(Evas_Object* focused)
{
	for (Evas_Object* obj = focused; obj; obj = evas_object_smart_parent_get(obj)) {
		if (!isEntry(obj))
			continue;
		bool takesInput = elm_entry_input_panel_enabled_get(obj) && elm_entry_editable_get(obj)
			&& !elm_object_disabled_get(obj);
		return takesInput ? obj : nullptr;
	}
	return nullptr;
}

void WVirtualKeypad::__focusChangedCb(void* data, Evas*, void*)
{
	auto* self = static_cast<WVirtualKeypad*>(data);
	if (WUiTimer::isAlive(self->m_settle))
		return;
	// Focus leaves one entry before it reaches the next: decide once both happened.
	self->m_settle = WUiTimer::addIdler([self](void*) {
		self->__settle();
		return false;
	}, nullptr, self->m_conformant);
}

void WVirtualKeypad::__conformantDelCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* self = static_cast<WVirtualKeypad*>(data);
	evas_event_callback_del_full(self->m_canvas, EVAS_CALLBACK_CANVAS_OBJECT_FOCUS_IN, __focusChangedCb, self);
	evas_event_callback_del_full(self->m_canvas, EVAS_CALLBACK_CANVAS_OBJECT_FOCUS_OUT, __focusChangedCb, self);
	self->m_conformant = nullptr;
}

void WVirtualKeypad::__settle()
{
	if (!m_conformant)
		return;
	__setShown(findInputPanelEntry(evas_focus_get(m_canvas)) != nullptr);
}

void WVirtualKeypad::__setShown(bool shown)
{
	if (shown == m_shown || !m_conformant)
		return;
	m_shown = shown;
	WDEBUG("virtual keypad %s", shown ? "on" : "off");
	evas_object_smart_callback_call(m_conformant, shown ? "virtualkeypad,state,on" : "virtualkeypad,state,off", nullptr);
}

} // namespace app_assist
