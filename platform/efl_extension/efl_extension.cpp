#include "efl_extension.h"

#include "ContactsDebug.h"
#include "KeyHookRegistry.h"

using ct::platform::KeyHookRegistry;

int eext_object_event_callback_add(Evas_Object* obj, Eext_Callback_Type type, Eext_Event_Cb func, void* data)
{
	if (!KeyHookRegistry::instance().add(obj, type, func, data)) {
		WERROR("Invalid param : obj %p, type %d, func %s", obj, type, func ? "set" : "null");
		return -22;
	}
	return 0;
}

void* eext_object_event_callback_del(Evas_Object* obj, Eext_Callback_Type type, Eext_Event_Cb func)
{
	WPRET_VM(!obj || !func, nullptr, "Invalid param : obj or func is null");
	return KeyHookRegistry::instance().remove(obj, type, func);
}

Eina_Bool eext_win_back_request(Evas_Object* win)
{
	WPRET_VM(!win, EINA_FALSE, "Invalid param : win");
	return KeyHookRegistry::instance().dispatch(win, EEXT_CALLBACK_BACK) ? EINA_TRUE : EINA_FALSE;
}

Eina_Bool eext_win_more_request(Evas_Object* win)
{
	WPRET_VM(!win, EINA_FALSE, "Invalid param : win");
	return KeyHookRegistry::instance().dispatch(win, EEXT_CALLBACK_MORE) ? EINA_TRUE : EINA_FALSE;
}
