// The floating list under a plain name entry: its rows, texts, height,
// selection, the back key, and the typing pause of the form's trigger.
#include "PredictionTestSupport.h"

#include "CtPredictionListControl.h"
#include "CtPredictionListModel.h"
#include "CtPredictionListTrigger.h"
#include "CtCommonWidgetUtil.h"

#include <filesystem>
#include <functional>
#include <map>

using namespace ct::test;

namespace {

const char* const kOneLine = "prediction.1line";
const char* const kTwoLine = "prediction.2line.top";

class CtPredictionListControlTest : public PredictionTest {
protected:
	void TearDown() override
	{
		m_trigger.reset();
		if (m_list && !m_alive.expired())
			m_list->destroy();
		PredictionTest::TearDown();
	}

	CtPredictionListControl* open(const std::string& text)
	{
		auto model = std::make_shared<CtPredictionListModel>(text);
		m_list = new CtPredictionListControl(model, m_entry, nullptr, onPicked());
		EXPECT_TRUE(m_list->create(m_form, nullptr));
		m_alive = m_list->getWeakPtr();
		m_list->resize();
		m_screen->pumpUntilIdle();
		return m_list;
	}
	bool isOpen() const { return !m_alive.expired(); }
	std::vector<Elm_Object_Item*> rows() const { return ScreenHarness::genlistItems(m_list->getGenlist()); }
	std::string mainText(Elm_Object_Item* item) const
	{
		std::string style = ScreenHarness::itemStyle(item);
		return ScreenHarness::itemText(item, style == kOneLine ? "elm.text.main.left" : "elm.text.main.left.top");
	}

	void makeTrigger(bool isNewContact)
	{
		m_trigger = std::make_unique<CtPredictionListTrigger>(m_form, m_form, isNewContact, onPicked());
	}
	std::function<void(contacts_record_h)> onPicked()
	{
		return [this](contacts_record_h contact) {
			contacts_record_get_int(contact, _contacts_contact.id, &m_selectedContact);
			contacts_record_destroy(contact, true);
		};
	}
	// Types `text` letter by letter without pausing, as the name row reports it.
	void type(const std::string& text)
	{
		for (size_t n = 1; n <= text.size(); ++n) {
			elm_entry_entry_set(m_entry, text.substr(0, n).c_str());
			m_trigger->onNameChanged(m_entry, nullptr, text.substr(0, n));
			m_screen->pumpFrames(1);
		}
	}
	void waitPastPause() { m_screen->pumpFor(CtPredictionListTrigger::kTypingPause + 0.3); }

