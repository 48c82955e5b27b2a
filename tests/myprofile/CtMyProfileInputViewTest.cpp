// The profile editor: title and Done by whether a profile is stored and
// filled, rows the wizard adds for shared fields, the more popup waiting for
// the keypad, the lunar calendar by country, and a save that fails in the
// store keeping the form and what was typed.
#include "../sharing/SharingScreenTest.h"

#include "CtCommonTextUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewEventItem.h"
#include "CtInputViewImportantFieldsItem.h"
#include "CtInputViewMsisdnItem.h"
#include "CtInputViewMultiImageItem.h"
#include "CtInputViewNumberItem.h"
#include "CtInputViewStatusItem.h"
#include "CtProfileSettingKeys.h"
#include "CtMyProfileDatePopup.h"
#include "CtMyProfileInputView.h"

#include <sqlite3.h>
#include <velmora_log_manager.h>

using namespace ct::test;

namespace {

using Kind = CtMyProfileInputView::RowKind;

std::string storedFirstName()
{
	contacts_list_h list = nullptr;
	int id = 0;
	if (contacts_db_get_all_records(_contacts_my_profile._uri, 0, 0, &list) == CONTACTS_ERROR_NONE) {
		contacts_record_h profile = nullptr;
		if (contacts_list_get_current_record_p(list, &profile) == CONTACTS_ERROR_NONE && profile)
			contacts_record_get_int(profile, _contacts_my_profile.id, &id);
		contacts_list_destroy(list, true);
	}
	contacts_record_h profile = nullptr, name = nullptr;
	if (id < 1 || contacts_db_get_record(_contacts_my_profile._uri, id, &profile) != CONTACTS_ERROR_NONE)
		return "";
	char* text = nullptr;
	std::string first;
	if (contacts_record_get_child_record_at_p(profile, _contacts_my_profile.name, 0, &name) == CONTACTS_ERROR_NONE
			&& contacts_record_get_str_p(name, _contacts_name.first, &text) == CONTACTS_ERROR_NONE && text)
		first = text;
	contacts_record_destroy(profile, true);
	return first;
}

} // namespace

class CtMyProfileInputViewTest : public SharingScreenTest {
protected:
	CtMyProfileInputView* show(CtMyProfileInputView* view)
	{
		EXPECT_TRUE(m_screen->push(view));
		m_screen->pumpUntilIdle();
		return view;
	}
	CtMyProfileInputView* showEditor() { return show(new CtMyProfileInputView(nullptr, nullptr)); }
	CtMyProfileInputView* showWizardEditor() { return show(new CtMyProfileInputView([](void*) {}, nullptr)); }

	static Evas_Object* nameEntry(CtMyProfileInputView* view)
	{
		auto rows = ScreenHarness::rowsOf<CtInputViewBasicInfoItem>(view->getGenlist());
		return rows.empty() ? nullptr : rows[0]->getFieldEntry(CtInputViewBasicInfoItem::NAME);
	}
	void type(Evas_Object* entry, const char* text)
	{
		elm_entry_entry_insert(entry, ctCommonUtf8ToMarkup(text).c_str());
		m_screen->pumpUntilIdle();
	}
	static Evas_Object* addFieldButton(CtMyProfileInputView* view, CtInputViewImportantFieldsItem::Button button)
	{
		auto rows = ScreenHarness::rowsOf<CtInputViewImportantFieldsItem>(view->getGenlist());
		return rows.empty() ? nullptr : rows[0]->getButton(button);
	}
	// The rows of the popup's list, as texts.
	std::vector<std::string> popupRows()
	{
		std::vector<std::string> texts;
		std::vector<Evas_Object*> lists = m_screen->findWidgets("Elm_Genlist");
		if (lists.empty())
			return texts;
		for (Elm_Object_Item* item : ScreenHarness::genlistItems(lists.front()))
			texts.push_back(ScreenHarness::itemText(item, "elm.text.main.left"));
		return texts;
	}
	void choosePopupRow(size_t index)
	{
		std::vector<Evas_Object*> lists = m_screen->findWidgets("Elm_Genlist");
		ASSERT_FALSE(lists.empty());
		std::vector<Elm_Object_Item*> items = ScreenHarness::genlistItems(lists.front());
		ASSERT_LT(index, items.size());
		ScreenHarness::selectItem(items[index]);
		m_screen->pumpUntilIdle();
	}
	static void shareOnly(int property)
	{
		for (int p = CT_PROFILE_PROPERTY_EMAIL; p < CT_PROFILE_PROPERTY_MAX; ++p)
			CtContactsAgentMgr::getInstance()->setProfileProperty(static_cast<CtProfileProperty>(p), p == property);
	}
	// Makes every write of the profile fail in the store, as a full disk would.
	void failProfileWrites(bool fail)
	{
		sqlite3* db = nullptr;
		ASSERT_EQ(SQLITE_OK, sqlite3_open(m_dir.file("contacts.db").c_str(), &db));
		const char* sql = fail
			? "CREATE TRIGGER fail_insert BEFORE INSERT ON my_profiles BEGIN SELECT RAISE(ABORT, 'disk full'); END;"
			  "CREATE TRIGGER fail_update BEFORE UPDATE ON my_profiles BEGIN SELECT RAISE(ABORT, 'disk full'); END;"
			: "DROP TRIGGER fail_insert; DROP TRIGGER fail_update;";
		EXPECT_EQ(SQLITE_OK, sqlite3_exec(db, sql, nullptr, nullptr, nullptr));
		sqlite3_close(db);
	}
};

