#ifndef _CT_EDIT_TAB_VIEW_H_
#define _CT_EDIT_TAB_VIEW_H_

#include "CtView.h"
#include "WPageSlideView.h"
#include "WUiTimer.h"

#include <contacts.h>

#include <string>

class CtInputView;

// The edit form of a person made of several linked contacts: one tab per
// contact (at most ten), each an input-view page, under one title bar with a
// single Done and Cancel. The shown page is built at once, the others a
// second later. Done writes every changed page, or none when a page fails its
// check; leaving with changes asks once for all pages.
class CtEditTabView : public app_assist::WPageSlideView, public CtView {
public:
	static constexpr int kMaxPages = 10;

	// `contactRecords` (contact records, not taken) is copied.
	explicit CtEditTabView(Eina_List* contactRecords);

	// A page asks to disable Done while all its fields are empty.
	void updateSaveBtn(bool disabled);

	int getTabCount() const { return m_pageCount; }
	int getCurrentTab() const { return m_currentPage; }
	// Null for a bad index.
	CtInputView* getPage(int index) const;
	bool isPageBuilt(int index) const;
	Evas_Object* getToolbar() const { return m_toolbar; }
	Elm_Object_Item* getTabItem(int index) const;
	Evas_Object* getDoneButton() const { return m_doneButton; }

public: // app_assist::WView
	const char* getClassName() override { return "CtEditTabView"; }

public: // CtView
	void onLanguageChanged() override;

protected:
	~CtEditTabView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;
	void onPushToNaviframe(Evas_Object* naviframeObj) override;
	void onPushed(Elm_Object_Item* naviItem) override;
	bool onPop() override;

private:
	void __createTitleButtons(Elm_Object_Item* naviItem);
	void __buildPage(int index);
	void __allowFocus(int index, bool allowed);
	void __createRestViews();
	void __tabChanged(Elm_Object_Item* toolbarItem);
	void __onPageScrollStopped();
	void __keepCurrentPage();
	void __onPageScrollStarted();
	void __save();
	void __cancel();
	bool __hasChanges();
	void __showDiscardPopup();
	void __closePopups();
	static std::string __getTabViewTitle(contacts_record_h record);

	static void __tabSelectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __pageScrollStopCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __pageScrollAnimStartCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __pageScrolledCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __pageScrollStartCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __saveCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelCb(void* data, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_toolbar = nullptr;
	Evas_Object* m_doneButton = nullptr;
	Elm_Object_Item* m_tabItems[kMaxPages] = {};
	int m_pageCount = 0;
	int m_currentPage = 0;
	bool m_contentMade[kMaxPages] = {};
	// Owned here until built; the page slide view owns them from then on.
	CtInputView* m_pages[kMaxPages] = {};
	bool m_discarded = false;
	app_assist::WUiTimerHandle m_restTimer;
	app_assist::WUiTimerHandle m_restIdler;
	Eina_List* m_records = nullptr;
	bool m_closing = false;
	bool m_dragged = false;
	bool m_animating = false;
};

#endif
