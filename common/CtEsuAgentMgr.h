#ifndef _CT_ESU_AGENT_MGR_H_
#define _CT_ESU_AGENT_MGR_H_

#include <app_control.h>

#include <Ecore.h>
#include <Evas.h>

#include <cstdint>
#include <vector>

// Easy sign-up: the service account behind profile sharing. Its state lives in
// the application preferences; whether the feature exists at all is a
// feature flag.
class CtEsuAgentMgr {
public:
	// The application that runs the sign-up step.
	static constexpr const char* kSignUpAppId = "org.velmora.easysignup";

	static CtEsuAgentMgr* getInstance();

	bool getEasySignUpCscFeatureEnabled();
	// Address book of the easy-sign-up account, -1 when there is none.
	int getEasySignUpAddressBookId();
	// Not 0 once the user signed up.
	int getEasySignUpStatus();
	bool getProfileSharingStatus();
	// Stores the state; the change signal (key 14, value 0) follows on the
	// main loop, as the state is confirmed.
	bool setProfileSharingStatus(bool on);

	// Runs the sign-up step (an application launched through app control).
	// `resultCallback(request, reply, result, data)` runs on the main loop;
	// on APP_CONTROL_RESULT_SUCCEEDED the sign-up status is already stored.
	// A caller that dies first calls cancelEnhancedFeature(data).
	bool launchEnhancedFeautre(app_control_reply_cb resultCallback, void* data, Evas_Object* window);
	void cancelEnhancedFeature(void* data);

private:
	struct PendingLaunch {
		uintptr_t id;
		app_control_reply_cb callback;
		void* data;
	};

	CtEsuAgentMgr() = default;
	~CtEsuAgentMgr();
	static void __onSignUpReplyCb(app_control_h request, app_control_h reply,
		app_control_result_e result, void* data);
	static void __sharingConfirmedCb(void* data);

	std::vector<PendingLaunch> m_pending;
	uintptr_t m_lastLaunchId = 0;
	Ecore_Job* m_confirmJob = nullptr;
};

#endif
