// The profile-sharing settings: rows and their state at opening, the switch
// with and without SIM and network, the processing popup until the agent
// confirms, profile type and privacy texts, the share-with button, and the
// preview of what a contact receives.
#include "SharingScreenTest.h"

#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtLoadingPopup.h"
#include "CtProfileOptionItem.h"
#include "CtProfileSettingKeys.h"
#include "CtProfileShareWithView.h"
#include "CtProfileSharingPreviewItem.h"
#include "CtProfileSharingView.h"
#include "CtRegistryMgr.h"
#include "WToastPopup.h"

#include <numeric>

using namespace ct::test;

class CtProfileSharingViewTest : public SharingScreenTest {
protected:
	CtProfileSharingView* show()
	{
		auto* view = new CtProfileSharingView();
		EXPECT_TRUE(m_screen->push(view));
		m_screen->pumpUntilIdle();
		return view;
	}
	static std::vector<Elm_Object_Item*> items(CtProfileSharingView* view)
	{
		return ScreenHarness::genlistItems(view->getGenlist());
	}
	static CtProfileSharingRow* row(CtProfileSharingView* view, int index)
	{
		return rows(view->getGenlist()).at(index);
	}
	// Indices of the disabled rows.
	static std::vector<int> disabledRows(CtProfileSharingView* view)
	{
		std::vector<int> out;
		std::vector<Elm_Object_Item*> all = items(view);
		for (size_t i = 0; i < all.size(); ++i)
			if (elm_object_item_disabled_get(all[i]))
				out.push_back(static_cast<int>(i));
		return out;
	}
	// Every row but the switch (row 0) is disabled.
	static bool onlySwitchEnabled(CtProfileSharingView* view)
	{
		std::vector<int> expected(items(view).size() - 1);
		std::iota(expected.begin(), expected.end(), 1);
		return disabledRows(view) == expected;
	}
	static int checkedProfileType(CtProfileSharingView* view)
	{
		int checked = -1;
		for (int index : {3, 4}) {
			Evas_Object* radio = row(view, index)->getHeldContent("elm.icon.1");
			if (radio && elm_radio_value_get(radio) == elm_radio_state_value_get(radio))
				checked = elm_radio_state_value_get(radio);
		}
		return checked;
	}
	void touchSwitch(CtProfileSharingView* view)
	{
		ASSERT_TRUE(toggle(view->getModeCheck()));
	}
	static void storeSharing(bool on) { preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, on); }
};

TEST_F(CtProfileSharingViewTest, ListsModeProfileTypesFieldsAndPreviewInOrder)
{
	storeSharing(true);
	CtProfileSharingView* view = show();
	EXPECT_EQ("Profile sharing", ScreenHarness::naviText(view));
	std::vector<std::string> shown;
	for (CtProfileSharingRow* r : rows(view->getGenlist()))
		shown.push_back(r->getStyle() + "|" + r->getText("elm.text.main.left") + r->getText("elm.text")
			+ r->getText("elm.text.main.left.top"));
	ASSERT_GE(shown.size(), 13u);
	EXPECT_EQ("1line|Profile sharing mode", shown[0]);
	EXPECT_EQ("group_index|Profile type", shown[1]);
	EXPECT_EQ("multiline_sub|", shown[2]);
	EXPECT_EQ("2line.top|Personal profile", shown[3]);
	EXPECT_EQ("1line|Business profile", shown[4]);
	// Rows 5 to 10 are the shareable-field block, checked with its control.
	EXPECT_EQ("group_index|What others will see", shown[11]);
	EXPECT_EQ("multiline_sub.main.1icon|", shown[12]);
	EXPECT_TRUE(row(view, 1)->isDisplayOnly());
	EXPECT_TRUE(row(view, 2)->isDisplayOnly());
	EXPECT_TRUE(isOn(view->getModeCheck()));
	EXPECT_TRUE(disabledRows(view).empty());
	shot("sharing-on");
}

// Sharing stored on but no network opens off, the stored choice kept.
TEST_F(CtProfileSharingViewTest, SharingOffOrWithoutNetworkOpensOffWithEveryRowButTheSwitchDisabled)
{
	for (bool stored : {true, false}) {
		SCOPED_TRACE(stored);
		storeSharing(stored);
		setNetwork(!stored);
		CtProfileSharingView* view = show();
		EXPECT_FALSE(isOn(view->getModeCheck()));
		EXPECT_TRUE(onlySwitchEnabled(view));
		EXPECT_EQ(stored, CtEsuAgentMgr::getInstance()->getProfileSharingStatus());
		if (!stored)
			shot("sharing-off");
		view->popOut();
		m_screen->pumpUntilIdle();
	}
}

