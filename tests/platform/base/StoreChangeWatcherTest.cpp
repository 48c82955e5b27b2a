#include "SqliteDatabase.h"
#include "StoreChangeWatcher.h"
#include "TempDataDir.h"

#include <Ecore.h>
#include <gtest/gtest.h>

#include <memory>

using ct::db::Database;
using ct::db::StoreChangeWatcher;

namespace {

// Runs the main loop until `done` holds or `seconds` passed.
template <typename Pred>
bool pumpUntil(Pred done, double seconds)
{
	double end = ecore_time_get() + seconds;
	while (!done() && ecore_time_get() < end) {
		ecore_main_loop_iterate();
		usleep(1000);
	}
	return done();
}

class StoreChangeWatcherTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ecore_init();
		ASSERT_EQ(SQLITE_OK, m_mine.open(m_dir.file("w.db")));
		ASSERT_EQ(SQLITE_OK, m_mine.exec("CREATE TABLE t(v INTEGER)"));
		ASSERT_EQ(SQLITE_OK, m_other.open(m_dir.file("w.db")));
	}
	void TearDown() override { ecore_shutdown(); }

	ct::test::TempDataDir m_dir;
	Database m_mine;
	Database m_other;
};

} // namespace

TEST_F(StoreChangeWatcherTest, OwnCommitsAreCoalescedIntoOneCall)
{
	int calls = 0;
	StoreChangeWatcher watcher(m_mine, [&] { ++calls; });
	for (int i = 0; i < 5; ++i) {
		m_mine.exec("INSERT INTO t VALUES(1)");
		watcher.notifyLocalChange();
	}
	EXPECT_EQ(0, calls) << "delivered synchronously";
	EXPECT_TRUE(pumpUntil([&] { return calls > 0; }, 2.0));
	pumpUntil([] { return false; }, 0.3);
	EXPECT_EQ(1, calls);
}

TEST_F(StoreChangeWatcherTest, OtherConnectionsCommitsArrive)
{
	int calls = 0;
	StoreChangeWatcher watcher(m_mine, [&] { ++calls; });
	pumpUntil([] { return false; }, 0.25);
	EXPECT_EQ(0, calls);
	m_other.exec("INSERT INTO t VALUES(2)");
	EXPECT_TRUE(pumpUntil([&] { return calls > 0; }, 0.5));
}

TEST_F(StoreChangeWatcherTest, NothingArrivesAfterTheWatcherDied)
{
	int calls = 0;
	auto watcher = std::make_unique<StoreChangeWatcher>(m_mine, [&] { ++calls; });
	watcher->notifyLocalChange();
	m_other.exec("INSERT INTO t VALUES(3)");
	watcher.reset();
	pumpUntil([] { return false; }, 0.3);
	EXPECT_EQ(0, calls);
}
