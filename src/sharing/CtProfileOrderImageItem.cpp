#include "CtProfileOrderImageItem.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

#include <cstring>

CtProfileOrderImageItem::CtProfileOrderImageItem(contacts_record_h image, const char* path)
	: m_image(image), m_path(path ? path : "")
{
}

Elm_Gen_Item_Class* CtProfileOrderImageItem::getItemClassNew()
{
	Elm_Gengrid_Item_Class* itc = elm_gengrid_item_class_new();
	WPRET_VM(!itc, nullptr, "elm_gengrid_item_class_new() is fail");
	itc->item_style = "default";
	itc->func.content_get = __contentGetCb;
	return itc;
}

Evas_Object* CtProfileOrderImageItem::__contentGetCb(void* data, Evas_Object* obj, const char* part)
{
	auto* cell = static_cast<CtProfileOrderImageItem*>(data);
	if (!part || strcmp(part, "elm.swallow.icon") != 0)
		return nullptr;
	Evas_Object* layout = ctCommonCreateLayout(obj, "contacts/detail_layout.edj", "layout/reorder/item");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* image = ctCommonCreateImage(layout, cell->m_path.c_str(), nullptr);
	if (!image) {
		WERROR("ctCommonCreateImage() is fail");
		return layout;
	}
	elm_image_aspect_fixed_set(image, EINA_TRUE);
	elm_image_preload_disabled_set(image, EINA_TRUE);
	elm_image_fill_outside_set(image, EINA_TRUE);
	elm_object_part_content_set(layout, "elm.swallow.content", image);
	return layout;
}
