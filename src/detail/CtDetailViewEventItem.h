#ifndef _CT_DETAIL_VIEW_EVENT_ITEM_H_
#define _CT_DETAIL_VIEW_EVENT_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// An event (birthday, anniversary, ...) with its date in the region's
// format, without a year when none is stored, marked when it is lunar.
class CtDetailViewEventItem : public CtDetailViewGenlistItem {
public:
	// `record` (_contacts_event) is owned by `data`.
	CtDetailViewEventItem(CtDetailDataBase* data, contacts_record_h record);

	// Whether the stored date is a day of the calendar (logged when not).
	// The detail list shows no row for one that is not: a row without a
	// date tells nothing.
	static bool hasCalendarDate(CtDetailDataBase* data, contacts_record_h record);

	contacts_record_h getRecord() const { return m_record; }

public: // CtDetailViewGenlistItem
	// The shown date.
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_EVENT; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/2line.bottom"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	contacts_record_h m_record;
};

#endif
