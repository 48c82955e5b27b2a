// A transient notice: shows its text for a few seconds and closes itself.
#pragma once

#include "WPopup.h"

namespace app_assist {

class WToastPopup : public WPopup {
public:
	explicit WToastPopup(const char* text, double seconds = kDefaultSeconds);

	const char* getClassName() override;
	const char* getText() const { return m_toastText.c_str(); }

	static constexpr double kDefaultSeconds = 2.0;

protected:
	~WToastPopup() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;

private:
	static void __timeoutCb(void* data, Evas_Object* obj, void* eventInfo);

	std::string m_toastText;
	double m_seconds;
};

} // namespace app_assist
