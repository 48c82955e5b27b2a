#include "RegionDateFormat.h"
#include "utils_i18n.h"
#include "vconf.h"

#include "LogSink.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

using namespace ct::i18n;

namespace {

std::string eventText(Year year, const char* locale, int yyyymmdd)
{
	i18n_udate_h formatter = createEventDateFormatter(year, locale);
	if (!formatter)
		return "<no formatter>";
	std::string text = formatEventDate(formatter, yyyymmdd);
	i18n_udate_destroy(formatter);
	return text;
}

} // namespace

TEST(DateFormat, EventDatesFollowTheLocaleKeepTheLeapDayAndImpossibleDatesGiveNothing)
{
	struct {
		Year year;
		const char* locale;
		int date;
		const char* text;
	} cases[] = {{Year::Shown, "en_US", 19850307, "Mar 7, 1985"}, {Year::Hidden, "en_US", 19850307, "Mar 7"},
		{Year::Shown, "en_GB", 19850307, "7 Mar 1985"}, {Year::Shown, "de_DE", 19850307, "7. März 1985"},
		{Year::Hidden, "de_DE", 19850307, "7. März"}, {Year::Shown, "ko_KR", 19850307, "1985년 3월 7일"},
		{Year::Hidden, "ko_KR", 19850307, "3월 7일"}, {Year::Shown, "en_US.UTF-8", 19850307, "Mar 7, 1985"},
		{Year::Hidden, "en_US", 229, "Feb 29"}, {Year::Hidden, "en_US", 1231, "Dec 31"},
		{Year::Shown, "en_US", 20240229, "Feb 29, 2024"}, {Year::Shown, "en_US", 19020101, "Jan 1, 1902"},
		{Year::Shown, "en_US", 20230229, ""}, {Year::Shown, "en_US", 19851301, ""}, {Year::Shown, "en_US", 19850400, ""},
		{Year::Shown, "en_US", 19850431, ""}, {Year::Shown, "en_US", -5, ""}};
	ct::log::clear();
	for (const auto& c : cases)
		EXPECT_EQ(c.text, eventText(c.year, c.locale, c.date)) << c.locale << " " << c.date;
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid date", DLOG_ERROR));
	EXPECT_EQ("", formatEventDate(nullptr, 19850307));
}

TEST(DateFormat, RegionFormatComesFromSettingsAndFallsBackToEnUs)
{
	ct::test::TempDataDir dir;
	EXPECT_EQ("en_US", regionFormat());
	ASSERT_EQ(0, vconf_set_str(VCONFKEY_REGIONFORMAT, "de_DE.UTF-8"));
	EXPECT_EQ("de_DE", regionFormat());
	EXPECT_EQ("7. März", eventText(Year::Hidden, "", 19850307));
	ASSERT_EQ(0, vconf_set_str(VCONFKEY_REGIONFORMAT, "ko_KR"));
	EXPECT_EQ("3월 7일", eventText(Year::Hidden, "", 19850307));

	ASSERT_EQ(0, vconf_set_str(VCONFKEY_REGIONFORMAT, "'; DROP TABLE x; --"));
	EXPECT_EQ("en_US", regionFormat());
	ASSERT_EQ(0, vconf_set_int(VCONFKEY_REGIONFORMAT, 5));
	EXPECT_EQ("en_US", regionFormat());
}

TEST(DateFormat, FormatterFromPatternAndUtf16Output)
{
	i18n_udate_h formatter = nullptr;
	ASSERT_EQ(I18N_ERROR_NONE, i18n_udate_create_from_pattern("yyyy-MM-dd HH:mm", "en_US", "UTC", &formatter));
	char* text = nullptr;
	ASSERT_EQ(I18N_ERROR_NONE, i18n_udate_format_date_utf8(formatter, 0.0, &text));
	EXPECT_STREQ("1970-01-01 00:00", text);
	free(text);

	i18n_uchar small[4];
	int32_t needed = 0;
	EXPECT_EQ(I18N_ERROR_BUFFER_OVERFLOW, i18n_udate_format_date(formatter, 0.0, small, 4, &needed));
	EXPECT_EQ(16, needed);
	i18n_uchar exact[17];
	ASSERT_EQ(I18N_ERROR_NONE, i18n_udate_format_date(formatter, 0.0, exact, 17, &needed));
	EXPECT_EQ(u"1970-01-01 00:00", std::u16string(reinterpret_cast<const char16_t*>(exact)));
	EXPECT_EQ(I18N_ERROR_BUFFER_OVERFLOW, i18n_udate_format_date(formatter, 0.0, nullptr, 0, &needed));
	i18n_udate_destroy(formatter);

	ASSERT_EQ(I18N_ERROR_NONE, i18n_udate_create_from_pattern("HH:mm", "en_US", "Asia/Seoul", &formatter));
	ASSERT_EQ(I18N_ERROR_NONE, i18n_udate_format_date_utf8(formatter, 0.0, &text));
	EXPECT_STREQ("09:00", text);
	free(text);
	i18n_udate_destroy(formatter);
}

TEST(DateFormat, BadArgumentsAreRefusedWithALogLine)
{
	ct::log::clear();
	i18n_udate_h formatter = reinterpret_cast<i18n_udate_h>(1);
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_create_from_skeleton(nullptr, "en_US", nullptr, &formatter));
	EXPECT_EQ(nullptr, formatter);
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_create_from_skeleton("yMMMd", "", nullptr, &formatter));
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_create_from_skeleton("yMMMd", "en\xFF", nullptr, &formatter));
	std::string huge(I18N_MAX_ARGUMENT_LENGTH + 1, 'y');
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_create_from_skeleton(huge.c_str(), "en_US", nullptr, &formatter));
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_create_from_pattern("yyyy", "en_US", "Mars/Olympus", &formatter));
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_create_from_pattern("yyyy", "en_US", nullptr, nullptr));
	EXPECT_EQ(nullptr, formatter);
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_destroy(nullptr));
	char* text = nullptr;
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_format_date_utf8(nullptr, 0.0, &text));
	int32_t needed = 0;
	EXPECT_EQ(I18N_ERROR_INVALID_PARAMETER, i18n_udate_format_date(nullptr, 0.0, nullptr, 0, &needed));
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid param", DLOG_ERROR));

	// An unknown locale still formats (ICU's root data), rather than failing.
	EXPECT_FALSE(eventText(Year::Shown, "xx_YY", 19850307).empty());
}
