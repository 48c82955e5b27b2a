#ifndef _CT_DETAIL_VIEW_LINK_ITEM_H_
#define _CT_DETAIL_VIEW_LINK_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// "Linked contacts" with the account icon of each linked contact: seven,
// then the eighth or, when there are more, the "more" icon. Cannot be selected.
class CtDetailViewLinkItem : public CtDetailViewGenlistItem {
public:
	explicit CtDetailViewLinkItem(CtDetailDataBase* data);

	static constexpr int kIconSlots = 8;

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_LINK; }
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "linked.1text.8icon"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	Evas_Object* __createAccountIcon(Evas_Object* parent, int index);
};

#endif
