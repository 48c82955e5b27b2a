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
	explicit SharedStore(std::string fileName);
	~SharedStore();
	SharedStore(const SharedStore&) = delete;
	SharedStore& operator=(const SharedStore&) = delete;

	// The open store, or null (with *error set) when it cannot be opened.
	// Borrowed: valid until close() or the data folder changes.
	KeyValueStore* get(int* error = nullptr);
	// Closes the file and drops every observer; the next get() reopens it.
	void close();

private:
	std::string m_fileName;
	std::mutex m_mutex;
	std::unique_ptr<KeyValueStore> m_store;
};

} // namespace ct::kv
