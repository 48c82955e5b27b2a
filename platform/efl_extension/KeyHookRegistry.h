// The hardware-key hooks of all windows, newest last. Hooks die with their
// object; each window gets its key grabs once, on its first hook.
#pragma once

#include "efl_extension.h"

#include <vector>

namespace ct::platform {

class KeyHookRegistry {
public:
	static KeyHookRegistry& instance();

	bool add(Evas_Object* obj, Eext_Callback_Type type, Eext_Event_Cb func, void* data);
	void* remove(Evas_Object* obj, Eext_Callback_Type type, Eext_Event_Cb func);
	// Runs the newest hook of `type` whose object is shown on `win`'s canvas.
	bool dispatch(Evas_Object* win, Eext_Callback_Type type);

private:
	struct Hook {
		Evas_Object* obj;
		Eext_Callback_Type type;
		Eext_Event_Cb func;
		void* data;
	};

	KeyHookRegistry() = default;
	static void __objectDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __windowDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __keyDownCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	void __watchObject(Evas_Object* obj);
	void __watchWindowOf(Evas_Object* obj);
	void __forgetObject(Evas_Object* obj);

	std::vector<Hook> m_hooks;
	std::vector<Evas_Object*> m_windows;
};

} // namespace ct::platform
