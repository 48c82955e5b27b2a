#include "ContactsCommon.h"
#include "../CommonTestSupport.h"

#include <vconf.h>

#include <fstream>
#include <tuple>
#include <sys/stat.h>

TEST(ContactsCommon, NumberDashesFollowTheRegion)
{
	// Known formats get dashes; what the region does not know stays as typed.
	const std::tuple<const char*, const char*, const char*> cases[] = {{"2015550123", "US", "201-555-0123"},
		{"+12015550123", "US", "+1-201-555-0123"}, {"0212345678", "KR", "02-1234-5678"},
		{"01012345678", "KR", "010-1234-5678"}, {"030123456", "DE", "030-123456"},
		{"02079460018", "GB", "020-7946-0018"}, {"112", "US", "112"}, {"*123#", "US", "*123#"},
		{"hello", "US", "hello"}, {nullptr, "US", ""}, {"2015550123", nullptr, "2015550123"}};
	for (const auto& [number, region, dashed] : cases)
		EXPECT_EQ(dashed, ContactsCommon::addNumberDashesForRegion(number, region)) << (number ? number : "null");
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
