// The per-thread connection of the contacts service: the database, a cache of
// prepared statements, write transactions with versions, and change callbacks.
#pragma once

#include "ContactsSchema.h"
#include "SqliteDatabase.h"
#include "StoreChangeWatcher.h"
#include "contacts_types.h"

#include <functional>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <unordered_map>
#include <vector>

namespace ct::contacts {

using db::CachedStatement;

// What one write transaction did; filled while it runs.
struct WriteContext {
	int version = 0;
	// Change keys (ContactsSchema::changeKeyOf) of the views written.
	std::set<std::string> touchedKeys;
	std::vector<std::function<void()>> onCommit;
	void touch(const ViewInfo& v) { touchedKeys.insert(ContactsSchema::changeKeyOf(v)); }
};

class ContactsSearchPlanner;

// Maps an SQLite result to a CONTACTS_ERROR_* code.
int contactsError(int sqliteResult);

class ContactsConnection {
public:
	// The connection of this thread, or null when not connected.
	static ContactsConnection* current();
	static int connect();
	static int disconnect();

	ContactsConnection() = default;
	~ContactsConnection();
	ContactsConnection(const ContactsConnection&) = delete;
	ContactsConnection& operator=(const ContactsConnection&) = delete;

	db::Database& database() { return m_db; }
	// A prepared statement for sql, cached for the connection's life.
	db::Statement& statement(const std::string& sql);
	// Logs and returns a contacts error for a failed statement.
	int failed(const char* what, int sqliteResult);

	// Runs fn inside one transaction that carries a new version. fn returns a
	// CONTACTS_ERROR_*; anything but NONE rolls everything back.
	int write(const std::function<int(WriteContext&)>& fn);
	int currentVersion();
	int lastChangeVersion() const { return m_lastChangeVersion; }
	// The stored setting; a write reads it once (ContactsWriter caches it).
	int nameDisplayOrder();

	// Lives as long as the connection, with what it learnt of the store.
	ContactsSearchPlanner& searchPlanner();

	int addChangedCb(const char* uri, contacts_db_changed_cb cb, void* userData);
	int removeChangedCb(const char* uri, contacts_db_changed_cb cb, void* userData);

private:
	int __open();
	int __checkOrCreateSchema();
	void __dispatchChanges();
	std::map<std::string, int64_t> __viewVersions();

	struct Callback {
		std::string uri;
		contacts_db_changed_cb cb;
		void* userData;
	};

	int m_count = 0;
	db::Database m_db;
	int m_lastChangeVersion = 0;
	std::vector<Callback> m_callbacks;
	std::map<std::string, int64_t> m_seenVersions;
	std::unique_ptr<db::StoreChangeWatcher> m_watcher;
	std::unique_ptr<ContactsSearchPlanner> m_searchPlanner;
	bool m_dispatching = false;
	bool m_closeAfterDispatch = false;
};

} // namespace ct::contacts
