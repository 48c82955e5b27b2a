// The create/edit form, headless: its title and buttons, what leaving asks,
// the save with its checks and replies, and what is shown after it.
#include "../../data/input/InputTestStore.h"

#include "ContactsCommon.h"
#include "ContactsDetails.h"
#include "CtCommonAddressbookUtil.h"
#include "CtData.h"
#include "CtDetailView.h"
#include "CtInputView.h"
#include "CtInputViewNumberItem.h"
#include "CtView.h"
#include "ScreenHarness.h"
#include "SqliteFaultInjector.h"
#include "UiGadget.h"
#include "AppControlRouter.h"
#include "ContactsAppIds.h"

#include <app_preference.h>
#include <vconf.h>

#include <filesystem>
#include <fstream>

using namespace ct::test;

namespace {

std::string tr(const char* id)
{
	return ContactsCommon::translate(id);
}

std::string shotPath(const std::string& file)
{
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/input";
	std::filesystem::create_directories(dir);
	return dir + "/" + file;
}

int countContactsNamed(const char* name)
{
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	contacts_query_create(_contacts_contact._uri, &query);
	contacts_filter_create(_contacts_contact._uri, &filter);
	contacts_filter_add_str(filter, _contacts_contact.display_name, CONTACTS_MATCH_EXACTLY, name);
	contacts_query_set_filter(query, filter);
	int count = 0;
	contacts_db_get_count_with_query(query, &count);
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	return count;
}

int contactIdNamed(const char* name)
{
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	contacts_list_h list = nullptr;
	contacts_query_create(_contacts_contact._uri, &query);
	contacts_filter_create(_contacts_contact._uri, &filter);
	contacts_filter_add_str(filter, _contacts_contact.display_name, CONTACTS_MATCH_EXACTLY, name);
	contacts_query_set_filter(query, filter);
	int id = 0;
	if (contacts_db_get_records_with_query(query, 0, 1, &list) == CONTACTS_ERROR_NONE) {
		contacts_record_h first = nullptr;
		if (contacts_list_get_current_record_p(list, &first) == CONTACTS_ERROR_NONE && first)
			contacts_record_get_int(first, _contacts_contact.id, &id);
		contacts_list_destroy(list, true);
	}
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	return id;
}

std::string preferenceText(const char* key)
{
	char* value = nullptr;
	preference_get_string(key, &value);
	std::string text = value ? value : "";
	free(value);
	return text;
}

// A launch request as a UI-gadget caller makes it; the test owns it.
struct GadgetLaunch {
	explicit GadgetLaunch(const char* operation) : owned(request(operation)), gadget("contacts-input")
	{
		launch.ug = gadget.handle();
		launch.appControl = owned.get();
		launch.callerAppId = "org.velmora.dialer";
	}
	Request owned;
	ct::ug::UiGadget gadget;
	CtLaunchRequest launch;
};

class CtInputViewTest : public InputStoreTest {
protected:
	void SetUp() override
	{
		InputStoreTest::SetUp();
		CtView::changeLanguage("en_US.UTF-8");
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		preference_set_boolean("hide_storage_popup", true);
		ScreenHarness::clearNotices();
		m_screen = std::make_unique<ScreenHarness>();
	}
	void TearDown() override
	{
		m_screen.reset();
		preference_close_store();
		// The settings store stays open: it follows the next test's data folder
		// with its listeners, which the application's singletons registered once.
		StoreTest::TearDown();
	}

	CtInputView* open(app_assist::WView* view)
	{
		auto* input = dynamic_cast<CtInputView*>(view);
		EXPECT_TRUE(input);
		EXPECT_TRUE(m_screen->push(view));
		return input;
	}

	// What the rows do as the person types a name: the contact takes it and
	// the view hears that the form is no longer empty.
	static void typeName(CtInputView* view, const char* name)
	{
		view->getData()->setFullName(name);
		view->updateSaveBtn(false);
	}

	bool pressDone(CtInputView* view)
	{
		bool fired = ScreenHarness::click(view->getDoneButton());
		m_screen->pumpUntilIdle();
		return fired;
	}

