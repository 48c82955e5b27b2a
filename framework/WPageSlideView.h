// A view of side-by-side pages in a paging scroller. Each page can hold a
// view, which the page slide view then owns.
#pragma once

#include "WUiTimer.h"
#include "WView.h"

#include <functional>
#include <string>
#include <vector>

namespace app_assist {

class WPageSlideView : public WView {
public:
	WPageSlideView();

	const char* getClassName() override;

	// Adds an empty page at the end; returns its index (-1 before onCreate).
	int appendPage(const char* name = nullptr);
	// Builds `view` on page `index` and shows it there. Returns false, logged,
	// for a bad index, a null view or a page that already has content; a view
	// that could not be placed is destroyed.
	bool setPageContent(int index, WView* view);
	WView* getPageContent(int index) const;
	void showPage(int index, bool animate);
	int getCurrentPage() const;
	int getPageCount() const { return static_cast<int>(m_pages.size()); }
	Evas_Object* getScroller() const { return m_scroller; }
	// Runs on the scroller right after it is made, before any page.
	void setOnInitScroller(std::function<void(Evas_Object* scroller)> onInit);

protected:
	~WPageSlideView() override;
	// Default: the page scroller itself.
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	// Makes the paging scroller under `parent`; subclasses place it.
	Evas_Object* createPageSlideContent(Evas_Object* parent);

private:
	struct Page {
		Evas_Object* obj;
		Evas_Object* spacer;
		std::string name;
		std::weak_ptr<WControl> view;
	};
	static void __scrollerResizeCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __boxResizeCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __dragStartCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __scrollerDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	void __resizePages();
	void __scrollToPage(int index, bool animate);

	Evas_Object* m_scroller = nullptr;
	Evas_Object* m_box = nullptr;
	std::vector<Page> m_pages;
	int m_requestedPage = -1;
	WUiTimerHandle m_reshowIdler;
	std::function<void(Evas_Object*)> m_onInitScroller;
};

} // namespace app_assist
