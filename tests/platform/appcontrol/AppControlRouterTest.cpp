#include "AppControlRouter.h"
#include "ContactsAppIds.h"
#include "app_control.h"

#include "LogSink.h"

#include <Ecore.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

using namespace ct::appcontrol;

namespace {

struct Sender {
	std::vector<std::string> received; // "result|request operation|reply id" per reply
	bool insideSend = false;
};

std::string take(char* text)
{
	std::string out = text ? text : "<none>";
	free(text);
	return out;
}

void recordReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data)
{
	auto* sender = static_cast<Sender*>(data);
	EXPECT_FALSE(sender->insideSend) << "reply delivered inside send";
	char *op = nullptr, *id = nullptr;
	app_control_get_operation(request, &op);
	app_control_get_extra_data(reply, APP_CONTROL_DATA_ID, &id);
	sender->received.push_back(std::to_string(result) + "|" + take(op) + "|" + take(id));
}

app_control_h makeRequest(const char* appId, const char* operation)
{
	app_control_h h = nullptr;
	app_control_create(&h);
	if (appId)
		app_control_set_app_id(h, appId);
	if (operation)
		app_control_set_operation(h, operation);
	return h;
}

int sendFrom(Sender* sender, app_control_h h)
{
	if (sender)
		sender->insideSend = true;
	int err = app_control_send_launch_request(h, sender ? recordReplyCb : nullptr, sender);
	if (sender)
		sender->insideSend = false;
	return err;
}

// Sends one request built from the app id and operation.
int send(const char* appId, const char* operation, Sender* sender = nullptr)
{
	app_control_h h = makeRequest(appId, operation);
	int err = sendFrom(sender, h);
	app_control_destroy(h);
	return err;
}

class AppControlRouterTest : public testing::Test {
protected:
	void SetUp() override
	{
		ecore_init();
		clearLaunches();
	}
	void TearDown() override { ecore_shutdown(); }

	static void pump()
	{
		for (int i = 0; i < 5; ++i)
			ecore_main_loop_iterate();
	}
};

} // namespace

TEST_F(AppControlRouterTest, HandlerGetsACopyAndItsReplyArrivesOnTheMainLoop)
{
	std::string seenCaller;
	bool seenReplyRequested = false;
	app_control_h keptRequest = nullptr;
	Registration reg = registerOperationHandler(APP_CONTROL_OPERATION_EDIT, [&](app_control_h request, const Reply& reply) {
		char* caller = nullptr;
		app_control_get_caller(request, &caller);
		seenCaller = take(caller);
		app_control_is_reply_requested(request, &seenReplyRequested);
		app_control_clone(&keptRequest, request);
		app_control_h answer = makeRequest(nullptr, nullptr);
		app_control_add_extra_data(answer, APP_CONTROL_DATA_ID, "42");
		reply(answer, APP_CONTROL_RESULT_SUCCEEDED);
		app_control_destroy(answer);
		return APP_CONTROL_ERROR_NONE;
	});
	Sender sender;
	app_control_h h = makeRequest(nullptr, APP_CONTROL_OPERATION_EDIT);
	app_control_add_extra_data(h, APP_CONTROL_DATA_ID, "7");
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, sendFrom(&sender, h));
	// The sender may drop its handle at once; the reply still comes.
	app_control_destroy(h);
	EXPECT_TRUE(sender.received.empty());
	pump();
	EXPECT_EQ(std::vector<std::string>{std::to_string(APP_CONTROL_RESULT_SUCCEEDED) + "|" APP_CONTROL_OPERATION_EDIT "|42"},
			sender.received);
	EXPECT_EQ(CONTACTS_APP_ID, seenCaller);
	EXPECT_TRUE(seenReplyRequested);
	ASSERT_EQ(1u, launches().size());
	EXPECT_EQ("7", launches()[0].extra(APP_CONTROL_DATA_ID));

	// Without a reply callback the handler is told so; bad answers are refused.
	app_control_destroy(keptRequest);
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, send(nullptr, APP_CONTROL_OPERATION_EDIT));
	EXPECT_FALSE(seenReplyRequested);
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
			app_control_reply_to_launch_request(keptRequest, keptRequest, static_cast<app_control_result_e>(9)));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
			app_control_reply_to_launch_request(nullptr, keptRequest, APP_CONTROL_RESULT_SUCCEEDED));
	app_control_destroy(keptRequest);
}

