// The address-book naming convention against the three rules that read it:
// a person counts as synced when one of its books is an account's, the
// storage list finds the device and SIM books by provider name, and the
// chosen storage is remembered by book name.
#include "../CommonTestSupport.h"

#include "ContactsCommon.h"
#include "CtCommonAddressbookUtil.h"

#include <sqlite3.h>

#include <fstream>

using namespace ct::test;

namespace {

class AddressbookNamingTest : public StoreTest {
protected:
	void SetUp() override
	{
		StoreTest::SetUp();
		std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\n[SIM2]\n";
		reopenStore();
	}

	// "name|provider" as stored and as the storage list reads it.
	static std::string describe(int addressbookId)
	{
		CText name = take(ctCommonGetAddressBookName(addressbookId));
		char* provider = nullptr;
		char* user = nullptr;
		ctCommonGetProviderNameByAddressbookId(addressbookId, &provider, &user);
		std::string out = std::string(name ? name.get() : "<null>") + "|" + (provider ? provider : "<null>");
		free(provider);
		free(user);
		return out;
	}
};

} // namespace

TEST_F(AddressbookNamingTest, BuiltInBooksAreNamedByKindAndShownByProvider)
{
	int sim1 = ctCommonGetAddressBookId(SIM_ADDRESSBOOK_NAME "1");
	int sim2 = ctCommonGetAddressBookId(SIM_ADDRESSBOOK_NAME "2");
	int account = addAddressbook("someone@example.com", 0, 3, "Exchange");
	ASSERT_GT(sim1, 0);
	ASSERT_GT(sim2, 0);
	const std::string device = ContactsCommon::translate("IDS_PB_OPT_DEVICE");
	struct Book {
		int id;
		std::string described;
		bool sim, synced;
	} books[] = {
		{0, PHONE_ADDRESSBOOK_NAME "|" + device, false, false},
		{sim1, SIM_ADDRESSBOOK_NAME "1|SIM1", true, false},
		{sim2, SIM_ADDRESSBOOK_NAME "2|SIM2", true, false},
		{account, "someone@example.com|Exchange", false, true},
	};
	for (const Book& book : books) {
		CText name = take(ctCommonGetAddressBookName(book.id));
		EXPECT_EQ(describe(book.id), book.described);
		EXPECT_EQ(ctCommonIsSimAddressbook(book.id), book.sim) << book.described;
		EXPECT_EQ(ctCommonIsAccountAddressbookName(name.get()), book.synced) << book.described;
		// The storage is remembered by name and found again by it.
		EXPECT_EQ(ctCommonGetAddressBookId(name.get()), book.id);
	}
	EXPECT_FALSE(ctCommonIsAccountAddressbookName(nullptr));
	EXPECT_FALSE(ctCommonIsAccountAddressbookName(SIM_ADDRESSBOOK_NAME));
}

TEST_F(AddressbookNamingTest, StoresOfTheOldNamingAreRenamedWhenOpened)
{
	int sim1 = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	contacts_disconnect();
	sqlite3* db = nullptr;
	ASSERT_EQ(sqlite3_open(m_dir.file("contacts.db").c_str(), &db), SQLITE_OK);
	ASSERT_EQ(sqlite3_exec(db,
		"UPDATE address_books SET name = 'Phone' WHERE id = 0;"
		"UPDATE address_books SET name = provider_name WHERE provider_name IN ('SIM1', 'SIM2');"
		"INSERT INTO address_books(account_id, name, provider_name) VALUES (4, 'Phone', 'Other');"
		"UPDATE meta SET value = 'contacts-service/3' WHERE key = 'schema';",
		nullptr, nullptr, nullptr), SQLITE_OK);
	sqlite3_close(db);
	ASSERT_EQ(contacts_connect(), CONTACTS_ERROR_NONE);

	EXPECT_EQ(ctCommonGetAddressBookId(PHONE_ADDRESSBOOK_NAME), 0);
	EXPECT_EQ(ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME), sim1);
	EXPECT_GT(ctCommonGetAddressBookId(CONTACTS_SIM2_ADDRESS_BOOK_NAME), 0);
	EXPECT_GT(ctCommonGetAddressBookId("Phone"), 0) << "an account's book keeps its name";
}
