// The process-wide KeyValueStore behind a C interface (vconf, preferences):
// opened on first use in the current data folder and reopened, with its
// observers, when the data folder changes.
#pragma once

#include "KeyValueStore.h"

#include <memory>
#include <mutex>
#include <string>

namespace ct::kv {

class SharedStore {
public:
	// `name` ("vconf", "preference") words the log lines.
	SharedStore(std::string fileName, std::string name);
	~SharedStore();
	SharedStore(const SharedStore&) = delete;
	SharedStore& operator=(const SharedStore&) = delete;

	// The open store, or null (with *error set) when it cannot be opened.
	// Borrowed: valid until close() or the data folder changes.
	KeyValueStore* get(int* error = nullptr);
	// Closes the file and drops every observer; the next get() reopens it.
	void close();

	// The open store for a valid `key`; null, logged, with *error set otherwise.
	KeyValueStore* forKey(const char* key, int* error);
	// The value of `key`, else what `fallback` (may be null) gives for a key
	// never set: kOk, kNotFound, kInvalid or a store error.
	int read(const char* key, Value* out, const Value* (*fallback)(const char* key) = nullptr);
	// Like read(), and kWrongType, logged, when the value has another type.
	int readTyped(const char* key, Type type, Value* out, const Value* (*fallback)(const char* key) = nullptr);
	// Stores the value: kOk or a store error, logged.
	int write(const char* key, const Value& value);

private:
	std::string m_fileName;
	std::string m_name;
	std::mutex m_mutex;
	std::unique_ptr<KeyValueStore> m_store;
};

} // namespace ct::kv