TEST_F(AppControlRouterTest, AppIdWinsOverOperationAndNewestHandlerWins)
{
	std::vector<std::string> hits;
	auto hit = [&](const char* name) {
		return [&hits, name](app_control_h, const Reply&) {
			hits.push_back(name);
			return APP_CONTROL_ERROR_NONE;
		};
	};
	Registration byOp = registerOperationHandler(APP_CONTROL_OPERATION_PICK, hit("pick"));
	Registration gallery = registerAppHandler(GALLERY_APP_ID, hit("gallery"));
	{
		Registration newer = registerAppHandler(GALLERY_APP_ID, hit("gallery2"));
		EXPECT_EQ(APP_CONTROL_ERROR_NONE, send(GALLERY_APP_ID, APP_CONTROL_OPERATION_PICK));
	}
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, send(GALLERY_APP_ID, APP_CONTROL_OPERATION_PICK));
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, send(nullptr, APP_CONTROL_OPERATION_PICK));
	EXPECT_EQ((std::vector<std::string>{"gallery2", "gallery", "pick"}), hits);
}

TEST_F(AppControlRouterTest, MissingRejectingOrThrowingHandlerFailsTheSendWithoutAReplyOrARecord)
{
	ct::log::clear();
	app_control_h h = makeRequest(MAPS_APP_ID, APP_CONTROL_OPERATION_VIEW);
	EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, sendFrom(nullptr, h));
	EXPECT_TRUE(ct::log::contains("no application for app id", DLOG_ERROR));
	EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, app_control_send_terminate_request(h));
	registerAppHandler(MAPS_APP_ID, [](app_control_h, const Reply&) { return 0; }).reset();
	EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, sendFrom(nullptr, h));
	app_control_destroy(h);
	EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, send(nullptr, nullptr));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_send_launch_request(nullptr, nullptr, nullptr));

	Registration reject = registerAppHandler(IMAGE_EDITOR_APP_ID, [](app_control_h, const Reply& reply) {
		reply(nullptr, APP_CONTROL_RESULT_SUCCEEDED);
		return APP_CONTROL_ERROR_LAUNCH_REJECTED;
	});
	Registration thrower = registerAppHandler(IMAGE_VIEWER_APP_ID, [](app_control_h, const Reply&) -> int {
		throw std::runtime_error("broken");
	});
	Sender sender;
	EXPECT_EQ(APP_CONTROL_ERROR_LAUNCH_REJECTED, send(IMAGE_EDITOR_APP_ID, nullptr, &sender));
	EXPECT_EQ(APP_CONTROL_ERROR_LAUNCH_FAILED, send(IMAGE_VIEWER_APP_ID, nullptr, &sender));
	pump();
	EXPECT_TRUE(sender.received.empty());
	EXPECT_TRUE(launches().empty());
}

