#include "CtInputViewMsisdnItem.h"

#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"

#include <cstring>

CtInputViewMsisdnItem::CtInputViewMsisdnItem(std::shared_ptr<CtData> data, contacts_record_h record)
	: CtInputViewGenlistItem(data ? data->getNumberNumber(record) : nullptr), m_data(std::move(data)), m_record(record)
{
}

Elm_Genlist_Item_Class* CtInputViewMsisdnItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("2line.bottom");
	return itc;
}

std::string CtInputViewMsisdnItem::getText(Evas_Object*, const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0) {
		const char* label = CtCommonGetNumberTypeStr(m_record, m_data->getDataType(m_record, _contacts_number.type));
		return ctCommonUtf8ToMarkup(label);
	}
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return ctCommonUtf8ToMarkup(m_data->getNumberNumber(m_record));
	return std::string();
}
