// Stand-ins for the applications the screens launch (phone, messages,
// e-mail, browser, maps, share, gallery, camera, ringtone picker, ...): each
// shows what would have happened as a notice naming the request, and replies
// sensibly where the sender waits for an answer. Registered while alive.
#pragma once

#include "AppControlRouter.h"

#include <string>
#include <vector>

namespace ct::demo {

class DemoAppControlHandlers {
public:
	// `picturePath` is what the picture pickers answer with (may be empty).
	explicit DemoAppControlHandlers(std::string picturePath);
	DemoAppControlHandlers(const DemoAppControlHandlers&) = delete;
	DemoAppControlHandlers& operator=(const DemoAppControlHandlers&) = delete;

	// The notice shown for `request` ("Call: tel:+4930...").
	static std::string describe(app_control_h request);

private:
	enum class Answer { None, Picture, Ringtone, Done };

	void __byOperation(const char* operation, Answer answer);
	void __byApp(const char* appId, Answer answer);
	int __handle(app_control_h request, const ct::appcontrol::Reply& reply, Answer answer) const;

	std::string m_picturePath;
	std::vector<ct::appcontrol::Registration> m_registrations;
};

} // namespace ct::demo
