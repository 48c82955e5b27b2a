/* Hardware-key hooks of the toolkit extension library: the back key
 * (Escape or XF86Back on the window, or the window's back request) and the
 * more key (Menu or XF86Menu). The most recently registered hook whose
 * object is shown on that window receives the key. */
#ifndef CT_PLATFORM_EFL_EXTENSION_H
#define CT_PLATFORM_EFL_EXTENSION_H

#include <Elementary.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	EEXT_CALLBACK_BACK = 0,
	EEXT_CALLBACK_MORE,
	EEXT_CALLBACK_LAST
} Eext_Callback_Type;

typedef void (*Eext_Event_Cb)(void *data, Evas_Object *obj, void *event_info);

/* Registers `func` for key `type` on `obj`; the hook goes away with `obj`.
 * Returns 0, or -22 for a null object or callback or an unknown type. */
int eext_object_event_callback_add(Evas_Object *obj, Eext_Callback_Type type,
	Eext_Event_Cb func, void *data);
/* Removes the newest matching hook and returns its data (NULL when none). */
void *eext_object_event_callback_del(Evas_Object *obj, Eext_Callback_Type type,
	Eext_Event_Cb func);

/* The window asks to go back (or for the more menu), as the key would.
 * Returns EINA_TRUE when a hook took the key. */
Eina_Bool eext_win_back_request(Evas_Object *win);
Eina_Bool eext_win_more_request(Evas_Object *win);

#ifdef __cplusplus
}
#endif

#endif
