// The share-fields screen, headless: the count in the title and the Done
// button, the text Done returns through the gadget and the preview that
// shows it, Cancel, and how the screen follows changes of the person.
#include "../data/detail/DetailTestStore.h"

#include "ContactsDetails.h"
#include "CtDetailData.h"
#include "CtView.h"
#include "CtDetailViewBasicInfoItem.h"
#include "CtShareContactText.h"
#include "CtShareContactView.h"
#include "CtShareContactViewItem.h"
#include "LogSink.h"
#include "ScreenHarness.h"
#include "UiGadget.h"

#include <glib.h>

#include <cstdlib>
#include <filesystem>

using namespace ct::test;

namespace {

class CtShareContactViewTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		m_screen = std::make_unique<ScreenHarness>(360, 640);
		CtView::changeLanguage("en_US.UTF-8");
		m_gadget = std::make_unique<ct::ug::UiGadget>("share-fields");
		m_request.ug = m_gadget->handle();
	}
	void TearDown() override
	{
		m_screen.reset();
		m_gadget.reset();
		contacts_disconnect();
	}

	CtShareContactView* open(int personId, CtLaunchRequest* request)
	{
		auto* view = static_cast<CtShareContactView*>(createCtShareContactView(personId, request));
		EXPECT_TRUE(m_screen->push(view));
		return view;
	}
	CtShareContactView* open(int personId) { return open(personId, &m_request); }

	static std::vector<CtShareContactViewItem*> rows(CtShareContactView* view)
	{
		return ScreenHarness::rowsOf<CtShareContactViewItem>(view->getGenlist());
	}
	// The field row whose value is `value`.
	static CtShareContactViewItem* rowOf(CtShareContactView* view, const std::string& value)
	{
		for (auto* row : rows(view))
			if (row->getShareValue() == value)
				return row;
		ADD_FAILURE() << "no row " << value;
		return nullptr;
	}
	static void mark(CtShareContactViewItem* row)
	{
		if (row)
			ScreenHarness::selectItem(row->getElmObjectItem());
	}
	static Evas_Object* titleButton(CtShareContactView* view, const char* part)
	{
		return elm_object_item_part_content_get(view->getNaviItem(), part);
	}
	static Evas_Object* done(CtShareContactView* view) { return titleButton(view, "title_right_btn"); }
	// Title, and whether Done can be pressed.
	static std::pair<std::string, bool> titleState(CtShareContactView* view)
	{
		return {ScreenHarness::naviText(view), !ScreenHarness::isDisabled(done(view))};
	}
	static bool isChecked(CtShareContactViewItem* row)
	{
		Evas_Object* layout = elm_object_item_part_content_get(row->getElmObjectItem(), "elm.icon.2");
		Evas_Object* check = layout ? elm_object_part_content_get(layout, "elm.swallow.content") : nullptr;
		return check && elm_check_state_get(check);
	}

	// Presses Done and returns the text the gadget received ("" for none).
	std::string pressDone(CtShareContactView* view)
	{
		EXPECT_TRUE(ScreenHarness::click(done(view)));
		EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
		EXPECT_EQ(1u, m_gadget->results().size());
		return m_gadget->results().empty() ? "" : m_gadget->resultValue(0, "person_info");
	}

	// Mina: two numbers, an e-mail, an address, a messenger, a work web
	// site, a relationship, a birthday and a note.
	int storeMina(int* contactId = nullptr)
	{
		contacts_record_h contact = newContact(0, "Mina");
		addNumber(contact, "010-1111-2222", CONTACTS_NUMBER_TYPE_CELL);
		addNumber(contact, "02-333-4444", CONTACTS_NUMBER_TYPE_CUSTOM, "Studio");
		addEmail(contact, "mina@example.com");
		contacts_record_h address = addText(contact, _contacts_contact.address, _contacts_address._uri,
				_contacts_address.street, "1 Main St & <Co>");
		contacts_record_set_str(address, _contacts_address.locality, "Springfield");
		contacts_record_set_int(address, _contacts_address.type, CONTACTS_ADDRESS_TYPE_WORK);
		contacts_record_h im = addText(contact, _contacts_contact.messenger, _contacts_messenger._uri,
				_contacts_messenger.im_id, "mina.s");
		contacts_record_set_int(im, _contacts_messenger.type, CONTACTS_MESSENGER_TYPE_ICQ);
		contacts_record_h url = addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url,
				"mina.example.com");
		contacts_record_set_int(url, _contacts_url.type, CONTACTS_URL_TYPE_WORK);
		contacts_record_h relation = addText(contact, _contacts_contact.relationship, _contacts_relationship._uri,
				_contacts_relationship.name, "Jun");
		contacts_record_set_int(relation, _contacts_relationship.type, CONTACTS_RELATIONSHIP_TYPE_BROTHER);
		contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.date, 19900315);
		contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
		addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "Met at the fair");
		int id = store(contact);
		if (contactId)
			*contactId = id;
		return personOf(id);
	}

	TempDataDir m_dir;
	std::unique_ptr<ScreenHarness> m_screen;
	std::unique_ptr<ct::ug::UiGadget> m_gadget;
	CtLaunchRequest m_request;
};

