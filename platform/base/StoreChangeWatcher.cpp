#include "StoreChangeWatcher.h"

#include <sys/inotify.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>

namespace ct::db {
namespace {

// A commit writes its last WAL frame a moment before it publishes the new
// state (and a busy machine can pause the writer in between), so a file
// event can come early: the version is checked again after 0.5 ms, then at
// doubling intervals up to 64 ms, and never while no file changes.
constexpr double kFirstRecheckSeconds = 0.0005;
constexpr int kRechecks = 8;

constexpr uint32_t kWatchedEvents = IN_MODIFY | IN_CLOSE_WRITE | IN_CREATE | IN_MOVED_TO | IN_DELETE_SELF
	| IN_MOVE_SELF | IN_ONLYDIR;

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
	if (detection == ChangeDetection::PollOnly || !__watchFolder())
		__startPolling();
}

StoreChangeWatcher::~StoreChangeWatcher()
{
	// A watcher of a store kept in a static can outlive the toolkit, whose
	// shutdown may take ecore down whatever we still hold (and our timers,
	// handlers and job with it): only what is alive is freed.
	bool ecoreAlive = ecore_init() > 1;
	if (!ecoreAlive)
		m_fdHandler = nullptr, m_pollTimer = m_recheckTimer = nullptr, m_job = nullptr;
	__stopWatching();
	if (m_job)
		ecore_job_del(m_job);
	ecore_shutdown();
	if (ecoreAlive)
		ecore_shutdown();
}

bool StoreChangeWatcher::__watchFolder()
{
	std::string folder = folderOf(m_path);
	if (folder.empty())
		return false;
	m_inotify = inotify_init1(IN_NONBLOCK | IN_CLOEXEC);
	if (m_inotify < 0)
		return false;
	if (inotify_add_watch(m_inotify, folder.c_str(), kWatchedEvents) < 0) {
		close(m_inotify);
		m_inotify = -1;
		return false;
	}
	m_fdHandler = ecore_main_fd_handler_add(m_inotify, ECORE_FD_READ, __fileEventsCb, this, nullptr, nullptr);
	return m_fdHandler != nullptr;
}

void StoreChangeWatcher::__startPolling()
{
	if (!m_pollTimer)
		m_pollTimer = ecore_timer_add(kFallbackPollSeconds, __pollCb, this);
}

void StoreChangeWatcher::__stopWatching()
{
	if (m_fdHandler)
		ecore_main_fd_handler_del(m_fdHandler);
	if (m_inotify >= 0)
		close(m_inotify);
	if (m_pollTimer)
		ecore_timer_del(m_pollTimer);
	if (m_recheckTimer)
		ecore_timer_del(m_recheckTimer);
	m_fdHandler = nullptr;
	m_inotify = -1;
	m_pollTimer = m_recheckTimer = nullptr;
}

void StoreChangeWatcher::notifyLocalChange()
{
	if (!m_job)
		m_job = ecore_job_add(__jobCb, this);
}

bool StoreChangeWatcher::__isDatabaseFile(const char* name) const
{
	std::string base = std::filesystem::path(m_path).filename().string();
	return name == base || name == base + "-wal" || name == base + "-journal";
}

bool StoreChangeWatcher::__readEvents(bool* touched)
{
	alignas(inotify_event) char buffer[4096];
	for (;;) {
		ssize_t size = read(m_inotify, buffer, sizeof(buffer));
		if (size <= 0)
			return size == 0 || errno == EAGAIN || errno == EINTR;
		for (ssize_t at = 0; at < size;) {
			const auto* event = reinterpret_cast<const inotify_event*>(buffer + at);
			at += static_cast<ssize_t>(sizeof(inotify_event) + event->len);
			if (event->mask & (IN_DELETE_SELF | IN_MOVE_SELF | IN_IGNORED))
				return false;
			if (event->len > 0 && __isDatabaseFile(event->name))
				*touched = true;
		}
	}
}

Eina_Bool StoreChangeWatcher::__fileEventsCb(void* data, Ecore_Fd_Handler*)
{
	auto* self = static_cast<StoreChangeWatcher*>(data);
	bool touched = false;
	bool watching = self->__readEvents(&touched);
	if (touched && !self->__checkVersion())
		self->__scheduleRecheck();
	if (watching)
		return ECORE_CALLBACK_RENEW;
	// The folder went away: nothing more will come from it.
	self->m_fdHandler = nullptr;
	close(self->m_inotify);
	self->m_inotify = -1;
	self->__startPolling();
	return ECORE_CALLBACK_CANCEL;
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
