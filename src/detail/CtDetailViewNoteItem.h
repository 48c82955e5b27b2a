#ifndef _CT_DETAILVIEWNOTEITEM_H_
#define _CT_DETAILVIEWNOTEITEM_H_

#include "CtDetailViewGenlistItem.h"

// A note, wrapped over as many lines as it needs.
class CtDetailViewNoteItem : public CtDetailViewGenlistItem {
public:
	// `record` (_contacts_note) is owned by `data`.
	CtDetailViewNoteItem(CtDetailDataBase* data, contacts_record_h record);

	contacts_record_h getRecord() const { return m_record; }

public: // CtDetailViewGenlistItem
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_NOTE; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/multiline_main.sub"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	contacts_record_h m_record;
};

#endif
