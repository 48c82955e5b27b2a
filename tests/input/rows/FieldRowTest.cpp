// The field rows over a stored contact: what typing, deleting and the type
// menu write into the contact, the changed and empty states, the limits and
// the keypad signals.
#include "InputRowTestSupport.h"

#include "CtInputViewEmailItem.h"
#include "CtInputViewNoteItem.h"
#include "CtInputViewNumberItem.h"
#include "CtInputViewStatusItem.h"
#include "CtInputViewWebsiteItem.h"

using namespace ct::test;

namespace {

using Strings = std::vector<std::string>;

contacts_record_h nth(Eina_List* list, int index = 0)
{
	contacts_record_h record = static_cast<contacts_record_h>(eina_list_nth(list, index));
	eina_list_free(list);
	return record;
}

// A stored contact "Ada" with a mobile number and a home e-mail; returns its id.
int storeAda()
{
	contacts_record_h contact = newContact(0, "Ada");
	addNumber(contact, "0101", CONTACTS_NUMBER_TYPE_CELL);
	addEmail(contact, "ada@example.com");
	return store(contact);
}

using FieldRowTest = InputRowTest;

} // namespace

TEST_F(FieldRowTest, StoredRowEmptiedIsChangedAndEmptyWhileAnAddedRowLeftEmptyIsNeither)
{
	auto data = edit(storeAda());
	contacts_record_h email = nth(data->getEmailList());
	auto* stored = new CtInputViewEmailItem(data, email, 0, m_calls.callbacks(), data->getEmailEmail(email));
	contacts_record_h added = data->addEmail("");
	auto* fresh = new CtInputViewEmailItem(data, added, 0, m_calls.callbacks(), nullptr);
	Elm_Object_Item* storedItem = show(stored);
	show(fresh);

	struct Expect {
		bool changed, empty;
	};
	auto state = [](CtInputViewGenlistItem* row) { return std::make_pair(row->getIsChanged(), row->getIsEmpty()); };
	EXPECT_EQ(std::make_pair(false, false), state(stored));
	EXPECT_EQ(std::make_pair(false, true), state(fresh));
	EXPECT_EQ(0, m_calls.changed);

	Evas_Object* entry = entryOf(storedItem);
	ASSERT_NE(nullptr, entry);
	EXPECT_EQ("ada@example.com", CtInputViewGenlistItem::getEntryUtf8(entry));
	replaceText(entry, "");
	EXPECT_EQ(std::make_pair(true, true), state(stored));
	EXPECT_EQ("", stored->getEntry() ? CtInputViewGenlistItem::getEntryUtf8(entry) : "?");
	EXPECT_EQ("", std::string(data->getEmailEmail(email) ? data->getEmailEmail(email) : ""));

	// Typing the stored text back makes the row unchanged again.
	type(entry, "ada@example.com");
	EXPECT_EQ(std::make_pair(false, false), state(stored));
	EXPECT_GE(m_calls.changed, 2);
}

TEST_F(FieldRowTest, DeleteButtonReportsWhetherTheRowHeldStoredTextAndRemovesTheRow)
{
	auto data = edit(storeAda());
	contacts_record_h email = nth(data->getEmailList());
	Elm_Object_Item* storedItem = show(new CtInputViewEmailItem(data, email, 0, m_calls.callbacks(), "ada@example.com"));
	contacts_record_h added = data->addWebsite("");
	Elm_Object_Item* addedItem = show(new CtInputViewWebsiteItem(data, added, 0, m_calls.callbacks(), nullptr));

	ASSERT_TRUE(ScreenHarness::click(content(storedItem, "elm.icon.2")));
	m_screen->pumpUntilIdle();
	ASSERT_TRUE(ScreenHarness::click(content(addedItem, "elm.icon.2")));
	m_screen->pumpUntilIdle();

	ASSERT_EQ(2u, m_calls.deleted.size());
	EXPECT_EQ(storedItem, m_calls.deleted[0].item);
	EXPECT_TRUE(m_calls.deleted[0].heldText);
	EXPECT_EQ(email, m_calls.deleted[0].record);
	EXPECT_FALSE(m_calls.deleted[1].heldText);
	EXPECT_EQ(added, m_calls.deleted[1].record);
	EXPECT_EQ(0u, elm_genlist_items_count(m_view->genlist));
}

TEST_F(FieldRowTest, DigitsGetTheRegionsDashesUntilALetterIsTypedAndAgainOnceEmptied)
{
	vconf_set_str("db/menu_widget/regionformat", "en_US.UTF-8");
	auto data = editNew();
	contacts_record_h number = data->addNumber("");
	auto* row = new CtInputViewNumberItem(data, number, 0, m_calls.callbacks(), nullptr);
	Evas_Object* entry = entryOf(show(row));
	ASSERT_NE(nullptr, entry);

	for (const char* digit : {"6", "5", "0", "2", "5", "3", "0", "0", "0", "0"})
		type(entry, digit);
	EXPECT_EQ("650-253-0000", CtInputViewGenlistItem::getEntryUtf8(entry));
	EXPECT_EQ("650-253-0000", std::string(data->getNumberNumber(number)));
	EXPECT_EQ(12, elm_entry_cursor_pos_get(entry));

	type(entry, "p");
	EXPECT_FALSE(row->isFormatting());
	type(entry, "1");
	EXPECT_EQ("650-253-0000p1", std::string(data->getNumberNumber(number)));

	replaceText(entry, "");
	EXPECT_TRUE(row->isFormatting());
	type(entry, "6502530000");
	EXPECT_EQ("650-253-0000", std::string(data->getNumberNumber(number)));
	EXPECT_FALSE(row->getIsEmpty());
	EXPECT_TRUE(row->getIsChanged());
}

