// The screens a person can open in this build: every library screen of
// LibraryScreens.h, then the host's own person list.
#pragma once

#include "LibraryScreens.h"
#include "PersonListView.h"

#include <functional>
#include <string>
#include <vector>

namespace ct::test {

struct OpenableScreen {
	std::string name;
	std::function<app_assist::WView*()> make;
};

inline std::vector<OpenableScreen> openableScreens(const ScreenInputs& in)
{
	std::vector<OpenableScreen> screens;
	for (const LibraryScreen& screen : libraryScreens())
		screens.push_back({ screen.factory, [screen, in] {
			// A factory that takes a record gets the stored person's contact each time.
			ScreenInputs made = in;
			if (screen.takesRecord)
				made.record = contactOfPerson(in.personId);
			return screen.make(made);
		} });
	screens.push_back({ "host person list", [] { return new ct::demo::PersonListView([](int) {}); } });
	return screens;
}

} // namespace ct::test
