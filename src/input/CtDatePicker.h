#ifndef _CT_DATE_PICKER_H_
#define _CT_DATE_PICKER_H_

#include "WControl.h"

#include <ctime>
#include <functional>

// Day, month and year spinners for the date popups (the toolkit's datetime
// needs an input module that not every system has). The day never passes the
// month's last day; the year field can be left out for dates without a year.
class CtDatePicker : public app_assist::WControl {
public:
	CtDatePicker(const struct tm& date, bool withYear = true);

	// The shown date; its year is 0 (tm_year -1900) when the year is left out.
	struct tm getDate() const;
	// Shows `date` without running the changed callback.
	void setDate(const struct tm& date);
	bool hasYear() const { return m_withYear; }
	// Runs after each change made on the spinners.
	void setChangedCallback(std::function<void()> changed) { m_changed = std::move(changed); }

	Evas_Object* getDaySpinner() const { return m_day; }
	Evas_Object* getMonthSpinner() const { return m_month; }
	// Null when the year is left out.
	Evas_Object* getYearSpinner() const { return m_year; }

	static int daysInMonth(int year, int month);
	// Today at noon, week and year days filled in.
	static struct tm today();

protected:
	~CtDatePicker() override = default;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;

private:
	Evas_Object* __addSpinner(Evas_Object* box, int min, int max, int value);
	void __onSpinnerChanged();
	static void __spinnerChangedCb(void* data, Evas_Object* obj, void* eventInfo);

	struct tm m_start;
	bool m_withYear;
	std::function<void()> m_changed;
	Evas_Object* m_day = nullptr;
	Evas_Object* m_month = nullptr;
	Evas_Object* m_year = nullptr;
};

#endif
