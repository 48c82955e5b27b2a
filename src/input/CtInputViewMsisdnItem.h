#ifndef _CT_INPUT_VIEW_MSISDN_ITEM_H_
#define _CT_INPUT_VIEW_MSISDN_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"

#include <memory>

// The profile's own number (read-only): its type above the number.
class CtInputViewMsisdnItem : public CtInputViewGenlistItem {
public:
	CtInputViewMsisdnItem(std::shared_ptr<CtData> data, contacts_record_h record);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected:
	std::string getText(Evas_Object* genlist, const char* part) override;

private:
	std::shared_ptr<CtData> m_data;
	contacts_record_h m_record;
};

#endif
