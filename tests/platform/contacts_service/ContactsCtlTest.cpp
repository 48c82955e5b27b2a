// contacts-ctl contacts ...: another process changes the database.
#include "../contacts_db/ContactsTestSupport.h"
#include "../vconf/StoreTestSupport.h"

using namespace ct::test;

TEST(ContactsCtlContacts, AddListLinkUnlinkAndDeletePersonsFromOutside)
{
	if (contactsCtlPath().empty())
		GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
	ConnectedStore store;
	std::string out;
	ASSERT_EQ(0, runContactsCtl("contacts add Anna Lee number=0101 email=a@x.org", &out));
	EXPECT_EQ("person 1 contact 1\n", out);
	ASSERT_EQ(0, runContactsCtl("contacts add Bob", &out));
	EXPECT_EQ(2, countOf(_contacts_person._uri));
	ASSERT_EQ(0, runContactsCtl("contacts link 1 2"));
	EXPECT_EQ(1, countOf(_contacts_person._uri));
	ASSERT_EQ(0, runContactsCtl("contacts list ann", &out));
	EXPECT_EQ("1\tAnna Lee\t2 contact(s)\n", out);
	ASSERT_EQ(0, runContactsCtl("contacts unlink 1 2", &out));
	EXPECT_EQ(2, countOf(_contacts_person._uri));
	ASSERT_EQ(0, runContactsCtl("contacts delete 1"));
	EXPECT_EQ(1, countOf(_contacts_contact._uri));
	EXPECT_EQ(1, runContactsCtl("contacts delete 1"));
	EXPECT_EQ(2, runContactsCtl("contacts delete one"));
	EXPECT_EQ(2, runContactsCtl("contacts frobnicate"));
	EXPECT_EQ(1, runContactsCtl("contacts add Bad book=77"));
}
