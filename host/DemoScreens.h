// The screens contacts-demo can open by name (--screen NAME), each made
// through the library's own exports.
#pragma once

#include "DetailsLibrary.h"

#include <Evas.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace app_assist {
class WView;
}

namespace ct::demo {

struct DemoScreenContext {
	const DetailsLibrary& library;
	int personId = 0;   // 0: none given
	// Requests and records a screen keeps pointers to; kept until the host ends.
	std::vector<std::shared_ptr<void>>& keepAlive;
};

struct DemoScreen {
	const char* name;
	bool needsPerson;
	const char* description;
	// The new view, or null when this build's library lacks its export.
	std::function<app_assist::WView*(DemoScreenContext&)> make;
	// Screens reached from another one: what a person does on the pushed
	// screen (a tap, a key) on the window `win` to get there; may be empty.
	std::function<void(Evas_Object* win)> reach = nullptr;
};

// Every screen, in the order the usage text lists them.
const std::vector<DemoScreen>& demoScreens();
// Null for an unknown name.
const DemoScreen* findDemoScreen(const std::string& name);

} // namespace ct::demo
