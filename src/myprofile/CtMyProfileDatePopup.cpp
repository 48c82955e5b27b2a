#include "CtMyProfileDatePopup.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

#include <ui_extension.h>
#include <vconf.h>

#include <cstdlib>
#include <ctime>
#include <string>

// The datetime is a clock that keeps showing the current time unless paused
// (a beta interface of the toolkit, declared here).
extern "C" EAPI void efl_ui_clock_pause_set(Eo* obj, Eina_Bool paused);

namespace {

std::string readVconf(const char* key)
{
	char* value = vconf_get_str(key);
	std::string out(value ? value : "");
	free(value);
	return out;
}

// The datetime only takes a date whose week and year days are filled in.
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

void followRegionFormat(Evas_Object* datetime)
{
	std::string region = readVconf(VCONFKEY_REGIONFORMAT);
	int time1224 = 0;
	if (vconf_get_int(VCONFKEY_REGIONFORMAT_TIME1224, &time1224) < 0)
		WERROR("ret < 0");
	else if (region.empty())
		WERROR("regionFmt is NULL");
	else
		uxt_date_time_set_format_by_locale(datetime, region.c_str());
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
	for (Evas_Object* part : {m_datetime, m_calendarButton})
		if (part)
			evas_object_event_callback_del_full(part, EVAS_CALLBACK_DEL, __partDelCb, this);
}

Evas_Object* CtMyProfileDatePopup::__createContent(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/contacts.edj", "popup_input_date");
	WPRET_VM(!layout, __createDatetime(parent), "ctCommonCreateLayout() is fail");
	elm_object_part_content_set(layout, "elm.swallow.content", __createDatetime(layout));
	if (!m_lunarAllowed)
		return layout;
	m_calendarButton = uxt_button_add(layout, "on_gradient_bg");
	evas_object_smart_callback_add(m_calendarButton, "clicked", __calendarBtnClickedCb, this);
	evas_object_event_callback_add(m_calendarButton, EVAS_CALLBACK_DEL, __partDelCb, this);
	elm_object_part_content_set(layout, "elm.button", m_calendarButton);
	__updateCalendarButton();
	return layout;
}

Evas_Object* CtMyProfileDatePopup::__createDatetime(Evas_Object* parent)
{
	m_datetime = elm_datetime_add(parent);
	efl_ui_clock_pause_set(m_datetime, EINA_TRUE);
	elm_datetime_field_visible_set(m_datetime, ELM_DATETIME_HOUR, EINA_FALSE);
	elm_datetime_field_visible_set(m_datetime, ELM_DATETIME_MINUTE, EINA_FALSE);
	elm_datetime_field_visible_set(m_datetime, ELM_DATETIME_AMPM, EINA_FALSE);
	followRegionFormat(m_datetime);
	uxt_theme_object_replace_color(m_datetime, "B0211", "transparent");
	struct tm start = today();
	elm_datetime_value_set(m_datetime, &start);
	evas_object_smart_callback_add(m_datetime, "changed", __datetimeChangedCb, this);
	evas_object_event_callback_add(m_datetime, EVAS_CALLBACK_DEL, __partDelCb, this);
	return m_datetime;
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
	WPRET_M(!m_datetime, "datetime is NULL");
	struct tm shown = {};
	elm_datetime_value_get(m_datetime, &shown);
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
	evas_object_smart_callback_del_full(m_datetime, "changed", __datetimeChangedCb, this);
	converted = withWeekDays(converted);
	elm_datetime_value_set(m_datetime, &converted);
	evas_object_smart_callback_add(m_datetime, "changed", __datetimeChangedCb, this);
	__updateCalendarButton();
}

void CtMyProfileDatePopup::__set()
{
	WPRET_M(!m_datetime || !m_onSet, "datetime is NULL");
	struct tm value = {};
	elm_datetime_value_get(m_datetime, &value);
	int date = (value.tm_year + 1900) * 10000 + (value.tm_mon + 1) * 100 + value.tm_mday;
	m_onSet(date, m_isSolar ? 0 : 1, !m_isSolar && m_isLeapMonth);
}

void CtMyProfileDatePopup::__calendarBtnClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtMyProfileDatePopup*>(data)->__toggleCalendar();
}

void CtMyProfileDatePopup::__datetimeChangedCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtMyProfileDatePopup*>(data);
	if (self->m_isSolar)
		return;
	struct tm value = {};
	elm_datetime_value_get(obj, &value);
	self->m_isLeapMonth = uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &value) == 1;
}

void CtMyProfileDatePopup::__partDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtMyProfileDatePopup*>(data);
	if (self->m_datetime == obj)
		self->m_datetime = nullptr;
	if (self->m_calendarButton == obj)
		self->m_calendarButton = nullptr;
}