TEST_F(CtShareContactViewTest, TitleCountsTheMarksAndDoneNeedsOne)
{
	CtShareContactView* view = open(storeMina());
	ASSERT_EQ(9u, rows(view).size());
	EXPECT_EQ(std::make_pair(std::string("0 selected"), false), titleState(view));
	EXPECT_EQ("Cancel", ScreenHarness::buttonLabel(titleButton(view, "title_left_btn")));
	EXPECT_EQ("Mina\n", view->getPreviewText());

	CtShareContactViewItem* number = rowOf(view, "010-1111-2222");
	mark(number);
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(number->isMarked());
	EXPECT_TRUE(isChecked(number));
	EXPECT_EQ(std::make_pair(std::string("1 selected"), true), titleState(view));
	mark(rowOf(view, "Met at the fair"));
	EXPECT_EQ(std::make_pair(std::string("2 selected"), true), titleState(view));
	mark(rowOf(view, "Met at the fair"));
	mark(number);
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(isChecked(number));
	EXPECT_EQ(std::make_pair(std::string("0 selected"), false), titleState(view));
	// A disabled Done sends nothing.
	EXPECT_FALSE(ScreenHarness::click(done(view)));
	EXPECT_TRUE(m_gadget->results().empty());
}

TEST_F(CtShareContactViewTest, DoneReturnsTheNameAndEachMarkedFieldAsLines)
{
	struct Case {
		std::vector<std::string> marked;
		std::string expected;
	};
	const Case cases[] = {
		{{"010-1111-2222"}, "Mina\nMobile\n010-1111-2222\n"},
		{{"02-333-4444", "mina@example.com"}, "Mina\nStudio\n02-333-4444\nHome\nmina@example.com\n"},
		// Plain text: neither markup escapes nor markup line breaks.
		{{"Springfield\n1 Main St & <Co>"}, "Mina\nWork\nSpringfield\n1 Main St & <Co>\n"},
		// A web address is labelled as a home one whatever its type.
		{{"mina.example.com"}, "Mina\nHome\nmina.example.com\n"},
		{{"mina.s", "Jun"}, "Mina\nICQ\nmina.s\nBrother\nJun\n"},
		{{"Met at the fair"}, "Mina\nMet at the fair\n"},
	};
	int personId = storeMina();
	for (const Case& c : cases) {
		m_gadget = std::make_unique<ct::ug::UiGadget>("share-fields");
		m_request.ug = m_gadget->handle();
		CtShareContactView* view = open(personId);
		// Marked in reverse: the text keeps the list order.
		for (auto it = c.marked.rbegin(); it != c.marked.rend(); ++it)
			mark(rowOf(view, *it));
		std::string preview = view->getPreviewText();
		EXPECT_EQ(view->composeText(), preview);
		EXPECT_EQ(c.expected, pressDone(view));
		EXPECT_EQ(c.expected, preview);
		EXPECT_TRUE(m_gadget->isDestroyRequested());
	}

	m_gadget = std::make_unique<ct::ug::UiGadget>("share-fields");
	m_request.ug = m_gadget->handle();
	CtShareContactView* view = open(personId);
	auto* birthday = ScreenHarness::rowsWhere<CtShareContactViewItem>(view->getGenlist(),
			[](CtShareContactViewItem* row) { return row->getKind() == _contacts_event._uri; }).at(0);
	mark(birthday);
	std::string text = pressDone(view);
	EXPECT_EQ(0u, text.find("Mina\nBirthday\n"));
	EXPECT_NE(std::string::npos, text.find("1990"));
}

