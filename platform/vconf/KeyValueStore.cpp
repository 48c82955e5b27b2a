#include "KeyValueStore.h"

#include "ContactsDebug.h"

#include <glib.h>

#include <algorithm>
#include <cstring>

namespace ct::kv {

namespace {

// Removed keys stay as rows of type None so that their sequence number tells
// other processes which key changed.
const char kSchema[] =
	"CREATE TABLE IF NOT EXISTS entries ("
	" key TEXT PRIMARY KEY NOT NULL,"
	" type INTEGER NOT NULL,"
	" value,"
	" seq INTEGER NOT NULL);"
	"CREATE INDEX IF NOT EXISTS entries_seq ON entries(seq);";

Value readValue(const ct::db::Statement& st, int typeCol, int valueCol)
{
	switch (static_cast<Type>(st.columnInt(typeCol))) {
	case Type::Int:
		return Value::ofInt(st.columnInt64(valueCol));
	case Type::Bool:
		return Value::ofBool(st.columnInt64(valueCol) != 0);
	case Type::Double:
		return Value::ofDouble(st.columnDouble(valueCol));
	case Type::String:
		return Value::ofString(st.columnText(valueCol));
	default:
		return Value();
	}
}

void bindValue(ct::db::Statement& st, int index, const Value& value)
{
	switch (value.type) {
	case Type::Int:
	case Type::Bool:
		st.bind(index, value.integer);
		break;
	case Type::Double:
		st.bind(index, value.real);
		break;
	case Type::String:
		st.bind(index, value.text);
		break;
	default:
		st.bindNull(index);
	}
}

int storageError(const ct::db::Database& db, const char* what, int rc)
{
	WERROR("%s failed on %s: %s (%d)", what, db.path().c_str(), db.errorMessage().c_str(), rc);
	return ct::db::toErrno(rc) ? ct::db::toErrno(rc) : -5;
}

} // namespace

KeyValueStore::KeyValueStore() = default;

KeyValueStore::~KeyValueStore()
{
	*m_self = nullptr;
}

int KeyValueStore::open(const std::string& path)
{
	if (path.empty()) {
		WERROR("no data folder for the store");
		return -13;
	}
	int rc = m_db.open(path);
	if (rc != SQLITE_OK)
		return storageError(m_db, "open", rc);
	rc = __createSchema();
	if (rc != SQLITE_OK) {
		int err = storageError(m_db, "schema", rc);
		m_db.close();
		return err;
	}
	m_deliveredSequence = __maxSequence();
	return kOk;
}

int KeyValueStore::__createSchema()
{
	ct::db::Transaction tx(m_db);
	if (tx.status() != SQLITE_OK)
		return tx.status();
	int rc = m_db.exec(kSchema);
	return rc == SQLITE_OK ? tx.commit() : rc;
}

int64_t KeyValueStore::__maxSequence() const
{
	auto st = m_db.prepare("SELECT coalesce(max(seq), 0) FROM entries");
	return st.step() == SQLITE_ROW ? st.columnInt64(0) : 0;
}

int KeyValueStore::get(const std::string& key, Value* out) const
{
	// Settings are read far more often than written: the read statement is
	// prepared once, and shared by the threads that read.
	std::lock_guard<std::mutex> lock(m_readMutex);
	ct::db::CachedStatement st(m_db.cached("SELECT type, value FROM entries WHERE key = ? AND type != 0"));
	int rc = st->bind(1, key).step();
	if (rc == SQLITE_DONE)
		return kNotFound;
	if (rc != SQLITE_ROW)
		return storageError(m_db, "read", rc);
	*out = readValue(*st, 0, 1);
	return kOk;
}

int KeyValueStore::set(const std::string& key, const Value& value)
{
	ct::db::Transaction tx(m_db);
	if (tx.status() != SQLITE_OK)
		return storageError(m_db, "begin", tx.status());
	int rc = __writeRow(key, value);
	if (rc == SQLITE_DONE)
		rc = tx.commit();
	if (rc != SQLITE_OK)
		return storageError(m_db, "write", rc);
	__announceLocalChange();
	return kOk;
}

int KeyValueStore::__writeRow(const std::string& key, const Value& value)
{
	auto st = m_db.prepare(
		"INSERT INTO entries(key, type, value, seq)"
		" VALUES(?1, ?2, ?3, (SELECT coalesce(max(seq), 0) + 1 FROM entries))"
		" ON CONFLICT(key) DO UPDATE SET type = excluded.type, value = excluded.value,"
		" seq = excluded.seq");
	st.bind(1, key).bind(2, static_cast<int>(value.type));
	bindValue(st, 3, value);
	return st.step();
}

int KeyValueStore::remove(const std::string& key)
{
	Value current;
	int rc = get(key, &current);
	if (rc != kOk)
		return rc;
	return set(key, Value());
}

int KeyValueStore::removeAll()
{
	ct::db::Transaction tx(m_db);
	if (tx.status() != SQLITE_OK)
		return storageError(m_db, "begin", tx.status());
	auto st = m_db.prepare(
		"UPDATE entries SET type = 0, value = NULL,"
		" seq = (SELECT coalesce(max(seq), 0) + 1 FROM entries) WHERE type != 0");
	int rc = st.step();
	if (rc == SQLITE_DONE)
		rc = tx.commit();
	if (rc != SQLITE_OK)
		return storageError(m_db, "remove all", rc);
	__announceLocalChange();
	return kOk;
}

std::vector<std::string> KeyValueStore::keys() const
{
	std::vector<std::string> result;
	auto st = m_db.prepare("SELECT key FROM entries WHERE type != 0 ORDER BY key");
	while (st.step() == SQLITE_ROW)
		result.push_back(st.columnText(0));
	return result;
}

void KeyValueStore::addObserver(const std::string& key, const void* tag, Observer observer)
{
	auto& list = m_observers[key];
	for (auto& registration : list) {
		if (registration->tag == tag) {
			registration->observer = std::move(observer);
			return;
		}
	}
	list.push_back(std::make_shared<Registration>(Registration{tag, std::move(observer)}));
	__ensureWatcher();
}

void KeyValueStore::takeObserversFrom(KeyValueStore& other)
{
	for (auto& [key, list] : other.m_observers) {
		for (auto& registration : list)
			addObserver(key, registration->tag, registration->observer);
		for (auto& registration : list)
			registration->active = false;
	}
	other.m_observers.clear();
}

bool KeyValueStore::removeObserver(const std::string& key, const void* tag)
{
	auto found = m_observers.find(key);
	if (found == m_observers.end())
		return false;
	auto& list = found->second;
	auto it = std::find_if(list.begin(), list.end(),
		[tag](const auto& registration) { return registration->tag == tag; });
	if (it == list.end())
		return false;
	(*it)->active = false;
	list.erase(it);
	if (list.empty())
		m_observers.erase(found);
	return true;
}

void KeyValueStore::__ensureWatcher()
{
	if (m_watcher || !m_db.isOpen())
		return;
	m_deliveredSequence = __maxSequence();
	m_watcher = std::make_unique<ct::db::StoreChangeWatcher>(m_db, [this] { __onDatabaseChanged(); });
	m_watching = true;
}

void KeyValueStore::__announceLocalChange()
{
	if (!m_watching)
		return;
	if (eina_main_loop_is()) {
		m_watcher->notifyLocalChange();
		return;
	}
	// The watcher belongs to the main loop: hand the news over to it.
	auto* self = new std::weak_ptr<KeyValueStore*>(m_self);
	ecore_main_loop_thread_safe_call_async(__announceFromThreadCb, self);
}

void KeyValueStore::__announceFromThreadCb(void* data)
{
	std::unique_ptr<std::weak_ptr<KeyValueStore*>> weak(static_cast<std::weak_ptr<KeyValueStore*>*>(data));
	std::shared_ptr<KeyValueStore*> self = weak->lock();
	if (self && *self && (*self)->m_watcher)
		(*self)->m_watcher->notifyLocalChange();
}

void KeyValueStore::__onDatabaseChanged()
{
	auto st = m_db.prepare("SELECT key, type, value, seq FROM entries WHERE seq > ? ORDER BY seq");
	st.bind(1, m_deliveredSequence);
	std::vector<std::pair<std::string, Value>> changes;
	while (st.step() == SQLITE_ROW) {
		changes.emplace_back(st.columnText(0), readValue(st, 1, 2));
		m_deliveredSequence = std::max(m_deliveredSequence, st.columnInt64(3));
	}
	std::shared_ptr<KeyValueStore*> self = m_self;
	for (const auto& [key, value] : changes) {
		if (!*self)
			return;
		__notify(key, value);
	}
}

void KeyValueStore::__notify(const std::string& key, const Value& value)
{
	auto found = m_observers.find(key);
	if (found == m_observers.end())
		return;
	// A snapshot: observers may add or remove registrations while we call them.
	auto snapshot = found->second;
	std::shared_ptr<KeyValueStore*> self = m_self;
	for (const auto& registration : snapshot) {
		if (!*self)
			return;
		if (registration->active)
			registration->observer(key, value);
	}
}

int KeyValueStore::validateKey(const char* key)
{
	if (!key || !*key || strlen(key) > kMaxKeyBytes || !g_utf8_validate(key, -1, nullptr))
		return kInvalid;
	return kOk;
}

int KeyValueStore::validateString(const char* text)
{
	if (!text || strlen(text) > kMaxStringBytes || !g_utf8_validate(text, -1, nullptr))
		return kInvalid;
	return kOk;
}

} // namespace ct::kv