	CtPredictionListControl* m_list = nullptr;
	std::weak_ptr<app_assist::WControl> m_alive;
	std::unique_ptr<CtPredictionListTrigger> m_trigger;
	int m_selectedContact = 0;
};

TEST_F(CtPredictionListControlTest, TwentyFiveMatchesShowTenRowsSizedForThree)
{
	for (int i = 0; i < 25; ++i)
		addPerson(("Anna " + std::to_string(i)).c_str(), "+1 555 0100");
	focusEntry("Anna");
	open("Anna");
	EXPECT_EQ(10u, rows().size());
	EXPECT_EQ(3 * 144 + 4, m_list->getUnscaledHeight());
}

TEST_F(CtPredictionListControlTest, RowKindFollowsTheDefaultNumber)
{
	addPerson("Anna Plain");
	addPerson("Anna Number", "+1 555 0101");
	focusEntry("Anna");
	open("Anna");
	std::map<std::string, std::pair<std::string, std::string>> seen;
	for (Elm_Object_Item* item : rows())
		seen[ScreenHarness::itemStyle(item)] = { mainText(item),
			ScreenHarness::itemText(item, "elm.text.sub.left.bottom") };
	ASSERT_EQ(2u, seen.size());
	EXPECT_NE(std::string::npos, seen[kOneLine].first.find("Plain"));
	EXPECT_EQ("", seen[kOneLine].second);
	EXPECT_NE(std::string::npos, seen[kTwoLine].first.find("Number"));
	EXPECT_EQ("+1 555 0101", seen[kTwoLine].second);
}

TEST_F(CtPredictionListControlTest, FourOneLineRowsAreThreeRowsHighBelowTheField)
{
	for (int i = 0; i < 4; ++i)
		addPerson(("Anna " + std::to_string(i)).c_str());
	focusEntry("Anna");
	open("Anna");
	EXPECT_EQ(3 * 96 + 4, m_list->getUnscaledHeight());
	m_list->resize(); // with the scale the toolkit settled on
	int ex, ey, ew, eh, x, y, w, h;
	evas_object_geometry_get(m_entry, &ex, &ey, &ew, &eh);
	evas_object_geometry_get(m_list->getEvasObj(), &x, &y, &w, &h);
	double scale = ctCommonGetScale() * 0.5; // design units are half pixels
	int margin = static_cast<int>(32 * scale);
	EXPECT_EQ(ey + eh, y);
	EXPECT_EQ(ex + margin, x);
	EXPECT_EQ(ew - 2 * margin, w);
	EXPECT_EQ(static_cast<int>(3 * 96 * scale) + static_cast<int>(4 * scale), h);
}

TEST_F(CtPredictionListControlTest, WordStartMatchIsHighlightedMiddleOfWordIsNot)
{
	addPerson("Maria Annabel");
	addPerson("Joanna");
	focusEntry("anna");
	open("anna");
	std::map<std::string, std::string> texts;
	for (Elm_Object_Item* item : rows())
		texts[mainText(item).find("Joanna") != std::string::npos ? "middle" : "start"] = mainText(item);
	ASSERT_EQ(2u, texts.size()) << "a middle-of-word match is still listed";
	EXPECT_EQ("Joanna", texts["middle"]);
	EXPECT_NE(std::string::npos, texts["start"].find("Maria <color=#"));
	EXPECT_NE(std::string::npos, texts["start"].find(">Anna</color>bel"));
}

TEST_F(CtPredictionListControlTest, HighlightKeepsMarkupOfTheNameEscaped)
{
	struct Case {
		const char* name;
		std::string search;
		bool highlighted;
	};
	const Case cases[] = {
		{ "Ann <b>Lee</b>", "lee", false },
		{ "Ann <b>Lee</b>", "<b>", true },
		{ "Ann & Co", "co", true },
		{ "Zoë Ørsted", "ørs", true },
		{ "Zoë", "", false },
	};
	for (const Case& c : cases) {
		std::string text = CtPredictionListControl::getSearchHighlightName(c.name, c.search);
		EXPECT_EQ(c.highlighted, text.find("<color=") != std::string::npos) << c.name << " / " << c.search;
		EXPECT_EQ(std::string::npos, text.find("<b>")) << text;
	}
	EXPECT_EQ("", CtPredictionListControl::getSearchHighlightName(nullptr, "a"));
}

TEST_F(CtPredictionListControlTest, PersonWithoutNameShowsUnknown)
{
	contacts_record_h contact = newContact(0, nullptr);
	addNumber(contact, "+1 555 0199", CONTACTS_NUMBER_TYPE_CELL);
	store(contact);
	focusEntry("555");
	open("555");
	if (rows().empty())
		GTEST_SKIP() << "the store names a nameless person after its number";
	std::string text = mainText(rows()[0]);
	EXPECT_TRUE(text == "Unknown" || text.find("555") != std::string::npos) << text;
}

TEST_F(CtPredictionListControlTest, SameTextIsNotLoadedAgain)
{
	addPerson("Anna One");
	int second = addPerson("Anna Two");
	focusEntry("Anna");
	open("Anna");
	ASSERT_EQ(2u, rows().size());
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, second));
	m_list->updatePredictionList("Anna");
	EXPECT_EQ(2u, rows().size()) << "the same text keeps the rows it has";
	m_list->updatePredictionList("Anna ");
	EXPECT_EQ(1u, rows().size());
}

// Choosing a row hands over its contact; a person deleted meanwhile hands
// over nothing; the back key chooses nothing. The list closes in every case.
TEST_F(CtPredictionListControlTest, ChoosingARowOrBackKeyCloses)
{
	struct Case {
		const char* name;
		bool deleteFirst, backKey, handedOver;
	} cases[] = {{"Anna Chosen", false, false, true}, {"Anna Gone", true, false, false},
		{"Anna Back", false, true, false}};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		m_selectedContact = 0;
		int person = addPerson(c.name, "+1 555 0101");
		focusEntry(c.name);
		open(c.name);
		ASSERT_EQ(1u, rows().size());
		if (c.deleteFirst) {
			ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, person));
		}
		if (c.backKey)
			m_screen->sendBackKey();
		else
			ScreenHarness::selectItem(rows()[0]);
		m_screen->pumpFrames(2);
		EXPECT_EQ(c.handedOver, m_selectedContact > 0);
		EXPECT_FALSE(isOpen());
	}
}

