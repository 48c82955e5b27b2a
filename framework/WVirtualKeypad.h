// The on-screen keypad as the window's conformant reports it. There is no
// real input panel here: the keypad counts as up while an editable entry
// with an input panel holds the focus, and "virtualkeypad,state,on" /
// "virtualkeypad,state,off" are raised on the conformant when that changes
// (settled once per main-loop turn, so moving from one entry to the next
// raises nothing). show()/hide() raise and lower it directly, as a person
// closing the keypad would.
#pragma once

#include "WUiTimer.h"

#include <Elementary.h>

namespace app_assist {

class WVirtualKeypad {
public:
	// Watches the canvas of `conformant`; both belong to the window.
	explicit WVirtualKeypad(Evas_Object* conformant);
	~WVirtualKeypad();
	WVirtualKeypad(const WVirtualKeypad&) = delete;
	WVirtualKeypad& operator=(const WVirtualKeypad&) = delete;

	bool isShown() const { return m_shown; }
	void show() { __setShown(true); }
	void hide() { __setShown(false); }

	// The entry (or null) that `focused` belongs to when it takes keypad input.
	static Evas_Object* findInputPanelEntry(Evas_Object* focused);

private:
	static void __focusChangedCb(void* data, Evas* canvas, void* eventInfo);
	static void __conformantDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	void __settle();
	void __setShown(bool shown);

	Evas_Object* m_conformant;
	Evas* m_canvas;
	bool m_shown = false;
	WUiTimerHandle m_settle;
};

} // namespace app_assist
