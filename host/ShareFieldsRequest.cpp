#include "ShareFieldsRequest.h"

#include "ContactsDebug.h"

#include <notification.h>

#include <cstdio>
#include <cstdlib>

namespace ct::demo {

namespace {

const char* const kResultKey = "person_info";

} // namespace

ShareFieldsRequest::ShareFieldsRequest()
	: m_gadget("share-fields", [this](app_control_h result) { __onResult(result); })
{
	m_request.ug = m_gadget.handle();
	m_request.callerAppId = "contacts-demo";
}

std::string ShareFieldsRequest::describe(const std::string& text)
{
	return text.empty() ? "Shared: nothing" : "Shared:\n" + text;
}

void ShareFieldsRequest::__onResult(app_control_h result)
{
	char* text = nullptr;
	if (app_control_get_extra_data(result, kResultKey, &text) != APP_CONTROL_ERROR_NONE)
		text = nullptr;
	m_lastText = text ? text : "";
	free(text);
	std::string notice = describe(m_lastText);
	printf("%s\n", notice.c_str());
	fflush(stdout);
	if (notification_status_message_post(notice.c_str()) != NOTIFICATION_ERROR_NONE)
		WWARNING("notification_status_message_post() Failed");
}

} // namespace ct::demo
