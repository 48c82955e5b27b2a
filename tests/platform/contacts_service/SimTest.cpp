// SIM cards: readiness from the power key, field limits, capacity, writes;
// contacts-ctl changing the store from another process.
#include "../contacts_db/ContactsTestSupport.h"

#include "../vconf/StoreTestSupport.h"
#include "vconf.h"

#include <fstream>

using namespace ct::test;

namespace {

int simBook(int slot)
{
	QueryOwner q(_contacts_address_book._uri);
	contacts_filter_add_str(q.filter, _contacts_address_book.name, CONTACTS_MATCH_EXACTLY, slot == 0 ? CONTACTS_SIM1_ADDRESS_BOOK_NAME : CONTACTS_SIM2_ADDRESS_BOOK_NAME);
	std::vector<int> ids = q.run(_contacts_address_book.id);
	return ids.empty() ? -1 : ids[0];
}

} // namespace

TEST(Sim, DefaultSimTakesNamesNumbersAndEmailsWithinItsLimits)
{
	ConnectedStore store;
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, 1);
	bool ready = false;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_sim_is_ready(0, &ready));
	EXPECT_TRUE(ready);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_sim_is_ready(1, &ready));
	EXPECT_FALSE(ready);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_sim_is_ready(2, &ready));
	int unused = 0;
	contacts_sim_get_unused_field_count(0, CONTACTS_SIM_FIELD_NAME, &unused);
	EXPECT_EQ(250, unused);

	int book = simBook(0);
	ASSERT_GT(book, 0);
	RecordPtr contact = makeContact({ "Simone", "", { "0101", "0202" }, { "s@x" }, book });
	int id = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_sim_insert(contact.get(), &id));
	store.reopen();
	RecordPtr read = getRecord(_contacts_contact._uri, id);
	EXPECT_EQ(1, childCount(read.get(), _contacts_contact.number)); // a SIM keeps one number
	EXPECT_EQ(1, childCount(read.get(), _contacts_contact.email));
	contacts_sim_get_unused_field_count(0, CONTACTS_SIM_FIELD_NAME, &unused);
	EXPECT_EQ(249, unused);

	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_sim_insert(makeContact({ "A name far too long for a SIM", "", {}, {}, book }).get(), &id));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_sim_insert(makeContact({ "Phone", "" }).get(), &id));

	contacts_record_set_str(childAt(read.get(), _contacts_contact.name), _contacts_name.first, "Simon");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_sim_update(read.get()));
	EXPECT_EQ("Simon", strOf(getRecord(_contacts_contact._uri, id).get(), _contacts_contact.display_name));

	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, 0);
	contacts_sim_is_ready(0, &ready);
	EXPECT_FALSE(ready);
	EXPECT_EQ(CONTACTS_ERROR_NOT_SUPPORTED, contacts_sim_insert(makeContact({ "Off", "", {}, {}, book }).get(), &id));
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, 1);

	int person = personOf(intOf(read.get(), _contacts_contact.id));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_sim_delete(person));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_sim_delete(person));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_sim_delete(-1));
}

TEST(Sim, ConfiguredSimsHaveTheirOwnCapacityAndLimits)
{
	TempDataDir dir;
	std::ofstream(dir.file("sim.conf")) << "[SIM1]\ncapacity=1\nname_max=5\nemail_max=0\n[SIM2]\ncapacity=3\n";
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	int book1 = simBook(0), book2 = simBook(1);
	EXPECT_GT(book1, 0);
	EXPECT_GT(book2, 0);
	bool supported = true;
	contacts_sim_get_field_status(0, CONTACTS_SIM_FIELD_EMAIL, &supported);
	EXPECT_FALSE(supported);
	int len = 0;
	contacts_sim_get_field_text_max_len(0, CONTACTS_SIM_FIELD_NAME, &len);
	EXPECT_EQ(5, len);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_sim_insert(makeContact({ "One", "", { "1" }, {}, book1 }).get(), nullptr));
	EXPECT_EQ(CONTACTS_ERROR_FILE_NO_SPACE, contacts_sim_insert(makeContact({ "Two", "", { "2" }, {}, book1 }).get(), nullptr));
	int unused = -1;
	contacts_sim_get_unused_field_count(0, CONTACTS_SIM_FIELD_NAME, &unused);
	EXPECT_EQ(0, unused);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_sim_insert(makeContact({ "Zwei", "", {}, {}, book2 }).get(), nullptr));
	contacts_disconnect();

	// The leading plus of an international number takes no digit of the card.
	std::ofstream(dir.file("sim.conf")) << "[SIM1]\nnumber_max=4\n";
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_sim_insert(makeContact({ "Plus", "", { "+1234" }, {}, book1 }).get(), nullptr));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_sim_insert(makeContact({ "Long", "", { "12345" }, {}, book1 }).get(), nullptr));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_sim_insert(makeContact({ "Plus2", "", { "+12345" }, {}, book1 }).get(), nullptr));
	contacts_disconnect();
}

TEST(ContactsCtlContacts, AddListLinkUnlinkAndDeletePersonsFromOutside)
{
	if (contactsCtlPath().empty())
		GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
	ConnectedStore store;
	std::string out;
	ASSERT_EQ(0, runContactsCtl("contacts add Anna Lee number=0101 email=a@x.org", &out));
	EXPECT_EQ("person 1 contact 1\n", out);
	ASSERT_EQ(0, runContactsCtl("contacts add Bob", &out));
	ASSERT_EQ(0, runContactsCtl("contacts link 1 2"));
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