TEST_F(FieldRowTest, CursorStaysOnTheSameDigitWhenDashesMove)
{
	struct Case {
		const char* from;
		int cursor;
		const char* to;
		int expected;
	};
	const Case cases[] = {
		{"6502530000", 10, "650-253-0000", 12},
		{"650-2530", 5, "650-2530", 5},
		{"65012", 3, "650-12", 3},
		{"(650) 253", 6, "650253", 3},
		{"", 0, "", 0},
		{"\xd9\xa1\xd9\xa2" "3", 2, "123", 2}, // two Arabic-Indic digits are two characters
	};
	for (const Case& c : cases)
		EXPECT_EQ(c.expected, CtInputViewNumberItem::mapCursor(c.from, c.cursor, c.to)) << c.from;

	EXPECT_TRUE(CtInputViewNumberItem::insertedNonDialChar("650", "65a0"));
	EXPECT_TRUE(CtInputViewNumberItem::insertedNonDialChar("650", "650\xc3\xa9"));
	EXPECT_FALSE(CtInputViewNumberItem::insertedNonDialChar("650", "6501"));
	EXPECT_FALSE(CtInputViewNumberItem::insertedNonDialChar("650", "+650"));
	EXPECT_FALSE(CtInputViewNumberItem::insertedNonDialChar("650", "65ab0"));
	EXPECT_FALSE(CtInputViewNumberItem::insertedNonDialChar("650", "65"));
}

TEST_F(FieldRowTest, FocusingAnEntryRaisesTheKeypadAndTheHarnessCanLowerAndRaiseIt)
{
	auto data = edit(storeAda());
	contacts_record_h number = nth(data->getNumberList());
	Evas_Object* entry = entryOf(show(new CtInputViewNumberItem(data, number, 0, m_calls.callbacks(), "0101")));
	ASSERT_NE(nullptr, entry);
	EXPECT_FALSE(m_screen->isKeypadShown());

	elm_object_focus_set(entry, EINA_TRUE);
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(m_screen->isKeypadShown());
	EXPECT_EQ(1, m_view->keypadOn);
	EXPECT_EQ((std::vector<bool>{true}), m_calls.focus);

	m_screen->lowerKeypad();
	EXPECT_EQ(1, m_view->keypadOff);
	m_screen->raiseKeypad();
	EXPECT_EQ(2, m_view->keypadOn);

	elm_object_focus_set(entry, EINA_FALSE);
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(m_screen->isKeypadShown());
	EXPECT_EQ(2, m_view->keypadOff);
}

TEST_F(FieldRowTest, EntriesStopAtTheirLimitWithOneNoticeAndAPasteOf100KbIsCutOnACharacter)
{
	auto data = editNew();
	auto* note = new CtInputViewNoteItem(data, data->addNote(""), 0, m_calls.callbacks(), nullptr);
	auto* website = new CtInputViewWebsiteItem(data, data->addWebsite(""), 0, m_calls.callbacks(), nullptr);
	Evas_Object* noteEntry = entryOf(show(note));
	Evas_Object* websiteEntry = entryOf(show(website));
	ASSERT_TRUE(noteEntry && websiteEntry);
	ScreenHarness::clearNotices();

	type(noteEntry, std::string(999, 'n').c_str());
	type(noteEntry, "\xe2\x82\xac"); // the 1000th character, three bytes
	type(noteEntry, "x");
	type(noteEntry, "y");
	type(websiteEntry, std::string(1001, 'w').c_str());
	EXPECT_EQ(std::string(999, 'n') + "\xe2\x82\xac", std::string(data->getNote(note->getRecord())));
	EXPECT_EQ(std::string(1000, 'w'), std::string(data->getWebsiteWebsite(website->getRecord())));
	// Each row tells once within 3.5 s.
	EXPECT_EQ(2u, ScreenHarness::notices().size());

	// 100 KB of two-byte characters pasted over the text: 1000 whole characters stay.
	std::string paste;
	while (paste.size() < 100 * 1024)
		paste += "\xc3\xa9";
	replaceText(websiteEntry, paste.c_str());
	std::string stored = data->getWebsiteWebsite(website->getRecord());
	EXPECT_EQ(2000u, stored.size());
	EXPECT_EQ(paste.substr(0, 2000), stored);
}

