#include "CtInputViewImportantSubItem.h"

#include <cstring>

namespace {

const char* const kContactEntries[] = {
	"IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB", "IDS_PB_BODY_GROUPS", "IDS_PB_OPT_ORGANISATION_ABB",
	"IDS_PB_BODY_ADDRESS_ABB2", "IDS_PB_OPT_WEB_ADDRESS_ABB", "IDS_PB_OPT_IM_ACCOUNT_ABB",
	"IDS_PB_OPT_EVENT_HEG_BIRTHDAY_ABB", "IDS_PB_BODY_NICKNAME_ABB", "IDS_PB_BODY_PHONETIC_NAME_ABB",
	"IDS_PB_OPT_RELATIONSHIP_ABB2", "IDS_PB_OPT_RINGTONE",
};

const char* const kMyProfileEntries[] = {
	"IDS_PB_BODY_ADDRESS_ABB2", "IDS_PB_OPT_EVENT_HEG_BIRTHDAY_ABB", "IDS_PB_BODY_NICKNAME_ABB",
	"IDS_PB_OPT_ORGANISATION_ABB", "IDS_PB_OPT_WEB_ADDRESS_ABB", "IDS_PB_OPT_IM_ACCOUNT_ABB",
	"IDS_PB_BODY_PHONETIC_NAME_ABB",
};

template <size_t N>
const char* entryOf(const char* const (&entries)[N], int entry)
{
	return entry >= 1 && entry <= static_cast<int>(N) ? entries[entry - 1] : nullptr;
}

} // namespace

CtInputViewImportantSubItem::CtInputViewImportantSubItem(int entry, Mode mode)
	: m_entry(entry), m_mode(mode)
{
}

const char* CtInputViewImportantSubItem::getTextId(int entry, Mode mode)
{
	return mode == Mode::Contact ? entryOf(kContactEntries, entry) : entryOf(kMyProfileEntries, entry);
}

Elm_Genlist_Item_Class* CtInputViewImportantSubItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("1line");
	return itc;
}

std::string CtInputViewImportantSubItem::getText(Evas_Object*, const char* part)
{
	const char* textId = getTextId(m_entry, m_mode);
	if (!textId || strcmp(part, "elm.text.main.left") != 0)
		return std::string();
	return translate(textId);
}
