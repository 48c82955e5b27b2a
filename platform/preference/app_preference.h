/* The application's preference store: typed values by key, kept in SQLite in
 * the data folder, with change callbacks on the EFL main loop (also for
 * changes made by another process). Keys have no defaults. */
#ifndef CT_PLATFORM_APP_PREFERENCE_H
#define CT_PLATFORM_APP_PREFERENCE_H

#include <stdbool.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	PREFERENCE_ERROR_NONE = 0,
	PREFERENCE_ERROR_IO_ERROR = -5,
	PREFERENCE_ERROR_OUT_OF_MEMORY = -12,
	PREFERENCE_ERROR_INVALID_PARAMETER = -22,
	PREFERENCE_ERROR_NO_SPACE = -28,
	PREFERENCE_ERROR_NO_KEY = -126
} preference_error_e;

/* The preference keys the contacts screens use. */
#define PREFERENCE_KEY_HIDE_STORAGE_POPUP "hide_storage_popup"
#define PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK "input_base_addressbook"
#define PREFERENCE_KEY_HAS_MYPROFILE_INFO "has_myprofile_info"
#define PREFERENCE_KEY_SHARING_SELECTED_CONTACTS_SET "my_profile_sharing_selected_contacts_set"

typedef void (*preference_changed_cb)(const char *key, void *user_data);

/* Setters create the key or replace its value and type; a failed write keeps
 * the previous value. Keys: non-empty UTF-8, at most 256 bytes. Strings:
 * UTF-8, at most 4096 bytes. */
int preference_set_int(const char *key, int value);
int preference_set_double(const char *key, double value);
int preference_set_string(const char *key, const char *value);
int preference_set_boolean(const char *key, bool value);

/* Getters: PREFERENCE_ERROR_NO_KEY when the key is missing,
 * PREFERENCE_ERROR_INVALID_PARAMETER when it holds another type. */
int preference_get_int(const char *key, int *value);
int preference_get_double(const char *key, double *value);
/* *value is a copy the caller frees with free(). */
int preference_get_string(const char *key, char **value);
int preference_get_boolean(const char *key, bool *value);

int preference_remove(const char *key);
int preference_is_existing(const char *key, bool *existing);
int preference_remove_all(void);

/* One callback per key (setting it again replaces it), called on the main
 * loop after the key was set or removed. The key need not exist yet. */
int preference_set_changed_cb(const char *key, preference_changed_cb callback, void *user_data);
int preference_unset_changed_cb(const char *key);

/* Closes the store file and drops every callback; the next call reopens it.
 * For tools and tests that reopen the store. */
void preference_close_store(void);

#ifdef __cplusplus
}
#endif

#endif
