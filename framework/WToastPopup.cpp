#include "WToastPopup.h"

#include "ContactsDebug.h"
#include "efl_extension.h"

namespace app_assist {

WToastPopup::WToastPopup(const char* text, double seconds)
	: m_toastText(text ? text : "")
	, m_seconds(seconds > 0 ? seconds : kDefaultSeconds)
{
}

WToastPopup::~WToastPopup() = default;

const char* WToastPopup::getClassName()
{
	return "WToastPopup";
}

Evas_Object* WToastPopup::onCreate(Evas_Object* parent, void*)
{
	Evas_Object* top = elm_object_top_widget_get(parent);
	Evas_Object* popup = elm_popup_add(top ? top : parent);
	WPRET_VM(!popup, nullptr, "elm_popup_add() failed");
	elm_object_style_set(popup, "toast");
	elm_popup_orient_set(popup, ELM_POPUP_ORIENT_BOTTOM);
	evas_object_size_hint_weight_set(popup, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	setPartText(popup, nullptr, m_toastText);
	elm_popup_timeout_set(popup, m_seconds);
	evas_object_smart_callback_add(popup, "timeout", __timeoutCb, this);
	evas_object_smart_callback_add(popup, "block,clicked", __timeoutCb, this);
	eext_object_event_callback_add(popup, EEXT_CALLBACK_BACK, __timeoutCb, this);
	evas_object_show(popup);
	return popup;
}

void WToastPopup::__timeoutCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<WToastPopup*>(data);
	if (!self->isDestroying())
		self->destroy();
}

} // namespace app_assist
