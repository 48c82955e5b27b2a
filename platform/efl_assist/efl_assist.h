/* Hardware-key hooks of the older assist library; they share the hooks of
 * efl_extension.h, so both kinds are served newest first. */
#ifndef CT_PLATFORM_EFL_ASSIST_H
#define CT_PLATFORM_EFL_ASSIST_H

#include <Elementary.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	EA_CALLBACK_BACK = 0,
	EA_CALLBACK_MORE,
	EA_CALLBACK_LAST
} Ea_Callback_Type;

typedef void (*Ea_Event_Cb)(void *data, Evas_Object *obj, void *event_info);

/* Returns 0, or -22 for a null object or callback or an unknown type. */
int ea_object_event_callback_add(Evas_Object *obj, Ea_Callback_Type type,
	Ea_Event_Cb func, void *data);
/* Removes the newest matching hook and returns its data (NULL when none). */
void *ea_object_event_callback_del(Evas_Object *obj, Ea_Callback_Type type,
	Ea_Event_Cb func);

#ifdef __cplusplus
}
#endif

#endif
