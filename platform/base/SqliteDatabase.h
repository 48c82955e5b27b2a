// Thin RAII layer over SQLite used by every platform store.
#pragma once

#include <sqlite3.h>

#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>

namespace ct::db {

// A prepared statement; finalized when it goes out of scope. Parameters are
// 1-based like SQLite's, columns 0-based.
class Statement {
public:
	Statement() = default;
	Statement(sqlite3* db, const char* sql);
	~Statement();
	Statement(Statement&& other) noexcept;
	Statement& operator=(Statement&& other) noexcept;
	Statement(const Statement&) = delete;
	Statement& operator=(const Statement&) = delete;

	bool valid() const { return m_stmt != nullptr; }
	// The result of sqlite3_prepare_v2 for this statement.
	int prepareStatus() const { return m_prepareStatus; }

	Statement& bind(int index, int value);
	Statement& bind(int index, int64_t value);
	Statement& bind(int index, double value);
	// A null text binds SQL NULL. The text is copied.
	Statement& bind(int index, const char* text);
	Statement& bind(int index, const std::string& text);
	Statement& bindBlob(int index, const void* data, int size);
	Statement& bindNull(int index);

	// SQLITE_ROW, SQLITE_DONE or an error code.
	int step();
	// step() until done; SQLITE_DONE on success.
	int run();
	void reset();

	int columnInt(int col) const;
	int64_t columnInt64(int col) const;
	double columnDouble(int col) const;
	// Empty for NULL.
	std::string columnText(int col) const;
	// Null for NULL; valid until the next step.
	const char* columnTextPtr(int col) const;
	bool columnIsNull(int col) const;
	int columnBytes(int col) const;
	const void* columnBlob(int col) const;

	sqlite3_stmt* handle() const { return m_stmt; }

private:
	sqlite3_stmt* m_stmt = nullptr;
	int m_prepareStatus = SQLITE_MISUSE;
};

enum class OpenMode { ReadWriteCreate, ReadWrite, ReadOnly };

// One connection. Files are opened in WAL mode with a busy timeout, through
// the fault-injecting VFS (a pass-through unless a test arms it).
class Database {
public:
	Database() = default;
	~Database();
	Database(const Database&) = delete;
	Database& operator=(const Database&) = delete;

	// SQLITE_OK or the SQLite error; errorMessage() tells more.
	int open(const std::string& path, OpenMode mode = OpenMode::ReadWriteCreate);
	void close();
	bool isOpen() const { return m_db != nullptr; }
	sqlite3* handle() const { return m_db; }
	const std::string& path() const { return m_path; }

	// Runs SQL without parameters (schema scripts). SQLITE_OK or the error.
	int exec(const char* sql);
	Statement prepare(const char* sql) const { return Statement(m_db, sql); }
	// The statement for `sql`, prepared once per connection and reset; hold
	// it in a CachedStatement. One thread at a time.
	Statement& cached(const std::string& sql) const;

	std::string errorMessage() const;
	int64_t lastInsertRowId() const;
	int changes() const;
	// Changes when another connection commits (PRAGMA data_version).
	int64_t dataVersion() const;

private:
	sqlite3* m_db = nullptr;
	std::string m_path;
	mutable std::unordered_map<std::string, std::unique_ptr<Statement>> m_statements;
};

// A cached statement, reset when the holder goes out of scope so that no
// read transaction stays open.
class CachedStatement {
public:
	explicit CachedStatement(Statement& st) : m_st(st) {}
	~CachedStatement() { m_st.reset(); }
	CachedStatement(const CachedStatement&) = delete;
	CachedStatement& operator=(const CachedStatement&) = delete;
	Statement* operator->() { return &m_st; }
	Statement& operator*() { return m_st; }

private:
	Statement& m_st;
};

// BEGIN IMMEDIATE on construction; rolls back unless commit() succeeded.
class Transaction {
public:
	explicit Transaction(Database& db);
	~Transaction();
	Transaction(const Transaction&) = delete;
	Transaction& operator=(const Transaction&) = delete;

	// SQLITE_OK when the transaction began.
	int status() const { return m_status; }
	// SQLITE_OK or the error; on error the transaction is rolled back.
	int commit();

private:
	Database& m_db;
	int m_status;
	bool m_open = false;
};

// A read transaction around several statements, so that they see one state
// of the file and take the read lock once; nothing when a transaction is
// already open or cannot begin (the statements then read on their own).
class ReadSnapshot {
public:
	explicit ReadSnapshot(const Database& db);
	~ReadSnapshot();
	ReadSnapshot(const ReadSnapshot&) = delete;
	ReadSnapshot& operator=(const ReadSnapshot&) = delete;

private:
	const Database& m_db;
	bool m_open = false;
};

// Statements started by every connection of the process so far (each first
// step after a prepare or reset, and each exec), to tell how much work an
// operation costs the database.
int64_t statementsStarted();

// Maps an SQLite result to a negative errno-style code: 0, -28 (ENOSPC) for a
// full disk, -13 (EACCES) for read-only or unopenable files, -16 (EBUSY) for
// a locked database, -5 (EIO) otherwise.
int toErrno(int sqliteResult);

} // namespace ct::db
