#include "ScreenHarness.h"
#include "TestViews.h"

#include "LogSink.h"
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
