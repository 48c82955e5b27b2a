#include "vconf.h"

#include "LogSink.h"
#include "SqliteFaultInjector.h"
#include "StoreTestSupport.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <memory>
#include <string>
#include <thread>
#include <vector>

using namespace ct::test;

namespace {

std::string getString(const char* key)
{
	std::unique_ptr<char, decltype(&free)> value(vconf_get_str(key), free);
	return value ? value.get() : "<null>";
}

int getInt(const char* key)
{
	int value = -999;
	EXPECT_EQ(VCONF_OK, vconf_get_int(key, &value)) << key;
	return value;
}

class Vconf : public testing::Test {
protected:
	void SetUp() override { vconf_close_store(); }
	void TearDown() override { vconf_close_store(); }

	TempDataDir m_dir;
	EcoreScope m_ecore;
};

struct Recorder {
	std::vector<std::string> names;
	std::vector<int> ints;
	std::vector<std::string> strings;
	int calls() const { return static_cast<int>(names.size()); }
};

void recordCb(keynode_t* node, void* data)
{
	auto* recorder = static_cast<Recorder*>(data);
	recorder->names.push_back(vconf_keynode_get_name(node));
	if (vconf_keynode_get_type(node) == VCONF_TYPE_INT)
		recorder->ints.push_back(vconf_keynode_get_int(node));
	if (vconf_keynode_get_type(node) == VCONF_TYPE_STRING)
		recorder->strings.push_back(vconf_keynode_get_str(node));
}

} // namespace

TEST_F(Vconf, KnownKeysReadTheirDefaultsUntilSetAndSettersMayChangeTheType)
{
	EXPECT_EQ(1, getInt(VCONFKEY_TELEPHONY_SIM_POWER_STATE2));
	EXPECT_EQ("en_US", getString(VCONFKEY_REGIONFORMAT));
	// Reading a default does not write it.
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1);
	EXPECT_EQ(VCONF_OK, vconf_unset(VCONFKEY_SETAPPL_PSMODE));
	EXPECT_EQ(0, getInt(VCONFKEY_SETAPPL_PSMODE));
	EXPECT_EQ(VCONF_ERROR_FILE_NO_ENT, vconf_unset(VCONFKEY_SETAPPL_PSMODE));

	double real = 0;
	int value = 0;
	ASSERT_EQ(VCONF_OK, vconf_set_dbl("db/test/ratio", 0.25));
	ASSERT_EQ(VCONF_OK, vconf_set_bool("db/test/ratio", 5));
	EXPECT_EQ(VCONF_OK, vconf_get_bool("db/test/ratio", &value));
	EXPECT_EQ(1, value);
	EXPECT_EQ(VCONF_ERROR_WRONG_TYPE, vconf_get_dbl("db/test/ratio", &real));
}

TEST_F(Vconf, UnknownKeysWrongTypesAndBadValuesAreReportedWithoutWriting)
{
	int value = 7;
	EXPECT_EQ(VCONF_ERROR_FILE_NO_ENT, vconf_get_int("db/unknown/key", &value));
	EXPECT_EQ(7, value);
	EXPECT_EQ(nullptr, vconf_get_str("db/unknown/key"));
	EXPECT_EQ(VCONF_TYPE_NONE, vconf_get_type("db/unknown/key"));
	ct::log::clear();
	EXPECT_EQ(VCONF_ERROR_WRONG_TYPE, vconf_get_int(VCONFKEY_REGIONFORMAT, &value));
	EXPECT_TRUE(ct::log::contains("* Critical * vconf key db/menu_widget/regionformat holds type"));
	EXPECT_EQ(VCONF_ERROR_WRONG_TYPE, vconf_get_bool(VCONFKEY_SETAPPL_PSMODE, &value));
	EXPECT_EQ(nullptr, vconf_get_str(VCONFKEY_SETAPPL_PSMODE));

	std::string longKey(257, 'k');
	std::string longValue(4097, 'v');
	EXPECT_EQ(VCONF_ERROR_INVALID_PARAMETER, vconf_get_int(nullptr, &value));
	EXPECT_TRUE(ct::log::contains("* Critical * invalid vconf key"));
	EXPECT_EQ(VCONF_ERROR_INVALID_PARAMETER, vconf_get_int(VCONFKEY_SETAPPL_PSMODE, nullptr));
	for (const char* key : {"", longKey.c_str(), "db/test/\xff\xfe"})
		EXPECT_EQ(VCONF_ERROR_INVALID_PARAMETER, vconf_set_int(key, 1));
	EXPECT_EQ(VCONF_OK, vconf_set_int(longKey.substr(1).c_str(), 1));
	EXPECT_EQ(nullptr, vconf_get_str(nullptr));
	EXPECT_EQ(VCONF_TYPE_NONE, vconf_get_type(nullptr));

	ASSERT_EQ(VCONF_OK, vconf_set_str("db/test/name", "before"));
	for (const char* bad : {static_cast<const char*>(nullptr), longValue.c_str(), "\xc3\x28"})
		EXPECT_EQ(VCONF_ERROR_INVALID_PARAMETER, vconf_set_str("db/test/name", bad));
	EXPECT_EQ("before", getString("db/test/name"));
	EXPECT_EQ(VCONF_OK, vconf_set_str("db/test/name", longValue.substr(1).c_str()));
	EXPECT_EQ(4096u, getString("db/test/name").size());

	EXPECT_EQ(VCONF_ERROR_INVALID_PARAMETER, vconf_notify_key_changed("db/test/name", nullptr, nullptr));
	EXPECT_EQ(VCONF_ERROR_INVALID_PARAMETER, vconf_notify_key_changed(nullptr, recordCb, nullptr));
	EXPECT_EQ(VCONF_TYPE_NONE, vconf_keynode_get_type(nullptr));
	EXPECT_EQ(nullptr, vconf_keynode_get_name(nullptr));
}

