#ifndef _CONTACTS_APP_CONTROL_LAUNCHER_H_
#define _CONTACTS_APP_CONTROL_LAUNCHER_H_

#include <app_control.h>

#include <Evas.h>

// Launches other applications for the contacts screens and remembers the
// last launch, so a screen can end what it started (terminate()).
class ContactsAppControlLauncher {
public:
	static ContactsAppControlLauncher* getInstance();

	// True when the request was handed to an application. A given
	// `replyCallback(request, reply, result, data)` runs on the main loop,
	// unless `ownerObject` is deleted first: then the reply is dropped.
	bool sendLaunchRequest(app_control_h request, app_control_reply_cb replyCallback = nullptr,
		void* data = nullptr, Evas_Object* ownerObject = nullptr);
	// The same as sendLaunchRequest (requests never block the main loop here).
	bool sendAsyncLaunchRequest(app_control_h request, app_control_reply_cb replyCallback,
		void* data, Evas_Object* ownerObject);
	// Ends the last launched application, if any.
	void terminate();

private:
	ContactsAppControlLauncher() = default;
	~ContactsAppControlLauncher();
	bool __send(app_control_h request, app_control_reply_cb replyCallback, void* data);
	static void __onOwnerDeletedCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);

	app_control_h m_lastLaunched = nullptr;
};

#endif