	std::string popupTitle() const
	{
		std::vector<Evas_Object*> popups = m_screen->findWidgets("Elm_Popup");
		if (popups.empty())
			return "";
		const char* title = elm_object_part_text_get(popups.front(), "title,text");
		return title ? title : "";
	}

	bool leaves()
	{
		return m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; });
	}

	// Types at the end of the form's first number row, as a person would:
	// the entry takes the focus, and with it the keypad comes up.
	static std::vector<CtInputViewNumberItem*> numberRows(CtInputView* view)
	{
		Evas_Object* genlist = elm_object_part_content_get(view->getLayout(), "elm.swallow.content");
		return ScreenHarness::rowsOf<CtInputViewNumberItem>(genlist);
	}

	// Whether the form lists rows (the list control may not be built yet).
	bool formHasRows()
	{
		CtInputView* view = open(createCtInputView(nullptr, nullptr));
		bool rows = !numberRows(view).empty();
		view->destroy();
		leaves();
		// The new contact's name entry took the keypad; the next form starts without it.
		m_screen->lowerKeypad();
		return rows;
	}

	void typeNumber(CtInputView* view, const char* text)
	{
		auto numbers = numberRows(view);
		ASSERT_FALSE(numbers.empty());
		Evas_Object* entry = numbers.front()->getEntry();
		ASSERT_TRUE(entry);
		elm_object_focus_set(entry, EINA_TRUE);
		elm_entry_cursor_end_set(entry);
		elm_entry_entry_insert(entry, text);
		m_screen->pumpUntilIdle();
	}

	static int storePersonWithNumber(const char* name, const char* number)
	{
		contacts_record_h contact = newContact(0, name);
		addNumber(contact, number, CONTACTS_NUMBER_TYPE_CELL);
		return store(contact);
	}

	std::unique_ptr<ScreenHarness> m_screen;
};

TEST_F(CtInputViewTest, TitleAndDoneFollowTheModeAndLeavingAnUntouchedFormAsksNothing)
{
	int contactId = 0;
	addSimplePerson("Anna", &contactId);
	struct Case {
		const char* name;
		contacts_record_h record;
		const char* title;
		bool doneDisabled;
	} cases[] = {
		{"create", nullptr, "IDS_PB_BUTTON_CREATE_ABB2", true},
		{"edit", readContact(contactId), "IDS_PB_OPT_EDIT", false},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		CtInputView* view = open(createCtInputView(c.record, nullptr));
		EXPECT_EQ(tr(c.title), ScreenHarness::naviText(view));
		EXPECT_EQ(c.doneDisabled, ScreenHarness::isDisabled(view->getDoneButton()));
		EXPECT_EQ(-1, view->getInputType());
		EXPECT_TRUE(m_screen->findButton(tr("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB")));
		m_screen->sendBackKey();
		EXPECT_TRUE(leaves());
		EXPECT_EQ("", popupTitle());
	}
}

TEST_F(CtInputViewTest, NameInUseAsksOnceAndSaveAnywayStoresTheSecondContact)
{
	addSimplePerson("Anna");
	CtInputView* view = open(createCtInputView(nullptr, nullptr));
	typeName(view, "Anna");
	ASSERT_TRUE(pressDone(view));
	EXPECT_EQ(tr("IDS_PB_HEADER_NAME_ALREADY_IN_USE_ABB3"), popupTitle());
	EXPECT_EQ(1, countContactsNamed("Anna"));

	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_BUTTON_SAVE_ANYWAY_ABB2"))));
	ASSERT_TRUE(m_screen->pumpUntil([this] { return dynamic_cast<CtDetailView*>(m_screen->topView()); }));
	EXPECT_EQ(2, countContactsNamed("Anna"));
	EXPECT_NE(tr("IDS_PB_HEADER_NAME_ALREADY_IN_USE_ABB3"), popupTitle());
}

TEST_F(CtInputViewTest, RenameKeepsTheFormWithoutSaving)
{
	addSimplePerson("Anna");
	CtInputView* view = open(createCtInputView(nullptr, nullptr));
	typeName(view, "Anna");
	pressDone(view);
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_BUTTON_RENAME_ABB4"))));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(view, m_screen->topView());
	EXPECT_EQ(1, countContactsNamed("Anna"));
	EXPECT_FALSE(view->isSaved());
}

