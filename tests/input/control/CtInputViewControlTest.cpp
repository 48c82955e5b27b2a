// The edit form's list: rows a person gets for new and stored contacts, the
// frame-by-frame listing of long contacts, the add buttons and the add-field
// popup, the changed and empty tests, and the storage switch.
#include "ControlTestSupport.h"

#include "CtInputViewImportantFieldsItem.h"
#include "CtCommonAddressbookUtil.h"
#include "CtInputViewNumberItem.h"

#include <ui_extension.h>
#include <vconf.h>

using namespace ct::test;

namespace {

using Kinds = std::vector<std::string>;
using Rows = std::vector<std::pair<std::string, bool>>;

int storeWithNumbers(int count, const char* email = nullptr)
{
	contacts_record_h contact = newContact(0, "Ada");
	for (int i = 0; i < count; ++i)
		addText(contact, _contacts_contact.number, _contacts_number._uri, _contacts_number.number,
				("0101000" + std::to_string(i)).c_str());
	if (email)
		addText(contact, _contacts_contact.email, _contacts_email._uri, _contacts_email.email, email);
	return store(contact);
}

void typeInto(Evas_Object* entry, const char* text)
{
	elm_entry_entry_insert(entry, text);
}

Evas_Object* entryOf(CtInputViewGenlistItem* row)
{
	auto* field = dynamic_cast<CtInputViewFieldItem*>(row);
	return field ? field->getEntry() : nullptr;
}

class CtInputViewControlTest : public InputControlTest {
protected:
	std::vector<std::string> moreLabels()
	{
		std::vector<std::string> labels;
		for (const auto& row : popupRows())
			labels.push_back(row.first + (row.second ? " (off)" : ""));
		return labels;
	}
	static std::vector<std::string> allEntries()
	{
		std::vector<std::string> labels;
		for (const char* id : { "IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB", "IDS_PB_BODY_GROUPS", "IDS_PB_OPT_ORGANISATION_ABB",
				 "IDS_PB_BODY_ADDRESS_ABB2", "IDS_PB_OPT_WEB_ADDRESS_ABB", "IDS_PB_OPT_IM_ACCOUNT_ABB",
				 "IDS_PB_OPT_EVENT_HEG_BIRTHDAY_ABB", "IDS_PB_BODY_NICKNAME_ABB", "IDS_PB_BODY_PHONETIC_NAME_ABB",
				 "IDS_PB_OPT_RELATIONSHIP_ABB2", "IDS_PB_OPT_RINGTONE" })
			labels.push_back(tr(id));
		return labels;
	}
};

} // namespace

TEST_F(CtInputViewControlTest, NewContactStartsWithOneEmptyNumberRowAndSaveDisabled)
{
	ASSERT_NE(nullptr, open(0));
	EXPECT_EQ((Kinds{ "basic", "number", "buttons" }), kinds());
	EXPECT_TRUE(control()->__checkIsEmpty());
	EXPECT_TRUE(ScreenHarness::isDisabled(m_view->getDoneButton()));
	EXPECT_EQ(1u, eina_list_count(m_view->getData()->getNumberList()));

	typeInto(entryOf(rowAt("number")), "0102");
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(control()->__checkIsEmpty());
	EXPECT_FALSE(ScreenHarness::isDisabled(m_view->getDoneButton()));
	EXPECT_TRUE(control()->getIsChanged());
}

TEST_F(CtInputViewControlTest, StoredContactsOfMoreThanTenRecordsAreListedOneRowPerFrame)
{
	for (int count : { 10, 11 }) {
		SCOPED_TRACE(count);
		int id = storeWithNumbers(count);
		open(id, nullptr, false);
		ASSERT_NE(nullptr, control());
		bool deferred = count > CtInputViewControl::kDeferredAppendThreshold;
		EXPECT_EQ(deferred, control()->isAppending());
		size_t listed = kinds().size();
		EXPECT_EQ(deferred ? 1u : count + 4u, listed) << "basic info, numbers, groups, storage and add buttons";
		if (deferred) {
			m_screen->pumpFrames(2);
			EXPECT_LT(listed, kinds().size()) << "a row per frame";
		}
		m_screen->pumpUntil([this] { return !control()->isAppending(); }, 20.0);
		m_screen->pumpUntilIdle();
		Kinds expected{ "basic" };
		expected.insert(expected.end(), count, "number");
		expected.insert(expected.end(), { "groups", "storage", "buttons" });
		EXPECT_EQ(expected, kinds());
		EXPECT_FALSE(control()->isAppending());
		EXPECT_EQ(deferred, (bool)uxt_scroller_is_auto_scroll_enabled(genlist()))
				<< "on after a frame-by-frame listing, else once the last row is shown";
		EXPECT_FALSE(control()->getIsChanged());
		close();
	}
}

