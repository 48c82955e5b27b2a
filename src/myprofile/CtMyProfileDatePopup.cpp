#include "CtMyProfileDatePopup.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtDatePicker.h"

#include <ui_extension.h>

namespace {

struct tm withWeekDays(struct tm tm)
{
	tm.tm_hour = 12;
	tm.tm_min = tm.tm_sec = 0;
	tm.tm_isdst = -1;
	mktime(&tm);
	return tm;
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
	if (m_calendarButton)
		evas_object_event_callback_del_full(m_calendarButton, EVAS_CALLBACK_DEL, __partDelCb, this);
}

Evas_Object* CtMyProfileDatePopup::__createContent(Evas_Object* parent)
{
	auto* picker = new CtDatePicker(CtDatePicker::today());
	m_picker = picker->getWeakPtr();
	picker->setChangedCallback([this] { __dateChanged(); });
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/contacts.edj", "popup_input_date");
	if (!layout) {
		WERROR("ctCommonCreateLayout() is fail");
		picker->create(parent, nullptr);
		return picker->getEvasObj();
	}
	picker->create(layout, nullptr);
	elm_object_part_content_set(layout, "elm.swallow.content", picker->getEvasObj());
	if (!m_lunarAllowed)
		return layout;
	m_calendarButton = uxt_button_add(layout, "on_gradient_bg");
	evas_object_smart_callback_add(m_calendarButton, "clicked", __calendarBtnClickedCb, this);
	evas_object_event_callback_add(m_calendarButton, EVAS_CALLBACK_DEL, __partDelCb, this);
	elm_object_part_content_set(layout, "elm.button", m_calendarButton);
	__updateCalendarButton();
	return layout;
}

CtDatePicker* CtMyProfileDatePopup::__picker() const
{
	return static_cast<CtDatePicker*>(m_picker.lock().get());
}

int CtMyProfileDatePopup::getDate() const
{
	CtDatePicker* picker = __picker();
	struct tm date = picker ? picker->getDate() : CtDatePicker::today();
	return (date.tm_year + 1900) * 10000 + (date.tm_mon + 1) * 100 + date.tm_mday;
}

// A lunar month may be a leap one.
void CtMyProfileDatePopup::__dateChanged()
{
	CtDatePicker* picker = __picker();
	if (!m_isSolar && picker) {
		struct tm date = picker->getDate();
		m_isLeapMonth = uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &date) == 1;
	}
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
	CtDatePicker* picker = __picker();
	WPRET_M(!picker, "picker is NULL");
	struct tm shown = withWeekDays(picker->getDate());
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
	picker->setDate(converted);
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

void CtMyProfileDatePopup::__partDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtMyProfileDatePopup*>(data);
	for (Evas_Object** part : {&self->m_calendarButton})
		if (*part == obj)
			*part = nullptr;
}
