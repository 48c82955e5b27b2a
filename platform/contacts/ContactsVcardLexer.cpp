#include "ContactsVcardLexer.h"

#include <strings.h>

#include <algorithm>
#include <cctype>
#include <cstring>

namespace ct::contacts {
namespace {

std::string upper(std::string_view s)
{
	std::string out(s);
	for (char& c : out)
		c = static_cast<char>(toupper(static_cast<unsigned char>(c)));
	return out;
}

std::string_view trimmed(std::string_view s)
{
	while (!s.empty() && (s.front() == ' ' || s.front() == '\t'))
		s.remove_prefix(1);
	while (!s.empty() && (s.back() == ' ' || s.back() == '\t'))
		s.remove_suffix(1);
	return s;
}

bool isLine(std::string_view line, const char* wanted)
{
	std::string_view t = trimmed(line);
	return t.size() == strlen(wanted) && strncasecmp(t.data(), wanted, t.size()) == 0;
}

bool isFolded(std::string_view line) { return !line.empty() && (line.front() == ' ' || line.front() == '\t'); }

// Position of the first `c` outside double quotes, npos when none.
size_t findUnquoted(std::string_view s, char c, size_t from = 0)
{
	bool quoted = false;
	for (size_t i = from; i < s.size(); ++i) {
		if (s[i] == '"')
			quoted = !quoted;
		else if (s[i] == c && !quoted)
			return i;
	}
	return std::string_view::npos;
}

bool isEncodingName(const std::string& v)
{
	return v == "QUOTED-PRINTABLE" || v == "BASE64" || v == "8BIT" || v == "7BIT";
}

void addParam(VcardProperty& p, std::string_view token)
{
	token = trimmed(token);
	if (token.empty())
		return;
	size_t eq = token.find('=');
	if (eq == std::string_view::npos) {
		std::string bare = upper(token);
		p.params.emplace_back(isEncodingName(bare) ? "ENCODING" : "TYPE", bare);
		return;
	}
	std::string value(trimmed(token.substr(eq + 1)));
	value.erase(std::remove(value.begin(), value.end(), '"'), value.end());
	p.params.emplace_back(upper(trimmed(token.substr(0, eq))), value);
}

// NAME;PARAM...:VALUE with an optional "group." before NAME. False when the
// line has no colon or no name.
bool parseProperty(std::string_view line, VcardProperty& p)
{
	size_t colon = findUnquoted(line, ':');
	if (colon == std::string_view::npos)
		return false;
	std::string_view head = line.substr(0, colon);
	p.value.assign(line.substr(colon + 1));
	size_t semi = findUnquoted(head, ';');
	std::string_view name = trimmed(head.substr(0, semi));
	size_t dot = name.rfind('.');
	if (dot != std::string_view::npos) {
		p.group.assign(name.substr(0, dot));
		name.remove_prefix(dot + 1);
	}
	if (name.empty())
		return false;
	p.name = upper(name);
	while (semi != std::string_view::npos) {
		size_t nextSemi = findUnquoted(head, ';', semi + 1);
		addParam(p, head.substr(semi + 1, nextSemi == std::string_view::npos ? std::string_view::npos : nextSemi - semi - 1));
		semi = nextSemi;
	}
	return true;
}

bool endsWithSoftBreak(const std::string& value) { return !value.empty() && value.back() == '='; }

// A line whose parameters say quoted-printable and that ends in '='.
bool isSoftBreak(const std::string& line)
{
	size_t colon = findUnquoted(line, ':');
	return endsWithSoftBreak(line) && colon != std::string::npos
		&& upper(std::string_view(line).substr(0, colon)).find("QUOTED-PRINTABLE") != std::string::npos;
}

} // namespace

std::string VcardProperty::param(const char* wanted) const
{
	for (const auto& [name, value] : params)
		if (name == wanted)
			return value;
	return {};
}

std::vector<std::string> VcardProperty::types() const
{
	std::vector<std::string> out;
	for (const auto& [name, value] : params) {
		if (name != "TYPE")
			continue;
		size_t start = 0;
		for (size_t comma; start <= value.size(); start = comma + 1) {
			comma = value.find(',', start);
			if (comma == std::string::npos)
				comma = value.size();
			std::string one = upper(trimmed(std::string_view(value).substr(start, comma - start)));
			if (!one.empty())
				out.push_back(one);
		}
	}
	return out;
}

bool VcardProperty::hasType(const char* type) const
{
	for (const std::string& t : types())
		if (t == type)
			return true;
	return false;
}

ContactsVcardLexer::ContactsVcardLexer(std::string_view text) : m_text(text)
{
	// A byte-order mark is not part of the first line.
	if (m_text.size() >= 3 && m_text.compare(0, 3, "\xEF\xBB\xBF") == 0)
		m_pos = 3;
}

bool ContactsVcardLexer::__peekLine(std::string_view* line) const
{
	if (m_pos >= m_text.size())
		return false;
	size_t end = m_text.find_first_of("\r\n", m_pos);
	*line = m_text.substr(m_pos, end == std::string_view::npos ? std::string_view::npos : end - m_pos);
	return true;
}

bool ContactsVcardLexer::__physicalLine(std::string_view* line)
{
	if (!__peekLine(line))
		return false;
	m_pos += line->size();
	if (m_pos < m_text.size() && m_text[m_pos] == '\r')
		++m_pos;
	if (m_pos < m_text.size() && m_text[m_pos] == '\n')
		++m_pos;
	++m_line;
	return true;
}

std::string ContactsVcardLexer::__logicalLine(const std::string& version)
{
	std::string_view first;
	__physicalLine(&first);
	std::string line(first);
	// 2.1 keeps the folding white space; later versions drop one character of it.
	size_t drop = version == "2.1" ? 0 : 1;
	for (std::string_view next; __peekLine(&next) && isFolded(next);) {
		__physicalLine(&next);
		// A quoted-printable soft break keeps the next line whole.
		if (isSoftBreak(line)) {
			line.pop_back();
			line.append(next);
		} else {
			line.append(next.substr(drop));
		}
	}
	return line;
}

void ContactsVcardLexer::__joinContinuations(VcardProperty& p, const std::string& version)
{
	std::string encoding = upper(p.param("ENCODING"));
	std::string_view next;
	if (encoding == "QUOTED-PRINTABLE") {
		while (endsWithSoftBreak(p.value) && __peekLine(&next) && !isLine(next, "END:VCARD")) {
			__physicalLine(&next);
			p.value.pop_back(); // the soft break
			p.value.append(next);
		}
	} else if ((encoding == "BASE64" || encoding == "B") && version == "2.1") {
		// 2.1 base64 data may run over unindented lines up to a blank line.
		while (__peekLine(&next) && !trimmed(next).empty() && next.find(':') == std::string_view::npos) {
			__physicalLine(&next);
			p.value.append(next);
		}
	}
}

void ContactsVcardLexer::__skipNestedCard()
{
	int depth = 1;
	for (std::string_view line; depth > 0 && __physicalLine(&line);) {
		if (isLine(line, "BEGIN:VCARD"))
			++depth;
		else if (isLine(line, "END:VCARD"))
			--depth;
	}
}

bool ContactsVcardLexer::next(VcardRawCard& card)
{
	card = VcardRawCard();
	std::string_view line;
	while (true) {
		if (!__physicalLine(&line))
			return false;
		if (isLine(line, "BEGIN:VCARD"))
			break;
	}
	card.line = m_line;
	while (__peekLine(&line)) {
		if (isLine(line, "END:VCARD")) {
			__physicalLine(&line);
			return true;
		}
		if (isLine(line, "BEGIN:VCARD")) {
			bool agent = !card.properties.empty() && card.properties.back().name == "AGENT"
				&& trimmed(card.properties.back().value).empty();
			if (!agent) {
				card.refusal = "no END:VCARD before the next card";
				return true;
			}
			__physicalLine(&line);
			__skipNestedCard();
			continue;
		}
		int start = m_line + 1;
		std::string logical = __logicalLine(card.version);
		VcardProperty p;
		if (!parseProperty(logical, p))
			continue;
		p.line = start;
		__joinContinuations(p, card.version);
		if (p.name == "VERSION")
			card.version = std::string(trimmed(p.value));
		if (card.properties.size() >= kMaxProperties) {
			card.refusal = "more than " + std::to_string(kMaxProperties) + " properties";
			continue;
		}
		card.properties.push_back(std::move(p));
	}
	card.refusal = "no END:VCARD (the file ends inside the card)";
	return true;
}

size_t ContactsVcardLexer::countCards(std::string_view text)
{
	size_t count = 0;
	for (size_t pos = 0; pos < text.size();) {
		size_t end = text.find('\n', pos);
		if (end == std::string_view::npos)
			end = text.size();
		std::string_view line = text.substr(pos, end - pos);
		if (!line.empty() && line.back() == '\r')
			line.remove_suffix(1);
		if (isLine(line, "BEGIN:VCARD"))
			++count;
		pos = end + 1;
	}
	return count;
}

} // namespace ct::contacts
