// The public side of launch routing (AppControlRouter.h) and the C calls
// that send, answer, cancel and terminate launch requests.
#include "AppControlRouter.h"

#include "LaunchRouter.h"

#include "ContactsDebug.h"

#include <cstring>

namespace ct::appcontrol {
namespace {

bool isKnownResult(app_control_result_e result)
{
	return result == APP_CONTROL_RESULT_APP_STARTED || result == APP_CONTROL_RESULT_SUCCEEDED ||
		result == APP_CONTROL_RESULT_FAILED || result == APP_CONTROL_RESULT_CANCELED;
}

} // namespace

int Reply::operator()(app_control_h reply, app_control_result_e result) const
{
	WPRET_VM(m_launchId == 0, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : empty reply");
	WPRET_VM(!isKnownResult(result), APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : result %d", (int)result);
	try {
		return LaunchRouter::instance().reply(m_launchId, reply, result);
	} catch (const std::bad_alloc&) {
		return APP_CONTROL_ERROR_OUT_OF_MEMORY;
	}
}

bool Reply::isPending() const
{
	return m_launchId != 0 && LaunchRouter::instance().isPending(m_launchId);
}

Registration::~Registration()
{
	reset();
}

Registration::Registration(Registration&& other) noexcept : m_id(other.m_id)
{
	other.m_id = 0;
}

Registration& Registration::operator=(Registration&& other) noexcept
{
	if (this != &other) {
		reset();
		m_id = other.m_id;
		other.m_id = 0;
	}
	return *this;
}

void Registration::reset()
{
	if (m_id)
		LaunchRouter::instance().removeHandler(m_id);
	m_id = 0;
}

Registration registerAppHandler(const std::string& appId, Handler handler, TerminateHook onTerminate)
{
	return Registration(LaunchRouter::instance().addHandler(true, appId, std::move(handler), std::move(onTerminate)));
}

Registration registerOperationHandler(const std::string& operation, Handler handler, TerminateHook onTerminate)
{
	return Registration(
			LaunchRouter::instance().addHandler(false, operation, std::move(handler), std::move(onTerminate)));
}

bool hasHandler(const std::string& appIdOrOperation)
{
	return LaunchRouter::instance().hasHandler(appIdOrOperation);
}

ScopedReplyCancel::~ScopedReplyCancel()
{
	app_control_cancel_replies(m_userData);
}

std::string LaunchRecord::extra(const std::string& key) const
{
	auto it = extras.find(key);
	return it == extras.end() || it->second.empty() ? std::string() : it->second.front();
}

size_t pendingReplies(void* userData)
{
	return LaunchRouter::instance().pendingFor(userData);
}

std::vector<LaunchRecord> launches()
{
	return LaunchRouter::instance().records();
}

void clearLaunches()
{
	LaunchRouter::instance().clearRecords();
}

void setOwnAppId(const std::string& appId)
{
	LaunchRouter::instance().setOwnAppId(appId);
}

} // namespace ct::appcontrol

using ct::appcontrol::LaunchRouter;

int app_control_send_launch_request(app_control_h app_control, app_control_reply_cb reply_cb, void* user_data)
{
	WPRET_VM(!app_control, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control");
	try {
		return LaunchRouter::instance().send(app_control, reply_cb, user_data);
	} catch (const std::bad_alloc&) {
		WFAILED("app_control_send_launch_request", APP_CONTROL_ERROR_OUT_OF_MEMORY);
		return APP_CONTROL_ERROR_OUT_OF_MEMORY;
	}
}

int app_control_send_terminate_request(app_control_h app_control)
{
	WPRET_VM(!app_control, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control");
	return LaunchRouter::instance().terminate(app_control);
}

int app_control_cancel_replies(void* user_data)
{
	return LaunchRouter::instance().cancel(user_data);
}

int app_control_reply_to_launch_request(app_control_h reply, app_control_h request, app_control_result_e result)
{
	WPRET_VM(!reply || !request, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : reply or request");
	WPRET_VM(request->launchId == 0, APP_CONTROL_ERROR_INVALID_PARAMETER, "request was not received");
	return ct::appcontrol::Reply(request->launchId)(reply, result);
}

int app_control_get_caller(app_control_h app_control, char** id)
{
	WPRET_VM(!app_control || !id, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control or id");
	*id = nullptr;
	WPRET_VM(!app_control->caller, APP_CONTROL_ERROR_INVALID_PARAMETER, "request was not received");
	*id = strdup(app_control->caller->c_str());
	return *id ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

int app_control_is_reply_requested(app_control_h app_control, bool* requested)
{
	WPRET_VM(!app_control || !requested, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : app_control or requested");
	WPRET_VM(app_control->launchId == 0, APP_CONTROL_ERROR_INVALID_PARAMETER, "request was not received");
	*requested = app_control->replyRequested;
	return APP_CONTROL_ERROR_NONE;
}
