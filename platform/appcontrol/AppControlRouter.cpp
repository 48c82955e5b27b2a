// Routes launch requests to in-process handlers and delivers their replies
// on the EFL main loop.
#include "AppControlRouter.h"

#include "AppControlHandle.h"
#include "ContactsAppIds.h"
#include "ContactsDebug.h"

#include <Ecore.h>

#include <cstring>
#include <deque>
#include <memory>

namespace ct::appcontrol {
namespace {

struct HandleDeleter {
	void operator()(app_control_h h) const { app_control_destroy(h); }
};
using HandlePtr = std::unique_ptr<app_control_s, HandleDeleter>;

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

const size_t kMaxRecords = 1000;
const size_t kMaxUnawaitedLaunches = 1000;

// One pending ecore job, holding the main loop up while it waits.
class MainLoopJob {
public:
	MainLoopJob(Ecore_Cb cb, void* data)
	{
		ecore_init();
		m_job = ecore_job_add(cb, data);
	}
	~MainLoopJob()
	{
		if (m_job)
			ecore_job_del(m_job);
		ecore_shutdown();
	}
	MainLoopJob(const MainLoopJob&) = delete;
	MainLoopJob& operator=(const MainLoopJob&) = delete;

	bool isValid() const { return m_job != nullptr; }
	void markFired() { m_job = nullptr; }

private:
	Ecore_Job* m_job = nullptr;
};

LaunchRecord makeRecord(const app_control_s& h, bool replyRequested)
{
	LaunchRecord record;
	record.appId = h.appId.value_or("");
	record.operation = h.operation.value_or("");
	record.uri = h.uri.value_or("");
	record.mime = h.mime.value_or("");
	record.launchMode = h.launchMode;
	for (const auto& entry : h.extras)
		record.extras[entry.first] = entry.second.values;
	record.replyRequested = replyRequested;
	return record;
}

bool isKnownResult(app_control_result_e result)
{
	return result == APP_CONTROL_RESULT_APP_STARTED || result == APP_CONTROL_RESULT_SUCCEEDED ||
		result == APP_CONTROL_RESULT_FAILED || result == APP_CONTROL_RESULT_CANCELED;
}

class Router {
public:
	static Router& instance()
	{
		// Never destroyed: pending jobs must not outlive the main loop at exit.
		static Router* router = new Router;
		return *router;
	}

	uint64_t addHandler(bool byAppId, const std::string& key, Handler handler, TerminateHook onTerminate)
	{
		uint64_t id = m_nextId++;
		m_handlers.push_back({id, byAppId, key, std::move(handler), std::move(onTerminate)});
		return id;
	}

	void removeHandler(uint64_t id)
	{
		for (auto it = m_handlers.begin(); it != m_handlers.end(); ++it) {
			if (it->id == id) {
				m_handlers.erase(it);
				return;
			}
		}
	}

	int send(app_control_h h, app_control_reply_cb replyCb, void* userData)
	{
		const HandlerEntry* entry = __findHandler(*h);
		if (!entry) {
			WERROR("no application for app id '%s', operation '%s'", h->appId.value_or("").c_str(),
					h->operation.value_or("").c_str());
			return APP_CONTROL_ERROR_APP_NOT_FOUND;
		}
		Handler handler = entry->handler;
		uint64_t launchId = __addLaunch(*h, replyCb, userData, entry->onTerminate);
		HandlePtr received(copyHandle(*h));
		received->launchId = launchId;
		received->caller = m_ownAppId;
		received->replyRequested = replyCb != nullptr;

		int err = __runHandler(handler, received.get(), launchId);
		if (err != APP_CONTROL_ERROR_NONE) {
			__dropLaunch(launchId);
			return err;
		}
		h->sent = true;
		__record(launchId, *h, replyCb != nullptr);
		return APP_CONTROL_ERROR_NONE;
	}

	int reply(uint64_t launchId, app_control_h reply, app_control_result_e result)
	{
		auto it = m_launches.find(launchId);
		if (it == m_launches.end()) {
			WERROR("no pending launch %llu (already answered or terminated)", (unsigned long long)launchId);
			return APP_CONTROL_ERROR_INVALID_PARAMETER;
		}
		Launch launch = std::move(it->second);
		m_launches.erase(it);
		if (!launch.replyCb)
			return APP_CONTROL_ERROR_NONE;
		HandlePtr replyCopy(reply ? copyHandle(*reply) : newHandle());
		m_deliveries.push_back({m_nextId++, launchId, launch.replyCb, launch.userData, std::move(launch.request),
				std::move(replyCopy), result});
		__scheduleDelivery();
		return APP_CONTROL_ERROR_NONE;
	}

	bool isPending(uint64_t launchId) const { return m_launches.count(launchId) != 0; }