TEST_F(CtInputViewControlTest, AddFieldPopupOffersWhatTheFormDoesNotShowYet)
{
	int groupId = addGroup(0, "Friends");
	contacts_record_h contact = newContact(0, "Ada");
	contacts_record_set_str(contact, _contacts_contact.ringtone_path, "/usr/share/sounds/ringtones/a.ogg");
	int stored = store(contact);
	contacts_group_add_contact(groupId, stored);
	std::vector<std::string> all = allEntries();
	std::vector<std::string> offPowerSaving = all;
	offPowerSaving.back() += " (off)";
	std::vector<std::string> forStored(all.begin() + 2, all.end() - 1);
	struct Case {
		int contact;
		int powerSaving;
		std::vector<std::string> expected;
	} cases[] = {
		{ 0, 0, all },
		{ 0, 1, offPowerSaving },
		{ stored, 0, forStored },
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.contact);
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, c.powerSaving);
		m_screen->pumpUntilIdle();
		open(c.contact);
		openMorePopup();
		EXPECT_EQ(c.expected, moreLabels());
		close();
	}

	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
	open(0);
	openMorePopup();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_BODY_ADDRESS_ABB2")));
	EXPECT_EQ(nullptr, popupList()) << "the popup closes";
	openMorePopup();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_WEB_ADDRESS_ABB")));
	ASSERT_TRUE(ScreenHarness::click(addButton(CtInputViewImportantFieldsItem::PHONE)));
	m_screen->pumpUntilIdle();
	EXPECT_EQ((Kinds{ "basic", "number", "number", "address", "website", "buttons" }), kinds());
	EXPECT_TRUE(control()->__checkIsEmpty()) << "added rows are empty";
}

TEST_F(CtInputViewControlTest, MoreButtonWhileTheKeypadIsUpOpensThePopupOnceItIsDown)
{
	open(0);
	m_screen->raiseKeypad();
	ASSERT_TRUE(ScreenHarness::click(addButton(CtInputViewImportantFieldsItem::MORE)));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, popupList());
	m_screen->lowerKeypad();
	EXPECT_EQ(11u, popupRows().size());
}

TEST_F(CtInputViewControlTest, NoteIsAddedOnceAndItsButtonComesBackWhenItIsDeleted)
{
	open(0);
	Evas_Object* note = addButton(CtInputViewImportantFieldsItem::NOTE);
	ASSERT_TRUE(ScreenHarness::click(note));
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(ScreenHarness::isDisabled(addButton(CtInputViewImportantFieldsItem::NOTE)));
	EXPECT_FALSE(ScreenHarness::click(addButton(CtInputViewImportantFieldsItem::NOTE)));
	m_screen->pumpUntilIdle();
	EXPECT_EQ((Kinds{ "basic", "number", "note", "buttons" }), kinds());
	EXPECT_EQ(1u, eina_list_count(m_view->getData()->getNoteList()));

	dynamic_cast<CtInputViewFieldItem*>(rowAt("note"))->deleteRow();
	m_screen->pumpUntilIdle();
	EXPECT_EQ((Kinds{ "basic", "number", "buttons" }), kinds());
	EXPECT_FALSE(ScreenHarness::isDisabled(addButton(CtInputViewImportantFieldsItem::NOTE)));
	EXPECT_EQ(0u, eina_list_count(m_view->getData()->getNoteList()));
	EXPECT_EQ(nullptr, control()->getLastItem(CtInputViewControl::INPUT_NOTE));
}

