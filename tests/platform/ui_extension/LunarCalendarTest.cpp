#include "ui_extension.h"

#include <gtest/gtest.h>

#include <ctime>
#include <tuple>

namespace {

struct tm makeDate(int year, int month, int day)
{
	struct tm date = {};
	date.tm_year = year - 1900;
	date.tm_mon = month - 1;
	date.tm_mday = day;
	return date;
}

struct LunarDate {
	int year, month, day;
	bool leap;
};

LunarDate toLunar(int year, int month, int day)
{
	struct tm solar = makeDate(year, month, day);
	struct tm lunar = {};
	int leap = -1;
	EXPECT_EQ(uxt_util_convert_gregorian_time_to_lunar_time(UXT_CALENDAR_LUNAR_CHINESE, &solar, &lunar, &leap), 0);
	return { lunar.tm_year + 1900, lunar.tm_mon + 1, lunar.tm_mday, leap == 1 };
}

} // namespace

TEST(LunarCalendar, ChineseNewYearsAndThe2023LeapSecondMonth)
{
	for (auto [y, m, d] : { std::tuple { 2023, 1, 22 }, { 2024, 2, 10 }, { 2025, 1, 29 }, { 1950, 2, 17 },
			 { 2000, 2, 5 }, { 2037, 2, 15 } }) {
		LunarDate newYear = toLunar(y, m, d);
		EXPECT_EQ(newYear.year, y);
		EXPECT_EQ(newYear.month, 1);
		EXPECT_EQ(newYear.day, 1);
		EXPECT_FALSE(newYear.leap);
		LunarDate eve = toLunar(y, m, d - 1);
		EXPECT_EQ(eve.year, y - 1);
		EXPECT_EQ(eve.month, 12);
	}

	LunarDate leapStart = toLunar(2023, 3, 22);
	EXPECT_EQ(leapStart.year, 2023);
	EXPECT_EQ(leapStart.month, 2);
	EXPECT_EQ(leapStart.day, 1);
	EXPECT_TRUE(leapStart.leap);
	LunarDate ordinarySecond = toLunar(2023, 2, 20);
	EXPECT_EQ(ordinarySecond.month, 2);
	EXPECT_EQ(ordinarySecond.day, 1);
	EXPECT_FALSE(ordinarySecond.leap);

	struct tm lunar = makeDate(2023, 2, 1);
	struct tm solar = {};
	ASSERT_EQ(uxt_util_convert_lunar_time_to_gregorian_time(UXT_CALENDAR_LUNAR_CHINESE, &lunar, 1, &solar), 0);
	EXPECT_EQ(solar.tm_year + 1900, 2023);
	EXPECT_EQ(solar.tm_mon + 1, 3);
	EXPECT_EQ(solar.tm_mday, 22);
	ASSERT_EQ(uxt_util_convert_lunar_time_to_gregorian_time(UXT_CALENDAR_LUNAR_CHINESE, &lunar, 0, &solar), 0);
	EXPECT_EQ(solar.tm_mon + 1, 2);
	EXPECT_EQ(solar.tm_mday, 20);

	EXPECT_EQ(uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &lunar), 1);
	struct tm third = makeDate(2023, 3, 1);
	EXPECT_EQ(uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &third), 0);
	struct tm leap2020 = makeDate(2020, 4, 1);
	EXPECT_EQ(uxt_util_is_leap_month_possible(UXT_CALENDAR_LUNAR_CHINESE, &leap2020), 1);
}

TEST(LunarCalendar, EveryDayFrom1902To2037RoundTrips)
{
	struct tm day = makeDate(1902, 1, 1);
	time_t t = timegm(&day);
	const time_t end = timegm(&(day = makeDate(2037, 12, 31)));
	int checked = 0;
	int leapDays = 0;
	for (; t <= end; t += 86400) {
		struct tm solar;
		gmtime_r(&t, &solar);
		struct tm lunar = {};
		int leap = 0;
		ASSERT_EQ(uxt_util_convert_gregorian_time_to_lunar_time(1, &solar, &lunar, &leap), 0);
		struct tm back = {};
		ASSERT_EQ(uxt_util_convert_lunar_time_to_gregorian_time(1, &lunar, leap, &back), 0)
			<< solar.tm_year + 1900 << "-" << solar.tm_mon + 1 << "-" << solar.tm_mday;
		ASSERT_EQ(back.tm_year, solar.tm_year);
		ASSERT_EQ(back.tm_mon, solar.tm_mon);
		ASSERT_EQ(back.tm_mday, solar.tm_mday);
		ASSERT_TRUE(lunar.tm_mday >= 1 && lunar.tm_mday <= 30);
		if (leap) {
			ASSERT_EQ(uxt_util_is_leap_month_possible(1, &lunar), 1);
		}
		leapDays += leap;
		++checked;
	}
	EXPECT_EQ(checked, 49674);
	// About 50 leap months in 136 years, each 29 or 30 days.
	EXPECT_GT(leapDays, 45 * 29);
	EXPECT_LT(leapDays, 55 * 30);
}

TEST(LunarCalendar, DatesOutsideTheMonthTableStillConvert)
{
	for (int year : { 1850, 2150 }) {
		struct tm solar = makeDate(year, 6, 15);
		struct tm lunar = {};
		int leap = 0;
		ASSERT_EQ(uxt_util_convert_gregorian_time_to_lunar_time(1, &solar, &lunar, &leap), 0);
		EXPECT_EQ(lunar.tm_year + 1900, year);
		struct tm back = {};
		ASSERT_EQ(uxt_util_convert_lunar_time_to_gregorian_time(1, &lunar, leap, &back), 0);
		EXPECT_EQ(back.tm_year, solar.tm_year);
		EXPECT_EQ(back.tm_mon, solar.tm_mon);
		EXPECT_EQ(back.tm_mday, solar.tm_mday);
	}
}

TEST(LunarCalendar, ImpossibleDatesAndBadInputAreRefused)
{
	struct tm out = {};
	int leap = 0;
	struct tm feb30 = makeDate(2023, 2, 30);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(1, &feb30, &out, &leap), 0);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(1, nullptr, &out, &leap), 0);
	struct tm ok = makeDate(2023, 5, 5);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(0, &ok, &out, &leap), 0);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(1, &ok, nullptr, &leap), 0);
	EXPECT_EQ(uxt_util_convert_gregorian_time_to_lunar_time(1, &ok, &out, nullptr), 0);

	struct tm noLeapThird = makeDate(2023, 3, 1);
	EXPECT_LT(uxt_util_convert_lunar_time_to_gregorian_time(1, &noLeapThird, 1, &out), 0);
	struct tm day31 = makeDate(2023, 1, 31);
	EXPECT_LT(uxt_util_convert_lunar_time_to_gregorian_time(1, &day31, 0, &out), 0);
	struct tm badMonth = makeDate(2023, 13, 1);
	EXPECT_LT(uxt_util_is_leap_month_possible(1, &badMonth), 0);
	EXPECT_LT(uxt_util_is_leap_month_possible(1, nullptr), 0);
}
