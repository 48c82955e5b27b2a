/* vconf: the platform's persistent key-value settings (int, bool, string),
 * kept in SQLite in the data folder, with change callbacks delivered on the
 * EFL main loop, also for changes made by another process. */
#ifndef CT_PLATFORM_VCONF_H
#define CT_PLATFORM_VCONF_H

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	VCONF_OK = 0,
	VCONF_ERROR = -1,
	VCONF_ERROR_WRONG_PREFIX = -2,
	VCONF_ERROR_WRONG_TYPE = -3,
	VCONF_ERROR_WRONG_VALUE = -4,
	VCONF_ERROR_NOT_INITIALIZED = -5,
	VCONF_ERROR_NO_MEM = -6,
	VCONF_ERROR_FILE_PERM = -11,
	VCONF_ERROR_FILE_BUSY = -12,
	VCONF_ERROR_FILE_NO_MEM = -13,
	VCONF_ERROR_FILE_NO_ENT = -14,
	VCONF_ERROR_INVALID_PARAMETER = -22,
	VCONF_ERROR_FILE_NO_SPACE = -28
} vconf_error_e;

typedef enum {
	VCONF_TYPE_NONE = 0,
	VCONF_TYPE_STRING = 40,
	VCONF_TYPE_INT = 41,
	VCONF_TYPE_DOUBLE = 42,
	VCONF_TYPE_BOOL = 43
} vconf_t;

typedef struct _keynode_t keynode_t;
typedef void (*vconf_callback_fn)(keynode_t *node, void *user_data);

/* Keys the contacts screens read. */
#define VCONFKEY_SETAPPL_PSMODE "db/setting/psmode"
#define VCONFKEY_TELEPHONY_SIM_POWER_STATE1 "db/telephony/sim_power_state1"
#define VCONFKEY_TELEPHONY_SIM_POWER_STATE2 "db/telephony/sim_power_state2"
#define VCONFKEY_SETAPPL_SIM1_NAME "db/setting/sim1_name"
#define VCONFKEY_SETAPPL_SIM2_NAME "db/setting/sim2_name"
#define VCONFKEY_SETAPPL_SIM1_ICON "db/setting/sim1_icon"
#define VCONFKEY_SETAPPL_SIM2_ICON "db/setting/sim2_icon"
#define VCONFKEY_REGIONFORMAT "db/menu_widget/regionformat"
#define VCONFKEY_REGIONFORMAT_TIME1224 "db/menu_widget/regionformat_time1224"
#define VCONFKEY_CSC_COUNTRY_ISO "db/csc/country_iso"
#define VCONFKEY_CONTACT_DEFAULT_IMAGE_PATH "db/deco-contact-image-editor/contact_default_image_path"
#define VCONFKEY_LANGSET "db/menu_widget/language"

/* Getters return VCONF_OK and fill *val; VCONF_ERROR_FILE_NO_ENT for an
 * unknown key, VCONF_ERROR_WRONG_TYPE when the key holds another type. */
int vconf_get_int(const char *key, int *val);
int vconf_get_bool(const char *key, int *val);
int vconf_get_dbl(const char *key, double *val);
/* A copy the caller frees, or NULL (unknown key, wrong type). */
char *vconf_get_str(const char *key);
/* The type of a stored key, VCONF_TYPE_NONE when unknown. */
int vconf_get_type(const char *key);

/* Setters create the key or replace its value and type. A failed write keeps
 * the previous value. */
int vconf_set_int(const char *key, int val);
int vconf_set_bool(const char *key, int val);
int vconf_set_dbl(const char *key, double val);
int vconf_set_str(const char *key, const char *val);
int vconf_unset(const char *key);

/* Calls cb on the EFL main loop after `key` changed. One registration per
 * (key, cb) pair; registering it again replaces its user data. */
int vconf_notify_key_changed(const char *key, vconf_callback_fn cb, void *user_data);
int vconf_ignore_key_changed(const char *key, vconf_callback_fn cb);

/* Valid only during the callback. */
const char *vconf_keynode_get_name(keynode_t *node);
int vconf_keynode_get_type(keynode_t *node);
int vconf_keynode_get_int(keynode_t *node);
int vconf_keynode_get_bool(keynode_t *node);
double vconf_keynode_get_dbl(keynode_t *node);
/* Borrowed; valid only during the callback. */
char *vconf_keynode_get_str(keynode_t *node);

/* Closes the store file and drops every change callback; the next call
 * reopens it. For tools and tests that reopen the store. */
void vconf_close_store(void);

#ifdef __cplusplus
}
#endif

#endif
