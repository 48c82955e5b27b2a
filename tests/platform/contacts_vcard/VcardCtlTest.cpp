// contacts-ctl vcard export and import, from another process.
#include "../vconf/StoreTestSupport.h"
#include "VcardTestSupport.h"

using namespace ct::test;

TEST(VcardCtl, ExportsAPersonAndImportsItBackIntoAnAddressBook)
{
	if (contactsCtlPath().empty())
		GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
	ConnectedStore store;
	RecordPtr contact = newRecord(_contacts_contact._uri);
	fillRich(contact.get(), store.dir());
	int id = insertRecord(contact.get());
	RecordPtr book = newRecord(_contacts_address_book._uri);
	contacts_record_set_str(book.get(), _contacts_address_book.name, "Backup");
	int backup = insertRecord(book.get());

	std::string printed;
	ASSERT_EQ(0, runContactsCtl("vcard export " + std::to_string(personOf(id)), &printed));
	std::string file = store.dir().file("anna.vcf");
	ASSERT_EQ(0, runContactsCtl("vcard export " + std::to_string(personOf(id)) + " " + file));
	EXPECT_EQ(printed, fileBytes(file));
	EXPECT_EQ(0u, printed.find("BEGIN:VCARD\r\nVERSION:3.0\r\nFN:Dr. Ánna"));

	std::string out;
	ASSERT_EQ(0, runContactsCtl("vcard import " + file + " book=" + std::to_string(backup), &out));
	EXPECT_EQ("imported 1 of 1 cards into address book " + std::to_string(backup) + "\n", out);
	QueryOwner query(_contacts_contact._uri);
	contacts_filter_add_int(query.filter, _contacts_contact.address_book_id, CONTACTS_MATCH_EQUAL, backup);
	std::vector<int> imported = query.run(_contacts_contact.id);
	ASSERT_EQ(1u, imported.size());
	EXPECT_EQ(describe(*getRecord(_contacts_contact._uri, id)), describe(*getRecord(_contacts_contact._uri, imported[0])));
}

TEST(VcardCtl, RefusedCardsAndBadArgumentsAreReported)
{
	if (contactsCtlPath().empty())
		GTEST_SKIP() << "CONTACTS_TEST_BIN_DIR is not set";
	ConnectedStore store;
	std::string file = store.dir().file("two.vcf");
	std::ofstream(file, std::ios::binary) << "BEGIN:VCARD\r\nVERSION:3.0\r\nFN:Good\r\nEND:VCARD\r\n"
										  << "BEGIN:VCARD\r\nVERSION:3.0\r\nFN:Bad\r\nBDAY:soon\r\nEND:VCARD\r\n";
	std::string out;
	EXPECT_EQ(1, runContactsCtl("vcard import " + file, &out));
	EXPECT_EQ("refused card 2 (line 5, Bad): BDAY (line 8): 'soon' is not a date\n"
			  "imported 1 of 2 cards into address book 0\n",
		out);
	EXPECT_EQ(1, countOf(_contacts_person._uri));
	EXPECT_EQ(1, runContactsCtl("vcard import " + store.dir().file("none.vcf")));
	EXPECT_EQ(1, runContactsCtl("vcard import " + file + " book=42"));
	EXPECT_EQ(1, runContactsCtl("vcard export 42"));
	EXPECT_EQ(1, runContactsCtl("vcard export 1 " + store.dir().file("no/such/folder.vcf")));
	for (const char* args : { "vcard", "vcard frobnicate", "vcard export", "vcard export one", "vcard import",
			 "vcard import a.vcf book=x", "vcard import a.vcf extra" })
		EXPECT_EQ(2, runContactsCtl(args)) << args;
	EXPECT_EQ(1, countOf(_contacts_person._uri));
}
