// The vCard reader on cards as other address books write them (2.1, 3.0,
// 4.0) and on cards it must refuse, with the reason.
#include "VcardTestSupport.h"

#include "ContactsVcardLexer.h"
#include "ContactsVcardReader.h"

using namespace ct::test;
using ct::contacts::ContactsVcardLexer;
using ct::contacts::ContactsVcardReader;
using ct::contacts::VcardEntry;
using ct::contacts::VcardRawCard;

namespace {

// Per card: the description of the contact read, with its pictures and
// groups, or "refused: why".
std::vector<std::string> readAll(const std::string& text)
{
	std::vector<std::string> out;
	ContactsVcardLexer lexer(text);
	VcardRawCard card;
	VcardEntry entry;
	while (lexer.next(card)) {
		std::string refusal;
		if (!ContactsVcardReader::read(card, entry, &refusal)) {
			out.push_back("refused: " + refusal);
			continue;
		}
		std::string d = describe(*entry.contact);
		for (const auto& picture : entry.pictures)
			d += std::string("picture=") + picture.format + " " + sha1(picture.bytes) + "\n";
		for (const auto& logo : entry.logos)
			d += std::string("logo=") + logo.second.format + "\n";
		for (const std::string& group : entry.groups)
			d += "group=" + group + "\n";
		out.push_back(d);
	}
	return out;
}

std::string base64(const std::string& bytes)
{
	gchar* encoded = g_base64_encode(reinterpret_cast<const guchar*>(bytes.data()), bytes.size());
	std::string out = encoded;
	g_free(encoded);
	return out;
}

std::string pngBytes() { return kPng + std::string(300, '\x42'); }

std::string card(const std::string& version, const std::string& body)
{
	return "BEGIN:VCARD\r\nVERSION:" + version + "\r\n" + body + "END:VCARD\r\n";
}

void expectHas(const std::string& description, std::initializer_list<const char*> lines)
{
	for (const char* line : lines)
		EXPECT_NE(std::string::npos, description.find(line)) << "missing \"" << line << "\" in\n" << description;
}

} // namespace

TEST(VcardReader, ReadsVersionTwoOneWithQuotedPrintableCharsetsAndBase64Pictures)
{
	std::string photo = base64(pngBytes());
	std::string text = card("2.1",
		"N;CHARSET=ISO-8859-1;ENCODING=QUOTED-PRINTABLE:M=FCller;J=F6rg;;;\r\n"
		"TEL;CELL;PREF:+49 170 1234\r\n"
		"TEL;HOME;VOICE:030 1234\r\n"
		"NOTE;ENCODING=QUOTED-PRINTABLE;CHARSET=UTF-8:Zeile eins=0D=0AZeile zwei=C3=A4 mit langem=\r\n"
		" Text=\r\n"
		"und Ende\r\n"
		"EMAIL;INTERNET:joerg@example.de\r\n"
		"ORG:Caf\xE9 M\xFCller\r\n" // no charset, not UTF-8: read as Windows-1252
		"PHOTO;ENCODING=BASE64;TYPE=PNG:\r\n"
		+ photo.substr(0, 60) + "\r\n" + photo.substr(60, 100) + "\r\n  " + photo.substr(160) + "\r\n\r\n");
	std::vector<std::string> cards = readAll(text);
	ASSERT_EQ(1u, cards.size());
	expectHas(cards[0], { "first=Jörg\n", "last=Müller\n", "type=64\n  is_default=1\n  number=+49 170 1234\n",
		"type=10\n  number=030 1234\n", "note=Zeile eins\nZeile zweiä mit langem Textund Ende\n",
		"email=joerg@example.de\n", "name=Café Müller\n" });
	expectHas(cards[0], { ("picture=PNG " + sha1(pngBytes())).c_str() });
}

