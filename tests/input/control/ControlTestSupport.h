// The edit form's list control, headless: the form pushed on a fresh store,
// its rows read back by kind, the add-field popup read as a person sees it,
// and stand-in applications answering the control's requests through the
// app-control router.
#pragma once

#include "../../data/input/InputTestStore.h"

#include "AppControlRouter.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "CtInputView.h"
#include "CtInputViewControl.h"
#include "CtInputViewGenlistItem.h"
#include "CtView.h"
#include "ScreenHarness.h"

#include <app_preference.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace ct::test {

// The answer to one request a stand-in application received (what was sent
// is in appcontrol::launches()).
using Received = appcontrol::Reply;

class InputControlTest : public InputStoreTest {
protected:
	void SetUp() override;
	void TearDown() override;

	// Pushes the form for `contactId` (0: a new contact), pumped until idle
	// unless `settle` is false (then the naviframe only pushed it).
	CtInputViewControl* open(int contactId, CtLaunchRequest* request = nullptr, bool settle = true);
	CtInputViewControl* control() const;
	// Ends the form (no question asked) and pumps.
	void close();
	Evas_Object* genlist() const { return control() ? control()->getGenlist() : nullptr; }
	// The kinds of the rows in list order ("basic", "number", "email", ...).
	std::vector<std::string> kinds() const;
	CtInputViewGenlistItem* rowAt(const std::string& kind, int index = 0) const;
	Elm_Object_Item* itemAt(const std::string& kind, int index = 0) const;

	// Taps the more button as a person would (the tap takes the focus from
	// the name entry, so the keypad goes down) and pumps.
	void openMorePopup();
	// The add buttons of the important-fields row (0 number, 1 e-mail, 2 note, 3 more).
	Evas_Object* addButton(int button) const;
	// The shown popup list other than the form (null when none).
	Evas_Object* popupList() const;
	// Its rows: label and whether it is disabled.
	std::vector<std::pair<std::string, bool>> popupRows() const;
	// The main text of the shown popup ("" when none).
	std::string popupText() const;
	// Taps the popup row labelled `label`; false when there is none.
	bool choosePopupRow(const std::string& label);
	static std::string tr(const char* id) { return ContactsCommon::translate(id); }

	// Registers a stand-in for `appId` that keeps each request for the test.
	void standIn(const std::string& appId);
	// Answers the newest request to `appId` with `extras` (one-element arrays
	// for keys in `arrays`) and `result`, then pumps.
	void answer(const std::string& appId, const std::map<std::string, std::string>& extras,
			const std::vector<std::string>& arrays = {}, app_control_result_e result = APP_CONTROL_RESULT_SUCCEEDED);
	std::vector<Received>& received(const std::string& appId) { return m_received[appId]; }

	std::unique_ptr<ScreenHarness> m_screen;
	CtInputView* m_view = nullptr;
	std::weak_ptr<app_assist::WControl> m_viewAlive;
	std::map<std::string, std::vector<Received>> m_received;
	std::vector<appcontrol::Registration> m_registrations;
	std::string m_previousLocale;
};

} // namespace ct::test
