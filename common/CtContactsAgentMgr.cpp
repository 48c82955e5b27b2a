#include "CtContactsAgentMgr.h"

#include "ContactsDebug.h"
#include "CtContactsAgentUtil.h"
#include "CtProfileSettingKeys.h"
#include "CtRegistryMgr.h"

#include <app_preference.h>

#include <algorithm>
#include <string>

namespace {

constexpr int kProfileChanged = 2;

bool writeInt(const char* key, int value)
{
	int ret = preference_set_int(key, value);
	if (ret != PREFERENCE_ERROR_NONE) {
		WFAILED("preference_set_int", ret);
		return false;
	}
	return true;
}

std::string propertyKey(CtProfileProperty property)
{
	return CT_PREF_PROFILE_PROPERTY_PREFIX + std::to_string((int)property);
}

} // namespace

CtContactsAgentMgr* CtContactsAgentMgr::getInstance()
{
	static CtContactsAgentMgr instance;
	return &instance;
}

CtContactsAgentMgr::~CtContactsAgentMgr()
{
	if (m_job)
		ecore_job_del(m_job);
}

int CtContactsAgentMgr::syncStart(SyncCallback callback, void* data)
{
	return __request(SyncKind::All, 0, callback, data);
}

int CtContactsAgentMgr::syncStartForProfile(SyncCallback callback, void* data)
{
	return __request(SyncKind::Profile, 0, callback, data);
}

int CtContactsAgentMgr::syncDataStart(int personId, SyncCallback callback, void* data)
{
	WPRET_VM(personId < 1, -22, "Invalid param : personId %d", personId);
	return __request(SyncKind::PersonData, personId, callback, data);
}

int CtContactsAgentMgr::__request(SyncKind kind, int personId, SyncCallback callback, void* data)
{
	m_requests.push_back({kind, personId});
	if (!callback)
		return 0;
	m_pending.push_back({callback, data});
	if (!m_job)
		m_job = ecore_job_add(__deliverCb, this);
	return 0;
}

void CtContactsAgentMgr::cancelCallbacks(void* data)
{
	m_pending.erase(std::remove_if(m_pending.begin(), m_pending.end(),
		[data](const PendingCallback& p) { return p.data == data; }), m_pending.end());
}

void CtContactsAgentMgr::__deliverCb(void* data)
{
	auto* self = static_cast<CtContactsAgentMgr*>(data);
	self->m_job = nullptr;
	std::vector<PendingCallback> due;
	due.swap(self->m_pending);
	for (const auto& p : due)
		p.callback(0, p.data);
}

bool CtContactsAgentMgr::setPermittedList(const int* personIds, int count)
{
	if (!CtContactsAgentUtil::setPreferenceSelectedContactsList(personIds, count))
		return false;
	int ret = preference_set_boolean(CT_PREF_SELECTED_CONTACTS_SET, true);
	if (ret != PREFERENCE_ERROR_NONE)
		WFAILED("preference_set_boolean", ret);
	return ret == PREFERENCE_ERROR_NONE;
}

int CtContactsAgentMgr::getPrivacyLevel()
{
	return CtContactsAgentUtil::getPreferenceProfilePrivacyLevel();
}

bool CtContactsAgentMgr::setPrivacyLevel(int level)
{
	WPRET_VM(level < 1 || level > 3, false, "invalid privacy level %d", level);
	if (!writeInt(CT_PREF_PROFILE_PRIVACY_LEVEL, level))
		return false;
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, kProfileChanged);
	return true;
}

int CtContactsAgentMgr::getProfileType()
{
	return CtContactsAgentUtil::getPreferenceProfileType();
}

bool CtContactsAgentMgr::setProfileType(int type)
{
	WPRET_VM(type != 0 && type != 1, false, "invalid profile type %d", type);
	if (!writeInt(CT_PREF_PROFILE_TYPE, type))
		return false;
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, kProfileChanged);
	return true;
}

bool CtContactsAgentMgr::getProfileProperty(CtProfileProperty property)
{
	WPRET_VM(property < 0 || property >= CT_PROFILE_PROPERTY_MAX, false, "invalid property %d", property);
	bool shared = false;
	preference_get_boolean(propertyKey(property).c_str(), &shared);
	return shared;
}

bool CtContactsAgentMgr::setProfileProperty(CtProfileProperty property, bool shared)
{
	WPRET_VM(property < 0 || property >= CT_PROFILE_PROPERTY_MAX, false, "invalid property %d", property);
	int ret = preference_set_boolean(propertyKey(property).c_str(), shared);
	if (ret != PREFERENCE_ERROR_NONE) {
		WFAILED("preference_set_boolean", ret);
		return false;
	}
	return true;
}