TEST_F(CtProfileSharingViewTest, SwitchRefusedWithoutSimOrNetworkLeavesEverythingUnchanged)
{
	struct Case {
		const char* name;
		bool sim;
		bool network;
		bool viaRow;
	} cases[] = {
		{"no SIM, switch", false, true, false},
		{"no SIM, row", false, true, true},
		{"no network, switch", true, false, false},
		{"no network, row", true, false, true},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		setSimInserted(c.sim);
		setNetwork(c.network);
		CtProfileSharingView* view = show();
		size_t logged = usage("CT14").size();
		if (c.viaRow)
			ScreenHarness::selectItem(view->getModeRow()->getElmObjectItem());
		else
			touchSwitch(view);
		m_screen->pumpUntilIdle();
		EXPECT_FALSE(isOn(view->getModeCheck()));
		EXPECT_FALSE(CtEsuAgentMgr::getInstance()->getProfileSharingStatus());
		EXPECT_EQ(logged, usage("CT14").size());
		app_assist::WControl* popup = view->getPopup();
		ASSERT_NE(nullptr, popup);
		if (!c.sim) {
			EXPECT_STREQ("WPopup", popup->getClassName());
			EXPECT_NE(nullptr, m_screen->findButton("OK"));
			m_screen->sendBackKey();
			m_screen->pumpUntilIdle();
			EXPECT_EQ(nullptr, view->getPopup());
		} else {
			EXPECT_NE(nullptr, dynamic_cast<app_assist::WToastPopup*>(popup));
		}
		EXPECT_TRUE(onlySwitchEnabled(view));
		view->popOut();
		m_screen->pumpUntilIdle();
	}
}

TEST_F(CtProfileSharingViewTest, ProcessingPopupStaysUntilTheAgentConfirms)
{
	CtProfileSharingView* view = show();
	touchSwitch(view);
	// Nothing has run on the loop yet: the agent's confirmation is pending.
	auto* popup = dynamic_cast<CtLoadingPopup*>(view->getPopup());
	ASSERT_NE(nullptr, popup);
	EXPECT_TRUE(CtEsuAgentMgr::getInstance()->getProfileSharingStatus());
	ASSERT_FALSE(usage("CT14").empty());
	EXPECT_EQ("1000", usage("CT14").back().value);
	EXPECT_EQ("", usage("CT14").back().extra);

	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, 2);
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_FAVORITE_CHANGED, 0);
	// The back key straight to the canvas, without running the loop.
	Evas* canvas = evas_object_evas_get(m_screen->win());
	evas_event_feed_key_down(canvas, "Escape", "Escape", nullptr, nullptr, 1, nullptr);
	evas_event_feed_key_up(canvas, "Escape", "Escape", nullptr, nullptr, 2, nullptr);
	EXPECT_EQ(popup, view->getPopup());
	EXPECT_EQ(1, m_screen->viewCount());

	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, view->getPopup());
	EXPECT_TRUE(isOn(view->getModeCheck()));
	EXPECT_TRUE(disabledRows(view).empty());

	touchSwitch(view);
	EXPECT_NE(nullptr, dynamic_cast<CtLoadingPopup*>(view->getPopup()));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, view->getPopup());
	EXPECT_FALSE(isOn(view->getModeCheck()));
	EXPECT_FALSE(CtEsuAgentMgr::getInstance()->getProfileSharingStatus());
	EXPECT_EQ("0", usage("CT14").back().value);
	EXPECT_TRUE(onlySwitchEnabled(view));
}

TEST_F(CtProfileSharingViewTest, PrivacyLevelsReadAsTheirTexts)
{
	struct Case {
		int level;
		const char* text;
	} cases[] = {{0, "All contacts"}, {1, "All contacts"}, {2, "Favourites"}, {3, "Selected contacts"}, {7, ""}};
	storeSharing(true);
	CtProfileSharingView* view = show();
	for (const Case& c : cases) {
		SCOPED_TRACE(c.level);
		preference_set_int(CT_PREF_PROFILE_PRIVACY_LEVEL, c.level);
		EXPECT_EQ(c.text, row(view, 3)->getText("elm.text.sub.left.bottom"));
	}
}

