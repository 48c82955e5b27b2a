#include "../vconf/StoreTestSupport.h"
#include "app_preference.h"
#include "bundle.h"
#include "vconf.h"
#include "velmora_log_manager.h"

#include <gtest/gtest.h>

#include <string>

namespace {

class ContactsCtl : public testing::Test {
protected:
	void SetUp() override
	{
		if (ct::test::contactsCtlPath().empty())
			GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
		vconf_close_store();
		preference_close_store();
	}
	void TearDown() override
	{
		vconf_close_store();
		preference_close_store();
	}

	std::string run(const std::string& args, int expectedExit = 0)
	{
		std::string output;
		EXPECT_EQ(expectedExit, ct::test::runContactsCtl(args, &output)) << args;
		return output;
	}

	ct::test::TempDataDir m_dir;
};

bool contains(const std::string& text, const std::string& part) { return text.find(part) != std::string::npos; }

} // namespace

TEST_F(ContactsCtl, SelfcheckStartsEveryStoreInTheDataFolderOrFailsWhenItIsUnusable)
{
	std::string out = run("selfcheck");
	EXPECT_TRUE(contains(out, "data folder: " + m_dir.path()));
	for (const char* file : {"vconf.db", "preferences.db", "callblock.db", "usagelog.db"})
		EXPECT_TRUE(contains(out, m_dir.file(file))) << file;
	EXPECT_TRUE(contains(out, "psmode=0 sim1 power=1 region=en_US"));
	EXPECT_TRUE(contains(out, "all services work"));
	ct::test::UnusableDataDir unusable(m_dir);
	EXPECT_TRUE(contains(run("selfcheck", 1), "some services failed"));
}

TEST_F(ContactsCtl, BadArgumentsPrintUsageAndExitTwo)
{
	for (const char* args : {"", "frobnicate", "vconf", "vconf get", "vconf set db/setting/psmode int",
			 "vconf set db/setting/psmode int twelve", "vconf set db/setting/psmode float 1", "pref set k bool maybe",
			 "block add", "block add no-digits", "usage", "features extra"})
		run(args, 2);
	EXPECT_TRUE(contains(run("help"), "contacts-ctl vconf set KEY int|bool|double|string VALUE"));
}

TEST_F(ContactsCtl, ReadsAndWritesTheSameStoresAsTheLibrary)
{
	// Plain sets and gets across processes are in the vconf, preference and call-block tests.
	EXPECT_EQ("1\n", run("vconf get db/menu_widget/regionformat_time1224"));
	ASSERT_EQ(VCONF_OK, vconf_set_bool("db/test/flag", 1));
	EXPECT_EQ("true\n", run("vconf get db/test/flag"));
	run("vconf get db/test/none", 1);
	run("vconf unset db/test/flag");
	run("vconf get db/test/flag", 1);

	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_string(PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK, "SIM1"));
	EXPECT_EQ("SIM1\n", run("pref get input_base_addressbook"));
	run("pref set count int 12");
	EXPECT_EQ("12\n", run("pref get count"));
	run("pref remove count");
	run("pref remove count", 1);

	run("block add \"+1 555 010 2000\"");
	run("block add +15550102000", 1);
	run("block add 0102");
	EXPECT_EQ("+15550102000\n0102\n", run("block list"));
	EXPECT_EQ("blocked\n", run("block check \"+1-555-010-2000\""));
	run("block remove 0103", 1);
}

TEST_F(ContactsCtl, ListsUsageRecordsAndFeatures)
{
	velmora_log_manager_h handle = nullptr;
	ASSERT_EQ(0, velmora_log_manager_create(&handle));
	bundle* b = bundle_create();
	bundle_add_str(b, "app_id", "org.example.contacts");
	bundle_add_str(b, "feature", "CT12");
	bundle_add_str(b, "extra", "Profile sharing");
	ASSERT_EQ(0, velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, b, 0, 0, nullptr));
	bundle_free(b);
	velmora_log_manager_destroy(handle);
	std::string out = run("usage list");
	EXPECT_TRUE(contains(out, "\tcontent://usagelog/feature\torg.example.contacts\tCT12\tProfile sharing\t\n")) << out;

	std::ofstream(m_dir.file("features.conf")) << "13=true\n";
	out = run("features");
	EXPECT_TRUE(contains(out, "88=false\t(hide address row)"));
	EXPECT_TRUE(contains(out, "13=true\t(easy sign-up)"));
}

TEST_F(ContactsCtl, SharingSetsNetworkAndSimsFromOutsideAndShowsTheSettings)
{
	preference_set_boolean("profile_sharing_status", true);
	preference_set_boolean("profile_sharing_property_1", true);
	preference_close_store();
	run("sharing network down");
	run("sharing sim 1 out");
	run("sharing sim 2 in");
	EXPECT_EQ("sharing=on network=down sim1=out sim2=in type=personal privacy=1 fields=organisation\n", run("sharing"));
	vconf_close_store();
	int value = -1;
	vconf_get_int("memory/network/status", &value);
	EXPECT_EQ(0, value);
	run("sharing network up");
	EXPECT_TRUE(contains(run("sharing show"), "network=up"));
	for (const char* args : {"sharing network sideways", "sharing sim 3 in", "sharing sim 1", "sharing show more"})
		run(args, 2);
}
