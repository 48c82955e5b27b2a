// Splits vCard text (2.1, 3.0 or 4.0, one or many cards) into cards of
// properties: lines unfolded, quoted-printable soft breaks and 2.1 base64
// continuations joined, parameters parsed. Values stay undecoded.
#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace ct::contacts {

struct VcardProperty {
	std::string group; // "item1" of "item1.TEL", else empty
	std::string name;  // upper case
	// Names upper case; bare 2.1 parameters become TYPE (or ENCODING for
	// QUOTED-PRINTABLE, BASE64, 8BIT, 7BIT).
	std::vector<std::pair<std::string, std::string>> params;
	std::string value; // as written, not decoded
	int line = 0;      // where the property starts, from 1

	// The first value of a parameter, "" when absent.
	std::string param(const char* name) const;
	// Every TYPE value, upper case, split at commas.
	std::vector<std::string> types() const;
	bool hasType(const char* type) const;
};

struct VcardRawCard {
	int line = 0;        // line of BEGIN:VCARD
	std::string version; // as written; empty when the card has no VERSION
	std::vector<VcardProperty> properties;
	std::string refusal; // why the card cannot be read; empty when it can
};

class ContactsVcardLexer {
public:
	// A card with more properties than this is refused.
	static constexpr size_t kMaxProperties = 5000;

	// The text must outlive the lexer.
	explicit ContactsVcardLexer(std::string_view text);

	// The next card (possibly refused, see VcardRawCard::refusal); false when
	// the text holds no more cards.
	bool next(VcardRawCard& card);
	// The number of cards the text starts (BEGIN:VCARD lines), cheaply.
	static size_t countCards(std::string_view text);

private:
	bool __physicalLine(std::string_view* line);
	bool __peekLine(std::string_view* line) const;
	std::string __logicalLine(const std::string& version);
	void __joinContinuations(VcardProperty& property, const std::string& version);
	void __skipNestedCard();

	std::string_view m_text;
	size_t m_pos = 0;
	int m_line = 0;
};

} // namespace ct::contacts
