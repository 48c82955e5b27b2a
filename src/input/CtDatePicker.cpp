#include "CtDatePicker.h"

#include "ContactsDebug.h"

#include <string>

namespace {

constexpr int kFirstYear = 1902;
constexpr int kLastYear = 2037;
constexpr int kLeapYear = 2000; // the day of a date without year may be 29 February
constexpr int kSpinnerWidth = 84;

// The month's name in the user's language ("Jan", ...).
std::string monthName(int month)
{
	struct tm tm = {};
	tm.tm_year = 100;
	tm.tm_mon = month - 1;
	tm.tm_mday = 1;
	char name[64] = {0};
	strftime(name, sizeof(name), "%b", &tm);
	return name;
}

int clamp(int value, int min, int max)
{
	return value < min ? min : value > max ? max : value;
}

} // namespace

CtDatePicker::CtDatePicker(const struct tm& date, bool withYear)
	: m_start(date), m_withYear(withYear)
{
}

int CtDatePicker::daysInMonth(int year, int month)
{
	static const int days[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
	bool leap = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
	month = clamp(month, 1, 12);
	return month == 2 && leap ? 29 : days[month - 1];
}

struct tm CtDatePicker::today()
{
	time_t now = time(nullptr);
	struct tm tm = {};
	localtime_r(&now, &tm);
	tm.tm_hour = 12;
	tm.tm_min = tm.tm_sec = 0;
	tm.tm_isdst = -1;
	mktime(&tm);
	return tm;
}

Evas_Object* CtDatePicker::onCreate(Evas_Object* parent, void*)
{
	Evas_Object* box = elm_box_add(parent);
	elm_box_horizontal_set(box, EINA_TRUE);
	elm_box_padding_set(box, ELM_SCALE_SIZE(8), 0);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, EVAS_HINT_FILL);
	m_day = __addSpinner(box, 1, 31, 1);
	m_month = __addSpinner(box, 1, 12, 1);
	for (int month = 1; month <= 12; ++month)
		elm_spinner_special_value_add(m_month, month, monthName(month).c_str());
	if (m_withYear)
		m_year = __addSpinner(box, kFirstYear, kLastYear, kFirstYear);
	setDate(m_start);
	evas_object_show(box);
	return box;
}

Evas_Object* CtDatePicker::__addSpinner(Evas_Object* box, int min, int max, int value)
{
	Evas_Object* spinner = elm_spinner_add(box);
	elm_spinner_min_max_set(spinner, min, max);
	elm_spinner_step_set(spinner, 1);
	elm_spinner_wrap_set(spinner, EINA_TRUE);
	elm_spinner_label_format_set(spinner, "%.0f");
	elm_spinner_value_set(spinner, value);
	evas_object_size_hint_min_set(spinner, ELM_SCALE_SIZE(kSpinnerWidth), 0);
	evas_object_size_hint_weight_set(spinner, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(spinner, EVAS_HINT_FILL, 0.5);
	evas_object_smart_callback_add(spinner, "changed", __spinnerChangedCb, this);
	elm_box_pack_end(box, spinner);
	evas_object_show(spinner);
	return spinner;
}

struct tm CtDatePicker::getDate() const
{
	struct tm date = {};
	if (!m_day || !m_month)
		return m_start;
	date.tm_year = m_year ? static_cast<int>(elm_spinner_value_get(m_year)) - 1900 : -1900;
	date.tm_mon = static_cast<int>(elm_spinner_value_get(m_month)) - 1;
	date.tm_mday = static_cast<int>(elm_spinner_value_get(m_day));
	date.tm_hour = 12;
	return date;
}

void CtDatePicker::setDate(const struct tm& date)
{
	m_start = date;
	WPRET_M(!m_day || !m_month, "picker is not created");
	int year = m_year ? clamp(date.tm_year + 1900, kFirstYear, kLastYear) : kLeapYear;
	int month = clamp(date.tm_mon + 1, 1, 12);
	for (Evas_Object* spinner : {m_day, m_month, m_year})
		if (spinner)
			evas_object_smart_callback_del_full(spinner, "changed", __spinnerChangedCb, this);
	if (m_year)
		elm_spinner_value_set(m_year, year);
	elm_spinner_value_set(m_month, month);
	elm_spinner_value_set(m_day, clamp(date.tm_mday, 1, daysInMonth(year, month)));
	for (Evas_Object* spinner : {m_day, m_month, m_year})
		if (spinner)
			evas_object_smart_callback_add(spinner, "changed", __spinnerChangedCb, this);
}

// No 31 February: the day follows the month and the year.
void CtDatePicker::__onSpinnerChanged()
{
	struct tm date = getDate();
	int lastDay = daysInMonth(m_year ? date.tm_year + 1900 : kLeapYear, date.tm_mon + 1);
	if (date.tm_mday > lastDay) {
		date.tm_mday = lastDay;
		setDate(date);
	}
	if (m_changed)
		m_changed();
}

void CtDatePicker::__spinnerChangedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtDatePicker*>(data)->__onSpinnerChanged();
}
