/* bundle: an in-memory set of string and string-array values by key, used to
 * pass extra data between applications and services. Not persistent. */
#ifndef CT_PLATFORM_BUNDLE_H
#define CT_PLATFORM_BUNDLE_H

#include <stddef.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	BUNDLE_ERROR_NONE = 0,
	BUNDLE_ERROR_OUT_OF_MEMORY = -12,
	BUNDLE_ERROR_INVALID_PARAMETER = -22,
	BUNDLE_ERROR_KEY_NOT_AVAILABLE = -126,
	BUNDLE_ERROR_KEY_EXISTS = -17
} bundle_error_e;

typedef enum {
	BUNDLE_TYPE_NONE = -1,
	BUNDLE_TYPE_ANY = 0,
	BUNDLE_TYPE_STR = 1 | 0x0100,
	BUNDLE_TYPE_STR_ARRAY = 1 | 0x0100 | 0x0200
} bundle_type_e;

typedef struct _bundle_t bundle;
typedef struct keyval_t bundle_keyval_t;
typedef unsigned char bundle_raw;

/* Called for each entry in key order; `kv` is valid only during the call. */
typedef void (*bundle_iterator_t)(const char *key, const int type,
	const bundle_keyval_t *kv, void *user_data);

/* A new empty bundle the caller frees with bundle_free(); NULL on failure. */
bundle *bundle_create(void);
int bundle_free(bundle *b);

/* Adds a copy of `str` under a new key; BUNDLE_ERROR_KEY_EXISTS when the key
 * is taken. Keys and values must be non-null, non-empty keys. */
int bundle_add_str(bundle *b, const char *key, const char *str);
/* *str is borrowed: valid until the key is deleted or the bundle freed. */
int bundle_get_str(bundle *b, const char *key, char **str);
/* Adds a copy of `len` strings (null entries are stored as ""). */
int bundle_add_str_array(bundle *b, const char *key, const char **str_array, const int len);
/* Borrowed array and strings; NULL when missing or not an array. */
const char **bundle_get_str_array(bundle *b, const char *key, int *len);
int bundle_del(bundle *b, const char *key);

/* Number of keys; 0 for a null bundle. */
int bundle_get_count(bundle *b);
/* BUNDLE_TYPE_STR / _STR_ARRAY, or BUNDLE_TYPE_NONE when missing. */
int bundle_get_type(bundle *b, const char *key);
/* A deep copy the caller frees; NULL for a null bundle. */
bundle *bundle_dup(bundle *b_from);
void bundle_foreach(bundle *b, bundle_iterator_t iter, void *user_data);

/* Entry accessors for bundle_foreach. Values are borrowed. */
int bundle_keyval_get_type(bundle_keyval_t *kv);
int bundle_keyval_get_basic_val(bundle_keyval_t *kv, void **val, size_t *size);
int bundle_keyval_get_array_val(bundle_keyval_t *kv, void ***array_val,
	unsigned int *array_len, size_t **array_element_size);

/* Serializes to a base64 text; *r is allocated (free with bundle_free_encoded_rawdata
 * or free()), *len its length without the terminator. */
int bundle_encode(bundle *b, bundle_raw **r, int *len);
int bundle_free_encoded_rawdata(bundle_raw **r);
/* Rebuilds a bundle from bundle_encode() output; NULL for malformed data. */
bundle *bundle_decode(const bundle_raw *r, const int len);

#ifdef __cplusplus
}
#endif

#endif
