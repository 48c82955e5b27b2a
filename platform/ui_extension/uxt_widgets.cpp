// Edit fields, styled buttons, toolbars and scroller auto-scroll.
#include "ui_extension.h"

#include "ContactsDebug.h"

#include <cstdlib>
#include <cstring>
#include <initializer_list>

namespace {

const char* const kEntryKey = "uxt_entry";
const char* const kClearKey = "uxt_clear_button";
const char* const kClearEnabledKey = "uxt_clear_enabled";
const char* const kStyleKey = "uxt_style";
const char* const kAutoScrollKey = "uxt_auto_scroll";

void freeDataCb(void* data, Evas*, Evas_Object*, void*)
{
	free(data);
}

void updateClearButton(Evas_Object* layout)
{
	auto* entry = static_cast<Evas_Object*>(evas_object_data_get(layout, kEntryKey));
	auto* clear = static_cast<Evas_Object*>(evas_object_data_get(layout, kClearKey));
	if (!entry || !clear)
		return;
	bool enabled = evas_object_data_get(layout, kClearEnabledKey) != nullptr;
	// Not elm_entry_is_empty(): its textblock cursor, made while the entry
	// handles a change, leaves the entry's own cursor behind the typed text.
	const char* text = elm_entry_entry_get(entry);
	bool show = enabled && !elm_object_disabled_get(entry) && text && *text;
	if (show)
		evas_object_show(clear);
	else
		evas_object_hide(clear);
}

void entryStateCb(void* data, Evas_Object*, void*)
{
	updateClearButton(static_cast<Evas_Object*>(data));
}

void clearClickedCb(void* data, Evas_Object*, void*)
{
	auto* layout = static_cast<Evas_Object*>(data);
	auto* entry = static_cast<Evas_Object*>(evas_object_data_get(layout, kEntryKey));
	if (!entry)
		return;
	elm_entry_entry_set(entry, "");
	elm_object_focus_set(entry, EINA_TRUE);
	updateClearButton(layout);
}

void bringFocusedIntoViewCb(void*, Evas*, Evas_Object* scroller, void*)
{
	if (!evas_object_data_get(scroller, kAutoScrollKey))
		return;
	Evas_Object* focused = elm_object_focused_object_get(scroller);
	if (!focused || focused == scroller)
		return;
	int sx = 0, sy = 0, fx = 0, fy = 0, fw = 0, fh = 0, rx = 0, ry = 0;
	evas_object_geometry_get(scroller, &sx, &sy, nullptr, nullptr);
	evas_object_geometry_get(focused, &fx, &fy, &fw, &fh);
	elm_scroller_region_get(scroller, &rx, &ry, nullptr, nullptr);
	elm_scroller_region_bring_in(scroller, rx + fx - sx, ry + fy - sy, fw, fh);
}

} // namespace