TEST_F(CtInputViewTest, FailedSaveKeepsTheTypedFormForAnotherTryThenTheSavedPersonIsShown)
{
	CtInputView* view = open(createCtInputView(nullptr, nullptr));
	typeName(view, "Zoe Quinn");
	{
		ct::db::ScopedWriteFailure full(1);
		pressDone(view);
	}
	EXPECT_EQ(view, m_screen->topView());
	EXPECT_EQ("Zoe Quinn", view->getData()->getFullName());
	EXPECT_FALSE(view->isSaved());
	EXPECT_FALSE(ScreenHarness::isDisabled(view->getDoneButton()));
	EXPECT_EQ(0, countContactsNamed("Zoe Quinn"));
	std::vector<std::string> notices = ScreenHarness::notices();
	ASSERT_FALSE(notices.empty());
	EXPECT_EQ(tr("IDS_PB_POP_NOT_ENOUGH_MEMORY"), notices.back());

	pressDone(view);
	ASSERT_TRUE(m_screen->pumpUntil([this] { return dynamic_cast<CtDetailView*>(m_screen->topView()); }));
	auto* detail = static_cast<CtDetailView*>(m_screen->topView());
	EXPECT_EQ("Zoe Quinn", ScreenHarness::naviText(detail));
	EXPECT_EQ(1, countContactsNamed("Zoe Quinn"));
	EXPECT_EQ(PHONE_ADDRESSBOOK_NAME, preferenceText("input_base_addressbook"));
	// The form goes once the new person's screen is in; back then leaves.
	ASSERT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 1; }));
	m_screen->sendBackKey();
	EXPECT_TRUE(leaves());
}

TEST_F(CtInputViewTest, AFailedEditKeepsTheFormAndTheStoredContactAsTheyWere)
{
	int contactId = 0;
	addSimplePerson("Before", &contactId);
	CtInputView* view = open(createCtInputView(readContact(contactId), nullptr));
	view->getData()->setFullName("After");
	{
		ct::db::ScopedWriteFailure full(1);
		pressDone(view);
	}
	EXPECT_EQ(view, m_screen->topView());
	EXPECT_FALSE(view->isSaved());
	EXPECT_EQ("After", view->getData()->getFullName());
	EXPECT_EQ(1, countContactsNamed("Before"));
	ASSERT_FALSE(ScreenHarness::notices().empty());
	EXPECT_EQ(tr("IDS_PB_POP_NOT_ENOUGH_MEMORY"), ScreenHarness::notices().back());

	pressDone(view);
	EXPECT_TRUE(leaves());
	EXPECT_EQ(0, countContactsNamed("Before"));
	EXPECT_EQ(1, countContactsNamed("After"));
}

TEST_F(CtInputViewTest, AGadgetCallerHearsTheOutcomeOfTheSaveAndIsClosed)
{
	// {operation, disk full, reply keys and values}
	struct Case {
		const char* operation;
		bool diskFull;
		std::map<std::string, std::string> reply;
	} cases[] = {
		{nullptr, false, {{"is_success", "1"}}},
		{APP_CONTROL_OPERATION_DEFAULT, false, {{"is_success", "1"}, {"id", "person"}}},
		{nullptr, true, {{"is_success", "0"}}},
		{APP_CONTROL_OPERATION_DEFAULT, true, {{"is_success", "0"}, {"id", ""}}},
	};
	int round = 0;
	for (const Case& c : cases) {
		SCOPED_TRACE(std::string(c.operation ? c.operation : "none") + (c.diskFull ? " full" : ""));
		GadgetLaunch launch(c.operation);
		CtInputView* view = open(createCtInputView(nullptr, &launch.launch));
		std::string name = "Caller Case " + std::to_string(++round);
		typeName(view, name.c_str());
		{
			std::unique_ptr<ct::db::ScopedWriteFailure> full;
			if (c.diskFull)
				full = std::make_unique<ct::db::ScopedWriteFailure>(1);
			pressDone(view);
		}
		ASSERT_EQ(1u, launch.gadget.results().size());
		for (const auto& [key, value] : c.reply) {
			std::string got = launch.gadget.resultValue(0, key);
			if (value == "person")
				EXPECT_GT(atoi(got.c_str()), 0) << key;
			else
				EXPECT_EQ(value, got) << key;
		}
		EXPECT_EQ(c.diskFull ? 0 : 1, countContactsNamed(name.c_str()));
		EXPECT_TRUE(m_screen->pumpUntil([&launch] { return launch.gadget.isDestroyRequested(); }));
		view->destroy();
		EXPECT_TRUE(leaves());
	}
}

