#include "CtDetailViewMessengerItem.h"

#include "CtCommonRecordUtil.h"

#include <cstring>

CtDetailViewMessengerItem::CtDetailViewMessengerItem(CtDetailDataBase* data, contacts_record_h record)
	: CtDetailViewGenlistItem(data), m_record(record)
{
}

std::string CtDetailViewMessengerItem::getCopyText()
{
	const char* value = getData()->getMessenger(m_record);
	return value ? value : "";
}

std::string CtDetailViewMessengerItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return typeLabel(CtCommonGetMessengerTypeStr(m_record, getData()->getDataType(m_record, _contacts_messenger.type)));
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return highlightMain(toMarkup(getCopyText().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewMessengerItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.main.left.bottom");
	return nullptr;
}

void CtDetailViewMessengerItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
}
