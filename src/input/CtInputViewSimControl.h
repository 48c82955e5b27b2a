#ifndef _CT_INPUT_VIEW_SIM_CONTROL_H_
#define _CT_INPUT_VIEW_SIM_CONTROL_H_

#include "CtData.h"
#include "WControl.h"
#include "WGenlistItem.h"

#include <memory>
#include <vector>

class CtInputView;
class CtInputViewAddrBookItem;
class CtInputViewGenlistItem;
class CtInputViewSimNameItem;

// The edit form of a contact stored on a SIM card: one name, one number and,
// while the card takes e-mails, one e-mail, each measured the way the card
// stores it and refused when it does not fit; a live count of what is left
// under each field; and the storage row, through which a new contact moves
// to another card or to the phone.
class CtInputViewSimControl : public app_assist::WControl {
public:
	// `view` owns this control and outlives it.
	CtInputViewSimControl(std::shared_ptr<CtData> data, CtInputView* view);

	// Every field row is empty.
	bool getIsEmpty();
	// A loaded row was changed, or a row added since the list was built holds text.
	bool getIsChanged();
	// Before a SIM write: the name entry's text becomes the first name, the
	// other name parts are cleared.
	void updateNameRecordForSim();
	void focusForRename();
	// Disables (true) or enables the view's Done button.
	void updateNumberSaveBtn(bool disabled);
	// The form edits an emergency contact's primary number (launch types 112, 126).
	bool getUgRequestIsForPrimaryOrNot();

	// The storage row (null before the list is made); the view refreshes it
	// when SIM cards change.
	CtInputViewAddrBookItem* getAddrBookItem() const { return m_addrBookItem; }
	void updateAddrBookItem();

	// WControl
	const char* getClassName() override { return "CtInputViewSimControl"; }

protected:
	~CtInputViewSimControl() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;

private:
	void __addSimAllItems();
	bool __hasEmailRoom();
	bool __needsEmailItem();
	Elm_Object_Item* __appendRow(app_assist::WGenlistItem* row, Elm_Object_Item* after = nullptr);
	// `stored`: the row shows the stored e-mail (made with the list).
	void __insertEmailItem(bool stored);
	void __removeEmailItem();
	// The field rows, from the first row up to the storage row.
	std::vector<CtInputViewGenlistItem*> __fieldRows() const;
	void __updateSaveBtn();
	void __onAddrbookItemSelectedCb();
	void __onStorageChosen(int addressbookId);
	void __moveToOtherCard(int addressbookId);
	void __askChangeLocation(int addressbookId);
	void __switchToStorage(int addressbookId);
	static void __createKeypadTimerCb(void* data);

	std::shared_ptr<CtData> m_data;
	CtInputView* m_view;
	Evas_Object* m_genlist = nullptr;
	Elm_Object_Item* m_firstItem = nullptr;
	Elm_Object_Item* m_numberItem = nullptr;
	Elm_Object_Item* m_emailItem = nullptr;
	Elm_Object_Item* m_addrBookElmItem = nullptr;
	CtInputViewSimNameItem* m_nameItem = nullptr;
	CtInputViewAddrBookItem* m_addrBookItem = nullptr;
	int m_builtRowCount = 0;
};

#endif
