#include "CtCommonWidgetUtil.h"

#include "AppControlRouter.h"
#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "ui_extension.h"

#include <vconf.h>

#include <cstdlib>
#include <cstring>

namespace {

const char* const kTextDomain = "contacts";
const char* const kIconColorClass = "ct_icon";
const int kLowSizeLimit = 270;

int g_cpuBoostCount = 0;

std::string resolveEdjPath(const char* edj)
{
	if (edj[0] == '/')
		return edj;
	std::string path;
	ContactsCommon::getAppEdjePath(edj, path, true);
	return path;
}

bool endsWithVariant(const std::string& code, char variant)
{
	return code.size() > 1 && code.back() == variant;
}


// The language part of the current UI locale ("ar" of "ar_AE.UTF-8").
std::string currentLanguage()
{
	const char* names[] = {"LANGUAGE", "LC_ALL", "LC_MESSAGES", "LANG"};
	for (const char* name : names) {
		const char* value = getenv(name);
		if (value && *value)
			return std::string(value).substr(0, 2);
	}
	return "en";
}

} // namespace

Evas_Object* ctCommonCreateLayout(Evas_Object* parent, const char* edj, const char* group)
{
	WPRET_VM(!parent || !edj || !*edj || !group, nullptr, "Invalid param : parent, edj or group");
	std::string path = resolveEdjPath(edj);
	WPRET_VM(path.empty(), nullptr, "no edje file %s", edj);
	Evas_Object* layout = elm_layout_add(parent);
	WPRET_VM(!layout, nullptr, "elm_layout_add() is fail");
	if (!elm_layout_file_set(layout, path.c_str(), group)) {
		WERROR("elm_layout_file_set(%s, %s) is fail", path.c_str(), group);
		evas_object_del(layout);
		return nullptr;
	}
	evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(layout, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(layout);
	return layout;
}

Evas_Object* ctCommonCreateImage(Evas_Object* parent, const char* edj, const char* group, const char* colorCode)
{
	WPRET_VM(!parent || !edj || !*edj, nullptr, "Invalid param : parent or edj");
	std::string path = group ? resolveEdjPath(edj) : std::string(edj);
	WPRET_VM(path.empty(), nullptr, "no image file %s", edj);
	Evas_Object* image = elm_image_add(parent);
	WPRET_VM(!image, nullptr, "elm_image_add() is fail");
	// Rows are drawn in the frame they are made in, not a frame later.
	elm_image_preload_disabled_set(image, EINA_TRUE);
	if (!elm_image_file_set(image, path.c_str(), group)) {
		WERROR("elm_image_file_set(%s, %s) is fail", path.c_str(), group ? group : "");
		evas_object_del(image);
		return nullptr;
	}
	if (colorCode && !ctCommonSetImageColor(image, colorCode))
		WWARNING("colour %s not applied", colorCode);
	evas_object_size_hint_weight_set(image, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(image, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(image);
	return image;
}

bool ctCommonSetImageColor(Evas_Object* image, const char* colorCode)
{
	WPRET_VM(!image || !colorCode, false, "Invalid param : image or colorCode");
	int r, g, b, a;
	if (!ctCommonGetThemeColor(colorCode, &r, &g, &b, &a))
		return false;
	Evas_Object* inner = elm_image_object_get(image);
	const char* type = inner ? evas_object_type_get(inner) : nullptr;
	if (type && strcmp(type, "edje") == 0)
		return edje_object_color_class_set(inner, kIconColorClass, r, g, b, a, r, g, b, a, r, g, b, a);
	evas_object_color_set(image, r * a / 255, g * a / 255, b * a / 255, a);
	return true;
}

Evas_Object* ctCommonCreateButton(Evas_Object* parent, const char* style, const char* textId,
		Evas_Smart_Cb clickedCb, void* data)
{
	WPRET_VM(!parent, nullptr, "Invalid param : parent");
	Evas_Object* button = elm_button_add(parent);
	WPRET_VM(!button, nullptr, "elm_button_add() is fail");
	if (style)
		elm_object_style_set(button, style);
	if (textId)
		elm_object_domain_translatable_text_set(button, kTextDomain, textId);
	if (clickedCb)
		evas_object_smart_callback_add(button, "clicked", clickedCb, data);
	evas_object_size_hint_weight_set(button, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(button, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(button);
	return button;
}

Evas_Object* ctCommonCreateDeleteImage(Evas_Object* parent, Evas_Smart_Cb clickedCb, void* data)
{
	Evas_Object* button = ctCommonCreateButton(parent, nullptr, nullptr, clickedCb, data);
	if (button)
		elm_object_text_set(button, "\xE2\x88\x92"); // minus sign
	return button;
}

Evas_Object* ctCommonCreateMaskImageForLowSizeImage(Evas_Object* parent, const char* path)
{
	WPRET_VM(!parent || !path || !*path, nullptr, "Invalid param : parent or path");
	Evas_Object* image = ctCommonCreateImage(parent, path, nullptr);
	if (image) {
		elm_image_aspect_fixed_set(image, EINA_TRUE);
		elm_image_resizable_set(image, EINA_FALSE, EINA_TRUE);
	}
	return image;
}

Evas_Object* ctCommonCreateMaskImageForCallerId(Evas_Object* parent, const char* path, int size)
{
	WPRET_VM(!parent || !path || !*path, nullptr, "Invalid param : parent or path");
	Evas_Object* image = ctCommonCreateImage(parent, path, nullptr);
	if (image) {
		elm_image_fill_outside_set(image, EINA_TRUE);
		elm_image_prescale_set(image, size > 0 ? size : 0);
		if (size > 0)
			evas_object_size_hint_min_set(image, size, size);
	}
	return image;
}

bool ctCommonIsLowSizeImage(Evas_Object* obj, const char* path)
{
	WPRET_VM(!obj || !path || !*path, false, "Invalid param : obj or path");
	Evas_Object* probe = evas_object_image_filled_add(evas_object_evas_get(obj));
	WPRET_VM(!probe, false, "evas_object_image_filled_add() is fail");
	evas_object_image_file_set(probe, path, nullptr);
	int w = 0, h = 0;
	bool loaded = evas_object_image_load_error_get(probe) == EVAS_LOAD_ERROR_NONE;
	if (loaded)
		evas_object_image_size_get(probe, &w, &h);
	evas_object_del(probe);
	WPRET_VM(!loaded, false, "cannot load %s", path);
	int limit = (int)(kLowSizeLimit * ctCommonGetScale());
	return w < limit || h < limit;
}

void ctCommonChecktStateSet(Evas_Object* check, Eina_Bool state, int /*animate*/)
{
	WPRET_M(!check, "Invalid param : check");
	elm_check_state_set(check, state);
}

void ctCommonInvokeDbusCpuBoost()
{
	++g_cpuBoostCount;
}

int ctCommonGetCpuBoostCount()
{
	return g_cpuBoostCount;
}

bool ctCommoncheckEmailAppEnable()
{
	return ct::appcontrol::hasHandler(APP_CONTROL_OPERATION_COMPOSE);
}

bool ctCommoncheckAccountAppEnable()
{
	return ct::appcontrol::hasHandler(CT_ACCOUNT_APP_ID);
}

bool ctCommonLaunchAddAccount()
{
	app_control_h request = nullptr;
	int err = app_control_create(&request);
	if (err != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_create", err);
		return false;
	}
	app_control_set_app_id(request, CT_ACCOUNT_APP_ID);
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	app_control_add_extra_data(request, "mode", "add_account");
	app_control_add_extra_data(request, "capability_filter", ACCOUNT_SUPPORTS_CAPABILITY_CONTACT);
	bool sent = ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request);
	app_control_destroy(request);
	return sent;
}

bool ctCommontGetMapsAppId(std::string& out)
{
	out.clear();
	if (ct::appcontrol::hasHandler(MAPS_APP_ID))
		out = MAPS_APP_ID;
	else if (ct::appcontrol::hasHandler(APP_CONTROL_OPERATION_VIEW) ||
			ct::appcontrol::hasHandler(APP_CONTROL_OPERATION_PICK))
		out = CT_GEO_VIEWER_ID;
	return !out.empty();
}

bool ctCommonCheckNetworkEnable()
{
	int status = 1;
	if (vconf_get_int(CT_NETWORK_STATUS_KEY, &status) != 0)
		return true;
	return status != 0;
}

bool ctCommonCheckHighlightSupported()
{
	static const char* const kShapedScripts[] = {"ar", "fa", "ur", "he", "th", "hi", "bn", "ta", "my", "km"};
	std::string language = currentLanguage();
	for (const char* shaped : kShapedScripts)
		if (language == shaped)
			return false;
	return true;
}

double ctCommonGetScale()
{
	double base = elm_app_base_scale_get();
	if (base <= 0.0)
		base = 1.0;
	return elm_config_scale_get() / base;
}

bool ctCommonGetThemeColor(const char* code, int* r, int* g, int* b, int* a)
{
	WPRET_VM(!code || !r || !g || !b || !a, false, "Invalid param : code or output");
	int cr, cg, cb, ca;
	if (uxt_theme_get_color(code, &cr, &cg, &cb, &ca) == UXT_ERROR_NONE) {
		*r = cr, *g = cg, *b = cb, *a = ca;
		return true;
	}
	std::string text(code);
	bool pressed = endsWithVariant(text, 'P');
	if (!pressed && !endsWithVariant(text, 'D'))
		return false;
	text.pop_back();
	if (uxt_theme_get_color(text.c_str(), &cr, &cg, &cb, &ca) != UXT_ERROR_NONE)
		return false;
	if (pressed) {
		*r = cr * 7 / 10, *g = cg * 7 / 10, *b = cb * 7 / 10, *a = ca;
	} else {
		*r = cr, *g = cg, *b = cb, *a = ca * 4 / 10;
	}
	return true;
}
