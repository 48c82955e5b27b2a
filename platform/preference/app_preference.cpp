#include "app_preference.h"

#include "ContactsDebug.h"
#include "SharedStore.h"

#include <cstdlib>
#include <cstring>

using ct::kv::KeyValueStore;
using ct::kv::Type;
using ct::kv::Value;

namespace {

ct::kv::SharedStore& sharedStore()
{
	static ct::kv::SharedStore store("preferences.db", "preference");
	return store;
}

// The single callback of a key is registered under this tag.
const char kCallbackTag = 0;

int toPreferenceError(int rc)
{
	switch (rc) {
	case ct::kv::kOk: return PREFERENCE_ERROR_NONE;
	case ct::kv::kNotFound: return PREFERENCE_ERROR_NO_KEY;
	case ct::kv::kInvalid:
	case ct::kv::kWrongType: return PREFERENCE_ERROR_INVALID_PARAMETER;
	case -28: return PREFERENCE_ERROR_NO_SPACE;
	case -12: return PREFERENCE_ERROR_OUT_OF_MEMORY;
	default: return PREFERENCE_ERROR_IO_ERROR;
	}
}

int readTyped(const char* key, Type type, Value* out)
{
	return sharedStore().readTyped(key, type, out);
}

int writeValue(const char* key, const Value& value)
{
	return toPreferenceError(sharedStore().write(key, value));
}

} // namespace

extern "C" {

int preference_set_int(const char* key, int value)
{
	return writeValue(key, Value::ofInt(value));
}

int preference_set_double(const char* key, double value)
{
	return writeValue(key, Value::ofDouble(value));
}

int preference_set_string(const char* key, const char* value)
{
	WPRET_VM(KeyValueStore::validateString(value) != ct::kv::kOk, PREFERENCE_ERROR_INVALID_PARAMETER,
		"value is null, not UTF-8 or longer than %zu bytes", KeyValueStore::kMaxStringBytes);
	return writeValue(key, Value::ofString(value));
}

int preference_set_boolean(const char* key, bool value)
{
	return writeValue(key, Value::ofBool(value));
}

int preference_get_int(const char* key, int* value)
{
	WPRET_VM(!value, PREFERENCE_ERROR_INVALID_PARAMETER, "value is null");
	Value stored;
	int rc = readTyped(key, Type::Int, &stored);
	if (rc == ct::kv::kOk)
		*value = static_cast<int>(stored.integer);
	return toPreferenceError(rc);
}

int preference_get_double(const char* key, double* value)
{
	WPRET_VM(!value, PREFERENCE_ERROR_INVALID_PARAMETER, "value is null");
	Value stored;
	int rc = readTyped(key, Type::Double, &stored);
	if (rc == ct::kv::kOk)
		*value = stored.real;
	return toPreferenceError(rc);
}

int preference_get_string(const char* key, char** value)
{
	WPRET_VM(!value, PREFERENCE_ERROR_INVALID_PARAMETER, "value is null");
	*value = nullptr;
	Value stored;
	int rc = readTyped(key, Type::String, &stored);
	if (rc != ct::kv::kOk)
		return toPreferenceError(rc);
	*value = strdup(stored.text.c_str());
	return *value ? PREFERENCE_ERROR_NONE : PREFERENCE_ERROR_OUT_OF_MEMORY;
}

int preference_get_boolean(const char* key, bool* value)
{
	WPRET_VM(!value, PREFERENCE_ERROR_INVALID_PARAMETER, "value is null");
	Value stored;
	int rc = readTyped(key, Type::Bool, &stored);
	if (rc == ct::kv::kOk)
		*value = stored.integer != 0;
	return toPreferenceError(rc);
}

int preference_remove(const char* key)
{
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().forKey(key, &rc);
	if (!store)
		return toPreferenceError(rc);
	return toPreferenceError(store->remove(key));
}

int preference_is_existing(const char* key, bool* existing)
{
	WPRET_VM(!existing, PREFERENCE_ERROR_INVALID_PARAMETER, "existing is null");
	*existing = false;
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().forKey(key, &rc);
	if (!store)
		return toPreferenceError(rc);
	Value stored;
	rc = store->get(key, &stored);
	if (rc == ct::kv::kNotFound)
		return PREFERENCE_ERROR_NONE;
	*existing = rc == ct::kv::kOk;
	return toPreferenceError(rc);
}

int preference_remove_all(void)
{
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().get(&rc);
	if (!store)
		return toPreferenceError(rc);
	return toPreferenceError(store->removeAll());
}

int preference_set_changed_cb(const char* key, preference_changed_cb callback, void* user_data)
{
	WPRET_VM(!callback, PREFERENCE_ERROR_INVALID_PARAMETER, "callback is null");
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().forKey(key, &rc);
	if (!store)
		return toPreferenceError(rc);
	store->addObserver(key, &kCallbackTag,
		[callback, user_data](const std::string& name, const Value&) { callback(name.c_str(), user_data); });
	return PREFERENCE_ERROR_NONE;
}

int preference_unset_changed_cb(const char* key)
{
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().forKey(key, &rc);
	if (!store)
		return toPreferenceError(rc);
	if (!store->removeObserver(key, &kCallbackTag))
		return PREFERENCE_ERROR_NO_KEY;
	return PREFERENCE_ERROR_NONE;
}

void preference_close_store(void)
{
	sharedStore().close();
}

} // extern "C"
