/* app_control: requests to other applications and replies to our callers.
 * Requests are routed in-process to handlers registered by application id or
 * by operation (AppControlRouter.h); nothing leaves the process. Every call
 * returns APP_CONTROL_ERROR_NONE (0) or a negative error and logs failures. */
#ifndef CT_PLATFORM_APP_CONTROL_H
#define CT_PLATFORM_APP_CONTROL_H

#include <stdbool.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef struct app_control_s *app_control_h;

typedef enum {
	APP_CONTROL_ERROR_NONE = 0,
	APP_CONTROL_ERROR_INVALID_PARAMETER = -22,
	APP_CONTROL_ERROR_OUT_OF_MEMORY = -12,
	APP_CONTROL_ERROR_PERMISSION_DENIED = -13,
	APP_CONTROL_ERROR_APP_NOT_FOUND = -0x01100021,
	APP_CONTROL_ERROR_KEY_NOT_FOUND = -0x01100022,
	APP_CONTROL_ERROR_KEY_REJECTED = -0x01100023,
	APP_CONTROL_ERROR_INVALID_DATA_TYPE = -0x01100024,
	APP_CONTROL_ERROR_LAUNCH_REJECTED = -0x01100025,
	APP_CONTROL_ERROR_LAUNCH_FAILED = -0x01100026
} app_control_error_e;

typedef enum {
	APP_CONTROL_RESULT_APP_STARTED = 1,
	APP_CONTROL_RESULT_SUCCEEDED = 0,
	APP_CONTROL_RESULT_FAILED = -1,
	APP_CONTROL_RESULT_CANCELED = -2
} app_control_result_e;

typedef enum {
	APP_CONTROL_LAUNCH_MODE_SINGLE = 0,
	APP_CONTROL_LAUNCH_MODE_GROUP = 1
} app_control_launch_mode_e;

/* Limits on what a request carries; longer input is INVALID_PARAMETER. */
#define APP_CONTROL_MAX_KEY_LENGTH 1024
#define APP_CONTROL_MAX_VALUE_LENGTH (1024 * 1024)
#define APP_CONTROL_MAX_ARRAY_LENGTH 65536

/* Operations. */
#define APP_CONTROL_OPERATION_PREFIX "http://velmora.org/appcontrol/operation/"
#define APP_CONTROL_OPERATION_DEFAULT APP_CONTROL_OPERATION_PREFIX "default"
#define APP_CONTROL_OPERATION_VIEW APP_CONTROL_OPERATION_PREFIX "view"
#define APP_CONTROL_OPERATION_PICK APP_CONTROL_OPERATION_PREFIX "pick"
#define APP_CONTROL_OPERATION_ADD APP_CONTROL_OPERATION_PREFIX "add"
#define APP_CONTROL_OPERATION_EDIT APP_CONTROL_OPERATION_PREFIX "edit"
#define APP_CONTROL_OPERATION_CALL APP_CONTROL_OPERATION_PREFIX "call"
#define APP_CONTROL_OPERATION_DIAL APP_CONTROL_OPERATION_PREFIX "dial"
#define APP_CONTROL_OPERATION_COMPOSE APP_CONTROL_OPERATION_PREFIX "compose"
#define APP_CONTROL_OPERATION_SHARE APP_CONTROL_OPERATION_PREFIX "share"
#define APP_CONTROL_OPERATION_SHARE_TEXT APP_CONTROL_OPERATION_PREFIX "share_text"
#define APP_CONTROL_OPERATION_CREATE_CONTENT APP_CONTROL_OPERATION_PREFIX "create_content"
#define APP_CONTROL_OPERATION_SOCIAL_ADD APP_CONTROL_OPERATION_PREFIX "social/add"
#define APP_CONTROL_OPERATION_SOCIAL_EDIT APP_CONTROL_OPERATION_PREFIX "social/edit"
#define APP_CONTROL_OPERATION_SOCIAL_CHOOSE APP_CONTROL_OPERATION_PREFIX "social/choose"

/* Data keys. */
#define APP_CONTROL_DATA_PREFIX "http://velmora.org/appcontrol/data/"
#define APP_CONTROL_DATA_ID APP_CONTROL_DATA_PREFIX "id"
#define APP_CONTROL_DATA_TYPE APP_CONTROL_DATA_PREFIX "type"
#define APP_CONTROL_DATA_NAME APP_CONTROL_DATA_PREFIX "name"
#define APP_CONTROL_DATA_PHONE APP_CONTROL_DATA_PREFIX "phone"
#define APP_CONTROL_DATA_EMAIL APP_CONTROL_DATA_PREFIX "email"
#define APP_CONTROL_DATA_URL APP_CONTROL_DATA_PREFIX "url"
#define APP_CONTROL_DATA_TEXT APP_CONTROL_DATA_PREFIX "text"
#define APP_CONTROL_DATA_SELECTED APP_CONTROL_DATA_PREFIX "selected"
#define APP_CONTROL_DATA_SELECTION_MODE APP_CONTROL_DATA_PREFIX "selection_mode"
#define APP_CONTROL_DATA_SOCIAL_ITEM_ID APP_CONTROL_DATA_PREFIX "social/item_id"
#define APP_CONTROL_DATA_SOCIAL_PHONE APP_CONTROL_DATA_PREFIX "social/phone"
#define APP_CONTROL_DATA_SOCIAL_EMAIL APP_CONTROL_DATA_PREFIX "social/email"
#define APP_CONTROL_DATA_SOCIAL_URL APP_CONTROL_DATA_PREFIX "social/url"

