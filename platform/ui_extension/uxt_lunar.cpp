// Gregorian <-> Chinese lunar dates on ICU's Chinese calendar.
#include "ui_extension.h"

#include "ContactsDebug.h"

#include <unicode/calendar.h>
#include <unicode/gregocal.h>
#include <unicode/timezone.h>

#include <algorithm>
#include <memory>
#include <vector>

namespace {

// ICU counts Chinese years from 2637 BCE; our lunar years are named by the
// Gregorian year they start in.
constexpr int kChineseEpochOffset = 2637;
constexpr int kMinYear = 1;
constexpr int kMaxYear = 9999;

struct Calendars {
	std::unique_ptr<icu::Calendar> gregorian;
	std::unique_ptr<icu::Calendar> chinese;
};

// One pair for the process: building ICU calendars is far dearer than using them.
Calendars* calendars()
{
	static Calendars* pair = [] {
		auto* made = new Calendars();
		UErrorCode status = U_ZERO_ERROR;
		made->gregorian.reset(icu::Calendar::createInstance(icu::TimeZone::getGMT()->clone(),
			icu::Locale("en_US@calendar=gregorian"), status));
		made->chinese.reset(icu::Calendar::createInstance(icu::TimeZone::getGMT()->clone(),
			icu::Locale("zh_CN@calendar=chinese"), status));
		if (U_FAILURE(status) || !made->gregorian || !made->chinese) {
			WFAILED("icu::Calendar::createInstance", status);
			delete made;
			return static_cast<Calendars*>(nullptr);
		}
		// Reset the switch to proleptic Gregorian so early dates stay Gregorian.
		if (auto* greg = dynamic_cast<icu::GregorianCalendar*>(made->gregorian.get()))
			greg->setGregorianChange(-8.64e15, status);
		return made;
	}();
	return pair;
}

bool validTm(const struct tm* date)
{
	if (!date)
		return false;
	int year = date->tm_year + 1900;
	return year >= kMinYear && year <= kMaxYear && date->tm_mon >= 0 && date->tm_mon <= 11 && date->tm_mday >= 1
		&& date->tm_mday <= 31;
}

void fillTm(struct tm* out, int year, int month, int day, int weekday)
{
	*out = {};
	out->tm_year = year - 1900;
	out->tm_mon = month;
	out->tm_mday = day;
	out->tm_wday = weekday - 1;
	out->tm_hour = 12;
}

// The noon instant of a Gregorian date; false when the date does not exist.
bool gregorianNoon(const struct tm* date, UDate* out)
{
	icu::Calendar& greg = *calendars()->gregorian;
	UErrorCode status = U_ZERO_ERROR;
	greg.clear();
	greg.set(date->tm_year + 1900, date->tm_mon, date->tm_mday, 12, 0, 0);
	*out = greg.getTime(status);
	return U_SUCCESS(status) && greg.get(UCAL_DATE, status) == date->tm_mday
		&& greg.get(UCAL_MONTH, status) == date->tm_mon && U_SUCCESS(status);
}

int icuGregorianToLunar(int calendar, const struct tm* gregorian, struct tm* lunar, int* is_leap_month)
{
	WPRET_VM(calendar != UXT_CALENDAR_LUNAR_CHINESE, UXT_ERROR_NOT_SUPPORTED, "unsupported calendar %d", calendar);
	WPRET_VM(!validTm(gregorian) || !lunar, UXT_ERROR_INVALID_PARAMETER, "Invalid param : date");
	WPRET_VM(!calendars(), UXT_ERROR_OPERATION_FAILED, "no ICU calendars");
	UDate noon = 0;
	WPRET_VM(!gregorianNoon(gregorian, &noon), UXT_ERROR_INVALID_PARAMETER, "no such date %d-%d-%d",
		gregorian->tm_year + 1900, gregorian->tm_mon + 1, gregorian->tm_mday);
	icu::Calendar& chinese = *calendars()->chinese;
	UErrorCode status = U_ZERO_ERROR;
	chinese.setTime(noon, status);
	int year = chinese.get(UCAL_EXTENDED_YEAR, status) - kChineseEpochOffset;
	int month = chinese.get(UCAL_MONTH, status);
	int day = chinese.get(UCAL_DATE, status);
	int leap = chinese.get(UCAL_IS_LEAP_MONTH, status);
	int weekday = chinese.get(UCAL_DAY_OF_WEEK, status);
	if (U_FAILURE(status)) {
		WFAILED("icu::Calendar::get", status);
		return UXT_ERROR_OPERATION_FAILED;
	}
	fillTm(lunar, year, month, day, weekday);
	if (is_leap_month)
		*is_leap_month = leap;
	return UXT_ERROR_NONE;
}

int icuLunarToGregorian(int calendar, const struct tm* lunar, int is_leap_month, struct tm* gregorian)
{
	WPRET_VM(calendar != UXT_CALENDAR_LUNAR_CHINESE, UXT_ERROR_NOT_SUPPORTED, "unsupported calendar %d", calendar);
	WPRET_VM(!validTm(lunar) || lunar->tm_mday > 30 || !gregorian, UXT_ERROR_INVALID_PARAMETER,
		"Invalid param : lunar date");
	WPRET_VM(!calendars(), UXT_ERROR_OPERATION_FAILED, "no ICU calendars");
	icu::Calendar& chinese = *calendars()->chinese;
	UErrorCode status = U_ZERO_ERROR;
	chinese.clear();
	chinese.set(UCAL_EXTENDED_YEAR, lunar->tm_year + 1900 + kChineseEpochOffset);
	chinese.set(UCAL_MONTH, lunar->tm_mon);
	chinese.set(UCAL_IS_LEAP_MONTH, is_leap_month ? 1 : 0);
	chinese.set(UCAL_DATE, lunar->tm_mday);
	chinese.set(UCAL_HOUR_OF_DAY, 12);
	UDate noon = chinese.getTime(status);
	// ICU rolls a missing leap month or day 30 into the next one: refuse those.
	bool same = U_SUCCESS(status) && chinese.get(UCAL_MONTH, status) == lunar->tm_mon
		&& chinese.get(UCAL_DATE, status) == lunar->tm_mday
		&& chinese.get(UCAL_IS_LEAP_MONTH, status) == (is_leap_month ? 1 : 0) && U_SUCCESS(status);
	if (!same)
		return UXT_ERROR_INVALID_PARAMETER;
	icu::Calendar& greg = *calendars()->gregorian;
	greg.setTime(noon, status);
	fillTm(gregorian, greg.get(UCAL_EXTENDED_YEAR, status), greg.get(UCAL_MONTH, status), greg.get(UCAL_DATE, status),
		greg.get(UCAL_DAY_OF_WEEK, status));
	return U_SUCCESS(status) ? UXT_ERROR_NONE : UXT_ERROR_OPERATION_FAILED;
}

// Days since 1970-01-01 of a proleptic Gregorian date (H. Hinnant's algorithm).
long daysFromCivil(int y, int m, int d)
{
	y -= m <= 2;
	const long era = (y >= 0 ? y : y - 399) / 400;
	const long yoe = y - era * 400;
	const long doy = (153 * (m + (m > 2 ? -3 : 9)) + 2) / 5 + d - 1;
	const long doe = yoe * 365 + yoe / 4 - yoe / 100 + doy;
	return era * 146097 + doe - 719468;
}

void civilFromDays(long z, int* y, int* m, int* d)
{
	z += 719468;
	const long era = (z >= 0 ? z : z - 146096) / 146097;
	const long doe = z - era * 146097;
	const long yoe = (doe - doe / 1460 + doe / 36524 - doe / 146096) / 365;
	const long doy = doe - (365 * yoe + yoe / 4 - yoe / 100);
	const long mp = (5 * doy + 2) / 153;
	*d = static_cast<int>(doy - (153 * mp + 2) / 5 + 1);
	*m = static_cast<int>(mp < 10 ? mp + 3 : mp - 9);
	*y = static_cast<int>(yoe + era * 400 + (*m <= 2));
}

bool gregorianExists(const struct tm* date)
{
	int y = 0, m = 0, d = 0;
	civilFromDays(daysFromCivil(date->tm_year + 1900, date->tm_mon + 1, date->tm_mday), &y, &m, &d);
	return y == date->tm_year + 1900 && m == date->tm_mon + 1 && d == date->tm_mday;
}

int weekdayOf(long days)
{
	return static_cast<int>(((days % 7) + 11) % 7); // 1970-01-01 was a Thursday
}

// The lunar months of 1900-2100, each with its first day: ICU is asked once
// per month, and conversions inside the range are a binary search.
struct LunarMonth {
	long start;
	int year;
	int month;
	int leap;
	int length;
	int key() const { return year * 32 + month * 2 + leap; }
};

bool icuLunarOfDay(long days, struct tm* lunar, int* leap)
{
	int y = 0, m = 0, d = 0;
	civilFromDays(days, &y, &m, &d);
	struct tm solar = {};
	solar.tm_year = y - 1900;
	solar.tm_mon = m - 1;
	solar.tm_mday = d;
	return icuGregorianToLunar(UXT_CALENDAR_LUNAR_CHINESE, &solar, lunar, leap) == UXT_ERROR_NONE;
}

std::vector<LunarMonth> buildMonths()
{
	std::vector<LunarMonth> months;
	struct tm lunar = {};
	int leap = 0;
	long day = daysFromCivil(1900, 1, 31); // lunar 1900, month 1, day 1
	const long end = daysFromCivil(2101, 1, 1);
	if (!icuLunarOfDay(day, &lunar, &leap) || lunar.tm_mday != 1)
		return months;
	while (day < end) {
		LunarMonth month { day, lunar.tm_year + 1900, lunar.tm_mon, leap, 29 };
		struct tm next = {};
		int nextLeap = 0;
		if (!icuLunarOfDay(day + 29, &next, &nextLeap))
			break;
		if (next.tm_mday != 1) {
			month.length = 30;
			if (!icuLunarOfDay(day + 30, &next, &nextLeap))
				break;
		}
		months.push_back(month);
		day += month.length;
		lunar = next;
		leap = nextLeap;
	}
	return months;
}

const std::vector<LunarMonth>& lunarMonths()
{
	static const std::vector<LunarMonth>* months = new std::vector<LunarMonth>(buildMonths());
	return *months;
}

} // namespace

