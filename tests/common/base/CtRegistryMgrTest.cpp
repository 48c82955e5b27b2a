#include "LogSink.h"
#include "../CommonTestSupport.h"

using ct::test::pumpUntil;

namespace {

struct Seen {
	std::vector<std::string> keys;
	int intValue = -1;
};

void onChanged(keynode_t* node, void* data)
{
	auto* seen = static_cast<Seen*>(data);
	seen->keys.push_back(vconf_keynode_get_name(node));
	seen->intValue = vconf_keynode_get_int(node);
}

using CtRegistryMgrTest = ct::test::LoopTest;

} // namespace

TEST_F(CtRegistryMgrTest, SeveralListenersOfOneKeyEachGetTheirOwnData)
{
	CtRegistryMgr* registry = CtRegistryMgr::getInstance();
	Seen first, second;
	ASSERT_EQ(0, registry->registerVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, onChanged, &first));
	ASSERT_EQ(0, registry->registerVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, onChanged, &second));
	EXPECT_EQ(2u, registry->getVconfListenerCount(VCONFKEY_SETAPPL_PSMODE));

	ASSERT_EQ(0, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1));
	EXPECT_TRUE(pumpUntil([&] { return !first.keys.empty() && !second.keys.empty(); }, 2.0));
	EXPECT_EQ(1, first.intValue);
	EXPECT_EQ(VCONFKEY_SETAPPL_PSMODE, second.keys.at(0));

	EXPECT_EQ(0, registry->unRegisterVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, onChanged, &first));
	EXPECT_NE(0, registry->unRegisterVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, onChanged, &first));
	ASSERT_EQ(0, vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0));
	EXPECT_TRUE(pumpUntil([&] { return second.keys.size() == 2; }, 2.0));
	EXPECT_EQ(1u, first.keys.size());
	EXPECT_EQ(0, registry->unRegisterVconfChangedCb(VCONFKEY_SETAPPL_PSMODE, onChanged, &second));
	EXPECT_EQ(0u, registry->getVconfListenerCount(VCONFKEY_SETAPPL_PSMODE));
	EXPECT_NE(0, registry->registerVconfChangedCb(nullptr, onChanged, nullptr));
}

TEST_F(CtRegistryMgrTest, ChangeSignalReachesListenersUntilRemoved)
{
	CtRegistryMgr* registry = CtRegistryMgr::getInstance();
	std::vector<std::pair<int, int>> got;
	int selfRemoving = 0;
	int id = registry->addChangeListener([&](ctRegistryKey key, int value) { got.emplace_back(key, value); });
	selfRemoving = registry->addChangeListener([&](ctRegistryKey, int) {
		registry->removeChangeListener(selfRemoving);
	});
	EXPECT_GT(id, 0);
	EXPECT_NE(id, selfRemoving);

	registry->raiseChangeSignal(CT_REGISTRY_KEY_PERSON_DELETED, 42);
	registry->raiseChangeSignal(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, 2);
	const std::vector<std::pair<int, int>> expected{{2, 42}, {14, 2}};
	EXPECT_EQ(expected, got);

	ct::log::clear();
	registry->removeChangeListener(id);
	registry->removeChangeListener(id);
	EXPECT_TRUE(ct::log::contains("* Critical * Already removed listener! =" + std::to_string(id), DLOG_ERROR));
	registry->raiseChangeSignal(CT_REGISTRY_KEY_FAVORITE_CHANGED, 1);
	EXPECT_EQ(expected, got);
}