TEST_F(CtProfileSharingViewTest, ChoosingAProfileTypeStoresItOnlyWithNetwork)
{
	storeSharing(true);
	CtProfileSharingView* view = show();
	EXPECT_EQ(0, checkedProfileType(view));
	ScreenHarness::selectItem(row(view, 4)->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_EQ(1, CtContactsAgentUtil::getPreferenceProfileType());
	EXPECT_EQ(1, checkedProfileType(view));
	EXPECT_EQ("Business profile", usage("CT0F").back().extra);

	ScreenHarness::selectItem(row(view, 3)->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_EQ(0, CtContactsAgentUtil::getPreferenceProfileType());
	EXPECT_EQ(0, checkedProfileType(view));
	EXPECT_EQ("Personal profile", usage("CT0F").back().extra);
}

TEST_F(CtProfileSharingViewTest, NetworkLostWhileOpenTurnsTheSwitchOffUntilItComesBack)
{
	storeSharing(true);
	CtProfileSharingView* view = show();
	setNetwork(false);
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(isOn(view->getModeCheck()));
	EXPECT_TRUE(onlySwitchEnabled(view));
	size_t logged = usage("CT0F").size();
	ScreenHarness::selectItem(row(view, 4)->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_EQ(0, CtContactsAgentUtil::getPreferenceProfileType());
	EXPECT_EQ(logged, usage("CT0F").size());
	EXPECT_TRUE(CtEsuAgentMgr::getInstance()->getProfileSharingStatus());

	setNetwork(true);
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(isOn(view->getModeCheck()));
	EXPECT_TRUE(disabledRows(view).empty());
}

TEST_F(CtProfileSharingViewTest, ShareWithButtonSwitchesBusinessToPersonalBeforeOpeningShareWith)
{
	storeSharing(true);
	CtContactsAgentMgr::getInstance()->setProfileType(1);
	CtProfileSharingView* view = show();
	Evas_Object* button = row(view, 3)->getHeldContent("elm.icon.2");
	ASSERT_NE(nullptr, button);
	EXPECT_TRUE(ScreenHarness::click(button));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(0, CtContactsAgentUtil::getPreferenceProfileType());
	EXPECT_NE(nullptr, dynamic_cast<CtProfileShareWithView*>(m_screen->topView()));
	EXPECT_EQ(2, m_screen->viewCount());
	m_screen->topView()->popOut();
	// The rows are drawn again once the screen is back on top.
	EXPECT_TRUE(m_screen->pumpUntil([view] { return checkedProfileType(view) != -1; }));
	EXPECT_EQ(0, checkedProfileType(view));
}

TEST_F(CtProfileSharingViewTest, ShareWithAreaIsNotAButtonWhileSharingIsOff)
{
	CtProfileSharingView* view = show();
	Evas_Object* area = row(view, 3)->getHeldContent("elm.icon.2");
	ASSERT_NE(nullptr, area);
	EXPECT_FALSE(ScreenHarness::click(area) && m_screen->viewCount() > 1);
	EXPECT_EQ(1, m_screen->viewCount());
}

TEST_F(CtProfileSharingViewTest, PreviewShowsOnlyTheFieldsChosenAndFollowsTheSwitches)
{
	contacts_record_h profile = newProfile("Robin");
	contacts_record_set_str(profile, _contacts_my_profile_ex.status, "Out hiking");
	contacts_record_h email = addChild(profile, _contacts_my_profile.email, _contacts_email._uri);
	contacts_record_set_str(email, _contacts_email.email, "robin@example.org");
	contacts_record_h company = addChild(profile, _contacts_my_profile.company, _contacts_company._uri);
	contacts_record_set_str(company, _contacts_company.name, "Acme");
	storeProfile(profile);
	storeSharing(true);
	CtContactsAgentMgr::getInstance()->setProfileProperty(CT_PROFILE_PROPERTY_ORGANIZATION, true);
	CtProfileSharingView* view = show();
	CtProfileSharingPreviewItem* preview = view->getPreviewRow();
	ASSERT_NE(nullptr, preview);
	EXPECT_EQ("Robin", preview->getName());
	EXPECT_EQ((std::vector<std::string>{"Out hiking", "Acme"}), preview->getLines());

	auto options = ScreenHarness::rowsOf<CtProfileOptionItem>(view->getGenlist());
	ASSERT_EQ(4u, options.size());
	ScreenHarness::selectItem(options[CT_PROFILE_PROPERTY_EMAIL]->getElmObjectItem());
	ScreenHarness::selectItem(options[CT_PROFILE_PROPERTY_ORGANIZATION]->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_EQ((std::vector<std::string>{"Out hiking", "robin@example.org"}), preview->getLines());
	EXPECT_NE(std::string::npos, preview->getText("elm.text.multiline").find("robin@example.org"));
	// A shared field without a value adds nothing.
	ScreenHarness::selectItem(options[CT_PROFILE_PROPERTY_BIRTHDAY]->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_EQ(2u, preview->getLines().size());
	elm_genlist_item_bring_in(preview->getElmObjectItem(), ELM_GENLIST_ITEM_SCROLLTO_TOP);
	shot("sharing-preview");
}

TEST_F(CtProfileSharingViewTest, PreviewFollowsAProfileEditedElsewhere)
{
	int id = storeProfile(newProfile("Robin"));
	storeSharing(true);
	CtProfileSharingView* view = show();
	CtProfileSharingPreviewItem* preview = view->getPreviewRow();
	EXPECT_TRUE(preview->getLines().empty());
	contacts_record_h profile = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_my_profile._uri, id, &profile));
	contacts_record_set_str(profile, _contacts_my_profile_ex.status, "Back soon");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(profile));
	contacts_record_destroy(profile, true);
	EXPECT_TRUE(m_screen->pumpUntil([preview] { return !preview->getLines().empty(); }));
	EXPECT_EQ((std::vector<std::string>{"Back soon"}), preview->getLines());
}

TEST_F(CtProfileSharingViewTest, ConfirmationAfterTheScreenClosedIsIgnored)
{
	CtProfileSharingView* view = show();
	touchSwitch(view);
	view->popOut();
	m_screen->pumpUntilIdle();
	EXPECT_EQ(0, m_screen->viewCount());
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, 0);
	setNetwork(false);
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(CtEsuAgentMgr::getInstance()->getProfileSharingStatus());
}
