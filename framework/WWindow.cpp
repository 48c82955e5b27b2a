#include "WWindow.h"

#include "ContactsDebug.h"

#include <initializer_list>

namespace app_assist {

WWindow::WWindow(const char* name, int width, int height)
{
	m_win = elm_win_add(nullptr, name ? name : "contacts", ELM_WIN_BASIC);
	WPRET_M(!m_win, "elm_win_add() failed");
	elm_win_title_set(m_win, name ? name : "contacts");
	elm_win_autodel_set(m_win, EINA_FALSE);
	evas_object_event_callback_add(m_win, EVAS_CALLBACK_DEL, __winDelCb, this);

	Evas_Object* bg = elm_bg_add(m_win);
	evas_object_size_hint_weight_set(bg, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	elm_win_resize_object_add(m_win, bg);
	evas_object_show(bg);

	m_conformant = elm_conformant_add(m_win);
	evas_object_size_hint_weight_set(m_conformant, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	elm_win_resize_object_add(m_win, m_conformant);
	evas_object_show(m_conformant);
	m_keypad = std::make_unique<WVirtualKeypad>(m_conformant);

	m_baseLayout = elm_layout_add(m_conformant);
	__setBaseTheme(m_baseLayout);
	evas_object_size_hint_weight_set(m_baseLayout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	elm_object_content_set(m_conformant, m_baseLayout);
	evas_object_show(m_baseLayout);

	if (width > 0 && height > 0)
		evas_object_resize(m_win, width, height);
	evas_object_show(m_win);
}

WWindow::~WWindow()
{
	m_keypad.reset();
	if (m_win) {
		evas_object_event_callback_del_full(m_win, EVAS_CALLBACK_DEL, __winDelCb, this);
		evas_object_del(m_win);
	}
}

void WWindow::__setBaseTheme(Evas_Object* layout)
{
	// Themes without the application's own group still have this one.
	for (const char* style : { "default", "toolbar-content" }) {
		if (elm_layout_theme_set(layout, "layout", "application", style)
			&& edje_object_part_exists(elm_layout_edje_get(layout), "elm.swallow.content"))
			return;
	}
	WERROR("no base layout group with elm.swallow.content in the theme");
}

void WWindow::setContent(Evas_Object* content)
{
	WPRET_M(!m_baseLayout, "window has no base layout");
	Evas_Object* old = elm_object_part_content_unset(m_baseLayout, "elm.swallow.content");
	if (old && old != content)
		evas_object_del(old);
	elm_object_part_content_set(m_baseLayout, "elm.swallow.content", content);
}

void WWindow::__winDelCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* self = static_cast<WWindow*>(data);
	self->m_win = nullptr;
	self->m_conformant = nullptr;
	self->m_baseLayout = nullptr;
}

} // namespace app_assist