TEST_F(FieldRowTest, StatusStopsAtSixtyCharacters)
{
	auto data = editNew();
	auto* status = new CtInputViewStatusItem(data, nullptr, 0, m_calls.callbacks(), nullptr);
	Evas_Object* entry = entryOf(show(status));
	ASSERT_NE(nullptr, entry);
	type(entry, std::string(70, 's').c_str());
	EXPECT_EQ(std::string(60, 's'), CtInputViewGenlistItem::getEntryUtf8(entry));
}

TEST_F(FieldRowTest, MarkupAndOverlongStoredTextsAreShownAndKeptAsStored)
{
	contacts_record_h contact = newContact(0, "Ada");
	addNumber(contact, "<b>0101&amp;", CONTACTS_NUMBER_TYPE_CELL);
	std::string longNote(3000, 'L');
	addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, longNote.c_str());
	int contactId = store(contact);
	auto data = edit(contactId);
	contacts_record_h number = nth(data->getNumberList());
	contacts_record_h note = nth(data->getNoteList());
	auto* numberRow = new CtInputViewNumberItem(data, number, 0, m_calls.callbacks(), data->getNumberNumber(number));
	auto* noteRow = new CtInputViewNoteItem(data, note, 0, m_calls.callbacks(), data->getNote(note));
	Evas_Object* numberEntry = entryOf(show(numberRow));
	Evas_Object* noteEntry = entryOf(show(noteRow));

	EXPECT_EQ("<b>0101&amp;", CtInputViewGenlistItem::getEntryUtf8(numberEntry));
	EXPECT_EQ(longNote, CtInputViewGenlistItem::getEntryUtf8(noteEntry));
	EXPECT_EQ(0, m_calls.changed);
	EXPECT_FALSE(numberRow->getIsChanged() || noteRow->getIsChanged());

	// A letter typed at the end of the markup-like number keeps it as typed.
	elm_entry_cursor_end_set(numberEntry);
	type(numberEntry, "<");
	ASSERT_EQ(CONTACTS_ERROR_NONE, data->updateContact());
	reopenStore();
	contacts_record_h saved = readContact(contactId);
	EXPECT_EQ("<b>0101&amp;<", textOf(childAt(saved, _contacts_contact.number, 0), _contacts_number.number));
	EXPECT_EQ(longNote, textOf(childAt(saved, _contacts_contact.note, 0), _contacts_note.note));
	contacts_record_destroy(saved, true);
}

TEST_F(FieldRowTest, ProfileSharingStorageShowsTheNumberDisabledWithoutDeleteButton)
{
	int book = addAddressbook("sharing", 0, 1, ContactsCommon::translate("IDS_PB_MBODY_PROFILE_SHARING"));
	contacts_record_h contact = newContact(book, "Ada");
	addNumber(contact, "0101", CONTACTS_NUMBER_TYPE_CELL);
	auto data = edit(store(contact));
	contacts_record_h number = nth(data->getNumberList());
	auto* row = new CtInputViewNumberItem(data, number, 0, m_calls.callbacks(), "0101");
	Elm_Object_Item* item = show(row);
	ASSERT_TRUE(row->isProfileSharingStorage());
	EXPECT_TRUE(ScreenHarness::isDisabled(entryOf(item)));
	EXPECT_TRUE(ScreenHarness::isDisabled(row->getHoverselObj()));
	EXPECT_EQ(nullptr, content(item, "elm.icon.2"));
}

TEST_F(FieldRowTest, AddedRowTakesTheFocusWhenFirstShownAndReturnKeyGoesToTheOwner)
{
	auto data = editNew();
	auto* row = new CtInputViewEmailItem(data, data->addEmail(""), CtInputViewEmailItem::kAddKind, m_calls.callbacks(),
			nullptr);
	Evas_Object* entry = entryOf(show(row));
	ASSERT_NE(nullptr, entry);
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->isKeypadShown(); }, 1.0));
	EXPECT_EQ(entry, app_assist::WVirtualKeypad::findInputPanelEntry(evas_focus_get(evas_object_evas_get(entry))));
	EXPECT_EQ((std::vector<bool>{false, true}), m_calls.focus);
	evas_object_smart_callback_call(entry, "activated", nullptr);
	EXPECT_EQ((std::vector<Evas_Object*>{entry}), m_calls.activated);
}

TEST_F(FieldRowTest, BackKeyFirstClearsASelectionInAnEntry)
{
	auto data = edit(storeAda());
	contacts_record_h email = nth(data->getEmailList());
	Evas_Object* entry = entryOf(show(new CtInputViewEmailItem(data, email, 0, m_calls.callbacks(), "ada@example.com")));
	ASSERT_NE(nullptr, entry);
	elm_object_focus_set(entry, EINA_TRUE);
	elm_entry_select_all(entry);
	m_screen->pumpUntilIdle();
	ASSERT_NE(nullptr, elm_entry_selection_get(entry));
	int views = m_screen->viewCount();
	m_screen->sendBackKey();
	EXPECT_EQ(nullptr, elm_entry_selection_get(entry));
	EXPECT_EQ(views, m_screen->viewCount());
	EXPECT_EQ("ada@example.com", std::string(data->getEmailEmail(email)));
}
