#ifndef _CT_INPUT_VIEW_ADDR_BOOK_ITEM_H_
#define _CT_INPUT_VIEW_ADDR_BOOK_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"

#include <functional>
#include <memory>

// The storage (address book) the contact is saved in: the save-location
// label over the storage's icon (the SIM card's own icon for SIM books).
// A new contact's storage can be changed: selecting the row runs
// `selected`. The row of a stored contact is disabled.
class CtInputViewAddrBookItem : public CtInputViewGenlistItem {
public:
	CtInputViewAddrBookItem(std::shared_ptr<CtData> data, std::function<void()> selected);

	// Shows the storage's icon again after the storage changed.
	void update();
	// The image file of the current storage's icon; empty when it has none.
	std::string getIconFile();

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;
	void onSelect(Elm_Object_Item* item) override;
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	std::string getText(Evas_Object* genlist, const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	std::shared_ptr<CtData> m_data;
	std::function<void()> m_selected;
};

#endif
