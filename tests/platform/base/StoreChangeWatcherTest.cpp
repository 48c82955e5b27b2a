#include "SqliteDatabase.h"
#include "StoreChangeWatcher.h"

#include "../vconf/StoreTestSupport.h"

#include <gtest/gtest.h>

#include <memory>

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
