#ifndef _CT_DETAIL_VIEW_WEBSITE_ITEM_H_
#define _CT_DETAIL_VIEW_WEBSITE_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// A web address with a button that opens it in the browser.
class CtDetailViewWebsiteItem : public CtDetailViewGenlistItem {
public:
	// `record` (_contacts_url) is owned by `data`.
	CtDetailViewWebsiteItem(CtDetailDataBase* data, contacts_record_h record);

	contacts_record_h getRecord() const { return m_record; }
	// Opens the URL, with "http://" put in front when it has no "http".
	void openUrl();

public: // CtDetailViewGenlistItem
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_WEBSITE; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/2line.bottom"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;
	void onIconClicked(const char* touchPart) override;

private:
	contacts_record_h m_record;
};

#endif
