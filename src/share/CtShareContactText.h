#ifndef _CT_SHARE_CONTACT_TEXT_H_
#define _CT_SHARE_CONTACT_TEXT_H_

#include <string>
#include <vector>

// The plain text a share of chosen fields returns: the name line, then for
// each field its label line (when it has a label) and its value. The result
// is valid UTF-8 of at most kMaxBytes bytes; a longer text is cut after the
// last whole line that fits (never right after a label whose value is cut
// away), or, when not even the first line fits, at the last whole character
// that does.
class CtShareContactText {
public:
	static constexpr size_t kMaxBytes = 1023;

	// `displayName` may be null or empty: the text then starts with the fields.
	explicit CtShareContactText(const char* displayName);

	// An empty value adds nothing; an empty label adds no label line.
	void appendField(const std::string& label, const std::string& value);
	std::string getText() const;

private:
	void __appendLine(const std::string& line);
	size_t __lastLineEndWithin(size_t maxBytes) const;

	std::string m_text;
	std::vector<size_t> m_labelEnds;
};

#endif
