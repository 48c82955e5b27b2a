// Done and leaving on the tabbed edit form of a linked person: every changed
// page written, none when one page fails its emergency check, one question
// before changes are thrown away.
#include "DetailActionsTest.h"

#include "CtEditTabView.h"
#include "CtInputView.h"
#include "CtInputViewNumberItem.h"

using namespace ct::test;

namespace {

std::string numberOf(int contactId)
{
	contacts_record_h contact = nullptr;
	if (contacts_db_get_record(_contacts_contact._uri, contactId, &contact) != CONTACTS_ERROR_NONE)
		return "(no contact)";
	contacts_record_h number = nullptr;
	char* text = nullptr;
	if (contacts_record_get_child_record_at_p(contact, _contacts_contact.number, 0, &number) == CONTACTS_ERROR_NONE)
		contacts_record_get_str_p(number, _contacts_number.number, &text);
	std::string value = text ? text : "";
	contacts_record_destroy(contact, true);
	return value;
}

} // namespace

class EditTabsSaveTest : public DetailActionsTest {
protected:
	// Shows page `index` and types `text` into its first number.
	void typeNumber(CtEditTabView* tabs, int index, const char* text)
	{
		elm_toolbar_item_selected_set(tabs->getTabItem(index), EINA_TRUE);
		ASSERT_TRUE(m_screen->pumpUntil([tabs, index] { return tabs->getCurrentPage() == index; }));
		m_screen->pumpUntilIdle();
		auto numbers = numberRows(tabs, index);
		ASSERT_FALSE(numbers.empty());
		ASSERT_NE(nullptr, numbers[0]->getEntry());
		elm_entry_entry_insert(numbers[0]->getEntry(), text);
		m_screen->pumpUntilIdle();
	}
	// The form's number rows, or none while this build lists no rows yet.
	static std::vector<CtInputViewNumberItem*> numberRows(CtEditTabView* tabs, int index)
	{
		CtInputView* page = tabs->getPage(index);
		Evas_Object* list = page ? elm_object_part_content_get(page->getLayout(), "elm.swallow.content") : nullptr;
		return ScreenHarness::rowsOf<CtInputViewNumberItem>(list);
	}
	CtEditTabView* openBuiltTabs(int personId)
	{
		show(personId);
		EXPECT_TRUE(choose("IDS_PB_OPT_EDIT"));
		auto* tabs = dynamic_cast<CtEditTabView*>(m_screen->topView());
		EXPECT_TRUE(tabs && m_screen->pumpUntil([tabs] {
			for (int i = 0; i < tabs->getTabCount(); ++i)
				if (!tabs->isPageBuilt(i))
					return false;
			return true;
		}));
		return tabs;
	}
};

TEST_F(EditTabsSaveTest, DoneWritesBothChangedPagesAndLeavesTheThirdAlone)
{
	std::vector<int> contacts;
	int id = person({PHONE, ACCOUNT, PHONE}, 3, &contacts);
	CtEditTabView* tabs = openBuiltTabs(id);
	ASSERT_NE(nullptr, tabs);
	if (numberRows(tabs, 0).empty())
		GTEST_SKIP() << "the edit form lists no rows in this build";
	typeNumber(tabs, 0, "7");
	typeNumber(tabs, 2, "8");
	m_screen->savePng(actionShotPath("edit-tabs-changed.png"));
	ASSERT_TRUE(clickPopupButton("IDS_TPLATFORM_ACBUTTON_DONE_ABB"));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 1; }));
	reopenStore();
	Strings numbers = {numberOf(contacts[0]), numberOf(contacts[1]), numberOf(contacts[2])};
	EXPECT_NE(std::string::npos, numbers[0].find('7')) << numbers[0];
	EXPECT_EQ("010-555-0001", numbers[1]);
	EXPECT_NE(std::string::npos, numbers[2].find('8')) << numbers[2];
}

TEST_F(EditTabsSaveTest, OnePageFailingTheEmergencyCheckWritesNothing)
{
	int emergency = addGroup(0, "Emergency", "emergency");
	int first = store([] {
		contacts_record_h contact = newContact(0, "Has number");
		addNumber(contact, "010-1234", CONTACTS_NUMBER_TYPE_CELL);
		return contact;
	}());
	int second = store(newContact(0, "No number"));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_group_add_contact(emergency, second));
	int id = linkContacts({first, second});
	CtEditTabView* tabs = openBuiltTabs(id);
	ASSERT_NE(nullptr, tabs);
	if (numberRows(tabs, 0).empty())
		GTEST_SKIP() << "the edit form lists no rows in this build";
	typeNumber(tabs, 0, "9");
	ASSERT_TRUE(clickPopupButton("IDS_TPLATFORM_ACBUTTON_DONE_ABB"));
	m_screen->pumpFor(0.3);
	EXPECT_EQ(tabs, m_screen->topView());
	EXPECT_EQ(translated({"IDS_PB_TPOP_UNABLE_TO_SAVE_CONTACT_AS_EMERGENCY_CONTACT_NO_PHONE_NUMBER_ENTERED"}),
			ScreenHarness::notices());
	reopenStore();
	EXPECT_EQ("010-1234", numberOf(first));

	// Leaving asks once for all pages; Cancel keeps the form working.
	m_screen->lowerKeypad();
	m_screen->sendBackKey();
	m_screen->pumpUntilIdle();
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_POP_ALL_CHANGES_WILL_BE_DISCARDED"), popupText());
	EXPECT_TRUE(clickPopupButton("IDS_PB_BUTTON_CANCEL"));
	EXPECT_EQ(tabs, m_screen->topView());
	ASSERT_TRUE(clickPopupButton("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"));
	EXPECT_TRUE(clickPopupButton("IDS_PB_BUTTON_DISCARD_ABB"));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 1; }));
	EXPECT_EQ("010-1234", numberOf(first));
}