TEST_F(CtMyProfileInputViewTest, TitleAndDoneFollowWhetherAProfileIsStoredAndFilled)
{
	struct Case {
		bool stored;
		const char* title;
		bool doneDisabled;
	};
	for (const Case& c : {Case{false, "Create profile", true}, Case{true, "Edit", false}}) {
		SCOPED_TRACE(c.title);
		removeProfiles();
		if (c.stored)
			storeProfile(newProfile("Ann"));
		CtMyProfileInputView* view = showEditor();
		EXPECT_EQ(c.title, ScreenHarness::naviText(view));
		EXPECT_EQ(!c.stored, view->isNewProfile());
		EXPECT_EQ(c.doneDisabled, ScreenHarness::isDisabled(view->getDoneButton()));
		ASSERT_NE(nullptr, view->getFirstItem(CtMyProfileInputView::MYPROFILE_INPUT_IMAGE));
		ASSERT_NE(nullptr, view->getFirstItem(CtMyProfileInputView::MYPROFILE_INPUT_ADD_FIELD));
		if (!c.stored) {
			shot("editor-new");
			type(nameEntry(view), "A");
			EXPECT_FALSE(ScreenHarness::isDisabled(view->getDoneButton()));
			elm_entry_entry_set(nameEntry(view), "");
			m_screen->pumpUntilIdle();
			EXPECT_TRUE(ScreenHarness::isDisabled(view->getDoneButton()));
		}
		EXPECT_TRUE(ScreenHarness::click(m_screen->findButton("Cancel")));
		m_screen->pumpUntilIdle();
		EXPECT_EQ(0, m_screen->viewCount()) << "nothing to discard";
	}
}

TEST_F(CtMyProfileInputViewTest, WizardAddsAnEmptyRowForEachSharedField)
{
	struct Case {
		int property;
		Kind kind;
		const char* name;
	};
	const Case cases[] = {
		{CT_PROFILE_PROPERTY_EMAIL, CtMyProfileInputView::MYPROFILE_INPUT_EMAIL, "email"},
		{CT_PROFILE_PROPERTY_ADDRESS, CtMyProfileInputView::MYPROFILE_INPUT_ADDRESS, "address"},
		{CT_PROFILE_PROPERTY_BIRTHDAY, CtMyProfileInputView::MYPROFILE_INPUT_EVENT, "birthday"},
	};
	const Kind sharedKinds[] = {CtMyProfileInputView::MYPROFILE_INPUT_EMAIL, CtMyProfileInputView::MYPROFILE_INPUT_ADDRESS,
		CtMyProfileInputView::MYPROFILE_INPUT_EVENT};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		shareOnly(c.property);
		CtMyProfileInputView* plain = showEditor();
		EXPECT_EQ(nullptr, plain->getFirstItem(c.kind)) << "only the wizard adds rows";
		plain->destroy();
		CtMyProfileInputView* view = showWizardEditor();
		EXPECT_EQ("Create profile", ScreenHarness::naviText(view));
		for (Kind kind : sharedKinds)
			EXPECT_EQ(kind == c.kind, view->getFirstItem(kind) != nullptr) << kind;
		Elm_Object_Item* added = view->getFirstItem(c.kind);
		ASSERT_NE(nullptr, added);
		auto* row = dynamic_cast<CtInputViewGenlistItem*>(static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(added)));
		EXPECT_TRUE(row->getIsEmpty());
		EXPECT_FALSE(row->getIsChanged());
		EXPECT_TRUE(ScreenHarness::isDisabled(view->getDoneButton()));
		view->destroy();
		m_screen->pumpUntilIdle();
	}
	shareOnly(CT_PROFILE_PROPERTY_ORGANIZATION);
	CtMyProfileInputView* view = showWizardEditor();
	auto basic = ScreenHarness::rowsOf<CtInputViewBasicInfoItem>(view->getGenlist());
	ASSERT_EQ(1u, basic.size());
	EXPECT_TRUE(basic[0]->getOrganisationShown());
	EXPECT_NE(nullptr, basic[0]->getFieldEntry(CtInputViewBasicInfoItem::COMPANY));
}

