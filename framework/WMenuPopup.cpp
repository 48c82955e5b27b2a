#include "WMenuPopup.h"

#include "ContactsDebug.h"
#include "IWWindow.h"
#include "WNaviframe.h"
#include "efl_extension.h"

namespace app_assist {

WMenuPopup::WMenuPopup(Evas_Object* window, Evas_Object* naviframe)
	: m_window(window)
	, m_naviframe(naviframe)
{
}

WMenuPopup::WMenuPopup(IWWindow* window, WNaviframe* naviframe)
	: m_window(window ? window->getEvasObj() : nullptr)
	, m_naviframe(naviframe ? naviframe->getEvasObj() : nullptr)
{
}

WMenuPopup::~WMenuPopup() = default;

const char* WMenuPopup::getClassName()
{
	return "WMenuPopup";
}

void WMenuPopup::setTextTranslatable(const char* domain)
{
	m_domain = domain ? domain : "";
}

void WMenuPopup::appendItem(const char* label, std::function<void()> action, ItemState state)
{
	WPRET_M(!label, "Invalid param : label");
	WPRET_M(isCreated(), "items are appended before the menu is shown");
	m_items.push_back(std::make_unique<Item>(Item { this, label, std::move(action), state }));
}

Evas_Object* WMenuPopup::onCreate(Evas_Object* parent, void*)
{
	Evas_Object* owner = m_window ? m_window : elm_object_top_widget_get(parent);
	Evas_Object* ctxpopup = elm_ctxpopup_add(owner ? owner : parent);
	WPRET_VM(!ctxpopup, nullptr, "elm_ctxpopup_add() failed");
	elm_object_style_set(ctxpopup, "more/default");
	elm_ctxpopup_auto_hide_disabled_set(ctxpopup, EINA_TRUE);
	for (auto& item : m_items) {
		Elm_Object_Item* it = elm_ctxpopup_item_append(ctxpopup, nullptr, nullptr, __itemSelectedCb, item.get());
		if (m_domain.empty())
			elm_object_item_text_set(it, item->label.c_str());
		else
			elm_object_item_domain_translatable_text_set(it, m_domain.c_str(), item->label.c_str());
		elm_object_item_disabled_set(it, item->state == ItemState::Disabled);
	}
	eext_object_event_callback_add(ctxpopup, EEXT_CALLBACK_BACK, __dismissCb, this);
	eext_object_event_callback_add(ctxpopup, EEXT_CALLBACK_MORE, __dismissCb, this);
	evas_object_smart_callback_add(ctxpopup, "dismissed", __dismissCb, this);
	__place(ctxpopup);
	evas_object_show(ctxpopup);
	return ctxpopup;
}

void WMenuPopup::__place(Evas_Object* ctxpopup)
{
	Evas_Object* win = elm_object_top_widget_get(ctxpopup);
	int w = 0, h = 0;
	evas_object_geometry_get(win, nullptr, nullptr, &w, &h);
	elm_ctxpopup_direction_priority_set(ctxpopup, ELM_CTXPOPUP_DIRECTION_UP, ELM_CTXPOPUP_DIRECTION_UNKNOWN,
		ELM_CTXPOPUP_DIRECTION_UNKNOWN, ELM_CTXPOPUP_DIRECTION_UNKNOWN);
	evas_object_move(ctxpopup, w / 2, h);
}

void WMenuPopup::__itemSelectedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* item = static_cast<Item*>(data);
	if (item->owner->isDestroying() || item->state == ItemState::Disabled)
		return;
	std::function<void()> action = item->action;
	item->owner->destroy();
	if (action)
		action();
}

void WMenuPopup::__dismissCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* self = static_cast<WMenuPopup*>(data);
	if (!self->isDestroying())
		self->destroy();
}

} // namespace app_assist
