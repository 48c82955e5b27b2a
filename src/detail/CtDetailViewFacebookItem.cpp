#include "CtDetailViewFacebookItem.h"

#include "ContactsAppIds.h"
#include "ContactsDebug.h"

#include <contacts.h>
#include <glib.h>

#include <cstring>

namespace {

// Base64 text -> its bytes as a string; empty for invalid input.
std::string decodeBase64(const std::string& text)
{
	gsize length = 0;
	guchar* bytes = g_base64_decode(text.c_str(), &length);
	std::string result = bytes ? std::string((const char*)bytes, length) : std::string();
	g_free(bytes);
	return result;
}

// Adds each "key:value" pair of `extraData` (Base64 parts, "," between pairs).
void addExtraPairs(app_control_h handle, const std::string& extraData)
{
	gchar** pairs = g_strsplit(extraData.c_str(), ",", -1);
	for (gchar** pair = pairs; pair && *pair; ++pair) {
		const char* colon = strchr(*pair, ':');
		if (!colon) {
			WDEBUG("extra pair without ':' skipped");
			continue;
		}
		std::string key = decodeBase64(std::string(*pair, colon - *pair));
		std::string value = decodeBase64(colon + 1);
		if (!key.empty())
			app_control_add_extra_data(handle, key.c_str(), value.c_str());
	}
	g_strfreev(pairs);
}

} // namespace

CtDetailViewFacebookItem::CtDetailViewFacebookItem(CtDetailDataBase* data) : CtDetailViewGenlistItem(data)
{
}

std::string CtDetailViewFacebookItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.main.left") == 0)
		return translate("IDS_PB_MBODY_VIEW_FACEBOOK_PROFILE");
	return std::string();
}

Evas_Object* CtDetailViewFacebookItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.2") != 0)
		return nullptr;
	Evas_Object* layout = createIconLayout(genlist, "list/C/detail/icon/facebook");
	if (layout)
		elm_layout_signal_callback_add(layout, "mouse,clicked,*", "touch.icon", __iconClickedCb, this);
	return layout;
}

void CtDetailViewFacebookItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	openProfile();
}

void CtDetailViewFacebookItem::onIconClicked(const char*)
{
	openProfile();
}

namespace {

std::string readText(contacts_record_h record, unsigned int property)
{
	char* text = nullptr;
	if (contacts_record_get_str_p(record, property, &text) != CONTACTS_ERROR_NONE || !text)
		return "";
	return text;
}

} // namespace

bool CtDetailViewFacebookItem::readFirstProfile(SocialProfile& profile)
{
	Eina_List* contacts = getData() ? getData()->getContactsList() : nullptr;
	WPRET_VM(!contacts, false, "list is nullptr");
	auto contact = static_cast<contacts_record_h>(eina_list_data_get(contacts));
	contacts_record_h record = nullptr;
	int err = contacts_record_get_child_record_at_p(contact, _contacts_contact.profile, 0, &record);
	if (err != CONTACTS_ERROR_NONE || !record) {
		WDEBUG("no social profile record");
		return false;
	}
	profile.appId = readText(record, _contacts_profile.app_id);
	profile.operation = readText(record, _contacts_profile.service_operation);
	profile.uri = readText(record, _contacts_profile.uri);
	profile.extraData = readText(record, _contacts_profile.extra_data);
	return true;
}

void CtDetailViewFacebookItem::openProfile()
{
	WENTER();
	SocialProfile profile;
	WPRET_M(!readFirstProfile(profile), "no profile");
	app_control_h handle = createLaunchRequest(profile);
	WPRET_M(!handle, "createLaunchRequest() is fail");
	int err = app_control_send_launch_request(handle, nullptr, nullptr);
	if (err != APP_CONTROL_ERROR_NONE)
		WFAILED("app_control_send_launch_request", err);
	app_control_destroy(handle);
}

app_control_h CtDetailViewFacebookItem::createLaunchRequest(const SocialProfile& profile)
{
	app_control_h handle = nullptr;
	int err = app_control_create(&handle);
	if (err != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_create", err);
		return nullptr;
	}
	if (profile.appId == FACEBOOK_APP_ID) {
		app_control_set_app_id(handle, profile.appId.c_str());
		if (!profile.operation.empty())
			app_control_set_operation(handle, profile.operation.c_str());
		if (!profile.uri.empty())
			app_control_set_uri(handle, profile.uri.c_str());
		addExtraPairs(handle, profile.extraData);
	} else {
		app_control_set_operation(handle, APP_CONTROL_OPERATION_VIEW);
		app_control_set_app_id(handle, FACEBOOK_APP_ID);
		app_control_add_extra_data(handle, "fb.appcontrol.launch.type", "launch_url");
		app_control_add_extra_data(handle, "fb.appcontrol.launch.info", profile.uri.c_str());
	}
	return handle;
}

void CtDetailViewFacebookItem::__iconClickedCb(void* data, Evas_Object*, const char*, const char* source)
{
	WHIT();
	static_cast<CtDetailViewFacebookItem*>(data)->onIconClicked(source);
}