TEST_F(CtMyProfileInputViewTest, MoreWhileTheKeypadIsUpOpensOnceItCloses)
{
	CtMyProfileInputView* view = showEditor();
	m_screen->raiseKeypad();
	ASSERT_TRUE(m_screen->isKeypadShown());
	EXPECT_TRUE(ScreenHarness::click(addFieldButton(view, CtInputViewImportantFieldsItem::MORE)));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, view->getPopup());
	m_screen->lowerKeypad();
	ASSERT_NE(nullptr, view->getPopup());
	EXPECT_EQ((std::vector<std::string>{"Address", "Event", "Nickname", "Organisation", "Website", "IM account",
		"Phonetic name"}), popupRows());
	shot("editor-more");
	choosePopupRow(2);
	EXPECT_EQ(nullptr, view->getPopup());
	auto basic = ScreenHarness::rowsOf<CtInputViewBasicInfoItem>(view->getGenlist());
	EXPECT_TRUE(basic[0]->getNicknameShown());
	EXPECT_TRUE(m_screen->pumpUntil([&] { return m_screen->isKeypadShown(); })) << "the nickname takes the focus";
	m_screen->lowerKeypad();
	EXPECT_TRUE(ScreenHarness::click(addFieldButton(view, CtInputViewImportantFieldsItem::MORE)));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(6u, popupRows().size()) << "a shown nickname is not offered again";
}

TEST_F(CtMyProfileInputViewTest, EventDateOffersTheLunarCalendarByCountry)
{
	struct Case {
		const char* country;
		bool lunar;
	};
	for (const Case& c : {Case{"KR", true}, Case{"CN", true}, Case{"US", false}, Case{"", false}}) {
		SCOPED_TRACE(c.country);
		vconf_set_str(VCONFKEY_CSC_COUNTRY_ISO, c.country);
		CtMyProfileInputView* view = showEditor();
		EXPECT_EQ(c.lunar, view->isLunarAllowed());
		EXPECT_TRUE(ScreenHarness::click(addFieldButton(view, CtInputViewImportantFieldsItem::MORE)));
		m_screen->pumpUntilIdle();
		choosePopupRow(1);
		auto* popup = dynamic_cast<CtMyProfileDatePopup*>(view->getPopup());
		ASSERT_NE(nullptr, popup);
		EXPECT_EQ(c.lunar, popup->getCalendarButton() != nullptr);
		int solarDate = popup->getDate();
		if (c.lunar) {
			EXPECT_EQ("Solar", ScreenHarness::buttonLabel(popup->getCalendarButton()));
			EXPECT_TRUE(ScreenHarness::click(popup->getCalendarButton()));
			EXPECT_EQ("Lunar", ScreenHarness::buttonLabel(popup->getCalendarButton()));
			EXPECT_LT(popup->getDate(), solarDate) << "the lunar calendar runs behind";
			if (std::string(c.country) == "KR")
				shot("editor-date-lunar");
		} else {
			shot("editor-date");
		}
		int shownDate = popup->getDate();
		EXPECT_TRUE(ScreenHarness::click(m_screen->findButton("Set")));
		m_screen->pumpUntilIdle();
		auto events = ScreenHarness::rowsOf<CtInputViewEventItem>(view->getGenlist());
		ASSERT_EQ(1u, events.size());
		EXPECT_EQ(c.lunar ? 1 : 0, view->getInputData()->getCalendarType(events[0]->getRecord()));
		EXPECT_EQ(shownDate, view->getInputData()->getEventEvent(events[0]->getRecord()));
		EXPECT_FALSE(ScreenHarness::isDisabled(view->getDoneButton()));
		view->destroy();
		m_screen->pumpUntilIdle();
	}
}

