// Edit from the detail screen's menu: one contact opens the edit form, a
// linked person the tabbed form; its tabs, lazily built pages, Done, Cancel
// and back, and changes of the person from elsewhere while it is open.
#include "DetailActionsTest.h"

#include "CtEditTabView.h"
#include "CtInputView.h"

using namespace ct::test;

namespace {

constexpr const char* EDIT = "IDS_PB_OPT_EDIT";

Strings tabLabels(CtEditTabView* view)
{
	Strings labels;
	for (int i = 0; i < view->getTabCount(); ++i)
		labels.push_back(elm_object_item_text_get(view->getTabItem(i)));
	return labels;
}

std::vector<bool> builtPages(CtEditTabView* view)
{
	std::vector<bool> built;
	for (int i = 0; i < view->getTabCount(); ++i)
		built.push_back(view->isPageBuilt(i));
	return built;
}

} // namespace

class EditFromDetailTest : public DetailActionsTest {
protected:
	CtEditTabView* openTabs(int personId)
	{
		show(personId);
		EXPECT_TRUE(choose(EDIT));
		auto* tabs = dynamic_cast<CtEditTabView*>(m_screen->topView());
		EXPECT_NE(nullptr, tabs);
		return tabs;
	}
};

TEST_F(EditFromDetailTest, OneEditableContactOpensTheFormAndSocialContactsGetNoTab)
{
	for (const std::vector<Book>& books : {std::vector<Book>{PHONE}, std::vector<Book>{SOCIAL, PHONE}}) {
		show(person(books));
		ASSERT_TRUE(choose(EDIT));
		auto* form = dynamic_cast<CtInputView*>(m_screen->topView());
		ASSERT_NE(nullptr, form);
		EXPECT_FALSE(form->isCreateMode());
		EXPECT_EQ(m_books[PHONE], form->getStorageId());
		closeAll();
	}
	EXPECT_EQ((Strings{"Edit", "Edit"}), usageExtras("CT06"));
}

TEST_F(EditFromDetailTest, TabsOnePerLinkedContactUpToTenExpandingUpToFour)
{
	struct Case {
		int linked;
		int tabs;
		Elm_Toolbar_Shrink_Mode mode;
	};
	for (const Case& c : {Case{2, 2, ELM_TOOLBAR_SHRINK_EXPAND}, Case{4, 4, ELM_TOOLBAR_SHRINK_EXPAND},
			 Case{5, 5, ELM_TOOLBAR_SHRINK_SCROLL}, Case{12, 10, ELM_TOOLBAR_SHRINK_SCROLL}}) {
		SCOPED_TRACE(c.linked);
		std::vector<Book> books(c.linked, PHONE);
		books[1] = ACCOUNT;
		CtEditTabView* tabs = openTabs(person(books, c.linked));
		ASSERT_NE(nullptr, tabs);
		ASSERT_EQ(c.tabs, tabs->getTabCount());
		EXPECT_EQ(c.mode, elm_toolbar_shrink_mode_get(tabs->getToolbar()));
		EXPECT_EQ(ContactsCommon::translate(EDIT), ScreenHarness::naviText(tabs));
		Strings titles(c.tabs, ContactsCommon::translate("IDS_PB_OPT_DEVICE"));
		titles[1] = "Mail";
		EXPECT_EQ(titles, tabLabels(tabs));
		// The shown page at once, the others a second later.
		std::vector<bool> first(c.tabs, false);
		first[0] = true;
		EXPECT_EQ(first, builtPages(tabs));
		EXPECT_TRUE(m_screen->pumpUntil([&] { return builtPages(tabs) == std::vector<bool>(c.tabs, true); }));
		if (c.linked == 4 || c.linked == 5) {
			m_screen->pumpUntilIdle();
			m_screen->savePng(actionShotPath("edit-tabs-" + std::to_string(c.linked) + ".png"));
		}
		for (int i = 0; i < c.tabs; ++i)
			EXPECT_NE(nullptr, tabs->getPage(i)) << i;
		closeAll();
	}
}

TEST_F(EditFromDetailTest, ChoosingATabBuildsAndShowsItsPage)
{
	CtEditTabView* tabs = openTabs(person({PHONE, PHONE, ACCOUNT, PHONE, PHONE, PHONE}, 6));
	ASSERT_NE(nullptr, tabs);
	elm_toolbar_item_selected_set(tabs->getTabItem(4), EINA_TRUE);
	m_screen->pumpUntilIdle(0.5);
	EXPECT_EQ(4, tabs->getCurrentTab());
	EXPECT_TRUE(tabs->isPageBuilt(4));
	EXPECT_TRUE(m_screen->pumpUntil([tabs] { return tabs->getCurrentPage() == 4; }));
	elm_toolbar_item_selected_set(tabs->getTabItem(2), EINA_TRUE);
	EXPECT_TRUE(m_screen->pumpUntil([tabs] { return tabs->getCurrentPage() == 2; }));
	EXPECT_EQ(2, tabs->getCurrentTab());
}

TEST_F(EditFromDetailTest, BackOrCancelWithoutChangesLeavesAtOnce)
{
	int id = person({PHONE, ACCOUNT}, 2);
	for (bool useCancel : {false, true}) {
		CtEditTabView* tabs = openTabs(id);
		ASSERT_NE(nullptr, tabs);
		const int below = m_screen->viewCount() - 1;
		// The back key first takes down the keypad the form may have raised.
		m_screen->lowerKeypad();
		if (useCancel)
			ASSERT_TRUE(clickPopupButton("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"));
		else
			m_screen->sendBackKey();
		EXPECT_TRUE(m_screen->pumpUntil([&] { return m_screen->viewCount() == below; })) << useCancel;
		EXPECT_EQ(nullptr, popup());
		EXPECT_STREQ("CtDetailView", m_screen->topView()->getClassName());
	}
}

TEST_F(EditFromDetailTest, PersonDeletedOrUnlinkedElsewhereWhileTheTabsAreOpen)
{
	std::vector<int> contacts;
	int id = person({PHONE, ACCOUNT, PHONE}, 3, &contacts);
	CtEditTabView* tabs = openTabs(id);
	ASSERT_NE(nullptr, tabs);
	ASSERT_TRUE(changeFromAnotherProcess([&] { return contacts_person_unlink_contact(id, contacts[2], nullptr); }));
	m_screen->pumpFor(0.7);
	EXPECT_EQ(tabs, m_screen->topView());
	EXPECT_TRUE(m_screen->pumpUntil([tabs] { return tabs->isPageBuilt(2); }));
	EXPECT_TRUE(clickPopupButton("IDS_TPLATFORM_ACBUTTON_DONE_ABB"));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 1; }));

	closeAll();
	tabs = openTabs(id);
	ASSERT_NE(nullptr, tabs);
	ASSERT_TRUE(changeFromAnotherProcess([id] { return contacts_db_delete_record(_contacts_person._uri, id); }));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
}
