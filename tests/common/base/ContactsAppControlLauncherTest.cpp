#include "AppControlRouter.h"
#include "ContactsAppControlLauncher.h"
#include "../CommonTestSupport.h"

using ct::test::pumpUntil;

namespace {

struct Received {
	int replies = 0;
	app_control_result_e result = APP_CONTROL_RESULT_FAILED;
};

void onReply(app_control_h, app_control_h, app_control_result_e result, void* data)
{
	auto* received = static_cast<Received*>(data);
	++received->replies;
	received->result = result;
}

app_control_h makeRequest(const char* appId)
{
	app_control_h request = nullptr;
	app_control_create(&request);
	app_control_set_app_id(request, appId);
	return request;
}

using ContactsAppControlLauncherTest = ct::test::WindowTest;

} // namespace

TEST_F(ContactsAppControlLauncherTest, SendsRepliesAndTerminates)
{
	auto* launcher = ContactsAppControlLauncher::getInstance();
	int terminated = 0;
	auto registration = ct::appcontrol::registerAppHandler("org.test.gallery",
		[](app_control_h, const ct::appcontrol::Reply& reply) {
			reply(nullptr, APP_CONTROL_RESULT_SUCCEEDED);
			return 0;
		},
		[&] { ++terminated; });

	app_control_h request = makeRequest("org.test.gallery");
	EXPECT_TRUE(launcher->sendLaunchRequest(request));
	// Both forms deliver the reply on the main loop, not inside the call.
	Received received;
	EXPECT_TRUE(launcher->sendLaunchRequest(request, onReply, &received, m_window));
	EXPECT_TRUE(launcher->sendAsyncLaunchRequest(request, onReply, &received, m_window));
	EXPECT_EQ(0, received.replies);
	EXPECT_TRUE(pumpUntil([&] { return received.replies == 2; }, 2.0));
	EXPECT_EQ(APP_CONTROL_RESULT_SUCCEEDED, received.result);

	app_control_destroy(request);

	auto running = ct::appcontrol::registerAppHandler("org.test.player",
		[](app_control_h, const ct::appcontrol::Reply&) { return 0; }, [&] { ++terminated; });
	app_control_h play = makeRequest("org.test.player");
	ASSERT_TRUE(launcher->sendLaunchRequest(play));
	app_control_destroy(play);
	launcher->terminate();
	launcher->terminate();
	EXPECT_EQ(1, terminated);

	app_control_h nobody = makeRequest("org.test.nobody");
	EXPECT_FALSE(launcher->sendLaunchRequest(nobody));
	EXPECT_FALSE(launcher->sendLaunchRequest(nullptr));
	app_control_destroy(nobody);
}

TEST_F(ContactsAppControlLauncherTest, ReplyIsDroppedWhenTheOwnerObjectDies)
{
	ct::appcontrol::Reply later;
	auto registration = ct::appcontrol::registerAppHandler("org.test.camera",
		[&](app_control_h, const ct::appcontrol::Reply& reply) {
			later = reply;
			return 0;
		});
	Evas_Object* owner = elm_layout_add(m_window);
	app_control_h request = makeRequest("org.test.camera");
	Received received;
	ASSERT_TRUE(ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request, onReply, &received, owner));
	evas_object_del(owner);
	later(nullptr, APP_CONTROL_RESULT_SUCCEEDED);
	ct::test::settle(0.2);
	EXPECT_EQ(0, received.replies);
	app_control_destroy(request);
}