	int terminate(app_control_h h)
	{
		if (!h->sent) {
			WERROR("terminate of a request that was never sent");
			return APP_CONTROL_ERROR_APP_NOT_FOUND;
		}
		std::vector<TerminateHook> hooks;
		for (auto it = m_launches.begin(); it != m_launches.end();) {
			if (it->second.senderSerial != h->serial) {
				++it;
				continue;
			}
			__markTerminated(it->second.recordSeq);
			if (it->second.onTerminate)
				hooks.push_back(std::move(it->second.onTerminate));
			it = m_launches.erase(it);
		}
		for (auto& hook : hooks)
			hook();
		return APP_CONTROL_ERROR_NONE;
	}

	int cancel(void* userData)
	{
		int dropped = 0;
		for (auto& entry : m_launches) {
			Launch& launch = entry.second;
			if (launch.replyCb && launch.userData == userData) {
				++dropped;
				launch.replyCb = nullptr;
				launch.request.reset();
			}
		}
		for (auto it = m_deliveries.begin(); it != m_deliveries.end();) {
			if (it->userData == userData) {
				++dropped;
				it = m_deliveries.erase(it);
			} else {
				++it;
			}
		}
		return dropped;
	}

	std::vector<LaunchRecord> records() const
	{
		std::vector<LaunchRecord> out;
		for (const auto& entry : m_records)
			out.push_back(entry.second);
		return out;
	}

	void clearRecords() { m_records.clear(); }
	void setOwnAppId(const std::string& appId) { m_ownAppId = appId; }

private:
	Router() = default;

	const HandlerEntry* __findHandler(const app_control_s& h) const
	{
		bool byAppId = h.appId.has_value() && !h.appId->empty();
		const std::string& key = byAppId ? *h.appId : h.operation.value_or("");
		if (key.empty())
			return nullptr;
		for (auto it = m_handlers.rbegin(); it != m_handlers.rend(); ++it) {
			if (it->byAppId == byAppId && it->key == key)
				return &*it;
		}
		return nullptr;
	}

	uint64_t __addLaunch(const app_control_s& h, app_control_reply_cb replyCb, void* userData,
			const TerminateHook& onTerminate)
	{
		uint64_t launchId = m_nextId++;
		Launch launch;
		launch.senderSerial = h.serial;
		launch.replyCb = replyCb;
		launch.userData = userData;
		if (replyCb)
			launch.request.reset(copyHandle(h));
		launch.onTerminate = onTerminate;
		m_launches.emplace(launchId, std::move(launch));
		__trimUnawaitedLaunches();
		return launchId;
	}

	// Launches nobody waits for stay answerable and terminable, but only the
	// newest of them are kept so handlers that never answer cannot grow this.
	void __trimUnawaitedLaunches()
	{
		size_t unawaited = 0;
		for (const auto& entry : m_launches)
			unawaited += entry.second.replyCb ? 0 : 1;
		for (auto it = m_launches.begin(); unawaited > kMaxUnawaitedLaunches && it != m_launches.end();) {
			if (it->second.replyCb) {
				++it;
				continue;
			}
			it = m_launches.erase(it);
			--unawaited;
		}
	}

	int __runHandler(const Handler& handler, app_control_h received, uint64_t launchId)
	{
		try {
			return handler(received, Reply(launchId));
		} catch (const std::exception& e) {
			WERROR("launch handler threw: %s", e.what());
		} catch (...) {
			WERROR("launch handler threw");
		}
		return APP_CONTROL_ERROR_LAUNCH_FAILED;
	}

	// A failed launch must not answer its sender, even if the handler replied.
	void __dropLaunch(uint64_t launchId)
	{
		auto it = m_launches.find(launchId);
		if (it != m_launches.end()) {
			m_launches.erase(it);
			return;
		}
		for (auto d = m_deliveries.begin(); d != m_deliveries.end(); ++d) {
			if (d->launchId == launchId) {
				m_deliveries.erase(d);
				return;
			}
		}
	}

	void __record(uint64_t launchId, const app_control_s& h, bool replyRequested)
	{
		uint64_t seq = m_nextId++;
		m_records.emplace(seq, makeRecord(h, replyRequested));
		if (m_records.size() > kMaxRecords)
			m_records.erase(m_records.begin());
		auto it = m_launches.find(launchId);
		if (it != m_launches.end())
			it->second.recordSeq = seq;
	}

	void __markTerminated(uint64_t seq)
	{
		auto it = m_records.find(seq);
		if (it != m_records.end())
			it->second.terminated = true;
	}

	void __scheduleDelivery()
	{
		if (m_job && m_job->isValid())
			return;
		m_job = std::make_unique<MainLoopJob>(&Router::__deliverCb, this);
	}

