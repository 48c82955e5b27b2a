#include "ScreenHarness.h"
#include "TestViews.h"

#include "LogSink.h"
#include "WNextFrame.h"
#include "WUiTimer.h"

#include <gtest/gtest.h>

using namespace ct::test;
using app_assist::WUiTimer;
using app_assist::WUiTimerHandle;

namespace {

struct Counter {
	int fired = 0;
	int repeatUntil = 1;
};

bool countCb(void* data)
{
	auto* counter = static_cast<Counter*>(data);
	return ++counter->fired < counter->repeatUntil;
}

using UiTimer = ViewTest;

} // namespace

TEST_F(UiTimer, CallbacksRepeatWhileTheyReturnTrueThenTheHandleExpires)
{
	auto* view = pushView("v");
	Counter idler{0, 3}, timer, animator{0, 4};
	WUiTimerHandle idlerHandle = WUiTimer::addIdler(countCb, &idler, view);
	WUiTimerHandle timerHandle = WUiTimer::addTimer(0.05, countCb, &timer, view);
	WUiTimerHandle animatorHandle = WUiTimer::addAnimator(countCb, &animator, view);
	EXPECT_TRUE(WUiTimer::isAlive(timerHandle));

	EXPECT_TRUE(screen.pumpUntil([&] {
		return idlerHandle.expired() && timerHandle.expired() && animatorHandle.expired();
	}));
	EXPECT_EQ((std::vector<int>{3, 1, 4}), (std::vector<int>{idler.fired, timer.fired, animator.fired}));
}

TEST_F(UiTimer, DestroyCancelsTimersDieWithTheirOwnerAndNullInputIsRefused)
{
	auto* view = pushView("v");
	Counter cancelled, orphaned, byObject; // none may fire
	WUiTimerHandle handle = WUiTimer::addTimer(0.05, countCb, &cancelled, view);
	WUiTimer::destroy(handle);
	WUiTimer::destroy(handle); // expired: ignored
	EXPECT_TRUE(handle.expired());

	WUiTimerHandle owned = WUiTimer::addTimer(0.05, countCb, &orphaned, view);
	WUiTimerHandle ownedByObject = WUiTimer::addAnimator(countCb, &byObject, view->layout);
	view->destroy();
	EXPECT_TRUE(owned.expired());
	EXPECT_TRUE(ownedByObject.expired());
	screen.pumpFor(0.2);
	EXPECT_EQ((std::vector<int>{0, 0, 0}), (std::vector<int>{cancelled.fired, orphaned.fired, byObject.fired}));

	ct::log::clear();
	EXPECT_TRUE(WUiTimer::addTimer(0.01, countCb, &cancelled, static_cast<app_assist::WControl*>(nullptr)).expired());
	EXPECT_TRUE(ct::log::contains("owner is null"));
	EXPECT_TRUE(WUiTimer::addIdler(nullptr, nullptr, static_cast<Evas_Object*>(nullptr)).expired());
	EXPECT_TRUE(ct::log::contains("callback is null"));
}

TEST_F(UiTimer, CallbackMayDestroyItsOwnerOrItself)
{
	auto* view = pushView("v");
	auto alive = view->getWeakPtr();
	int fired = 0;
	WUiTimer::addTimer(0.01, [&](void*) {
		++fired;
		view->destroy();
		return true; // ignored: the owner is gone
	}, nullptr, view);
	int selfFired = 0;
	Evas_Object* holder = evas_object_rectangle_add(evas_object_evas_get(screen.win()));
	WUiTimerHandle self = WUiTimer::addAnimator([&](void*) {
		++selfFired;
		WUiTimer::destroy(self);
		return true;
	}, nullptr, holder);
	EXPECT_TRUE(screen.pumpUntil([&] { return fired > 0 && selfFired > 0; }));
	screen.pumpFor(0.1);
	EXPECT_TRUE(alive.expired());
	EXPECT_EQ(std::make_pair(1, 1), std::make_pair(fired, selfFired));
	evas_object_del(holder);
}

TEST_F(UiTimer, NextFrameRunsOnceAfterADrawnFrameAndIsDroppedWithItsObject)
{
	Evas* canvas = evas_object_evas_get(screen.win());
	int frames = 0;
	Evas_Event_Cb countFrame = [](void* data, Evas*, void*) { ++*static_cast<int*>(data); };
	evas_event_callback_priority_add(canvas, EVAS_CALLBACK_RENDER_POST, EVAS_CALLBACK_PRIORITY_BEFORE, countFrame, &frames);
	Evas_Object* box = evas_object_rectangle_add(canvas);
	evas_object_resize(box, 40, 40);
	evas_object_show(box);

	std::vector<int> seenAt; // frames drawn when each waiter ran
	auto once = std::make_unique<app_assist::WNextFrame>(box, [&] { seenAt.push_back(frames); });
	std::unique_ptr<app_assist::WNextFrame> selfDestroying;
	selfDestroying = std::make_unique<app_assist::WNextFrame>(box, [&] {
		seenAt.push_back(frames);
		selfDestroying.reset();
	});
	auto dropped = std::make_unique<app_assist::WNextFrame>(box, [&] { seenAt.push_back(-1); });
	dropped.reset();
	EXPECT_TRUE(once->isPending());
	EXPECT_TRUE(seenAt.empty());
	EXPECT_TRUE(screen.pumpUntil([&] { return seenAt.size() >= 2; }));
	screen.pumpFrames(3);
	EXPECT_EQ((std::vector<int>{1, 1}), seenAt);
	EXPECT_FALSE(once->isPending());
	EXPECT_EQ(nullptr, selfDestroying);

	auto orphan = std::make_unique<app_assist::WNextFrame>(box, [&] { seenAt.push_back(-2); });
	evas_object_del(box);
	EXPECT_FALSE(orphan->isPending());
	screen.pumpFrames(3);
	EXPECT_EQ(2u, seenAt.size());
	evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, countFrame, &frames);

	ct::log::clear();
	EXPECT_FALSE(app_assist::WNextFrame(nullptr, [] {}).isPending());
	EXPECT_TRUE(ct::log::contains("Invalid param"));
}
