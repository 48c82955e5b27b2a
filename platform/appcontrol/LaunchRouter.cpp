// Routes launch requests to in-process handlers and delivers their replies
// on the EFL main loop.
#include "LaunchRouter.h"

#include "ContactsAppIds.h"
#include "ContactsDebug.h"

namespace ct::appcontrol {
namespace {

const size_t kMaxRecords = 1000;
const size_t kMaxUnawaitedLaunches = 1000;

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

int runHandler(const Handler& handler, app_control_h received, uint64_t launchId)
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

} // namespace

LaunchRouter& LaunchRouter::instance()
{
	static auto* router = new LaunchRouter;
	return *router;
}

LaunchRouter::LaunchRouter() : m_ownAppId(CONTACTS_APP_ID) {}

uint64_t LaunchRouter::addHandler(bool byAppId, const std::string& key, Handler handler, TerminateHook onTerminate)
{
	uint64_t id = m_nextId++;
	m_handlers.push_back({id, byAppId, key, std::move(handler), std::move(onTerminate)});
	return id;
}

void LaunchRouter::removeHandler(uint64_t id)
{
	for (auto it = m_handlers.begin(); it != m_handlers.end(); ++it) {
		if (it->id == id) {
			m_handlers.erase(it);
			return;
		}
	}
}

int LaunchRouter::send(app_control_h h, app_control_reply_cb replyCb, void* userData)
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

	int err = runHandler(handler, received.get(), launchId);
	if (err != APP_CONTROL_ERROR_NONE) {
		__dropLaunch(launchId);
		return err;
	}
	h->sent = true;
	__record(launchId, *h, replyCb != nullptr);
	return APP_CONTROL_ERROR_NONE;
}

int LaunchRouter::reply(uint64_t launchId, app_control_h reply, app_control_result_e result)
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

int LaunchRouter::terminate(app_control_h h)
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
	for (auto& hook : hooks) {
		try {
			hook();
		} catch (...) {
			WERROR("terminate hook threw");
		}
	}
	return APP_CONTROL_ERROR_NONE;
}

int LaunchRouter::cancel(void* userData)
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

size_t LaunchRouter::pendingFor(void* userData) const
{
	size_t count = 0;
	for (const auto& entry : m_launches)
		count += entry.second.replyCb && entry.second.userData == userData ? 1 : 0;
	for (const Delivery& delivery : m_deliveries)
		count += delivery.userData == userData ? 1 : 0;
	return count;
}

std::vector<LaunchRecord> LaunchRouter::records() const
{
	std::vector<LaunchRecord> out;
	for (const auto& entry : m_records)
		out.push_back(entry.second);
	return out;
}

bool LaunchRouter::hasHandler(const std::string& key) const
{
	for (const HandlerEntry& entry : m_handlers)
		if (entry.key == key)
			return true;
	return false;
}

const LaunchRouter::HandlerEntry* LaunchRouter::__findHandler(const app_control_s& h) const
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

uint64_t LaunchRouter::__addLaunch(const app_control_s& h, app_control_reply_cb replyCb, void* userData,
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
void LaunchRouter::__trimUnawaitedLaunches()
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

// A failed launch must not answer its sender, even if the handler replied.
void LaunchRouter::__dropLaunch(uint64_t launchId)
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

void LaunchRouter::__record(uint64_t launchId, const app_control_s& h, bool replyRequested)
{
	uint64_t seq = m_nextId++;
	m_records.emplace(seq, makeRecord(h, replyRequested));
	if (m_records.size() > kMaxRecords)
		m_records.erase(m_records.begin());
	auto it = m_launches.find(launchId);
	if (it != m_launches.end())
		it->second.recordSeq = seq;
}

void LaunchRouter::__markTerminated(uint64_t seq)
{
	auto it = m_records.find(seq);
	if (it != m_records.end())
		it->second.terminated = true;
}

void LaunchRouter::__scheduleDelivery()
{
	if (m_job && m_job->isPending())
		return;
	m_job = std::make_unique<MainLoopJob>([this] { __deliverQueued(); });
}

void LaunchRouter::__deliverQueued()
{
	// Replies queued by these callbacks wait for the next job; replies
	// cancelled by them are gone from the queue before their turn.
	uint64_t last = m_deliveries.empty() ? 0 : m_deliveries.back().seq;
	while (!m_deliveries.empty() && m_deliveries.front().seq <= last) {
		Delivery delivery = std::move(m_deliveries.front());
		m_deliveries.pop_front();
		delivery.replyCb(delivery.request.get(), delivery.reply.get(), delivery.result, delivery.userData);
	}
	if (m_job && m_job->isPending())
		return;
	m_job.reset();
	if (!m_deliveries.empty())
		__scheduleDelivery();
}

} // namespace ct::appcontrol