/* `request` is the request as sent (a copy that lives until the callback
 * returns); `reply` is the handler's reply, valid only during the call. */
typedef void (*app_control_reply_cb)(app_control_h request, app_control_h reply,
		app_control_result_e result, void *user_data);
/* Return false to stop the iteration. */
typedef bool (*app_control_extra_data_cb)(app_control_h app_control, const char *key,
		void *user_data);

/* Lifecycle. create/clone hand out a handle the caller destroys. */
int app_control_create(app_control_h *app_control);
int app_control_destroy(app_control_h app_control);
/* A deep copy of `app_control`, independent of it. */
int app_control_clone(app_control_h *clone, app_control_h app_control);

/* Setters copy the text; NULL clears the field. Getters hand out a copy
 * (caller frees) or NULL when the field is not set. */
int app_control_set_operation(app_control_h app_control, const char *operation);
int app_control_get_operation(app_control_h app_control, char **operation);
int app_control_set_uri(app_control_h app_control, const char *uri);
int app_control_get_uri(app_control_h app_control, char **uri);
int app_control_set_mime(app_control_h app_control, const char *mime);
int app_control_get_mime(app_control_h app_control, char **mime);
int app_control_set_app_id(app_control_h app_control, const char *app_id);
int app_control_get_app_id(app_control_h app_control, char **app_id);
int app_control_set_launch_mode(app_control_h app_control, app_control_launch_mode_e mode);
int app_control_get_launch_mode(app_control_h app_control, app_control_launch_mode_e *mode);

/* Extra data: UTF-8 keys mapped to a text or to an array of texts. Adding an
 * existing key replaces its value (and kind). */
int app_control_add_extra_data(app_control_h app_control, const char *key, const char *value);
int app_control_add_extra_data_array(app_control_h app_control, const char *key,
		const char **value, int length);
int app_control_remove_extra_data(app_control_h app_control, const char *key);
/* A copy the caller frees. KEY_NOT_FOUND when absent, INVALID_DATA_TYPE for an array. */
int app_control_get_extra_data(app_control_h app_control, const char *key, char **value);
/* A malloc'ed array of malloc'ed copies; the caller frees each and the array.
 * INVALID_DATA_TYPE when the key holds a single text. */
int app_control_get_extra_data_array(app_control_h app_control, const char *key,
		char ***value, int *length);
int app_control_is_extra_data_array(app_control_h app_control, const char *key, bool *array);
/* Calls cb for each key in key order; the key is valid during the call only. */
int app_control_foreach_extra_data(app_control_h app_control, app_control_extra_data_cb cb,
		void *user_data);

/* Routes the request to the handler registered for its application id, else
 * for its operation; APP_NOT_FOUND when there is none. The handler runs before
 * this returns, on a copy of the request. When reply_cb is given, it is called
 * once on the EFL main loop (never inside this call) with the handler's reply,
 * unless the sender cancelled it first (app_control_cancel_replies). */
int app_control_send_launch_request(app_control_h app_control, app_control_reply_cb reply_cb,
		void *user_data);
/* Ends what `app_control` launched: its pending replies are dropped and the
 * handler's terminate hook (if any) runs. APP_NOT_FOUND when this handle was
 * never sent; NONE when it was, even if the launched side already finished. */
int app_control_send_terminate_request(app_control_h app_control);
/* Drops every pending reply whose user data is `user_data`; call it when the
 * object that sent requests dies. Returns the number of dropped replies (>= 0). */
int app_control_cancel_replies(void *user_data);

/* Replies to a request received by a handler. The reply's content is copied;
 * the sender's callback sees it on the main loop. A request is answered once:
 * a second reply is INVALID_PARAMETER. Replying to a request that asked for no
 * reply, or whose sender cancelled, succeeds and delivers nothing. */
int app_control_reply_to_launch_request(app_control_h reply, app_control_h request,
		app_control_result_e result);
/* The application id of the sender of a received request (copy, caller frees);
 * INVALID_PARAMETER for a request that was not received. */
int app_control_get_caller(app_control_h app_control, char **id);
/* Whether the sender of a received request waits for a reply. */
int app_control_is_reply_requested(app_control_h app_control, bool *requested);

#ifdef __cplusplus
}
#endif

#endif
