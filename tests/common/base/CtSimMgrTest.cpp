#include "CtSimMgr.h"
#include "CtThread.h"
#include "../CommonTestSupport.h"

#include <atomic>
#include <unistd.h>

using ct::test::pumpUntil;

namespace {

struct CountingListener : CtSimListener {
	void onSimChanged() override { ++changes; }
	int changes = 0;
};

using CtSimMgrTest = ct::test::LoopTest;

} // namespace

TEST_F(CtSimMgrTest, FollowsTheSimPowerSettings)
{
	CtSimMgr* sims = CtSimMgr::getInstance();
	EXPECT_EQ(2, sims->getInsertedSimCount());
	EXPECT_EQ(-1, sims->getAvailableSimForIcon());

	CountingListener listener;
	sims->attach(&listener);
	ASSERT_EQ(0, vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, 0));
	EXPECT_TRUE(pumpUntil([&] { return listener.changes > 0; }, 2.0));
	EXPECT_EQ(1, sims->getInsertedSimCount());
	EXPECT_EQ(0, sims->getAvailableSimForIcon());
	EXPECT_NE(nullptr, sims->getSimColor(sims->getAvailableSimForIcon()));
	EXPECT_STRNE(sims->getSimColor(0), sims->getSimColor(1));
	EXPECT_EQ(nullptr, sims->getSimColor(-1));
	EXPECT_EQ(nullptr, sims->getSimColor(2));

	sims->detach(&listener);
	int before = listener.changes;
	ASSERT_EQ(0, vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, 0));
	ct::test::settle(0.3);
	EXPECT_EQ(before, listener.changes);
	EXPECT_EQ(0, sims->getInsertedSimCount());
	EXPECT_EQ(-1, sims->getAvailableSimForIcon());
	EXPECT_FALSE(sims->isSimAvailable(7));
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, 1);
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, 1);
}

TEST_F(CtSimMgrTest, AListenerAttachedFromAWorkerThreadIsTold)
{
	CountingListener listener;
	bool ended = false;
	CtThread thread([&] { CtSimMgr::getInstance()->attach(&listener); }, [&] { ended = true; });
	ASSERT_TRUE(thread.start());
	EXPECT_TRUE(pumpUntil([&] { return ended; }, 5.0));
	EXPECT_FALSE(thread.isRunning());

	ASSERT_EQ(0, vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, 0));
	EXPECT_TRUE(pumpUntil([&] { return listener.changes > 0; }, 2.0));
	CtSimMgr::getInstance()->detach(&listener);
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, 1);
}

TEST_F(CtSimMgrTest, ThreadDeletedBeforeItsEndNeverCallsBack)
{
	bool ended = false;
	std::atomic<bool> release{false};
	auto thread = std::make_unique<CtThread>([&] { while (!release) usleep(1000); }, [&] { ended = true; });
	ASSERT_TRUE(thread->start());
	thread.reset();
	release = true;
	ct::test::settle(0.3);
	EXPECT_FALSE(ended);

	std::unique_ptr<CtThread> selfDeleting;
	selfDeleting = std::make_unique<CtThread>([] {}, [&] { selfDeleting.reset(); });
	ASSERT_TRUE(selfDeleting->start());
	EXPECT_TRUE(pumpUntil([&] { return !selfDeleting; }, 5.0));
}
