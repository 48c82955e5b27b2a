// The vCard maker: line form (CRLF, 75-octet folds, escapes) read back line
// by line, and every field of a rich person read by an independent parser
// (vobject, through vcard_fields.py) field by field.
#include "VcardTestSupport.h"

#include "ContactsVcard.h"

#include <cstdio>
#include <sstream>

using namespace ct::test;

namespace {

std::string personVcard(int personId)
{
	char* stream = nullptr;
	int rc = contacts_vcard_make_from_person(getRecord(_contacts_person._uri, personId).get(), &stream);
	EXPECT_EQ(CONTACTS_ERROR_NONE, rc);
	std::string text = stream ? stream : "";
	free(stream);
	return text;
}

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

// The lines vcard_fields.py prints for the file; empty when it cannot run.
std::vector<std::string> parsedByVobject(const std::string& path, std::string* problem)
{
	const char* sources = getenv("CONTACTS_TEST_SOURCE_DIR");
	if (!sources) {
		*problem = "CONTACTS_TEST_SOURCE_DIR is not set";
		return {};
	}
	std::string command = std::string("/usr/bin/python3 ") + sources + "/platform/contacts_vcard/vcard_fields.py " + path
		+ " 2>&1";
	FILE* pipe = popen(command.c_str(), "r");
	std::string output;
	for (char buffer[4096]; pipe && fgets(buffer, sizeof buffer, pipe);)
		output += buffer;
	int status = pipe ? pclose(pipe) : -1;
	if (status != 0) {
		*problem = "vcard_fields.py failed (is python3-vobject installed? scripts/install-deps): " + output;
		return {};
	}
	std::vector<std::string> lines;
	std::istringstream in(output);
	for (std::string line; std::getline(in, line);)
		lines.push_back(line);
	return lines;
}

std::string row(const char* name, const char* types, const char* params, const std::string& value, const char* label = "")
{
	return std::string(name) + "\t" + types + "\t" + params + "\t" + value + "\t" + label;
}

} // namespace

TEST(VcardMaker, LinesAreFoldedAtSeventyFiveOctetsAndValuesEscaped)
{
	ConnectedStore store;
	std::string longNote = "Line one; with, specials \\ and a newline\nthen " + std::string(200, 'x') + " ünïcödé ";
	for (int i = 0; i < 40; ++i)
		longNote += "한";
	RecordPtr contact = makeContact({ "Ánna", "O'Neil", { "+1 555 0100" }, { "anna@example.com" } });
	setStr(addChild(contact.get(), _contacts_contact.note, _contacts_note._uri), _contacts_note.note, longNote.c_str());
	int id = insertRecord(contact.get());
	int other = insertContact({ "Second", "", { "999" } });
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(personOf(id), personOf(other)));

	std::string text = personVcard(personOf(id));
	std::istringstream physical(text);
	for (std::string l; std::getline(physical, l);)
		EXPECT_LE(l.size(), 76u) << l; // 75 octets plus the CR
	bool wellFormed = false;
	auto lines = vcardLines(text, &wellFormed);
	ASSERT_TRUE(wellFormed);
	EXPECT_EQ(0u, text.find("BEGIN:VCARD\r\nVERSION:3.0\r\n"));
	// Both linked contacts' numbers; the person's default one is preferred.
	EXPECT_EQ(1u, lines.count("TEL;TYPE=CELL,PREF"));
	EXPECT_EQ(1u, lines.count("TEL;TYPE=CELL"));
	ASSERT_EQ(1u, lines.count("NOTE"));
	EXPECT_EQ(longNote, unescaped(lines.find("NOTE")->second));
	EXPECT_EQ("O'Neil;Ánna;;;", lines.find("N")->second); // from the name contact
	EXPECT_EQ("VCARD", lines.find("END")->second);
}

