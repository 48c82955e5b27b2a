// Fields, extra data, clones and bad input of app_control_h.
#include "app_control.h"

#include "LogSink.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

namespace {

struct HandleGuard {
	app_control_h h = nullptr;
	HandleGuard() { app_control_create(&h); }
	~HandleGuard() { app_control_destroy(h); }
};

std::string takeString(char* text)
{
	std::string out = text ? text : "<null>";
	free(text);
	return out;
}

std::string extra(app_control_h h, const char* key)
{
	char* value = nullptr;
	int err = app_control_get_extra_data(h, key, &value);
	return err == APP_CONTROL_ERROR_NONE ? takeString(value) : "<err " + std::to_string(err) + ">";
}

std::vector<std::string> extraArray(app_control_h h, const char* key)
{
	char** values = nullptr;
	int length = -1;
	std::vector<std::string> out;
	if (app_control_get_extra_data_array(h, key, &values, &length) != APP_CONTROL_ERROR_NONE)
		return {"<err>"};
	for (int i = 0; i < length; ++i)
		out.push_back(takeString(values[i]));
	free(values);
	return out;
}

} // namespace

TEST(AppControlData, FieldsAreCopiedInAndOutAndNullClearsThem)
{
	HandleGuard g;
	char* text = reinterpret_cast<char*>(1);
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_get_operation(g.h, &text));
	EXPECT_EQ(nullptr, text);

	std::string op = APP_CONTROL_OPERATION_VIEW;
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_set_operation(g.h, op.c_str()));
	op[0] = 'X';
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_set_uri(g.h, "tel:0101234"));
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_set_mime(g.h, "image/jpg"));
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_set_app_id(g.h, "org.velmora.maps"));
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_set_launch_mode(g.h, APP_CONTROL_LAUNCH_MODE_GROUP));

	app_control_get_operation(g.h, &text);
	EXPECT_EQ(APP_CONTROL_OPERATION_VIEW, takeString(text));
	app_control_get_uri(g.h, &text);
	EXPECT_EQ("tel:0101234", takeString(text));
	app_control_get_mime(g.h, &text);
	EXPECT_EQ("image/jpg", takeString(text));
	app_control_get_app_id(g.h, &text);
	EXPECT_EQ("org.velmora.maps", takeString(text));
	app_control_launch_mode_e mode = APP_CONTROL_LAUNCH_MODE_SINGLE;
	app_control_get_launch_mode(g.h, &mode);
	EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, mode);

	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_set_uri(g.h, nullptr));
	app_control_get_uri(g.h, &text);
	EXPECT_EQ(nullptr, text);
}

TEST(AppControlData, ExtrasKeepTheirKindAndReplaceOnAdd)
{
	HandleGuard g;
	const char* selected[] = {"/a.jpg", "", "/c.jpg"};
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(g.h, "person_id", "12"));
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data_array(g.h, APP_CONTROL_DATA_SELECTED, selected, 3));

	EXPECT_EQ("12", extra(g.h, "person_id"));
	EXPECT_EQ((std::vector<std::string>{"/a.jpg", "", "/c.jpg"}), extraArray(g.h, APP_CONTROL_DATA_SELECTED));
	bool isArray = false;
	app_control_is_extra_data_array(g.h, APP_CONTROL_DATA_SELECTED, &isArray);
	EXPECT_TRUE(isArray);
	app_control_is_extra_data_array(g.h, "person_id", &isArray);
	EXPECT_FALSE(isArray);

	// Reading a key as the other kind is a type error, not a crash or a guess.
	char* value = nullptr;
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_DATA_TYPE, app_control_get_extra_data(g.h, APP_CONTROL_DATA_SELECTED, &value));
	EXPECT_EQ(nullptr, value);
	char** values = nullptr;
	int length = 7;
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_DATA_TYPE, app_control_get_extra_data_array(g.h, "person_id", &values, &length));
	EXPECT_EQ(0, length);

	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(g.h, APP_CONTROL_DATA_SELECTED, "/only.jpg"));
	EXPECT_EQ("/only.jpg", extra(g.h, APP_CONTROL_DATA_SELECTED));
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data_array(g.h, "empty", nullptr, 0));
	EXPECT_TRUE(extraArray(g.h, "empty").empty());

	EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_remove_extra_data(g.h, "person_id"));
	EXPECT_EQ(APP_CONTROL_ERROR_KEY_NOT_FOUND, app_control_remove_extra_data(g.h, "person_id"));
	EXPECT_EQ("<err " + std::to_string(APP_CONTROL_ERROR_KEY_NOT_FOUND) + ">", extra(g.h, "person_id"));
}

