// Every screen the library exports, made through its factory. The soak, the
// hostile-input tests and the factory fuzz target walk this table: a new
// screen is one line here.
#pragma once

#include "ContactsDetails.h"
#include "CtGalSearchData.h"

#include <contacts.h>

#include <vector>

namespace ct::test {

// A new record of the contact shown for `personId`, for a factory that takes
// it over; null when there is no such person.
inline contacts_record_h contactOfPerson(int personId)
{
	contacts_record_h person = nullptr;
	if (personId < 1 || contacts_db_get_record(_contacts_person._uri, personId, &person) != CONTACTS_ERROR_NONE)
		return nullptr;
	int contactId = 0;
	contacts_record_get_int(person, _contacts_person.display_contact_id, &contactId);
	contacts_record_destroy(person, true);
	contacts_record_h contact = nullptr;
	if (contacts_db_get_record(_contacts_contact._uri, contactId, &contact) != CONTACTS_ERROR_NONE)
		return nullptr;
	return contact;
}

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
		{ "createCtMyProfileDetailView", [](const ScreenInputs&) { return createCtMyProfileDetailView(); } },
		{ "createCtProfileWizardView", [](const ScreenInputs&) { return createCtProfileWizardView(); } },
		{ "createCtMyProfileInputView", [](const ScreenInputs& in) { return createCtMyProfileInputView(nullptr, in.request); } },
	};
	return screens;
}

} // namespace ct::test