TEST(VcardMaker, BadHandlesAndWrongViewsAreRefused)
{
	ConnectedStore store;
	int id = insertContact({ "Anna", "" });
	char* stream = reinterpret_cast<char*>(1);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_person(nullptr, &stream));
	EXPECT_EQ(nullptr, stream);
	RecordPtr contact = getRecord(_contacts_contact._uri, id);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_person(contact.get(), &stream));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_my_profile(contact.get(), &stream));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_vcard_make_from_contact(contact.get(), nullptr));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_vcard_make_from_contact(contact.get(), &stream));
	free(stream);
}

TEST(VcardMaker, PicturesTooBigOrOfNoKnownFormatAreLeftOut)
{
	ConnectedStore store;
	RecordPtr contact = makeContact({ "Anna", "", {}, {}, 0,
		writePicture(store.dir(), "big.jpg", kJpeg, ct::contacts::ContactsVcard::kMaxPictureBytes + 1) });
	setStr(addChild(contact.get(), _contacts_contact.image, _contacts_image._uri), _contacts_image.path,
		writePicture(store.dir(), "text.png", "plain text", 100).c_str());
	setStr(addChild(contact.get(), _contacts_contact.image, _contacts_image._uri), _contacts_image.path,
		store.dir().file("missing.png").c_str());
	std::string text = personVcard(personOf(insertRecord(contact.get())));
	EXPECT_EQ(std::string::npos, text.find("PHOTO")) << text;
	EXPECT_NE(std::string::npos, text.find("FN:Anna\r\n"));
}

