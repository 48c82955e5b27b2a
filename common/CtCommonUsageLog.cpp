#include "CtCommonUsageLog.h"

#include "ContactsAppIds.h"
#include "ContactsDebug.h"

#include <bundle.h>
#include <velmora_log_manager.h>

namespace {

void insertRecord(const char* feature, const char* key, const char* text)
{
	WPRET_M(!feature, "Invalid param : feature");
	bundle* b = bundle_create();
	WPRET_M(!b, "bundle_create() is fail");
	bundle_add_str(b, "app_id", CONTACTS_APP_ID);
	bundle_add_str(b, "feature", feature);
	if (text)
		bundle_add_str(b, key, text);
	velmora_log_manager_h handle = nullptr;
	if (velmora_log_manager_create(&handle) == 0) {
		velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, b, 0, 0, nullptr);
		velmora_log_manager_destroy(handle);
	}
	bundle_free(b);
}

} // namespace

void ctCommonInsertUsageLog(const char* feature, const char* extra)
{
	insertRecord(feature, "extra", extra);
}

void ctCommonInsertUsageLogValue(const char* feature, const char* value)
{
	insertRecord(feature, "value", value);
}
