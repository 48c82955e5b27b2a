// The card a person is shared as, read back by a strict vCard 3.0 reader
// written here from the standard (content lines, folding, escapes), not by
// the store's own importer: every field kind, non-ASCII text, separators.
#include "DetailActionsTest.h"

#include <glib.h>

#include <map>

using namespace ct::test;

namespace {

struct Property {
	std::string group;
	std::string name;
	std::multimap<std::string, std::string> params;
	std::string value; // raw, still escaped
};

// Unfolds and splits the card into content lines; fails the test on any
// line that breaks the grammar.
std::vector<Property> readCard(const std::string& card)
{
	std::vector<Property> properties;
	EXPECT_TRUE(g_utf8_validate(card.data(), card.size(), nullptr));
	std::vector<std::string> lines;
	size_t pos = 0;
	while (pos < card.size()) {
		size_t end = card.find("\r\n", pos);
		EXPECT_NE(std::string::npos, end) << "line without CRLF at " << pos;
		if (end == std::string::npos)
			break;
		std::string line = card.substr(pos, end - pos);
		EXPECT_LE(line.size(), 75u) << line;
		if (!line.empty() && (line[0] == ' ' || line[0] == '\t')) {
			EXPECT_FALSE(lines.empty());
			if (!lines.empty())
				lines.back() += line.substr(1);
		} else {
			lines.push_back(line);
		}
		pos = end + 2;
	}
	for (const std::string& line : lines) {
		EXPECT_TRUE(g_utf8_validate(line.data(), line.size(), nullptr)) << "a fold split a character: " << line;
		Property p;
		size_t i = 0;
		bool quoted = false;
		std::string head;
		for (; i < line.size() && (quoted || line[i] != ':'); ++i) {
			if (line[i] == '"')
				quoted = !quoted;
			head += line[i];
		}
		EXPECT_LT(i, line.size()) << "no value: " << line;
		p.value = i < line.size() ? line.substr(i + 1) : "";
		std::vector<std::string> parts;
		std::string part;
		quoted = false;
		for (char c : head) {
			if (c == '"')
				quoted = !quoted;
			if (c == ';' && !quoted) {
				parts.push_back(part);
				part.clear();
			} else {
				part += c;
			}
		}
		parts.push_back(part);
		p.name = parts[0];
		if (size_t dot = p.name.find('.'); dot != std::string::npos) {
			p.group = p.name.substr(0, dot);
			p.name = p.name.substr(dot + 1);
		}
		for (char c : p.name)
			EXPECT_TRUE(isalnum(static_cast<unsigned char>(c)) || c == '-') << "bad name: " << line;
		for (size_t k = 1; k < parts.size(); ++k) {
			size_t eq = parts[k].find('=');
			EXPECT_NE(std::string::npos, eq) << "bad parameter: " << line;
			if (eq != std::string::npos)
				p.params.emplace(parts[k].substr(0, eq), parts[k].substr(eq + 1));
		}
		properties.push_back(p);
	}
	return properties;
}

// The components of a structured value (split at unescaped `separator`), unescaped.
Strings components(const std::string& value, char separator = ';')
{
	Strings out(1);
	for (size_t i = 0; i < value.size(); ++i) {
		char c = value[i];
		if (c == '\\' && i + 1 < value.size()) {
			char n = value[++i];
			out.back() += n == 'n' || n == 'N' ? '\n' : n;
			EXPECT_TRUE(strchr("nN\\,;", n)) << "bad escape \\" << n << " in " << value;
		} else if (c == separator) {
			out.emplace_back();
		} else {
			out.back() += c;
		}
	}
	return out;
}

// Every value of `name`, each as its components (text lists split at ',').
std::vector<Strings> valuesOf(const std::vector<Property>& card, const std::string& name)
{
	const bool textList = name == "NICKNAME" || name == "CATEGORIES";
	std::vector<Strings> values;
	for (const Property& p : card)
		if (p.name == name)
			values.push_back(components(p.value, textList ? ',' : ';'));
	return values;
}

// The X-ABLabel of the group that `name` with `value` is in.
std::string labelOf(const std::vector<Property>& card, const std::string& name, const std::string& value)
{
	for (const Property& p : card) {
		if (p.name != name || components(p.value).front() != value || p.group.empty())
			continue;
		for (const Property& l : card)
			if (l.group == p.group && l.name == "X-ABLabel")
				return components(l.value).front();
	}
	return "";
}

contacts_record_h child(contacts_record_h contact, unsigned int list, const char* uri,
		std::initializer_list<std::pair<unsigned int, const char*>> texts, int type = -1, unsigned int typeProperty = 0)
{
	contacts_record_h record = addChild(contact, list, uri);
	for (const auto& [property, text] : texts)
		contacts_record_set_str(record, property, text);
	if (typeProperty)
		contacts_record_set_int(record, typeProperty, type);
	return record;
}

} // namespace