TEST(VcardMaker, AnIndependentParserReadsEveryFieldOfARichPerson)
{
	ConnectedStore store;
	RecordPtr contact = newRecord(_contacts_contact._uri);
	RichContact rich = fillRich(contact.get(), store.dir());
	int id = insertRecord(contact.get());
	std::string path = store.dir().file("rich.vcf");
	std::ofstream(path, std::ios::binary) << personVcard(personOf(id));

	std::string problem;
	std::vector<std::string> actual = parsedByVobject(path, &problem);
	ASSERT_FALSE(actual.empty()) << problem;
	std::vector<std::string> expected = {
		row("FN", "", "", "Dr. Ánna Maria O'Neil; Jr, PhD"),
		row("N", "", "", "O'Neil; Jr;Ánna;Maria;Dr.;PhD"),
		row("X-PHONETIC-FIRST-NAME", "", "", "Ana"),
		row("X-PHONETIC-MIDDLE-NAME", "", "", "Mari"),
		row("X-PHONETIC-LAST-NAME", "", "", "Oneel"),
		row("NICKNAME", "", "", "Annie"),
		row("NICKNAME", "", "", "A, the great"),
		row("NOTE", "", "", "Line one; with, specials \\ and\\nanother line"),
		row("NOTE", "", "", "Second note: ünïcödé 한국어"),
		row("TEL", "CELL,PREF", "", "+1 555 0100"),
		row("TEL", "HOME,VOICE", "", "+1 555 0101"),
		row("TEL", "FAX,WORK", "", "+1 555 0102"),
		row("TEL", "", "", "+1 555 0103", "Boat; deck"),
		row("TEL", "X-ASSISTANT", "", "+1 555 0104"),
		row("TEL", "X-COMPANY-MAIN", "", "+1 555 0105"),
		row("TEL", "", "", "*31#"),
		row("EMAIL", "HOME,INTERNET,PREF", "", "anna@home.example"),
		row("EMAIL", "INTERNET", "", "anna@club.example", "Club"),
		row("EMAIL", "INTERNET,X-MOBILE", "", "anna@mobile.example"),
		row("EMAIL", "INTERNET,WORK", "", "anna@work.example"),
		row("ADR", "HOME,PREF", "", "PO 7;Flat 2;1 Main St, Rear\\nBuilding B;Springfield;IL;62701;USA"),
		row("ADR", "", "", ";;;Lakeside;;;", "Cabin"),
		row("ORG", "", "", "ACME; Inc.;R&D"),
		row("TITLE", "", "", "Chief, Rockets"),
		row("ROLE", "", "", "Engineer"),
		row("X-ASSISTANT", "", "", "Bob"),
		row("X-PHONETIC-ORG", "", "", "Akmee"),
		row("X-COMPANY-LOCATION", "", "", "Building 3"),
		row("X-COMPANY-DESCRIPTION", "", "", "Makes everything"),
		row("LOGO", "JPEG", "", "sha1:" + sha1(fileBytes(rich.logo))),
		row("ORG", "", "", "Other Co"),
		row("TITLE", "", "", "Advisor"),
		row("URL", "", "", "https://example.org/0?a=1,b=2"),
		row("URL", "", "", "https://example.org/1?a=1,b=2", "Blog"),
		row("URL", "HOME", "", "https://example.org/2?a=1,b=2"),
		row("URL", "WORK", "", "https://example.org/3?a=1,b=2"),
		row("IMPP", "", "", "x-apple:anna0@im.example"),
		row("IMPP", "", "X-SERVICE-TYPE=Signal", "x-apple:anna1@im.example"),
		row("X-GOOGLE-TALK", "", "", "anna2@im.example"),
		row("X-MSN", "", "", "anna3@im.example"),
		row("X-YAHOO", "", "", "anna4@im.example"),
		row("IMPP", "", "X-SERVICE-TYPE=Facebook", "xmpp:anna5@im.example"),
		row("X-ICQ", "", "", "anna6@im.example"),
		row("X-AIM", "", "", "anna7@im.example"),
		row("X-QQ", "", "", "anna8@im.example"),
		row("X-JABBER", "", "", "anna9@im.example"),
		row("X-SKYPE", "", "", "anna10@im.example"),
		row("IMPP", "", "X-SERVICE-TYPE=IRC", "irc:anna11@im.example"),
		row("BDAY", "", "", "1990-01-02"),
		row("X-ANNIVERSARY", "", "X-APPLE-OMIT-YEAR=1604", "1604-06-15"),
		row("X-ABDATE", "", "", "2020-01-01", "_$!<Other>!$_"),
		row("X-ABDATE", "", "X-CALSCALE=LUNAR X-LEAP-MONTH=TRUE", "2012-06-30", "Graduation"),
		row("CATEGORIES", "", "", "Family,Work, Team"),
		row("UID", "", "", "uid-123@example"),
		row("X-SOCIALPROFILE", "FRIENDBOOK",
			"X-APP-ID=com.example.friendbook X-CATEGORY=social X-EXTRA=aWQ=:MTIz,bmFtZQ==:QW5uYQ== X-MIME=vnd.example/profile "
			"X-OPERATION=http://example.org/appcontrol/operation/social/view X-PROFILE-TYPE=1 X-TEXT=Anna on Friendbook "
			"X-USER=anna.oneil",
			"https://friendbook.example/anna;p=1"),
		row("PHOTO", "PNG", "", "sha1:" + sha1(fileBytes(rich.picture1))),
		row("PHOTO", "JPEG", "", "sha1:" + sha1(fileBytes(rich.picture2))),
		"END",
	};
	const char* relations[] = { "Other", "Assistant", "Brother", "Child", "DomesticPartner", "Father", "Friend",
		"Manager", "Mother", "Parent", "Partner", "ReferredBy", "Relative", "Sister", "Spouse" };
	for (int type = 0; type <= CONTACTS_RELATIONSHIP_TYPE_CUSTOM; ++type) {
		std::string label = type == CONTACTS_RELATIONSHIP_TYPE_CUSTOM ? "Godmother" : "_$!<" + std::string(relations[type]) + ">!$_";
		expected.push_back(row("X-ABRELATEDNAMES", "", "", "Person " + std::to_string(type), label.c_str()));
	}
	std::sort(expected.begin(), expected.end());
	std::sort(actual.begin(), actual.end());
	EXPECT_EQ(expected, actual);
}
