#ifndef _CT_DETAIL_VIEW_PROFILE_SHARING_ITEM_H_
#define _CT_DETAIL_VIEW_PROFILE_SHARING_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// Whether the user's profile is shared, and as which profile type.
class CtDetailViewProfileSharingItem : public CtDetailViewGenlistItem {
public:
	explicit CtDetailViewProfileSharingItem(CtDetailDataBase* data);

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_PROFILE_SHARING; }

protected:
	const char* getItemStyle() override { return "2line.bottom"; }
	std::string getText(const char* part) override;
};

#endif