TEST_F(CtMyProfileInputViewTest, FailedSaveKeepsTheFormAndTheTypedText)
{
	struct Case {
		bool stored;
		ctRegistryKey signal;
	};
	for (const Case& c : {Case{false, CT_REGISTRY_KEY_CONTACT_DATA_CHANGED}, Case{true, CT_REGISTRY_KEY_PROFILE_SAVED}}) {
		SCOPED_TRACE(c.stored ? "update" : "insert");
		removeProfiles();
		preference_remove_all();
		ScreenHarness::clearNotices();
		if (c.stored)
			storeProfile(newProfile("Ann"));
		CtMyProfileInputView* view = showEditor();
		Evas_Object* entry = nameEntry(view);
		elm_entry_cursor_end_set(entry);
		type(entry, c.stored ? "e" : "Bo");
		const std::string typed = c.stored ? "Anne" : "Bo";
		SignalRecorder signals;
		size_t updates = usage("CT13").size();

		failProfileWrites(true);
		EXPECT_TRUE(ScreenHarness::click(view->getDoneButton()));
		m_screen->pumpUntilIdle();
		EXPECT_EQ(1, m_screen->viewCount());
		EXPECT_EQ((std::vector<std::string>{"Failed to save profile. Try again."}), ScreenHarness::notices());
		EXPECT_EQ(typed, CtInputViewGenlistItem::getEntryUtf8(nameEntry(view)));
		EXPECT_FALSE(ScreenHarness::isDisabled(m_screen->findButton("Cancel")));
		EXPECT_EQ(c.stored ? "Ann" : "", storedFirstName());
		EXPECT_TRUE(signals.signals.empty());
		EXPECT_EQ(updates, usage("CT13").size());

		failProfileWrites(false);
		EXPECT_TRUE(ScreenHarness::click(view->getDoneButton()));
		m_screen->pumpUntilIdle();
		EXPECT_EQ(0, m_screen->viewCount());
		EXPECT_EQ(typed, storedFirstName());
		EXPECT_EQ(1, profileCount());
		EXPECT_EQ(1, signals.count(c.signal));
		bool hasInfo = false;
		EXPECT_EQ(0, preference_get_boolean("has_myprofile_info", &hasInfo));
		EXPECT_TRUE(hasInfo);
		EXPECT_EQ(updates + 1, usage("CT13").size());
	}
}

