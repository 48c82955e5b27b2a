#include "StoreChangeWatcher.h"

#include <filesystem>

namespace ct::db {
namespace {

// A commit writes its last WAL frame a moment before it publishes the new
// state (and a busy machine can pause the writer in between), so a file
// event can come early: the version is checked again after 0.5 ms, then at
// doubling intervals up to 64 ms, and never while no file changes.
constexpr double kFirstRecheckSeconds = 0.0005;
constexpr int kRechecks = 8;

std::string folderOf(const std::string& path)
{
	std::error_code ec;
	std::filesystem::path absolute = std::filesystem::absolute(path, ec);
	return ec ? std::string() : absolute.parent_path().string();
}

} // namespace

StoreChangeWatcher::StoreChangeWatcher(Database& db, std::function<void()> onChange, ChangeDetection detection)
	: m_db(db)
	, m_onChange(std::move(onChange))
	, m_lastVersion(db.dataVersion())
	, m_path(db.path())
{
	ecore_init();
	ecore_file_init();
	if (detection == ChangeDetection::PollOnly || !__watchFolder())
		__startPolling();
}

StoreChangeWatcher::~StoreChangeWatcher()
{
	__stopWatching();
	if (m_job)
		ecore_job_del(m_job);
	ecore_file_shutdown();
	ecore_shutdown();
}

bool StoreChangeWatcher::__watchFolder()
{
	std::string folder = folderOf(m_path);
	if (folder.empty())
		return false;
	m_monitor = ecore_file_monitor_add(folder.c_str(), __fileEventCb, this);
	return m_monitor != nullptr;
}

void StoreChangeWatcher::__startPolling()
{
	m_pollTimer = ecore_timer_add(kFallbackPollSeconds, __pollCb, this);
}

void StoreChangeWatcher::__stopWatching()
{
	if (m_monitor)
		ecore_file_monitor_del(m_monitor);
	if (m_pollTimer)
		ecore_timer_del(m_pollTimer);
	if (m_recheckTimer)
		ecore_timer_del(m_recheckTimer);
	m_monitor = nullptr;
	m_pollTimer = m_recheckTimer = nullptr;
}

void StoreChangeWatcher::notifyLocalChange()
{
	if (!m_job)
		m_job = ecore_job_add(__jobCb, this);
}

bool StoreChangeWatcher::__isDatabaseFile(const char* path) const
{
	if (!path)
		return false;
	std::string name = std::filesystem::path(path).filename().string();
	std::string base = std::filesystem::path(m_path).filename().string();
	return name == base || name == base + "-wal" || name == base + "-journal";
}

void StoreChangeWatcher::__fileEventCb(void* data, Ecore_File_Monitor*, Ecore_File_Event event, const char* path)
{
	auto* self = static_cast<StoreChangeWatcher*>(data);
	if (event == ECORE_FILE_EVENT_DELETED_SELF || !self->__isDatabaseFile(path))
		return;
	if (!self->__checkVersion())
		self->__scheduleRecheck();
}

bool StoreChangeWatcher::__checkVersion()
{
	int64_t version = m_db.dataVersion();
	if (version == m_lastVersion)
		return false;
	m_lastVersion = version;
	// Delivered from a job, where the receiver may even delete the watcher.
	notifyLocalChange();
	return true;
}

void StoreChangeWatcher::__scheduleRecheck()
{
	m_rechecksLeft = kRechecks;
	if (m_recheckTimer)
		ecore_timer_del(m_recheckTimer);
	m_recheckTimer = ecore_timer_add(kFirstRecheckSeconds, __recheckCb, this);
}

Eina_Bool StoreChangeWatcher::__recheckCb(void* data)
{
	auto* self = static_cast<StoreChangeWatcher*>(data);
	--self->m_rechecksLeft;
	if (self->__checkVersion() || self->m_rechecksLeft <= 0) {
		self->m_recheckTimer = nullptr;
		return ECORE_CALLBACK_CANCEL;
	}
	ecore_timer_interval_set(self->m_recheckTimer, kFirstRecheckSeconds * (1 << (kRechecks - self->m_rechecksLeft)));
	return ECORE_CALLBACK_RENEW;
}

Eina_Bool StoreChangeWatcher::__pollCb(void* data)
{
	static_cast<StoreChangeWatcher*>(data)->__checkVersion();
	return ECORE_CALLBACK_RENEW;
}

void StoreChangeWatcher::__jobCb(void* data)
{
	auto* self = static_cast<StoreChangeWatcher*>(data);
	self->m_job = nullptr;
	self->__deliver();
}

void StoreChangeWatcher::__deliver()
{
	if (m_onChange)
		m_onChange();
}


} // namespace ct::db
