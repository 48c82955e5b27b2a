#ifndef _CT_DETAILVIEWSTATUSITEM_H_
#define _CT_DETAILVIEWSTATUSITEM_H_

#include "CtDetailViewGenlistItem.h"

// The person's (or profile's) status text. Cannot be selected.
class CtDetailViewStatusItem : public CtDetailViewGenlistItem {
public:
	explicit CtDetailViewStatusItem(CtDetailDataBase* data);

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_STATUS; }
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "2line.bottom"; }
	std::string getText(const char* part) override;
};

#endif
