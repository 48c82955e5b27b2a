// An application window: elm_win with a background, a conformant and a base
// layout whose "elm.swallow.content" holds the naviframe.
#pragma once

#include "IWWindow.h"
#include "WVirtualKeypad.h"

#include <memory>

namespace app_assist {

class WWindow : public IWWindow {
public:
	// `name` is the window's name and title; size 0 keeps the toolkit's size.
	WWindow(const char* name, int width = 0, int height = 0);
	~WWindow() override;
	WWindow(const WWindow&) = delete;
	WWindow& operator=(const WWindow&) = delete;

	Evas_Object* getEvasObj() const override { return m_win; }
	Evas_Object* getConformantEvasObj() const override { return m_conformant; }
	Evas_Object* getBaseLayoutEvasObj() const override { return m_baseLayout; }

	// Puts `content` into the base layout (the previous content is deleted).
	void setContent(Evas_Object* content);
	// The keypad stand-in that raises the conformant's keypad signals.
	WVirtualKeypad* getVirtualKeypad() const { return m_keypad.get(); }

private:
	static void __setBaseTheme(Evas_Object* layout);
	static void __winDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_win = nullptr;
	Evas_Object* m_conformant = nullptr;
	Evas_Object* m_baseLayout = nullptr;
	std::unique_ptr<WVirtualKeypad> m_keypad;
};

} // namespace app_assist
