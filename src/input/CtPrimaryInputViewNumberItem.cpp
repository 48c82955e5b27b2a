#include "CtPrimaryInputViewNumberItem.h"

#include "CtCommonUsageLog.h"

#include <cstring>

CtPrimaryInputViewNumberItem::CtPrimaryInputViewNumberItem(std::shared_ptr<CtData> data, contacts_record_h record,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewNumberItem(std::move(data), record, 0, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtPrimaryInputViewNumberItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("baseinfo.primary");
	return itc;
}

std::string CtPrimaryInputViewNumberItem::getText(Evas_Object*, const char* part)
{
	return strcmp(part, "elm.text") == 0 ? translate("IDS_PB_BODY_PHONE_NUMBER_ABB") : std::string();
}

Evas_Object* CtPrimaryInputViewNumberItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.entry") == 0)
		ctCommonInsertUsageLog("0041", nullptr);
	return CtInputViewNumberItem::getContent(genlist, part);
}
