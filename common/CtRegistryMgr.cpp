#include "CtRegistryMgr.h"

#include "ContactsDebug.h"

#include <algorithm>

CtRegistryMgr* CtRegistryMgr::getInstance()
{
	static CtRegistryMgr instance;
	return &instance;
}

int CtRegistryMgr::registerVconfChangedCb(const char* key, vconf_callback_fn callback, void* data)
{
	WPRET_VM(!key || !*key || !callback, VCONF_ERROR_INVALID_PARAMETER, "Invalid param : key or callback");
	auto& listeners = m_vconfListeners[key];
	if (listeners.empty()) {
		int ret = vconf_notify_key_changed(key, __onVconfChangedCb, this);
		if (ret != VCONF_OK) {
			WFAILED("vconf_notify_key_changed", ret);
			m_vconfListeners.erase(key);
			return ret;
		}
	}
	listeners.push_back({callback, data});
	return VCONF_OK;
}

int CtRegistryMgr::unRegisterVconfChangedCb(const char* key, vconf_callback_fn callback, void* data)
{
	WPRET_VM(!key || !callback, VCONF_ERROR_INVALID_PARAMETER, "Invalid param : key or callback");
	auto it = m_vconfListeners.find(key);
	WPRET_VM(it == m_vconfListeners.end(), VCONF_ERROR, "no listener for %s", key);

	auto& listeners = it->second;
	auto found = std::find_if(listeners.begin(), listeners.end(),
		[&](const VconfListener& l) { return l.callback == callback && l.data == data; });
	WPRET_VM(found == listeners.end(), VCONF_ERROR, "listener not registered for %s", key);
	listeners.erase(found);

	if (listeners.empty()) {
		m_vconfListeners.erase(it);
		int ret = vconf_ignore_key_changed(key, __onVconfChangedCb);
		if (ret != VCONF_OK)
			WFAILED("vconf_ignore_key_changed", ret);
	}
	return VCONF_OK;
}

size_t CtRegistryMgr::getVconfListenerCount(const char* key) const
{
	auto it = key ? m_vconfListeners.find(key) : m_vconfListeners.end();
	return it == m_vconfListeners.end() ? 0 : it->second.size();
}

void CtRegistryMgr::__onVconfChangedCb(keynode_t* node, void* data)
{
	const char* key = vconf_keynode_get_name(node);
	WPRET_M(!key, "Invalid param : node");
	static_cast<CtRegistryMgr*>(data)->__dispatchVconfChange(key, node);
}

void CtRegistryMgr::__dispatchVconfChange(const std::string& key, keynode_t* node)
{
	auto it = m_vconfListeners.find(key);
	if (it == m_vconfListeners.end())
		return;
	// A listener may unregister itself or others while we walk.
	std::vector<VconfListener> snapshot = it->second;
	for (const auto& listener : snapshot) {
		auto current = m_vconfListeners.find(key);
		if (current == m_vconfListeners.end())
			return;
		const auto& live = current->second;
		bool stillThere = std::any_of(live.begin(), live.end(), [&](const VconfListener& l) {
			return l.callback == listener.callback && l.data == listener.data;
		});
		if (stillThere)
			listener.callback(node, listener.data);
	}
}

int CtRegistryMgr::addChangeListener(ChangeListener listener)
{
	m_changeListeners.emplace_back(++m_lastListenerId, std::move(listener));
	return m_lastListenerId;
}

void CtRegistryMgr::removeChangeListener(int id)
{
	auto it = std::find_if(m_changeListeners.begin(), m_changeListeners.end(),
		[id](const auto& entry) { return entry.first == id; });
	WPRET_M(it == m_changeListeners.end(), "Already removed listener! =%d", id);
	m_changeListeners.erase(it);
}

void CtRegistryMgr::raiseChangeSignal(ctRegistryKey key, int value)
{
	WDEBUG("key %d value %d", key, value);
	std::vector<int> ids;
	for (const auto& entry : m_changeListeners)
		ids.push_back(entry.first);
	for (int id : ids) {
		auto it = std::find_if(m_changeListeners.begin(), m_changeListeners.end(),
			[id](const auto& entry) { return entry.first == id; });
		if (it == m_changeListeners.end())
			continue;
		ChangeListener listener = it->second;
		listener(key, value);
	}
}
