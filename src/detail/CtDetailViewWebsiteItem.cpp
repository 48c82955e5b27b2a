#include "CtDetailViewWebsiteItem.h"

#include "ContactsDebug.h"

#include <app_control.h>

#include <cstring>

CtDetailViewWebsiteItem::CtDetailViewWebsiteItem(CtDetailDataBase* data, contacts_record_h record)
	: CtDetailViewGenlistItem(data), m_record(record)
{
}

std::string CtDetailViewWebsiteItem::getCopyText()
{
	const char* url = getData()->getUrl(m_record);
	return url ? url : "";
}

std::string CtDetailViewWebsiteItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return translate("IDS_PB_OPT_WEB_ADDRESS_ABB");
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return highlightMain(toMarkup(getCopyText().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewWebsiteItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.2") == 0) {
		Evas_Object* layout = createIconLayout(genlist, "list/C/detail/icon");
		addIconButton(layout, "elm.icon", "contacts_btn_ic_Internet.png", "touch.icon", false);
		return layout;
	}
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.main.left.bottom");
	return nullptr;
}

void CtDetailViewWebsiteItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	openUrl();
}

void CtDetailViewWebsiteItem::onIconClicked(const char*)
{
	openUrl();
}

void CtDetailViewWebsiteItem::openUrl()
{
	WENTER();
	std::string url = getCopyText();
	WPRET_M(url.empty(), "url is empty");
	if (url.find("http") == std::string::npos)
		url = "http://" + url;
	app_control_h handle = nullptr;
	int err = app_control_create(&handle);
	WPRET_M(err != APP_CONTROL_ERROR_NONE, "app_control_create() Failed(%d)", err);
	app_control_set_operation(handle, APP_CONTROL_OPERATION_VIEW);
	app_control_set_uri(handle, url.c_str());
	app_control_set_launch_mode(handle, APP_CONTROL_LAUNCH_MODE_GROUP);
	err = app_control_send_launch_request(handle, nullptr, nullptr);
	if (err != APP_CONTROL_ERROR_NONE)
		WFAILED("app_control_send_launch_request", err);
	app_control_destroy(handle);
}
