#include "CtDetailViewVideoCallItem.h"

#include "ContactsDebug.h"
#include "CtDetailViewItemOwner.h"

#include <cstring>

CtDetailViewVideoCallItem::CtDetailViewVideoCallItem(CtDetailViewItemOwner* owner, CtDetailDataBase* data,
		bool powerSaving)
	: CtDetailViewGenlistItem(data), m_owner(owner)
{
	m_powerSaving = powerSaving;
}

std::string CtDetailViewVideoCallItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.main.left") == 0)
		return translate("IDS_PB_OPT_VIDEO_CALL");
	return std::string();
}

Evas_Object* CtDetailViewVideoCallItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.2") != 0)
		return nullptr;
	Evas_Object* layout = createIconLayout(genlist, "list/C/detail/icon");
	addIconButton(layout, "elm.icon", "contacts_btn_ic_video_call.png", "touch.icon", m_powerSaving);
	return layout;
}

void CtDetailViewVideoCallItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	if (m_powerSaving)
		elm_object_item_disabled_set(item, EINA_TRUE);
}

void CtDetailViewVideoCallItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	onIconClicked(nullptr);
}

void CtDetailViewVideoCallItem::onIconClicked(const char*)
{
	if (m_powerSaving) {
		WINFO("power saving mode");
		return;
	}
	WPRET_M(!m_owner, "owner is nullptr");
	m_owner->onVideoCallSelected();
}