TEST_F(CtMyProfileInputViewTest, PicturesGoToTheTappedPlaceAndCanBeRemoved)
{
	std::vector<std::string> replies = {writePicture("red.png", 220, 40, 40), writePicture("blue.png", 40, 60, 220)};
	size_t next = 0;
	ct::appcontrol::Registration gallery = ct::appcontrol::registerAppHandler(GALLERY_APP_ID,
		[&](app_control_h, const ct::appcontrol::Reply& reply) {
			app_control_h data = nullptr;
			app_control_create(&data);
			const char* selected[] = {replies[next++ % replies.size()].c_str()};
			app_control_add_extra_data_array(data, APP_CONTROL_DATA_SELECTED, selected, 1);
			reply(data, APP_CONTROL_RESULT_SUCCEEDED);
			app_control_destroy(data);
			return 0;
		});
	CtMyProfileInputView* view = showEditor();
	auto tap = [&](int order, size_t action) {
		auto rows = ScreenHarness::rowsOf<CtInputViewMultiImageItem>(view->getGenlist());
		ASSERT_EQ(1u, rows.size());
		rows[0]->tapPicture(order);
		m_screen->pumpUntilIdle();
		std::vector<std::string> actions = popupRows();
		EXPECT_EQ(view->getInputData()->getImagePath(order) ? 4u : 3u, actions.size()) << order;
		ASSERT_LT(action, actions.size());
		int before = view->getInputData()->getImageCount();
		choosePopupRow(action);
		EXPECT_TRUE(m_screen->pumpUntil([&] { return view->getInputData()->getImageCount() != before; }));
	};
	auto path = [&](int order) {
		const char* stored = view->getInputData()->getImagePath(order);
		return std::string(stored ? stored : "");
	};
	const std::vector<std::string> withRemove = {"From Gallery", "Take picture", "From preset styles", "Remove"};
	tap(1, 0);
	EXPECT_EQ(1, view->getInputData()->getImageCount());
	EXPECT_FALSE(ScreenHarness::isDisabled(view->getDoneButton())) << "a picture alone can be saved";
	tap(2, 0);
	EXPECT_EQ(replies[1], path(2));
	auto rows = ScreenHarness::rowsOf<CtInputViewMultiImageItem>(view->getGenlist());
	rows[0]->tapPicture(1);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(withRemove, popupRows());
	shot("editor-pictures-popup");
	choosePopupRow(3);
	EXPECT_EQ(1, view->getInputData()->getImageCount());
	EXPECT_EQ(replies[1], path(1)) << "the pictures after a removed one move up";
	shot("editor-pictures");

	EXPECT_TRUE(ScreenHarness::click(view->getDoneButton()));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(0, m_screen->viewCount());
	std::vector<std::string> extras;
	for (const ct::usagelog::Record& record : usage("CT13"))
		extras.push_back(record.extra);
	EXPECT_EQ((std::vector<std::string>{"Update", "Update multi image"}), extras);
	auto status = usage("CT23");
	ASSERT_EQ(1u, status.size());
	EXPECT_EQ("1 image", status[0].extra);
	EXPECT_EQ(USAGE_LOG_STATUS_URI, status[0].uri);
}

TEST_F(CtMyProfileInputViewTest, StatusRowAndSyncFollowEasySignUpAndTheOwnNumberStandsApart)
{
	contacts_record_h profile = newProfile("Ann");
	addProfileNumber(profile, "01012345678", true, "sim_card_number");
	addProfileNumber(profile, "0209999");
	storeProfile(profile);
	struct Case {
		bool signUp;
		bool statusRow;
		size_t syncs;
	};
	for (const Case& c : {Case{false, false, 0}, Case{true, true, 2}}) {
		SCOPED_TRACE(c.signUp);
		if (c.signUp)
			setenv("CONTACTS_FEATURES", "13", 1);
		preference_set_int(CT_PREF_EASY_SIGNUP_STATUS, c.signUp ? 1 : 0);
		CtContactsAgentMgr::getInstance()->clearSyncRequests();
		CtMyProfileInputView* view = showEditor();
		EXPECT_EQ(1u, ScreenHarness::rowsOf<CtInputViewMsisdnItem>(view->getGenlist()).size());
		auto numbers = ScreenHarness::rowsOf<CtInputViewNumberItem>(view->getGenlist());
		ASSERT_EQ(1u, numbers.size()) << "the own number is not among the numbers";
		EXPECT_EQ("0209999", CtInputViewGenlistItem::getEntryUtf8(numbers[0]->getEntry()));
		auto status = ScreenHarness::rowsOf<CtInputViewStatusItem>(view->getGenlist());
		ASSERT_EQ(c.statusRow ? 1u : 0u, status.size());
		if (c.statusRow) {
			shot("editor-status");
			type(status[0]->getEntry(), "On holiday");
		}
		EXPECT_TRUE(ScreenHarness::click(view->getDoneButton()));
		m_screen->pumpUntilIdle();
		EXPECT_EQ(0, m_screen->viewCount());
		EXPECT_EQ(c.syncs, CtContactsAgentMgr::getInstance()->getSyncRequests().size());
		auto updates = usage("CT13");
		EXPECT_EQ(c.statusRow ? 1 : 0, std::count_if(updates.begin(), updates.end(),
			[](const ct::usagelog::Record& r) { return r.extra == "Update status message"; }));
		unsetenv("CONTACTS_FEATURES");
	}
}
