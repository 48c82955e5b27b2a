#include "ui_extension.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

namespace {

std::string dateText(const char* region, int year, int month, int day, int format)
{
	struct tm date = {};
	date.tm_year = year - 1900;
	date.tm_mon = month - 1;
	date.tm_mday = day;
	char* text = uxt_util_get_date_time_text_by_locale(region, &date, format);
	std::string result = text ? text : "(null)";
	free(text);
	return result;
}

} // namespace

TEST(DateText, FormatsSixAndSevenFollowTheRegion)
{
	EXPECT_EQ(dateText("en_US", 2023, 1, 22, 7), "January 22, 2023");
	EXPECT_EQ(dateText("en_US.UTF-8", 2023, 1, 22, 6), "January 22");
	EXPECT_EQ(dateText("en_GB", 2024, 2, 10, 7), "10 February 2024");
	EXPECT_EQ(dateText("de_DE.UTF-8", 2024, 2, 10, 6), "10. Februar");
	// A birthday without year keeps 29 February.
	EXPECT_EQ(dateText("en_US", 1900 - 1900, 2, 29, 6), "February 29");
	EXPECT_EQ(dateText(nullptr, 2025, 1, 29, 7), "January 29, 2025");
	EXPECT_EQ(dateText("en_US", 2025, 1, 29, 3), "(null)");
	EXPECT_EQ(uxt_util_get_date_time_text_by_locale("en_US", nullptr, 7), nullptr);
}
