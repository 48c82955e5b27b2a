// Importing vCard files: every good card stored in one transaction, refused
// cards listed, nothing stored (and no picture left behind) when the file
// or the write fails.
#include "VcardTestSupport.h"

#include "ContactsVcardImport.h"
#include "SqliteFaultInjector.h"

#include <filesystem>

using namespace ct::test;
using ct::contacts::ContactsVcardImport;
using ct::contacts::VcardImportReport;

namespace {

std::string pngCard(const std::string& name)
{
	std::string png = kPng + std::string(200, '\x11');
	gchar* encoded = g_base64_encode(reinterpret_cast<const guchar*>(png.data()), png.size());
	std::string text = "BEGIN:VCARD\r\nVERSION:3.0\r\nFN:" + name + "\r\nPHOTO;ENCODING=b;TYPE=PNG:" + encoded
		+ "\r\nCATEGORIES:Imported\r\nEND:VCARD\r\n";
	g_free(encoded);
	return text;
}

std::string plainCard(const std::string& name) { return "BEGIN:VCARD\r\nVERSION:3.0\r\nFN:" + name + "\r\nEND:VCARD\r\n"; }

size_t filesIn(const std::string& folder)
{
	std::error_code ec;
	size_t count = 0;
	for (auto it = std::filesystem::directory_iterator(folder, ec); !ec && it != std::filesystem::directory_iterator(); ++it)
		++count;
	return count;
}

int addAddressBook(const char* name, int mode = CONTACTS_ADDRESS_BOOK_MODE_NONE)
{
	RecordPtr book = newRecord(_contacts_address_book._uri);
	contacts_record_set_str(book.get(), _contacts_address_book.name, name);
	contacts_record_set_int(book.get(), _contacts_address_book.mode, mode);
	return insertRecord(book.get());
}

} // namespace

TEST(VcardImport, StoresEveryGoodCardAndNamesTheRefusedOnes)
{
	ConnectedStore store;
	std::string path = store.dir().file("mixed.vcf");
	std::ofstream(path, std::ios::binary) << plainCard("Anna") << "BEGIN:VCARD\r\nVERSION:3.0\r\nFN:Bad date\r\n"
		<< "BDAY:yesterday\r\nEND:VCARD\r\n" << pngCard("Bert") << "BEGIN:VCARD\r\nFN:Cut off\r\n";
	VcardImportReport report = ContactsVcardImport::importFile(path, 0);
	ASSERT_EQ(CONTACTS_ERROR_NONE, report.error) << report.errorText;
	EXPECT_EQ(4, report.cards);
	EXPECT_EQ((std::vector<std::string>{ "card 2 (line 5, Bad date): BDAY (line 8): 'yesterday' is not a date",
				  "card 4 (line 16, Cut off): no END:VCARD (the file ends inside the card)" }),
		report.refused);
	ASSERT_EQ(2u, report.contactIds.size());
	store.reopen();
	EXPECT_EQ(2, countOf(_contacts_person._uri));
	RecordPtr bert = getRecord(_contacts_contact._uri, report.contactIds[1]);
	EXPECT_EQ("Bert", strOf(bert.get(), _contacts_contact.display_name));
	std::string picture = strOf(childAt(bert.get(), _contacts_contact.image), _contacts_image.path);
	EXPECT_EQ(kPng + std::string(200, '\x11'), fileBytes(picture));
	EXPECT_EQ((std::vector<std::string>{ "Imported" }),
		texts(bert.get(), _contacts_contact.group_relation, _contacts_group_relation.name));
}

TEST(VcardImport, FilesThatCannotBeImportedStoreNothingAndSayWhy)
{
	ConnectedStore store;
	int readOnly = addAddressBook("Server", CONTACTS_ADDRESS_BOOK_MODE_READONLY);
	int sim = addAddressBook(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	std::string good = store.dir().file("good.vcf");
	std::ofstream(good, std::ios::binary) << plainCard("Anna");
	std::string garbage = store.dir().file("garbage.bin");
	std::ofstream(garbage, std::ios::binary) << std::string("\x00\x01\xFF not a card\n", 16);
	std::string huge = store.dir().file("huge.vcf");
	{
		std::ofstream out(huge, std::ios::binary);
		for (size_t i = 0; i <= ContactsVcardImport::kMaxCards * 2; ++i)
			out << "BEGIN:VCARD\r\nFN:P" << i << "\r\nEND:VCARD\r\n";
	}
	const struct {
		std::string path;
		int book;
		int error;
		const char* why;
	} cases[] = {
		{ store.dir().file("missing.vcf"), 0, CONTACTS_ERROR_INVALID_PARAMETER, "No such file" },
		{ store.dir().path(), 0, CONTACTS_ERROR_INVALID_PARAMETER, "" },
		{ garbage, 0, CONTACTS_ERROR_INVALID_PARAMETER, "the file holds no vCard" },
		{ huge, 0, CONTACTS_ERROR_INVALID_PARAMETER, "the file holds 100001 cards; at most 50000 are imported at once" },
		{ good, 99, CONTACTS_ERROR_INVALID_PARAMETER, "there is no address book 99" },
		{ good, readOnly, CONTACTS_ERROR_PERMISSION_DENIED, "is read-only" },
		{ good, sim, CONTACTS_ERROR_NOT_SUPPORTED, "is a SIM card" },
	};
	for (const auto& c : cases) {
		VcardImportReport report = ContactsVcardImport::importFile(c.path, c.book);
		EXPECT_EQ(c.error, report.error) << c.path;
		EXPECT_NE(std::string::npos, report.errorText.find(c.why)) << report.errorText;
		EXPECT_TRUE(report.contactIds.empty());
	}
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
}

TEST(VcardImport, AFullDiskStoresNoCardAndLeavesNoPictureBehind)
{
	ConnectedStore store;
	std::string text = pngCard("Anna") + plainCard("Bert") + pngCard("Carl");
	for (int n = 1; n < 400; ++n) {
		VcardImportReport report;
		{
			ct::db::ScopedWriteFailure failure(n);
			report = ContactsVcardImport::importText(text, 0);
		}
		if (report.error == CONTACTS_ERROR_NONE) {
			EXPECT_EQ(3u, report.contactIds.size());
			EXPECT_EQ(2u, filesIn(store.dir().file("images")));
			return;
		}
		EXPECT_EQ(CONTACTS_ERROR_FILE_NO_SPACE, report.error) << "n=" << n;
		EXPECT_EQ("nothing was stored: the disk is full", report.errorText);
		ASSERT_EQ(0, countOf(_contacts_contact._uri)) << "n=" << n;
		ASSERT_EQ(0, countOf(_contacts_group._uri)) << "n=" << n;
		ASSERT_EQ(0u, filesIn(store.dir().file("images"))) << "n=" << n;
	}
	FAIL() << "the import never succeeded";
}
