#include "CtInputViewNoteItem.h"

#include "CtCommonRecordUtil.h"

CtInputViewNoteItem::CtInputViewNoteItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewNoteItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.2icon");
	return itc;
}

std::string CtInputViewNoteItem::readText()
{
	const char* text = m_data->getNote(m_record);
	return text ? text : "";
}

void CtInputViewNoteItem::writeText(const char* text)
{
	m_data->setNote(m_record, text);
}
