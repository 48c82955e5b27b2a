#ifndef _CT_DETAIL_VIEW_PROFILE_MULTI_IMAGE_ITEM_H_
#define _CT_DETAIL_VIEW_PROFILE_MULTI_IMAGE_ITEM_H_

#include "CtDetailViewMultiImageItem.h"

// The picture row of the user's own profile.
class CtDetailViewProfileMultiImageItem : public CtDetailViewMultiImageItem {
public:
	CtDetailViewProfileMultiImageItem(CtDetailViewItemOwner* owner, CtDetailDataBase* data, bool isLowSize);

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_PROFILE_MULTI_IMAGE; }
};

#endif
