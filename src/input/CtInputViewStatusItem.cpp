#include "CtInputViewStatusItem.h"

#include "CtCommonRecordUtil.h"
#include "CtInputData.h"

#include <cstdlib>

CtInputViewStatusItem::CtInputViewStatusItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewStatusItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.2icon");
	return itc;
}

std::string CtInputViewStatusItem::readText()
{
	const char* status = m_data->getStatus();
	std::string text = status ? status : "";
	// The ordinary contact hands out a copy; the profile lends its own text.
	if (dynamic_cast<CtInputData*>(m_data.get()))
		free(const_cast<char*>(status));
	return text;
}

void CtInputViewStatusItem::writeText(const char* text)
{
	m_data->setStatus(text);
}
