// In-process routing of app-control launch requests: the host and tests
// register handlers by application id or by operation; senders get the
// handler's reply on the EFL main loop. All calls belong to the main thread.
#pragma once

#include "app_control.h"

#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <vector>

namespace ct::appcontrol {

// Answers one received request. Copyable; may be kept and called later from
// the main loop. Only the first answer counts; later ones return
// INVALID_PARAMETER. An answer the sender no longer waits for (it cancelled,
// or asked for no reply) succeeds and is dropped.
class Reply {
public:
	Reply() = default;
	explicit Reply(uint64_t launchId) : m_launchId(launchId) {}

	// `reply` may be null (a reply with no data); its content is copied.
	int operator()(app_control_h reply, app_control_result_e result) const;
	// Whether the request is still unanswered and not terminated.
	bool isPending() const;

private:
	uint64_t m_launchId = 0;
};

// Runs inside app_control_send_launch_request with a copy of the request that
// lives until the handler returns (clone it to keep it; clones can still be
// answered with app_control_reply_to_launch_request). A non-zero return is
// the error the sender gets, e.g. APP_CONTROL_ERROR_LAUNCH_REJECTED.
using Handler = std::function<int(app_control_h request, const Reply& reply)>;
// Called when the sender terminates what it launched.
using TerminateHook = std::function<void()>;

// Keeps a handler registered while it lives.
class Registration {
public:
	Registration() = default;
	explicit Registration(uint64_t id) : m_id(id) {}
	~Registration();
	Registration(Registration&& other) noexcept;
	Registration& operator=(Registration&& other) noexcept;
	Registration(const Registration&) = delete;
	Registration& operator=(const Registration&) = delete;

	void reset();
	bool isActive() const { return m_id != 0; }

private:
	uint64_t m_id = 0;
};

// A request with an application id goes to the newest handler of that id;
// one without goes to the newest handler of its operation.
Registration registerAppHandler(const std::string& appId, Handler handler, TerminateHook onTerminate = {});
Registration registerOperationHandler(const std::string& operation, Handler handler,
		TerminateHook onTerminate = {});

// Whether a handler is registered for `appIdOrOperation` (an application id
// or an operation): whether such an application is installed.
bool hasHandler(const std::string& appIdOrOperation);

// Cancels the pending replies of one user data when it dies (calls
// app_control_cancel_replies in the destructor).
class ScopedReplyCancel {
public:
	explicit ScopedReplyCancel(void* userData) : m_userData(userData) {}
	~ScopedReplyCancel();
	ScopedReplyCancel(const ScopedReplyCancel&) = delete;
	ScopedReplyCancel& operator=(const ScopedReplyCancel&) = delete;

private:
	void* m_userData;
};

// Replies still to come to `userData`: unanswered launches and answers
// queued for the main loop. A dying sender must leave 0 after cancelling.
size_t pendingReplies(void* userData);

// What was sent, for tests and diagnostics.
struct LaunchRecord {
	std::string appId;
	std::string operation;
	std::string uri;
	std::string mime;
	app_control_launch_mode_e launchMode = APP_CONTROL_LAUNCH_MODE_SINGLE;
	std::map<std::string, std::vector<std::string>> extras;
	bool replyRequested = false;
	bool terminated = false;

	// The first value of `key`, or "" when absent.
	std::string extra(const std::string& key) const;
};

// Launches routed to a handler since the last clear, oldest first (the newest 1000).
std::vector<LaunchRecord> launches();
void clearLaunches();

// The id given as caller of the requests this process sends (CONTACTS_APP_ID by default).
void setOwnAppId(const std::string& appId);

} // namespace ct::appcontrol
