#include "ContactsCommon.h"
#include "../CommonTestSupport.h"

#include <vconf.h>

#include <gtest/gtest.h>

#include <fstream>
#include <string>
#include <sys/stat.h>

TEST(ContactsCommon, NumberDashesFollowTheRegion)
{
	EXPECT_EQ("201-555-0123", ContactsCommon::addNumberDashesForRegion("2015550123", "US"));
	EXPECT_EQ("+1-201-555-0123", ContactsCommon::addNumberDashesForRegion("+12015550123", "US"));
	EXPECT_EQ("02-1234-5678", ContactsCommon::addNumberDashesForRegion("0212345678", "KR"));
	EXPECT_EQ("010-1234-5678", ContactsCommon::addNumberDashesForRegion("01012345678", "KR"));
	EXPECT_EQ("030-123456", ContactsCommon::addNumberDashesForRegion("030123456", "DE"));
	EXPECT_EQ("020-7946-0018", ContactsCommon::addNumberDashesForRegion("02079460018", "GB"));

	// What the region does not know stays as typed.
	EXPECT_EQ("112", ContactsCommon::addNumberDashesForRegion("112", "US"));
	EXPECT_EQ("*123#", ContactsCommon::addNumberDashesForRegion("*123#", "US"));
	EXPECT_EQ("hello", ContactsCommon::addNumberDashesForRegion("hello", "US"));
	EXPECT_EQ("", ContactsCommon::addNumberDashesForRegion(nullptr, "US"));
	EXPECT_EQ("2015550123", ContactsCommon::addNumberDashesForRegion("2015550123", nullptr));
	std::string huge(100000, '5');
	EXPECT_LE(ContactsCommon::addNumberDashesForRegion(huge.c_str(), "US").size(), 1024u);

	EXPECT_EQ("2015550123", ContactsCommon::removeNumberDashes("201-555-0123"));
	EXPECT_EQ("", ContactsCommon::removeNumberDashes(nullptr));
}

TEST(ContactsCommon, RegionComesFromTheRegionFormatThenTheCountry)
{
	ct::test::TempDataDir dir;
	EXPECT_EQ("US", ContactsCommon::getRegionCode());
	ASSERT_EQ(0, vconf_set_str(VCONFKEY_REGIONFORMAT, "ko_KR.UTF-8"));
	EXPECT_EQ("KR", ContactsCommon::getRegionCode());
	EXPECT_EQ("010-1234-5678", ContactsCommon::addNumberDashes("01012345678"));
	ASSERT_EQ(0, vconf_set_str(VCONFKEY_REGIONFORMAT, "C"));
	ASSERT_EQ(0, vconf_set_str(VCONFKEY_CSC_COUNTRY_ISO, "de"));
	EXPECT_EQ("DE", ContactsCommon::getRegionCode());
}

TEST(ContactsCommon, ResourcePathsResolveNamesUnderTheResourceFolder)
{
	ct::test::TempDataDir dir;
	ct::test::EnvScope resources("CONTACTS_RES_DIR", dir.path().c_str());
	mkdir((dir.path() + "/edje").c_str(), 0700);
	std::ofstream(dir.path() + "/edje/detail_layout.edj") << "x";

	std::string path;
	EXPECT_TRUE(ContactsCommon::getAppEdjePath("contacts/detail_layout.edj", path));
	EXPECT_EQ(dir.path() + "/edje/detail_layout.edj", path);
	EXPECT_FALSE(ContactsCommon::getAppEdjePath("contacts/missing.edj", path));
	EXPECT_TRUE(path.empty());
	EXPECT_TRUE(ContactsCommon::getAppEdjePath("contacts/missing.edj", path, false));
	EXPECT_FALSE(ContactsCommon::getAppEdjePath(nullptr, path));
	EXPECT_EQ("", ContactsCommon::getAppImagePath("nothing.png"));
	EXPECT_EQ(dir.path() + "/images/nothing.png", ContactsCommon::getAppImagePath("nothing.png", false));
}
