// The share-with screen: its three levels with the stored one chosen, what a
// choice stores and records, when the contacts picker opens, and the setting
// button of selected contacts with sharing on and off.
#include "SharingScreenTest.h"

#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtProfileSettingKeys.h"
#include "CtProfileShareWithView.h"

using namespace ct::test;

class CtProfileShareWithViewTest : public SharingScreenTest {
protected:
	CtProfileShareWithView* show()
	{
		auto* view = new CtProfileShareWithView();
		EXPECT_TRUE(m_screen->push(view));
		m_screen->pumpUntilIdle();
		return view;
	}
	static CtProfileSharingRow* rowOf(CtProfileShareWithView* view, int level)
	{
		return rows(view->getGenlist()).at(level - 1);
	}
	static Evas_Object* radioOf(CtProfileShareWithView* view, int level)
	{
		return rowOf(view, level)->getHeldContent("elm.icon.1");
	}
	static int checkedLevel(CtProfileShareWithView* view)
	{
		int checked = 0;
		for (int level = 1; level <= 3; ++level) {
			Evas_Object* radio = radioOf(view, level);
			if (radio && elm_radio_value_get(radio) == elm_radio_state_value_get(radio))
				checked = checked ? -1 : level;
		}
		return checked;
	}
	static bool isButton(Evas_Object* obj)
	{
		const char* type = evas_object_type_get(obj);
		return type && std::string(type).find("utton") != std::string::npos;
	}
	void choose(CtProfileShareWithView* view, int level)
	{
		ScreenHarness::selectItem(rowOf(view, level)->getElmObjectItem());
		m_screen->pumpUntilIdle();
	}
};

TEST_F(CtProfileShareWithViewTest, ShowsThreeLevelsWithTheStoredOneChosenAndNoneForAnUnknownLevel)
{
	for (const auto& [stored, checked] : {std::pair{2, 2}, std::pair{9, 0}}) {
		SCOPED_TRACE(stored);
		preference_set_int(CT_PREF_PROFILE_PRIVACY_LEVEL, stored);
		CtProfileShareWithView* view = show();
		EXPECT_EQ("Share with", ScreenHarness::naviText(view));
		std::vector<std::string> texts;
		for (CtProfileSharingRow* row : rows(view->getGenlist()))
			texts.push_back(row->getText("elm.text.main.left"));
		EXPECT_EQ((std::vector<std::string>{"All contacts", "Favourites", "Selected contacts"}), texts);
		EXPECT_EQ(checked, checkedLevel(view));
		view->popOut();
		m_screen->pumpUntilIdle();
	}
	EXPECT_STREQ("", CtProfileShareWithView::textIdOf(9));
}

TEST_F(CtProfileShareWithViewTest, ChoosingALevelStoresItRecordsItAndMovesTheRadio)
{
	struct Case {
		int level;
		const char* extra;
	} cases[] = {{1, "All contacts"}, {2, "Favourites"}, {1, "All contacts"}};
	CtProfileShareWithView* view = show();
	for (const Case& c : cases) {
		SCOPED_TRACE(c.extra);
		choose(view, c.level);
		EXPECT_EQ(c.level, CtContactsAgentUtil::getPreferenceProfilePrivacyLevel());
		EXPECT_EQ(c.level, checkedLevel(view));
		ASSERT_FALSE(usage("CT10").empty());
		EXPECT_EQ(c.extra, usage("CT10").back().extra);
	}
	EXPECT_EQ(0, pickerLaunches());
}

TEST_F(CtProfileShareWithViewTest, FavouritesAgainRecordsTheChoiceButDoesNotRefreshTheRows)
{
	CtContactsAgentMgr::getInstance()->setPrivacyLevel(2);
	CtProfileShareWithView* view = show();
	Evas_Object* radioBefore = radioOf(view, 2);
	size_t before = usage("CT10").size();
	choose(view, 2);
	EXPECT_EQ(before + 1, usage("CT10").size());
	EXPECT_EQ("Favourites", usage("CT10").back().extra);
	// A refresh rebuilds the row contents; the same radio proves none happened.
	EXPECT_EQ(radioBefore, radioOf(view, 2));
	choose(view, 1);
	EXPECT_NE(radioBefore, radioOf(view, 2));
}

TEST_F(CtProfileShareWithViewTest, FirstChoiceOfSelectedContactsOpensThePickerLaterOnlyTheButtonDoes)
{
	CtEsuAgentMgr::getInstance()->setProfileSharingStatus(true);
	CtProfileShareWithView* view = show();
	choose(view, 3);
	ASSERT_EQ(1, pickerLaunches());
	ct::appcontrol::LaunchRecord launch = ct::appcontrol::launches().back();
	EXPECT_EQ("65", launch.extra("type"));
	EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, launch.launchMode);
	EXPECT_FALSE(launch.replyRequested);

	// The picker's list reaches the agent, which marks it chosen.
	int ids[] = {4, 7};
	CtContactsAgentMgr::getInstance()->setPermittedList(ids, 2);
	choose(view, 1);
	choose(view, 3);
	EXPECT_EQ(1, pickerLaunches());

	Evas_Object* button = rowOf(view, 3)->getHeldContent("elm.icon.2");
	ASSERT_NE(nullptr, button);
	EXPECT_TRUE(isButton(button));
	EXPECT_TRUE(ScreenHarness::click(button));
	EXPECT_EQ(2, pickerLaunches());
	shot("share-with");
}

TEST_F(CtProfileShareWithViewTest, SettingOfSelectedContactsIsADimmedImageWhileSharingIsOff)
{
	CtProfileShareWithView* view = show();
	Evas_Object* setting = rowOf(view, 3)->getHeldContent("elm.icon.2");
	ASSERT_NE(nullptr, setting);
	EXPECT_FALSE(isButton(setting));
	EXPECT_EQ(nullptr, rowOf(view, 1)->getHeldContent("elm.icon.2"));
	EXPECT_EQ(0, pickerLaunches());
}
