#include "phone_misc.h"

#include "../vconf/StoreTestSupport.h"
#include "SqliteFaultInjector.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

class CallBlock : public testing::Test {
protected:
	void SetUp() override { ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_connect(&m_handle)); }
	void TearDown() override
	{
		if (m_handle)
			phone_misc_disconnect(m_handle);
	}

	bool isBlocked(const char* number)
	{
		int out = -1;
		int rc = phone_misc_block_find(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, number, &out);
		EXPECT_GE(rc, 0) << number;
		EXPECT_EQ(rc, out);
		return rc > 0;
	}

	ct::test::TempDataDir m_dir;
	ct::test::EcoreScope m_ecore;
	phone_misc_h m_handle = nullptr;
};

void countCb(void* data)
{
	++*static_cast<int*>(data);
}

void appendNumber(const char* number, void* data)
{
	static_cast<std::vector<std::string>*>(data)->push_back(number);
}

} // namespace

TEST_F(CallBlock, NumbersMatchWhateverTheirFormatting)
{
	EXPECT_FALSE(isBlocked("+1 555 010 2000"));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_add(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, "+1 (555) 010-2000"));
	EXPECT_TRUE(isBlocked("+15550102000"));
	EXPECT_TRUE(isBlocked(" +1-555-010-2000"));
	// Only a leading '+' counts; without it the number is another one.
	EXPECT_FALSE(isBlocked("15550102000"));
	EXPECT_FALSE(isBlocked("1+5550102000"));
	EXPECT_EQ(PHONE_MISC_ERROR_ALREADY_EXISTS, phone_misc_block_add(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, "+1.555.010.2000"));

	// Message blocking is a separate list.
	int out = -1;
	EXPECT_EQ(0, phone_misc_block_find(m_handle, PHONE_MISC_BLOCK_TYPE_MESSAGE, "+15550102000", &out));
	EXPECT_EQ(0, out);

	EXPECT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_remove(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, "+1 555-010-2000"));
	EXPECT_FALSE(isBlocked("+15550102000"));
	EXPECT_EQ(PHONE_MISC_ERROR_NO_DATA, phone_misc_block_remove(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, "+15550102000"));
}

TEST_F(CallBlock, ListSurvivesReconnectAndAFullDiskChangesNothing)
{
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_add(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, "0102 345"));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_add(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, "+44 20 7946 0000"));
	{
		ct::db::ScopedWriteFailure diskFull(1);
		EXPECT_EQ(PHONE_MISC_ERROR_NO_SPACE, phone_misc_block_add(m_handle, 1, "222"));
		EXPECT_EQ(PHONE_MISC_ERROR_NO_SPACE, phone_misc_block_remove(m_handle, 1, "0102345"));
	}
	phone_misc_disconnect(m_handle);
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_connect(&m_handle));
	std::vector<std::string> numbers;
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_foreach(m_handle, PHONE_MISC_BLOCK_TYPE_CALL, appendNumber, &numbers));
	EXPECT_EQ((std::vector<std::string>{"+442079460000", "0102345"}), numbers);
}

TEST_F(CallBlock, BadArgumentsAreRejected)
{
	int out = 7;
	std::string huge(1025, '1');
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_connect(nullptr));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_disconnect(nullptr));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_block_find(nullptr, 1, "123", &out));
	EXPECT_EQ(0, out);
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_block_find(m_handle, 1, nullptr, &out));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_block_find(m_handle, 9, "123", &out));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_block_add(m_handle, 1, "+-() "));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_block_add(m_handle, 1, ""));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_block_add(m_handle, 1, huge.c_str()));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_add_block_db_change_cb(m_handle, nullptr, nullptr));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_add_block_db_change_cb(nullptr, countCb, nullptr));
	EXPECT_EQ(PHONE_MISC_ERROR_NO_DATA, phone_misc_remove_block_db_change_cb(m_handle, countCb));
	EXPECT_EQ(PHONE_MISC_ERROR_INVALID_PARAMETER, phone_misc_block_foreach(m_handle, 1, nullptr, nullptr));
}

TEST_F(CallBlock, OwnAndOtherProcessesChangesCallBackOnTheMainLoop)
{
	int calls = 0, otherCalls = 0;
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_add_block_db_change_cb(m_handle, countCb, &otherCalls));
	// Adding the same callback again replaces its data.
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_add_block_db_change_cb(m_handle, countCb, &calls));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_add(m_handle, 1, "333"));
	EXPECT_EQ(0, calls);
	ASSERT_TRUE(ct::test::pumpUntil([&] { return calls == 1; }));
	// A write that changes nothing calls nobody.
	EXPECT_EQ(PHONE_MISC_ERROR_ALREADY_EXISTS, phone_misc_block_add(m_handle, 1, "333"));
	ct::test::pumpFor(0.3);
	EXPECT_EQ(1, calls);
	EXPECT_EQ(0, otherCalls);

	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_remove_block_db_change_cb(m_handle, countCb));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_remove(m_handle, 1, "333"));
	ct::test::pumpFor(0.3);
	EXPECT_EQ(1, calls);

	// Writes of another process call back too.
	if (ct::test::contactsCtlPath().empty())
		GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_add_block_db_change_cb(m_handle, countCb, &calls));
	ASSERT_EQ(0, ct::test::runContactsCtl("block add 010-555-0199"));
	ASSERT_TRUE(ct::test::pumpUntil([&] { return calls >= 2; }));
	EXPECT_TRUE(isBlocked("0105550199"));
	ASSERT_EQ(0, ct::test::runContactsCtl("block remove 0105550199"));
	ASSERT_TRUE(ct::test::pumpUntil([&] { return calls >= 3; }));
	EXPECT_FALSE(isBlocked("010 555 0199"));
}

TEST_F(CallBlock, DisconnectInsideTheCallbackIsSafe)
{
	struct {
		phone_misc_h handle = nullptr;
		int calls = 0;
	} state;
	int later = 0;
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_connect(&state.handle));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_add_block_db_change_cb(state.handle, [](void* data) {
		auto* self = static_cast<decltype(state)*>(data);
		self->calls++;
		phone_misc_disconnect(self->handle);
	}, &state));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_add_block_db_change_cb(state.handle, countCb, &later));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_add(state.handle, 1, "444"));
	ASSERT_TRUE(ct::test::pumpUntil([&] { return state.calls == 1; }));
	ct::test::pumpFor(0.2);
	EXPECT_EQ(0, later);
	EXPECT_TRUE(isBlocked("444"));
}
