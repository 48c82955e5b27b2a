/* i18n date formatting: ICU date formatters for a locale, made from an ICU
 * pattern or from a skeleton ("yMMMd") that becomes the locale's own pattern. */
#ifndef CT_PLATFORM_UTILS_I18N_H
#define CT_PLATFORM_UTILS_I18N_H

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef struct i18n_udate_s *i18n_udate_h;
/* A UTF-16 code unit. */
typedef uint16_t i18n_uchar;
/* Milliseconds since 1970-01-01 00:00 UTC. */
typedef double i18n_udate;

typedef enum {
	I18N_ERROR_NONE = 0,
	I18N_ERROR_INVALID_PARAMETER = -22,
	I18N_ERROR_OUT_OF_MEMORY = -12,
	I18N_ERROR_BUFFER_OVERFLOW = -0x01960001,
	I18N_ERROR_NOT_SUPPORTED = -0x01960002
} i18n_error_e;

/* Longest locale, time-zone id, skeleton or pattern accepted, in bytes. */
#define I18N_MAX_ARGUMENT_LENGTH 256

/* A formatter for `locale` ("en_US", "de_DE", "ko_KR"; an encoding suffix
 * such as ".UTF-8" is ignored) in time zone `tz_id` (NULL: "UTC"). The caller
 * destroys it with i18n_udate_destroy. INVALID_PARAMETER for null, invalid
 * UTF-8 or over-long arguments, and for a pattern or zone ICU rejects. */
int i18n_udate_create_from_skeleton(const char *skeleton, const char *locale, const char *tz_id,
		i18n_udate_h *formatter);
int i18n_udate_create_from_pattern(const char *pattern, const char *locale, const char *tz_id,
		i18n_udate_h *formatter);
int i18n_udate_destroy(i18n_udate_h formatter);

/* The formatter's pattern as UTF-8 (caller frees). */
int i18n_udate_get_pattern(i18n_udate_h formatter, char **pattern);

/* Formats `date` into `result` (UTF-16, NUL-terminated when there is room).
 * *buf_size_needed gets the length without the NUL; BUFFER_OVERFLOW when
 * result_len is too small (result then holds nothing useful). */
int i18n_udate_format_date(i18n_udate_h formatter, i18n_udate date, i18n_uchar *result,
		int32_t result_len, int32_t *buf_size_needed);
/* Formats `date` as UTF-8 text (caller frees). */
int i18n_udate_format_date_utf8(i18n_udate_h formatter, i18n_udate date, char **result);

#ifdef __cplusplus
}
#endif

#endif
