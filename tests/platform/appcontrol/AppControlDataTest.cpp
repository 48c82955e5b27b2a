#include "app_control.h"

#include "LogSink.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>
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
	int length = 0;
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_get_extra_data_array(h, key, &values, &length)) << key;
	std::vector<std::string> out;
	for (int i = 0; i < length; ++i)
		out.push_back(takeString(values[i]));
	free(values);
	return out;
}

std::string field(app_control_h h, int (*get)(app_control_h, char**))
{
	char* text = reinterpret_cast<char*>(1);
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, get(h, &text));
	return takeString(text);
}

} // namespace

TEST(AppControlData, ExtrasKeepTheirKindAndReplaceOnAdd)
{
	HandleGuard g;
	const char* selected[] = {"/a.jpg", "", "/c.jpg"};
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(g.h, "person_id", "12"));
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data_array(g.h, APP_CONTROL_DATA_SELECTED, selected, 3));
	EXPECT_EQ("12", extra(g.h, "person_id"));
	EXPECT_EQ((std::vector<std::string>{"/a.jpg", "", "/c.jpg"}), extraArray(g.h, APP_CONTROL_DATA_SELECTED));
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

TEST(AppControlData, ForeachVisitsEveryKeySurvivesRemovalAndStopsOnFalse)
{
	HandleGuard g;
	app_control_add_extra_data(g.h, "b", "2");
	app_control_add_extra_data(g.h, "a", "1");
	const char* arr[] = {"x"};
	app_control_add_extra_data_array(g.h, "c", arr, 1);
	std::vector<std::string> seen;
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_foreach_extra_data(g.h, [](app_control_h, const char* key, void* data) {
		static_cast<std::vector<std::string>*>(data)->push_back(key);
		return true;
	}, &seen));
	EXPECT_EQ((std::vector<std::string>{"a", "b", "c"}), seen);

	// Removing keys while iterating is safe; returning false stops.
	int calls = 0;
	app_control_foreach_extra_data(g.h, [](app_control_h h, const char*, void* data) {
		++*static_cast<int*>(data);
		app_control_remove_extra_data(h, "b");
		app_control_remove_extra_data(h, "c");
		return true;
	}, &calls);
	EXPECT_EQ(1, calls);
	app_control_add_extra_data(g.h, "d", "4");
	app_control_foreach_extra_data(g.h, [](app_control_h, const char*, void* data) {
		++*static_cast<int*>(data);
		return false;
	}, &calls);
	EXPECT_EQ(2, calls);
}

TEST(AppControlData, FieldsAreCopiedInAndClonesAreIndependentOfTheirSource)
{
	auto source = std::make_unique<HandleGuard>();
	std::string op = APP_CONTROL_OPERATION_PICK;
	app_control_set_operation(source->h, op.c_str());
	op[0] = 'X';
	app_control_set_uri(source->h, "tel:1");
	app_control_add_extra_data(source->h, "type", "36");
	const char* arr[] = {"1", "2"};
	app_control_add_extra_data_array(source->h, "ids", arr, 2);
	HandleGuard clone;
	app_control_destroy(clone.h);
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_clone(&clone.h, source->h));
	app_control_add_extra_data(source->h, "type", "65");
	app_control_set_operation(source->h, APP_CONTROL_OPERATION_VIEW);
	app_control_remove_extra_data(source->h, "ids");
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_set_uri(source->h, nullptr));
	EXPECT_EQ("<null>", field(source->h, app_control_get_uri));
	source.reset();
	EXPECT_EQ(APP_CONTROL_OPERATION_PICK, field(clone.h, app_control_get_operation));
	EXPECT_EQ("tel:1", field(clone.h, app_control_get_uri));
	EXPECT_EQ("36", extra(clone.h, "type"));
	EXPECT_EQ((std::vector<std::string>{"1", "2"}), extraArray(clone.h, "ids"));
}

TEST(AppControlData, BadInputGetsAnErrorAndALogLineAndChangesNothing)
{
	ct::log::clear();
	char* text = nullptr;
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_create(nullptr));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_destroy(nullptr));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_set_operation(nullptr, "x"));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_get_uri(nullptr, &text));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(nullptr, "k", "v"));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_clone(nullptr, nullptr));
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid param", DLOG_ERROR));

	HandleGuard g;
	app_control_add_extra_data(g.h, "key", "kept");
	const std::string invalidUtf8 = "ab\xC3\x28";
	const std::string huge(APP_CONTROL_MAX_VALUE_LENGTH + 1, 'a');
	const std::string longKey(APP_CONTROL_MAX_KEY_LENGTH + 1, 'k');
	for (const char* value : {invalidUtf8.c_str(), huge.c_str(), static_cast<const char*>(nullptr)})
		EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, "key", value));
	for (const char* key : {longKey.c_str(), "", invalidUtf8.c_str()})
		EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(g.h, key, "v"));
	const char* withNull[] = {"a", nullptr};
	const char* withBad[] = {"a", invalidUtf8.c_str()};
	for (auto [values, length] : {std::pair{withNull, 2}, {withBad, 2}, {static_cast<const char**>(nullptr), 3}, {withNull, -1}})
		EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data_array(g.h, "key", values, length));
	EXPECT_EQ("kept", extra(g.h, "key"));

	app_control_set_uri(g.h, "geo:0,0");
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_set_uri(g.h, invalidUtf8.c_str()));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_set_uri(g.h, huge.c_str()));
	EXPECT_EQ("geo:0,0", field(g.h, app_control_get_uri));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
			app_control_set_launch_mode(g.h, static_cast<app_control_launch_mode_e>(7)));
	const std::string atLimit(APP_CONTROL_MAX_VALUE_LENGTH, 'b');
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(g.h, "big", atLimit.c_str()));
	EXPECT_EQ(atLimit.size(), extra(g.h, "big").size());

	// Caller and reply queries need a received request.
	bool requested = true;
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_get_caller(g.h, &text));
	EXPECT_EQ(nullptr, text);
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_is_reply_requested(g.h, &requested));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
			app_control_reply_to_launch_request(g.h, g.h, APP_CONTROL_RESULT_SUCCEEDED));
}
