#include "efl_assist.h"

#include "efl_extension.h"

static_assert(static_cast<int>(EA_CALLBACK_BACK) == static_cast<int>(EEXT_CALLBACK_BACK));
static_assert(static_cast<int>(EA_CALLBACK_MORE) == static_cast<int>(EEXT_CALLBACK_MORE));

int ea_object_event_callback_add(Evas_Object* obj, Ea_Callback_Type type, Ea_Event_Cb func, void* data)
{
	return eext_object_event_callback_add(obj, static_cast<Eext_Callback_Type>(type), func, data);
}

void* ea_object_event_callback_del(Evas_Object* obj, Ea_Callback_Type type, Ea_Event_Cb func)
{
	return eext_object_event_callback_del(obj, static_cast<Eext_Callback_Type>(type), func);
}
