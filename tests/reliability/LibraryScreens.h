// Every screen the library exports, made through its factory. The soak, the
// hostile-input tests and the factory fuzz target walk this table: a new
// screen is one line here.
#pragma once

#include "ContactsDetails.h"
#include "CtGalSearchData.h"

#include <contacts.h>

#include <vector>

namespace ct::test {

// What a factory may be given; each line takes what its factory needs.
struct ScreenInputs {
	int personId = 0;
	CtLaunchRequest* request = nullptr;
	contacts_record_h record = nullptr;   // given away to the factory that takes it
	const CtGalSearchData* galData = nullptr;
};

struct LibraryScreen {
	const char* factory; // the exported name
	app_assist::WView* (*make)(const ScreenInputs& in);
	bool takesRecord = false; // the factory owns ScreenInputs::record from then on
};

inline const std::vector<LibraryScreen>& libraryScreens()
{
	static const std::vector<LibraryScreen> screens = {
		{ "createCtDetailView", [](const ScreenInputs& in) { return createCtDetailView(in.personId, in.request); } },
		{ "createCtDetailViewForGalSearch",
			[](const ScreenInputs& in) { return createCtDetailViewForGalSearch(const_cast<CtGalSearchData*>(in.galData)); } },
		{ "createCtShareContactView", [](const ScreenInputs& in) { return createCtShareContactView(in.personId, in.request); } },
		// The form takes the record over.
		{ "createCtInputView", [](const ScreenInputs& in) { return createCtInputView(in.record, in.request); }, true },
		{ "createCtInputViewForEditAppControl",
			[](const ScreenInputs& in) { return createCtInputViewForEditAppControl(in.request); } },
	};
	return screens;
}

} // namespace ct::test
