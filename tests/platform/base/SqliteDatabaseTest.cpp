#include "DataDir.h"
#include "SqliteDatabase.h"
#include "SqliteFaultInjector.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <string>

using ct::db::Database;
using ct::db::FaultInjector;
using ct::db::ScopedWriteFailure;
using ct::db::Transaction;

namespace {

std::string readFile(const std::string& path)
{
	std::ifstream in(path, std::ios::binary);
	return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

int countRows(Database& db)
{
	auto st = db.prepare("SELECT count(*) FROM t");
	return st.step() == SQLITE_ROW ? st.columnInt(0) : -1;
}

int insertTwoRows(Database& db)
{
	Transaction tx(db);
	if (tx.status() != SQLITE_OK)
		return tx.status();
	for (const char* text : {"first", "second"}) {
		auto st = db.prepare("INSERT INTO t(v) VALUES(?)");
		st.bind(1, text);
		if (int rc = st.run(); rc != SQLITE_DONE)
			return rc;
	}
	return tx.commit();
}

} // namespace

TEST(SqliteDatabase, BindsTextLiterallyAndPersistsAcrossReopen)
{
	ct::test::TempDataDir dir;
	const std::string path = dir.file("t.db");
	{
		Database db;
		ASSERT_EQ(SQLITE_OK, db.open(path));
		ASSERT_EQ(SQLITE_OK, db.exec("CREATE TABLE t(v TEXT)"));
		auto st = db.prepare("INSERT INTO t(v) VALUES(?)");
		st.bind(1, "x'); DROP TABLE t; --");
		EXPECT_EQ(SQLITE_DONE, st.run());
		st.reset();
		st.bind(1, static_cast<const char*>(nullptr));
		EXPECT_EQ(SQLITE_DONE, st.run());
	}
	Database db;
	ASSERT_EQ(SQLITE_OK, db.open(path, ct::db::OpenMode::ReadOnly));
	auto st = db.prepare("SELECT v FROM t ORDER BY rowid");
	ASSERT_EQ(SQLITE_ROW, st.step());
	EXPECT_EQ("x'); DROP TABLE t; --", st.columnText(0));
	ASSERT_EQ(SQLITE_ROW, st.step());
	EXPECT_TRUE(st.columnIsNull(0));
	EXPECT_EQ(nullptr, st.columnTextPtr(0));
	EXPECT_EQ(SQLITE_DONE, st.step());
	EXPECT_FALSE(db.prepare("SELECT nonsense FROM").valid());
}

TEST(SqliteDatabase, ForeignFilesAndBadPathsAreReportedNotOverwritten)
{
	ct::test::TempDataDir dir;
	const std::string garbage = dir.file("garbage.db");
	std::ofstream(garbage, std::ios::binary) << std::string(8192, 'z');
	Database db;
	EXPECT_NE(SQLITE_OK, db.open(garbage));
	EXPECT_FALSE(db.isOpen());
	EXPECT_EQ(std::string(8192, 'z'), readFile(garbage));

	const std::string notADir = dir.file("plain");
	std::ofstream(notADir) << "x";
	EXPECT_EQ(-13, ct::db::toErrno(db.open(notADir + "/t.db")));
	EXPECT_NE(0, ct::platform::makeDirectories(notADir + "/sub"));
}

TEST(SqliteDatabase, EveryFailedWriteLeavesTheTableAsItWas)
{
	ct::test::TempDataDir dir;
	Database db;
	ASSERT_EQ(SQLITE_OK, db.open(dir.file("t.db")));
	ASSERT_EQ(SQLITE_OK, db.exec("CREATE TABLE t(v TEXT)"));
	ASSERT_EQ(SQLITE_OK, insertTwoRows(db));

	FaultInjector::resetCount();
	ASSERT_EQ(SQLITE_OK, insertTwoRows(db));
	const int writesPerSave = FaultInjector::writeCount();
	ASSERT_GT(writesPerSave, 0);

	int expected = 4;
	int failures = 0;
	for (int n = 1; n <= writesPerSave + 1; ++n) {
		int rc;
		{
			ScopedWriteFailure failure(n);
			rc = insertTwoRows(db);
		}
		if (rc == SQLITE_OK) {
			expected += 2;
		} else {
			++failures;
			EXPECT_EQ(SQLITE_FULL, rc) << "write " << n;
		}
		EXPECT_EQ(expected, countRows(db)) << "write " << n;
	}
	EXPECT_EQ(writesPerSave, failures);
	EXPECT_EQ(SQLITE_OK, insertTwoRows(db));
	Database reopened;
	ASSERT_EQ(SQLITE_OK, reopened.open(dir.file("t.db")));
	EXPECT_EQ(expected + 2, countRows(reopened));
}

TEST(SqliteDatabase, CachedStatementsAreResetRetriedAfterAFailedPrepareAndLetOthersWrite)
{
	ct::test::TempDataDir dir;
	const std::string path = dir.file("t.db");
	Database db;
	ASSERT_EQ(SQLITE_OK, db.open(path));
	const std::string query = "SELECT v FROM t WHERE v = ?";
	EXPECT_FALSE(db.cached(query).valid()); // no table yet
	ASSERT_EQ(SQLITE_OK, db.exec("CREATE TABLE t(v TEXT)"));
	ASSERT_EQ(SQLITE_OK, insertTwoRows(db));
	{
		ct::db::CachedStatement st(db.cached(query));
		ASSERT_TRUE(st->valid());
		EXPECT_EQ(SQLITE_ROW, st->bind(1, "first").step());
		EXPECT_EQ(&*st, &db.cached(query)) << "prepared once";
	}
	// The holder reset it: no read stays open to keep a writer waiting, and
	// the old binding is gone.
	Database other;
	ASSERT_EQ(SQLITE_OK, other.open(path));
	ASSERT_EQ(SQLITE_OK, insertTwoRows(other));
	EXPECT_EQ(SQLITE_DONE, ct::db::CachedStatement(db.cached(query))->step());
	EXPECT_EQ(4, countRows(db));

	db.close();
	ASSERT_EQ(SQLITE_OK, db.open(path));
	EXPECT_EQ(SQLITE_ROW, ct::db::CachedStatement(db.cached(query))->bind(1, "second").step());
}

TEST(SqliteDatabase, AReadSnapshotSeesOneStateOfTheFileAndNestsInAWrite)
{
	ct::test::TempDataDir dir;
	const std::string path = dir.file("t.db");
	Database reader, writer;
	ASSERT_EQ(SQLITE_OK, reader.open(path));
	ASSERT_EQ(SQLITE_OK, reader.exec("CREATE TABLE t(v TEXT)"));
	ASSERT_EQ(SQLITE_OK, writer.open(path));
	{
		ct::db::ReadSnapshot snapshot(reader);
		EXPECT_EQ(0, countRows(reader));
		ASSERT_EQ(SQLITE_OK, insertTwoRows(writer)); // readers never block the writer
		EXPECT_EQ(0, countRows(reader));
	}
	EXPECT_EQ(2, countRows(reader));

	Transaction tx(reader);
	ASSERT_EQ(SQLITE_OK, tx.status());
	{
		ct::db::ReadSnapshot inside(reader);
		EXPECT_EQ(SQLITE_OK, reader.exec("INSERT INTO t(v) VALUES('third')"));
	}
	EXPECT_EQ(SQLITE_OK, tx.commit()) << "the snapshot did not end the write";
	EXPECT_EQ(3, countRows(writer));
}