int uxt_util_convert_gregorian_time_to_lunar_time(int calendar, const struct tm* gregorian, struct tm* lunar,
	int* is_leap_month)
{
	WPRET_VM(calendar != UXT_CALENDAR_LUNAR_CHINESE, UXT_ERROR_NOT_SUPPORTED, "unsupported calendar %d", calendar);
	WPRET_VM(!validTm(gregorian) || !lunar, UXT_ERROR_INVALID_PARAMETER, "Invalid param : date");
	WPRET_VM(!gregorianExists(gregorian), UXT_ERROR_INVALID_PARAMETER, "no such date %d-%d-%d",
		gregorian->tm_year + 1900, gregorian->tm_mon + 1, gregorian->tm_mday);
	const std::vector<LunarMonth>& months = lunarMonths();
	long days = daysFromCivil(gregorian->tm_year + 1900, gregorian->tm_mon + 1, gregorian->tm_mday);
	auto after = std::upper_bound(months.begin(), months.end(), days,
		[](long d, const LunarMonth& m) { return d < m.start; });
	if (after == months.begin() || days >= std::prev(after)->start + std::prev(after)->length)
		return icuGregorianToLunar(calendar, gregorian, lunar, is_leap_month);
	const LunarMonth& month = *std::prev(after);
	fillTm(lunar, month.year, month.month, static_cast<int>(days - month.start) + 1, weekdayOf(days) + 1);
	if (is_leap_month)
		*is_leap_month = month.leap;
	return UXT_ERROR_NONE;
}

