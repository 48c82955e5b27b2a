#include "CtDetailViewStatusItem.h"

#include <cstring>

CtDetailViewStatusItem::CtDetailViewStatusItem(CtDetailDataBase* data) : CtDetailViewGenlistItem(data)
{
}

void CtDetailViewStatusItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_NONE);
}

std::string CtDetailViewStatusItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return translate("IDS_PB_MBODY_STATUS");
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return toMarkup(getData()->getStatus());
	return std::string();
}
