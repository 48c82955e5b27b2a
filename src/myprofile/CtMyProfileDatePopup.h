#ifndef _CT_MY_PROFILE_DATE_POPUP_H_
#define _CT_MY_PROFILE_DATE_POPUP_H_

#include "WPopup.h"

#include <memory>

#include <ctime>
#include <functional>

class CtDatePicker;

// The date of a new event of the profile: day, month and year pickers
// (starting on today) and, where the country uses the lunar calendar, a
// button switching between the solar and the lunar calendar. Set hands over
// the date (YYYYMMDD), the calendar type (0 solar, 1 lunar) and whether the
// month is a leap month.
class CtMyProfileDatePopup : public app_assist::WPopup {
public:
	using SetCallback = std::function<void(int date, int calendarType, bool isLeapMonth)>;

	CtMyProfileDatePopup(bool lunarAllowed, SetCallback onSet);

	// The date shown, as YYYYMMDD.
	int getDate() const;
	// The solar/lunar button; null where the lunar calendar is not used.
	Evas_Object* getCalendarButton() const { return m_calendarButton; }
	bool isSolar() const { return m_isSolar; }
	CtDatePicker* getPicker() const { return __picker(); }

protected:
	~CtMyProfileDatePopup() override;

private:
	Evas_Object* __createContent(Evas_Object* parent);
	CtDatePicker* __picker() const;
	void __dateChanged();
	void __toggleCalendar();
	void __updateCalendarButton();
	void __set();
	static void __calendarBtnClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __partDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	bool m_lunarAllowed;
	SetCallback m_onSet;
	std::weak_ptr<app_assist::WControl> m_picker;
	Evas_Object* m_calendarButton = nullptr;
	bool m_isSolar = true;
	bool m_isLeapMonth = false;
};

#endif