TEST_F(CtInputViewTest, SimFormStaysWhileTheCardInitialisesAndClosesWhenItIsSwitchedOff)
{
	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\n";
	reopenStore();
	preference_set_string("input_base_addressbook", CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	CtInputView* view = open(createCtInputView(nullptr, nullptr));
	ASSERT_EQ(1, view->getData()->getSimNo());
	typeName(view, "Sim Sam");

	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\npresent=0\n";
	pressDone(view);
	EXPECT_EQ(view, m_screen->topView());
	ASSERT_FALSE(ScreenHarness::notices().empty());
	EXPECT_EQ(tr("IDS_PB_BODY_SIM_CARD_INITIALISING_ING"), ScreenHarness::notices().back());
	EXPECT_FALSE(view->isSaved());

	vconf_set_int("db/telephony/sim_power_state1", 0);
	EXPECT_TRUE(leaves());
	EXPECT_EQ(PHONE_ADDRESSBOOK_NAME, preferenceText("input_base_addressbook"));
	EXPECT_EQ("", popupTitle());
}

TEST_F(CtInputViewTest, TheFormOfAContactDeletedElsewhereCloses)
{
	int contactId = 0;
	addSimplePerson("Gone", &contactId);
	open(createCtInputView(readContact(contactId), nullptr));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_contact._uri, contactId));
	EXPECT_TRUE(leaves());
}

TEST_F(CtInputViewTest, ScreenshotsOfCreateAndEdit)
{
	int contactId = 0;
	addSimplePerson("Anna", &contactId);
	open(createCtInputView(nullptr, nullptr));
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(m_screen->savePng(shotPath("create.png")));
	m_screen->sendBackKey();
	ASSERT_TRUE(leaves());
	open(createCtInputView(readContact(contactId), nullptr));
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(m_screen->savePng(shotPath("edit.png")));
}

TEST_F(CtInputViewTest, NewContactsAskWhereToSaveOnceAndSaveRemembersTheAnswer)
{
	// {sim.conf, power saving, popup title shown, storage list shown}
	struct Case {
		const char* name;
		const char* sims;
		int powerSaving;
		bool asks;
		bool list;
	} cases[] = {
		{"phone only", "", 0, true, false},
		{"phone only, power saving", "", 1, false, false},
		{"phone and a SIM", "[SIM1]\n", 0, true, true},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		std::ofstream(m_dir.file("sim.conf")) << c.sims;
		reopenStore();
		int sim = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
		if (!*c.sims && sim > 0) {
			ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_address_book._uri, sim));
		}
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, c.powerSaving);
		preference_set_boolean("hide_storage_popup", false);
		CtInputView* view = open(createCtInputView(nullptr, nullptr));
		const std::string question = tr("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB");
		bool asked = m_screen->pumpUntil([&] { return popupTitle() == question; }, 2.0);
		EXPECT_EQ(c.asks, asked);
		if (asked) {
			EXPECT_EQ(c.list, m_screen->findWidgets("Elm_Genlist").size() > 1);
			ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_BUTTON_SAVE"))));
			m_screen->pumpUntilIdle();
			EXPECT_EQ("", popupTitle());
			bool hide = false;
			preference_get_boolean("hide_storage_popup", &hide);
			EXPECT_TRUE(hide);
			EXPECT_EQ(0, view->getStorageId());
		}
		view->destroy();
		EXPECT_TRUE(leaves());
	}
}

