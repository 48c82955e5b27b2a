#include "velmora_log_manager.h"

#include "ContactsDebug.h"
#include "UsageLog.h"

#include <glib.h>

#include <cstring>
#include <new>

struct velmora_log_manager_s {
	ct::db::Database db;
};

namespace {

const size_t kMaxTextBytes = 4096;

int toLogError(int sqliteResult)
{
	int err = ct::db::toErrno(sqliteResult);
	return err ? err : VELMORA_LOG_MANAGER_ERROR_IO_ERROR;
}

bool isKnownUri(const char* uri)
{
	return uri && (strcmp(uri, USAGE_LOG_FEATURE_URI) == 0 || strcmp(uri, USAGE_LOG_STATUS_URI) == 0);
}

// The bundle's text under `key`, or null when missing. False when the text
// is not UTF-8 or too long.
bool readField(bundle* data, const char* key, const char** out)
{
	char* text = nullptr;
	*out = nullptr;
	if (bundle_get_str(data, key, &text) != BUNDLE_ERROR_NONE)
		return true;
	if (strlen(text) > kMaxTextBytes || !g_utf8_validate(text, -1, nullptr)) {
		WERROR("usage log field %s is not UTF-8 or longer than %zu bytes", key, kMaxTextBytes);
		return false;
	}
	*out = text;
	return true;
}

} // namespace

extern "C" {

int velmora_log_manager_create(velmora_log_manager_h* handle)
{
	WPRET_VM(!handle, VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, "handle is null");
	*handle = nullptr;
	auto* manager = new (std::nothrow) velmora_log_manager_s;
	if (!manager)
		return VELMORA_LOG_MANAGER_ERROR_OUT_OF_MEMORY;
	int rc = ct::usagelog::openLog(manager->db);
	if (rc != SQLITE_OK) {
		delete manager;
		return toLogError(rc);
	}
	*handle = manager;
	return VELMORA_LOG_MANAGER_ERROR_NONE;
}

int velmora_log_manager_insert(velmora_log_manager_h handle, const char* uri, bundle* data,
	int, int, int* out_id)
{
	WPRET_VM(!handle || !data, VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, "handle or data is null");
	WPRET_VM(!isKnownUri(uri), VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, "unknown uri %s",
		uri ? uri : "(null)");
	const char *appId, *feature, *extra, *value;
	if (!readField(data, "app_id", &appId) || !readField(data, "feature", &feature)
		|| !readField(data, "extra", &extra) || !readField(data, "value", &value))
		return VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER;
	WPRET_VM(!appId || !*appId || !feature || !*feature, VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER,
		"app_id and feature are required");

	auto st = handle->db.prepare(
		"INSERT INTO records(uri, app_id, feature, extra, value, time) VALUES(?, ?, ?, ?, ?, ?)");
	st.bind(1, uri).bind(2, appId).bind(3, feature).bind(4, extra).bind(5, value);
	st.bind(6, static_cast<int64_t>(g_get_real_time() / 1000));
	int rc = st.step();
	if (rc != SQLITE_DONE) {
		WERROR("usage log insert failed: %s (%d)", handle->db.errorMessage().c_str(), rc);
		return toLogError(rc);
	}
	if (out_id)
		*out_id = static_cast<int>(handle->db.lastInsertRowId());
	return VELMORA_LOG_MANAGER_ERROR_NONE;
}

int velmora_log_manager_destroy(velmora_log_manager_h handle)
{
	WPRET_VM(!handle, VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, "handle is null");
	delete handle;
	return VELMORA_LOG_MANAGER_ERROR_NONE;
}

} // extern "C"
