#include "SqliteDatabase.h"
#include "StoreChangeWatcher.h"

#include "../vconf/StoreTestSupport.h"

#include <gtest/gtest.h>

#include <memory>

#include <sys/wait.h>
#include <unistd.h>

using ct::db::Database;
using ct::db::StoreChangeWatcher;
using namespace ct::test;

TEST(StoreChangeWatcher, OwnCommitsCoalesceOtherConnectionsArriveAndNothingComesAfterDeath)
{
	EcoreScope ecore;
	TempDataDir dir;
	Database mine, other;
	ASSERT_EQ(SQLITE_OK, mine.open(dir.file("w.db")));
	ASSERT_EQ(SQLITE_OK, mine.exec("CREATE TABLE t(v INTEGER)"));
	ASSERT_EQ(SQLITE_OK, other.open(dir.file("w.db")));
	int calls = 0;
	auto watcher = std::make_unique<StoreChangeWatcher>(mine, [&] { ++calls; });
	for (int i = 0; i < 5; ++i) {
		mine.exec("INSERT INTO t VALUES(1)");
		watcher->notifyLocalChange();
	}
	EXPECT_EQ(0, calls) << "delivered synchronously";
	EXPECT_TRUE(pumpUntil([&] { return calls > 0; }, 2.0));
	pumpFor(0.3);
	EXPECT_EQ(1, calls);

	other.exec("INSERT INTO t VALUES(2)");
	EXPECT_TRUE(pumpUntil([&] { return calls == 2; }, 2.0));
	pumpFor(0.3);
	EXPECT_EQ(2, calls);

	watcher->notifyLocalChange();
	other.exec("INSERT INTO t VALUES(3)");
	watcher.reset();
	pumpFor(0.3);
	EXPECT_EQ(2, calls);
}

namespace {

Eina_Bool quitCb(void*)
{
	ecore_main_loop_quit();
	return ECORE_CALLBACK_CANCEL;
}

Eina_Bool countCb(void* data)
{
	++*static_cast<int*>(data);
	return ECORE_CALLBACK_RENEW;
}

// Times the main loop woke up during `seconds` of running it.
int wakeUpsWhileRunning(double seconds)
{
	int wakeUps = 0;
	Ecore_Idle_Exiter* exiter = ecore_idle_exiter_add(countCb, &wakeUps);
	ecore_timer_add(seconds, quitCb, nullptr);
	ecore_main_loop_begin();
	ecore_idle_exiter_del(exiter);
	return wakeUps;
}

} // namespace

TEST(StoreChangeWatcher, NothingWakesTheLoopWhileNoFileChanges)
{
	EcoreScope ecore;
	TempDataDir dir;
	Database mine;
	ASSERT_EQ(SQLITE_OK, mine.open(dir.file("w.db")));
	ASSERT_EQ(SQLITE_OK, mine.exec("CREATE TABLE t(v INTEGER)"));
	StoreChangeWatcher watcher(mine, [] {});
	ASSERT_TRUE(watcher.watchesFiles());
	pumpFor(0.1);
	// Only the timer that ends the run wakes the loop.
	EXPECT_EQ(1, wakeUpsWhileRunning(0.4));
}

TEST(StoreChangeWatcher, AnotherProcessCommitArrivesThroughFileEventsOrThroughTheFallbackPoll)
{
	for (ct::db::ChangeDetection detection : { ct::db::ChangeDetection::FileEvents, ct::db::ChangeDetection::PollOnly }) {
		EcoreScope ecore;
		TempDataDir dir;
		Database mine;
		ASSERT_EQ(SQLITE_OK, mine.open(dir.file("w.db")));
		ASSERT_EQ(SQLITE_OK, mine.exec("CREATE TABLE t(v INTEGER)"));
		int calls = 0;
		StoreChangeWatcher watcher(mine, [&] { ++calls; }, detection);
		EXPECT_EQ(detection == ct::db::ChangeDetection::FileEvents, watcher.watchesFiles());
		pid_t child = fork();
		ASSERT_GE(child, 0);
		if (child == 0) {
			Database theirs;
			bool ok = theirs.open(dir.file("w.db")) == SQLITE_OK && theirs.exec("INSERT INTO t VALUES(7)") == SQLITE_OK;
			_exit(ok ? 0 : 1);
		}
		int status = 0;
		waitpid(child, &status, 0);
		ASSERT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
		EXPECT_TRUE(pumpUntil([&] { return calls > 0; }, 3.0)) << static_cast<int>(detection);
		// Writes of the watcher's own connection are told by notifyLocalChange only.
		calls = 0;
		mine.exec("INSERT INTO t VALUES(8)");
		pumpFor(0.2);
		EXPECT_EQ(0, calls) << static_cast<int>(detection);
	}
}

TEST(StoreChangeWatcher, AFolderThatGoesAwayLeavesTheWatcherPollingAndSafeToDelete)
{
	EcoreScope ecore;
	auto dir = std::make_unique<TempDataDir>();
	Database mine;
	ASSERT_EQ(SQLITE_OK, mine.open(dir->file("w.db")));
	ASSERT_EQ(SQLITE_OK, mine.exec("CREATE TABLE t(v INTEGER)"));
	auto watcher = std::make_unique<StoreChangeWatcher>(mine, [] {});
	ASSERT_TRUE(watcher->watchesFiles());
	mine.close();
	dir.reset();
	EXPECT_TRUE(pumpUntil([&] { return !watcher->watchesFiles(); }, 3.0));
	watcher.reset();
	pumpFor(0.1);
}
