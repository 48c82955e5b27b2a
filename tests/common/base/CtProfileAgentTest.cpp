#include "AppControlRouter.h"
#include "CtContactsAgentMgr.h"
#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"
#include "../CommonTestSupport.h"

#include <app_preference.h>

using namespace ct::test;

namespace {

class CtProfileAgentTest : public ct::test::LoopTest {
protected:
	TempDataDir m_dir;
};

void countSync(int result, void* data)
{
	if (result == 0)
		++*static_cast<int*>(data);
}

struct SignUp {
	int calls = 0;
	app_control_result_e result = APP_CONTROL_RESULT_FAILED;
};

void onSignUp(app_control_h, app_control_h, app_control_result_e result, void* data)
{
	auto* signUp = static_cast<SignUp*>(data);
	++signUp->calls;
	signUp->result = result;
}

} // namespace

TEST_F(CtProfileAgentTest, SettingsPersistAndDefaultsHold)
{
	auto* agent = CtContactsAgentMgr::getInstance();
	EXPECT_EQ(1, agent->getPrivacyLevel());
	EXPECT_EQ(0, agent->getProfileType());
	EXPECT_FALSE(agent->getProfileProperty(CT_PROFILE_PROPERTY_ADDRESS));

	SignalRecorder signals;
	EXPECT_TRUE(agent->setPrivacyLevel(3));
	EXPECT_FALSE(agent->setPrivacyLevel(4));
	EXPECT_TRUE(agent->setProfileType(1));
	EXPECT_FALSE(agent->setProfileType(7));
	EXPECT_TRUE(agent->setProfileProperty(CT_PROFILE_PROPERTY_ADDRESS, true));
	EXPECT_FALSE(agent->setProfileProperty(CT_PROFILE_PROPERTY_MAX, true));

	EXPECT_EQ(3, CtContactsAgentUtil::getPreferenceProfilePrivacyLevel());
	EXPECT_EQ(1, CtContactsAgentUtil::getPreferenceProfileType());
	EXPECT_TRUE(agent->getProfileProperty(CT_PROFILE_PROPERTY_ADDRESS));
	EXPECT_EQ(signals.signals, (std::vector<std::pair<ctRegistryKey, int>>(2, {CT_REGISTRY_KEY_PROFILE_SHARING_STATE, 2})));
}

TEST_F(CtProfileAgentTest, ShareWithListRoundTripsAndMarksTheChoice)
{
	int* ids = nullptr;
	EXPECT_EQ(0, CtContactsAgentUtil::getPreferenceSelectedContactsList(&ids));
	EXPECT_EQ(nullptr, ids);
	EXPECT_EQ(0, CtContactsAgentUtil::getPreferenceSelectedContactsList(nullptr));

	const int chosen[] = {12, 5, 99};
	ASSERT_TRUE(CtContactsAgentMgr::getInstance()->setPermittedList(chosen, 3));
	bool set = false;
	EXPECT_EQ(0, preference_get_boolean("my_profile_sharing_selected_contacts_set", &set));
	EXPECT_TRUE(set);
	ASSERT_EQ(3, CtContactsAgentUtil::getPreferenceSelectedContactsList(&ids));
	EXPECT_EQ(std::vector<int>(ids, ids + 3), std::vector<int>(chosen, chosen + 3));
	free(ids);

	// A damaged stored list gives the ids it still holds.
	ASSERT_EQ(0, preference_set_string("profile_sharing_permitted_list", "7,x,-3,,8"));
	ASSERT_EQ(2, CtContactsAgentUtil::getPreferenceSelectedContactsList(&ids));
	EXPECT_EQ(std::vector<int>(ids, ids + 2), (std::vector<int>{7, 8}));
	free(ids);
	EXPECT_FALSE(CtContactsAgentMgr::getInstance()->setPermittedList(nullptr, 2));
	EXPECT_TRUE(CtContactsAgentMgr::getInstance()->setPermittedList(nullptr, 0));
	EXPECT_EQ(0, CtContactsAgentUtil::getPreferenceSelectedContactsList(&ids));
}

