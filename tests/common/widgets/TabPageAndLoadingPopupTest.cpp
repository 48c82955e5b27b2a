// Pieces the tabbed edit and the sharing screens stand on: a tab page that is
// a page of a page slide view, and a processing popup that only its owner
// can close.
#include "../CommonTestSupport.h"

#include "ContactsCommon.h"
#include "CtLoadingPopup.h"
#include "IContactsTabPageView.h"
#include "ScreenHarness.h"
#include "WPageSlideView.h"

using namespace ct::test;

namespace {

class TabPage : public IContactsTabPageView {
public:
	TabPage(std::vector<std::string>& log, std::string tag) : m_log(log), m_tag(std::move(tag)) {}
	const char* getClassName() override { return "TabPage"; }
	void onTabSelect(Elm_Object_Item* naviItem) override { __note(naviItem ? "select" : "select without item"); }
	void onTabUnselect(Elm_Object_Item*) override { __note("unselect"); }
	void onTabPop() override { __note("pop"); }
	void onTabScrollStart() override {}
	void onTabScrollStop() override {}

protected:
	~TabPage() override { __note("gone"); }
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		Evas_Object* layout = elm_layout_add(parent);
		elm_layout_theme_set(layout, "layout", "application", "default");
		return layout;
	}

private:
	void __note(const char* what) { m_log.push_back(m_tag + ":" + what); }
	std::vector<std::string>& m_log;
	std::string m_tag;
};

class TabbedView : public app_assist::WPageSlideView {
public:
	explicit TabbedView(std::vector<IContactsTabPageView*> pages) : m_pages(std::move(pages)) {}
	void switchTo(int index)
	{
		m_pages[getCurrentPage()]->onTabUnselect(getNaviItem());
		m_pages[index]->onTabSelect(getNaviItem());
		showPage(index, false);
	}

protected:
	void onPushed(Elm_Object_Item*) override
	{
		for (size_t i = 0; i < m_pages.size(); ++i)
			setPageContent(appendPage(), m_pages[i]);
	}
	bool onPop() override
	{
		for (IContactsTabPageView* page : m_pages)
			page->onTabPop();
		return true;
	}

private:
	std::vector<IContactsTabPageView*> m_pages;
};

} // namespace

TEST(TabPageView, PagesHearTheirTabsAndEndWithTheTabbedView)
{
	std::vector<std::string> log;
	{
		ScreenHarness screen;
		auto* tabs = new TabbedView({new TabPage(log, "a"), new TabPage(log, "b")});
		ASSERT_TRUE(screen.push(tabs));
		screen.pumpUntilIdle();
		ASSERT_EQ(tabs->getPageCount(), 2);
		tabs->switchTo(1);
		screen.sendBackKey();
		screen.pumpUntilIdle();
		EXPECT_EQ(screen.viewCount(), 0);
	}
	EXPECT_EQ(log, (std::vector<std::string>{"a:unselect", "b:select", "a:pop", "b:pop", "b:gone", "a:gone"}));
}

TEST(LoadingPopup, ShowsItsTextAndIgnoresBackUntilItsOwnerClosesIt)
{
	std::vector<std::string> log;
	ScreenHarness screen;
	auto* view = new TabPage(log, "v");
	ASSERT_TRUE(screen.push(view));
	auto* popup = new CtLoadingPopup("IDS_PB_BODY_PROCESSING_ING");
	view->attachPopup(popup);
	screen.pumpFrames(3);
	auto alive = popup->getWeakPtr();
	ASSERT_FALSE(alive.expired());
	EXPECT_EQ(screen.findWidgets("Elm_Progressbar").size(), 1u);
	auto labels = screen.findWidgets("Elm_Label");
	ASSERT_EQ(labels.size(), 1u);
	EXPECT_STREQ(elm_object_text_get(labels[0]), ContactsCommon::translate("IDS_PB_BODY_PROCESSING_ING"));

	EXPECT_TRUE(screen.savePng(shotPath("loading_popup")));

	screen.sendBackKey();
	evas_object_smart_callback_call(popup->getEvasObj(), "block,clicked", nullptr);
	screen.pumpFrames(3);
	EXPECT_FALSE(alive.expired());
	EXPECT_EQ(screen.viewCount(), 1) << "the back key reached the view under the popup";

	popup->destroy();
	screen.pumpFrames(3);
	EXPECT_TRUE(alive.expired());
}
