#include "StatusToast.h"

#include "ContactsDebug.h"

#include <Elementary.h>

#include <cstdlib>

namespace ct::notification {

StatusToast& StatusToast::instance()
{
	// Never destroyed: window callbacks may point here until the process ends.
	static auto* toast = new StatusToast;
	return *toast;
}

void StatusToast::setWindow(Evas_Object* win)
{
	if (win == m_window)
		return;
	__removePopup();
	__forgetWindow();
	if (!win)
		return;
	m_window = win;
	evas_object_event_callback_add(win, EVAS_CALLBACK_DEL, &StatusToast::__onWindowDelCb, this);
}

bool StatusToast::show(const std::string& text)
{
	if (!m_window)
		return false;
	__removePopup();
	char* markup = elm_entry_utf8_to_markup(text.c_str());
	Evas_Object* popup = elm_popup_add(m_window);
	if (!popup) {
		WERROR("elm_popup_add() failed");
		free(markup);
		return false;
	}
	elm_object_style_set(popup, "toast");
	elm_popup_orient_set(popup, ELM_POPUP_ORIENT_BOTTOM);
	elm_object_text_set(popup, markup ? markup : "");
	free(markup);
	elm_popup_timeout_set(popup, kTimeout);
	evas_object_smart_callback_add(popup, "timeout", &StatusToast::__onTimeoutCb, this);
	evas_object_smart_callback_add(popup, "block,clicked", &StatusToast::__onTimeoutCb, this);
	evas_object_event_callback_add(popup, EVAS_CALLBACK_DEL, &StatusToast::__onPopupDelCb, this);
	evas_object_show(popup);
	m_popup = popup;
	return true;
}

void StatusToast::__forgetWindow()
{
	if (m_window)
		evas_object_event_callback_del_full(m_window, EVAS_CALLBACK_DEL, &StatusToast::__onWindowDelCb, this);
	m_window = nullptr;
}

void StatusToast::__removePopup()
{
	Evas_Object* popup = m_popup;
	m_popup = nullptr;
	if (!popup)
		return;
	evas_object_event_callback_del_full(popup, EVAS_CALLBACK_DEL, &StatusToast::__onPopupDelCb, this);
	evas_object_del(popup);
}

void StatusToast::__onWindowDelCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* self = static_cast<StatusToast*>(data);
	// The popup is the window's child and goes with it.
	self->m_window = nullptr;
}

void StatusToast::__onPopupDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<StatusToast*>(data);
	if (self->m_popup == obj)
		self->m_popup = nullptr;
}

void StatusToast::__onTimeoutCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<StatusToast*>(data);
	if (self->m_popup == obj)
		self->__removePopup();
	else
		evas_object_del(obj);
}

} // namespace ct::notification
