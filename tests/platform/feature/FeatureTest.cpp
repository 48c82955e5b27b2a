#include "csc_feature.h"

#include "FeatureFlags.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <string>

namespace {

void writeFile(const std::string& path, const std::string& text)
{
	std::ofstream out(path, std::ios::trunc);
	out << text;
}

class EnvFeatures {
public:
	explicit EnvFeatures(const char* value) { setenv("CONTACTS_FEATURES", value, 1); }
	~EnvFeatures() { unsetenv("CONTACTS_FEATURES"); }
};

} // namespace

TEST(Features, FlagsAreOffUntilTheFileOrTheEnvironmentSetsThemAndChangesAreReread)
{
	ct::test::TempDataDir dir;
	for (int flag : {int(CSC_FEATURE_CONTACTS_HIDE_ADDRESS_ROW), int(CSC_FEATURE_CONTACTS_EASY_SIGNUP), -1, 0})
		EXPECT_FALSE(csc_feature_get_bool(flag)) << flag;
	std::string path = dir.file("features.conf");
	writeFile(path, "# device configuration\n88=true\n12 = TRUE  # style two\n13=false\n");
	EXPECT_TRUE(csc_feature_get_bool(88));
	EXPECT_TRUE(csc_feature_get_bool(12));
	EXPECT_FALSE(csc_feature_get_bool(13));

	// Same length, written right away: the change is still seen.
	writeFile(path, "# device configuration\n88=fals\n12 = TRUE  # style two\n13=true\n");
	EXPECT_FALSE(csc_feature_get_bool(88));
	EXPECT_TRUE(csc_feature_get_bool(13));
	{
		EnvFeatures env("88, 12,,x7,-3");
		EXPECT_TRUE(csc_feature_get_bool(88));
		EXPECT_FALSE(csc_feature_get_bool(7));
	}
	std::remove(path.c_str());
	EXPECT_FALSE(csc_feature_get_bool(12));
}

TEST(Features, MalformedLinesAreSkipped)
{
	auto flags = ct::feature::FeatureFlags::parseFile(
		"88\n=true\nabc=true\n12=maybe\n99999999999=true\n5=1\n6=0\n\n   # only a comment\n7=true");
	EXPECT_EQ((std::map<int, bool>{{5, true}, {6, false}, {7, true}}), flags);
	EXPECT_EQ((std::set<int>{1, 2}), ct::feature::FeatureFlags::parseList(" 1,2 ,2, ,+3,4a"));
}
