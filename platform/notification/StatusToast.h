// The one transient toast of the host window: a new message replaces the
// shown one; it disappears after its timeout or when the window dies.
#pragma once

#include <Evas.h>

#include <string>

namespace ct::notification {

class StatusToast {
public:
	static constexpr double kTimeout = 2.0;

	static StatusToast& instance();

	void setWindow(Evas_Object* win);
	Evas_Object* window() const { return m_window; }
	Evas_Object* popup() const { return m_popup; }
	// False when there is no window to show it on.
	bool show(const std::string& text);

private:
	StatusToast() = default;
	void __forgetWindow();
	void __removePopup();

	static void __onWindowDelCb(void* data, Evas* e, Evas_Object* obj, void* info);
	static void __onPopupDelCb(void* data, Evas* e, Evas_Object* obj, void* info);
	static void __onTimeoutCb(void* data, Evas_Object* obj, void* info);

	Evas_Object* m_window = nullptr;
	Evas_Object* m_popup = nullptr;
};

} // namespace ct::notification
