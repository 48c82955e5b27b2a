#ifndef _CT_CONTACTS_AGENT_MGR_H_
#define _CT_CONTACTS_AGENT_MGR_H_

#include <Ecore.h>

#include <vector>

// Profile fields that may be shared besides name, status and picture.
enum CtProfileProperty {
	CT_PROFILE_PROPERTY_EMAIL = 0,
	CT_PROFILE_PROPERTY_ORGANIZATION = 1,
	CT_PROFILE_PROPERTY_ADDRESS = 2,
	CT_PROFILE_PROPERTY_BIRTHDAY = 3,
	CT_PROFILE_PROPERTY_MAX
};

// The contacts agent: profile-sharing settings (kept in the application
// preferences) and synchronisation requests. There is no sharing server on
// this platform: a sync request completes on the next main-loop iteration and
// is recorded, so callers and tests can see what was asked.
class CtContactsAgentMgr {
public:
	using SyncCallback = void (*)(int result, void* data);

	enum class SyncKind { All, Profile, PersonData };
	struct SyncRequest {
		SyncKind kind;
		int personId;
	};

	static CtContactsAgentMgr* getInstance();

	// Each returns 0 when the request was taken. The callback, if any, runs on
	// the main loop with result 0, unless cancelCallbacks(data) came first.
	int syncStart(SyncCallback callback, void* data);
	int syncStartForProfile(SyncCallback callback = nullptr, void* data = nullptr);
	int syncDataStart(int personId, SyncCallback callback = nullptr, void* data = nullptr);
	void cancelCallbacks(void* data);

	// The share-with list: stored, and marked as chosen.
	bool setPermittedList(const int* personIds, int count);

	int getPrivacyLevel();
	bool setPrivacyLevel(int level);
	int getProfileType();
	bool setProfileType(int type);
	bool getProfileProperty(CtProfileProperty property);
	bool setProfileProperty(CtProfileProperty property, bool shared);

	const std::vector<SyncRequest>& getSyncRequests() const { return m_requests; }
	void clearSyncRequests() { m_requests.clear(); }

private:
	struct PendingCallback {
		SyncCallback callback;
		void* data;
	};

	CtContactsAgentMgr() = default;
	~CtContactsAgentMgr();
	int __request(SyncKind kind, int personId, SyncCallback callback, void* data);
	static void __deliverCb(void* data);

	std::vector<SyncRequest> m_requests;
	std::vector<PendingCallback> m_pending;
	Ecore_Job* m_job = nullptr;
};

#endif
