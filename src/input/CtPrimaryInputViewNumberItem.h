#ifndef _CT_PRIMARY_INPUT_VIEW_NUMBER_ITEM_H_
#define _CT_PRIMARY_INPUT_VIEW_NUMBER_ITEM_H_

#include "CtInputViewNumberItem.h"

// The number row of the emergency-contact forms: one number field for the
// emergency number record, formatted like the number rows, without type or
// delete button.
class CtPrimaryInputViewNumberItem : public CtInputViewNumberItem {
public:
	// `record` is the contact's emergency number (CtData::getEmergencyNumber).
	CtPrimaryInputViewNumberItem(std::shared_ptr<CtData> data, contacts_record_h record,
			CtInputViewItemCallbacks callbacks, const char* initialText);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected:
	EntryTraits getEntryTraits() const override
	{
		return {"IDS_PB_BODY_PHONE_NUMBER_ABB", false, kMaxChars, ELM_INPUT_PANEL_LAYOUT_PHONENUMBER, true, nullptr, 0};
	}
	bool hasTypes() const override { return false; }
	std::string getText(Evas_Object* genlist, const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;
};

#endif
