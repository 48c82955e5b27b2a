#ifndef _CT_DETAIL_VIEW_ADDRESS_ITEM_H_
#define _CT_DETAIL_VIEW_ADDRESS_ITEM_H_

#include "CtDetailViewGenlistItem.h"

class CtDetailViewItemOwner;

// A postal address, wrapped, with a map button; the owner screen opens the
// map. Disabled while power saving is on.
class CtDetailViewAddressItem : public CtDetailViewGenlistItem {
public:
	// `record` (_contacts_address) is owned by `data`; `owner` must outlive the row.
	CtDetailViewAddressItem(CtDetailViewItemOwner* owner, CtDetailDataBase* data, contacts_record_h record,
			bool powerSaving);

	contacts_record_h getRecord() const { return m_record; }

public: // CtDetailViewGenlistItem
	// The full address.
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_ADDRESS; }
	void onSelect(Elm_Object_Item* item) override;
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/multiline_main.sub.1icon.2"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;
	void onIconClicked(const char* touchPart) override;

private:
	CtDetailViewItemOwner* m_owner;
	contacts_record_h m_record;
};

#endif
