#include "vconf.h"

#include "ContactsDebug.h"
#include "SharedStore.h"

#include <cstdlib>
#include <cstring>

using ct::kv::KeyValueStore;
using ct::kv::Type;
using ct::kv::Value;

struct _keynode_t {
	const char* name;
	Value value;
};

namespace {

ct::kv::SharedStore& sharedStore()
{
	static ct::kv::SharedStore store("vconf.db", "vconf");
	return store;
}

struct Default {
	const char* key;
	Value value;
};

// What a key reads as until it is first set (and again after vconf_unset).
const Default* findDefault(const std::string& key)
{
	static const Default defaults[] = {
		{VCONFKEY_SETAPPL_PSMODE, Value::ofInt(0)},
		{VCONFKEY_TELEPHONY_SIM_POWER_STATE1, Value::ofInt(1)},
		{VCONFKEY_TELEPHONY_SIM_POWER_STATE2, Value::ofInt(1)},
		{VCONFKEY_SETAPPL_SIM1_NAME, Value::ofString("SIM1")},
		{VCONFKEY_SETAPPL_SIM2_NAME, Value::ofString("SIM2")},
		{VCONFKEY_SETAPPL_SIM1_ICON, Value::ofInt(0)},
		{VCONFKEY_SETAPPL_SIM2_ICON, Value::ofInt(1)},
		{VCONFKEY_REGIONFORMAT, Value::ofString("en_US")},
		{VCONFKEY_REGIONFORMAT_TIME1224, Value::ofInt(1)},
		{VCONFKEY_CSC_COUNTRY_ISO, Value::ofString("US")},
		{VCONFKEY_CONTACT_DEFAULT_IMAGE_PATH, Value::ofString("")},
		{VCONFKEY_LANGSET, Value::ofString("en_US.UTF-8")},
	};
	for (const auto& entry : defaults) {
		if (key == entry.key)
			return &entry;
	}
	return nullptr;
}

int toVconfError(int rc)
{
	switch (rc) {
	case ct::kv::kOk: return VCONF_OK;
	case ct::kv::kNotFound: return VCONF_ERROR_FILE_NO_ENT;
	case ct::kv::kInvalid: return VCONF_ERROR_INVALID_PARAMETER;
	case ct::kv::kWrongType: return VCONF_ERROR_WRONG_TYPE;
	case -28: return VCONF_ERROR_FILE_NO_SPACE;
	case -13: return VCONF_ERROR_FILE_PERM;
	case -16: return VCONF_ERROR_FILE_BUSY;
	case -12: return VCONF_ERROR_NO_MEM;
	default: return VCONF_ERROR;
	}
}

int vconfType(Type type)
{
	switch (type) {
	case Type::Int: return VCONF_TYPE_INT;
	case Type::Bool: return VCONF_TYPE_BOOL;
	case Type::Double: return VCONF_TYPE_DOUBLE;
	case Type::String: return VCONF_TYPE_STRING;
	default: return VCONF_TYPE_NONE;
	}
}

const Value* defaultValue(const char* key)
{
	const Default* entry = findDefault(key);
	return entry ? &entry->value : nullptr;
}

int readTyped(const char* key, Type type, Value* out)
{
	return sharedStore().readTyped(key, type, out, defaultValue);
}

int writeValue(const char* key, const Value& value)
{
	return toVconfError(sharedStore().write(key, value));
}

void deliver(const std::string& key, const Value& stored, vconf_callback_fn cb, void* userData)
{
	_keynode_t node{key.c_str(), stored};
	if (stored.type == Type::None) {
		if (const Default* entry = findDefault(key))
			node.value = entry->value;
	}
	cb(&node, userData);
}

} // namespace

