// Ringtone information, case-insensitive search, vCards read back by a small
// independent parser.
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

struct VcardLine {
	std::string name;
	std::string params;
	std::vector<std::string> values; // split at unescaped ';', unescaped
};

// Unfolds (CRLF + space), splits lines and unescapes values, per vCard 3.0.
std::vector<VcardLine> parseVcard(const std::string& text, bool* wellFormed)
{
	*wellFormed = true;
	std::string unfolded;
	for (size_t i = 0; i < text.size(); ++i) {
		if (text.compare(i, 3, "\r\n ") == 0) {
			i += 2;
			continue;
		}
		unfolded += text[i];
	}
	std::vector<VcardLine> lines;
	size_t start = 0;
	while (start < unfolded.size()) {
		size_t end = unfolded.find("\r\n", start);
		if (end == std::string::npos) {
			*wellFormed = false;
			break;
		}
		std::string raw = unfolded.substr(start, end - start);
		start = end + 2;
		size_t colon = raw.find(':');
		VcardLine line;
		std::string head = raw.substr(0, colon);
		size_t semi = head.find(';');
		line.name = head.substr(0, semi);
		line.params = semi == std::string::npos ? "" : head.substr(semi + 1);
		std::string value, current;
		std::string rest = raw.substr(colon + 1);
		for (size_t i = 0; i < rest.size(); ++i) {
			char c = rest[i];
			if (c == '\\' && i + 1 < rest.size()) {
				char n = rest[++i];
				current += n == 'n' || n == 'N' ? '\n' : n;
			} else if (c == ';') {
				line.values.push_back(current);
				current.clear();
			} else {
				current += c;
			}
		}
		line.values.push_back(current);
		lines.push_back(line);
	}
	return lines;
}

} // namespace

TEST(Vcard, PersonVcardCarriesEveryFieldFoldedAndEscaped)
{
	ConnectedStore store;
	std::string longNote = "Line one; with, specials \\ and a newline\nthen " + std::string(200, 'x') + " ünïcödé ";
	for (int i = 0; i < 40; ++i)
		longNote += "한";
	RecordPtr contact = makeContact({ "Ánna", "O'Neil", { "+1 555 0100" }, { "anna@example.com" } });
	contacts_record_h note = addChild(contact.get(), _contacts_contact.note, _contacts_note._uri);
	contacts_record_set_str(note, _contacts_note.note, longNote.c_str());
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
	int id = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(contact.get(), &id));
	int other = insertContact({ "Second", "", { "999" } });
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(personOf(id), personOf(other)));

	RecordPtr person = getRecord(_contacts_person._uri, personOf(id));
	char* stream = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_vcard_make_from_person(person.get(), &stream));
	std::string text = stream;
	free(stream);

	std::istringstream physical(text);
	for (std::string l; std::getline(physical, l);)
		EXPECT_LE(l.size(), 76u) << l; // 75 octets plus the CR
	bool wellFormed = false;
	std::vector<VcardLine> lines = parseVcard(text, &wellFormed);
	ASSERT_TRUE(wellFormed);
	std::multimap<std::string, VcardLine> byName;
	for (const auto& l : lines)
		byName.emplace(l.name, l);
	EXPECT_EQ("BEGIN", lines.front().name);
	EXPECT_EQ("END", lines.back().name);
	EXPECT_EQ("3.0", byName.find("VERSION")->second.values[0]);
	EXPECT_EQ("Ánna O'Neil", byName.find("FN")->second.values[0]);
	EXPECT_EQ((std::vector<std::string>{ "O'Neil", "Ánna", "", "", "" }), byName.find("N")->second.values);
	EXPECT_EQ(2u, byName.count("TEL"));
	EXPECT_EQ("TYPE=CELL", byName.find("TEL")->second.params);
	EXPECT_EQ("anna@example.com", byName.find("EMAIL")->second.values[0]);
	EXPECT_EQ(longNote, byName.find("NOTE")->second.values[0]);
	EXPECT_EQ((std::vector<std::string>{ "ACME; Inc.", "" }), byName.find("ORG")->second.values);
	EXPECT_EQ("Boss", byName.find("TITLE")->second.values[0]);
	EXPECT_EQ("1990-01-02", byName.find("BDAY")->second.values[0]);
	EXPECT_EQ((std::vector<std::string>{ "", "", "1 Main St", "Springfield", "", "", "" }),
		byName.find("ADR")->second.values);

	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_person(contact.get(), &stream));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_person(nullptr, &stream));
}

TEST(Vcard, MyProfileVcardUsesTheProfileRecord)
{
	contacts_record_h profile = nullptr;
	contacts_record_create(_contacts_my_profile._uri, &profile);
	RecordPtr owner(profile);
	contacts_record_h name = addChild(profile, _contacts_my_profile.name, _contacts_name._uri);
	contacts_record_set_str(name, _contacts_name.first, "Me,Myself");
	char* stream = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_vcard_make_from_my_profile(profile, &stream));
	bool wellFormed = false;
	std::vector<VcardLine> lines = parseVcard(stream, &wellFormed);
	free(stream);
	ASSERT_TRUE(wellFormed);
	bool found = false;
	for (const auto& l : lines)
		if (l.name == "FN") {
			EXPECT_EQ("Me,Myself", l.values[0]);
			found = true;
		}
	EXPECT_TRUE(found);
}
