/* The toolkit extension library: edit fields, styled buttons, toolbars,
 * scroller auto-scroll, theme colours, locale date texts and the lunar
 * (Chinese) calendar. Functions returning int give 0 on success and a
 * negative UXT_ERROR_* code otherwise. */
#ifndef CT_PLATFORM_UI_EXTENSION_H
#define CT_PLATFORM_UI_EXTENSION_H

#include <Elementary.h>
#include <time.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	UXT_ERROR_NONE = 0,
	UXT_ERROR_INVALID_PARAMETER = -22,
	UXT_ERROR_NOT_SUPPORTED = -95,
	UXT_ERROR_OPERATION_FAILED = -1
} uxt_error_e;

/* ---- edit field ---- */
typedef enum {
	UXT_EDIT_FIELD_LAYOUT_STYLE_MULTILINE = 1,
	UXT_EDIT_FIELD_LAYOUT_STYLE_SINGLELINE = 2
} uxt_edit_field_layout_style_e;

/* An edit field: an entry (guide text in its "elm.guide" part) with a clear
 * button shown while the entry holds text. NULL for a null parent
 * or an unknown style. */
Evas_Object *uxt_edit_field_layout_add(Evas_Object *parent, int style);
Evas_Object *uxt_edit_field_layout_get_entry(Evas_Object *layout);
Evas_Object *uxt_edit_field_layout_get_clear_button(Evas_Object *layout);
int uxt_edit_field_layout_set_clear_button_enabled(Evas_Object *layout, Eina_Bool enabled);

/* ---- buttons and toolbars ---- */
/* A button of the named style ("naviframe/title_right", "naviframe/title_left",
 * "naviframe/back_btn/default", "datetime", "circle", "btn_with_swallow", ...);
 * uxt_button_style_get tells which. NULL for a null parent. */
Evas_Object *uxt_button_add(Evas_Object *parent, const char *style);
const char *uxt_button_style_get(const Evas_Object *button);
/* A toolbar of the named style (for example "tabbar_with_title"). */
Evas_Object *uxt_toolbar_add(Evas_Object *parent, const char *style);

/* ---- scroller auto-scroll ---- */
/* When on, the scroller (or genlist) brings the focused entry into view when
 * it resizes, for example when the keypad appears. Off by default. */
int uxt_scroller_set_auto_scroll_enabled(Evas_Object *scroller, Eina_Bool enabled);
Eina_Bool uxt_scroller_is_auto_scroll_enabled(const Evas_Object *scroller);

/* ---- theme colours ---- */
/* The colour of a theme colour code ("T1067", "A03O004", ...); "transparent"
 * is (0,0,0,0). Codes unknown to the theme and to the built-in table give
 * UXT_ERROR_INVALID_PARAMETER. */
int uxt_theme_get_color(const char *code, int *r, int *g, int *b, int *a);
/* Draws `obj`'s colour class `from` with the colour of code `to`. */
int uxt_theme_object_replace_color(Evas_Object *obj, const char *from, const char *to);
/* Sets colour class `code` of `obj` to the theme colour of the same code. */
int uxt_theme_object_set_color(Evas_Object *obj, const char *code);

/* ---- dates ---- */
typedef enum {
	UXT_DATE_FORMAT_DATE_WITHOUT_YEAR = 6, /* month and day, e.g. "January 22" */
	UXT_DATE_FORMAT_DATE_WITH_YEAR = 7     /* e.g. "January 22, 2023" */
} uxt_date_format_e;

/* The date of `date` (tm fields; tm_year from 1900, tm_mon from 0) for the
 * region format `region` ("en_US", "de_DE.UTF-8", ...), in `format`. Returns
 * a new string the caller frees, or NULL (bad input or unknown format). */
char *uxt_util_get_date_time_text_by_locale(const char *region, const struct tm *date, int format);
/* Sets an elm_datetime's display format to the region's date order. */
int uxt_date_time_set_format_by_locale(Evas_Object *datetime, const char *region);

/* ---- lunar calendar ---- */
typedef enum {
	UXT_CALENDAR_SOLAR = 0,
	UXT_CALENDAR_LUNAR_CHINESE = 1
} uxt_calendar_type_e;

/* Lunar dates use struct tm with tm_year = the Gregorian year in which the
 * lunar year starts, minus 1900; tm_mon = lunar month - 1; tm_mday = day.
 * A leap month repeats the number of the month before it. */
int uxt_util_convert_gregorian_time_to_lunar_time(int calendar, const struct tm *gregorian,
	struct tm *lunar, int *is_leap_month);
int uxt_util_convert_lunar_time_to_gregorian_time(int calendar, const struct tm *lunar,
	int is_leap_month, struct tm *gregorian);
/* 1 when lunar year `lunar->tm_year` has a leap month after month
 * `lunar->tm_mon`, 0 when not, a negative error for bad input. */
int uxt_util_is_leap_month_possible(int calendar, const struct tm *lunar);

#ifdef __cplusplus
}
#endif

#endif
