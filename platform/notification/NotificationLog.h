// What notification_status_message_post showed, and where it shows it.
#pragma once

#include <Evas.h>

#include <string>
#include <vector>

namespace ct::notification {

// Every accepted status message since the last clear, oldest first (the newest 1000).
std::vector<std::string> postedMessages();
void clearPostedMessages();

// The window toasts appear on; nullptr stops toasts. Not owned: forgotten
// when the window is deleted, and its toast goes with it.
void setToastWindow(Evas_Object* win);
// The toast on screen now, or nullptr.
Evas_Object* currentToast();

} // namespace ct::notification
