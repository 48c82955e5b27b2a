// The profile wizard: steps forward and back (and out from the first), the
// sign-up on the first step, all four fields shared on the last, and the
// editor it opens closing both screens when it saves.
#include "SharingScreenTest.h"

#include "CtCommonTextUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtMyProfileInputView.h"
#include "CtProfileSettingKeys.h"
#include "CtProfileWizardView.h"

using namespace ct::test;

class CtProfileWizardViewTest : public SharingScreenTest {
protected:
	CtProfileWizardView* show(bool signedUp = true)
	{
		preference_set_int(CT_PREF_EASY_SIGNUP_STATUS, signedUp ? 1 : 0);
		auto* view = new CtProfileWizardView();
		EXPECT_TRUE(m_screen->push(view));
		m_screen->pumpUntilIdle();
		return view;
	}
	void next(CtProfileWizardView* view)
	{
		EXPECT_TRUE(ScreenHarness::click(view->getNextButton()));
		m_screen->pumpUntilIdle();
	}
	void back()
	{
		m_screen->sendBackKey();
		m_screen->pumpUntilIdle();
	}
	static std::vector<bool> sharedFields()
	{
		std::vector<bool> shared;
		for (int p = CT_PROFILE_PROPERTY_EMAIL; p < CT_PROFILE_PROPERTY_MAX; ++p)
			shared.push_back(CtContactsAgentMgr::getInstance()->getProfileProperty(static_cast<CtProfileProperty>(p)));
		return shared;
	}
	// Answers the sign-up application's launch with `result`.
	ct::appcontrol::Registration answerSignUp(app_control_result_e result)
	{
		return ct::appcontrol::registerAppHandler(CtEsuAgentMgr::kSignUpAppId,
			[result](app_control_h, const ct::appcontrol::Reply& reply) {
				reply(nullptr, result);
				return 0;
			});
	}
};

TEST_F(CtProfileWizardViewTest, BackGoesOneStepBackAndLeavesFromTheFirst)
{
	CtProfileWizardView* view = show();
	EXPECT_EQ(1, view->getStep());
	EXPECT_STREQ("Self-promotion made easy", view->getTitleAreaText());
	EXPECT_EQ(nullptr, view->getGenlist());
	shot("wizard-step1");

	next(view);
	EXPECT_EQ(2, view->getStep());
	EXPECT_STREQ("Select a profile type", view->getTitleAreaText());
	auto types = rows(view->getGenlist());
	ASSERT_EQ(2u, types.size());
	EXPECT_EQ("Personal profile", types[0]->getText("elm.text.main"));
	EXPECT_EQ("Business profile", types[1]->getText("elm.text.main"));
	EXPECT_TRUE(CtEsuAgentMgr::getInstance()->getProfileSharingStatus());
	ScreenHarness::selectItem(types[1]->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_EQ(1, CtContactsAgentUtil::getPreferenceProfileType());
	shot("wizard-step2");

	next(view);
	EXPECT_EQ(3, view->getStep());
	EXPECT_EQ("Profile sharing", ScreenHarness::naviText(view));
	EXPECT_STREQ("", view->getTitleAreaText());
	shot("wizard-step3");

	const int expectedSteps[] = {2, 1};
	for (int step : expectedSteps) {
		back();
		ASSERT_EQ(1, m_screen->viewCount());
		EXPECT_EQ(step, view->getStep());
	}
	EXPECT_STREQ("Self-promotion made easy", view->getTitleAreaText());
	back();
	EXPECT_EQ(0, m_screen->viewCount());
}

TEST_F(CtProfileWizardViewTest, FirstStepWaitsForTheSignUp)
{
	struct Case {
		app_control_result_e result;
		int step;
	};
	for (const Case& c : {Case{APP_CONTROL_RESULT_CANCELED, 1}, Case{APP_CONTROL_RESULT_SUCCEEDED, 2}}) {
		SCOPED_TRACE(c.result);
		ct::appcontrol::Registration signUp = answerSignUp(c.result);
		CtProfileWizardView* view = show(false);
		next(view);
		EXPECT_TRUE(m_screen->pumpUntil([&] { return view->getStep() == c.step; }));
		m_screen->pumpFor(0.2);
		EXPECT_EQ(c.step, view->getStep());
		view->destroy();
		m_screen->pumpUntilIdle();
	}
}

TEST_F(CtProfileWizardViewTest, LastStepSharesAllFourFieldsWhicheverWereOff)
{
	for (int p = CT_PROFILE_PROPERTY_EMAIL; p < CT_PROFILE_PROPERTY_MAX; ++p)
		CtContactsAgentMgr::getInstance()->setProfileProperty(static_cast<CtProfileProperty>(p), p == 1);
	CtProfileWizardView* view = show();
	next(view);
	EXPECT_EQ((std::vector<bool>{false, true, false, false}), sharedFields());
	next(view);
	EXPECT_EQ((std::vector<bool>{true, true, true, true}), sharedFields());
	auto options = rows(view->getGenlist());
	ASSERT_EQ(6u, options.size()) << "group title, explanation and four fields";
	for (size_t i = 2; i < options.size(); ++i)
		EXPECT_TRUE(isOn(options[i]->getHeldContent("elm.icon.2"))) << i;
	EXPECT_TRUE(toggle(options[2]->getHeldContent("elm.icon.2")));
	m_screen->pumpUntilIdle();
	EXPECT_EQ((std::vector<bool>{false, true, true, true}), sharedFields()) << "the user may turn a field off";
}

TEST_F(CtProfileWizardViewTest, SavingTheProfileFromTheLastStepClosesEditorAndWizard)
{
	CtProfileWizardView* view = show();
	next(view);
	next(view);
	next(view);
	ASSERT_EQ(2, m_screen->viewCount());
	auto* editor = dynamic_cast<CtMyProfileInputView*>(m_screen->topView());
	ASSERT_NE(nullptr, editor);
	EXPECT_TRUE(editor->isWizardMode());
	for (auto kind : {CtMyProfileInputView::MYPROFILE_INPUT_EMAIL, CtMyProfileInputView::MYPROFILE_INPUT_ADDRESS,
			CtMyProfileInputView::MYPROFILE_INPUT_EVENT})
		EXPECT_NE(nullptr, editor->getFirstItem(kind)) << kind;
	shot("wizard-editor");
	auto basic = ScreenHarness::rowsOf<CtInputViewBasicInfoItem>(editor->getGenlist());
	ASSERT_EQ(1u, basic.size());
	EXPECT_TRUE(basic[0]->getOrganisationShown());
	Evas_Object* name = basic[0]->getFieldEntry(CtInputViewBasicInfoItem::NAME);
	elm_entry_entry_insert(name, "Mia");
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(ScreenHarness::click(editor->getDoneButton()));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(0, m_screen->viewCount());
	ASSERT_EQ(1, profileCount());
	contacts_list_h list = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_all_records(_contacts_my_profile._uri, 0, 0, &list));
	contacts_record_h first = nullptr, profile = nullptr;
	int id = 0;
	contacts_list_get_current_record_p(list, &first);
	contacts_record_get_int(first, _contacts_my_profile.id, &id);
	contacts_list_destroy(list, true);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_my_profile._uri, id, &profile));
	for (unsigned int property : {_contacts_my_profile.email, _contacts_my_profile.address, _contacts_my_profile.event}) {
		int count = -1;
		contacts_record_get_child_record_count(profile, property, &count);
		EXPECT_EQ(0, count) << "rows left empty are not stored";
	}
	contacts_record_destroy(profile, true);
}