TEST(VcardReader, ReadsAddressBookLabelsFoldsAndGroupsOfVersionThree)
{
	std::string photo = base64(pngBytes());
	std::string text = "BEGIN:VCARD\nVERSION:3.0\nN:Smith;Anna;;;\nFN:Anna Sm\n ith\n"
		"item1.TEL;type=CELL;type=VOICE;type=pref:(555) 010-0100\n"
		"item2.EMAIL;type=INTERNET:anna@other.example\nitem2.X-ABLabel:_$!<Other>!$_\n"
		"item3.EMAIL;type=INTERNET:anna@club.example\nitem3.X-ABLabel:Golf club\n"
		"item4.X-ABDATE;type=pref:2001-05-06\nitem4.X-ABLabel:_$!<Anniversary>!$_\n"
		"BDAY;X-APPLE-OMIT-YEAR=1604:1604-03-04\n"
		"item5.X-ABRELATEDNAMES:Bob\nitem5.X-ABLabel:_$!<Spouse>!$_\n"
		"IMPP;X-SERVICE-TYPE=Skype;type=HOME:skype:anna.s\n"
		"X-SOCIALPROFILE;type=twitter:https://twitter.example/anna\n"
		"NOTE:\xED\x95\x9C\xEA\xB5\n \xAD\xEC\x96\xB4\n" // a fold inside a character
		"CATEGORIES:Friends,Golf\\, club\n"
		"PHOTO;ENCODING=b;TYPE=PNG:" + photo.substr(0, 40) + "\n " + photo.substr(40) + "\n"
		"END:VCARD\n";
	std::vector<std::string> cards = readAll(text);
	ASSERT_EQ(1u, cards.size());
	expectHas(cards[0], { "first=Anna\n", "last=Smith\n", "type=72\n  is_default=1\n  number=(555) 010-0100\n",
		"email=anna@other.example\n", "type=1\n  label=Golf club\n  email=anna@club.example\n",
		"type=3\n  date=20010506\n", "type=2\n  date=304\n", "type=14\n  name=Bob\n",
		"type=10\n  im_id=anna.s\n", "note=한국어\n", "group=Friends\n", "group=Golf, club\n", "picture=PNG" });
	expectHas(cards[0], { "profile:\n  label=twitter\n  uri=https://twitter.example/anna\n" });
}

TEST(VcardReader, ReadsVersionFourValues)
{
	std::string text = card("4.0",
		"FN:Zoë Test\r\nN:Test;Zoë;;;\r\n"
		"TEL;VALUE=uri;TYPE=\"cell,voice\";PREF=1:tel:+1-555-0199\r\n"
		"EMAIL;TYPE=work:zoe@work.example\r\n"
		"ANNIVERSARY:20100615\r\nBDAY:--0102\r\n"
		"RELATED;TYPE=spouse;VALUE=text:Sam\r\n"
		"ORG:Acme;Sales;EMEA\r\n"
		"PHOTO:data:image/png;base64," + base64(pngBytes()) + "\r\n");
	std::vector<std::string> cards = readAll(text);
	ASSERT_EQ(1u, cards.size());
	expectHas(cards[0], { "first=Zoë\n", "type=72\n  is_default=1\n  number=+1-555-0199\n",
		"type=4\n  email=zoe@work.example\n", "type=3\n  date=20100615\n", "type=2\n  date=102\n",
		"type=14\n  name=Sam\n", "name=Acme\n  department=Sales;EMEA\n", "picture=PNG" });
}

TEST(VcardReader, FindsEveryCardAmongNoiseNestedAgentsAndOtherEncodings)
{
	std::string text = "\xEF\xBB\xBFnot a card\r\n"
		"BEGIN:VCARD\r\nVERSION:2.1\r\nN:One;;;;\r\nAGENT:\r\n"
		"BEGIN:VCARD\r\nVERSION:2.1\r\nN:Agent;;;;\r\nEND:VCARD\r\nEND:VCARD\r\n"
		"noise\r\n"
		"begin:vcard\r\nversion:3.0\r\nfn:Two\r\nend:vcard\r\n"
		"BEGIN:VCARD\r\nVERSION:3.0\r\nN;CHARSET=SHIFT_JIS:\x8E\x52\x93\x63;\x91\xBE\x98\x59;;;\r\nEND:VCARD\r\n";
	EXPECT_EQ(4u, ContactsVcardLexer::countCards(text)); // the agent counts: an upper bound
	std::vector<std::string> cards = readAll(text);
	ASSERT_EQ(3u, cards.size());
	expectHas(cards[0], { "last=One\n" });
	EXPECT_EQ(std::string::npos, cards[0].find("Agent"));
	expectHas(cards[1], { "first=Two\n" });
	expectHas(cards[2], { "first=太郎\n", "last=山田\n" });
}

