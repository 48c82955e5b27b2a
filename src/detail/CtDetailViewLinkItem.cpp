#include "CtDetailViewLinkItem.h"

#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonWidgetUtil.h"

#include <cstdio>
#include <cstring>

namespace {

const char* const kLinkedTint = "A03O004L1";

// The slot number of "elm.icon.N" (1 to 8), 0 for other parts.
int slotOf(const char* part)
{
	int slot = 0;
	char rest = 0;
	if (sscanf(part, "elm.icon.%d%c", &slot, &rest) != 1)
		return 0;
	return slot >= 1 && slot <= CtDetailViewLinkItem::kIconSlots ? slot : 0;
}

} // namespace

CtDetailViewLinkItem::CtDetailViewLinkItem(CtDetailDataBase* data) : CtDetailViewGenlistItem(data)
{
}

void CtDetailViewLinkItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_NONE);
}

std::string CtDetailViewLinkItem::getText(const char* part)
{
	if (strcmp(part, "elm.text") == 0)
		return translate("IDS_PB_HEADER_LINKED_CONTACTS_ABB");
	return std::string();
}

Evas_Object* CtDetailViewLinkItem::getContent(Evas_Object* genlist, const char* part)
{
	int slot = slotOf(part);
	if (slot == 0)
		return nullptr;
	int count = (int)eina_list_count(getData()->getContactsList());
	if (slot == kIconSlots && count > kIconSlots)
		return ctCommonCreateImage(genlist, "contacts/image_layout.edj", "contacts_ic_linked.png", kLinkedTint);
	if (slot > count)
		return nullptr;
	return __createAccountIcon(genlist, slot - 1);
}

Evas_Object* CtDetailViewLinkItem::__createAccountIcon(Evas_Object* parent, int index)
{
	auto* contact = static_cast<contacts_record_h>(eina_list_nth(getData()->getContactsList(), index));
	WPRET_VM(!contact, nullptr, "contact %d is nullptr", index);
	int addressbookId = 0;
	int err = contacts_record_get_int(contact, _contacts_contact.address_book_id, &addressbookId);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_get_int", err);
		return nullptr;
	}
	std::string path = ctCommonGetAccountIconPathByAddressbookId(addressbookId);
	if (path.empty())
		return nullptr;
	Evas_Object* icon = ctCommonCreateImage(parent, path.c_str(), nullptr);
	if (!icon)
		return nullptr;
	elm_image_aspect_fixed_set(icon, EINA_TRUE);
	if (addressbookId == 0)
		ctCommonSetImageColor(icon, kLinkedTint);
	return icon;
}
