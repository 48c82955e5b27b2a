// The record, address-book and text helpers given what screens can hand
// them by mistake: unknown ids, null records and lists, invalid UTF-8 and
// very long texts. Each gives an empty result, never a crash.
#include "../../data/detail/DetailTestStore.h"

#include "ContactsCommon.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"
#include "ScreenHarness.h"
#include "TempDataDir.h"

#include <glib.h>

#include <cstdlib>
#include <memory>
#include <string>

using namespace ct::test;

namespace {

using CText = std::unique_ptr<char, decltype(&free)>;

CText take(char* text)
{
	return CText(text, free);
}

class HelpersBadInputTest : public ::testing::Test {
protected:
	void SetUp() override { ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect()); }
	void TearDown() override { contacts_disconnect(); }
	TempDataDir m_dir;
};

} // namespace

TEST_F(HelpersBadInputTest, UnknownAddressbookIdsGiveEmptyAnswers)
{
	for (int id : {-7, 4242}) {
		SCOPED_TRACE(id);
		EXPECT_FALSE(ctCommonIsSimAddressbook(id));
		EXPECT_EQ(take(ctCommonGetAddressBookName(id)), nullptr);
		char* provider = nullptr;
		char* user = nullptr;
		EXPECT_LT(ctCommonGetProviderNameByAddressbookId(id, &provider, &user), 0);
		EXPECT_EQ(provider, nullptr);
		EXPECT_EQ(user, nullptr);
		EXPECT_EQ(ctCommonGetAccountIconPathByAddressbookId(id), "");
		EXPECT_EQ(ctCommonGetEasDefaultGroupId(id), 0);
	}
	EXPECT_EQ(ctCommonGetAddressBookId(nullptr), -1);
	EXPECT_EQ(ctCommonGetAddressBookId("no such book"), -1);
	EXPECT_EQ(ctCommonGetAddressBookId("bad\xff\xfe"), -1);
	EXPECT_EQ(ctCommonGetAddressBookId(std::string(200000, 'b').c_str()), -1);
}

TEST_F(HelpersBadInputTest, UnknownPersonsAndNullRecordsGiveEmptyAnswers)
{
	for (int personId : {0, -3, 99999}) {
		SCOPED_TRACE(personId);
		EXPECT_EQ(ctCommonGetContactsList(personId), nullptr);
		EXPECT_FALSE(ctCommonIsSimContact(personId));
		EXPECT_EQ(take(CtCommonGetShareText(personId)), nullptr);
		EXPECT_EQ(ctCommonGetWritableContactList(personId, 0), nullptr);
	}
	EXPECT_TRUE(ScreenHarness::logContains("Invalid param : personId"));
	EXPECT_EQ(CtCommonGetChildDataList(nullptr, _contacts_contact.number), nullptr);
	ctCommonDestroyRecordList(nullptr);
	EXPECT_EQ(take(CtCommonGetCompany(nullptr)), nullptr);
	char* first = nullptr;
	char* second = nullptr;
	CtCommonGetExtraName1(nullptr, &first, &second);
	EXPECT_EQ(first, nullptr);
	EXPECT_EQ(second, nullptr);
	EXPECT_EQ(ctCommonGetGroupNames(nullptr), "");
	// A custom type without its record falls back to the generic label.
	EXPECT_STREQ(CtCommonGetNumberTypeStr(static_cast<contacts_record_h>(nullptr), CONTACTS_NUMBER_TYPE_CUSTOM),
		ContactsCommon::translate("IDS_PB_OPT_CUSTOM"));
	EXPECT_EQ(CtCommonGetDatetimeStr(nullptr, 2020, 2, 30), "");
}

TEST_F(HelpersBadInputTest, InvalidUtf8AndHugeTextsStayValidAndBounded)
{
	CText oneLine = take(ctCommonRemoveNewline("a\nb\r\xff"));
	ASSERT_NE(oneLine, nullptr);
	EXPECT_EQ(std::string(oneLine.get()).find('\n'), std::string::npos);
	EXPECT_EQ(take(ctCommonRemoveNewline(nullptr)), nullptr);

	CText plain = take(ctCommonMarkupToUtf8("<b>Bad\xc3\x28</b>&amp;"));
	ASSERT_NE(plain, nullptr);
	EXPECT_TRUE(g_utf8_validate(plain.get(), -1, nullptr));

	std::string huge(1 << 20, 'x');
	huge += "\xe2\x82";  // a character cut in half at the very end
	char out[64];
	ctCommonGetDisplayfileName(huge.c_str(), out, sizeof(out));
	EXPECT_LT(strlen(out), sizeof(out));
	EXPECT_TRUE(g_utf8_validate(out, -1, nullptr));
	ctCommonGetDisplayfileName(nullptr, out, sizeof(out));
	EXPECT_STREQ(out, "");

	char number[16];
	EXPECT_LT(ctCommonCleanNumber(huge.c_str(), number, sizeof(number)), static_cast<int>(sizeof(number)));
	std::string digits(5000, '7');
	EXPECT_EQ(ctCommonCleanNumberForSim(digits.c_str(), number, sizeof(number)), 15);
	EXPECT_EQ(ctCommonCleanNumber("\xff\xfe", number, sizeof(number)), 0);
	EXPECT_STREQ(number, "");

	std::string encoded;
	EXPECT_TRUE(ctCommontEncodeAddress("Stra\xdf" "e\xff", encoded));
	EXPECT_EQ(encoded.find_first_not_of(
				  "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789-._~%+ "),
		std::string::npos);
}
