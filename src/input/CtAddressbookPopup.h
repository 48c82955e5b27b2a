#ifndef _CT_ADDRESSBOOK_POPUP_H_
#define _CT_ADDRESSBOOK_POPUP_H_

#include "CtSimListener.h"
#include "WPopup.h"

#include <functional>

// The storages a new contact can be saved in: the device, each switched-on
// SIM card (in slot order, with its name and icon) and the accounts that
// accept contacts. Choosing one reports its address book id and leaves the
// popup open; the list follows SIM cards switched on or off while open.
class CtAddressbookPopup : public app_assist::WPopup, public CtSimListener {
public:
	CtAddressbookPopup(int inputType, int selectedId);

	void setOnResultCb(std::function<void(int addressbookId)> onResult);
	int getSelectedId() const { return m_selectedId; }
	Evas_Object* getGenlist() const { return m_genlist; }

	// WControl
	const char* getClassName() override;
	// CtSimListener
	void onSimChanged() override;

protected:
	~CtAddressbookPopup() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;

private:
	struct Row;
	Evas_Object* __createContent(Evas_Object* parent);
	void __updateGenlist();
	void __addPopupItems();
	void __appendRow(Row* row, bool twoLines);
	void __fitHeight();
	void __onRowSelected(Row* row, Elm_Object_Item* item);
	static char* __textGetCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __contentGetCb(void* data, Evas_Object* obj, const char* part);
	static void __rowDelCb(void* data, Evas_Object* obj);
	static void __itemSelectedCb(void* data, Evas_Object* obj, void* eventInfo);

	int m_selectedId;
	bool m_isSim1Powered = false;
	bool m_isSim2Powered = false;
	std::function<void(int)> m_onResult;
	Evas_Object* m_genlist = nullptr;
	int m_inputType;
};

#endif
