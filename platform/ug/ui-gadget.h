/* UI gadget: a screen running inside a host application's gadget sends its
 * results to the host and asks the host to close it. The host side is
 * ct::ug::UiGadget (UiGadget.h). */
#ifndef CT_PLATFORM_UI_GADGET_H
#define CT_PLATFORM_UI_GADGET_H

#include "app_control.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef struct ui_gadget_s *ui_gadget_h;

typedef enum {
	UG_ERROR_NONE = 0,
	UG_ERROR_INVALID_PARAMETER = -22,
	UG_ERROR_OUT_OF_MEMORY = -12
} ug_error_e;

/* Hands a copy of `result` to the host's result callback before returning;
 * the caller keeps `result`. INVALID_PARAMETER for a null, unknown or
 * already closed gadget, or a null result. */
int ug_send_result(ui_gadget_h ug, app_control_h result);
/* Asks the host to close the gadget. The host's destroy callback runs later on
 * the EFL main loop (never inside this call, which usually comes from the
 * gadget's own screen), once, however often this is called. */
int ug_destroy_me(ui_gadget_h ug);

#ifdef __cplusplus
}
#endif

#endif
