// A typed key-value store over one SQLite file, with change notification on
// the EFL main loop for this process's writes and for other processes'
// commits. vconf and the application preferences are built on it.
#pragma once

#include "SqliteDatabase.h"
#include "StoreChangeWatcher.h"

#include <atomic>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <vector>

namespace ct::kv {

enum class Type { None = 0, Int, Bool, Double, String };

struct Value {
	Type type = Type::None;
	int64_t integer = 0;
	double real = 0.0;
	std::string text;

	static Value ofInt(int64_t v) { return {Type::Int, v, 0.0, {}}; }
	static Value ofBool(bool v) { return {Type::Bool, v ? 1 : 0, 0.0, {}}; }
	static Value ofDouble(double v) { return {Type::Double, 0, v, {}}; }
	static Value ofString(std::string v) { return {Type::String, 0, 0.0, std::move(v)}; }
};

// Result codes: 0, or a negative errno-style code.
enum : int {
	kOk = 0,
	kNotFound = -2,         // ENOENT: no such key
	kInvalid = -22,         // EINVAL: bad key or value
	kWrongType = -71,       // EPROTO: the key holds another type
	// Storage failures come from ct::db::toErrno: -28 full disk, -13 not
	// writable, -16 locked, -12 out of memory, -5 anything else.
};

class KeyValueStore {
public:
	static constexpr size_t kMaxKeyBytes = 256;
	static constexpr size_t kMaxStringBytes = 4096;

	// Called on the main loop with the key and its new value (type None when
	// the key was removed).
	using Observer = std::function<void(const std::string& key, const Value& value)>;

	KeyValueStore();
	~KeyValueStore();
	KeyValueStore(const KeyValueStore&) = delete;
	KeyValueStore& operator=(const KeyValueStore&) = delete;

	// Opens or creates the store file. 0 or a storage error code.
	int open(const std::string& path);
	const std::string& path() const { return m_db.path(); }

	// 0 and *out filled, kNotFound, or a storage error.
	int get(const std::string& key, Value* out) const;
	// Creates or replaces the value (and its type). A failed write leaves the
	// store as it was.
	int set(const std::string& key, const Value& value);
	// 0 when removed, kNotFound when it was not there.
	int remove(const std::string& key);
	int removeAll();
	// Keys holding a value, sorted.
	std::vector<std::string> keys() const;

	// Values may be read and written from any thread; observers are added,
	// removed and called on the main loop.
	// One observer per (key, tag); adding it again replaces the function.
	void addObserver(const std::string& key, const void* tag, Observer observer);
	// True when there was such an observer.
	bool removeObserver(const std::string& key, const void* tag);
	// Takes over every observer of `other` (which keeps none), so listeners
	// survive the store being reopened elsewhere.
	void takeObserversFrom(KeyValueStore& other);

	// kOk when `key` is non-empty UTF-8 of at most kMaxKeyBytes; else kInvalid.
	static int validateKey(const char* key);
	// kOk for UTF-8 of at most kMaxStringBytes; else kInvalid.
	static int validateString(const char* text);

private:
	struct Registration {
		const void* tag;
		Observer observer;
		bool active = true;
	};

	int __createSchema();
	int64_t __maxSequence() const;
	int __writeRow(const std::string& key, const Value& value);
	void __ensureWatcher();
	void __announceLocalChange();
	static void __announceFromThreadCb(void* data);
	void __onDatabaseChanged();
	void __notify(const std::string& key, const Value& value);

	ct::db::Database m_db;
	mutable std::mutex m_readMutex;
	std::unique_ptr<ct::db::StoreChangeWatcher> m_watcher;
	std::map<std::string, std::vector<std::shared_ptr<Registration>>> m_observers;
	std::atomic<bool> m_watching{false};
	int64_t m_deliveredSequence = 0;
	// Cleared on destruction, so that a delivery in progress or a change
	// announced from another thread can tell the store died.
	std::shared_ptr<KeyValueStore*> m_self = std::make_shared<KeyValueStore*>(this);
};

} // namespace ct::kv
