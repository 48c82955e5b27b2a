#include "CtDetailViewEventItem.h"

#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"

#include <cstring>

namespace {

const int kMinYear = 1902;
const size_t kMaxDateBytes = 256;
const int kMaxLunarDay = 30;

bool isLeapYear(int year)
{
	return (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
}

// Days of a solar month; a February without a year has its 29th.
int daysInMonth(int year, int month)
{
	static const int days[] = {31, 29, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
	if (month == 2 && year != 0 && !isLeapYear(year))
		return 28;
	return days[month - 1];
}

} // namespace

bool CtDetailViewEventItem::hasCalendarDate(CtDetailDataBase* data, contacts_record_h record)
{
	WPRET_VM(!data || !record, false, "Invalid param : data or record");
	int date = data->getEvent(record);
	int year = date / 10000;
	int month = date / 100 % 100;
	int day = date % 100;
	bool lunar = data->getCalendarType(record) == 1;
	bool valid = date > 0 && month >= 1 && month <= 12 && day >= 1
		&& day <= (lunar ? kMaxLunarDay : daysInMonth(year, month));
	if (!valid)
		WERROR("Invalid date(mon=%d,day=%d)", month, day);
	return valid;
}

CtDetailViewEventItem::CtDetailViewEventItem(CtDetailDataBase* data, contacts_record_h record)
	: CtDetailViewGenlistItem(data), m_record(record)
{
}

std::string CtDetailViewEventItem::getCopyText()
{
	if (!hasCalendarDate(getData(), m_record))
		return std::string();
	int date = getData()->getEvent(m_record);
	int year = date / 10000;
	int month = date / 100 % 100;
	int day = date % 100;
	std::string text = year == 0
		? CtCommonGetDatetimeStr(getData()->getTimeFormatterWithoutYear(), year, month, day)
		: CtCommonGetDatetimeStr(getData()->getTimeFormatter(), std::max(year, kMinYear), month, day);
	if (getData()->getCalendarType(m_record) == 1)
		text += "(" + translate("IDS_PB_SBODY_LUNAR_M_STATUS") + ")";
	if (text.size() >= kMaxDateBytes)
		text.resize(kMaxDateBytes - 1);
	return text;
}

std::string CtDetailViewEventItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0) {
		int type = getData()->getDataType(m_record, _contacts_event.type);
		return typeLabel(CtCommonGetEventTypeStr(m_record, type));
	}
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return highlightMain(toMarkup(getCopyText().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewEventItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.main.left.bottom");
	return nullptr;
}

void CtDetailViewEventItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
}
