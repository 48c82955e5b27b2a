#include "CtInputViewAddrBookItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonWidgetUtil.h"

#include <vconf.h>

#include <cstring>

namespace {

const char* const kSimIcons[] = { "logs_icon_sim_1_62.png", "logs_icon_sim_2_62.png", "logs_icon_sim_phone_62.png",
	"logs_icon_sim_message_62.png", "logs_icon_sim_data_62.png", "logs_icon_sim_internet_62.png",
	"logs_icon_sim_home_62.png", "logs_icon_sim_office_62.png", "logs_icon_sim_heart_62.png" };
const int kSimIconCount = sizeof(kSimIcons) / sizeof(kSimIcons[0]);

// The icon the person chose for the SIM card of `slot` (0 or 1) in settings.
const char* slotSimIcon(int slot)
{
	int icon = slot;
	if (vconf_get_int(slot == 0 ? VCONFKEY_SETAPPL_SIM1_ICON : VCONFKEY_SETAPPL_SIM2_ICON, &icon) != VCONF_OK
			|| icon < 0 || icon >= kSimIconCount)
		icon = slot;
	return kSimIcons[icon];
}

} // namespace

CtInputViewAddrBookItem::CtInputViewAddrBookItem(std::shared_ptr<CtData> data, std::function<void()> selected)
	: m_data(std::move(data)), m_selected(std::move(selected))
{
}

Elm_Genlist_Item_Class* CtInputViewAddrBookItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("linked.1text.8icon");
	return itc;
}

void CtInputViewAddrBookItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	if (m_data && m_data->getContactId() > 0)
		elm_object_item_disabled_set(item, EINA_TRUE);
}

void CtInputViewAddrBookItem::update()
{
	if (Elm_Object_Item* item = getElmObjectItem())
		elm_genlist_item_fields_update(item, "elm.icon.1", ELM_GENLIST_ITEM_FIELD_CONTENT);
}

std::string CtInputViewAddrBookItem::getIconFile()
{
	WPRET_VM(!m_data, std::string(), "data is NULL");
	const char* provider = m_data->getAddressbookName();
	if (provider && !strcmp(provider, CONTACTS_SIM1_PROVIDER_NAME))
		return ContactsCommon::getAppImagePath(slotSimIcon(0), false);
	if (provider && !strcmp(provider, CONTACTS_SIM2_PROVIDER_NAME))
		return ContactsCommon::getAppImagePath(slotSimIcon(1), false);
	return ctCommonGetAccountIconPathByAddressbookId(m_data->getAddressbookId());
}

std::string CtInputViewAddrBookItem::getText(Evas_Object*, const char* part)
{
	if (strcmp(part, "elm.text") == 0)
		return translate("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB");
	return std::string();
}

Evas_Object* CtInputViewAddrBookItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.1") != 0)
		return nullptr;
	std::string file = getIconFile();
	if (file.empty())
		return nullptr;
	Evas_Object* icon = ctCommonCreateImage(genlist, file.c_str(), nullptr);
	if (icon)
		elm_image_aspect_fixed_set(icon, EINA_TRUE);
	return icon;
}

void CtInputViewAddrBookItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_selected)
		m_selected();
}
