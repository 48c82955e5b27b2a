#include "CtDetailViewNoteItem.h"

#include "CtCommonRecordUtil.h"

#include <cstring>

CtDetailViewNoteItem::CtDetailViewNoteItem(CtDetailDataBase* data, contacts_record_h record)
	: CtDetailViewGenlistItem(data), m_record(record)
{
}

std::string CtDetailViewNoteItem::getCopyText()
{
	const char* value = getData()->getNote(m_record);
	return value ? value : "";
}

std::string CtDetailViewNoteItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub") == 0)
		return translate("IDS_PB_BUTTON_NOTES");
	if (strcmp(part, "elm.text.multiline") == 0)
		return highlightMain(toMarkup(getCopyText().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewNoteItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.multiline");
	return nullptr;
}

void CtDetailViewNoteItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
}
