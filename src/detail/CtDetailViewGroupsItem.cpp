#include "CtDetailViewGroupsItem.h"

#include <cstring>

CtDetailViewGroupsItem::CtDetailViewGroupsItem(CtDetailDataBase* data) : CtDetailViewGenlistItem(data)
{
}

void CtDetailViewGroupsItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_NONE);
}

std::string CtDetailViewGroupsItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return translate("IDS_PB_BODY_GROUPS");
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return toMarkup(getData()->getGroupNames().c_str());
	return std::string();
}
