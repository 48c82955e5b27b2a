#include "SharedStore.h"

#include "ContactsDebug.h"
#include "DataDir.h"

namespace ct::kv {

SharedStore::SharedStore(std::string fileName, std::string name)
	: m_fileName(std::move(fileName))
	, m_name(std::move(name))
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

KeyValueStore* SharedStore::forKey(const char* key, int* error)
{
	*error = KeyValueStore::validateKey(key);
	if (*error != kOk) {
		WERROR("invalid %s key", m_name.c_str());
		return nullptr;
	}
	KeyValueStore* store = get(error);
	if (!store)
		WERROR("%s store unavailable (%d)", m_name.c_str(), *error);
	return store;
}

int SharedStore::read(const char* key, Value* out, const Value* (*fallback)(const char* key))
{
	int rc = kOk;
	KeyValueStore* store = forKey(key, &rc);
	if (!store)
		return rc;
	rc = store->get(key, out);
	if (rc != kNotFound)
		return rc;
	if (const Value* value = fallback ? fallback(key) : nullptr) {
		*out = *value;
		return kOk;
	}
	WDEBUG("%s key %s not found", m_name.c_str(), key);
	return rc;
}

int SharedStore::readTyped(const char* key, Type type, Value* out, const Value* (*fallback)(const char* key))
{
	int rc = read(key, out, fallback);
	if (rc == kOk && out->type != type) {
		WERROR("%s key %s holds type %d, asked for %d", m_name.c_str(), key, static_cast<int>(out->type),
			static_cast<int>(type));
		return kWrongType;
	}
	return rc;
}

int SharedStore::write(const char* key, const Value& value)
{
	int rc = kOk;
	KeyValueStore* store = forKey(key, &rc);
	if (!store)
		return rc;
	rc = store->set(key, value);
	if (rc != kOk)
		WWARNING("%s_set() Failed(%d)", m_name.c_str(), rc);
	return rc;
}

} // namespace ct::kv