TEST_F(CtShareContactViewTest, CancelAndTheBackKeyReturnNothingAndCloseTheGadget)
{
	int personId = storeMina();
	CtShareContactView* view = open(personId);
	mark(rowOf(view, "010-1111-2222"));
	EXPECT_TRUE(ScreenHarness::click(titleButton(view, "title_left_btn")));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	EXPECT_TRUE(m_gadget->results().empty());
	EXPECT_TRUE(m_gadget->isDestroyRequested());

	m_gadget = std::make_unique<ct::ug::UiGadget>("share-fields");
	m_request.ug = m_gadget->handle();
	open(personId);
	m_screen->sendBackKey();
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	EXPECT_TRUE(m_gadget->results().empty());
	EXPECT_TRUE(m_gadget->isDestroyRequested());
}

TEST_F(CtShareContactViewTest, LongSelectionsAreCutAfterAWholeLineOfWholeCharacters)
{
	contacts_record_h contact = newContact(0, "Long");
	for (int i = 0; i < 12; ++i) {
		std::string note = std::to_string(i) + ":";
		for (int j = 0; j < 60; ++j)
			note += "ü";
		addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, note.c_str());
	}
	CtShareContactView* view = open(personOf(store(contact)));
	std::string full = "Long\n";
	for (auto* row : rows(view)) {
		mark(row);
		full += row->getShareValue() + "\n";
	}
	ASSERT_GT(full.size(), CtShareContactText::kMaxBytes);
	std::string preview = view->getPreviewText();
	std::string text = pressDone(view);
	EXPECT_EQ(preview, text);
	EXPECT_LE(text.size(), CtShareContactText::kMaxBytes);
	EXPECT_EQ('\n', text.back());
	EXPECT_EQ(full.substr(0, text.size()), text);
	EXPECT_TRUE(g_utf8_validate(text.data(), static_cast<gssize>(text.size()), nullptr));
}

TEST_F(CtShareContactViewTest, DeletingThePersonClosesTheScreen)
{
	int personId = storeMina();
	CtShareContactView* view = open(personId);
	mark(rowOf(view, "010-1111-2222"));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, personId));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	EXPECT_TRUE(m_gadget->results().empty());
	EXPECT_TRUE(m_gadget->isDestroyRequested());
}

TEST_F(CtShareContactViewTest, OnlyChangesOfTheShownPersonRebuildAndMarksOfRemainingFieldsStay)
{
	int contactId = 0;
	int personId = storeMina(&contactId);
	int otherContactId = 0;
	addSimplePerson("Other", &otherContactId);
	CtShareContactView* view = open(personId);
	mark(rowOf(view, "02-333-4444"));
	mark(rowOf(view, "Met at the fair"));
	CtShareContactViewItem* marked = rowOf(view, "02-333-4444");

	addNumberToStoredContact(otherContactId, "030-000-0000");
	addNumberToStoredContact(contactId, "010-9999-0000");
	ASSERT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() > 0; }));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(1, view->getRebuildCount());
	EXPECT_EQ(10u, rows(view).size());
	EXPECT_NE(marked, rowOf(view, "02-333-4444"));
	std::vector<std::string> markedValues;
	for (auto* row : rows(view))
		if (row->isMarked())
			markedValues.push_back(row->getShareValue());
	EXPECT_EQ((std::vector<std::string>{"02-333-4444", "Met at the fair"}), markedValues);
	EXPECT_EQ(std::make_pair(std::string("2 selected"), true), titleState(view));
	EXPECT_EQ("Mina\nStudio\n02-333-4444\nMet at the fair\n", view->getPreviewText());

	// A marked field removed elsewhere leaves the count.
	contacts_record_h contact = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_contact._uri, contactId, &contact));
	contacts_record_h note = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_child_record_at_p(contact, _contacts_contact.note, 0, &note));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_remove_child_record(contact, _contacts_contact.note, note));
	contacts_record_destroy(note, true);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(contact));
	contacts_record_destroy(contact, true);
	ASSERT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() > 1; }));
	EXPECT_EQ(std::make_pair(std::string("1 selected"), true), titleState(view));
	EXPECT_EQ("Mina\nStudio\n02-333-4444\n", pressDone(view));
}

