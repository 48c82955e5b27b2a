// Theme colour codes: the theme's colour classes first, then the built-in
// table of the codes the screens name.
#include "ui_extension.h"

#include "ContactsDebug.h"

#include <cstring>

namespace {

struct ThemeColor {
	const char* code;
	int r, g, b, a;
};

const ThemeColor kColors[] = {
	{ "A03O004", 61, 185, 204, 255 },
	{ "A03O004L1", 61, 185, 204, 255 },
	{ "A03O011", 76, 175, 80, 255 },
	{ "A03O012", 245, 124, 0, 255 },
	{ "A08O001", 255, 255, 255, 255 },
	{ "A08O001A", 255, 255, 255, 128 },
	{ "B043", 250, 250, 250, 255 },
	{ "B043A", 250, 250, 250, 128 },
	{ "B0211", 250, 250, 250, 255 },
	{ "F032L3", 61, 185, 204, 255 },
	{ "T1067", 61, 185, 204, 255 },
	{ "transparent", 0, 0, 0, 0 },
};

} // namespace

int uxt_theme_get_color(const char* code, int* r, int* g, int* b, int* a)
{
	WPRET_VM(!code || !r || !g || !b || !a, UXT_ERROR_INVALID_PARAMETER, "Invalid param : code or output");
	int r2, g2, b2, a2, r3, g3, b3, a3;
	if (edje_color_class_get(code, r, g, b, a, &r2, &g2, &b2, &a2, &r3, &g3, &b3, &a3))
		return UXT_ERROR_NONE;
	for (const ThemeColor& color : kColors) {
		if (strcmp(color.code, code) == 0) {
			*r = color.r;
			*g = color.g;
			*b = color.b;
			*a = color.a;
			return UXT_ERROR_NONE;
		}
	}
	WWARNING("unknown theme colour %s", code);
	return UXT_ERROR_INVALID_PARAMETER;
}

int uxt_theme_object_replace_color(Evas_Object* obj, const char* from, const char* to)
{
	WPRET_VM(!obj || !from || !to, UXT_ERROR_INVALID_PARAMETER, "Invalid param : obj, from or to");
	int r, g, b, a;
	int ret = uxt_theme_get_color(to, &r, &g, &b, &a);
	if (ret != UXT_ERROR_NONE)
		return ret;
	const char* type = evas_object_type_get(obj);
	Evas_Object* edje = type && strcmp(type, "edje") == 0 ? obj : elm_layout_edje_get(obj);
	if (!edje || !edje_object_color_class_set(edje, from, r, g, b, a, r, g, b, a, r, g, b, a)) {
		WFAILED("edje_object_color_class_set", UXT_ERROR_OPERATION_FAILED);
		return UXT_ERROR_OPERATION_FAILED;
	}
	return UXT_ERROR_NONE;
}

int uxt_theme_object_set_color(Evas_Object* obj, const char* code)
{
	return uxt_theme_object_replace_color(obj, code, code);
}
