#ifndef _CT_INPUT_VIEW_IMPORTANT_SUB_ITEM_H_
#define _CT_INPUT_VIEW_IMPORTANT_SUB_ITEM_H_

#include "CtInputViewGenlistItem.h"

// One entry of the add-field popup, numbered from 1 in the popup's order.
// The contact form and the my-profile form list different fields.
class CtInputViewImportantSubItem : public CtInputViewGenlistItem {
public:
	enum class Mode { Contact, MyProfile };

	CtInputViewImportantSubItem(int entry, Mode mode);

	int getEntry() const { return m_entry; }
	// The translation id of the entry; null for an entry the mode does not have.
	static const char* getTextId(int entry, Mode mode);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected:
	std::string getText(Evas_Object* genlist, const char* part) override;

private:
	int m_entry;
	Mode m_mode;
};

#endif
