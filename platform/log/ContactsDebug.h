/* Logging macros of the contacts code: tag "PHONE" and the prefix
 * "file: function(line) > ". */
#ifndef CT_PLATFORM_CONTACTS_DEBUG_H
#define CT_PLATFORM_CONTACTS_DEBUG_H

#include "dlog.h"

#define CT_LOG_TAG "PHONE"

#define CT_LOG(prio, fmt, ...) \
	dlog_print(prio, CT_LOG_TAG, "%s: %s(%d) > " fmt, dlog_basename(__FILE__), __func__, __LINE__, ##__VA_ARGS__)

#define WDEBUG(fmt, ...) CT_LOG(DLOG_DEBUG, fmt, ##__VA_ARGS__)
#define WINFO(fmt, ...) CT_LOG(DLOG_INFO, fmt, ##__VA_ARGS__)
#define WWARNING(fmt, ...) CT_LOG(DLOG_WARN, fmt, ##__VA_ARGS__)
#define WERROR(fmt, ...) CT_LOG(DLOG_ERROR, "* Critical * " fmt, ##__VA_ARGS__)

/* Start of an operation, and a toolkit or service callback firing. */
#define WENTER() CT_LOG(DLOG_INFO, "BEGIN >>>>")
#define WHIT() CT_LOG(DLOG_INFO, ">>>HIT<<<")

/* A failed platform call: "contacts_db_get_record() Failed(-2)". */
#define WFAILED(call, err) CT_LOG(DLOG_WARN, "%s() Failed(%d)", call, (int)(err))

#define WPRET_M(cond, fmt, ...) \
	do { \
		if (cond) { \
			WERROR(fmt, ##__VA_ARGS__); \
			return; \
		} \
	} while (0)

#define WPRET_VM(cond, val, fmt, ...) \
	do { \
		if (cond) { \
			WERROR(fmt, ##__VA_ARGS__); \
			return (val); \
		} \
	} while (0)

#endif
