#include "app_preference.h"

#include "../vconf/StoreTestSupport.h"
#include "SqliteFaultInjector.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

namespace {

class Preference : public testing::Test {
protected:
	void SetUp() override { preference_close_store(); }
	void TearDown() override { preference_close_store(); }

	ct::test::TempDataDir m_dir;
	ct::test::EcoreScope m_ecore;
};

std::string getString(const char* key)
{
	char* value = nullptr;
	if (preference_get_string(key, &value) != PREFERENCE_ERROR_NONE)
		return "<missing>";
	std::string copy = value;
	free(value);
	return copy;
}

bool exists(const char* key)
{
	bool result = true;
	EXPECT_EQ(PREFERENCE_ERROR_NONE, preference_is_existing(key, &result));
	return result;
}

void recordKey(const char* key, void* data)
{
	static_cast<std::vector<std::string>*>(data)->push_back(key);
}

} // namespace

TEST_F(Preference, MissingKeysAreMissingAndTypedValuesSurviveReopenButNotRemoval)
{
	bool flag = true;
	int number = 5;
	double real = 0;
	EXPECT_FALSE(exists(PREFERENCE_KEY_HIDE_STORAGE_POPUP));
	EXPECT_EQ(PREFERENCE_ERROR_NO_KEY, preference_get_boolean(PREFERENCE_KEY_HIDE_STORAGE_POPUP, &flag));
	EXPECT_TRUE(flag);
	EXPECT_EQ(PREFERENCE_ERROR_NO_KEY, preference_get_int("count", &number));
	EXPECT_EQ(5, number);
	EXPECT_EQ(PREFERENCE_ERROR_NO_KEY, preference_remove(PREFERENCE_KEY_HAS_MYPROFILE_INFO));

	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_boolean(PREFERENCE_KEY_HIDE_STORAGE_POPUP, true));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_string(PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK, "SIM1"));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_int("count", -42));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_double("ratio", 2.5));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_string("empty", ""));
	preference_close_store();
	EXPECT_EQ(PREFERENCE_ERROR_NONE, preference_get_boolean(PREFERENCE_KEY_HIDE_STORAGE_POPUP, &flag));
	EXPECT_TRUE(flag);
	EXPECT_EQ("SIM1", getString(PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK));
	EXPECT_EQ(PREFERENCE_ERROR_NONE, preference_get_int("count", &number));
	EXPECT_EQ(-42, number);
	EXPECT_EQ(PREFERENCE_ERROR_NONE, preference_get_double("ratio", &real));
	EXPECT_DOUBLE_EQ(2.5, real);
	EXPECT_EQ("", getString("empty"));
	// A value of another type is an invalid request, not a conversion.
	EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_get_int(PREFERENCE_KEY_HIDE_STORAGE_POPUP, &number));
	EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_get_boolean("count", &flag));

	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_remove("count"));
	EXPECT_FALSE(exists("count"));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_remove_all());
	preference_close_store();
	EXPECT_FALSE(exists(PREFERENCE_KEY_HIDE_STORAGE_POPUP));
	EXPECT_FALSE(exists("ratio"));
}

TEST_F(Preference, BadInputIsRejected)
{
	std::string longKey(257, 'k');
	std::string longValue(4097, 'v');
	bool flag = false;
	char* text = nullptr;
	for (const char* key : {static_cast<const char*>(nullptr), "", longKey.c_str(), "\xc0\xaf"})
		EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_set_int(key, 1));
	for (const char* value : {static_cast<const char*>(nullptr), longValue.c_str(), "abc\xff"})
		EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_set_string("name", value));
	EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_get_boolean("name", nullptr));
	EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_get_string("name", nullptr));
	EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_get_string(nullptr, &text));
	EXPECT_EQ(nullptr, text);
	EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_is_existing("name", nullptr));
	EXPECT_EQ(PREFERENCE_ERROR_INVALID_PARAMETER, preference_set_changed_cb("name", nullptr, nullptr));
	EXPECT_EQ(PREFERENCE_ERROR_NO_KEY, preference_unset_changed_cb("name"));
	EXPECT_EQ(PREFERENCE_ERROR_NO_KEY, preference_get_boolean("name", &flag));
}

TEST_F(Preference, FailedWriteKeepsTheStoreAsItWas)
{
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_string(PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK, "phone"));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_boolean(PREFERENCE_KEY_HAS_MYPROFILE_INFO, true));
	{
		ct::db::ScopedWriteFailure diskFull(1);
		EXPECT_EQ(PREFERENCE_ERROR_NO_SPACE, preference_set_string(PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK, "SIM2"));
		EXPECT_EQ(PREFERENCE_ERROR_NO_SPACE, preference_remove_all());
		EXPECT_EQ(PREFERENCE_ERROR_NO_SPACE, preference_remove(PREFERENCE_KEY_HAS_MYPROFILE_INFO));
	}
	preference_close_store();
	EXPECT_EQ("phone", getString(PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK));
	EXPECT_TRUE(exists(PREFERENCE_KEY_HAS_MYPROFILE_INFO));
}

namespace {

void unsetSelfCb(const char* key, void* data)
{
	recordKey(key, data);
	preference_unset_changed_cb(key);
}

} // namespace

TEST_F(Preference, ChangedCallbackFollowsSetRemoveUnsetAndOtherProcessesAndMayUnsetItself)
{
	std::vector<std::string> first, second, self;
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_changed_cb(PREFERENCE_KEY_HIDE_STORAGE_POPUP, recordKey, &first));
	// One callback per key: setting it again replaces the first.
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_changed_cb(PREFERENCE_KEY_HIDE_STORAGE_POPUP, recordKey, &second));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_changed_cb("a", unsetSelfCb, &self));

	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_boolean(PREFERENCE_KEY_HIDE_STORAGE_POPUP, true));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_int("other", 1));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_int("a", 1));
	ASSERT_TRUE(ct::test::pumpUntil([&] { return !second.empty() && !self.empty(); }));
	EXPECT_TRUE(first.empty());
	EXPECT_EQ(std::vector<std::string>{PREFERENCE_KEY_HIDE_STORAGE_POPUP}, second);

	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_remove_all());
	ASSERT_TRUE(ct::test::pumpUntil([&] { return second.size() == 2; }));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_unset_changed_cb(PREFERENCE_KEY_HIDE_STORAGE_POPUP));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_boolean(PREFERENCE_KEY_HIDE_STORAGE_POPUP, false));
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_int("a", 2));
	ct::test::pumpFor(0.3);
	EXPECT_EQ(2u, second.size());
	EXPECT_EQ(1u, self.size());

	// Writes of another process reach the callback too.
	if (ct::test::contactsCtlPath().empty())
		GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
	const char* key = PREFERENCE_KEY_SHARING_SELECTED_CONTACTS_SET;
	ASSERT_EQ(PREFERENCE_ERROR_NONE, preference_set_changed_cb(key, recordKey, &first));
	ASSERT_EQ(0, ct::test::runContactsCtl(std::string("pref set ") + key + " bool true"));
	ASSERT_TRUE(ct::test::pumpUntil([&] { return first.size() == 1; }));
	bool flag = false;
	EXPECT_EQ(PREFERENCE_ERROR_NONE, preference_get_boolean(key, &flag));
	EXPECT_TRUE(flag);
	ASSERT_EQ(0, ct::test::runContactsCtl(std::string("pref remove ") + key));
	ASSERT_TRUE(ct::test::pumpUntil([&] { return first.size() == 2; }));
	EXPECT_FALSE(exists(key));
	preference_unset_changed_cb(key);
}
