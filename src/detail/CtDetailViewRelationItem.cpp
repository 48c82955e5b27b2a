#include "CtDetailViewRelationItem.h"

#include "CtCommonRecordUtil.h"

#include <cstring>

CtDetailViewRelationItem::CtDetailViewRelationItem(CtDetailDataBase* data, contacts_record_h record)
	: CtDetailViewGenlistItem(data), m_record(record)
{
}

std::string CtDetailViewRelationItem::getCopyText()
{
	const char* value = getData()->getRelationship(m_record);
	return value ? value : "";
}

std::string CtDetailViewRelationItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return typeLabel(CtCommonGetRelationshipTypeStr(m_record, getData()->getDataType(m_record, _contacts_relationship.type)));
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return highlightMain(toMarkup(getCopyText().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewRelationItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.main.left.bottom");
	return nullptr;
}

void CtDetailViewRelationItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
}
