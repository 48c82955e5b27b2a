#ifndef _CT_REGISTRY_MGR_H_
#define _CT_REGISTRY_MGR_H_

#include <vconf.h>

#include <functional>
#include <map>
#include <string>
#include <vector>

// What changed, told between the contacts screens through the change signal.
enum ctRegistryKey {
	CT_REGISTRY_KEY_FAVORITE_CHANGED = 0,
	CT_REGISTRY_KEY_PERSON_DELETED = 2,
	CT_REGISTRY_KEY_PHONELOG_CHANGED = 5,
	CT_REGISTRY_KEY_CONTACT_DATA_CHANGED = 6,
	CT_REGISTRY_KEY_CONTACT_LIST_CHANGED = 10,
	CT_REGISTRY_KEY_PROFILE_SAVED = 11,
	CT_REGISTRY_KEY_PROFILE_SHARING_STATE = 14,
	CT_REGISTRY_KEY_RELATIONSHIP_PERSON = 16,
};

// Settings listeners by vconf key (several per key, each with its own data)
// and the application-wide change signal. Main loop only.
class CtRegistryMgr {
public:
	using ChangeListener = std::function<void(ctRegistryKey key, int value)>;

	static CtRegistryMgr* getInstance();

	// Calls `callback(node, data)` when `key` changes. The same three values
	// unregister it. Returns 0 or a negative vconf error.
	int registerVconfChangedCb(const char* key, vconf_callback_fn callback, void* data);
	int unRegisterVconfChangedCb(const char* key, vconf_callback_fn callback, void* data);

	// Returns the listener's id (> 0).
	int addChangeListener(ChangeListener listener);
	void removeChangeListener(int id);
	// Calls every listener now, in the order they were added. A listener may
	// add or remove listeners while it runs.
	void raiseChangeSignal(ctRegistryKey key, int value);

	size_t getVconfListenerCount(const char* key) const;

private:
	struct VconfListener {
		vconf_callback_fn callback;
		void* data;
	};

	CtRegistryMgr() = default;
	static void __onVconfChangedCb(keynode_t* node, void* data);
	void __dispatchVconfChange(const std::string& key, keynode_t* node);

	std::map<std::string, std::vector<VconfListener>> m_vconfListeners;
	std::vector<std::pair<int, ChangeListener>> m_changeListeners;
	int m_lastListenerId = 0;
};

#endif
