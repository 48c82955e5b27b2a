#ifndef _CT_DETAIL_VIEW_RINGTONE_ITEM_H_
#define _CT_DETAIL_VIEW_RINGTONE_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// The person's ringtone by its file's display name. Cannot be selected.
class CtDetailViewRingtoneItem : public CtDetailViewGenlistItem {
public:
	explicit CtDetailViewRingtoneItem(CtDetailDataBase* data);

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_RINGTONE; }
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "2line.bottom"; }
	std::string getText(const char* part) override;
};

#endif
