#include "CtInputViewMultiImageItem.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

#include <ui_extension.h>
#include <vconf.h>

#include <cstring>
#include <string>

namespace {

const char* const kPowerSavingKey = "db/setting/psmode";

Evas_Object* pictureOrPlaceholder(Evas_Object* parent, const char* path)
{
	if (!path || !*path)
		return nullptr;
	Evas_Object* image = elm_image_add(parent);
	elm_image_file_set(image, path, nullptr);
	elm_image_aspect_fixed_set(image, EINA_TRUE);
	elm_image_fill_outside_set(image, EINA_TRUE);
	return image;
}

} // namespace

CtInputViewMultiImageItem::CtInputViewMultiImageItem(std::shared_ptr<CtData> data,
		std::function<void(int order)> pictureClicked, std::function<void()> reorderClicked, bool large)
	: m_data(std::move(data)), m_pictureClicked(std::move(pictureClicked)),
	  m_reorderClicked(std::move(reorderClicked)), m_large(large)
{
	for (int order = 0; order <= kMaxPictures; ++order)
		m_slots[order] = {this, order};
}

CtInputViewMultiImageItem::~CtInputViewMultiImageItem() = default;

Elm_Genlist_Item_Class* CtInputViewMultiImageItem::getItemClassNew()
{
	return createItemClass(m_large ? "input.multi.image.z1" : "input.multi.image");
}

bool CtInputViewMultiImageItem::isPowerSaving() const
{
	int mode = 0;
	return vconf_get_int(kPowerSavingKey, &mode) == 0 && mode != 0;
}

bool CtInputViewMultiImageItem::tapsAllowed() const
{
	const char* name = m_data->getAddressbookName();
	bool sharing = name && strcmp(name, translate("IDS_PB_MBODY_PROFILE_SHARING")) == 0;
	return !isPowerSaving() && !sharing;
}

int CtInputViewMultiImageItem::getPictureCount() const
{
	int count = m_data->getImageCount();
	return count < 0 ? 0 : count > kMaxPictures ? kMaxPictures : count;
}

// After the pictures an empty place takes the next one, until there are five.
int CtInputViewMultiImageItem::getPlaceCount() const
{
	int count = getPictureCount();
	return count > 0 && count < kMaxPictures ? count + 1 : count;
}

void CtInputViewMultiImageItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	int count = getPictureCount();
	if (count > 0)
		elm_object_item_signal_emit(item, ("show," + std::to_string(getPlaceCount()) + "icon").c_str(), "");
	elm_object_item_signal_emit(item, count > 0 ? "show,bg" : "hide,bg", "");
	elm_object_item_signal_emit(item, isPowerSaving() ? "button,disable" : "button,enable", "");
}

Evas_Object* CtInputViewMultiImageItem::getContent(Evas_Object* genlist, const char* part)
{
	int count = getPictureCount();
	if (strcmp(part, "elm.icon.default") == 0)
		return count > 0 ? __createMainPicture(genlist) : nullptr;
	if (strcmp(part, "elm.icon.add") == 0)
		return count == 0 ? __createInvitation(genlist) : nullptr;
	if (strcmp(part, "elm.button") == 0)
		return count > 1 ? __createReorderButton(genlist) : nullptr;
	for (int order = 1; order <= getPlaceCount(); ++order)
		if (strcmp(part, ("elm.icon." + std::to_string(order)).c_str()) == 0)
			return __createPlace(genlist, order);
	return nullptr;
}

