/* The platform log: tagged, levelled lines to stderr and to an in-memory
 * sink that tests read (LogSink.h). */
#ifndef CT_PLATFORM_DLOG_H
#define CT_PLATFORM_DLOG_H

#include <stdarg.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	DLOG_UNKNOWN = 0,
	DLOG_DEFAULT,
	DLOG_VERBOSE,
	DLOG_DEBUG,
	DLOG_INFO,
	DLOG_WARN,
	DLOG_ERROR,
	DLOG_FATAL,
	DLOG_SILENT,
	DLOG_PRIO_MAX
} log_priority;

typedef enum {
	DLOG_ERROR_NONE = 0,
	DLOG_ERROR_INVALID_PARAMETER = -22,
	DLOG_ERROR_NOT_PERMITTED = -1
} dlog_error_e;

/* Writes one line. Returns the number of bytes of the message, or
 * DLOG_ERROR_INVALID_PARAMETER for a null tag or format or a bad priority. */
int dlog_print(log_priority prio, const char *tag, const char *fmt, ...)
	__attribute__((format(printf, 3, 4)));
int dlog_vprint(log_priority prio, const char *tag, const char *fmt, va_list ap);

/* Lowest priority written to stderr; the sink keeps every line regardless.
 * Starts from $CONTACTS_LOG_LEVEL (debug, info, warn, error, silent), default info. */
void dlog_set_stderr_priority(log_priority prio);

/* The file name part of a path, for the log prefix. */
const char *dlog_basename(const char *path);

#ifdef __cplusplus
}
#endif

#endif
