#include "CtSimMgr.h"

#include "ContactsDebug.h"
#include "CtRegistryMgr.h"

#include <Ecore.h>

#include <algorithm>

namespace {

const char* const kPowerKeys[CtSimMgr::kSlotCount] = {
	VCONFKEY_TELEPHONY_SIM_POWER_STATE1,
	VCONFKEY_TELEPHONY_SIM_POWER_STATE2,
};

const char* const kSimColors[CtSimMgr::kSlotCount] = {"A03O011", "A03O012"};

} // namespace

CtSimMgr* CtSimMgr::getInstance()
{
	static CtSimMgr instance;
	return &instance;
}

CtSimMgr::CtSimMgr() = default;

// A process-lifetime singleton: the registry outlives no screen, so there is
// nothing to unregister at exit.
CtSimMgr::~CtSimMgr() = default;

void CtSimMgr::attach(CtSimListener* listener)
{
	WPRET_M(!listener, "Invalid param : listener");
	{
		std::lock_guard<std::mutex> lock(m_mutex);
		if (std::find(m_listeners.begin(), m_listeners.end(), listener) == m_listeners.end())
			m_listeners.push_back(listener);
	}
	if (eina_main_loop_is())
		__registerOnMainLoop();
	else
		ecore_main_loop_thread_safe_call_sync(__registerCb, this);
}

void CtSimMgr::detach(CtSimListener* listener)
{
	std::lock_guard<std::mutex> lock(m_mutex);
	m_listeners.erase(std::remove(m_listeners.begin(), m_listeners.end(), listener), m_listeners.end());
}

void* CtSimMgr::__registerCb(void* data)
{
	static_cast<CtSimMgr*>(data)->__registerOnMainLoop();
	return nullptr;
}

void CtSimMgr::__registerOnMainLoop()
{
	if (m_registered)
		return;
	m_registered = true;
	for (const char* key : kPowerKeys)
		CtRegistryMgr::getInstance()->registerVconfChangedCb(key, __onSimPowerChangedCb, this);
}

bool CtSimMgr::isSimAvailable(int slot)
{
	if (slot < 0 || slot >= kSlotCount)
		return false;
	int powered = 0;
	int ret = vconf_get_int(kPowerKeys[slot], &powered);
	if (ret == VCONF_ERROR_WRONG_TYPE)
		ret = vconf_get_bool(kPowerKeys[slot], &powered);
	if (ret != VCONF_OK) {
		WFAILED("vconf_get_int", ret);
		return false;
	}
	return powered != 0;
}

int CtSimMgr::getInsertedSimCount()
{
	int count = 0;
	for (int slot = 0; slot < kSlotCount; ++slot)
		count += isSimAvailable(slot) ? 1 : 0;
	return count;
}

int CtSimMgr::getAvailableSimForIcon()
{
	bool first = isSimAvailable(0);
	bool second = isSimAvailable(1);
	if (first == second)
		return -1;
	return first ? 0 : 1;
}

const char* CtSimMgr::getSimColor(int slot)
{
	if (slot < 0 || slot >= kSlotCount)
		return nullptr;
	return kSimColors[slot];
}

void CtSimMgr::__onSimPowerChangedCb(keynode_t*, void* data)
{
	WHIT();
	static_cast<CtSimMgr*>(data)->__notifyListeners();
}

void CtSimMgr::__notifyListeners()
{
	std::vector<CtSimListener*> snapshot;
	{
		std::lock_guard<std::mutex> lock(m_mutex);
		snapshot = m_listeners;
	}
	for (CtSimListener* listener : snapshot) {
		bool stillAttached;
		{
			std::lock_guard<std::mutex> lock(m_mutex);
			stillAttached = std::find(m_listeners.begin(), m_listeners.end(), listener) != m_listeners.end();
		}
		if (stillAttached)
			listener->onSimChanged();
	}
}
