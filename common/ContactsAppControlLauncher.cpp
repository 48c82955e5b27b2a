#include "ContactsAppControlLauncher.h"

#include "ContactsDebug.h"

ContactsAppControlLauncher* ContactsAppControlLauncher::getInstance()
{
	static ContactsAppControlLauncher instance;
	return &instance;
}

ContactsAppControlLauncher::~ContactsAppControlLauncher()
{
	if (m_lastLaunched)
		app_control_destroy(m_lastLaunched);
}

bool ContactsAppControlLauncher::sendAsyncLaunchRequest(app_control_h request,
	app_control_reply_cb replyCallback, void* data, Evas_Object* ownerObject)
{
	return sendLaunchRequest(request, replyCallback, data, ownerObject);
}

bool ContactsAppControlLauncher::sendLaunchRequest(app_control_h request,
	app_control_reply_cb replyCallback, void* data, Evas_Object* ownerObject)
{
	if (!__send(request, replyCallback, data))
		return false;
	if (ownerObject && replyCallback)
		evas_object_event_callback_add(ownerObject, EVAS_CALLBACK_DEL, __onOwnerDeletedCb, data);
	return true;
}

void ContactsAppControlLauncher::terminate()
{
	if (!m_lastLaunched)
		return;
	int ret = app_control_send_terminate_request(m_lastLaunched);
	if (ret != APP_CONTROL_ERROR_NONE)
		WFAILED("app_control_send_terminate_request", ret);
	app_control_destroy(m_lastLaunched);
	m_lastLaunched = nullptr;
}

bool ContactsAppControlLauncher::__send(app_control_h request, app_control_reply_cb replyCallback, void* data)
{
	WPRET_VM(!request, false, "Invalid param : request");
	app_control_h launched = nullptr;
	int ret = app_control_clone(&launched, request);
	if (ret != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_clone", ret);
		return false;
	}
	ret = app_control_send_launch_request(launched, replyCallback, data);
	if (ret != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_send_launch_request", ret);
		app_control_destroy(launched);
		return false;
	}
	if (m_lastLaunched)
		app_control_destroy(m_lastLaunched);
	m_lastLaunched = launched;
	return true;
}

void ContactsAppControlLauncher::__onOwnerDeletedCb(void* data, Evas*, Evas_Object*, void*)
{
	app_control_cancel_replies(data);
}
