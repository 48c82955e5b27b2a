// The state behind AppControlRouter.h: registered handlers, launches waiting
// for an answer, answers waiting for the main loop, and the launch records.
// Internal to platform/appcontrol; main thread only.
#pragma once

#include "AppControlHandle.h"
#include "AppControlRouter.h"
#include "MainLoopJob.h"

#include <deque>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace ct::appcontrol {

struct HandleDeleter {
	void operator()(app_control_h h) const { app_control_destroy(h); }
};
using HandlePtr = std::unique_ptr<app_control_s, HandleDeleter>;

class LaunchRouter {
public:
	// Never destroyed: a pending job must not outlive the main loop at exit.
	static LaunchRouter& instance();

	uint64_t addHandler(bool byAppId, const std::string& key, Handler handler, TerminateHook onTerminate);
	void removeHandler(uint64_t id);
	bool hasHandler(const std::string& key) const;

	int send(app_control_h h, app_control_reply_cb replyCb, void* userData);
	int reply(uint64_t launchId, app_control_h reply, app_control_result_e result);
	bool isPending(uint64_t launchId) const { return m_launches.count(launchId) != 0; }
	int terminate(app_control_h h);
	int cancel(void* userData);
	size_t pendingFor(void* userData) const;

	std::vector<LaunchRecord> records() const;
	void clearRecords() { m_records.clear(); }
	void setOwnAppId(const std::string& appId) { m_ownAppId = appId; }

private:
	struct HandlerEntry {
		uint64_t id;
		bool byAppId;
		std::string key;
		Handler handler;
		TerminateHook onTerminate;
	};
	struct Launch {
		uint64_t senderSerial = 0;
		app_control_reply_cb replyCb = nullptr;
		void* userData = nullptr;
		HandlePtr request;
		TerminateHook onTerminate;
		uint64_t recordSeq = 0;
	};
	struct Delivery {
		uint64_t seq;
		uint64_t launchId;
		app_control_reply_cb replyCb;
		void* userData;
		HandlePtr request;
		HandlePtr reply;
		app_control_result_e result;
	};

	LaunchRouter();

	const HandlerEntry* __findHandler(const app_control_s& h) const;
	uint64_t __addLaunch(const app_control_s& h, app_control_reply_cb replyCb, void* userData,
			const TerminateHook& onTerminate);
	void __trimUnawaitedLaunches();
	void __dropLaunch(uint64_t launchId);
	void __record(uint64_t launchId, const app_control_s& h, bool replyRequested);
	void __markTerminated(uint64_t seq);
	void __scheduleDelivery();
	void __deliverQueued();

	uint64_t m_nextId = 1;
	std::vector<HandlerEntry> m_handlers;
	std::map<uint64_t, Launch> m_launches;
	std::deque<Delivery> m_deliveries;
	std::map<uint64_t, LaunchRecord> m_records;
	std::unique_ptr<MainLoopJob> m_job;
	std::string m_ownAppId;
};

} // namespace ct::appcontrol
