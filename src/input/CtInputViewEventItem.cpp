#include "CtInputViewEventItem.h"

#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtDatePicker.h"
#include "CtInputDataTypeCustomPopup.h"
#include "WPopup.h"

#include <ui_extension.h>
#include <vconf.h>

#include <cstdlib>
#include <cstring>
#include <string>

namespace {

const int kFirstShownYear = 1902;

int daysInMonth(int year, int month)
{
	static const int days[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
	bool leap = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
	return month == 2 && leap ? 29 : days[month - 1];
}

std::string readVconf(const char* key)
{
	char* value = vconf_get_str(key);
	std::string out(value ? value : "");
	free(value);
	return out;
}

// The lunar conversion takes a date whose week and year days are filled in.
struct tm withWeekDays(struct tm tm)
{
	tm.tm_hour = 12;
	tm.tm_min = tm.tm_sec = 0;
	tm.tm_isdst = -1;
	mktime(&tm);
	return tm;
}

void untrackCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto** slot = static_cast<Evas_Object**>(data);
	if (*slot == obj)
		*slot = nullptr;
}

// Keeps `*slot` pointing at `obj` until it dies (the slot outlives it: it is a row member
// and the row removes the callback in its destructor).
void track(Evas_Object** slot, Evas_Object* obj)
{
	*slot = obj;
	evas_object_event_callback_add(obj, EVAS_CALLBACK_DEL, untrackCb, slot);
}

void untrack(Evas_Object** slot)
{
	if (*slot)
		evas_object_event_callback_del_full(*slot, EVAS_CALLBACK_DEL, untrackCb, slot);
	*slot = nullptr;
}

} // namespace

CtInputViewEventItem::CtInputViewEventItem(std::shared_ptr<CtData> data, contacts_record_h record,
		const char* initialText, std::shared_ptr<bool> hasBirthday, CtInputViewItemCallbacks callbacks,
		std::function<void()> typesChanged)
	: CtInputViewGenlistItem(initialText), m_data(std::move(data)), m_record(record),
	  m_hasBirthday(hasBirthday ? std::move(hasBirthday) : std::make_shared<bool>(false)),
	  m_callbacks(std::move(callbacks)), m_typesChanged(std::move(typesChanged))
{
	updateChangedState(initialText);
}

CtInputViewEventItem::~CtInputViewEventItem()
{
	for (const auto& popup : {m_datePopup, m_customPopup})
		if (auto alive = popup.lock())
			alive->destroy();
	for (Evas_Object** slot : {&m_dateButton, &m_hoversel, &m_calendarButton})
		untrack(slot);
}

Elm_Genlist_Item_Class* CtInputViewEventItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.3icon.1");
	return itc;
}

bool CtInputViewEventItem::isLunarSupported()
{
	std::string country = readVconf(VCONFKEY_CSC_COUNTRY_ISO);
	return country == "CN" || country == "KR";
}

bool CtInputViewEventItem::__isProfileSharingStorage()
{
	const char* name = m_data->getAddressbookName();
	return name && strcmp(name, translate("IDS_PB_MBODY_PROFILE_SHARING")) == 0;
}

int CtInputViewEventItem::__getType()
{
	return m_data->getDataType(m_record, _contacts_event.type);
}

std::string CtInputViewEventItem::getDateText()
{
	int date = m_data->getEventEvent(m_record);
	if (date == 0)
		return translate("IDS_ST_BODY_SET_DATE"); // a new event waiting for its date
	int year = date / 10000, month = date % 10000 / 100, day = date % 100;
	if (date < 0 || month < 1 || month > 12 || day < 1 || day > 31) {
		WERROR("Invalid date(mon=%d,day=%d)", month, day);
		return translate("IDS_ST_BODY_SET_DATE");
	}
	struct tm tm = {};
	tm.tm_year = (year ? year : 2000) - 1900; // a leap year, so that 29 February stays valid
	tm.tm_mon = month - 1;
	tm.tm_mday = day;
	int format = year ? UXT_DATE_FORMAT_DATE_WITH_YEAR : UXT_DATE_FORMAT_DATE_WITHOUT_YEAR;
	char* text = uxt_util_get_date_time_text_by_locale(readVconf(VCONFKEY_REGIONFORMAT).c_str(), &tm, format);
	std::string out(text ? text : "");
	free(text);
	return out;
}

void CtInputViewEventItem::updateDateText()
{
	if (m_dateButton)
		elm_object_text_set(m_dateButton, getDateText().c_str());
}

struct tm CtInputViewEventItem::popupStartDate(int date)
{
	int year = date / 10000, month = date % 10000 / 100, day = date % 100;
	struct tm tm = {};
	year = year < kFirstShownYear ? kFirstShownYear : year;
	month = month < 1 ? 1 : month > 12 ? 12 : month;
	int lastDay = daysInMonth(year, month);
	day = day < 1 ? 1 : day > lastDay ? lastDay : day;
	tm.tm_year = year - 1900;
	tm.tm_mon = month - 1;
	tm.tm_mday = day;
	return withWeekDays(tm);
}