Evas_Object* uxt_edit_field_layout_add(Evas_Object* parent, int style)
{
	WPRET_VM(!parent, nullptr, "Invalid param : parent");
	WPRET_VM(style != UXT_EDIT_FIELD_LAYOUT_STYLE_MULTILINE && style != UXT_EDIT_FIELD_LAYOUT_STYLE_SINGLELINE,
		nullptr, "Invalid param : style %d", style);
	Evas_Object* layout = elm_box_add(parent);
	elm_box_horizontal_set(layout, EINA_TRUE);
	evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(layout, EVAS_HINT_FILL, EVAS_HINT_FILL);

	Evas_Object* entry = elm_entry_add(layout);
	bool single = style == UXT_EDIT_FIELD_LAYOUT_STYLE_SINGLELINE;
	elm_entry_single_line_set(entry, single ? EINA_TRUE : EINA_FALSE);
	elm_entry_scrollable_set(entry, single ? EINA_TRUE : EINA_FALSE);
	evas_object_size_hint_weight_set(entry, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(entry, EVAS_HINT_FILL, 0.5);
	elm_box_pack_end(layout, entry);
	evas_object_show(entry);

	Evas_Object* clear = elm_button_add(layout);
	elm_object_style_set(clear, "editfield_clear");
	elm_object_text_set(clear, "\u00d7");
	elm_object_focus_allow_set(clear, EINA_FALSE);
	elm_box_pack_end(layout, clear);
	evas_object_smart_callback_add(clear, "clicked", clearClickedCb, layout);

	evas_object_data_set(layout, kEntryKey, entry);
	evas_object_data_set(layout, kClearKey, clear);
	evas_object_data_set(layout, kClearEnabledKey, layout);
	for (const char* signal : { "changed", "changed,user" })
		evas_object_smart_callback_add(entry, signal, entryStateCb, layout);
	updateClearButton(layout);
	evas_object_show(layout);
	return layout;
}

Evas_Object* uxt_edit_field_layout_get_entry(Evas_Object* layout)
{
	WPRET_VM(!layout, nullptr, "Invalid param : layout");
	return static_cast<Evas_Object*>(evas_object_data_get(layout, kEntryKey));
}

Evas_Object* uxt_edit_field_layout_get_clear_button(Evas_Object* layout)
{
	WPRET_VM(!layout, nullptr, "Invalid param : layout");
	return static_cast<Evas_Object*>(evas_object_data_get(layout, kClearKey));
}

int uxt_edit_field_layout_set_clear_button_enabled(Evas_Object* layout, Eina_Bool enabled)
{
	WPRET_VM(!uxt_edit_field_layout_get_entry(layout), UXT_ERROR_INVALID_PARAMETER, "not an edit field");
	evas_object_data_set(layout, kClearEnabledKey, enabled ? layout : nullptr);
	updateClearButton(layout);
	return UXT_ERROR_NONE;
}

Evas_Object* uxt_button_add(Evas_Object* parent, const char* style)
{
	WPRET_VM(!parent, nullptr, "Invalid param : parent");
	Evas_Object* button = elm_button_add(parent);
	if (style && *style) {
		elm_object_style_set(button, style);
		evas_object_data_set(button, kStyleKey, strdup(style));
		evas_object_event_callback_add(button, EVAS_CALLBACK_DEL, freeDataCb, evas_object_data_get(button, kStyleKey));
	}
	return button;
}

const char* uxt_button_style_get(const Evas_Object* button)
{
	if (!button)
		return nullptr;
	auto* style = static_cast<const char*>(evas_object_data_get(button, kStyleKey));
	return style ? style : "default";
}

Evas_Object* uxt_toolbar_add(Evas_Object* parent, const char* style)
{
	WPRET_VM(!parent, nullptr, "Invalid param : parent");
	Evas_Object* toolbar = elm_toolbar_add(parent);
	if (style && *style)
		elm_object_style_set(toolbar, style);
	return toolbar;
}

int uxt_scroller_set_auto_scroll_enabled(Evas_Object* scroller, Eina_Bool enabled)
{
	WPRET_VM(!scroller, UXT_ERROR_INVALID_PARAMETER, "Invalid param : scroller");
	bool hooked = evas_object_data_get(scroller, "uxt_auto_scroll_hooked") != nullptr;
	if (!hooked) {
		evas_object_event_callback_add(scroller, EVAS_CALLBACK_RESIZE, bringFocusedIntoViewCb, nullptr);
		evas_object_data_set(scroller, "uxt_auto_scroll_hooked", scroller);
	}
	evas_object_data_set(scroller, kAutoScrollKey, enabled ? scroller : nullptr);
	return UXT_ERROR_NONE;
}

Eina_Bool uxt_scroller_is_auto_scroll_enabled(const Evas_Object* scroller)
{
	return scroller && evas_object_data_get(scroller, kAutoScrollKey) ? EINA_TRUE : EINA_FALSE;
}
