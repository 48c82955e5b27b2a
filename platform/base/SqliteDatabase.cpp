#include "SqliteDatabase.h"
#include "SqliteFaultInjector.h"

#include <atomic>
#include <cerrno>
#include <utility>

namespace ct::db {

namespace {

constexpr int kBusyTimeoutMs = 5000;

std::atomic<int64_t> g_statementsStarted{0};

void countStatement()
{
	g_statementsStarted.fetch_add(1, std::memory_order_relaxed);
}

int openFlags(OpenMode mode)
{
	switch (mode) {
	case OpenMode::ReadWriteCreate:
		return SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE;
	case OpenMode::ReadWrite:
		return SQLITE_OPEN_READWRITE;
	case OpenMode::ReadOnly:
		return SQLITE_OPEN_READONLY;
	}
	return SQLITE_OPEN_READWRITE;
}

} // namespace

Statement::Statement(sqlite3* db, const char* sql)
{
	if (!db || !sql)
		return;
	m_prepareStatus = sqlite3_prepare_v2(db, sql, -1, &m_stmt, nullptr);
	if (m_prepareStatus != SQLITE_OK) {
		sqlite3_finalize(m_stmt);
		m_stmt = nullptr;
	}
}

Statement::~Statement()
{
	sqlite3_finalize(m_stmt);
}

Statement::Statement(Statement&& other) noexcept
	: m_stmt(std::exchange(other.m_stmt, nullptr))
	, m_prepareStatus(other.m_prepareStatus)
{
}

Statement& Statement::operator=(Statement&& other) noexcept
{
	if (this != &other) {
		sqlite3_finalize(m_stmt);
		m_stmt = std::exchange(other.m_stmt, nullptr);
		m_prepareStatus = other.m_prepareStatus;
	}
	return *this;
}

Statement& Statement::bind(int index, int value)
{
	sqlite3_bind_int(m_stmt, index, value);
	return *this;
}

Statement& Statement::bind(int index, int64_t value)
{
	sqlite3_bind_int64(m_stmt, index, value);
	return *this;
}

Statement& Statement::bind(int index, double value)
{
	sqlite3_bind_double(m_stmt, index, value);
	return *this;
}

Statement& Statement::bind(int index, const char* text)
{
	if (text)
		sqlite3_bind_text(m_stmt, index, text, -1, SQLITE_TRANSIENT);
	else
		sqlite3_bind_null(m_stmt, index);
	return *this;
}

Statement& Statement::bind(int index, const std::string& text)
{
	sqlite3_bind_text(m_stmt, index, text.data(), (int)text.size(), SQLITE_TRANSIENT);
	return *this;
}

Statement& Statement::bindBlob(int index, const void* data, int size)
{
	sqlite3_bind_blob(m_stmt, index, data, size, SQLITE_TRANSIENT);
	return *this;
}

Statement& Statement::bindNull(int index)
{
	sqlite3_bind_null(m_stmt, index);
	return *this;
}

int Statement::step()
{
	if (!m_stmt)
		return SQLITE_MISUSE;
	if (!sqlite3_stmt_busy(m_stmt))
		countStatement();
	return sqlite3_step(m_stmt);
}

int Statement::run()
{
	int rc;
	while ((rc = step()) == SQLITE_ROW) {
	}
	return rc;
}

void Statement::reset()
{
	if (m_stmt) {
		sqlite3_reset(m_stmt);
		sqlite3_clear_bindings(m_stmt);
	}
}

int Statement::columnInt(int col) const
{
	return sqlite3_column_int(m_stmt, col);
}

int64_t Statement::columnInt64(int col) const
{
	return sqlite3_column_int64(m_stmt, col);
}

double Statement::columnDouble(int col) const
{
	return sqlite3_column_double(m_stmt, col);
}

std::string Statement::columnText(int col) const
{
	const unsigned char* text = sqlite3_column_text(m_stmt, col);
	if (!text)
		return {};
	return std::string(reinterpret_cast<const char*>(text), sqlite3_column_bytes(m_stmt, col));
}

const char* Statement::columnTextPtr(int col) const
{
	return reinterpret_cast<const char*>(sqlite3_column_text(m_stmt, col));
}

bool Statement::columnIsNull(int col) const
{
	return sqlite3_column_type(m_stmt, col) == SQLITE_NULL;
}

int Statement::columnBytes(int col) const
{
	return sqlite3_column_bytes(m_stmt, col);
}

const void* Statement::columnBlob(int col) const
{
	return sqlite3_column_blob(m_stmt, col);
}

Database::~Database()
{
	close();
}

int Database::open(const std::string& path, OpenMode mode)
{
	close();
	m_path = path;
	int rc = sqlite3_open_v2(path.c_str(), &m_db, openFlags(mode), FaultInjector::vfsName());
	if (rc != SQLITE_OK) {
		sqlite3_close(m_db);
		m_db = nullptr;
		return rc;
	}
	sqlite3_busy_timeout(m_db, kBusyTimeoutMs);
	sqlite3_extended_result_codes(m_db, 0);
	if (mode != OpenMode::ReadOnly) {
		// A file that is not a database fails here, before anything is written.
		rc = exec("PRAGMA journal_mode=WAL; PRAGMA synchronous=NORMAL; PRAGMA foreign_keys=ON;");
		if (rc != SQLITE_OK) {
			close();
			return rc;
		}
	}
	return SQLITE_OK;
}

void Database::close()
{
	m_statements.clear();
	if (m_db) {
		sqlite3_close_v2(m_db);
		m_db = nullptr;
	}
}

Statement& Database::cached(const std::string& sql) const
{
	// A statement that failed to prepare (a locked schema, say) is tried again.
	std::unique_ptr<Statement>& slot = m_statements[sql];
	if (!slot || !slot->valid())
		slot = std::make_unique<Statement>(m_db, sql.c_str());
	slot->reset();
	return *slot;
}

int Database::exec(const char* sql)
{
	if (!m_db)
		return SQLITE_MISUSE;
	countStatement();
	return sqlite3_exec(m_db, sql, nullptr, nullptr, nullptr);
}

std::string Database::errorMessage() const
{
	return m_db ? sqlite3_errmsg(m_db) : "database not open";
}

int64_t Database::lastInsertRowId() const
{
	return m_db ? sqlite3_last_insert_rowid(m_db) : 0;
}

int Database::changes() const
{
	return m_db ? sqlite3_changes(m_db) : 0;
}

int64_t Database::dataVersion() const
{
	if (!m_db)
		return -1;
	CachedStatement st(cached("PRAGMA data_version"));
	return st->step() == SQLITE_ROW ? st->columnInt64(0) : -1;
}

ReadSnapshot::ReadSnapshot(const Database& db)
	: m_db(db)
{
	if (!db.handle() || !sqlite3_get_autocommit(db.handle()))
		return;
	CachedStatement begin(db.cached("BEGIN"));
	m_open = begin->step() == SQLITE_DONE;
}

ReadSnapshot::~ReadSnapshot()
{
	if (!m_open)
		return;
	CachedStatement end(m_db.cached("COMMIT"));
	if (end->step() != SQLITE_DONE)
		sqlite3_exec(m_db.handle(), "ROLLBACK", nullptr, nullptr, nullptr);
}

Transaction::Transaction(Database& db)
	: m_db(db)
	, m_status(db.exec("BEGIN IMMEDIATE"))
	, m_open(m_status == SQLITE_OK)
{
}

Transaction::~Transaction()
{
	if (m_open)
		m_db.exec("ROLLBACK");
}

int Transaction::commit()
{
	if (!m_open)
		return m_status == SQLITE_OK ? SQLITE_MISUSE : m_status;
	int rc = m_db.exec("COMMIT");
	if (rc != SQLITE_OK) {
		m_db.exec("ROLLBACK");
	}
	m_open = false;
	return rc;
}

int64_t statementsStarted()
{
	return g_statementsStarted.load(std::memory_order_relaxed);
}

int toErrno(int sqliteResult)
{
	switch (sqliteResult & 0xff) {
	case SQLITE_OK:
	case SQLITE_DONE:
	case SQLITE_ROW:
		return 0;
	case SQLITE_FULL:
		return -ENOSPC;
	case SQLITE_READONLY:
	case SQLITE_CANTOPEN:
	case SQLITE_PERM:
	case SQLITE_AUTH:
		return -EACCES;
	case SQLITE_BUSY:
	case SQLITE_LOCKED:
		return -EBUSY;
	case SQLITE_NOMEM:
		return -ENOMEM;
	default:
		return -EIO;
	}
}

} // namespace ct::db