Evas_Object* CtInputViewEventItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.entry") == 0)
		return __createDateButton(genlist);
	if (strcmp(part, "elm.icon.1") == 0)
		return __createSelector(genlist);
	if (strcmp(part, "elm.icon.2") == 0)
		return ctCommonCreateDeleteImage(genlist, __deleteClickedCb, this);
	return nullptr;
}

Evas_Object* CtInputViewEventItem::__createDateButton(Evas_Object* genlist)
{
	Evas_Object* button = uxt_button_add(genlist, "datetime");
	WPRET_VM(!button, nullptr, "button is NULL");
	elm_object_text_set(button, getDateText().c_str());
	evas_object_smart_callback_add(button, "clicked", __dateClickedCb, this);
	if (__isProfileSharingStorage())
		elm_object_disabled_set(button, EINA_TRUE);
	untrack(&m_dateButton);
	track(&m_dateButton, button);
	return button;
}

Evas_Object* CtInputViewEventItem::__createSelector(Evas_Object* genlist)
{
	Evas_Object* layout = CtInputViewTypeSelector::create(genlist, genlist, __getTypeLabel(), this,
			[this] { return __getTypeChoices(); }, [this](int value) { selectType(value); });
	WPRET_VM(!layout, nullptr, "layout is NULL");
	Evas_Object* hoversel = CtInputViewTypeSelector::getHoversel(layout);
	if (__isProfileSharingStorage())
		elm_object_disabled_set(hoversel, EINA_TRUE);
	untrack(&m_hoversel);
	track(&m_hoversel, hoversel);
	return layout;
}

std::vector<CtInputViewTypeSelector::Choice> CtInputViewEventItem::__getTypeChoices()
{
	std::vector<CtInputViewTypeSelector::Choice> choices;
	int type = __getType();
	const char* label = m_data->getDataTypeCustom(m_record, _contacts_event.label);
	if (type == CONTACTS_EVENT_TYPE_CUSTOM && label && *label)
		choices.push_back({label, -1});
	if (!*m_hasBirthday || type == CONTACTS_EVENT_TYPE_BIRTH)
		choices.push_back({translate("IDS_PB_OPT_BIRTHDAY"), CONTACTS_EVENT_TYPE_BIRTH});
	choices.push_back({translate("IDS_PB_OPT_ANNIVERSARY_ABB"), CONTACTS_EVENT_TYPE_ANNIVERSARY});
	choices.push_back({translate("IDS_PB_OPT_OTHER"), CONTACTS_EVENT_TYPE_OTHER});
	choices.push_back({translate("IDS_PB_OPT_CUSTOM"), CONTACTS_EVENT_TYPE_CUSTOM});
	return choices;
}

std::string CtInputViewEventItem::__getTypeLabel()
{
	const char* label = CtCommonGetEventTypeStr(m_record, __getType());
	return label ? label : "";
}

void CtInputViewEventItem::selectType(int type)
{
	if (type < 0)
		return;
	if (type == CONTACTS_EVENT_TYPE_CUSTOM) {
		app_assist::WControl* view = getAttachedView();
		WPRET_M(!view, "view is NULL");
		auto* popup = new CtInputDataTypeCustomPopup();
		popup->setResultCallback([this](const char* label) { setCustomType(label); });
		view->attachPopup(popup);
		m_customPopup = popup->getWeakPtr();
		return;
	}
	setIsChanged(true);
	int previous = __getType();
	if (type == CONTACTS_EVENT_TYPE_BIRTH)
		*m_hasBirthday = true;
	else if (previous == CONTACTS_EVENT_TYPE_BIRTH)
		*m_hasBirthday = false;
	m_data->setEventType(m_record, type, nullptr);
	if (m_hoversel)
		CtInputViewTypeSelector::setLabel(m_hoversel, __getTypeLabel());
	if (m_callbacks.changed)
		m_callbacks.changed();
	__notifyTypesChanged();
}

void CtInputViewEventItem::setCustomType(const char* label)
{
	WPRET_M(!label || !*label, "label is NULL");
	setIsChanged(true);
	if (__getType() == CONTACTS_EVENT_TYPE_BIRTH)
		*m_hasBirthday = false;
	m_data->setEventType(m_record, CONTACTS_EVENT_TYPE_CUSTOM, label);
	if (m_hoversel)
		CtInputViewTypeSelector::setLabel(m_hoversel, __getTypeLabel());
	if (m_callbacks.changed)
		m_callbacks.changed();
	__notifyTypesChanged();
}

