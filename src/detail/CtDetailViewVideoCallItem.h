#ifndef _CT_DETAIL_VIEW_VIDEO_CALL_ITEM_H_
#define _CT_DETAIL_VIEW_VIDEO_CALL_ITEM_H_

#include "CtDetailViewGenlistItem.h"

class CtDetailViewItemOwner;

// "Video call" with its icon; the owner screen places the call (choosing
// the number when there are several). Disabled while power saving is on.
class CtDetailViewVideoCallItem : public CtDetailViewGenlistItem {
public:
	// `owner` is not owned and must outlive the row.
	CtDetailViewVideoCallItem(CtDetailViewItemOwner* owner, CtDetailDataBase* data, bool powerSaving);

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_VIDEO_CALL; }
	void onSelect(Elm_Object_Item* item) override;
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "1line"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;
	void onIconClicked(const char* touchPart) override;

private:
	CtDetailViewItemOwner* m_owner;
};

#endif
