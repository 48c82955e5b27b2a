#ifndef _CT_DETAIL_VIEW_EMAIL_ITEM_H_
#define _CT_DETAIL_VIEW_EMAIL_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// An e-mail address with its type and a compose button. Disabled while
// power saving is on; composes nothing when no e-mail application exists.
class CtDetailViewEmailItem : public CtDetailViewGenlistItem {
public:
	// `record` (_contacts_email) is owned by `data`.
	CtDetailViewEmailItem(CtDetailDataBase* data, contacts_record_h record, bool powerSaving);

	contacts_record_h getRecord() const { return m_record; }
	void compose();

public: // CtDetailViewGenlistItem
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_EMAIL; }
	void onSelect(Elm_Object_Item* item) override;
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/2line.bottom"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;
	void onIconClicked(const char* touchPart) override;

private:
	contacts_record_h m_record;
	bool m_emailAppEnabled;
};

#endif