TEST_F(CtPredictionListControlTest, TypingFastSearchesOnceAfterThePause)
{
	for (int i = 0; i < 5; ++i)
		addPerson(("Annabel Lee " + std::to_string(i)).c_str());
	makeTrigger(true);
	focusEntry();
	type("Annabel Le");
	EXPECT_EQ(nullptr, m_trigger->getPredictionList()) << "nothing before the pause";
	waitPastPause();
	EXPECT_EQ(1, m_trigger->getLoadCount());
	ASSERT_NE(nullptr, m_trigger->getPredictionList());
	EXPECT_EQ(5u, ScreenHarness::genlistItems(m_trigger->getPredictionList()->getGenlist()).size());
}

TEST_F(CtPredictionListControlTest, ExistingContactNeverGetsPredictions)
{
	addPerson("Anna One");
	makeTrigger(false);
	focusEntry();
	type("Anna");
	waitPastPause();
	EXPECT_EQ(0, m_trigger->getLoadCount());
	EXPECT_EQ(nullptr, m_trigger->getPredictionList());
}

TEST_F(CtPredictionListControlTest, UnfocusedEntryOrBlankNameShowsNothing)
{
	addPerson("Anna One");
	makeTrigger(true);
	elm_object_focus_set(m_entry, EINA_FALSE);
	m_trigger->onNameChanged(m_entry, nullptr, "Anna");
	waitPastPause();
	EXPECT_EQ(nullptr, m_trigger->getPredictionList());
	focusEntry();
	type("Anna");
	waitPastPause();
	ASSERT_NE(nullptr, m_trigger->getPredictionList());
	m_trigger->onNameChanged(m_entry, nullptr, "   ");
	EXPECT_EQ(nullptr, m_trigger->getPredictionList()) << "a blank name closes the list";
	waitPastPause();
	EXPECT_EQ(nullptr, m_trigger->getPredictionList());
}

TEST_F(CtPredictionListControlTest, LaterTypingUpdatesInPlaceAndNoMatchCloses)
{
	addPerson("Anna One");
	addPerson("Anna Two");
	makeTrigger(true);
	focusEntry();
	type("Anna");
	waitPastPause();
	CtPredictionListControl* list = m_trigger->getPredictionList();
	ASSERT_NE(nullptr, list);
	m_trigger->onNameChanged(m_entry, nullptr, "Anna T");
	waitPastPause();
	EXPECT_EQ(list, m_trigger->getPredictionList()) << "the same list, updated";
	EXPECT_EQ(1u, ScreenHarness::genlistItems(list->getGenlist()).size());
	m_trigger->onNameChanged(m_entry, nullptr, "Anna Tx");
	waitPastPause();
	EXPECT_EQ(nullptr, m_trigger->getPredictionList()) << "no earlier rows left up";
	m_trigger->onNameChanged(m_entry, nullptr, "Qxz");
	waitPastPause();
	EXPECT_EQ(nullptr, m_trigger->getPredictionList());
}

TEST_F(CtPredictionListControlTest, EntryDeletedDuringThePauseIsForgotten)
{
	addPerson("Anna One");
	makeTrigger(true);
	focusEntry();
	type("Anna");
	evas_object_del(m_entry);
	m_entry = nullptr;
	waitPastPause();
	EXPECT_EQ(nullptr, m_trigger->getPredictionList());
}

TEST_F(CtPredictionListControlTest, ScreenshotShowsTheListUnderTheTypedName)
{
	addPerson("Anna Karenina", "+7 495 123 4567");
	addPerson("Annabel Lee", "+1 555 0101");
	addPerson("Joanna Plain");
	addPerson("Anna Bolena");
	makeTrigger(true);
	focusEntry();
	type("Ann");
	waitPastPause();
	ASSERT_NE(nullptr, m_trigger->getPredictionList());
	m_screen->pumpUntilIdle();
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/input";
	std::filesystem::create_directories(dir);
	EXPECT_TRUE(m_screen->savePng(dir + "/prediction_list.png"));
}


TEST_F(CtPredictionListControlTest, TapInTheFormCloses)
{
	addPerson("Anna One");
	makeTrigger(true);
	focusEntry();
	type("Anna");
	waitPastPause();
	ASSERT_NE(nullptr, m_trigger->getPredictionList());
	// A tap on the name field itself, which lies in the form.
	Evas* canvas = evas_object_evas_get(m_form);
	int x, y, w, h;
	evas_object_geometry_get(m_entry, &x, &y, &w, &h);
	evas_event_feed_mouse_in(canvas, 0, nullptr);
	evas_event_feed_mouse_move(canvas, x + w / 2, y + h / 2, 0, nullptr);
	evas_event_feed_mouse_down(canvas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	evas_event_feed_mouse_up(canvas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	m_screen->pumpFrames(2);
	EXPECT_EQ(nullptr, m_trigger->getPredictionList());
}

} // namespace
