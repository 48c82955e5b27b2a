#ifndef _I_CONTACTS_TAB_PAGE_VIEW_H_
#define _I_CONTACTS_TAB_PAGE_VIEW_H_

#include "WView.h"

// A view that can also be one page of a tabbed view (the tabs share one
// title bar): the tabbed view tells its pages when their tab is chosen or
// left, and when the whole tabbed view is about to pop.
class IContactsTabPageView : public app_assist::WView {
public:
	IContactsTabPageView() = default;
	explicit IContactsTabPageView(const char* name) : app_assist::WView(name) {}

	// The page's tab became the shown one; `naviItem` is the tabbed view's.
	virtual void onTabSelect(Elm_Object_Item* naviItem) = 0;
	// Another tab is about to be shown.
	virtual void onTabUnselect(Elm_Object_Item* naviItem) = 0;
	// The tabbed view is popping (its onPop runs).
	virtual void onTabPop() = 0;
	// The tab pages are being dragged, and came to rest.
	virtual void onTabScrollStart() = 0;
	virtual void onTabScrollStop() = 0;

protected:
	~IContactsTabPageView() override = default;
};

#endif
