// The record of status messages and notification_status_message_post.
#include "NotificationLog.h"

#include "StatusToast.h"
#include "notification.h"

#include "ContactsDebug.h"

#include <Eina.h>
#include <glib.h>

#include <cstring>
#include <deque>
#include <mutex>

namespace ct::notification {
namespace {

const size_t kMaxKept = 1000;

std::mutex g_mutex;

std::deque<std::string>& messages()
{
	static auto* kept = new std::deque<std::string>;
	return *kept;
}

void keep(const std::string& text)
{
	std::lock_guard<std::mutex> lock(g_mutex);
	messages().push_back(text);
	if (messages().size() > kMaxKept)
		messages().pop_front();
}

} // namespace

std::vector<std::string> postedMessages()
{
	std::lock_guard<std::mutex> lock(g_mutex);
	return {messages().begin(), messages().end()};
}

void clearPostedMessages()
{
	std::lock_guard<std::mutex> lock(g_mutex);
	messages().clear();
}

void setToastWindow(Evas_Object* win)
{
	StatusToast::instance().setWindow(win);
}

Evas_Object* currentToast()
{
	return StatusToast::instance().popup();
}

} // namespace ct::notification

int notification_status_message_post(const char* message)
{
	WPRET_VM(!message || !message[0], NOTIFICATION_ERROR_INVALID_PARAMETER, "Invalid param : message");
	size_t length = strnlen(message, NOTIFICATION_MAX_MESSAGE_LENGTH + 1);
	WPRET_VM(length > NOTIFICATION_MAX_MESSAGE_LENGTH, NOTIFICATION_ERROR_INVALID_PARAMETER,
			"Invalid param : message longer than %d bytes", NOTIFICATION_MAX_MESSAGE_LENGTH);
	WPRET_VM(!g_utf8_validate(message, (gssize)length, nullptr), NOTIFICATION_ERROR_INVALID_PARAMETER,
			"Invalid param : message is not UTF-8");
	try {
		ct::notification::keep(message);
	} catch (const std::bad_alloc&) {
		return NOTIFICATION_ERROR_OUT_OF_MEMORY;
	}
	// Widgets belong to the main loop; elsewhere the message is only logged.
	bool shown = eina_main_loop_is() && ct::notification::StatusToast::instance().show(message);
	if (!shown)
		WINFO("status message: %s", message);
	return NOTIFICATION_ERROR_NONE;
}
