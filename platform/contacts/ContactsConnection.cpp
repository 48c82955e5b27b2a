#include "ContactsConnection.h"

#include "ContactsDebug.h"
#include "ContactsSearchPlanner.h"
#include "ContactsSim.h"
#include "DataDir.h"
#include "contacts_db.h"

#include <algorithm>

namespace ct::contacts {
namespace {

thread_local ContactsConnection* t_connection = nullptr;

const char* kDatabaseFile = "contacts.db";

} // namespace

int contactsError(int sqliteResult)
{
	switch (db::toErrno(sqliteResult)) {
	case 0: return CONTACTS_ERROR_NONE;
	case -28: return CONTACTS_ERROR_FILE_NO_SPACE;
	case -13: return CONTACTS_ERROR_PERMISSION_DENIED;
	case -16: return CONTACTS_ERROR_DB_LOCKED;
	default: return CONTACTS_ERROR_DB;
	}
}

ContactsConnection* ContactsConnection::current()
{
	return t_connection && t_connection->m_count > 0 ? t_connection : nullptr;
}

int ContactsConnection::connect()
{
	if (t_connection) {
		++t_connection->m_count;
		return CONTACTS_ERROR_NONE;
	}
	auto conn = std::make_unique<ContactsConnection>();
	int err = conn->__open();
	if (err != CONTACTS_ERROR_NONE)
		return err;
	conn->m_count = 1;
	t_connection = conn.release();
	return CONTACTS_ERROR_NONE;
}

int ContactsConnection::disconnect()
{
	WPRET_VM(!t_connection || t_connection->m_count <= 0, CONTACTS_ERROR_DB, "not connected");
	if (--t_connection->m_count > 0)
		return CONTACTS_ERROR_NONE;
	if (t_connection->m_dispatching) {
		// A change callback disconnected; close once the dispatch is over.
		t_connection->m_closeAfterDispatch = true;
		return CONTACTS_ERROR_NONE;
	}
	delete t_connection;
	t_connection = nullptr;
	return CONTACTS_ERROR_NONE;
}

ContactsConnection::~ContactsConnection()
{
	m_watcher.reset();
	m_searchPlanner.reset();
	m_db.close();
}

int ContactsConnection::__open()
{
	std::string dir = platform::dataDir();
	WPRET_VM(dir.empty(), CONTACTS_ERROR_SYSTEM, "no data folder");
	int rc = m_db.open(platform::dataPath(kDatabaseFile));
	if (rc != SQLITE_OK) {
		WERROR("cannot open the contacts database: %s (%d)", m_db.errorMessage().c_str(), rc);
		m_db.close();
		return rc == SQLITE_NOTADB ? CONTACTS_ERROR_DB : contactsError(rc);
	}
	int err = __checkOrCreateSchema();
	if (err == CONTACTS_ERROR_NONE)
		err = ContactsSim::ensureAddressBooks(*this);
	if (err != CONTACTS_ERROR_NONE)
		m_db.close();
	return err;
}

int ContactsConnection::__checkOrCreateSchema()
{
	db::Transaction tx(m_db);
	if (tx.status() != SQLITE_OK)
		return failed("BEGIN", tx.status());
	int tables = 0;
	{
		db::Statement st = m_db.prepare("SELECT count(*) FROM sqlite_master");
		if (st.step() != SQLITE_ROW)
			return failed("sqlite_master", st.prepareStatus());
		tables = st.columnInt(0);
	}
	if (tables > 0) {
		std::string tag;
		{
			db::Statement st = m_db.prepare("SELECT value FROM meta WHERE key = 'schema'");
			if (st.valid() && st.step() == SQLITE_ROW)
				tag = st.columnText(0);
		}
		if (tag == ContactsSchema::schemaTag())
			return CONTACTS_ERROR_NONE;
		const char* upgrade = tag.empty() ? nullptr : ContactsSchema::upgradeSql(tag);
		if (!upgrade) {
			WERROR("%s is not a contacts database; left untouched", m_db.path().c_str());
			return CONTACTS_ERROR_DB;
		}
		int rc = m_db.exec(upgrade);
		if (rc != SQLITE_OK)
			return failed("upgrade schema", rc);
		db::Statement st = m_db.prepare("UPDATE meta SET value = ? WHERE key = 'schema'");
		rc = st.bind(1, ContactsSchema::schemaTag()).run();
		if (rc != SQLITE_DONE)
			return failed("schema tag", rc);
		rc = tx.commit();
		return rc == SQLITE_OK ? CONTACTS_ERROR_NONE : failed("COMMIT", rc);
	}
	int rc = m_db.exec(ContactsSchema::createSql());
	if (rc != SQLITE_OK)
		return failed("create schema", rc);
	db::Statement st = m_db.prepare("INSERT INTO meta(key, value) VALUES ('schema', ?)");
	rc = st.bind(1, ContactsSchema::schemaTag()).run();
	if (rc != SQLITE_DONE)
		return failed("schema tag", rc);
	rc = tx.commit();
	return rc == SQLITE_OK ? CONTACTS_ERROR_NONE : failed("COMMIT", rc);
}

db::Statement& ContactsConnection::statement(const std::string& sql)
{
	db::Statement& st = m_db.cached(sql);
	if (!st.valid())
		WERROR("prepare failed (%s): %s", m_db.errorMessage().c_str(), sql.c_str());
	return st;
}

ContactsSearchPlanner& ContactsConnection::searchPlanner()
{
	if (!m_searchPlanner)
		m_searchPlanner = std::make_unique<ContactsSearchPlanner>(*this);
	return *m_searchPlanner;
}

int ContactsConnection::failed(const char* what, int sqliteResult)
{
	WERROR("%s failed: %s (%d)", what, m_db.errorMessage().c_str(), sqliteResult);
	return contactsError(sqliteResult == SQLITE_DONE || sqliteResult == SQLITE_ROW ? SQLITE_ERROR : sqliteResult);
}

int ContactsConnection::currentVersion()
{
	CachedStatement st(statement("SELECT value FROM meta WHERE key = 'version'"));
	return st->step() == SQLITE_ROW ? st->columnInt(0) : 0;
}

int ContactsConnection::nameDisplayOrder()
{
	CachedStatement st(statement("SELECT value FROM meta WHERE key = 'name_display_order'"));
	return st->step() == SQLITE_ROW ? st->columnInt(0) : CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST;
}

int ContactsConnection::write(const std::function<int(WriteContext&)>& fn)
{
	db::Transaction tx(m_db);
	if (tx.status() != SQLITE_OK)
		return failed("BEGIN", tx.status());
	WriteContext ctx;
	{
		CachedStatement st(statement("UPDATE meta SET value = value + 1 WHERE key = 'version' RETURNING value"));
		int rc = st->step();
		if (rc != SQLITE_ROW)
			return failed("version", rc);
		ctx.version = st->columnInt(0);
		if ((rc = st->step()) != SQLITE_DONE)
			return failed("version", rc);
	}
	int err = fn(ctx);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	for (const std::string& key : ctx.touchedKeys) {
		CachedStatement st(statement("INSERT OR REPLACE INTO view_versions(uri, version) VALUES (?, ?)"));
		int rc = st->bind(1, key).bind(2, ctx.version).run();
		if (rc != SQLITE_DONE)
			return failed("view version", rc);
	}
	int rc = tx.commit();
	if (rc != SQLITE_OK)
		return failed("COMMIT", rc);
	m_lastChangeVersion = ctx.version;
	for (auto& f : ctx.onCommit)
		f();
	if (m_watcher)
		m_watcher->notifyLocalChange();
	return CONTACTS_ERROR_NONE;
}

std::map<std::string, int64_t> ContactsConnection::__viewVersions()
{
	std::map<std::string, int64_t> versions;
	CachedStatement st(statement("SELECT uri, version FROM view_versions"));
	while (st->step() == SQLITE_ROW)
		versions[st->columnText(0)] = st->columnInt64(1);
	return versions;
}

int ContactsConnection::addChangedCb(const char* uri, contacts_db_changed_cb cb, void* userData)
{
	WPRET_VM(!ContactsSchema::view(uri) || !cb, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	for (const Callback& c : m_callbacks)
		if (c.uri == uri && c.cb == cb && c.userData == userData)
			return CONTACTS_ERROR_NONE;
	if (!m_watcher) {
		m_seenVersions = __viewVersions();
		m_watcher = std::make_unique<db::StoreChangeWatcher>(m_db, [this]() { __dispatchChanges(); });
	}
	m_callbacks.push_back({ uri, cb, userData });
	return CONTACTS_ERROR_NONE;
}

int ContactsConnection::removeChangedCb(const char* uri, contacts_db_changed_cb cb, void* userData)
{
	WPRET_VM(!uri || !cb, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	auto it = std::find_if(m_callbacks.begin(), m_callbacks.end(), [&](const Callback& c) {
		return c.uri == uri && c.cb == cb && c.userData == userData;
	});
	WPRET_VM(it == m_callbacks.end(), CONTACTS_ERROR_INVALID_PARAMETER, "callback was not registered for %s", uri);
	m_callbacks.erase(it);
	return CONTACTS_ERROR_NONE;
}

void ContactsConnection::__dispatchChanges()
{
	std::set<std::string> changed;
	for (const auto& [key, version] : __viewVersions()) {
		if (version > m_seenVersions[key])
			for (std::string& uri : ContactsSchema::urisOfChangeKey(key))
				changed.insert(std::move(uri));
		m_seenVersions[key] = version;
	}
	std::vector<Callback> pending;
	for (const std::string& uri : changed)
		for (const Callback& c : m_callbacks)
			if (c.uri == uri)
				pending.push_back(c);
	m_dispatching = true;
	for (const Callback& c : pending) {
		bool stillRegistered = std::any_of(m_callbacks.begin(), m_callbacks.end(), [&](const Callback& r) {
			return r.uri == c.uri && r.cb == c.cb && r.userData == c.userData;
		});
		if (stillRegistered && !m_closeAfterDispatch)
			c.cb(c.uri.c_str(), c.userData);
	}
	m_dispatching = false;
	if (m_closeAfterDispatch && m_count == 0) {
		// Deleting the watcher from inside its own callback is safe: it
		// touches nothing of itself after this returns.
		t_connection = nullptr;
		delete this;
	} else {
		m_closeAfterDispatch = false;
	}
}

} // namespace ct::contacts

using ct::contacts::ContactsConnection;

extern "C" {

int contacts_connect(void) { return ContactsConnection::connect(); }
int contacts_disconnect(void) { return ContactsConnection::disconnect(); }
int contacts_connect_on_thread(void) { return ContactsConnection::connect(); }
int contacts_disconnect_on_thread(void) { return ContactsConnection::disconnect(); }

int contacts_db_add_changed_cb(const char* view_uri, contacts_db_changed_cb cb, void* user_data)
{
	ContactsConnection* conn = ContactsConnection::current();
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected");
	return conn->addChangedCb(view_uri, cb, user_data);
}

int contacts_db_remove_changed_cb(const char* view_uri, contacts_db_changed_cb cb, void* user_data)
{
	ContactsConnection* conn = ContactsConnection::current();
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected");
	return conn->removeChangedCb(view_uri, cb, user_data);
}

int contacts_db_get_current_version(int* contacts_db_version)
{
	WPRET_VM(!contacts_db_version, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	*contacts_db_version = 0;
	ContactsConnection* conn = ContactsConnection::current();
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected");
	*contacts_db_version = conn->currentVersion();
	return CONTACTS_ERROR_NONE;
}

int contacts_db_get_last_change_version(int* last_change_version)
{
	WPRET_VM(!last_change_version, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	ContactsConnection* conn = ContactsConnection::current();
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected");
	*last_change_version = conn->lastChangeVersion();
	return CONTACTS_ERROR_NONE;
}

} // extern "C"
