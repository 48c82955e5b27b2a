#ifndef _CT_DETAIL_VIEW_NUMBER_ITEM_H_
#define _CT_DETAIL_VIEW_NUMBER_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// A phone number: its type and number, the call-block mark, and call and
// message buttons. Selecting the row calls.
class CtDetailViewNumberItem : public CtDetailViewGenlistItem {
public:
	// `record` (a _contacts_number record) is owned by `data`.
	CtDetailViewNumberItem(CtDetailDataBase* data, contacts_record_h record, bool isBlocked, bool isSimContact);

	contacts_record_h getRecord() const { return m_record; }
	bool isBlocked() const { return m_isBlocked; }
	// The screen refreshes "elm.icon.left.bottom" after changing this.
	void setBlocked(bool blocked)
	{
		m_isBlocked = blocked;
		invalidateContent();
	}

	void call();
	void sendMessage();

public: // CtDetailViewGenlistItem
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_NUMBER; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override { return "detail/2line.bottom"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;
	void onIconClicked(const char* touchPart) override;

private:
	std::string __getNumber() const;

	contacts_record_h m_record;
	bool m_isBlocked;
	bool m_isSimContact;
	bool m_iconTapped = false;
	double m_iconTapTime = 0.0;
};

#endif