	static void __deliverCb(void* data)
	{
		auto* self = static_cast<Router*>(data);
		self->m_job->markFired();
		// Replies queued by these callbacks wait for the next job; replies
		// cancelled by them are gone from the queue before their turn.
		uint64_t last = self->m_deliveries.empty() ? 0 : self->m_deliveries.back().seq;
		while (!self->m_deliveries.empty() && self->m_deliveries.front().seq <= last) {
			Delivery delivery = std::move(self->m_deliveries.front());
			self->m_deliveries.pop_front();
			delivery.replyCb(delivery.request.get(), delivery.reply.get(), delivery.result, delivery.userData);
		}
		if (self->m_job->isValid())
			return;
		if (self->m_deliveries.empty())
			self->m_job.reset();
		else
			self->m_job = std::make_unique<MainLoopJob>(&Router::__deliverCb, self);
	}

private:
	uint64_t m_nextId = 1;
	std::vector<HandlerEntry> m_handlers;
	std::map<uint64_t, Launch> m_launches;
	std::deque<Delivery> m_deliveries;
	std::map<uint64_t, LaunchRecord> m_records;
	std::unique_ptr<MainLoopJob> m_job;
	std::string m_ownAppId = CONTACTS_APP_ID;
};

} // namespace

int Reply::operator()(app_control_h reply, app_control_result_e result) const
{
	WPRET_VM(m_launchId == 0, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : empty reply");
	WPRET_VM(!isKnownResult(result), APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : result %d", (int)result);
	try {
		return Router::instance().reply(m_launchId, reply, result);
	} catch (const std::bad_alloc&) {
		return APP_CONTROL_ERROR_OUT_OF_MEMORY;
	}
}

bool Reply::isPending() const
{
	return m_launchId != 0 && Router::instance().isPending(m_launchId);
}

Registration::~Registration()
{
	reset();
}

Registration::Registration(Registration&& other) noexcept : m_id(other.m_id)
{
	other.m_id = 0;
}

Registration& Registration::operator=(Registration&& other) noexcept
{
	if (this != &other) {
		reset();
		m_id = other.m_id;
		other.m_id = 0;
	}
	return *this;
}

void Registration::reset()
{
	if (m_id)
		Router::instance().removeHandler(m_id);
	m_id = 0;
}

Registration registerAppHandler(const std::string& appId, Handler handler, TerminateHook onTerminate)
{
	return Registration(Router::instance().addHandler(true, appId, std::move(handler), std::move(onTerminate)));
}

Registration registerOperationHandler(const std::string& operation, Handler handler, TerminateHook onTerminate)
{
	return Registration(
			Router::instance().addHandler(false, operation, std::move(handler), std::move(onTerminate)));
}

ScopedReplyCancel::~ScopedReplyCancel()
{
	app_control_cancel_replies(m_userData);
}

std::string LaunchRecord::extra(const std::string& key) const
{
	auto it = extras.find(key);
	return it == extras.end() || it->second.empty() ? std::string() : it->second.front();
}

std::vector<LaunchRecord> launches()
{
	return Router::instance().records();
}

void clearLaunches()
{
	Router::instance().clearRecords();
}

void setOwnAppId(const std::string& appId)
{
	Router::instance().setOwnAppId(appId);
}

} // namespace ct::appcontrol

using ct::appcontrol::Router;

int app_control_send_launch_request(app_control_h app_control, app_control_reply_cb reply_cb, void* user_data)
{
	WPRET_VM(!app_control, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control");
	try {
		return Router::instance().send(app_control, reply_cb, user_data);
	} catch (const std::bad_alloc&) {
		WFAILED("app_control_send_launch_request", APP_CONTROL_ERROR_OUT_OF_MEMORY);
		return APP_CONTROL_ERROR_OUT_OF_MEMORY;
	}
}

int app_control_send_terminate_request(app_control_h app_control)
{
	WPRET_VM(!app_control, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control");
	return Router::instance().terminate(app_control);
}

int app_control_cancel_replies(void* user_data)
{
	return Router::instance().cancel(user_data);
}

int app_control_reply_to_launch_request(app_control_h reply, app_control_h request, app_control_result_e result)
{
	WPRET_VM(!reply || !request, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : reply or request");
	WPRET_VM(request->launchId == 0, APP_CONTROL_ERROR_INVALID_PARAMETER, "request was not received");
	return ct::appcontrol::Reply(request->launchId)(reply, result);
}

int app_control_get_caller(app_control_h app_control, char** id)
{
	WPRET_VM(!app_control || !id, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control or id");
	*id = nullptr;
	WPRET_VM(!app_control->caller, APP_CONTROL_ERROR_INVALID_PARAMETER, "request was not received");
	*id = strdup(app_control->caller->c_str());
	return *id ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

int app_control_is_reply_requested(app_control_h app_control, bool* requested)
{
	WPRET_VM(!app_control || !requested, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control or requested");
	WPRET_VM(app_control->launchId == 0, APP_CONTROL_ERROR_INVALID_PARAMETER, "request was not received");
	*requested = app_control->replyRequested;
	return APP_CONTROL_ERROR_NONE;
}
