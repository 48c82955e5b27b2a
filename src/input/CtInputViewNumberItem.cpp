#include "CtInputViewNumberItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"

#include <cstring>

namespace {

bool isFormattingChar(const std::string& text, size_t pos)
{
	char c = text[pos];
	return c == '(' || c == ')' || c == ' ' || c == '-';
}

} // namespace

CtInputViewNumberItem::CtInputViewNumberItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewNumberItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.3icon");
	return itc;
}

std::string CtInputViewNumberItem::readText()
{
	const char* text = m_data->getNumberNumber(m_record);
	return text ? text : "";
}

void CtInputViewNumberItem::writeText(const char* text)
{
	m_data->setNumberNumber(m_record, text);
}

std::vector<CtInputViewTypeSelector::Choice> CtInputViewNumberItem::getTypeChoices()
{
	using namespace CtDataType;
	std::vector<CtInputViewTypeSelector::Choice> choices;
	addCurrentCustomChoice(choices, _contacts_number.type, _contacts_number.label, CONTACTS_NUMBER_TYPE_CUSTOM);
	const std::pair<const char*, int> menu[] = {{"IDS_PB_OPT_MOBILE", NUMBER_MENU_MOBILE},
		{"IDS_PB_OPT_WORK", NUMBER_MENU_WORK}, {"IDS_PB_OPT_HOME_ABB2", NUMBER_MENU_HOME},
		{"IDS_PB_OPT_FAX_HWORK_ABB", NUMBER_MENU_WORK_FAX}, {"IDS_PB_OPT_FAX_HHOME_ABB", NUMBER_MENU_HOME_FAX},
		{"IDS_PB_OPT_PAGER", NUMBER_MENU_PAGER}, {"IDS_PB_OPT_OTHER", NUMBER_MENU_OTHER_OR_CUSTOM},
		{"IDS_PB_OPT_CUSTOM", NUMBER_MENU_CUSTOM}};
	for (const auto& [textId, position] : menu)
		choices.push_back(choice(textId, position));
	return choices;
}

std::string CtInputViewNumberItem::getTypeLabel()
{
	const char* label = CtCommonGetNumberTypeStr(m_record, m_data->getDataType(m_record, _contacts_number.type));
	return label ? label : "";
}

int CtInputViewNumberItem::mapChoiceToType(int value)
{
	return m_data->getNumberTypeByIndex(value);
}

void CtInputViewNumberItem::writeType(int type, const char* label)
{
	m_data->setNumberType(m_record, type, label);
}

std::string CtInputViewNumberItem::formatNumber(const char* text)
{
	if (!text || !*text)
		return std::string();
	// Cleaning only drops characters: a buffer as long as the text never cuts it.
	std::string cleaned(strlen(text) + 1, '\0');
	int len = ctCommonCleanNumber(text, &cleaned[0], static_cast<int>(cleaned.size()));
	cleaned.resize(len > 0 ? len : 0);
	std::string plain = ContactsCommon::removeNumberDashes(cleaned.c_str());
	return ContactsCommon::addNumberDashes(plain.c_str());
}

bool CtInputViewNumberItem::insertedNonDialChar(const std::string& before, const std::string& now)
{
	if (now.size() <= before.size())
		return false;
	size_t prefix = 0;
	while (prefix < before.size() && before[prefix] == now[prefix])
		++prefix;
	// Step back to the start of a character cut by the common prefix.
	while (prefix > 0 && (static_cast<unsigned char>(now[prefix]) & 0xC0) == 0x80)
		--prefix;
	size_t insertedLen = now.size() - before.size();
	if (static_cast<size_t>(ctCommonCheckUtf8(now[prefix])) != insertedLen)
		return false;
	if (now.compare(prefix + insertedLen, std::string::npos, before, prefix, std::string::npos) != 0)
		return false;
	char c = now[prefix];
	return insertedLen > 1 || !((c >= '0' && c <= '9') || c == '+');
}

int CtInputViewNumberItem::mapCursor(const std::string& from, int cursor, const std::string& to)
{
	int significant = 0;
	size_t pos = 0;
	for (int chars = 0; chars < cursor && pos < from.size(); ++chars) {
		if (!isFormattingChar(from, pos))
			++significant;
		pos += ctCommonCheckUtf8(from[pos]);
	}
	int chars = 0;
	pos = 0;
	while (pos < to.size() && significant > 0) {
		if (!isFormattingChar(to, pos))
			--significant;
		pos += ctCommonCheckUtf8(to[pos]);
		++chars;
	}
	return chars;
}

void CtInputViewNumberItem::onTextChanged(Evas_Object* entry)
{
	char* raw = ctCommonMarkupToUtf8(elm_entry_entry_get(entry));
	WPRET_M(!raw, "text is NULL");
	std::string text(raw);
	free(raw);
	if (text == m_lastText)
		return;
	if (text.empty())
		m_formatting = true;
	else if (insertedNonDialChar(m_lastText, text))
		m_formatting = false;

	std::string formatted = m_formatting ? formatNumber(text.c_str()) : text;
	updateChangedState(formatted.c_str());
	m_data->setNumberNumber(m_record, formatted.c_str());
	m_lastText = formatted;
	if (formatted != text) {
		int cursor = mapCursor(text, elm_entry_cursor_pos_get(entry), formatted);
		setEntryText(entry, formatted.c_str());
		elm_entry_cursor_pos_set(entry, cursor);
	}
	notifyChanged();
	showGuideWhenEmpty(entry);
}
