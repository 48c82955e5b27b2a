#include "CtInputViewWebsiteItem.h"

#include "CtCommonRecordUtil.h"

CtInputViewWebsiteItem::CtInputViewWebsiteItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewWebsiteItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.2icon");
	return itc;
}

std::string CtInputViewWebsiteItem::readText()
{
	const char* text = m_data->getWebsiteWebsite(m_record);
	return text ? text : "";
}

void CtInputViewWebsiteItem::writeText(const char* text)
{
	m_data->setWebsiteWebsite(m_record, text);
}