extern "C" {

int vconf_get_int(const char* key, int* val)
{
	WPRET_VM(!val, VCONF_ERROR_INVALID_PARAMETER, "val is null");
	Value value;
	int rc = readTyped(key, Type::Int, &value);
	if (rc == ct::kv::kOk)
		*val = static_cast<int>(value.integer);
	return toVconfError(rc);
}

int vconf_get_bool(const char* key, int* val)
{
	WPRET_VM(!val, VCONF_ERROR_INVALID_PARAMETER, "val is null");
	Value value;
	int rc = readTyped(key, Type::Bool, &value);
	if (rc == ct::kv::kOk)
		*val = value.integer ? 1 : 0;
	return toVconfError(rc);
}

int vconf_get_dbl(const char* key, double* val)
{
	WPRET_VM(!val, VCONF_ERROR_INVALID_PARAMETER, "val is null");
	Value value;
	int rc = readTyped(key, Type::Double, &value);
	if (rc == ct::kv::kOk)
		*val = value.real;
	return toVconfError(rc);
}

char* vconf_get_str(const char* key)
{
	Value value;
	if (readTyped(key, Type::String, &value) != ct::kv::kOk)
		return nullptr;
	return strdup(value.text.c_str());
}

int vconf_get_type(const char* key)
{
	Value value;
	return sharedStore().read(key, &value, defaultValue) == ct::kv::kOk ? vconfType(value.type) : VCONF_TYPE_NONE;
}

int vconf_set_int(const char* key, int val)
{
	return writeValue(key, Value::ofInt(val));
}

int vconf_set_bool(const char* key, int val)
{
	return writeValue(key, Value::ofBool(val != 0));
}

int vconf_set_dbl(const char* key, double val)
{
	return writeValue(key, Value::ofDouble(val));
}

int vconf_set_str(const char* key, const char* val)
{
	WPRET_VM(!val, VCONF_ERROR_INVALID_PARAMETER, "val is null");
	WPRET_VM(KeyValueStore::validateString(val) != ct::kv::kOk, VCONF_ERROR_INVALID_PARAMETER,
		"value for %s is not UTF-8 or longer than %zu bytes", key ? key : "(null)",
		KeyValueStore::kMaxStringBytes);
	return writeValue(key, Value::ofString(val));
}

int vconf_unset(const char* key)
{
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().forKey(key, &rc);
	if (!store)
		return toVconfError(rc);
	return toVconfError(store->remove(key));
}

int vconf_notify_key_changed(const char* key, vconf_callback_fn cb, void* user_data)
{
	WPRET_VM(!cb, VCONF_ERROR_INVALID_PARAMETER, "cb is null");
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().forKey(key, &rc);
	if (!store)
		return toVconfError(rc);
	store->addObserver(key, reinterpret_cast<const void*>(cb),
		[cb, user_data](const std::string& name, const Value& value) { deliver(name, value, cb, user_data); });
	return VCONF_OK;
}

int vconf_ignore_key_changed(const char* key, vconf_callback_fn cb)
{
	WPRET_VM(!cb, VCONF_ERROR_INVALID_PARAMETER, "cb is null");
	int rc = ct::kv::kOk;
	KeyValueStore* store = sharedStore().forKey(key, &rc);
	if (!store)
		return toVconfError(rc);
	if (!store->removeObserver(key, reinterpret_cast<const void*>(cb))) {
		WWARNING("no callback registered for %s", key);
		return VCONF_ERROR;
	}
	return VCONF_OK;
}

const char* vconf_keynode_get_name(keynode_t* node)
{
	return node ? node->name : nullptr;
}

int vconf_keynode_get_type(keynode_t* node)
{
	return node ? vconfType(node->value.type) : VCONF_TYPE_NONE;
}

int vconf_keynode_get_int(keynode_t* node)
{
	WPRET_VM(!node || node->value.type != Type::Int, VCONF_ERROR_WRONG_TYPE, "not an int node");
	return static_cast<int>(node->value.integer);
}

int vconf_keynode_get_bool(keynode_t* node)
{
	WPRET_VM(!node || node->value.type != Type::Bool, VCONF_ERROR_WRONG_TYPE, "not a bool node");
	return node->value.integer ? 1 : 0;
}

double vconf_keynode_get_dbl(keynode_t* node)
{
	WPRET_VM(!node || node->value.type != Type::Double, 0.0, "not a double node");
	return node->value.real;
}

char* vconf_keynode_get_str(keynode_t* node)
{
	WPRET_VM(!node || node->value.type != Type::String, nullptr, "not a string node");
	return const_cast<char*>(node->value.text.c_str());
}

void vconf_close_store(void)
{
	sharedStore().close();
}

} // extern "C"
