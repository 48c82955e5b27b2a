#include "CtDetailViewAddressItem.h"

#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"
#include "CtDetailViewItemOwner.h"

#include <cstring>

namespace {

const int kAddressBytes = 1024;

} // namespace

CtDetailViewAddressItem::CtDetailViewAddressItem(CtDetailViewItemOwner* owner, CtDetailDataBase* data,
		contacts_record_h record, bool powerSaving)
	: CtDetailViewGenlistItem(data), m_owner(owner), m_record(record)
{
	m_powerSaving = powerSaving;
}

std::string CtDetailViewAddressItem::getCopyText()
{
	char buf[kAddressBytes] = {0};
	getData()->getAddress(m_record, buf, sizeof(buf));
	return buf;
}

std::string CtDetailViewAddressItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.main") == 0) {
		int type = getData()->getDataType(m_record, _contacts_address.type);
		return typeLabel(CtCommonGetAddressTypeStr(m_record, type));
	}
	if (strcmp(part, "elm.text.multiline") == 0)
		return highlightMain(toMarkup(getCopyText().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewAddressItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.right") == 0) {
		Evas_Object* layout = createIconLayout(genlist, "list/C/detail/icon");
		addIconButton(layout, "elm.icon", "contacts_btn_ic_map.png", "touch.icon", m_powerSaving);
		return layout;
	}
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.multiline");
	return nullptr;
}

void CtDetailViewAddressItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	if (m_powerSaving)
		elm_object_item_disabled_set(item, EINA_TRUE);
}

void CtDetailViewAddressItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	onIconClicked(nullptr);
}

void CtDetailViewAddressItem::onIconClicked(const char*)
{
	if (m_powerSaving) {
		WINFO("power saving mode");
		return;
	}
	WPRET_M(!m_owner, "owner is nullptr");
	m_owner->onAddressSelected(m_record);
}
