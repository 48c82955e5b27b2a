#include "ScreenHarness.h"
#include "TestViews.h"

#include "LogSink.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <stdexcept>

using namespace ct::test;
using app_assist::WView;
using ViewLifecycle = ViewTest;

TEST(ViewTeardown, PushThenBackRunsEveryStepInOrderAndClosingTheScreenEndsTheRest)
{
	EventLog log;
	{
		ScreenHarness screen;
		auto* view = new RecordingView(log, "a");
		ASSERT_TRUE(screen.push(view, "first"));
		EXPECT_EQ(screen.topView(), view);
		EXPECT_EQ(WView_getInstanceFromEvasObj(view->getEvasObj()), view);
		EXPECT_EQ(WView_getWindowEvasObj(view), screen.win());
		view->setTitle("Details");
		EXPECT_EQ(ScreenHarness::naviText(view), "Details");

		screen.sendBackKey();
		EXPECT_EQ(screen.viewCount(), 0);
		screen.push(new RecordingView(log, "b"));
		screen.push(new RecordingView(log, "c"));
	}
	// Closing the screen destroys the views still pushed, top first.
	EXPECT_EQ(log, (EventLog { "a:constructor", "a:onCreate", "a:onCreated", "a:onPushed", "a:onPop",
		"a:onDestroy", "a:destructor", "b:constructor", "b:onCreate", "b:onCreated", "b:onPushed",
		"c:constructor", "c:onCreate", "c:onCreated", "c:onPushed", "c:onDestroy", "c:destructor",
		"b:onDestroy", "b:destructor" }));
}

TEST_F(ViewLifecycle, NestedViewsPopTopFirstByBackKeyTitleButtonOrDestroyAndEndOnce)
{
	auto* a = pushView("a");
	auto* b = pushView("b");
	auto* c = pushView("c");
	EXPECT_EQ(screen.viewCount(), 3);
	auto aliveA = a->getWeakPtr();
	auto aliveB = b->getWeakPtr();
	c->onPopAction = [c] { c->destroy(); c->destroy(); };

	screen.sendBackKey();
	EXPECT_EQ(std::count(log.begin(), log.end(), "c:destructor"), 1);
	EXPECT_EQ(screen.topView(), b);
	EXPECT_GE(b->becameTop, 1);

	Evas_Object* prev = elm_object_item_part_content_get(b->getNaviItem(), "prev_btn");
	EXPECT_TRUE(ScreenHarness::click(prev));
	screen.pumpUntilIdle();
	EXPECT_TRUE(aliveB.expired());
	EXPECT_EQ(screen.topView(), a);
	EXPECT_LT(std::find(log.begin(), log.end(), "c:destructor"), std::find(log.begin(), log.end(), "b:destructor"));

	// Destroying directly removes the view from the naviframe at once.
	a->destroy();
	EXPECT_TRUE(aliveA.expired());
	EXPECT_EQ(screen.viewCount(), 0);
	screen.pumpUntilIdle();
	EXPECT_EQ(std::count(log.begin(), log.end(), "a:onDestroy"), 1);
}

TEST_F(ViewLifecycle, BadInputIsRefusedAndLogged)
{
	ct::log::clear();
	EXPECT_FALSE(screen.naviframe()->push(nullptr));
	EXPECT_TRUE(ct::log::contains("Invalid param : view"));

	EXPECT_FALSE(screen.naviframe()->pop());
	EXPECT_TRUE(ct::log::contains("naviframe is empty"));
	screen.sendBackKey();
	EXPECT_TRUE(ct::log::contains("back on an empty naviframe"));

	auto* orphan = new RecordingView(log, "o");
	EXPECT_FALSE(orphan->create(nullptr, nullptr));
	EXPECT_TRUE(ct::log::contains("parent is null"));
	orphan->popOut(); // not in a naviframe: it is destroyed
	EXPECT_EQ(log.back(), "o:destructor");

	auto* twice = new RecordingView(log, "t");
	ASSERT_TRUE(screen.push(twice));
	EXPECT_FALSE(screen.naviframe()->push(twice));
	EXPECT_TRUE(ct::log::contains("is already created"));
	EXPECT_EQ(screen.viewCount(), 1);

	EXPECT_EQ(WView_getInstanceFromEvasObj(nullptr), nullptr);
	EXPECT_EQ(WView_getWindowEvasObj(nullptr), nullptr);
}

TEST_F(ViewLifecycle, BackIsRefusedByOnPopOrByTheLastViewHandler)
{
	auto* view = new RecordingView(log, "a");
	view->allowPop = false;
	ASSERT_TRUE(screen.push(view));
	auto alive = view->getWeakPtr();
	screen.sendBackKey();
	view->popOut();
	screen.pumpUntilIdle();
	EXPECT_FALSE(alive.expired());
	EXPECT_EQ(std::count(log.begin(), log.end(), "a:onPop"), 2);

	int asked = 0;
	bool letGo = false;
	screen.naviframe()->setOnLastViewBack([&](bool* popOut) {
		++asked;
		*popOut = letGo;
	});
	view->allowPop = true;
	screen.sendBackKey();
	EXPECT_EQ(asked, 1);
	EXPECT_FALSE(alive.expired());
	letGo = true;
	screen.sendBackKey();
	EXPECT_TRUE(alive.expired());
}

// A screen whose own constructor fails after its framework base was built.
class FailingView : public WView {
public:
	explicit FailingView(EventLog& log) : m_log(log) { throw std::runtime_error("no memory for the data"); }
	~FailingView() override { m_log.push_back("destructor"); }

private:
	EventLog& m_log;
};

TEST(ViewTeardown, AConstructorThatThrowsLeavesItsBaseFreedOnceAndTheExceptionToTheCaller)
{
	EventLog log;
	EXPECT_THROW(new FailingView(log), std::runtime_error);
	// The derived destructor never ran; the base freed nothing of its own.
	EXPECT_TRUE(log.empty());
	ScreenHarness screen;
	EXPECT_TRUE(screen.push(new RecordingView(log, "next")));
}