int uxt_util_convert_lunar_time_to_gregorian_time(int calendar, const struct tm* lunar, int is_leap_month,
	struct tm* gregorian)
{
	WPRET_VM(calendar != UXT_CALENDAR_LUNAR_CHINESE, UXT_ERROR_NOT_SUPPORTED, "unsupported calendar %d", calendar);
	WPRET_VM(!validTm(lunar) || lunar->tm_mday > 30 || !gregorian, UXT_ERROR_INVALID_PARAMETER,
		"Invalid param : lunar date");
	const std::vector<LunarMonth>& months = lunarMonths();
	LunarMonth wanted { 0, lunar->tm_year + 1900, lunar->tm_mon, is_leap_month ? 1 : 0, 0 };
	bool inRange = !months.empty() && wanted.key() >= months.front().key() && wanted.key() <= months.back().key();
	if (!inRange)
		return icuLunarToGregorian(calendar, lunar, is_leap_month, gregorian);
	auto found = std::lower_bound(months.begin(), months.end(), wanted.key(),
		[](const LunarMonth& m, int key) { return m.key() < key; });
	if (found == months.end() || found->key() != wanted.key() || lunar->tm_mday > found->length)
		return UXT_ERROR_INVALID_PARAMETER;
	long days = found->start + lunar->tm_mday - 1;
	int y = 0, m = 0, d = 0;
	civilFromDays(days, &y, &m, &d);
	fillTm(gregorian, y, m - 1, d, weekdayOf(days) + 1);
	return UXT_ERROR_NONE;
}

int uxt_util_is_leap_month_possible(int calendar, const struct tm* lunar)
{
	WPRET_VM(calendar != UXT_CALENDAR_LUNAR_CHINESE, UXT_ERROR_NOT_SUPPORTED, "unsupported calendar %d", calendar);
	WPRET_VM(!validTm(lunar), UXT_ERROR_INVALID_PARAMETER, "Invalid param : lunar date");
	struct tm first = *lunar;
	first.tm_mday = 1;
	struct tm ignored;
	return uxt_util_convert_lunar_time_to_gregorian_time(calendar, &first, 1, &ignored) == UXT_ERROR_NONE ? 1 : 0;
}