TEST_F(CtShareContactViewTest, AChangeArrivingWithAFavouriteTapIsNotLost)
{
	int contactId = 0;
	int personId = storeMina(&contactId);
	CtShareContactView* view = open(personId);
	mark(rowOf(view, "mina@example.com"));
	m_screen->pumpUntilIdle();
	auto* name = ScreenHarness::rowsOf<CtDetailViewBasicInfoItem>(view->getGenlist()).at(0);
	Evas_Object* star = name->getFavoriteIcon();
	ASSERT_NE(nullptr, star);
	Evas_Coord x, y, w, h;
	evas_object_geometry_get(star, &x, &y, &w, &h);
	Evas* evas = evas_object_evas_get(star);
	evas_event_feed_mouse_move(evas, x + w / 2, y + h / 2, 0, nullptr);
	evas_event_feed_mouse_down(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	evas_event_feed_mouse_up(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	ASSERT_TRUE(name->isFavorite());
	// Another program adds a number before the tap's notification is heard.
	addNumberToStoredContact(contactId, "010-9999-0000");

	ASSERT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() > 0 && rows(view).size() == 10; }));
	EXPECT_TRUE(CtDetailData(personId).isFavorite());
	EXPECT_TRUE(rowOf(view, "mina@example.com")->isMarked());
	EXPECT_EQ(std::make_pair(std::string("1 selected"), true), titleState(view));
}

TEST_F(CtShareContactViewTest, ALanguageChangeTranslatesTitleButtonsAndLabels)
{
	CtShareContactView* view = open(storeMina());
	mark(rowOf(view, "010-1111-2222"));
	CtView::changeLanguage("de_DE.UTF-8");
	std::vector<std::string> shown = {ScreenHarness::naviText(view),
		ScreenHarness::buttonLabel(done(view)), ScreenHarness::buttonLabel(titleButton(view, "title_left_btn")),
		view->getPreviewText()};
	CtView::changeLanguage("en_US.UTF-8");
	EXPECT_EQ((std::vector<std::string>{"1 ausgewählt", "Fertig", "Abbrechen", "Mina\nMobil\n010-1111-2222\n"}),
			shown);
	EXPECT_EQ("Mina\nMobile\n010-1111-2222\n", view->getPreviewText());
}

TEST_F(CtShareContactViewTest, MissingPersonsAndMissingRequestsGiveQuietScreens)
{
	for (int personId : {0, -4, 9999}) {
		CtShareContactView* view = open(personId);
		EXPECT_TRUE(rows(view).empty()) << personId;
		EXPECT_EQ(std::make_pair(std::string("0 selected"), false), titleState(view));
		EXPECT_EQ("", view->composeText());
		view->popOut();
		m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; });
	}

	// Without a request the text has nobody to go to; the screen still closes.
	CtShareContactView* view = open(storeMina(), nullptr);
	mark(rowOf(view, "mina@example.com"));
	EXPECT_TRUE(ScreenHarness::click(done(view)));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	EXPECT_TRUE(m_gadget->results().empty());
	// A gadget that is gone already is not an error for the screen.
	CtLaunchRequest stale;
	stale.ug = m_gadget->handle();
	m_gadget.reset();
	view = open(storeMina(), &stale);
	mark(rows(view).at(0));
	EXPECT_TRUE(ScreenHarness::click(done(view)));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
}

TEST_F(CtShareContactViewTest, PictureWithThePreviewForReview)
{
	CtShareContactView* view = open(storeMina());
	mark(rowOf(view, "010-1111-2222"));
	mark(rowOf(view, "mina.example.com"));
	mark(rowOf(view, "Met at the fair"));
	m_screen->pumpUntilIdle();
	// A wrapped label takes its size after a first drawing.
	m_screen->pumpFrames(3);
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/share";
	std::filesystem::create_directories(dir);
	EXPECT_TRUE(m_screen->savePng(dir + "/share-fields.png"));
}

} // namespace