TEST_F(Vconf, ValuesSurviveReopenAndAFailedWriteKeepsThePreviousValue)
{
	ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1));
	ASSERT_EQ(VCONF_OK, vconf_set_str(VCONFKEY_SETAPPL_SIM1_NAME, "Work \xe2\x98\x8e"));
	ASSERT_EQ(VCONF_OK, vconf_set_bool("db/test/flag", 1));
	{
		ct::db::ScopedWriteFailure diskFull(1);
		EXPECT_EQ(VCONF_ERROR_FILE_NO_SPACE, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0));
		EXPECT_EQ(VCONF_ERROR_FILE_NO_SPACE, vconf_set_str("db/test/new", "x"));
	}
	EXPECT_EQ(1, getInt(VCONFKEY_SETAPPL_PSMODE));
	vconf_close_store();

	EXPECT_EQ(1, getInt(VCONFKEY_SETAPPL_PSMODE));
	EXPECT_EQ(nullptr, vconf_get_str("db/test/new"));
	EXPECT_EQ("Work \xe2\x98\x8e", getString(VCONFKEY_SETAPPL_SIM1_NAME));
	int flag = 0;
	EXPECT_EQ(VCONF_OK, vconf_get_bool("db/test/flag", &flag));
	EXPECT_EQ(1, flag);
}

TEST_F(Vconf, UnusableFolderOrGarbageStoreIsAnErrorAndTheFileIsLeftAlone)
{
	int value = 0;
	{
		UnusableDataDir unusable(m_dir);
		EXPECT_EQ(VCONF_ERROR_FILE_PERM, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1));
		EXPECT_EQ(VCONF_ERROR_FILE_PERM, vconf_get_int(VCONFKEY_SETAPPL_PSMODE, &value));
		EXPECT_EQ(nullptr, vconf_get_str(VCONFKEY_REGIONFORMAT));
	}
	std::string path = m_dir.file("vconf.db");
	std::ofstream(path, std::ios::binary) << std::string(8192, 'g');
	ct::log::clear();
	EXPECT_EQ(VCONF_ERROR, vconf_get_int(VCONFKEY_SETAPPL_PSMODE, &value));
	EXPECT_EQ(VCONF_ERROR, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1));
	EXPECT_TRUE(ct::log::contains("vconf store unavailable", DLOG_ERROR));
	EXPECT_EQ(8192u, std::filesystem::file_size(path));
}

namespace {

Recorder g_removed;

void removedCb(keynode_t* node, void*)
{
	recordCb(node, &g_removed);
}

void removeOthersCb(keynode_t* node, void* data)
{
	recordCb(node, data);
	vconf_ignore_key_changed(vconf_keynode_get_name(node), removedCb);
	vconf_ignore_key_changed(vconf_keynode_get_name(node), removeOthersCb);
}

} // namespace

