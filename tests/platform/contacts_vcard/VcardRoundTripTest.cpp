// Every field kind written by the vCard maker and read back by the importer
// comes back equal, for a person and for my profile.
#include "VcardTestSupport.h"

#include "ContactsVcardImport.h"

using namespace ct::test;
using ct::contacts::ContactsVcardImport;
using ct::contacts::VcardImportReport;

namespace {

int addAddressBook(const char* name, int mode = CONTACTS_ADDRESS_BOOK_MODE_NONE)
{
	RecordPtr book = newRecord(_contacts_address_book._uri);
	contacts_record_set_str(book.get(), _contacts_address_book.name, name);
	contacts_record_set_int(book.get(), _contacts_address_book.mode, mode);
	return insertRecord(book.get());
}

std::string takeStream(int rc, char* stream)
{
	EXPECT_EQ(CONTACTS_ERROR_NONE, rc);
	std::string text = stream ? stream : "";
	free(stream);
	return text;
}

std::string personVcard(int personId)
{
	char* stream = nullptr;
	int rc = contacts_vcard_make_from_person(getRecord(_contacts_person._uri, personId).get(), &stream);
	return takeStream(rc, stream);
}

std::vector<std::string> groupNames(contacts_record_h contact)
{
	std::vector<std::string> names = texts(contact, _contacts_contact.group_relation, _contacts_group_relation.name);
	std::sort(names.begin(), names.end());
	return names;
}

} // namespace

TEST(VcardRoundTrip, EveryFieldOfAPersonComesBackEqualInAnotherAddressBook)
{
	ConnectedStore store;
	RecordPtr contact = newRecord(_contacts_contact._uri);
	fillRich(contact.get(), store.dir());
	int id = insertRecord(contact.get());
	RecordPtr stored = getRecord(_contacts_contact._uri, id);
	int backup = addAddressBook("Backup");

	VcardImportReport report = ContactsVcardImport::importText(personVcard(personOf(id)), backup);
	ASSERT_EQ(CONTACTS_ERROR_NONE, report.error) << report.errorText;
	ASSERT_EQ(1u, report.contactIds.size());
	EXPECT_TRUE(report.refused.empty());
	store.reopen();
	RecordPtr imported = getRecord(_contacts_contact._uri, report.contactIds[0]);
	EXPECT_EQ(describe(*stored), describe(*imported));
	EXPECT_EQ(backup, intOf(imported.get(), _contacts_contact.address_book_id));
	// The groups were made in the other address book, under the same names.
	EXPECT_EQ((std::vector<std::string>{ "Family", "Work, Team" }), groupNames(imported.get()));
	EXPECT_EQ(4, countOf(_contacts_group._uri));
	// The pictures are copies of their own in the data folder.
	for (int i = 0; i < 2; ++i)
		EXPECT_EQ(0u, strOf(childAt(imported.get(), _contacts_contact.image, i), _contacts_image.path)
			.find(store.dir().file("images/vcard_")));
}

TEST(VcardRoundTrip, ImportingTheSameCardAgainReusesItsGroups)
{
	ConnectedStore store;
	RecordPtr contact = newRecord(_contacts_contact._uri);
	fillRich(contact.get(), store.dir());
	int id = insertRecord(contact.get());
	std::string text = personVcard(personOf(id));
	for (int round = 0; round < 2; ++round) {
		VcardImportReport report = ContactsVcardImport::importText(text, 0);
		ASSERT_EQ(1u, report.contactIds.size());
		EXPECT_EQ(describe(*getRecord(_contacts_contact._uri, id)),
			describe(*getRecord(_contacts_contact._uri, report.contactIds[0])));
	}
	EXPECT_EQ(2, countOf(_contacts_group._uri));
}

TEST(VcardRoundTrip, MyProfileComesBackEqualAsAContact)
{
	ConnectedStore store;
	RecordPtr profile = newRecord(_contacts_my_profile._uri);
	fillRich(profile.get(), store.dir());
	contacts_record_set_str(profile.get(), _contacts_my_profile_ex.status, "Out, walking; back soon");
	int id = insertRecord(profile.get());
	RecordPtr stored = getRecord(_contacts_my_profile._uri, id);
	char* stream = nullptr;
	int rc = contacts_vcard_make_from_my_profile(stored.get(), &stream);
	std::string text = takeStream(rc, stream);
	EXPECT_NE(std::string::npos, text.find("\r\nX-STATUS:Out\\, walking\\; back soon\r\n"));

	VcardImportReport report = ContactsVcardImport::importText(text, 0);
	ASSERT_EQ(1u, report.contactIds.size());
	RecordPtr imported = getRecord(_contacts_contact._uri, report.contactIds[0]);
	EXPECT_EQ(describe(*stored, true), describe(*imported, true));
}
