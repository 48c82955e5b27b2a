#include "CtDetailViewEmailItem.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonWidgetUtil.h"

#include <app_control.h>

#include <cstring>

CtDetailViewEmailItem::CtDetailViewEmailItem(CtDetailDataBase* data, contacts_record_h record, bool powerSaving)
	: CtDetailViewGenlistItem(data), m_record(record),
	  m_emailAppEnabled(ctCommoncheckEmailAppEnable())
{
	m_powerSaving = powerSaving;
}

std::string CtDetailViewEmailItem::getCopyText()
{
	const char* email = getData()->getEmail(m_record);
	return email ? email : "";
}

std::string CtDetailViewEmailItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0) {
		int type = getData()->getDataType(m_record, _contacts_email.type);
		return typeLabel(CtCommonGetEmailTypeStr(m_record, type));
	}
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return highlightMain(toMarkup(getCopyText().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewEmailItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.2") == 0) {
		Evas_Object* layout = createIconLayout(genlist, "list/C/detail/icon");
		addIconButton(layout, "elm.icon", "contacts_btn_ic_email.png", "touch.icon", m_powerSaving);
		return layout;
	}
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.main.left.bottom");
	return nullptr;
}

void CtDetailViewEmailItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	if (m_powerSaving)
		elm_object_item_disabled_set(item, EINA_TRUE);
}

void CtDetailViewEmailItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	compose();
}

void CtDetailViewEmailItem::onIconClicked(const char*)
{
	compose();
}

void CtDetailViewEmailItem::compose()
{
	WENTER();
	if (m_powerSaving || !m_emailAppEnabled) {
		WINFO("%s", m_powerSaving ? "power saving mode" : "no email application");
		return;
	}
	std::string uri = "mailto:" + getCopyText();
	app_control_h handle = nullptr;
	int err = app_control_create(&handle);
	WPRET_M(err != APP_CONTROL_ERROR_NONE, "app_control_create() Failed(%d)", err);
	app_control_set_uri(handle, uri.c_str());
	app_control_set_operation(handle, APP_CONTROL_OPERATION_COMPOSE);
	app_control_add_extra_data(handle, RETURN_RESULT_DATA_KEY, "true");
	app_control_set_launch_mode(handle, APP_CONTROL_LAUNCH_MODE_GROUP);
	if (!ContactsAppControlLauncher::getInstance()->sendLaunchRequest(handle))
		WERROR("launch Failed");
	app_control_destroy(handle);
	insertUsageLog("CT0E", nullptr);
}
