// contacts-demo: the host application. Opens (or creates) the demo store,
// loads the detail library, shows the person list in a 360x640 window titled
// "Contacts" and pushes a person's detail screen when one is chosen; or,
// headless, saves pictures of screens and exits.
#pragma once

#include "DemoAppControlHandlers.h"
#include "DemoDatabase.h"
#include "DemoOptions.h"
#include "DemoScreens.h"
#include "DetailsLibrary.h"
#include "WNaviframe.h"
#include "WWindow.h"

#include <memory>
#include <string>
#include <vector>

namespace ct::demo {

class PersonListView;

class DemoApp {
public:
	static constexpr int kWidth = 360;
	static constexpr int kHeight = 640;

	explicit DemoApp(DemoOptions options);
	// Destroys the screens, then the window; the library goes last.
	~DemoApp();
	DemoApp(const DemoApp&) = delete;
	DemoApp& operator=(const DemoApp&) = delete;

	// Runs what the options ask for. Returns the process exit code.
	int run();

private:
	bool __start();
	int __runWindow();
	int __printPersons();
	int __saveScreenshot(const std::string& path);
	// Opens what --person and --screen ask for; false (with a message) when it cannot.
	bool __openRequestedScreen();
	bool __pushScreen(const DemoScreen& screen, int personId);
	// Runs the main loop for `seconds`, so changes made by other programs arrive.
	void __hold(double seconds);
	int __saveScreenshots(const std::string& dir);
	// Pushes the detail screen of `personId`; false (with a notice) without one.
	bool __openPerson(int personId);
	void __popToList();
	bool __settle(double maxSeconds = 5.0);
	bool __save(const std::string& path);
	PersonListView* __list() const;
	const char* __topScreenName() const;

	DemoOptions m_options;
	DemoDatabase m_database;
	DetailsLibrary m_library;
	std::unique_ptr<DemoAppControlHandlers> m_handlers;
	std::vector<std::shared_ptr<void>> m_keepAlive;
	std::unique_ptr<app_assist::WWindow> m_window;
	app_assist::WNaviframe* m_naviframe = nullptr;
	std::weak_ptr<app_assist::WControl> m_naviframeAlive;
	bool m_pushing = false;
	std::weak_ptr<app_assist::WControl> m_listAlive;
};

} // namespace ct::demo
