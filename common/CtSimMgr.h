#ifndef _CT_SIM_MGR_H_
#define _CT_SIM_MGR_H_

#include "CtSimListener.h"

#include <vconf.h>

#include <mutex>
#include <vector>

// The SIM cards as the screens see them: which slots are switched on
// ("db/telephony/sim_power_stateN"), their colours, and listeners told on
// every change. attach/detach may be called from any thread; listeners are
// called on the main loop.
class CtSimMgr {
public:
	static constexpr int kSlotCount = 2;

	static CtSimMgr* getInstance();

	void attach(CtSimListener* listener);
	void detach(CtSimListener* listener);

	// Slots (0-based) whose SIM is inserted and switched on.
	int getInsertedSimCount();
	bool isSimAvailable(int slot);
	// The slot whose colour marks call icons: the only available SIM, or -1
	// when none or both are available.
	int getAvailableSimForIcon();
	// Colour code of a slot's SIM (theme colour code), null for other slots.
	const char* getSimColor(int slot);

private:
	CtSimMgr();
	~CtSimMgr();
	CtSimMgr(const CtSimMgr&) = delete;
	CtSimMgr& operator=(const CtSimMgr&) = delete;

	static void __onSimPowerChangedCb(keynode_t* node, void* data);
	static void* __registerCb(void* data);
	void __registerOnMainLoop();
	void __notifyListeners();

	std::mutex m_mutex;
	std::vector<CtSimListener*> m_listeners;
	bool m_registered = false;
};

#endif
