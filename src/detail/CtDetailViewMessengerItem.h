#ifndef _CT_DETAILVIEWMESSENGERITEM_H_
#define _CT_DETAILVIEWMESSENGERITEM_H_

#include "CtDetailViewGenlistItem.h"

// A messenger id with its type.
class CtDetailViewMessengerItem : public CtDetailViewGenlistItem {
public:
	// `record` (_contacts_messenger) is owned by `data`.
	CtDetailViewMessengerItem(CtDetailDataBase* data, contacts_record_h record);

	contacts_record_h getRecord() const { return m_record; }

public: // CtDetailViewGenlistItem
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_MESSENGER; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/2line.bottom"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	contacts_record_h m_record;
};

#endif
