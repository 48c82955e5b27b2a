// Tells a store, on the EFL main loop, that its database may have changed:
// after its own commits (notifyLocalChange) and when another connection or
// process committed. Other commits are noticed through inotify events on the
// database's folder, read by a main-loop fd handler and confirmed by PRAGMA
// data_version; nothing wakes the loop while no file changes. Only when the
// folder cannot be watched (or goes away) does a slow poll take over.
//
// Why not Ecore_File's or Eio's monitor: the first frees its monitor by
// itself when the folder is deleted (our handle then dangles), the second
// starts watching only after an asynchronous stat, missing the commits made
// right after a callback was registered.
#pragma once

#include "SqliteDatabase.h"

#include <Ecore.h>

#include <functional>
#include <string>

namespace ct::db {

enum class ChangeDetection { FileEvents, PollOnly };

class StoreChangeWatcher {
public:
	static constexpr double kFallbackPollSeconds = 0.5;

	// `db` must outlive the watcher. `onChange` runs on the main loop, at most
	// once per main-loop iteration however many commits came before it.
	StoreChangeWatcher(Database& db, std::function<void()> onChange,
		ChangeDetection detection = ChangeDetection::FileEvents);
	~StoreChangeWatcher();
	StoreChangeWatcher(const StoreChangeWatcher&) = delete;
	StoreChangeWatcher& operator=(const StoreChangeWatcher&) = delete;

	// Call after this connection committed.
	void notifyLocalChange();
	// Whether other commits are noticed through file events (else by polling).
	bool watchesFiles() const { return m_fdHandler != nullptr; }

private:
	static Eina_Bool __fileEventsCb(void* data, Ecore_Fd_Handler* handler);
	static Eina_Bool __pollCb(void* data);
	static Eina_Bool __recheckCb(void* data);
	static void __jobCb(void* data);
	bool __watchFolder();
	void __startPolling();
	void __stopWatching();
	// Reads the pending events; false when the folder is no longer watched.
	bool __readEvents(bool* touched);
	bool __isDatabaseFile(const char* name) const;
	// Queues a delivery when another connection committed since the last check.
	bool __checkVersion();
	void __scheduleRecheck();
	void __deliver();

	Database& m_db;
	std::function<void()> m_onChange;
	int64_t m_lastVersion;
	std::string m_path;
	int m_inotify = -1;
	Ecore_Fd_Handler* m_fdHandler = nullptr;
	Ecore_Timer* m_pollTimer = nullptr;
	Ecore_Timer* m_recheckTimer = nullptr;
	int m_rechecksLeft = 0;
	Ecore_Job* m_job = nullptr;
};

} // namespace ct::db
