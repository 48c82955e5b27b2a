#include "ContactsDebug.h"
#include "LogSink.h"

#include <gtest/gtest.h>

#include <string>

namespace {

int failingLookup()
{
	WPRET_VM(true, -1, "Invalid param : %s", "data");
	return 0;
}

} // namespace

TEST(Log, LinesCarryTagPrefixAndLevelAndBadCallsAreRefused)
{
	ct::log::clear();
	WENTER();
	WHIT();
	WFAILED("contacts_db_get_record", -2);
	EXPECT_EQ(-1, failingLookup());
	auto lines = ct::log::entries();
	ASSERT_EQ(4u, lines.size());
	EXPECT_EQ("PHONE", lines[3].tag);
	EXPECT_EQ(DLOG_INFO, lines[0].priority);
	EXPECT_NE(std::string::npos, lines[0].text.find("LogTest.cpp: TestBody(")) << lines[0].text;
	EXPECT_NE(std::string::npos, lines[0].text.find(") > BEGIN >>>>"));
	EXPECT_TRUE(ct::log::contains("contacts_db_get_record() Failed(-2)", DLOG_WARN));
	EXPECT_TRUE(ct::log::contains("failingLookup(", DLOG_ERROR));
	EXPECT_TRUE(ct::log::contains("> * Critical * Invalid param : data", DLOG_ERROR));

	ct::log::clear();
	EXPECT_EQ(DLOG_ERROR_INVALID_PARAMETER, dlog_print(DLOG_INFO, nullptr, "x"));
	EXPECT_EQ(DLOG_ERROR_INVALID_PARAMETER, dlog_print(DLOG_INFO, "PHONE", nullptr));
	EXPECT_EQ(DLOG_ERROR_INVALID_PARAMETER, dlog_print(DLOG_SILENT, "PHONE", "x"));
	EXPECT_TRUE(ct::log::entries().empty());
	std::string huge(100000, 'a');
	EXPECT_EQ(100000, dlog_print(DLOG_WARN, "PHONE", "%s", huge.c_str()));
	ASSERT_EQ(1u, ct::log::entries().size());
	EXPECT_LT(ct::log::entries()[0].text.size(), 5000u);
	EXPECT_STREQ("", dlog_basename(nullptr));
}