TEST_F(Vconf, CallbacksSeeOwnChangesOnTheMainLoopAndFollowTheStoreToANewFolder)
{
	Recorder first, second;
	ASSERT_EQ(VCONF_OK, vconf_notify_key_changed(VCONFKEY_SETAPPL_PSMODE, recordCb, &first));
	// Registering the same pair again only replaces its user data.
	ASSERT_EQ(VCONF_OK, vconf_notify_key_changed(VCONFKEY_SETAPPL_PSMODE, recordCb, &second));
	ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1));
	EXPECT_TRUE(second.ints.empty()) << "delivered before the main loop ran";
	ASSERT_TRUE(pumpUntil([&] { return !second.ints.empty(); }));
	EXPECT_TRUE(first.names.empty());
	EXPECT_EQ(std::vector<std::string>{VCONFKEY_SETAPPL_PSMODE}, second.names);
	EXPECT_EQ(std::vector<int>{1}, second.ints);

	// Removing the key tells the callback it went back to its default.
	ASSERT_EQ(VCONF_OK, vconf_unset(VCONFKEY_SETAPPL_PSMODE));
	ASSERT_TRUE(pumpUntil([&] { return second.ints.size() == 2; }));
	EXPECT_EQ(0, second.ints[1]);

	{
		TempDataDir other;
		EXPECT_EQ(0, getInt(VCONFKEY_SETAPPL_PSMODE)) << "the new folder starts from the defaults";
		ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1));
		ASSERT_TRUE(pumpUntil([&] { return second.ints.size() == 3; }));
		EXPECT_EQ(1, second.ints[2]);
	}

	// Other keys do not call it, nor does the key once ignored.
	ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_SETAPPL_SIM1_ICON, 3));
	ASSERT_EQ(VCONF_OK, vconf_ignore_key_changed(VCONFKEY_SETAPPL_PSMODE, recordCb));
	EXPECT_EQ(VCONF_ERROR, vconf_ignore_key_changed(VCONFKEY_SETAPPL_PSMODE, recordCb));
	ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0));
	pumpFor(0.3);
	EXPECT_EQ(3, second.calls());

	// A callback removed by another one during delivery is not called.
	Recorder remover;
	ASSERT_EQ(VCONF_OK, vconf_notify_key_changed(VCONFKEY_REGIONFORMAT, removeOthersCb, &remover));
	ASSERT_EQ(VCONF_OK, vconf_notify_key_changed(VCONFKEY_REGIONFORMAT, removedCb, nullptr));
	ASSERT_EQ(VCONF_OK, vconf_set_str(VCONFKEY_REGIONFORMAT, "de_DE"));
	ASSERT_TRUE(pumpUntil([&] { return remover.calls() == 1; }));
	ASSERT_EQ(VCONF_OK, vconf_set_str(VCONFKEY_REGIONFORMAT, "fr_FR"));
	pumpFor(0.3);
	EXPECT_EQ(1, remover.calls());
	EXPECT_EQ(0, g_removed.calls());
}

TEST_F(Vconf, WritesFromAnotherThreadOrProcessAreDeliveredOnTheMainLoop)
{
	Recorder recorder;
	static std::thread::id deliveredOn;
	auto threadCb = [](keynode_t* node, void* data) {
		deliveredOn = std::this_thread::get_id();
		recordCb(node, data);
	};
	ASSERT_EQ(VCONF_OK, vconf_notify_key_changed(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, threadCb, &recorder));
	int result = -1;
	std::thread([&] { result = vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, 0); }).join();
	ASSERT_EQ(VCONF_OK, result);
	ASSERT_TRUE(pumpUntil([&] { return !recorder.ints.empty(); }));
	EXPECT_EQ(0, recorder.ints[0]);
	EXPECT_EQ(std::this_thread::get_id(), deliveredOn);
	vconf_ignore_key_changed(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, threadCb);

	if (contactsCtlPath().empty())
		GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
	ASSERT_EQ(VCONF_OK, vconf_notify_key_changed(VCONFKEY_SETAPPL_SIM1_NAME, recordCb, &recorder));
	ASSERT_EQ(0, runContactsCtl("vconf set db/setting/sim1_name string Travel"));
	ASSERT_TRUE(pumpUntil([&] { return !recorder.strings.empty(); }));
	EXPECT_EQ("Travel", recorder.strings[0]);
	EXPECT_EQ("Travel", getString(VCONFKEY_SETAPPL_SIM1_NAME));
	std::string output;
	ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1));
	ASSERT_EQ(0, runContactsCtl("vconf get db/setting/psmode", &output));
	EXPECT_EQ("1\n", output);
	vconf_ignore_key_changed(VCONFKEY_SETAPPL_SIM1_NAME, recordCb);
}
