#include "ScreenHarness.h"
#include "TestViews.h"

#include "WGengridItem.h"
#include "WPageSlideView.h"
#include "WUgClient.h"

#include <gtest/gtest.h>

#include <algorithm>

using namespace ct::test;

namespace {

class Cell : public app_assist::WGengridItem {
public:
	explicit Cell(int* live) : m_live(live) {}
	Elm_Gengrid_Item_Class* getItemClassNew() override
	{
		Elm_Gengrid_Item_Class* itc = elm_gengrid_item_class_new();
		itc->item_style = "default";
		return itc;
	}

private:
	LiveCount m_live;
};

template <class Row>
Row* append(Evas_Object* genlist, Row* row)
{
	row->setElmObjectItem(elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr, ELM_GENLIST_ITEM_NONE,
		row->getSelectCb(), nullptr));
	return row;
}

} // namespace

using GenlistItem = ViewTest;

TEST_F(GenlistItem, RowsAreReadSelectedAndDeletedWithTheirItemsAndTheirView)
{
	int live = 0, selections = 0;
	RecordingView* view = pushView();
	Evas_Object* genlist = elm_genlist_add(view->layout);
	for (int i = 0; i < 5; ++i)
		append(genlist, new CountingRow(i, &live, &selections));
	auto rows = ScreenHarness::rowsOf<CountingRow>(genlist);
	ASSERT_EQ(rows.size(), 5u);
	Elm_Object_Item* third = rows[2]->getElmObjectItem();
	EXPECT_EQ(ScreenHarness::itemStyle(third) + "/" + ScreenHarness::itemText(third, "elm.text"), "default/Row 2");
	ScreenHarness::selectItem(third);
	EXPECT_EQ(selections, 1);
	EXPECT_FALSE(elm_genlist_item_selected_get(third));
	elm_object_item_del(third);
	EXPECT_EQ(live, 4);

	// Rows whose item class deletes them directly are not touched again.
	int selfLive = 0;
	for (auto deleter : {CountingRow::kClassCallback, CountingRow::kPlainDelete})
		append(genlist, new CountingRow(0, &selfLive, &selections, deleter));
	EXPECT_EQ(selfLive, 2);
	elm_genlist_clear(genlist);
	EXPECT_EQ(std::make_pair(0, 0), std::make_pair(selfLive, live));

	auto* again = append(genlist, new CountingRow(9, &live, &selections));
	again->attachToView(view);
	EXPECT_EQ(again->getAttachedView(), view);
	view->popOut();
	screen.pumpUntilIdle();
	EXPECT_EQ(live, 0);
}

TEST(GengridItem, CellsOwnTheirNewItemClassAndDieWithTheGrid)
{
	int live = 0;
	ScreenHarness screen;
	Evas_Object* grid = elm_gengrid_add(screen.win());
	for (int i = 0; i < 3; ++i) {
		auto* cell = new Cell(&live);
		cell->setElmObjectItem(elm_gengrid_item_append(grid, cell->getItemClass(), cell, cell->getSelectCb(), nullptr));
	}
	EXPECT_EQ(live, 3);
	evas_object_del(grid);
	EXPECT_EQ(live, 0);
}

using PageSlideView = ViewTest;

TEST_F(PageSlideView, PagesHoldViewsThatDieWithIt)
{
	auto* slide = new app_assist::WPageSlideView();
	Evas_Object* initScroller = nullptr;
	slide->setOnInitScroller([&](Evas_Object* scroller) { initScroller = scroller; });
	ASSERT_TRUE(screen.push(slide));
	EXPECT_EQ(initScroller, slide->getScroller());
	EXPECT_EQ((std::vector<int>{0, 1}), (std::vector<int>{slide->appendPage("one"), slide->appendPage("two")}));
	EXPECT_EQ(slide->getPageCount(), 2);

	auto* first = new RecordingView(log, "p0");
	auto* second = new RecordingView(log, "p1");
	EXPECT_TRUE(slide->setPageContent(0, first));
	EXPECT_TRUE(slide->setPageContent(1, second));
	EXPECT_STREQ(second->getName(), "two");
	EXPECT_EQ(second->getWindow(), &screen.window());
	EXPECT_EQ(slide->getPageContent(1), second);
	EXPECT_FALSE(slide->setPageContent(5, new RecordingView(log, "bad")));
	EXPECT_EQ(log.back(), "bad:destructor");

	slide->showPage(1, false);
	screen.pumpUntilIdle();
	EXPECT_EQ(slide->getCurrentPage(), 1) << "asked for before the pages were laid out";
	slide->showPage(7, true); // logged, ignored

	second->popOut(); // a page leaves with its slide view
	screen.pumpUntilIdle();
	EXPECT_EQ(screen.viewCount(), 0);
	EXPECT_EQ(std::count(log.begin(), log.end(), "p0:destructor"), 1);
	EXPECT_EQ(std::count(log.begin(), log.end(), "p1:destructor"), 1);
}

TEST(UgClient, DestroyRunsTheEndCallbackOnce)
{
	int ended = 0;
	auto* client = new app_assist::WUgClient([&] { ++ended; });
	client->destroy();
	EXPECT_EQ(ended, 1);
}
