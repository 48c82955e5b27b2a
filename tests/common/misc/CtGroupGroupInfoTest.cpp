// Groups of several address books gathered under the name a person sees.
#include "../CommonTestSupport.h"

#include "ContactsCommon.h"
#include "CtCommonAddressbookUtil.h"
#include "CtGroupGroupInfo.h"
#include "ScreenHarness.h"

using namespace ct::test;

using CtGroupGroupInfoTest = StoreTest;

TEST_F(CtGroupGroupInfoTest, GroupsOfSeveralAddressbooksGatherUnderTheirShownName)
{
	int account = addAddressbook("work@example.com", 0, 1, "Exchange");
	int phoneFamily = addGroup(0, "Family");
	int accountFamily = addGroup(account, "Family");
	int phoneFriends = addGroup(0, "Friends club");
	// A system group shows its translated name whatever its stored name.
	int accountCoworkers = addGroup(account, "coworkers-raw", "coworkers");
	std::string coworkers = ctCommonGetDisplayGroupName("coworkers");

	auto infos = CtGroupGroupInfo::gatherByDisplayName(
		{phoneFamily, accountCoworkers, accountFamily, phoneFriends, phoneFamily});
	std::vector<std::string> names;
	for (const auto& info : infos)
		names.push_back(info.getName());
	ASSERT_EQ(names, (std::vector<std::string>{"Family", coworkers, "Friends club"}));
	EXPECT_EQ(infos[0].getMembers().size(), 2u);
	EXPECT_EQ(infos[0].getGroupIdInAddressbook(0), phoneFamily);
	EXPECT_EQ(infos[0].getGroupIdInAddressbook(account), accountFamily);
	EXPECT_EQ(infos[1].getSystemId(), "coworkers");
	EXPECT_EQ(infos[1].getGroupIdInAddressbook(0), 0);

	// Looking a shown name up in one address book, after a reopen.
	reopenStore();
	EXPECT_EQ(CtGroupGroupInfo::findGroupInAddressbook("Family", account), accountFamily);
	EXPECT_EQ(CtGroupGroupInfo::findGroupInAddressbook(coworkers, account), accountCoworkers);
	EXPECT_EQ(CtGroupGroupInfo::findGroupInAddressbook("Friends club", account), 0);
}

TEST_F(CtGroupGroupInfoTest, UnknownIdsNamelessGroupsAndBadTextsAreLeftOutWithALogLine)
{
	int family = addGroup(0, "Family");
	int nameless = addGroup(0, nullptr);
	auto infos = CtGroupGroupInfo::gatherByDisplayName({9999, -1, 0, nameless, family});
	ASSERT_EQ(infos.size(), 1u);
	EXPECT_EQ(infos[0].getName(), "Family");
	EXPECT_TRUE(ScreenHarness::logContains("contacts_db_get_record() Failed("));
	EXPECT_TRUE(ScreenHarness::logContains(("group " + std::to_string(nameless) + " has no name").c_str()));
	EXPECT_TRUE(CtGroupGroupInfo::gatherByDisplayName({}).empty());

	EXPECT_EQ(CtGroupGroupInfo::getDisplayName("Fam\xff" "ily", nullptr), "Fam\xef\xbf\xbdily");
	EXPECT_EQ(CtGroupGroupInfo::getDisplayName(nullptr, nullptr), "");
	EXPECT_EQ(CtGroupGroupInfo::getDisplayName("Own", "not-a-system-group"), "Own");
	EXPECT_EQ(CtGroupGroupInfo::findGroupInAddressbook("", 0), 0);
	EXPECT_EQ(CtGroupGroupInfo::findGroupInAddressbook("Family", 4242), 0);
	EXPECT_EQ(CtGroupGroupInfo::findGroupInAddressbook(std::string(100000, 'x'), 0), 0);
}