Evas_Object* CtInputViewMultiImageItem::__createMainPicture(Evas_Object* genlist)
{
	Evas_Object* layout = ctCommonCreateLayout(genlist, "contacts/detail_layout.edj", "layout/default_image");
	WPRET_VM(!layout, nullptr, "layout is NULL");
	const char* path = m_data->getImagePath(1);
	bool low = path && ctCommonIsLowSizeImage(genlist, path);
	Evas_Object* area = ctCommonCreateLayout(layout, "contacts/detail_layout.edj",
			low ? "layout/detail/contact_image/low_resolution" : "layout/detail/contact_image");
	Evas_Object* image = low ? ctCommonCreateMaskImageForLowSizeImage(area, path) : pictureOrPlaceholder(area, path);
	if (area && image)
		elm_object_part_content_set(area, "elm.swallow.content", image);
	elm_object_part_content_set(layout, "elm.swallow.content", area);
	Evas_Object* button = uxt_button_add(layout, "transparent");
	evas_object_smart_callback_add(button, "clicked", __pictureClickedCb, &m_slots[1]);
	elm_object_part_content_set(layout, "elm.icon", button);
	return layout;
}

Evas_Object* CtInputViewMultiImageItem::__createInvitation(Evas_Object* genlist)
{
	bool saving = isPowerSaving();
	Evas_Object* layout = ctCommonCreateLayout(genlist, "contacts/contacts.edj",
			saving ? "layout/myprofile/add_photo/ups" : "layout/myprofile/add_photo/default");
	WPRET_VM(!layout, nullptr, "layout is NULL");
	Evas_Object* button = uxt_button_add(layout, "btn_with_swallow");
	elm_object_content_set(button, ctCommonCreateImage(button, "contacts/image_layout.edj",
			"contacts_caller_id_default_02.png"));
	evas_object_smart_callback_add(button, "clicked", __pictureClickedCb, &m_slots[1]);
	elm_object_disabled_set(button, saving ? EINA_TRUE : EINA_FALSE);
	elm_object_part_content_set(layout, "myprofile_add_photo", button);
	elm_object_domain_translatable_part_text_set(layout, "elm.text", "contacts",
			"IDS_PB_NPBODY_ADD_PICTURES_TO_EXPRESS_YOURSELF");
	return layout;
}

Evas_Object* CtInputViewMultiImageItem::__createPlace(Evas_Object* genlist, int order)
{
	Evas_Object* layout = ctCommonCreateLayout(genlist, "contacts/contacts.edj", "layout/myprofile/photo");
	WPRET_VM(!layout, nullptr, "layout is NULL");
	Evas_Object* image = pictureOrPlaceholder(layout, m_data->getImagePath(order));
	if (!image)
		image = ctCommonCreateImage(layout, "contacts/image_layout.edj", "contacts_caller_id_default_02.png");
	if (image)
		elm_object_part_content_set(layout, "elm.swallow.content", image);
	if (order > 1) {
		Evas_Object* button = uxt_button_add(layout, "transparent");
		evas_object_smart_callback_add(button, "clicked", __pictureClickedCb, &m_slots[order]);
		elm_object_part_content_set(layout, "elm.icon", button);
	}
	return layout;
}

Evas_Object* CtInputViewMultiImageItem::__createReorderButton(Evas_Object* genlist)
{
	Evas_Object* button = uxt_button_add(genlist, "on_gradient_bg");
	elm_object_domain_translatable_text_set(button, "contacts", "IDS_PB_ACBUTTON_REORDER");
	elm_object_disabled_set(button, isPowerSaving() ? EINA_TRUE : EINA_FALSE);
	evas_object_smart_callback_add(button, "clicked", __reorderButtonClickedCb, this);
	return button;
}

void CtInputViewMultiImageItem::tapPicture(int order)
{
	if (order < 1 || order > kMaxPictures || !tapsAllowed())
		return;
	if (m_pictureClicked)
		m_pictureClicked(order);
}

void CtInputViewMultiImageItem::__pictureClickedCb(void* data, Evas_Object*, void*)
{
	auto* slot = static_cast<Slot*>(data);
	slot->row->tapPicture(slot->order);
}

void CtInputViewMultiImageItem::__reorderButtonClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<CtInputViewMultiImageItem*>(data);
	if (self->m_reorderClicked && !self->isPowerSaving())
		self->m_reorderClicked();
}
