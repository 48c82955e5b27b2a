#include "NotificationLog.h"
#include "notification.h"

#include "LogSink.h"

#include <Elementary.h>
#include <gtest/gtest.h>

#include <string>
#include <thread>
#include <vector>

using namespace ct::notification;

namespace {

class ElmEnvironment : public testing::Environment {
public:
	void SetUp() override { elm_init(0, nullptr); }
	void TearDown() override { elm_shutdown(); }
};

const testing::Environment* const g_elm = testing::AddGlobalTestEnvironment(new ElmEnvironment);

class NotificationTest : public testing::Test {
protected:
	void SetUp() override
	{
		clearPostedMessages();
		ct::log::clear();
	}
	void TearDown() override
	{
		setToastWindow(nullptr);
		if (m_win)
			evas_object_del(m_win);
	}

	Evas_Object* makeWindow()
	{
		m_win = elm_win_add(nullptr, "toast-test", ELM_WIN_BASIC);
		evas_object_resize(m_win, 480, 800);
		evas_object_show(m_win);
		return m_win;
	}

	static void pump()
	{
		for (int i = 0; i < 5; ++i)
			ecore_main_loop_iterate();
	}

	static std::string toastText()
	{
		const char* text = currentToast() ? elm_object_text_get(currentToast()) : nullptr;
		return text ? text : "";
	}

	Evas_Object* m_win = nullptr;
};

} // namespace

TEST_F(NotificationTest, AcceptedMessagesAreRecordedAndLoggedWithoutAWindowAndBadTextIsRefused)
{
	for (const char* text : {"Saved", "Saved", "Überschrift gespeichert"})
		EXPECT_EQ(NOTIFICATION_ERROR_NONE, notification_status_message_post(text));
	EXPECT_EQ((std::vector<std::string>{"Saved", "Saved", "Überschrift gespeichert"}), postedMessages());
	EXPECT_EQ(nullptr, currentToast());
	EXPECT_TRUE(ct::log::contains("status message: Saved", DLOG_INFO));

	clearPostedMessages();
	std::string huge(NOTIFICATION_MAX_MESSAGE_LENGTH + 1, 'x');
	for (const char* bad : {static_cast<const char*>(nullptr), "", "bad \xFF\xFE", huge.c_str()})
		EXPECT_EQ(NOTIFICATION_ERROR_INVALID_PARAMETER, notification_status_message_post(bad));
	huge.pop_back();
	EXPECT_EQ(NOTIFICATION_ERROR_NONE, notification_status_message_post(huge.c_str()));
	EXPECT_EQ(1u, postedMessages().size());
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid param : message", DLOG_ERROR));
}

TEST_F(NotificationTest, ToastShowsEscapedTextAndANewMessageOrWindowReplacesIt)
{
	setToastWindow(makeWindow());
	ASSERT_EQ(NOTIFICATION_ERROR_NONE, notification_status_message_post("Limit <5> & more"));
	EXPECT_EQ(m_win, elm_object_parent_widget_get(currentToast()));
	EXPECT_EQ("Limit &lt;5&gt; &amp; more", toastText());
	ASSERT_EQ(NOTIFICATION_ERROR_NONE, notification_status_message_post("Second"));
	EXPECT_EQ("Second", toastText());
	pump();
	// What the popup's timeout does, without waiting for it.
	evas_object_smart_callback_call(currentToast(), "timeout", nullptr);
	EXPECT_EQ(nullptr, currentToast());
	pump();

	notification_status_message_post("On first");
	Evas_Object* second = elm_win_add(nullptr, "second", ELM_WIN_BASIC);
	setToastWindow(second);
	EXPECT_EQ(nullptr, currentToast());
	notification_status_message_post("On second");
	EXPECT_EQ(second, elm_object_parent_widget_get(currentToast()));
	setToastWindow(nullptr);
	evas_object_del(second);
	pump();
}

TEST_F(NotificationTest, WindowDeathTakesTheToastAndLaterOrWorkerMessagesOnlyRecord)
{
	setToastWindow(makeWindow());
	notification_status_message_post("Before");
	int err = -1;
	std::thread worker([&] { err = notification_status_message_post("From worker"); });
	worker.join();
	EXPECT_EQ(NOTIFICATION_ERROR_NONE, err);
	EXPECT_EQ("Before", toastText()) << "a worker must not touch widgets";
	evas_object_del(m_win);
	m_win = nullptr;
	EXPECT_EQ(nullptr, currentToast());
	pump();

	ct::log::clear();
	EXPECT_EQ(NOTIFICATION_ERROR_NONE, notification_status_message_post("After"));
	EXPECT_EQ(nullptr, currentToast());
	EXPECT_TRUE(ct::log::contains("status message: After"));
	EXPECT_EQ((std::vector<std::string>{"Before", "From worker", "After"}), postedMessages());
}
