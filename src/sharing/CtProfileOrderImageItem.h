#ifndef _CT_PROFILE_ORDER_IMAGE_ITEM_H_
#define _CT_PROFILE_ORDER_IMAGE_ITEM_H_

#include "WGengridItem.h"

#include <contacts.h>

#include <string>

// A cell of the picture-order grid: one picture of the edited profile. The
// image record belongs to the edited record.
class CtProfileOrderImageItem : public app_assist::WGengridItem {
public:
	CtProfileOrderImageItem(contacts_record_h image, const char* path);

	contacts_record_h getImage() const { return m_image; }
	const std::string& getPath() const { return m_path; }

public: // WGenItem
	Elm_Gen_Item_Class* getItemClassNew() override;

private:
	static Evas_Object* __contentGetCb(void* data, Evas_Object* obj, const char* part);

	contacts_record_h m_image;
	std::string m_path;
};

#endif
