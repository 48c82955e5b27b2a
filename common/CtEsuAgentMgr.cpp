#include "CtEsuAgentMgr.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsDebug.h"
#include "CtProfileSettingKeys.h"
#include "CtRegistryMgr.h"

#include <app_preference.h>
#include <csc_feature.h>

#include <algorithm>

namespace {

constexpr int kSharingStatusChanged = 0;

int readInt(const char* key, int fallback)
{
	int value = fallback;
	return preference_get_int(key, &value) == PREFERENCE_ERROR_NONE ? value : fallback;
}

} // namespace

CtEsuAgentMgr* CtEsuAgentMgr::getInstance()
{
	static CtEsuAgentMgr instance;
	return &instance;
}

CtEsuAgentMgr::~CtEsuAgentMgr()
{
	if (m_confirmJob)
		ecore_job_del(m_confirmJob);
}

bool CtEsuAgentMgr::getEasySignUpCscFeatureEnabled()
{
	return csc_feature_get_bool(CSC_FEATURE_CONTACTS_EASY_SIGNUP);
}

int CtEsuAgentMgr::getEasySignUpAddressBookId()
{
	return readInt(CT_PREF_EASY_SIGNUP_ADDRESSBOOK, -1);
}

int CtEsuAgentMgr::getEasySignUpStatus()
{
	return readInt(CT_PREF_EASY_SIGNUP_STATUS, 0);
}

bool CtEsuAgentMgr::getProfileSharingStatus()
{
	bool on = false;
	preference_get_boolean(CT_PREF_PROFILE_SHARING_STATUS, &on);
	return on;
}

bool CtEsuAgentMgr::setProfileSharingStatus(bool on)
{
	int ret = preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, on);
	if (ret != PREFERENCE_ERROR_NONE) {
		WFAILED("preference_set_boolean", ret);
		return false;
	}
	if (!m_confirmJob)
		m_confirmJob = ecore_job_add(__sharingConfirmedCb, this);
	return true;
}

void CtEsuAgentMgr::__sharingConfirmedCb(void* data)
{
	auto* self = static_cast<CtEsuAgentMgr*>(data);
	self->m_confirmJob = nullptr;
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, kSharingStatusChanged);
}

bool CtEsuAgentMgr::launchEnhancedFeautre(app_control_reply_cb resultCallback, void* data, Evas_Object* /*window*/)
{
	app_control_h request = nullptr;
	int ret = app_control_create(&request);
	WPRET_VM(ret != APP_CONTROL_ERROR_NONE, false, "app_control_create() Failed(%d)", ret);
	app_control_set_app_id(request, kSignUpAppId);
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	// The reply carries the launch's id, not a pointer: a launch whose caller
	// cancelled is simply no longer found.
	uintptr_t id = ++m_lastLaunchId;
	bool sent = ContactsAppControlLauncher::getInstance()->sendAsyncLaunchRequest(
		request, __onSignUpReplyCb, reinterpret_cast<void*>(id), nullptr);
	app_control_destroy(request);
	if (!sent) {
		WERROR("launch Failed");
		return false;
	}
	m_pending.push_back({id, resultCallback, data});
	return true;
}

void CtEsuAgentMgr::cancelEnhancedFeature(void* data)
{
	m_pending.erase(std::remove_if(m_pending.begin(), m_pending.end(),
		[data](const PendingLaunch& p) { return p.data == data; }), m_pending.end());
}

void CtEsuAgentMgr::__onSignUpReplyCb(app_control_h request, app_control_h reply,
	app_control_result_e result, void* data)
{
	CtEsuAgentMgr* self = getInstance();
	if (result == APP_CONTROL_RESULT_SUCCEEDED) {
		int ret = preference_set_int(CT_PREF_EASY_SIGNUP_STATUS, 1);
		if (ret != PREFERENCE_ERROR_NONE)
			WFAILED("preference_set_int", ret);
	}
	auto id = reinterpret_cast<uintptr_t>(data);
	auto it = std::find_if(self->m_pending.begin(), self->m_pending.end(),
		[id](const PendingLaunch& p) { return p.id == id; });
	if (it == self->m_pending.end())
		return;
	PendingLaunch launch = *it;
	self->m_pending.erase(it);
	if (launch.callback)
		launch.callback(request, reply, result, launch.data);
}