// A launch request as another application sends it, with its reply kept.
struct SentRequest {
	SentRequest(const char* operation, const std::map<std::string, std::string>& extras)
	{
		handler = ct::appcontrol::registerAppHandler("test.form-host", [this](app_control_h request, const ct::appcontrol::Reply&) {
			app_control_clone(&received, request);
			return APP_CONTROL_ERROR_NONE;
		});
		app_control_h sent = nullptr;
		app_control_create(&sent);
		app_control_set_app_id(sent, "test.form-host");
		app_control_set_operation(sent, operation);
		for (const auto& [key, value] : extras)
			app_control_add_extra_data(sent, key.c_str(), value.c_str());
		app_control_send_launch_request(sent, [](app_control_h, app_control_h reply, app_control_result_e result, void* data) {
			auto* self = static_cast<SentRequest*>(data);
			self->result = result;
			char* id = nullptr;
			if (reply)
				app_control_get_extra_data(reply, APP_CONTROL_DATA_ID, &id);
			self->replyId = id ? id : "";
			free(id);
			self->replied = true;
		}, this);
		app_control_destroy(sent);
		launch.appControl = received;
	}
	~SentRequest()
	{
		ct::appcontrol::ScopedReplyCancel cancel(this);
		if (received)
			app_control_destroy(received);
	}
	ct::appcontrol::Registration handler;
	app_control_h received = nullptr;
	CtLaunchRequest launch;
	bool replied = false;
	int result = 99;
	std::string replyId;
};

TEST_F(CtInputViewTest, AnApplicationThatAsksToAddHearsTheNewPersonOrTheCancel)
{
	for (bool done : {true, false}) {
		SCOPED_TRACE(done ? "done" : "cancel");
		SentRequest sent(APP_CONTROL_OPERATION_ADD, {{"type", "not a number"}});
		ASSERT_TRUE(m_screen->pumpUntil([&sent] { return sent.received != nullptr; }));
		CtInputView* view = open(createCtInputView(nullptr, &sent.launch));
		EXPECT_EQ(-1, view->getInputType());
		const char* name = done ? "Asked For" : "Asked Then Cancelled";
		typeName(view, name);
		if (done)
			pressDone(view);
		else
			ASSERT_TRUE(ScreenHarness::click(view->getCancelButton()));
		ASSERT_TRUE(m_screen->pumpUntil([&sent] { return sent.replied; }));
		EXPECT_EQ(done ? APP_CONTROL_RESULT_SUCCEEDED : APP_CONTROL_RESULT_CANCELED, sent.result);
		EXPECT_EQ(done ? 1 : 0, countContactsNamed(name));
		if (done) {
			EXPECT_EQ(std::to_string(personOf(contactIdNamed("Asked For"))), sent.replyId);
		}
		if (!done && m_screen->findButton(tr("IDS_PB_BUTTON_DISCARD_ABB")))
			ScreenHarness::click(m_screen->findButton(tr("IDS_PB_BUTTON_DISCARD_ABB")));
		EXPECT_TRUE(leaves());
	}
}

TEST_F(CtInputViewTest, ThePictureCropFlowSetsTheChosenPictureOnTheNewPerson)
{
	std::string picture = ContactsCommon::getAppImagePath("contacts_btn_ic_call.png");
	ASSERT_FALSE(picture.empty());
	std::vector<std::string> viewerPaths;
	auto viewer = ct::appcontrol::registerAppHandler(IMAGE_VIEWER_APP_ID,
		[&](app_control_h request, const ct::appcontrol::Reply& reply) {
			char* path = nullptr;
			app_control_get_extra_data(request, "Path", &path);
			viewerPaths.push_back(path ? path : "");
			free(path);
			app_control_h answer = nullptr;
			app_control_create(&answer);
			const char* selected[] = {picture.c_str()};
			app_control_add_extra_data_array(answer, APP_CONTROL_DATA_SELECTED, selected, 1);
			reply(answer, APP_CONTROL_RESULT_SUCCEEDED);
			app_control_destroy(answer);
			return APP_CONTROL_ERROR_NONE;
		});
	GadgetLaunch launch(nullptr);
	app_control_add_extra_data(launch.owned.get(), "type", "41");
	app_control_add_extra_data(launch.owned.get(), "ct_path", "/tmp/caller-id.png");
	CtInputView* view = open(createCtInputView(nullptr, &launch.launch));
	EXPECT_EQ(41, view->getInputType());
	typeName(view, "Cropped Picture");
	pressDone(view);
	ASSERT_TRUE(m_screen->pumpUntil([&launch] { return launch.gadget.isDestroyRequested(); }));
	EXPECT_EQ(std::vector<std::string>{"/tmp/caller-id.png"}, viewerPaths);
	EXPECT_EQ("1", launch.gadget.resultValue(0, "is_success"));
	contacts_record_h stored = readContact(contactIdNamed("Cropped Picture"));
	ASSERT_TRUE(stored);
	EXPECT_FALSE(textOf(childAt(stored, _contacts_contact.image, 0), _contacts_image.path).empty());
	contacts_record_destroy(stored, true);
	view->destroy();
	EXPECT_TRUE(leaves());
}

