#include "CtInputViewGroupsItem.h"

#include "CtCommonTextUtil.h"

#include <algorithm>
#include <cstring>

CtInputViewGroupsItem::CtInputViewGroupsItem(std::shared_ptr<CtData> data, std::function<void()> selected)
	: m_data(std::move(data)), m_selected(std::move(selected))
{
	m_data->getAllGroupsId(m_groupIds);
	std::sort(m_groupIds.begin(), m_groupIds.end());
	updateChangedState(m_groupIds.empty() ? nullptr : "groups");
	setIsChanged(false);
}

Elm_Genlist_Item_Class* CtInputViewGroupsItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("2line.bottom");
	return itc;
}

void CtInputViewGroupsItem::updateGroups()
{
	std::vector<int> ids;
	m_data->getAllGroupsId(ids);
	std::sort(ids.begin(), ids.end());
	if (ids != m_groupIds)
		setIsChanged(true);
	m_groupIds = ids;
	m_data->updateGroupsName();
	if (Elm_Object_Item* item = getElmObjectItem())
		elm_genlist_item_fields_update(item, "elm.text.main.left.bottom", ELM_GENLIST_ITEM_FIELD_TEXT);
}

std::string CtInputViewGroupsItem::getText(Evas_Object*, const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return translate("IDS_PB_BODY_GROUPS");
	if (strcmp(part, "elm.text.main.left.bottom") == 0) {
		std::string names = m_data->getGroupsName();
		return names.empty() ? translate("IDS_PB_BODY_NOT_ASSIGNED") : ctCommonUtf8ToMarkup(names.c_str());
	}
	return std::string();
}

void CtInputViewGroupsItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_selected)
		m_selected();
}
