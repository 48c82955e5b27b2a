/* Usage-log client: appends records of feature use to the usage log in the
 * data folder ("usagelog.db"). */
#ifndef CT_PLATFORM_VELMORA_LOG_MANAGER_H
#define CT_PLATFORM_VELMORA_LOG_MANAGER_H

#include "bundle.h"

#ifdef __cplusplus
extern "C" {
#endif

#define USAGE_LOG_FEATURE_URI "content://usagelog/feature"
#define USAGE_LOG_STATUS_URI "content://usagelog/status"

typedef enum {
	VELMORA_LOG_MANAGER_ERROR_NONE = 0,
	VELMORA_LOG_MANAGER_ERROR_IO_ERROR = -5,
	VELMORA_LOG_MANAGER_ERROR_OUT_OF_MEMORY = -12,
	VELMORA_LOG_MANAGER_ERROR_PERMISSION_DENIED = -13,
	VELMORA_LOG_MANAGER_ERROR_BUSY = -16,
	VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER = -22,
	VELMORA_LOG_MANAGER_ERROR_NO_SPACE = -28
} velmora_log_manager_error_e;

typedef struct velmora_log_manager_s *velmora_log_manager_h;

/* Opens the usage log; *handle is freed with velmora_log_manager_destroy(). */
int velmora_log_manager_create(velmora_log_manager_h *handle);

/* Appends one record under `uri` (USAGE_LOG_FEATURE_URI or
 * USAGE_LOG_STATUS_URI) from the bundle's "app_id" and "feature" (both
 * required) and "extra" and "value" (optional); texts are UTF-8 of at most
 * 4096 bytes. `reserved1`/`reserved2` are kept for callers and pass 0.
 * *out_id (optional) receives the record id. */
int velmora_log_manager_insert(velmora_log_manager_h handle, const char *uri, bundle *data,
	int reserved1, int reserved2, int *out_id);

int velmora_log_manager_destroy(velmora_log_manager_h handle);

#ifdef __cplusplus
}
#endif

#endif
