// Tells a store, on the EFL main loop, that its database may have changed:
// after its own commits (notifyLocalChange) and when another connection or
// process committed (polled through PRAGMA data_version).
#pragma once

#include "SqliteDatabase.h"

#include <Ecore.h>

#include <functional>

namespace ct::db {

class StoreChangeWatcher {
public:
	static constexpr double kDefaultPollSeconds = 0.1;

	// `db` must outlive the watcher. `onChange` runs on the main loop, at most
	// once per main-loop iteration however many commits came before it.
	StoreChangeWatcher(Database& db, std::function<void()> onChange,
		double pollSeconds = kDefaultPollSeconds);
	~StoreChangeWatcher();
	StoreChangeWatcher(const StoreChangeWatcher&) = delete;
	StoreChangeWatcher& operator=(const StoreChangeWatcher&) = delete;

	// Call after this connection committed.
	void notifyLocalChange();

private:
	static Eina_Bool __pollCb(void* data);
	static void __jobCb(void* data);
	void __deliver();

	Database& m_db;
	std::function<void()> m_onChange;
	int64_t m_lastVersion;
	Ecore_Timer* m_timer = nullptr;
	Ecore_Job* m_job = nullptr;
};

} // namespace ct::db
