#ifndef _CT_LAUNCH_REQUEST_H_
#define _CT_LAUNCH_REQUEST_H_

#include <app_control.h>
#include <ui-gadget.h>

// The host's launch request. Owned by the host and alive for the whole life
// of the view that keeps a pointer to it; any member may be null.
struct CtLaunchRequest {
	ui_gadget_h ug = nullptr;              // set when the screen runs as a UI gadget
	app_control_h appControl = nullptr;    // the request that started the screen
	const char* callerAppId = nullptr;     // the caller's application id
};

#endif
