#include "CtInputViewSimNumberItem.h"

#include "CtCommonTextUtil.h"

#include <glib.h>

#include <algorithm>

namespace {

const int kNumberBufferSize = 1024;

std::string cleanNumber(const std::string& text)
{
	char cleaned[kNumberBufferSize] = {};
	ctCommonCleanNumber(text.c_str(), cleaned, sizeof(cleaned));
	return cleaned;
}

// Where the cursor stands in the cleaned text: after what was kept of the
// characters before it.
int cleanedCursor(const std::string& typed, int cursor)
{
	glong chars = g_utf8_strlen(typed.c_str(), static_cast<gssize>(typed.size()));
	const char* end = g_utf8_offset_to_pointer(typed.c_str(), std::clamp<glong>(cursor, 0, chars));
	return static_cast<int>(cleanNumber(std::string(typed.c_str(), end)).size());
}

} // namespace

CtInputViewSimNumberItem::CtInputViewSimNumberItem(std::shared_ptr<CtData> data, contacts_record_h record,
		std::function<void()> changed, std::function<void(bool)> emptied, const char* initialText)
	: CtInputViewSimFieldItem(std::move(data), CONTACTS_SIM_FIELD_NUMBER, std::move(changed), initialText),
	  m_record(record), m_emptied(std::move(emptied))
{
}

std::string CtInputViewSimNumberItem::readText()
{
	const char* text = m_data && m_record ? m_data->getNumberNumber(m_record) : nullptr;
	return text ? text : "";
}

void CtInputViewSimNumberItem::writeText(const char* text)
{
	if (m_data && m_record)
		m_data->setNumberNumber(m_record, text);
}

int CtInputViewSimNumberItem::measure(const std::string& text)
{
	return static_cast<int>(text.size());
}

int CtInputViewSimNumberItem::limitFor(const std::string& text)
{
	return getMaxLength() + (text.compare(0, 1, "+") == 0 ? 1 : 0);
}

void CtInputViewSimNumberItem::onTextChanged(Evas_Object* entry)
{
	std::string typed = getEntryUtf8(entry);
	std::string cleaned = cleanNumber(typed);
	if (cleaned.size() > static_cast<size_t>(std::max(limitFor(cleaned), 0))) {
		rewriteEntry(entry, m_acceptedText);
		postNotice("IDS_PB_POP_MAXIMUM_NUMBER_OF_CHARACTERS_REACHED");
		return;
	}
	if (cleaned != m_acceptedText) {
		accept(cleaned);
		if (m_emptied)
			m_emptied(cleaned.empty());
	}
	if (cleaned != typed) {
		rewriteEntry(entry, cleaned, cleanedCursor(typed, elm_entry_cursor_pos_get(entry)));
	}
	if (cleaned.empty())
		elm_object_signal_emit(entry, "elm,state,guide,enabled", "elm");
}
