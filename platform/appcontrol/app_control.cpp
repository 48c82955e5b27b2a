// Handles, fields and extra data of app_control_h.
#include "AppControlHandle.h"

#include "ContactsDebug.h"

#include <glib.h>

#include <atomic>
#include <cstdlib>
#include <cstring>
#include <new>

namespace {

std::atomic<uint64_t> g_nextSerial{1};

// Runs `body`, turning an allocation failure into OUT_OF_MEMORY so that no
// exception crosses the C interface.
template <typename Body>
int guarded(const char* call, Body body)
{
	try {
		return body();
	} catch (const std::bad_alloc&) {
		WFAILED(call, APP_CONTROL_ERROR_OUT_OF_MEMORY);
		return APP_CONTROL_ERROR_OUT_OF_MEMORY;
	}
}

bool isValidText(const char* text, size_t maxLength)
{
	size_t length = strnlen(text, maxLength + 1);
	return length <= maxLength && g_utf8_validate(text, (gssize)length, nullptr);
}

bool isValidKey(const char* key)
{
	return key && key[0] != '\0' && isValidText(key, APP_CONTROL_MAX_KEY_LENGTH);
}

// A malloc'ed copy for the C caller; nullptr only when out of memory.
char* dupForCaller(const std::string& text)
{
	return strdup(text.c_str());
}

int setField(app_control_h h, std::optional<std::string> app_control_s::*field, const char* value,
		const char* call)
{
	if (!h) {
		WERROR("Invalid param : app_control (%s)", call);
		return APP_CONTROL_ERROR_INVALID_PARAMETER;
	}
	if (value && !isValidText(value, APP_CONTROL_MAX_VALUE_LENGTH)) {
		WERROR("%s: value is not UTF-8 or longer than %d bytes", call, APP_CONTROL_MAX_VALUE_LENGTH);
		return APP_CONTROL_ERROR_INVALID_PARAMETER;
	}
	return guarded(call, [&] {
		if (value)
			h->*field = std::string(value);
		else
			(h->*field).reset();
		return APP_CONTROL_ERROR_NONE;
	});
}

int getField(app_control_h h, std::optional<std::string> app_control_s::*field, char** out,
		const char* call)
{
	if (!h || !out) {
		WERROR("Invalid param : app_control or out (%s)", call);
		return APP_CONTROL_ERROR_INVALID_PARAMETER;
	}
	*out = nullptr;
	const std::optional<std::string>& value = h->*field;
	if (!value)
		return APP_CONTROL_ERROR_NONE;
	*out = dupForCaller(*value);
	return *out ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

const AppControlExtra* findExtra(app_control_h h, const char* key)
{
	auto it = h->extras.find(key);
	return it == h->extras.end() ? nullptr : &it->second;
}

int checkExtraAccess(app_control_h h, const char* key, const char* call)
{
	if (!h || !isValidKey(key)) {
		WERROR("Invalid param : app_control or key (%s)", call);
		return APP_CONTROL_ERROR_INVALID_PARAMETER;
	}
	return APP_CONTROL_ERROR_NONE;
}

void freeArray(char** values, int count)
{
	for (int i = 0; i < count; ++i)
		free(values[i]);
	free(values);
}

} // namespace

namespace ct::appcontrol {

app_control_h newHandle()
{
	auto* h = new app_control_s;
	h->serial = g_nextSerial++;
	return h;
}

app_control_h copyHandle(const app_control_s& source)
{
	auto* h = new app_control_s(source);
	h->serial = g_nextSerial++;
	h->sent = false;
	return h;
}

} // namespace ct::appcontrol

int app_control_create(app_control_h* app_control)
{
	WPRET_VM(!app_control, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control");
	*app_control = nullptr;
	return guarded("app_control_create", [&] {
		*app_control = ct::appcontrol::newHandle();
		return APP_CONTROL_ERROR_NONE;
	});
}

int app_control_destroy(app_control_h app_control)
{
	WPRET_VM(!app_control, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control");
	delete app_control;
	return APP_CONTROL_ERROR_NONE;
}

int app_control_clone(app_control_h* clone, app_control_h app_control)
{
	WPRET_VM(!clone || !app_control, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : clone or app_control");
	*clone = nullptr;
	return guarded("app_control_clone", [&] {
		*clone = ct::appcontrol::copyHandle(*app_control);
		return APP_CONTROL_ERROR_NONE;
	});
}

int app_control_set_operation(app_control_h h, const char* operation)
{
	return setField(h, &app_control_s::operation, operation, "app_control_set_operation");
}

int app_control_get_operation(app_control_h h, char** operation)
{
	return getField(h, &app_control_s::operation, operation, "app_control_get_operation");
}

int app_control_set_uri(app_control_h h, const char* uri)
{
	return setField(h, &app_control_s::uri, uri, "app_control_set_uri");
}

int app_control_get_uri(app_control_h h, char** uri)
{
	return getField(h, &app_control_s::uri, uri, "app_control_get_uri");
}

int app_control_set_mime(app_control_h h, const char* mime)
{
	return setField(h, &app_control_s::mime, mime, "app_control_set_mime");
}

int app_control_get_mime(app_control_h h, char** mime)
{
	return getField(h, &app_control_s::mime, mime, "app_control_get_mime");
}

int app_control_set_app_id(app_control_h h, const char* app_id)
{
	return setField(h, &app_control_s::appId, app_id, "app_control_set_app_id");
}

int app_control_get_app_id(app_control_h h, char** app_id)
{
	return getField(h, &app_control_s::appId, app_id, "app_control_get_app_id");
}

int app_control_set_launch_mode(app_control_h h, app_control_launch_mode_e mode)
{
	WPRET_VM(!h, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control");
	WPRET_VM(mode != APP_CONTROL_LAUNCH_MODE_SINGLE && mode != APP_CONTROL_LAUNCH_MODE_GROUP,
			APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : mode %d", (int)mode);
	h->launchMode = mode;
	return APP_CONTROL_ERROR_NONE;
}

int app_control_get_launch_mode(app_control_h h, app_control_launch_mode_e* mode)
{
	WPRET_VM(!h || !mode, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control or mode");
	*mode = h->launchMode;
	return APP_CONTROL_ERROR_NONE;
}

int app_control_add_extra_data(app_control_h h, const char* key, const char* value)
{
	int err = checkExtraAccess(h, key, "app_control_add_extra_data");
	if (err != APP_CONTROL_ERROR_NONE)
		return err;
	WPRET_VM(!value || !isValidText(value, APP_CONTROL_MAX_VALUE_LENGTH), APP_CONTROL_ERROR_INVALID_PARAMETER,
			"Invalid param : value of %s (null, not UTF-8 or too long)", key);
	return guarded("app_control_add_extra_data", [&] {
		AppControlExtra extra;
		extra.values.emplace_back(value);
		h->extras[key] = std::move(extra);
		return APP_CONTROL_ERROR_NONE;
	});
}

int app_control_add_extra_data_array(app_control_h h, const char* key, const char** value, int length)
{
	int err = checkExtraAccess(h, key, "app_control_add_extra_data_array");
	if (err != APP_CONTROL_ERROR_NONE)
		return err;
	WPRET_VM(length < 0 || length > APP_CONTROL_MAX_ARRAY_LENGTH || (length > 0 && !value),
			APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : array of %s (length %d)", key, length);
	for (int i = 0; i < length; ++i)
		WPRET_VM(!value[i] || !isValidText(value[i], APP_CONTROL_MAX_VALUE_LENGTH),
				APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : element %d of %s", i, key);
	return guarded("app_control_add_extra_data_array", [&] {
		AppControlExtra extra;
		extra.array = true;
		extra.values.assign(value, value + length);
		h->extras[key] = std::move(extra);
		return APP_CONTROL_ERROR_NONE;
	});
}

int app_control_remove_extra_data(app_control_h h, const char* key)
{
	int err = checkExtraAccess(h, key, "app_control_remove_extra_data");
	if (err != APP_CONTROL_ERROR_NONE)
		return err;
	return h->extras.erase(key) ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_KEY_NOT_FOUND;
}

int app_control_get_extra_data(app_control_h h, const char* key, char** value)
{
	WPRET_VM(!value, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : value");
	*value = nullptr;
	int err = checkExtraAccess(h, key, "app_control_get_extra_data");
	if (err != APP_CONTROL_ERROR_NONE)
		return err;
	const AppControlExtra* extra = findExtra(h, key);
	if (!extra)
		return APP_CONTROL_ERROR_KEY_NOT_FOUND;
	if (extra->array) {
		WWARNING("%s holds an array", key);
		return APP_CONTROL_ERROR_INVALID_DATA_TYPE;
	}
	*value = dupForCaller(extra->values.front());
	return *value ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

int app_control_get_extra_data_array(app_control_h h, const char* key, char*** value, int* length)
{
	WPRET_VM(!value || !length, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : value or length");
	*value = nullptr;
	*length = 0;
	int err = checkExtraAccess(h, key, "app_control_get_extra_data_array");
	if (err != APP_CONTROL_ERROR_NONE)
		return err;
	const AppControlExtra* extra = findExtra(h, key);
	if (!extra)
		return APP_CONTROL_ERROR_KEY_NOT_FOUND;
	if (!extra->array) {
		WWARNING("%s holds a single value", key);
		return APP_CONTROL_ERROR_INVALID_DATA_TYPE;
	}
	int count = (int)extra->values.size();
	auto** copies = static_cast<char**>(calloc(count > 0 ? count : 1, sizeof(char*)));
	if (!copies)
		return APP_CONTROL_ERROR_OUT_OF_MEMORY;
	for (int i = 0; i < count; ++i) {
		copies[i] = dupForCaller(extra->values[i]);
		if (!copies[i]) {
			freeArray(copies, i);
			return APP_CONTROL_ERROR_OUT_OF_MEMORY;
		}
	}
	*value = copies;
	*length = count;
	return APP_CONTROL_ERROR_NONE;
}

int app_control_is_extra_data_array(app_control_h h, const char* key, bool* array)
{
	WPRET_VM(!array, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : array");
	int err = checkExtraAccess(h, key, "app_control_is_extra_data_array");
	if (err != APP_CONTROL_ERROR_NONE)
		return err;
	const AppControlExtra* extra = findExtra(h, key);
	if (!extra)
		return APP_CONTROL_ERROR_KEY_NOT_FOUND;
	*array = extra->array;
	return APP_CONTROL_ERROR_NONE;
}

int app_control_foreach_extra_data(app_control_h h, app_control_extra_data_cb cb, void* user_data)
{
	WPRET_VM(!h || !cb, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control or cb");
	return guarded("app_control_foreach_extra_data", [&] {
		// The callback may change the extras, so walk a copy of the keys.
		std::vector<std::string> keys;
		for (const auto& entry : h->extras)
			keys.push_back(entry.first);
		for (const std::string& key : keys) {
			if (h->extras.count(key) && !cb(h, key.c_str(), user_data))
				break;
		}
		return APP_CONTROL_ERROR_NONE;
	});
}