TEST_F(CtInputViewTest, LeavingAsksOnlyWhenSomethingWouldBeLost)
{
	if (!formHasRows())
		GTEST_SKIP() << "the form lists no rows yet";
	int contactId = storePersonWithNumber("Anna", "010");
	struct Case {
		const char* name;
		bool edit;
		const char* typed;
		bool asks;
	} cases[] = {
		{"create, nothing typed", false, nullptr, false},
		{"create, a digit typed", false, "5", true},
		{"edit, unchanged", true, nullptr, false},
		{"edit, a number added", true, "5", true},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		CtInputView* view = open(createCtInputView(c.edit ? readContact(contactId) : nullptr, nullptr));
		m_screen->pumpUntilIdle();
		if (c.typed)
			typeNumber(view, c.typed);
		m_screen->lowerKeypad();
		m_screen->sendBackKey();
		m_screen->pumpUntilIdle();
		EXPECT_EQ(c.asks ? tr("IDS_PB_HEADER_DISCARD_CHANGES_ABB") : "", popupTitle());
		if (c.asks) {
			ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_BUTTON_CANCEL"))));
			m_screen->pumpUntilIdle();
			EXPECT_EQ(view, m_screen->topView());
			m_screen->sendBackKey();
			m_screen->pumpUntilIdle();
			ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_BUTTON_DISCARD_ABB"))));
		}
		EXPECT_TRUE(leaves());
	}
	EXPECT_EQ(1, countContactsNamed("Anna"));
}

// Back with the keypad up first takes the keypad down (the view lets go of
// the entry); the question comes once it is down.
TEST_F(CtInputViewTest, WithTheKeypadUpTheDiscardQuestionWaitsForItToGoDown)
{
	if (!formHasRows())
		GTEST_SKIP() << "the form lists no rows yet";
	CtInputView* view = open(createCtInputView(nullptr, nullptr));
	typeNumber(view, "0102");
	ASSERT_TRUE(view->isSipShown());
	view->popOut();   // what the back key does, without running the loop after it
	EXPECT_EQ("", popupTitle());
	EXPECT_TRUE(view->isDiscardPending());

	m_screen->pumpUntilIdle();
	EXPECT_FALSE(m_screen->isKeypadShown());
	EXPECT_EQ(tr("IDS_PB_HEADER_DISCARD_CHANGES_ABB"), popupTitle());
	EXPECT_FALSE(view->isDiscardPending());
	EXPECT_EQ(view, m_screen->topView());
}

TEST_F(CtInputViewTest, DoneWithTheKeypadUpSavesAndLeavesOnceTheKeypadIsDown)
{
	if (!formHasRows())
		GTEST_SKIP() << "the form lists no rows yet";
	int contactId = storePersonWithNumber("Kim", "010");
	CtInputView* view = open(createCtInputView(readContact(contactId), nullptr));
	m_screen->pumpUntilIdle();
	typeNumber(view, "7");
	ASSERT_TRUE(view->isSipShown());
	ASSERT_TRUE(pressDone(view));
	EXPECT_TRUE(leaves());
	contacts_record_h stored = readContact(contactId);
	ASSERT_TRUE(stored);
	EXPECT_EQ("0107", textOf(childAt(stored, _contacts_contact.number, 0), _contacts_number.number));
	contacts_record_destroy(stored, true);
}

} // namespace
