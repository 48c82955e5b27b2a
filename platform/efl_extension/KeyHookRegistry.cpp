#include "KeyHookRegistry.h"

#include "ContactsDebug.h"

#include <algorithm>
#include <cstring>

namespace ct::platform {

namespace {

const char* const kBackKeys[] = { "Escape", "XF86Back" };
const char* const kMoreKeys[] = { "Menu", "XF86Menu" };

bool isOneOf(const char* key, const char* const (&names)[2])
{
	return key && (strcmp(key, names[0]) == 0 || strcmp(key, names[1]) == 0);
}

// Shown means the object and every smart parent are visible: a view under the
// top of a naviframe keeps its own flag but its item is hidden.
bool isShown(Evas_Object* obj)
{
	for (Evas_Object* o = obj; o; o = evas_object_smart_parent_get(o)) {
		if (!evas_object_visible_get(o))
			return false;
	}
	return true;
}

Evas_Object* windowOf(Evas_Object* obj)
{
	Evas_Object* win = elm_object_top_widget_get(obj);
	if (win)
		return win;
	Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(obj));
	return ee ? static_cast<Evas_Object*>(ecore_evas_data_get(ee, "elm_win")) : nullptr;
}

} // namespace

KeyHookRegistry& KeyHookRegistry::instance()
{
	static KeyHookRegistry* registry = new KeyHookRegistry();
	return *registry;
}

bool KeyHookRegistry::add(Evas_Object* obj, Eext_Callback_Type type, Eext_Event_Cb func, void* data)
{
	if (!obj || !func || type < EEXT_CALLBACK_BACK || type >= EEXT_CALLBACK_LAST)
		return false;
	__watchObject(obj);
	__watchWindowOf(obj);
	m_hooks.push_back({ obj, type, func, data });
	return true;
}

void* KeyHookRegistry::remove(Evas_Object* obj, Eext_Callback_Type type, Eext_Event_Cb func)
{
	auto found = std::find_if(m_hooks.rbegin(), m_hooks.rend(), [&](const Hook& h) {
		return h.obj == obj && h.type == type && h.func == func;
	});
	if (found == m_hooks.rend())
		return nullptr;
	void* data = found->data;
	m_hooks.erase(std::next(found).base());
	bool stillHooked = std::any_of(m_hooks.begin(), m_hooks.end(), [obj](const Hook& h) { return h.obj == obj; });
	if (!stillHooked)
		evas_object_event_callback_del_full(obj, EVAS_CALLBACK_DEL, __objectDelCb, this);
	return data;
}

bool KeyHookRegistry::dispatch(Evas_Object* win, Eext_Callback_Type type)
{
	if (!win)
		return false;
	Evas* canvas = evas_object_evas_get(win);
	for (auto it = m_hooks.rbegin(); it != m_hooks.rend(); ++it) {
		if (it->type != type || evas_object_evas_get(it->obj) != canvas || !isShown(it->obj))
			continue;
		// The hook may add or remove hooks, or delete its object.
		Hook hook = *it;
		hook.func(hook.data, hook.obj, nullptr);
		return true;
	}
	WDEBUG("no key hook of type %d on this window", type);
	return false;
}

void KeyHookRegistry::__watchObject(Evas_Object* obj)
{
	bool known = std::any_of(m_hooks.begin(), m_hooks.end(), [obj](const Hook& h) { return h.obj == obj; });
	if (!known)
		evas_object_event_callback_add(obj, EVAS_CALLBACK_DEL, __objectDelCb, this);
}

void KeyHookRegistry::__watchWindowOf(Evas_Object* obj)
{
	Evas_Object* win = windowOf(obj);
	if (!win || std::find(m_windows.begin(), m_windows.end(), win) != m_windows.end())
		return;
	m_windows.push_back(win);
	for (const char* key : { kBackKeys[0], kBackKeys[1], kMoreKeys[0], kMoreKeys[1] }) {
		if (!evas_object_key_grab(win, key, 0, 0, EINA_FALSE))
			WFAILED("evas_object_key_grab", 0);
	}
	evas_object_event_callback_add(win, EVAS_CALLBACK_KEY_DOWN, __keyDownCb, this);
	evas_object_event_callback_add(win, EVAS_CALLBACK_DEL, __windowDelCb, this);
}

void KeyHookRegistry::__forgetObject(Evas_Object* obj)
{
	m_hooks.erase(std::remove_if(m_hooks.begin(), m_hooks.end(), [obj](const Hook& h) { return h.obj == obj; }),
		m_hooks.end());
}

void KeyHookRegistry::__objectDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	static_cast<KeyHookRegistry*>(data)->__forgetObject(obj);
}

void KeyHookRegistry::__windowDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<KeyHookRegistry*>(data);
	self->m_windows.erase(std::remove(self->m_windows.begin(), self->m_windows.end(), obj), self->m_windows.end());
}

void KeyHookRegistry::__keyDownCb(void* data, Evas*, Evas_Object* obj, void* eventInfo)
{
	auto* ev = static_cast<Evas_Event_Key_Down*>(eventInfo);
	if (!ev || (ev->event_flags & EVAS_EVENT_FLAG_ON_HOLD))
		return;
	auto* self = static_cast<KeyHookRegistry*>(data);
	bool taken = false;
	if (isOneOf(ev->keyname, kBackKeys))
		taken = self->dispatch(obj, EEXT_CALLBACK_BACK);
	else if (isOneOf(ev->keyname, kMoreKeys))
		taken = self->dispatch(obj, EEXT_CALLBACK_MORE);
	if (taken)
		ev->event_flags = static_cast<Evas_Event_Flags>(ev->event_flags | EVAS_EVENT_FLAG_ON_HOLD);
}

} // namespace ct::platform
