#ifndef _CT_DETAIL_IMAGE_VIEW_H_
#define _CT_DETAIL_IMAGE_VIEW_H_

#include "CtView.h"
#include "WUiTimer.h"
#include "WView.h"

#include <string>
#include <utility>
#include <vector>

class CtDetailDataBase;

// The pictures of a person or of the user's own profile, full screen: the
// default picture, one picture, or a pager over up to five pictures with a
// page indicator labelled with their orders. Closed by its back button or
// the back key.
class CtDetailImageView : public app_assist::WView, public CtView {
public:
	static constexpr int kMaxPictures = 5;

	// The picture paths are read here: `data` is not kept, so the screen below
	// may replace its data while this one is shown. `page` is the pager page
	// to show first (0-based; out of range shows the first).
	CtDetailImageView(CtDetailDataBase* data, bool isMyProfile, int page);

	// The pager and its indicator, null unless two or more pictures are shown.
	Evas_Object* getPager() const { return m_scroller; }
	Evas_Object* getPageIndex() const { return m_index; }
	bool isMyProfile() const { return m_isMyProfile; }

public: // app_assist::WView
	const char* getClassName() override { return "CtDetailImageView"; }

public: // CtView
	void onLanguageChanged() override;

protected:
	~CtDetailImageView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onPushed(Elm_Object_Item* naviItem) override;
	bool onPop() override;
	void onDestroy() override;

private:
	Evas_Object* __createSingle(Evas_Object* parent, const std::string& path);
	Evas_Object* __createPager(Evas_Object* parent);
	Evas_Object* __createPage(Evas_Object* box);
	// Puts the picture into the page unless it has it already.
	void __fillPage(int page);
	bool __fillNextPage();
	Evas_Object* __createPicture(Evas_Object* parent, const std::string& path);
	void __showBackButton();
	void __showPage(int page);
	void __selectIndexOfPage(int page);
	void __setIndicatorStyle(const char* part, const char* style);
	static void __scrollerResizeCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __scrollCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __backClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	bool m_isMyProfile;
	int m_page;
	// Order and path of each picture that is set, in order.
	std::vector<std::pair<int, std::string>> m_pictures;
	Evas_Object* m_content = nullptr;
	Evas_Object* m_scroller = nullptr;
	Evas_Object* m_box = nullptr;
	Evas_Object* m_index = nullptr;
	// Each page and the path of the picture it still lacks (empty once filled).
	std::vector<std::pair<Evas_Object*, std::string>> m_pages;
	app_assist::WUiTimerHandle m_pageFiller;
	Evas_Coord m_pageWidth = 0;
	Evas_Coord m_pageHeight = 0;
};

#endif
