// Ringtone information, case-insensitive search, and vCards read back line by
// line, independently of the writer.
#include "../contacts_db/ContactsTestSupport.h"

#include <cstdlib>
#include <map>
#include <sstream>

using namespace ct::test;

TEST(Utils, StrstrFindsMultiByteMatchesIgnoringCase)
{
	int len = -1;
	EXPECT_EQ(0, contacts_utils_strstr("Anna", "an", &len));
	EXPECT_EQ(2, len);
	EXPECT_EQ(6, contacts_utils_strstr("Maria ÁBEL", "ábel", &len));
	EXPECT_EQ(5, len); // "ÁBEL" is 5 bytes
	EXPECT_EQ(3, contacts_utils_strstr("김철수 김영희", " 김영", &len) - 6);
	EXPECT_EQ(-1, contacts_utils_strstr("Anna", "x", &len));
	EXPECT_EQ(0, len);
	EXPECT_EQ(-1, contacts_utils_strstr(nullptr, "x", &len));
	EXPECT_EQ(-1, contacts_utils_strstr("Anna", "", &len));
	EXPECT_EQ(-1, contacts_utils_strstr("bad \xff", "a", &len));
	EXPECT_EQ(-1, contacts_utils_strstr("Anna", "a", nullptr));
}

TEST(Utils, RingtoneInfoIsStoredPerKindAndId)
{
	ConnectedStore store;
	char* path = nullptr;
	int flag = 0;
	long long position = 0;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_utils_get_ringtone_info(1, 5, &path, &flag, &position));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_utils_set_ringtone_info(1, 5, "/music/a.mp3", 1, 12345678901LL));
	store.reopen();
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_utils_get_ringtone_info(1, 5, &path, &flag, &position));
	EXPECT_STREQ("/music/a.mp3", path);
	free(path);
	EXPECT_EQ(1, flag);
	EXPECT_EQ(12345678901LL, position);
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_utils_get_ringtone_info(0, 5, &path, &flag, &position));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_utils_set_ringtone_info(1, 5, nullptr, 0, 0));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_utils_get_ringtone_info(1, 5, &path, &flag, &position));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_utils_set_ringtone_info(1, -1, "/x", 1, 0));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_utils_get_ringtone_info(7, 1, &path, &flag, &position));
}

namespace {

// The logical lines of a vCard (folds undone): the raw value by "NAME;PARAMETERS".
// Sets wellFormed when the text ends in CRLF.
std::multimap<std::string, std::string> vcardLines(std::string text, bool* wellFormed)
{
	for (size_t fold; (fold = text.find("\r\n ")) != std::string::npos;)
		text.erase(fold, 3);
	*wellFormed = text.size() >= 2 && text.compare(text.size() - 2, 2, "\r\n") == 0;
	std::multimap<std::string, std::string> lines;
	for (size_t start = 0, end; (end = text.find("\r\n", start)) != std::string::npos; start = end + 2) {
		std::string line = text.substr(start, end - start);
		size_t colon = line.find(':');
		lines.emplace(line.substr(0, colon), colon == std::string::npos ? "" : line.substr(colon + 1));
	}
	return lines;
}

std::string unescaped(const std::string& value)
{
	std::string out;
	for (size_t i = 0; i < value.size(); ++i) {
		if (value[i] != '\\' || i + 1 == value.size()) {
			out += value[i];
			continue;
		}
		char c = value[++i];
		out += c == 'n' || c == 'N' ? '\n' : c;
	}
	return out;
}

} // namespace

TEST(Vcard, PersonVcardCarriesEveryFieldFoldedAndEscaped)
{
	ConnectedStore store;
	std::string longNote = "Line one; with, specials \\ and a newline\nthen " + std::string(200, 'x') + " ünïcödé ";
	for (int i = 0; i < 40; ++i)
		longNote += "한";
	RecordPtr contact = makeContact({ "Ánna", "O'Neil", { "+1 555 0100" }, { "anna@example.com" } });
	contacts_record_set_str(addChild(contact.get(), _contacts_contact.note, _contacts_note._uri), _contacts_note.note,
		longNote.c_str());
	contacts_record_h company = addChild(contact.get(), _contacts_contact.company, _contacts_company._uri);
	contacts_record_set_str(company, _contacts_company.name, "ACME; Inc.");
	contacts_record_set_str(company, _contacts_company.job_title, "Boss");
	contacts_record_h event = addChild(contact.get(), _contacts_contact.event, _contacts_event._uri);
	contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	contacts_record_set_int(event, _contacts_event.date, 19900102);
	contacts_record_h address = addChild(contact.get(), _contacts_contact.address, _contacts_address._uri);
	contacts_record_set_str(address, _contacts_address.street, "1 Main St");
	contacts_record_set_str(address, _contacts_address.locality, "Springfield");
	contacts_record_set_int(address, _contacts_address.type, CONTACTS_ADDRESS_TYPE_HOME);
	int id = insertRecord(contact.get());
	int other = insertContact({ "Second", "", { "999" } });
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(personOf(id), personOf(other)));

	char* stream = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE,
		contacts_vcard_make_from_person(getRecord(_contacts_person._uri, personOf(id)).get(), &stream));
	std::string text = stream;
	free(stream);
	std::istringstream physical(text);
	for (std::string l; std::getline(physical, l);)
		EXPECT_LE(l.size(), 76u) << l; // 75 octets plus the CR
	bool wellFormed = false;
	auto lines = vcardLines(text, &wellFormed);
	ASSERT_TRUE(wellFormed);
	EXPECT_EQ(0u, text.find("BEGIN:VCARD\r\n"));
	EXPECT_EQ(2u, lines.count("TEL;TYPE=CELL"));
	for (auto [name, value] : { std::pair{ "END", "VCARD" }, { "VERSION", "3.0" }, { "FN", "Ánna O'Neil" },
			 { "N", "O'Neil;Ánna;;;" }, { "EMAIL", "anna@example.com" }, { "ORG", "ACME\\; Inc.;" }, { "TITLE", "Boss" },
			 { "BDAY", "1990-01-02" }, { "ADR;TYPE=HOME", ";;1 Main St;Springfield;;;" } }) {
		auto line = lines.find(name);
		EXPECT_TRUE(line != lines.end() && line->second == value) << name << ": " << text;
	}
	ASSERT_EQ(1u, lines.count("NOTE"));
	EXPECT_EQ(longNote, unescaped(lines.find("NOTE")->second));

	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_person(contact.get(), &stream));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_person(nullptr, &stream));

	// My profile's vCard is made from the profile record.
	RecordPtr profile = newRecord(_contacts_my_profile._uri);
	contacts_record_set_str(addChild(profile.get(), _contacts_my_profile.name, _contacts_name._uri), _contacts_name.first,
		"Me,Myself");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_vcard_make_from_my_profile(profile.get(), &stream));
	lines = vcardLines(stream, &wellFormed);
	free(stream);
	ASSERT_TRUE(wellFormed);
	ASSERT_EQ(1u, lines.count("FN"));
	EXPECT_EQ("Me,Myself", unescaped(lines.find("FN")->second));
}