TEST(VcardReader, RefusesCardsItCannotStoreFaithfullyAndSaysWhy)
{
	std::string manyLines;
	for (size_t i = 0; i <= ContactsVcardLexer::kMaxProperties; ++i)
		manyLines += "NOTE:" + std::to_string(i) + "\r\n";
	const std::pair<std::string, const char*> cases[] = {
		{ card("3.0", "N:\xFF\xFE;;;;\r\n"), "N (line 3): text is not UTF-8" },
		{ card("3.0", "N;CHARSET=NOPE-42:x;;;;\r\n"), "text cannot be read as NOPE-42" },
		{ card("3.0", "FN:A\r\nPHOTO;ENCODING=b;TYPE=JPEG:@@@@\r\n"), "PHOTO (line 4): picture is not valid base64" },
		{ card("3.0", "FN:A\r\nPHOTO;ENCODING=b;TYPE=JPEG:aGVsbG8=\r\n"), "picture is not a JPEG, PNG, GIF, BMP or WEBP" },
		{ card("3.0", "FN:A\r\nPHOTO;ENCODING=b:" + std::string(14 * 1024 * 1024, 'A') + "\r\n"), "picture larger than 4 MB" },
		{ card("3.0", "FN:A\r\nBDAY:someday\r\n"), "BDAY (line 4): 'someday' is not a date" },
		{ card("3.0", "FN:A\r\nBDAY:2001-13-45\r\n"), "is not a date" },
		{ card("5.0", "FN:A\r\n"), "vCard version 5.0 is not supported" },
		{ card("3.0", "X-FOO:bar\r\nPRODID:-//x//\r\n"), "the card holds no contact data" },
		{ card("3.0", manyLines), "more than 5000 properties" },
		{ "BEGIN:VCARD\r\nVERSION:3.0\r\nFN:Cut", "no END:VCARD (the file ends inside the card)" },
	};
	for (const auto& [text, reason] : cases) {
		std::vector<std::string> cards = readAll(text);
		ASSERT_EQ(1u, cards.size()) << reason;
		EXPECT_EQ(0u, cards[0].find("refused: ")) << reason;
		EXPECT_NE(std::string::npos, cards[0].find(reason)) << cards[0];
	}
}

TEST(VcardReader, ACardWithoutEndDoesNotSwallowTheNextOne)
{
	std::vector<std::string> cards = readAll("BEGIN:VCARD\r\nVERSION:3.0\r\nFN:First\r\n"
		"BEGIN:VCARD\r\nVERSION:3.0\r\nFN:Second\r\nX-UNKNOWN;FOO=bar:baz\r\nEND:VCARD\r\n");
	ASSERT_EQ(2u, cards.size());
	EXPECT_EQ("refused: no END:VCARD before the next card", cards[0]);
	expectHas(cards[1], { "first=Second\n" });
}

TEST(VcardReader, ABackslashAtTheEndOfAValueIsKeptAsText)
{
	std::vector<std::string> cards = readAll(card("3.0", "ORG:Acme\\\r\nN:Smith\\\r\nNICKNAME:A\\\r\n"));
	ASSERT_EQ(1u, cards.size());
	expectHas(cards[0], { "name=Acme\\\n", "last=Smith\\\n", "name=A\\\n" });
}

TEST(VcardReader, ValuesThatAreOnlyASchemeMakeNoField)
{
	std::vector<std::string> cards = readAll(card("4.0", "FN:A\r\nTEL;VALUE=uri:tel:\r\nIMPP;X-SERVICE-TYPE=Skype:skype:\r\n"));
	ASSERT_EQ(1u, cards.size());
	EXPECT_EQ(std::string::npos, cards[0].find("number")) << cards[0];
	EXPECT_EQ(std::string::npos, cards[0].find("messenger")) << cards[0];
}
