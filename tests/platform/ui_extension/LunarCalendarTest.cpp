#include "ui_extension.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <ctime>
#include <string>

namespace {

constexpr int kLunar = UXT_CALENDAR_LUNAR_CHINESE;

struct tm makeDate(int year, int month, int day)
{
	struct tm date = {};
	date.tm_year = year - 1900;
	date.tm_mon = month - 1;
	date.tm_mday = day;
	return date;
}

std::string dateText(const char* region, int year, int month, int day, int format)
{
	struct tm date = makeDate(year, month, day);
	char* text = uxt_util_get_date_time_text_by_locale(region, &date, format);
	std::string result = text ? text : "(null)";
	free(text);
	return result;
}

std::string ymd(const struct tm& t)
{
	return std::to_string(t.tm_year + 1900) + "-" + std::to_string(t.tm_mon + 1) + "-" + std::to_string(t.tm_mday);
}

} // namespace

TEST(DateText, FormatsSixAndSevenFollowTheRegion)
{
	EXPECT_EQ(dateText("en_US", 2023, 1, 22, 7), "January 22, 2023");
	EXPECT_EQ(dateText("en_US.UTF-8", 2023, 1, 22, 6), "January 22");
	EXPECT_EQ(dateText("en_GB", 2024, 2, 10, 7), "10 February 2024");
	EXPECT_EQ(dateText("de_DE.UTF-8", 2024, 2, 10, 6), "10. Februar");
	// A birthday without year keeps 29 February.
	EXPECT_EQ(dateText("en_US", 0, 2, 29, 6), "February 29");
	EXPECT_EQ(dateText(nullptr, 2025, 1, 29, 7), "January 29, 2025");
	EXPECT_EQ(dateText("en_US", 2025, 1, 29, 3), "(null)");
	EXPECT_EQ(uxt_util_get_date_time_text_by_locale("en_US", nullptr, 7), nullptr);
}

TEST(LunarCalendar, NewYearsEvesAndThe2023LeapSecondMonthConvertBothWays)
{
	struct Case {
		int y, m, d;
		const char* lunar;
		int leap;
	} cases[] = { { 2023, 1, 22, "2023-1-1", 0 }, { 2023, 1, 21, "2022-12-30", 0 }, { 2024, 2, 10, "2024-1-1", 0 },
		{ 2025, 1, 29, "2025-1-1", 0 }, { 1950, 2, 17, "1950-1-1", 0 }, { 2000, 2, 5, "2000-1-1", 0 },
		{ 2037, 2, 15, "2037-1-1", 0 }, { 2023, 3, 22, "2023-2-1", 1 }, { 2023, 2, 20, "2023-2-1", 0 } };
	for (const Case& c : cases) {
		struct tm solar = makeDate(c.y, c.m, c.d), lunar = {}, back = {};
		int leap = -1;
		ASSERT_EQ(uxt_util_convert_gregorian_time_to_lunar_time(kLunar, &solar, &lunar, &leap), 0);
		EXPECT_EQ(c.lunar, ymd(lunar)) << ymd(solar);
		EXPECT_EQ(c.leap, leap) << ymd(solar);
		ASSERT_EQ(uxt_util_convert_lunar_time_to_gregorian_time(kLunar, &lunar, c.leap, &back), 0);
		EXPECT_EQ(ymd(solar), ymd(back));
	}
	struct tm second = makeDate(2023, 2, 1), third = makeDate(2023, 3, 1), fourth2020 = makeDate(2020, 4, 1);
	EXPECT_EQ(uxt_util_is_leap_month_possible(kLunar, &second), 1);
	EXPECT_EQ(uxt_util_is_leap_month_possible(kLunar, &third), 0);
	EXPECT_EQ(uxt_util_is_leap_month_possible(kLunar, &fourth2020), 1);
}

TEST(LunarCalendar, EveryDayFrom1902To2037AndDaysOutsideTheTableRoundTrip)
{
	int checked = 0, leapDays = 0;
	auto roundTrip = [&](const struct tm& solar) {
		struct tm lunar = {}, back = {};
		int leap = 0;
		ASSERT_EQ(uxt_util_convert_gregorian_time_to_lunar_time(kLunar, &solar, &lunar, &leap), 0);
		ASSERT_EQ(uxt_util_convert_lunar_time_to_gregorian_time(kLunar, &lunar, leap, &back), 0) << ymd(solar);
		ASSERT_EQ(ymd(solar), ymd(back));
		ASSERT_TRUE(lunar.tm_mday >= 1 && lunar.tm_mday <= 30);
		ASSERT_TRUE(!leap || uxt_util_is_leap_month_possible(kLunar, &lunar) == 1) << ymd(solar);
		leapDays += leap;
		++checked;
	};
	struct tm first = makeDate(1902, 1, 1), last = makeDate(2037, 12, 31), solar;
	for (time_t t = timegm(&first), end = timegm(&last); t <= end && !testing::Test::HasFatalFailure(); t += 86400)
		roundTrip(*gmtime_r(&t, &solar));
	EXPECT_EQ(checked, 49674);
	// About 50 leap months in 136 years, each 29 or 30 days.
	EXPECT_GT(leapDays, 45 * 29);
	EXPECT_LT(leapDays, 55 * 30);
	roundTrip(makeDate(1850, 6, 15));
	roundTrip(makeDate(2150, 6, 15));
}

TEST(LunarCalendar, ImpossibleDatesAndBadInputAreRefused)
{
	struct tm out = {};
	int leap = 0;
	struct tm feb30 = makeDate(2023, 2, 30), ok = makeDate(2023, 5, 5);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(kLunar, &feb30, &out, &leap), 0);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(kLunar, nullptr, &out, &leap), 0);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(UXT_CALENDAR_SOLAR, &ok, &out, &leap), 0);
	EXPECT_LT(uxt_util_convert_gregorian_time_to_lunar_time(kLunar, &ok, nullptr, &leap), 0);
	EXPECT_EQ(uxt_util_convert_gregorian_time_to_lunar_time(kLunar, &ok, &out, nullptr), 0);

	struct tm noLeapThird = makeDate(2023, 3, 1), day31 = makeDate(2023, 1, 31), badMonth = makeDate(2023, 13, 1);
	EXPECT_LT(uxt_util_convert_lunar_time_to_gregorian_time(kLunar, &noLeapThird, 1, &out), 0);
	EXPECT_LT(uxt_util_convert_lunar_time_to_gregorian_time(kLunar, &day31, 0, &out), 0);
	EXPECT_LT(uxt_util_is_leap_month_possible(kLunar, &badMonth), 0);
	EXPECT_LT(uxt_util_is_leap_month_possible(kLunar, nullptr), 0);
}
