/* Call-block list: numbers the user blocked, kept in SQLite in the data
 * folder ("callblock.db"), with change callbacks on the EFL main loop (also
 * for changes made by another process). */
#ifndef CT_PLATFORM_PHONE_MISC_H
#define CT_PLATFORM_PHONE_MISC_H

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	PHONE_MISC_ERROR_NONE = 0,
	PHONE_MISC_ERROR_IO_ERROR = -5,
	PHONE_MISC_ERROR_OUT_OF_MEMORY = -12,
	PHONE_MISC_ERROR_PERMISSION_DENIED = -13,
	PHONE_MISC_ERROR_BUSY = -16,
	PHONE_MISC_ERROR_ALREADY_EXISTS = -17,
	PHONE_MISC_ERROR_INVALID_PARAMETER = -22,
	PHONE_MISC_ERROR_NO_SPACE = -28,
	PHONE_MISC_ERROR_NO_DATA = -61
} phone_misc_error_e;

typedef enum {
	PHONE_MISC_BLOCK_TYPE_CALL = 1,
	PHONE_MISC_BLOCK_TYPE_MESSAGE = 2
} phone_misc_block_type_e;

typedef struct phone_misc_s *phone_misc_h;
typedef void (*phone_misc_block_db_change_cb)(void *user_data);
typedef void (*phone_misc_block_foreach_cb)(const char *number, void *user_data);

/* Opens the block list; *handle is released with phone_misc_disconnect(). */
int phone_misc_connect(phone_misc_h *handle);
/* Releases the handle and its callbacks; safe inside one of its callbacks. */
int phone_misc_disconnect(phone_misc_h handle);

/* Numbers are compared after removing everything but digits and a leading
 * '+' ("+1 (555) 010-2000" is "+15550102000"); a number with no digit, or of
 * more than 1024 bytes, is an invalid parameter. */

/* Returns 1 when `number` is blocked for `type`, 0 when not, or a negative
 * error; *out_is_blocked (optional) receives 1 or 0. */
int phone_misc_block_find(phone_misc_h handle, int type, const char *number, int *out_is_blocked);
/* PHONE_MISC_ERROR_ALREADY_EXISTS when already blocked. */
int phone_misc_block_add(phone_misc_h handle, int type, const char *number);
/* PHONE_MISC_ERROR_NO_DATA when it was not blocked. */
int phone_misc_block_remove(phone_misc_h handle, int type, const char *number);
/* Calls cb for each blocked number of `type` (cleaned form), sorted. */
int phone_misc_block_foreach(phone_misc_h handle, int type, phone_misc_block_foreach_cb cb, void *user_data);

/* Calls cb on the main loop after the block list changed. Adding the same cb
 * again replaces its user data. */
int phone_misc_add_block_db_change_cb(phone_misc_h handle, phone_misc_block_db_change_cb cb, void *user_data);
int phone_misc_remove_block_db_change_cb(phone_misc_h handle, phone_misc_block_db_change_cb cb);

#ifdef __cplusplus
}
#endif

#endif
