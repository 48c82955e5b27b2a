#ifndef _CT_COMMON_WIDGET_UTIL_H_
#define _CT_COMMON_WIDGET_UTIL_H_

#include <Elementary.h>

#include "ContactsAppIds.h"
#include "CtCommonTextUtil.h"

#include <string>

// Widget helpers shared by the contacts screens. All run on the main loop;
// every object returned belongs to its parent (deleted with it).

// A layout of `group` from `edj`, which is either a resource name such as
// "contacts/detail_layout.edj" or a full path. Null (and a log line) for a
// null parent, a missing file or an unknown group.
Evas_Object* ctCommonCreateLayout(Evas_Object* parent, const char* edj, const char* group);

// An image showing `group` of the edje file `edj` (resource name or path),
// or the plain image file `edj` when `group` is null. With a colour code
// ("A03O004", "A03O004P", "A03O004D", ...) the image's "ct_icon" colour class
// takes the theme colour of that code; a code unknown to the theme that ends
// in "P" (pressed) or "D" (disabled) is derived from its base code: darker,
// or faded. Null for bad input.
Evas_Object* ctCommonCreateImage(Evas_Object* parent, const char* edj, const char* group,
		const char* colorCode = nullptr);

// Recolours an image of ctCommonCreateImage with `colorCode`: the "ct_icon"
// colour class of an edje image, else the whole image is tinted.
// Returns false for bad input or an unknown code.
bool ctCommonSetImageColor(Evas_Object* image, const char* colorCode);

// A button of `style` (default style for null) labelled with the translation
// id `textId`, calling `clickedCb(data)` on "clicked". Null for a null parent.
Evas_Object* ctCommonCreateButton(Evas_Object* parent, const char* style, const char* textId,
		Evas_Smart_Cb clickedCb, void* data);

// The round minus button of the edit forms' delete slot, calling
// `clickedCb(data)` on "clicked".
Evas_Object* ctCommonCreateDeleteImage(Evas_Object* parent, Evas_Smart_Cb clickedCb, void* data);

// A picture too small for the detail picture area, kept at its aspect and
// never enlarged past its own size. Null for a null parent or empty path.
Evas_Object* ctCommonCreateMaskImageForLowSizeImage(Evas_Object* parent, const char* path);

// The caller-id picture: the image at `path` filling a `size` square
// (cropped to it, at its aspect). Null for a null parent or empty path.
Evas_Object* ctCommonCreateMaskImageForCallerId(Evas_Object* parent, const char* path, int size);

// Whether the picture at `path` is smaller than the detail picture area
// (native width or height below 270 × the scale, see ctCommonGetScale).
// `obj` is any object on the canvas that loads it. False for bad input.
bool ctCommonIsLowSizeImage(Evas_Object* obj, const char* path);

// Sets a check's state without emitting "changed" (`animate` is ignored:
// the headless toolkit has no check animation).
void ctCommonChecktStateSet(Evas_Object* check, Eina_Bool state, int animate);

// Asks the platform for a short CPU boost while a list is touched. Counted
// for diagnostics (ctCommonGetCpuBoostCount) since nothing boosts here.
void ctCommonInvokeDbusCpuBoost();
int ctCommonGetCpuBoostCount();

// The account application (adds accounts from the storage question); the
// availability check and the launch both use this id.
#define CT_ACCOUNT_APP_ID ACCOUNT_SETTINGS_APP_ID
// Returned by ctCommontGetMapsAppId for a generic viewer of "geo:" URIs
// (reached by operation, without an application id).
#define CT_GEO_VIEWER_ID "org.velmora.geo-viewer"

// Whether an e-mail composer is installed: a handler of the operation
// APP_CONTROL_OPERATION_COMPOSE (e-mail is composed by operation).
bool ctCommoncheckEmailAppEnable();
// Whether the account application CT_ACCOUNT_APP_ID can be started.
bool ctCommoncheckAccountAppEnable();
// Starts CT_ACCOUNT_APP_ID to add an account that stores contacts ("mode"
// "add_account", "capability_filter" ACCOUNT_SUPPORTS_CAPABILITY_CONTACT).
// True when the request was sent.
bool ctCommonLaunchAddAccount();

// The maps application to use: MAPS_APP_ID when installed, else
// CT_GEO_VIEWER_ID when a handler of APP_CONTROL_OPERATION_VIEW or
// APP_CONTROL_OPERATION_PICK is installed, else empty.
// Returns whether `out` is non-empty.
bool ctCommontGetMapsAppId(std::string& out);

// Whether a data network is connected: the vconf int
// CT_NETWORK_STATUS_KEY, connected unless it is set to 0.
bool ctCommonCheckNetworkEnable();
#define CT_NETWORK_STATUS_KEY "memory/network/status"

// Whether search matches may be highlighted in the current language
// (scripts that shape letters across a match are left plain).
bool ctCommonCheckHighlightSupported();

// elm_config_scale_get() / elm_app_base_scale_get() (1.0 when the base is unset).
double ctCommonGetScale();

// The colour of a theme colour code, with the "P"/"D" derivation above.
// Returns false (colour untouched) for an unknown code.
bool ctCommonGetThemeColor(const char* code, int* r, int* g, int* b, int* a);

#endif
