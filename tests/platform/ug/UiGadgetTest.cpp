#include "UiGadget.h"

#include "LogSink.h"

#include <Ecore.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

using ct::ug::UiGadget;

namespace {

class UiGadgetTest : public testing::Test {
protected:
	void SetUp() override { ecore_init(); }
	void TearDown() override { ecore_shutdown(); }

	static void pump()
	{
		for (int i = 0; i < 5; ++i)
			ecore_main_loop_iterate();
	}
};

app_control_h makeResult(const char* key, const char* value)
{
	app_control_h h = nullptr;
	app_control_create(&h);
	app_control_add_extra_data(h, key, value);
	return h;
}

} // namespace

TEST_F(UiGadgetTest, ResultsReachTheHostAsCopiesUntilTheGadgetIsClosed)
{
	std::vector<std::string> seen;
	UiGadget gadget("contacts-details", [&](app_control_h result) {
		char* value = nullptr;
		app_control_get_extra_data(result, "is_success", &value);
		seen.push_back(value ? value : "");
		free(value);
	});
	app_control_h result = makeResult("is_success", "1");
	ASSERT_EQ(UG_ERROR_NONE, ug_send_result(gadget.handle(), result));
	app_control_add_extra_data(result, "is_success", "0");
	app_control_add_extra_data(result, "id", "9");
	ASSERT_EQ(UG_ERROR_NONE, ug_send_result(gadget.handle(), result));
	app_control_destroy(result);

	EXPECT_EQ((std::vector<std::string>{"1", "0"}), seen);
	EXPECT_EQ("1", gadget.resultValue(0, "is_success"));
	EXPECT_EQ("", gadget.resultValue(0, "id"));
	EXPECT_EQ("9", gadget.resultValue(1, "id"));
	EXPECT_EQ("", gadget.resultValue(5, "id"));
	EXPECT_EQ(UG_ERROR_INVALID_PARAMETER, ug_send_result(gadget.handle(), nullptr));

	// A closed gadget that still exists refuses everything.
	ug_destroy_me(gadget.handle());
	pump();
	EXPECT_TRUE(gadget.isDestroyed());
	result = makeResult("k", "v");
	EXPECT_EQ(UG_ERROR_INVALID_PARAMETER, ug_send_result(gadget.handle(), result));
	EXPECT_EQ(UG_ERROR_INVALID_PARAMETER, ug_destroy_me(gadget.handle()));
	EXPECT_EQ(2u, gadget.results().size());
	app_control_destroy(result);
}

TEST_F(UiGadgetTest, DestroyRunsOnceLaterOnTheMainLoopAndMayDeleteTheGadget)
{
	int destroyed = 0;
	std::unique_ptr<UiGadget> gadget;
	gadget = std::make_unique<UiGadget>("ct", nullptr, [&] {
		++destroyed;
		gadget.reset();
	});
	ui_gadget_h handle = gadget->handle();
	app_control_h result = makeResult("is_success", "1");
	ASSERT_EQ(UG_ERROR_NONE, ug_send_result(handle, result));
	ASSERT_EQ(UG_ERROR_NONE, ug_destroy_me(handle));
	EXPECT_EQ(UG_ERROR_NONE, ug_destroy_me(handle));
	EXPECT_EQ(0, destroyed);
	EXPECT_TRUE(gadget->isDestroyRequested());
	// Deleting a gadget with a close pending drops the close.
	{
		UiGadget shortLived("short", nullptr, [&] { ++destroyed; });
		ug_destroy_me(shortLived.handle());
	}
	pump();
	EXPECT_EQ(1, destroyed);
	EXPECT_EQ(nullptr, gadget);

	// The handle is stale now: an error and a log line, no crash.
	ct::log::clear();
	EXPECT_EQ(UG_ERROR_INVALID_PARAMETER, ug_send_result(handle, result));
	EXPECT_EQ(UG_ERROR_INVALID_PARAMETER, ug_destroy_me(handle));
	EXPECT_TRUE(ct::log::contains("Invalid param : ug", DLOG_ERROR));
	EXPECT_EQ(UG_ERROR_INVALID_PARAMETER, ug_send_result(nullptr, result));
	EXPECT_EQ(UG_ERROR_INVALID_PARAMETER, ug_destroy_me(nullptr));
	app_control_destroy(result);
}
