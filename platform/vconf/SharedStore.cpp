#include "SharedStore.h"

#include "DataDir.h"

namespace ct::kv {

SharedStore::SharedStore(std::string fileName)
	: m_fileName(std::move(fileName))
{
}

SharedStore::~SharedStore() = default;

KeyValueStore* SharedStore::get(int* error)
{
	std::string path = ct::platform::dataPath(m_fileName);
	std::lock_guard<std::mutex> lock(m_mutex);
	if (m_store && m_store->path() == path)
		return m_store.get();
	auto store = std::make_unique<KeyValueStore>();
	int rc = store->open(path);
	if (error)
		*error = rc;
	if (rc != kOk)
		return nullptr;
	if (m_store)
		store->takeObserversFrom(*m_store);
	m_store = std::move(store);
	return m_store.get();
}

void SharedStore::close()
{
	std::lock_guard<std::mutex> lock(m_mutex);
	m_store.reset();
}

} // namespace ct::kv
