#include "CtDetailViewUtil.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonTextUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtDetailViewGenlistItem.h"
#include "CtThemeMgr.h"

#include <app_control.h>
#include <csc_feature.h>
#include <glib.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

constexpr const char* kEdjFiles[] = {"contacts/contacts.edj", "contacts/detail_layout.edj"};
constexpr int kMaxAddressBytes = 1024;
// The toolkit composes title texts in fixed buffers and aborts on very long
// ones; no one reads past the first few lines of a title anyway.
constexpr glong kTitleMostCharacters = 256;

std::string titleMarkup(const char* text)
{
	if (!text || !*text)
		return "";
	gchar* valid = g_utf8_make_valid(text, -1);
	gchar* shortened = g_utf8_substring(valid, 0, std::min(g_utf8_strlen(valid, -1), kTitleMostCharacters));
	std::string markup = ctCommonUtf8ToMarkup(shortened);
	g_free(shortened);
	g_free(valid);
	return markup;
}

void appendNonEmpty(std::string& joined, const char* part)
{
	if (!part || !*part)
		return;
	if (!joined.empty())
		joined += ",";
	joined += part;
}

} // namespace

void ctDetailAddExtensionThemes()
{
	for (const char* edj : kEdjFiles) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
}

void ctDetailUpdateTitle(Elm_Object_Item* naviItem, CtDetailDataBase* data)
{
	WPRET_M(!naviItem || !data, "naviItem or data is nullptr");
	std::string title = titleMarkup(data->getDisplayName());
	if (title.empty())
		title = ContactsCommon::translate("IDS_LOGS_MBODY_UNKNOWN");
	elm_object_item_part_text_set(naviItem, "elm.text.title", title.c_str());

	std::string subtitle;
	appendNonEmpty(subtitle, data->getExtraName1Second());
	appendNonEmpty(subtitle, data->getExtraName1First());
	appendNonEmpty(subtitle, data->getCompany());
	elm_object_item_part_text_set(naviItem, "subtitle", subtitle.empty() ? nullptr : titleMarkup(subtitle.c_str()).c_str());
}

bool ctDetailHasCompactRows(CtDetailDataBase* data)
{
	return eina_list_count(data->getAddressList()) <= 1 && eina_list_count(data->getNoteList()) <= 1;
}

bool ctDetailIsLowSizePicture(CtDetailDataBase* data, Evas_Object* obj)
{
	char* first = data->getImagePath(1);
	char* second = data->getImagePath(2);
	bool lowSize = first && *first && !(second && *second) && ctCommonIsLowSizeImage(obj, first);
	free(first);
	free(second);
	return lowSize;
}

const char* ctDetailPowerSavingIconPart(int itemType)
{
	switch (itemType) {
	case DETAIL_ITEM_VIDEO_CALL:
	case DETAIL_ITEM_EMAIL:
		return "elm.icon.2";
	case DETAIL_ITEM_ADDRESS:
		return "elm.icon.right";
	default:
		return nullptr;
	}
}

void ctDetailApplyPowerSaving(Evas_Object* genlist, bool on)
{
	WPRET_M(!genlist, "__genlist is nullptr");
	for (Elm_Object_Item* item = elm_genlist_first_item_get(genlist); item; item = elm_genlist_item_next_get(item)) {
		CtDetailViewGenlistItem* row = ctDetailRowOf(item);
		const char* part = row ? ctDetailPowerSavingIconPart(row->getItemType()) : nullptr;
		if (!part)
			continue;
		row->setPowerSaving(on);
		elm_object_item_disabled_set(item, on ? EINA_TRUE : EINA_FALSE);
		elm_genlist_item_fields_update(item, part, ELM_GENLIST_ITEM_FIELD_CONTENT);
	}
}

CtDetailViewGenlistItem* ctDetailRowOf(Elm_Object_Item* item)
{
	auto* base = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
	return dynamic_cast<CtDetailViewGenlistItem*>(base);
}

void ctDetailOpenAddressInMaps(CtDetailDataBase* data, contacts_record_h address)
{
	WPRET_M(!data || !address, "data or address is nullptr");
	if (csc_feature_get_bool(CSC_FEATURE_CONTACTS_HIDE_ADDRESS_ROW))
		return;
	std::string mapsAppId;
	ctCommontGetMapsAppId(mapsAppId);
	WPRET_M(mapsAppId.empty(), "mapsAppId is empty");
	char text[kMaxAddressBytes] = {0};
	data->getAddress(address, text, sizeof(text));
	std::string markup = ctCommonUtf8ToMarkup(text);

	app_control_h request = nullptr;
	int err = app_control_create(&request);
	WPRET_M(err != APP_CONTROL_ERROR_NONE, "app_control_create() Failed(%d)", err);
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	if (mapsAppId == MAPS_APP_ID) {
		app_control_set_app_id(request, MAPS_APP_ID);
		app_control_add_extra_data(request, "searchByName", markup.c_str());
	} else {
		std::string encoded;
		ctCommontEncodeAddress(markup.c_str(), encoded);
		char uri[kMaxAddressBytes] = {0};
		snprintf(uri, sizeof(uri), "geo:0,0?q=\"%s\"", encoded.c_str());
		app_control_set_operation(request, APP_CONTROL_OPERATION_VIEW);
		app_control_set_uri(request, uri);
	}
	if (!ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request))
		WERROR("launch Failed");
	app_control_destroy(request);
}