void CtInputViewEventItem::__notifyTypesChanged()
{
	Elm_Object_Item* item = getElmObjectItem();
	if (!m_typesChanged || !item)
		return;
	// The owner rebuilds the rows, this one's menu included: not from inside its callback.
	std::function<void()> typesChanged = m_typesChanged;
	app_assist::WUiTimer::addIdler([typesChanged](void*) {
		typesChanged();
		return false;
	}, nullptr, elm_object_item_widget_get(item));
}

void CtInputViewEventItem::deleteRow()
{
	Elm_Object_Item* item = getElmObjectItem();
	WPRET_M(!item, "item is NULL");
	updateChangedState(nullptr);
	if (m_callbacks.deleted)
		m_callbacks.deleted(item, getIsChanged(), m_record);
	elm_object_item_del(item); // deletes this row
}

void CtInputViewEventItem::openDatePopup()
{
	if (auto open = m_datePopup.lock())
		open->destroy();
	app_assist::WControl* view = getAttachedView();
	WPRET_M(!view, "view is NULL");
	auto* popup = new app_assist::WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_ST_BODY_SET_DATE");
	popup->setContent([this](Evas_Object* parent) { return __createDatePopupContent(parent); });
	popup->addButton("IDS_PB_BUTTON_CANCEL", nullptr);
	popup->addButton("IDS_PB_SK_SET", [this](bool*) { __setDate(); });
	view->attachPopup(popup);
	m_datePopup = popup->getWeakPtr();
}

Evas_Object* CtInputViewEventItem::__createDatePopupContent(Evas_Object* parent)
{
	int date = m_data->getEventEvent(m_record);
	bool lunar = isLunarSupported();
	m_isSolar = !lunar || m_data->getCalendarType(m_record) == 0;
	m_isLeapMonth = !m_isSolar && m_data->getIsLeapMonth(m_record);
	struct tm start = popupStartDate(date);
	if (m_isLeapMonth && uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &start) != 1)
		m_isLeapMonth = false; // no such leap month that year: keep the ordinary month

	Evas_Object* layout = lunar ? ctCommonCreateLayout(parent, "contacts/contacts.edj", "popup_input_date") : nullptr;
	auto* picker = new CtDatePicker(start);
	picker->setChangedCallback([this] { __onPickerChanged(); });
	picker->create(layout ? layout : parent, nullptr);
	m_datePicker = picker->getWeakPtr();
	untrack(&m_calendarButton);
	if (!layout)
		return picker->getEvasObj();
	elm_object_part_content_set(layout, "elm.swallow.content", picker->getEvasObj());
	Evas_Object* button = uxt_button_add(layout, "on_gradient_bg");
	evas_object_smart_callback_add(button, "clicked", __calendarClickedCb, this);
	elm_object_part_content_set(layout, "elm.button", button);
	track(&m_calendarButton, button);
	__updateCalendarButton();
	return layout;
}

void CtInputViewEventItem::__updateCalendarButton()
{
	if (m_calendarButton)
		elm_object_domain_translatable_text_set(m_calendarButton, "contacts",
				m_isSolar ? "IDS_PB_ACBUTTON_SOLAR_ABB" : "IDS_PB_ACBUTTON_LUNAR_ABB");
}

CtDatePicker* CtInputViewEventItem::__datePicker() const
{
	return static_cast<CtDatePicker*>(m_datePicker.lock().get());
}

void CtInputViewEventItem::__toggleCalendar()
{
	CtDatePicker* picker = __datePicker();
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
		WFAILED(m_isSolar ? "uxt_util_convert_gregorian_time_to_lunar_time" : "uxt_util_convert_lunar_time_to_gregorian_time", err);
		return;
	}
	m_isSolar = !m_isSolar;
	picker->setDate(converted);
	__updateCalendarButton();
}

void CtInputViewEventItem::__setDate()
{
	CtDatePicker* picker = __datePicker();
	WPRET_M(!picker, "picker is NULL");
	if (isLunarSupported()) {
		m_data->setCalendarType(m_record, m_isSolar ? 0 : 1);
		if (!m_isSolar)
			m_data->setIsLeapMonth(m_record, m_isLeapMonth);
	}
	struct tm value = picker->getDate();
	int date = (value.tm_year + 1900) * 10000 + (value.tm_mon + 1) * 100 + value.tm_mday;
	m_data->setEventEvent(m_record, date);
	updateDateText();
	updateChangedState(std::to_string(date).c_str());
	if (m_callbacks.changed)
		m_callbacks.changed();
}

void CtInputViewEventItem::__dateClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputViewEventItem*>(data)->openDatePopup();
}

void CtInputViewEventItem::__calendarClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputViewEventItem*>(data)->__toggleCalendar();
}

void CtInputViewEventItem::__onPickerChanged()
{
	CtDatePicker* picker = __datePicker();
	if (m_isSolar || !picker)
		return;
	struct tm value = picker->getDate();
	m_isLeapMonth = uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &value) == 1;
}

void CtInputViewEventItem::__deleteClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputViewEventItem*>(data)->deleteRow();
}