TEST_F(AppControlRouterTest, LateReplyAfterACancelOrATerminateIsNeverDelivered)
{
	Reply kept;
	app_control_h keptRequest = nullptr;
	int terminated = 0;
	Registration reg = registerAppHandler(RINGTONE_PICKER_APP_ID, [&](app_control_h request, const Reply& reply) {
		kept = reply;
		app_control_clone(&keptRequest, request);
		return APP_CONTROL_ERROR_NONE;
	}, [&] { ++terminated; });
	auto sender = std::make_unique<Sender>();
	Sender other;
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, send(RINGTONE_PICKER_APP_ID, nullptr, sender.get()));
	Reply first = kept;
	app_control_h firstRequest = keptRequest;
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, send(RINGTONE_PICKER_APP_ID, nullptr, &other));
	app_control_destroy(keptRequest);

	EXPECT_EQ(1u, pendingReplies(sender.get()));
	ScopedReplyCancel{sender.get()}; // the view that sent the first request dies before the answer
	EXPECT_EQ(0u, pendingReplies(sender.get()));
	sender.reset();
	// The handler does not need to know; its answer is simply dropped.
	EXPECT_EQ(APP_CONTROL_ERROR_NONE,
			app_control_reply_to_launch_request(firstRequest, firstRequest, APP_CONTROL_RESULT_SUCCEEDED));
	app_control_destroy(firstRequest);
	EXPECT_FALSE(first.isPending());
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, kept(nullptr, APP_CONTROL_RESULT_CANCELED));
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, kept(nullptr, APP_CONTROL_RESULT_SUCCEEDED));
	pump();
	EXPECT_EQ(std::vector<std::string>{std::to_string(APP_CONTROL_RESULT_CANCELED) + "|<none>|<none>"}, other.received);

	// Terminating ends the launch once and calls the hook; no reply follows.
	clearLaunches();
	app_control_h h = makeRequest(RINGTONE_PICKER_APP_ID, nullptr);
	app_control_add_extra_data(h, "marked_mode", "default");
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, sendFrom(&other, h));
	app_control_destroy(keptRequest);
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_terminate_request(h));
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_terminate_request(h));
	app_control_destroy(h);
	EXPECT_EQ(1, terminated);
	EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, kept(nullptr, APP_CONTROL_RESULT_SUCCEEDED));
	pump();
	EXPECT_EQ(1u, other.received.size());
	ASSERT_EQ(1u, launches().size());
	EXPECT_TRUE(launches()[0].terminated);
	EXPECT_EQ("default", launches()[0].extra("marked_mode"));
}

TEST_F(AppControlRouterTest, CancelBeforeTheMainLoopDropsQueuedRepliesEvenFromAReplyCallback)
{
	Registration reg = registerAppHandler(GALLERY_APP_ID, [](app_control_h, const Reply& reply) {
		return reply(nullptr, APP_CONTROL_RESULT_SUCCEEDED);
	});
	Sender a, b;
	send(GALLERY_APP_ID, nullptr, &a);
	send(GALLERY_APP_ID, nullptr, &b);
	send(GALLERY_APP_ID, nullptr, &a);
	EXPECT_EQ(2, app_control_cancel_replies(&a));
	EXPECT_EQ(0, app_control_cancel_replies(&a));
	pump();
	EXPECT_TRUE(a.received.empty());
	EXPECT_EQ(1u, b.received.size());

	// A reply callback that cancels another sender stops its queued reply.
	Sender victim;
	Sender* target = &victim;
	app_control_h h = makeRequest(GALLERY_APP_ID, nullptr);
	app_control_send_launch_request(h, [](app_control_h, app_control_h, app_control_result_e, void* data) {
		app_control_cancel_replies(*static_cast<Sender**>(data));
	}, &target);
	sendFrom(&victim, h);
	app_control_destroy(h);
	pump();
	EXPECT_TRUE(victim.received.empty());
}

TEST_F(AppControlRouterTest, HandlersThatNeverAnswerCannotGrowTheRouterWithoutBound)
{
	std::vector<Reply> replies;
	Registration reg = registerOperationHandler(APP_CONTROL_OPERATION_CALL, [&](app_control_h, const Reply& reply) {
		replies.push_back(reply);
		return APP_CONTROL_ERROR_NONE;
	});
	app_control_h h = makeRequest(nullptr, APP_CONTROL_OPERATION_CALL);
	for (int i = 0; i < 1100; ++i)
		ASSERT_EQ(APP_CONTROL_ERROR_NONE, sendFrom(nullptr, h));
	app_control_destroy(h);
	EXPECT_FALSE(replies.front().isPending());
	EXPECT_TRUE(replies.back().isPending());
	EXPECT_EQ(APP_CONTROL_ERROR_NONE, replies.back()(nullptr, APP_CONTROL_RESULT_SUCCEEDED));
	EXPECT_EQ(1000u, launches().size());
}
