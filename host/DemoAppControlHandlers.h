// Stand-ins for the applications the screens launch. Pickers open a small
// screen of their own on the host's naviframe and reply through the router
// as the real application would (StandIn*View): gallery, camera, preset-style
// editor, image-viewer crop, ringtone picker, group and contact pickers,
// maps and the share target. Everything else (calls, messages, e-mail,
// browser, video call, adding an account, ...) shows a notice of what would
// have happened. Registered while alive.
#pragma once

#include "AppControlRouter.h"
#include "WNaviframe.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace ct::demo {

class DemoAppControlHandlers {
public:
	struct Folders {
		std::string pictures;    // what the gallery lists, the camera sees and the editor styles
		std::string output;      // styled pictures, crops and saved vCards
		std::string ringtones;   // the ringtones offered when the asked folder has none
		// The demo pictures and ringtones, output in the data folder.
		static Folders defaults();
	};

	// Stand-in screens are pushed on `naviframe`; without one every request
	// gets a notice and a cancelled reply.
	DemoAppControlHandlers(app_assist::WNaviframe* naviframe, Folders folders);
	DemoAppControlHandlers(const DemoAppControlHandlers&) = delete;
	DemoAppControlHandlers& operator=(const DemoAppControlHandlers&) = delete;

	// The notice shown for `request` ("Call: tel:+4930...").
	static std::string describe(app_control_h request);

private:
	using ScreenMaker = std::function<app_assist::WView*(app_control_h request, const ct::appcontrol::Reply& reply)>;
	struct Screen {
		ScreenMaker make;
		std::weak_ptr<app_assist::WControl> open;
	};

	void __noticeByOperation(const char* operation);
	void __noticeByApp(const char* appId);
	void __screenByOperation(const char* operation, ScreenMaker make);
	void __screenByApp(const char* appId, ScreenMaker make);
	int __notice(app_control_h request, const ct::appcontrol::Reply& reply) const;
	int __open(Screen& screen, app_control_h request, const ct::appcontrol::Reply& reply);
	app_assist::WView* __makePicker(app_control_h request, const ct::appcontrol::Reply& reply) const;
	app_assist::WView* __makePick(app_control_h request, const ct::appcontrol::Reply& reply) const;

	app_assist::WNaviframe* m_naviframe;
	std::weak_ptr<app_assist::WControl> m_naviframeAlive;
	Folders m_folders;
	std::vector<std::unique_ptr<Screen>> m_screens;
	std::vector<ct::appcontrol::Registration> m_registrations;
};

} // namespace ct::demo
