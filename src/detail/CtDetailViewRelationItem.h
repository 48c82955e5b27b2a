#ifndef _CT_DETAILVIEWRELATIONITEM_H_
#define _CT_DETAILVIEWRELATIONITEM_H_

#include "CtDetailViewGenlistItem.h"

// A related person's name with the relationship type.
class CtDetailViewRelationItem : public CtDetailViewGenlistItem {
public:
	// `record` (_contacts_relationship) is owned by `data`.
	CtDetailViewRelationItem(CtDetailDataBase* data, contacts_record_h record);

	contacts_record_h getRecord() const { return m_record; }

public: // CtDetailViewGenlistItem
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_RELATION; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/2line.bottom"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	contacts_record_h m_record;
};

#endif
