// The content of an app_control_h. Internal to platform/appcontrol.
#pragma once

#include "app_control.h"

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <vector>

struct AppControlExtra {
	std::vector<std::string> values;
	bool array = false;
};

struct app_control_s {
	std::optional<std::string> operation;
	std::optional<std::string> uri;
	std::optional<std::string> mime;
	std::optional<std::string> appId;
	app_control_launch_mode_e launchMode = APP_CONTROL_LAUNCH_MODE_SINGLE;
	std::map<std::string, AppControlExtra> extras;

	// Identity of this handle as a sender (terminate finds its launches by it).
	uint64_t serial = 0;
	bool sent = false;

	// Set on a request received by a handler, and kept by its clones.
	uint64_t launchId = 0;
	std::optional<std::string> caller;
	bool replyRequested = false;
};

namespace ct::appcontrol {

// A new handle with a fresh serial; the caller owns it (app_control_destroy).
app_control_h newHandle();
// A deep copy with a fresh serial; the received-request link is kept.
app_control_h copyHandle(const app_control_s& source);

} // namespace ct::appcontrol
