#include "CtInputViewCallerIdPicture.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

#include <vconf.h>

#include <cstdlib>

namespace {

const char* const kDefaultImageKey = "db/deco-contact-image-editor/contact_default_image_path";

Evas_Object* createDefaultImage(Evas_Object* parent)
{
	Evas_Object* image = nullptr;
	char* custom = vconf_get_str(kDefaultImageKey);
	if (custom && *custom)
		image = ctCommonCreateImage(parent, custom, nullptr);
	free(custom);
	return image ? image : ctCommonCreateImage(parent, "contacts/image_layout.edj", "contacts_caller_id_default_05.png");
}

} // namespace

Evas_Object* CtInputViewCallerIdPicture::create(Evas_Object* parent, const char* imagePath, bool touchable,
		Edje_Signal_Cb clickedCb, void* data)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/contacts.edj", "layout/basicInfo/callerId");
	WPRET_VM(!layout, nullptr, "layout is NULL");
	Evas_Object* image = imagePath && *imagePath ? ctCommonCreateMaskImageForCallerId(layout, imagePath, kSize)
												 : createDefaultImage(layout);
	if (image)
		elm_object_part_content_set(layout, "elm.swallow.content", image);
	elm_object_signal_emit(layout, touchable ? "enable" : "disable", "touch_area");
	if (touchable && clickedCb)
		elm_object_signal_callback_add(layout, "mouse,clicked,*", "touch_area", clickedCb, data);
	return layout;
}
