#include "CtShareContactText.h"

#include <glib.h>

#include <algorithm>

namespace {

// Enough raw bytes to fill the text: whatever lies beyond is cut anyway.
constexpr size_t kMaxRawBytes = CtShareContactText::kMaxBytes + 4;

bool isContinuationByte(char c)
{
	return (static_cast<unsigned char>(c) & 0xC0) == 0x80;
}

std::string validUtf8(const std::string& text)
{
	std::string head = text.substr(0, kMaxRawBytes);
	gchar* valid = g_utf8_make_valid(head.c_str(), static_cast<gssize>(head.size()));
	std::string result = valid ? valid : "";
	g_free(valid);
	return result;
}

} // namespace

CtShareContactText::CtShareContactText(const char* displayName)
{
	if (displayName && *displayName)
		__appendLine(displayName);
}

void CtShareContactText::appendField(const std::string& label, const std::string& value)
{
	if (value.empty())
		return;
	if (!label.empty()) {
		__appendLine(label);
		m_labelEnds.push_back(m_text.size());
	}
	__appendLine(value);
}

void CtShareContactText::__appendLine(const std::string& line)
{
	if (m_text.size() > kMaxBytes)
		return;
	m_text += validUtf8(line);
	m_text += '\n';
}

std::string CtShareContactText::getText() const
{
	if (m_text.size() <= kMaxBytes)
		return m_text;
	size_t end = __lastLineEndWithin(kMaxBytes);
	if (std::find(m_labelEnds.begin(), m_labelEnds.end(), end) != m_labelEnds.end())
		end = __lastLineEndWithin(end - 1);
	if (end > 0)
		return m_text.substr(0, end);
	end = kMaxBytes;
	while (end > 0 && isContinuationByte(m_text[end]))
		--end;
	return m_text.substr(0, end);
}

// The length of the longest prefix of whole lines within `maxBytes`; 0 when none.
size_t CtShareContactText::__lastLineEndWithin(size_t maxBytes) const
{
	if (maxBytes == 0)
		return 0;
	size_t newline = m_text.rfind('\n', maxBytes - 1);
	return newline == std::string::npos ? 0 : newline + 1;
}