TEST_F(CtInputViewControlTest, DeletedRowsCountAsAChangeUnlessTheyWerePrefilled)
{
	struct Case {
		const char* name;
		bool prefilled;
		const char* kind;
		bool typeFirst;
		bool changed;
	} cases[] = {
		{ "stored number deleted", false, "number", false, true },
		{ "stored number edited", false, "number", true, true },
		{ "prefilled number deleted", true, "number", false, false },
		{ "prefilled e-mail deleted", true, "email", false, true },
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		int id = storeWithNumbers(c.prefilled ? 0 : 1, c.prefilled ? nullptr : "ada@example.com");
		bool number = std::string(c.kind) == "number";
		Request request = ct::test::request(APP_CONTROL_OPERATION_EDIT,
				{ { APP_CONTROL_DATA_ID, std::to_string(personOf(id)) }, { "type", "0" },
					{ number ? APP_CONTROL_DATA_PHONE : APP_CONTROL_DATA_EMAIL, number ? "01099" : "new@example.com" } });
		CtLaunchRequest launch;
		launch.appControl = request.get();
		open(id, c.prefilled ? &launch : nullptr);
		CtInputViewGenlistItem* row = rowAt(c.kind);
		ASSERT_NE(nullptr, row);
		EXPECT_EQ(c.prefilled, row->getIsPrefilled());
		EXPECT_EQ(c.prefilled, control()->getIsChanged()) << "what the caller handed in is a change";
		if (c.typeFirst)
			typeInto(entryOf(row), "7");
		else
			dynamic_cast<CtInputViewFieldItem*>(row)->deleteRow();
		m_screen->pumpUntilIdle();
		EXPECT_EQ(c.changed, control()->getIsChanged());
		close();
	}
}

TEST_F(CtInputViewControlTest, ProfileSharingStorageIsNeverEmpty)
{
	int sharing = addAddressbook("profile-sharing", 0, 9, tr("IDS_PB_MBODY_PROFILE_SHARING").c_str());
	for (auto book : { std::make_pair(0, true), std::make_pair(sharing, false) }) {
		SCOPED_TRACE(book.first);
		char* name = ctCommonGetAddressBookName(book.first);
		preference_set_string("input_base_addressbook", name ? name : "");
		free(name);
		open(0);
		EXPECT_EQ(book.first, m_view->getData()->getAddressbookId());
		EXPECT_EQ(book.second, control()->__checkIsEmpty());
		EXPECT_EQ(book.second, ScreenHarness::isDisabled(m_view->getDoneButton()));
		close();
	}
}

TEST_F(CtInputViewControlTest, ChoosingAnotherStorageAfterTypingAsksAndCancelKeepsTheStorage)
{
	int mail = addAddressbook("mail", 0, 7, "Mail");
	open(0);
	openMorePopup();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB")));
	ASSERT_TRUE(choosePopupRow("Mail"));
	EXPECT_EQ(mail, m_view->getData()->getAddressbookId());
	EXPECT_EQ((Kinds{ "basic", "number", "storage", "buttons" }), kinds()) << "the storage row is shown from now on";

	typeInto(entryOf(rowAt("number")), "0102");
	m_screen->pumpUntilIdle();
	CtInputViewControl* before = control();
	for (bool change : { false, true }) {
		SCOPED_TRACE(change);
		ScreenHarness::selectItem(itemAt("storage"));
		m_screen->pumpUntilIdle();
		ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_DEVICE")));
		EXPECT_EQ(tr("IDS_PB_POP_SOME_CONTACT_INFORMATION_MAY_BE_LOST"), popupText());
		Evas_Object* button = m_screen->findButton(tr(change ? "IDS_PB_BUTTON_CHANGE_ABB" : "IDS_PB_BUTTON_CANCEL"));
		ASSERT_NE(nullptr, button);
		ASSERT_TRUE(ScreenHarness::click(button));
		m_screen->pumpUntilIdle();
		EXPECT_EQ(change ? 0 : mail, m_view->getData()->getAddressbookId());
		if (!change) {
			EXPECT_EQ(before, control());
		}
	}
	EXPECT_NE(nullptr, control()) << "a new list for the phone's storage";
}