TEST(AppControlData, ForeachVisitsEveryKeyAndStopsOnFalse)
{
	HandleGuard g;
	app_control_add_extra_data(g.h, "b", "2");
	app_control_add_extra_data(g.h, "a", "1");
	const char* arr[] = {"x"};
	app_control_add_extra_data_array(g.h, "c", arr, 1);

	std::vector<std::string> seen;
	auto collect = [](app_control_h, const char* key, void* data) {
		static_cast<std::vector<std::string>*>(data)->push_back(key);
		return true;
	};
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_foreach_extra_data(g.h, collect, &seen));
	EXPECT_EQ((std::vector<std::string>{"a", "b", "c"}), seen);

	// A callback that removes keys while iterating is safe.
	int calls = 0;
	auto removeAll = [](app_control_h h, const char*, void* data) {
		++*static_cast<int*>(data);
		app_control_remove_extra_data(h, "b");
		app_control_remove_extra_data(h, "c");
		return true;
	};
	app_control_foreach_extra_data(g.h, removeAll, &calls);
	EXPECT_EQ(1, calls);

	calls = 0;
	app_control_add_extra_data(g.h, "d", "4");
	auto stop = [](app_control_h, const char*, void* data) {
		++*static_cast<int*>(data);
		return false;
	};
	app_control_foreach_extra_data(g.h, stop, &calls);
	EXPECT_EQ(1, calls);
}

TEST(AppControlData, CloneIsIndependentOfItsSource)
{
	HandleGuard g;
	app_control_set_operation(g.h, APP_CONTROL_OPERATION_PICK);
	app_control_add_extra_data(g.h, "type", "36");
	const char* arr[] = {"1", "2"};
	app_control_add_extra_data_array(g.h, "ids", arr, 2);

	app_control_h clone = nullptr;
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_clone(&clone, g.h));
	app_control_add_extra_data(g.h, "type", "65");
	app_control_set_operation(g.h, APP_CONTROL_OPERATION_VIEW);
	app_control_remove_extra_data(g.h, "ids");

	char* op = nullptr;
	app_control_get_operation(clone, &op);
	EXPECT_EQ(APP_CONTROL_OPERATION_PICK, takeString(op));
	EXPECT_EQ("36", extra(clone, "type"));
	EXPECT_EQ((std::vector<std::string>{"1", "2"}), extraArray(clone, "ids"));

	app_control_destroy(g.h);
	g.h = nullptr;
	EXPECT_EQ("36", extra(clone, "type"));
	app_control_destroy(clone);
}

TEST(AppControlData, BadInputGetsAnErrorAndALogLineAndChangesNothing)
{
	ct::log::clear();
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_create(nullptr));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_destroy(nullptr));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_set_operation(nullptr, "x"));
	char* text = nullptr;
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_get_uri(nullptr, &text));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(nullptr, "k", "v"));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_clone(nullptr, nullptr));
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid param", DLOG_ERROR));

	HandleGuard g;
	app_control_add_extra_data(g.h, "key", "kept");
	const std::string invalidUtf8 = "ab\xC3\x28";
	const std::string huge(APP_CONTROL_MAX_VALUE_LENGTH + 1, 'a');
	const std::string longKey(APP_CONTROL_MAX_KEY_LENGTH + 1, 'k');
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, "key", invalidUtf8.c_str()));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, "key", huge.c_str()));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, "key", nullptr));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, longKey.c_str(), "v"));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, "", "v"));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, invalidUtf8.c_str(), "v"));
	EXPECT_EQ("kept", extra(g.h, "key"));

	const char* withNull[] = {"a", nullptr};
	const char* withBad[] = {"a", invalidUtf8.c_str()};
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data_array(g.h, "key", withNull, 2));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data_array(g.h, "key", withBad, 2));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data_array(g.h, "key", nullptr, 3));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data_array(g.h, "key", withNull, -1));
	EXPECT_EQ("kept", extra(g.h, "key"));

	app_control_set_uri(g.h, "geo:0,0");
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_set_uri(g.h, invalidUtf8.c_str()));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_set_uri(g.h, huge.c_str()));
	app_control_get_uri(g.h, &text);
	EXPECT_EQ("geo:0,0", takeString(text));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
			app_control_set_launch_mode(g.h, static_cast<app_control_launch_mode_e>(7)));

	// A value right at the limit is fine.
	const std::string atLimit(APP_CONTROL_MAX_VALUE_LENGTH, 'b');
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(g.h, "big", atLimit.c_str()));
	EXPECT_EQ(atLimit.size(), extra(g.h, "big").size());
}

TEST(AppControlData, CallerAndReplyQueriesNeedAReceivedRequest)
{
	HandleGuard g;
	char* caller = nullptr;
	bool requested = true;
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_get_caller(g.h, &caller));
	EXPECT_EQ(nullptr, caller);
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_is_reply_requested(g.h, &requested));
	app_control_h reply = nullptr;
	app_control_create(&reply);
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
			app_control_reply_to_launch_request(reply, g.h, APP_CONTROL_RESULT_SUCCEEDED));
	app_control_destroy(reply);
}