TEST_F(DetailActionsTest, SharedCardHoldsEveryFieldKindAsAStrictReaderReadsIt)
{
	const std::string longNote = "Première ligne; deuxième, avec \\ et\nune autre ligne — 東京都渋谷区 🎉 "
			+ std::string(40, 'x') + " ünïcödé über die Faltgrenze hinaus ÆØÅ ÄÖÜ ß";
	contacts_record_h contact = newContact(0, nullptr);
	child(contact, _contacts_contact.name, _contacts_name._uri, {{_contacts_name.first, "Zoë"},
		{_contacts_name.last, "Ørsted-Łukasiewicz"}, {_contacts_name.addition, "Ana;María"},
		{_contacts_name.prefix, "Dr."}, {_contacts_name.suffix, "Jr., PhD"}, {_contacts_name.phonetic_first, "ゾエ"}});
	child(contact, _contacts_contact.nickname, _contacts_nickname._uri, {{_contacts_nickname.name, "Zozo, the 2nd"}});
	child(contact, _contacts_contact.number, _contacts_number._uri, {{_contacts_number.number, "+49 30 123456"}},
		CONTACTS_NUMBER_TYPE_CELL, _contacts_number.type);
	child(contact, _contacts_contact.number, _contacts_number._uri,
		{{_contacts_number.number, "010-9876-5432"}, {_contacts_number.label, "Ferienhaus"}},
		CONTACTS_NUMBER_TYPE_CUSTOM, _contacts_number.type);
	child(contact, _contacts_contact.email, _contacts_email._uri, {{_contacts_email.email, "zoë@exämple.org"}},
		CONTACTS_EMAIL_TYPE_WORK, _contacts_email.type);
	child(contact, _contacts_contact.address, _contacts_address._uri, {{_contacts_address.postbox, "PF 12"},
		{_contacts_address.extended, "Hinterhaus; 2. OG"}, {_contacts_address.street, "Straße des 17. Juni 1"},
		{_contacts_address.locality, "Berlin"}, {_contacts_address.region, "Bérlin, BE"},
		{_contacts_address.postal_code, "10623"}, {_contacts_address.country, "Deutschland"}},
		CONTACTS_ADDRESS_TYPE_HOME, _contacts_address.type);
	child(contact, _contacts_contact.url, _contacts_url._uri, {{_contacts_url.url, "https://例え.jp/パス?a=1,b=2"}},
		CONTACTS_URL_TYPE_HOME, _contacts_url.type);
	child(contact, _contacts_contact.company, _contacts_company._uri, {{_contacts_company.name, "Société Générale"},
		{_contacts_company.department, "R&D; Labs"}, {_contacts_company.job_title, "Ingénieure"}});
	child(contact, _contacts_contact.messenger, _contacts_messenger._uri,
		{{_contacts_messenger.im_id, "zoë.im"}, {_contacts_messenger.label, "Signal"}},
		CONTACTS_MESSENGER_TYPE_CUSTOM, _contacts_messenger.type);
	child(contact, _contacts_contact.relationship, _contacts_relationship._uri,
		{{_contacts_relationship.name, "Björn"}, {_contacts_relationship.label, "Patenonkel"}},
		CONTACTS_RELATIONSHIP_TYPE_CUSTOM, _contacts_relationship.type);
	contacts_record_h birthday = child(contact, _contacts_contact.event, _contacts_event._uri, {},
		CONTACTS_EVENT_TYPE_BIRTH, _contacts_event.type);
	contacts_record_set_int(birthday, _contacts_event.date, 19840229);
	contacts_record_h anniversary = child(contact, _contacts_contact.event, _contacts_event._uri, {},
		CONTACTS_EVENT_TYPE_ANNIVERSARY, _contacts_event.type);
	contacts_record_set_int(anniversary, _contacts_event.date, 20101009);
	child(contact, _contacts_contact.note, _contacts_note._uri, {{_contacts_note.note, longNote.c_str()}});
	int contactId = store(contact);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_group_add_contact(addGroup(0, "Familie, nah"), contactId));

	CtDetailData data(personOf(contactId));
	char* stream = data.getVcardStream();
	ASSERT_NE(nullptr, stream);
	const std::string text = stream;
	free(stream);
	std::vector<Property> card = readCard(text);
	ASSERT_GE(card.size(), 3u) << text;
	EXPECT_EQ((Strings{"BEGIN", "VCARD"}), (Strings{card.front().name, card.front().value}));
	EXPECT_EQ((Strings{"VERSION", "3.0"}), (Strings{card[1].name, card[1].value}));
	EXPECT_EQ((Strings{"END", "VCARD"}), (Strings{card.back().name, card.back().value}));

	using Values = std::vector<Strings>;
	EXPECT_EQ((Values{{"Ørsted-Łukasiewicz", "Zoë", "Ana;María", "Dr.", "Jr., PhD"}}), valuesOf(card, "N")) << text;
	EXPECT_EQ((Values{{"ゾエ"}}), valuesOf(card, "X-PHONETIC-FIRST-NAME"));
	EXPECT_EQ((Values{{"Zozo, the 2nd"}}), valuesOf(card, "NICKNAME"));
	EXPECT_EQ((Values{{"+49 30 123456"}, {"010-9876-5432"}}), valuesOf(card, "TEL"));
	EXPECT_EQ("Ferienhaus", labelOf(card, "TEL", "010-9876-5432"));
	EXPECT_EQ((Values{{"zoë@exämple.org"}}), valuesOf(card, "EMAIL"));
	EXPECT_EQ((Values{{"PF 12", "Hinterhaus; 2. OG", "Straße des 17. Juni 1", "Berlin", "Bérlin, BE", "10623", "Deutschland"}}),
			valuesOf(card, "ADR"));
	EXPECT_EQ((Values{{"https://例え.jp/パス?a=1,b=2"}}), valuesOf(card, "URL"));
	EXPECT_EQ((Values{{"Société Générale", "R&D; Labs"}}), valuesOf(card, "ORG"));
	EXPECT_EQ((Values{{"Ingénieure"}}), valuesOf(card, "TITLE"));
	EXPECT_EQ((Values{{"x-apple:zoë.im"}}), valuesOf(card, "IMPP"));
	EXPECT_EQ((Values{{"Björn"}}), valuesOf(card, "X-ABRELATEDNAMES"));
	EXPECT_EQ("Patenonkel", labelOf(card, "X-ABRELATEDNAMES", "Björn"));
	EXPECT_EQ((Values{{"1984-02-29"}}), valuesOf(card, "BDAY"));
	EXPECT_EQ((Values{{"2010-10-09"}}), valuesOf(card, "X-ANNIVERSARY"));
	EXPECT_EQ((Values{{longNote}}), valuesOf(card, "NOTE"));
	EXPECT_EQ((Values{{"Familie, nah"}}), valuesOf(card, "CATEGORIES"));
	for (const Property& p : card) {
		if (p.group.empty() && (p.name == "TEL" || p.name == "EMAIL" || p.name == "ADR" || p.name == "URL")) {
			EXPECT_EQ(1u, p.params.count("TYPE")) << p.name;
		}
	}
}
