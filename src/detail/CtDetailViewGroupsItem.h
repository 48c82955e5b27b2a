#ifndef _CT_DETAILVIEWGROUPSITEM_H_
#define _CT_DETAILVIEWGROUPSITEM_H_

#include "CtDetailViewGenlistItem.h"

// The names of the groups the person belongs to. Cannot be selected.
class CtDetailViewGroupsItem : public CtDetailViewGenlistItem {
public:
	explicit CtDetailViewGroupsItem(CtDetailDataBase* data);

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_GROUPS; }
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "2line.bottom"; }
	std::string getText(const char* part) override;
};

#endif
