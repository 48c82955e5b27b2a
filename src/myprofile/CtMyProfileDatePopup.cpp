#include "CtMyProfileDatePopup.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

#include <ui_extension.h>

namespace {

constexpr int kFirstYear = 1902;
constexpr int kLastYear = 2037;
constexpr int kSpinnerWidth = 84;

int daysInMonth(int year, int month)
{
	static const int days[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
	bool leap = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
	return month == 2 && leap ? 29 : days[month - 1];
}

struct tm withWeekDays(struct tm tm)
{
	tm.tm_hour = 12;
	tm.tm_min = tm.tm_sec = 0;
	tm.tm_isdst = -1;
	mktime(&tm);
	return tm;
}

struct tm today()
{
	time_t now = time(nullptr);
	struct tm tm = {};
	localtime_r(&now, &tm);
	return withWeekDays(tm);
}

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

} // namespace

CtMyProfileDatePopup::CtMyProfileDatePopup(bool lunarAllowed, SetCallback onSet)
	: m_lunarAllowed(lunarAllowed), m_onSet(std::move(onSet))
{
	setTextTranslatable("contacts");
	setTitle("IDS_ST_BODY_SET_DATE");
	setContent([this](Evas_Object* parent) { return __createContent(parent); });
	addButton("IDS_PB_BUTTON_CANCEL", nullptr);
	addButton("IDS_PB_SK_SET", [this](bool*) { __set(); });
}

CtMyProfileDatePopup::~CtMyProfileDatePopup()
{
	for (Evas_Object* part : {m_day, m_month, m_year, m_calendarButton})
		if (part)
			evas_object_event_callback_del_full(part, EVAS_CALLBACK_DEL, __partDelCb, this);
}

Evas_Object* CtMyProfileDatePopup::__createContent(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/contacts.edj", "popup_input_date");
	WPRET_VM(!layout, __createPicker(parent), "ctCommonCreateLayout() is fail");
	elm_object_part_content_set(layout, "elm.swallow.content", __createPicker(layout));
	if (!m_lunarAllowed)
		return layout;
	m_calendarButton = uxt_button_add(layout, "on_gradient_bg");
	evas_object_smart_callback_add(m_calendarButton, "clicked", __calendarBtnClickedCb, this);
	evas_object_event_callback_add(m_calendarButton, EVAS_CALLBACK_DEL, __partDelCb, this);
	elm_object_part_content_set(layout, "elm.button", m_calendarButton);
	__updateCalendarButton();
	return layout;
}

Evas_Object* CtMyProfileDatePopup::__createPicker(Evas_Object* parent)
{
	Evas_Object* box = elm_box_add(parent);
	elm_box_horizontal_set(box, EINA_TRUE);
	elm_box_padding_set(box, ELM_SCALE_SIZE(8), 0);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, EVAS_HINT_FILL);
	struct tm start = today();
	m_day = __addSpinner(box, 1, 31, start.tm_mday);
	m_month = __addSpinner(box, 1, 12, start.tm_mon + 1);
	for (int month = 1; month <= 12; ++month)
		elm_spinner_special_value_add(m_month, month, monthName(month).c_str());
	m_year = __addSpinner(box, kFirstYear, kLastYear, start.tm_year + 1900);
	evas_object_show(box);
	return box;
}

Evas_Object* CtMyProfileDatePopup::__addSpinner(Evas_Object* box, int min, int max, int value)
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
	evas_object_event_callback_add(spinner, EVAS_CALLBACK_DEL, __partDelCb, this);
	elm_box_pack_end(box, spinner);
	evas_object_show(spinner);
	return spinner;
}

int CtMyProfileDatePopup::getDate() const
{
	struct tm date = __shownDate();
	return (date.tm_year + 1900) * 10000 + (date.tm_mon + 1) * 100 + date.tm_mday;
}

struct tm CtMyProfileDatePopup::__shownDate() const
{
	struct tm date = {};
	if (!m_day || !m_month || !m_year)
		return today();
	date.tm_year = static_cast<int>(elm_spinner_value_get(m_year)) - 1900;
	date.tm_mon = static_cast<int>(elm_spinner_value_get(m_month)) - 1;
	date.tm_mday = static_cast<int>(elm_spinner_value_get(m_day));
	return date;
}

void CtMyProfileDatePopup::__showDate(const struct tm& date)
{
	WPRET_M(!m_day || !m_month || !m_year, "picker is NULL");
	for (Evas_Object* spinner : {m_day, m_month, m_year})
		evas_object_smart_callback_del_full(spinner, "changed", __spinnerChangedCb, this);
	elm_spinner_value_set(m_year, date.tm_year + 1900);
	elm_spinner_value_set(m_month, date.tm_mon + 1);
	elm_spinner_value_set(m_day, date.tm_mday);
	for (Evas_Object* spinner : {m_day, m_month, m_year})
		evas_object_smart_callback_add(spinner, "changed", __spinnerChangedCb, this);
}

// No 31 February: the day follows the month; a lunar month may be a leap one.
void CtMyProfileDatePopup::__dateChanged()
{
	struct tm date = __shownDate();
	int lastDay = daysInMonth(date.tm_year + 1900, date.tm_mon + 1);
	if (date.tm_mday > lastDay) {
		date.tm_mday = lastDay;
		__showDate(date);
	}
	if (!m_isSolar)
		m_isLeapMonth = uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &date) == 1;
}

// The button names the calendar the picker shows.
void CtMyProfileDatePopup::__updateCalendarButton()
{
	if (m_calendarButton)
		elm_object_domain_translatable_text_set(m_calendarButton, "contacts",
			m_isSolar ? "IDS_PB_ACBUTTON_SOLAR_ABB" : "IDS_PB_ACBUTTON_LUNAR_ABB");
}

void CtMyProfileDatePopup::__toggleCalendar()
{
	struct tm shown = withWeekDays(__shownDate());
	struct tm converted = {};
	int err;
	if (m_isSolar) {
		int leap = 0;
		err = uxt_util_convert_gregorian_time_to_lunar_time(UXT_CALENDAR_LUNAR_CHINESE, &shown, &converted, &leap);
		if (err == UXT_ERROR_NONE)
			m_isLeapMonth = leap == 1;
	} else {
		err = uxt_util_convert_lunar_time_to_gregorian_time(UXT_CALENDAR_LUNAR_CHINESE, &shown, m_isLeapMonth,
			&converted);
	}
	if (err != UXT_ERROR_NONE) {
		WFAILED(m_isSolar ? "uxt_util_convert_gregorian_time_to_lunar_time"
			: "uxt_util_convert_lunar_time_to_gregorian_time", err);
		return;
	}
	m_isSolar = !m_isSolar;
	__showDate(converted);
	__updateCalendarButton();
}

void CtMyProfileDatePopup::__set()
{
	WPRET_M(!m_onSet, "data is NULL");
	m_onSet(getDate(), m_isSolar ? 0 : 1, !m_isSolar && m_isLeapMonth);
}

void CtMyProfileDatePopup::__calendarBtnClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtMyProfileDatePopup*>(data)->__toggleCalendar();
}

void CtMyProfileDatePopup::__spinnerChangedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtMyProfileDatePopup*>(data)->__dateChanged();
}

void CtMyProfileDatePopup::__partDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtMyProfileDatePopup*>(data);
	for (Evas_Object** part : {&self->m_day, &self->m_month, &self->m_year, &self->m_calendarButton})
		if (*part == obj)
			*part = nullptr;
}
