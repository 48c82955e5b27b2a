// The shareable-field block: its rows, a field the agent reports as shared,
// toggling with and without network, and what each toggle records.
#include "SharingScreenTest.h"

#include "CtContactsAgentMgr.h"
#include "CtProfileOptionItem.h"
#include "CtProfileOptionSelectControl.h"

using namespace ct::test;

class CtProfileOptionSelectControlTest : public SharingScreenTest {
protected:
	ListHostView* show(std::function<void()> onChanged = {})
	{
		auto* view = new ListHostView();
		EXPECT_TRUE(m_screen->push(view));
		CtProfileOptionSelectControl control;
		control.setOnChanged(std::move(onChanged));
		EXPECT_EQ(6, control.append(view->genlist));
		m_screen->pumpUntilIdle();
		return view;
	}
	static std::vector<CtProfileOptionItem*> options(ListHostView* view)
	{
		return ScreenHarness::rowsOf<CtProfileOptionItem>(view->genlist);
	}
};

TEST_F(CtProfileOptionSelectControlTest, AppendsTitleExplanationAndFourFieldsWithTheSharedOneOn)
{
	CtContactsAgentMgr::getInstance()->setProfileProperty(CT_PROFILE_PROPERTY_ADDRESS, true);
	ListHostView* view = show();
	std::vector<std::string> shown;
	for (CtProfileSharingRow* row : rows(view->genlist))
		shown.push_back(row->getStyle() + "|" + row->getText("elm.text") + row->getText("elm.text.main.left")
			+ (row->isDisplayOnly() ? "|display" : ""));
	EXPECT_EQ((std::vector<std::string>{"group_index|Additional info to share|display", "multiline_sub||display",
		"1line|Email", "1line|Organisation", "1line|Address", "1line|Date of birth"}), shown);
	EXPECT_FALSE(rows(view->genlist)[1]->getText("elm.text.multiline").empty());
	std::vector<bool> on;
	for (CtProfileOptionItem* option : options(view))
		on.push_back(isOn(option->getCheck()));
	EXPECT_EQ((std::vector<bool>{false, false, true, false}), on);
}

TEST_F(CtProfileOptionSelectControlTest, TogglesStoreTheFieldAndRecordItsName)
{
	struct Case {
		const char* how;
		CtProfileProperty property;
		const char* logName;
	} cases[] = {
		{"row", CT_PROFILE_PROPERTY_EMAIL, "Email"},
		{"switch", CT_PROFILE_PROPERTY_ORGANIZATION, "Organisation"},
		{"row", CT_PROFILE_PROPERTY_BIRTHDAY, "Birthday"},
	};
	int changes = 0;
	size_t before = usage("CT19").size();
	ListHostView* view = show([&changes] { ++changes; });
	for (const Case& c : cases) {
		SCOPED_TRACE(c.logName);
		CtProfileOptionItem* option = options(view)[c.property];
		if (std::string(c.how) == "row")
			ScreenHarness::selectItem(option->getElmObjectItem());
		else
			EXPECT_TRUE(toggle(option->getCheck()));
		m_screen->pumpUntilIdle();
		EXPECT_TRUE(CtContactsAgentMgr::getInstance()->getProfileProperty(c.property));
		EXPECT_TRUE(isOn(options(view)[c.property]->getCheck()));
		ASSERT_FALSE(usage("CT19").empty());
		EXPECT_EQ(c.logName, usage("CT19").back().extra);
	}
	EXPECT_EQ(3, changes);
	EXPECT_EQ(before + 3, usage("CT19").size());
	EXPECT_FALSE(CtContactsAgentMgr::getInstance()->getProfileProperty(CT_PROFILE_PROPERTY_ADDRESS));
}

TEST_F(CtProfileOptionSelectControlTest, ToggleWithoutNetworkKeepsOldStateShowsNoticeAndStillRecords)
{
	CtContactsAgentMgr::getInstance()->setProfileProperty(CT_PROFILE_PROPERTY_EMAIL, true);
	ListHostView* view = show();
	size_t before = usage("CT19").size();
	setNetwork(false);
	ScreenHarness::selectItem(options(view)[0]->getElmObjectItem());
	EXPECT_TRUE(toggle(options(view)[1]->getCheck()));
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(CtContactsAgentMgr::getInstance()->getProfileProperty(CT_PROFILE_PROPERTY_EMAIL));
	EXPECT_FALSE(CtContactsAgentMgr::getInstance()->getProfileProperty(CT_PROFILE_PROPERTY_ORGANIZATION));
	EXPECT_TRUE(isOn(options(view)[0]->getCheck()));
	EXPECT_FALSE(isOn(options(view)[1]->getCheck()));
	ASSERT_EQ(2u, ScreenHarness::notices().size());
	EXPECT_NE(std::string::npos, ScreenHarness::notices()[0].find("network"));
	EXPECT_EQ(before + 2, usage("CT19").size());
}
