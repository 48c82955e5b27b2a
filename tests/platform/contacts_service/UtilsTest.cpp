// Ringtone information and case-insensitive search.
#include "../contacts_db/ContactsTestSupport.h"

#include <cstdlib>

using namespace ct::test;

TEST(Utils, StrstrFindsMultiByteMatchesIgnoringCase)
{
	int len = -1;
	EXPECT_EQ(0, contacts_utils_strstr("Anna", "an", &len));
	EXPECT_EQ(2, len);
	EXPECT_EQ(6, contacts_utils_strstr("Maria ÁBEL", "ábel", &len));
	EXPECT_EQ(5, len); // "ÁBEL" is 5 bytes
	EXPECT_EQ(3, contacts_utils_strstr("김철수 김영희", " 김영", &len) - 6);
	EXPECT_EQ(-1, contacts_utils_strstr("Anna", "x", &len));
	EXPECT_EQ(0, len);
	EXPECT_EQ(-1, contacts_utils_strstr(nullptr, "x", &len));
	EXPECT_EQ(-1, contacts_utils_strstr("Anna", "", &len));
	EXPECT_EQ(-1, contacts_utils_strstr("bad \xff", "a", &len));
	EXPECT_EQ(-1, contacts_utils_strstr("Anna", "a", nullptr));
}

TEST(Utils, RingtoneInfoIsStoredPerKindAndId)
{
	ConnectedStore store;
	char* path = nullptr;
	int flag = 0;
	long long position = 0;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_utils_get_ringtone_info(1, 5, &path, &flag, &position));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_utils_set_ringtone_info(1, 5, "/music/a.mp3", 1, 12345678901LL));
	store.reopen();
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_utils_get_ringtone_info(1, 5, &path, &flag, &position));
	EXPECT_STREQ("/music/a.mp3", path);
	free(path);
	EXPECT_EQ(1, flag);
	EXPECT_EQ(12345678901LL, position);
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_utils_get_ringtone_info(0, 5, &path, &flag, &position));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_utils_set_ringtone_info(1, 5, nullptr, 0, 0));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_utils_get_ringtone_info(1, 5, &path, &flag, &position));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_utils_set_ringtone_info(1, -1, "/x", 1, 0));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_utils_get_ringtone_info(7, 1, &path, &flag, &position));
}