TEST_F(CtProfileAgentTest, SyncsAreRecordedAndCallBackUnlessCancelled)
{
	auto* agent = CtContactsAgentMgr::getInstance();
	agent->clearSyncRequests();
	int done = 0, cancelled = 0;
	EXPECT_EQ(0, agent->syncStart(countSync, &done));
	EXPECT_EQ(0, agent->syncDataStart(42, countSync, &cancelled));
	EXPECT_NE(0, agent->syncDataStart(0));
	EXPECT_EQ(0, agent->syncStartForProfile());
	agent->cancelCallbacks(&cancelled);
	EXPECT_EQ(0, done);
	EXPECT_TRUE(pumpUntil([&] { return done > 0; }, 1.0));
	ct::test::settle(0.1);
	EXPECT_EQ(0, cancelled);

	const auto& requests = agent->getSyncRequests();
	ASSERT_EQ(3u, requests.size());
	EXPECT_EQ(CtContactsAgentMgr::SyncKind::PersonData, requests[1].kind);
	EXPECT_EQ(42, requests[1].personId);
	EXPECT_EQ(CtContactsAgentMgr::SyncKind::Profile, requests[2].kind);
}

TEST_F(CtProfileAgentTest, SignUpStepStoresTheStatusOnSuccessOnly)
{
	auto* esu = CtEsuAgentMgr::getInstance();
	EXPECT_FALSE(esu->getEasySignUpCscFeatureEnabled());
	setenv("CONTACTS_FEATURES", "13", 1);
	EXPECT_TRUE(esu->getEasySignUpCscFeatureEnabled());
	unsetenv("CONTACTS_FEATURES");
	EXPECT_EQ(0, esu->getEasySignUpStatus());
	EXPECT_EQ(-1, esu->getEasySignUpAddressBookId());

	SignUp noApp;
	EXPECT_FALSE(esu->launchEnhancedFeautre(onSignUp, &noApp, nullptr));

	app_control_result_e answer = APP_CONTROL_RESULT_CANCELED;
	auto registration = ct::appcontrol::registerAppHandler(CtEsuAgentMgr::kSignUpAppId,
		[&](app_control_h, const ct::appcontrol::Reply& reply) {
			reply(nullptr, answer);
			return 0;
		});
	SignUp cancelled;
	ASSERT_TRUE(esu->launchEnhancedFeautre(onSignUp, &cancelled, nullptr));
	EXPECT_TRUE(pumpUntil([&] { return cancelled.calls > 0; }, 1.0));
	EXPECT_EQ(APP_CONTROL_RESULT_CANCELED, cancelled.result);
	EXPECT_EQ(0, esu->getEasySignUpStatus());

	answer = APP_CONTROL_RESULT_SUCCEEDED;
	SignUp gone, succeeded;
	ASSERT_TRUE(esu->launchEnhancedFeautre(onSignUp, &gone, nullptr));
	esu->cancelEnhancedFeature(&gone);
	ASSERT_TRUE(esu->launchEnhancedFeautre(onSignUp, &succeeded, nullptr));
	EXPECT_TRUE(pumpUntil([&] { return succeeded.calls > 0; }, 1.0));
	EXPECT_EQ(0, gone.calls);
	EXPECT_NE(0, esu->getEasySignUpStatus());
}

TEST_F(CtProfileAgentTest, SharingStatusChangeIsConfirmedThroughTheSignal)
{
	auto* esu = CtEsuAgentMgr::getInstance();
	EXPECT_FALSE(esu->getProfileSharingStatus());
	SignalRecorder signals;
	ASSERT_TRUE(esu->setProfileSharingStatus(true));
	EXPECT_TRUE(esu->getProfileSharingStatus());
	EXPECT_TRUE(signals.signals.empty());
	EXPECT_TRUE(pumpUntil([&] { return !signals.signals.empty(); }, 1.0));
	EXPECT_EQ((std::pair<ctRegistryKey, int>(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, 0)), signals.signals[0]);
}
