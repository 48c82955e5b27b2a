/* Notification: short status messages shown to the user as a transient toast. */
#ifndef CT_PLATFORM_NOTIFICATION_H
#define CT_PLATFORM_NOTIFICATION_H

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
	NOTIFICATION_ERROR_NONE = 0,
	NOTIFICATION_ERROR_INVALID_PARAMETER = -22,
	NOTIFICATION_ERROR_OUT_OF_MEMORY = -12
} notification_error_e;

/* Longest message accepted, in bytes. */
#define NOTIFICATION_MAX_MESSAGE_LENGTH 4096

/* Shows `message` (plain UTF-8 text) as a toast on the host's window, or only
 * logs it when there is none, and records it (NotificationLog.h).
 * INVALID_PARAMETER for null, empty, invalid UTF-8 or over-long text. */
int notification_status_message_post(const char *message);

#ifdef __cplusplus
}
#endif

#endif
