// Headless screen tests (ELM_ENGINE=buffer): a window with a naviframe,
// pushing views, pumping the main loop, reading and driving widgets, the back
// and more keys, posted notices, log lines and a PNG of the window.
#pragma once

#include "WGenlistItem.h"
#include "WNaviframe.h"
#include "WView.h"
#include "WWindow.h"

#include <Elementary.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace ct::test {

class ScreenHarness {
public:
	static constexpr int kWidth = 480;
	static constexpr int kHeight = 800;

	explicit ScreenHarness(int width = kWidth, int height = kHeight);
	// Destroys the naviframe (and so every pushed view), then the window.
	~ScreenHarness();
	ScreenHarness(const ScreenHarness&) = delete;
	ScreenHarness& operator=(const ScreenHarness&) = delete;

	app_assist::WWindow& window() { return *m_window; }
	Evas_Object* win() const { return m_window->getEvasObj(); }
	app_assist::WNaviframe* naviframe() const { return m_naviframe; }

	// Pushes `view` (the naviframe owns it) and pumps until idle.
	bool push(app_assist::WView* view, const char* name = nullptr, void* param = nullptr);
	app_assist::WView* topView() const;
	int viewCount() const;

	// Runs the main loop until nothing was drawn for a few frames (at most
	// `maxSeconds`). Returns false when it never settled.
	bool pumpUntilIdle(double maxSeconds = 3.0);
	// Runs the main loop for `frames` animation frames.
	void pumpFrames(int frames);
	void pumpFor(double seconds);
	// Runs the main loop until `done` holds (at most `maxSeconds`); returns
	// whether it holds. Prefer this to pumpFor when waiting for something.
	bool pumpUntil(const std::function<bool()>& done, double maxSeconds = 5.0);

	// Hardware keys, fed to the window's canvas as the device would.
	void sendBackKey();
	void sendMoreKey();

	// The on-screen keypad stand-in: raised while an entry takes input;
	// these raise and lower it as the person would, then pump until idle.
	void raiseKeypad();
	void lowerKeypad();
	bool isKeypadShown() const;

	// Widgets anywhere on the window (popups included), top-most first;
	// `type` is the widget class name such as "Elm_Genlist".
	std::vector<Evas_Object*> findWidgets(const char* type) const;
	Evas_Object* findGenlist() const;
	// The shown button whose label is `label` (null when none).
	Evas_Object* findButton(const std::string& label) const;
	std::vector<std::string> buttonLabels() const;

	static std::vector<Elm_Object_Item*> genlistItems(Evas_Object* genlist);
	// Rows of class `Row` (or derived), in list order.
	template <class Row>
	static std::vector<Row*> rowsOf(Evas_Object* genlist);
	// Rows of class `Row` for which `pred(row)` holds, e.g. rows of one kind.
	template <class Row, class Pred>
	static std::vector<Row*> rowsWhere(Evas_Object* genlist, Pred pred);
	static std::string itemStyle(Elm_Object_Item* item);
	// The item class's text for `part`, realized or not ("" when none).
	static std::string itemText(Elm_Object_Item* item, const char* part);
	static void selectItem(Elm_Object_Item* item);

	// A text part of a view's naviframe item ("elm.text.title" is its title).
	static std::string naviText(app_assist::WView* view, const char* part = "elm.text.title");

	static std::string buttonLabel(Evas_Object* button);
	static bool isDisabled(Evas_Object* obj);
	// Taps the button; a disabled one ignores it. Returns whether it fired.
	static bool click(Evas_Object* button);

	// Notices posted through the notification service, oldest first.
	static std::vector<std::string> notices();
	static void clearNotices();
	static bool logContains(const std::string& needle);

	// Renders the window and writes it as a PNG. Returns success.
	bool savePng(const std::string& path) const;

private:
	template <class Done>
	bool __runUntil(Done done, double maxSeconds);
	void __feedKey(const char* key);

	std::unique_ptr<app_assist::WWindow> m_window;
	app_assist::WNaviframe* m_naviframe = nullptr;
	std::weak_ptr<app_assist::WControl> m_naviframeAlive;
};

template <class Row>
std::vector<Row*> ScreenHarness::rowsOf(Evas_Object* genlist)
{
	std::vector<Row*> rows;
	for (Elm_Object_Item* item : genlistItems(genlist)) {
		auto* base = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
		if (auto* row = dynamic_cast<Row*>(base))
			rows.push_back(row);
	}
	return rows;
}

template <class Row, class Pred>
std::vector<Row*> ScreenHarness::rowsWhere(Evas_Object* genlist, Pred pred)
{
	std::vector<Row*> rows;
	for (Row* row : rowsOf<Row>(genlist)) {
		if (pred(row))
			rows.push_back(row);
	}
	return rows;
}

} // namespace ct::test
