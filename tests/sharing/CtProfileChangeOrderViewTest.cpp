// The picture-order screen: cells in picture order, Done only after a move,
// Done numbering the pictures 1, 2, 3 in grid order in the edited record only,
// the caller's row and callback, Cancel, and a caller row that died first.
#include "SharingScreenTest.h"

#include "CtMyProfileInputData.h"
#include "CtProfileChangeOrderView.h"

using namespace ct::test;

namespace {

int orderOf(contacts_record_h image)
{
	int order = 0;
	contacts_record_get_int(image, _contacts_image_ex.order, &order);
	return order;
}

std::string pathOf(contacts_record_h image)
{
	char* path = nullptr;
	contacts_record_get_str_p(image, _contacts_image.path, &path);
	return path ? path : "";
}

} // namespace

class CtProfileChangeOrderViewTest : public SharingScreenTest {
protected:
	// Three pictures stored with orders that have gaps: blue 5, red 2, green 4.
	std::shared_ptr<CtData> editedProfile()
	{
		contacts_record_h profile = newProfile("Me");
		m_blue = writePicture("blue.png", 40, 60, 220);
		m_red = writePicture("red.png", 220, 40, 40);
		m_green = writePicture("green.png", 40, 200, 60);
		addProfilePictures(profile, {{m_blue, 5}, {m_red, 2}, {m_green, 4}});
		return std::make_shared<CtMyProfileInputData>(profile);
	}

	CtProfileChangeOrderView* show(std::shared_ptr<CtData> data, Elm_Object_Item* row = nullptr)
	{
		auto* view = new CtProfileChangeOrderView(data, row, [this] { ++m_doneCalls; });
		EXPECT_TRUE(m_screen->push(view));
		m_screen->pumpUntilIdle();
		return view;
	}

	static std::vector<std::string> cellPaths(CtProfileChangeOrderView* view)
	{
		std::vector<std::string> paths;
		for (contacts_record_h image : view->getCellImages())
			paths.push_back(pathOf(image));
		return paths;
	}

	// Drags the first cell behind the last one, as a finger would: press,
	// hold until the grid lets it move, slide, release.
	void dragFirstToLast(CtProfileChangeOrderView* view)
	{
		Evas_Object* grid = view->getGengrid();
		Elm_Object_Item* first = elm_gengrid_first_item_get(grid);
		Elm_Object_Item* last = elm_gengrid_last_item_get(grid);
		Evas_Object* from = elm_object_item_part_content_get(first, "elm.swallow.icon");
		Evas_Object* to = elm_object_item_part_content_get(last, "elm.swallow.icon");
		ASSERT_TRUE(from && to);
		int fx, fy, fw, fh, tx, ty, tw, th;
		evas_object_geometry_get(from, &fx, &fy, &fw, &fh);
		evas_object_geometry_get(to, &tx, &ty, &tw, &th);
		Evas* canvas = evas_object_evas_get(grid);
		unsigned int t = 1000;
		elm_config_longpress_timeout_set(0.2);
		evas_event_feed_mouse_move(canvas, fx + fw / 2, fy + fh / 2, t++, nullptr);
		evas_event_feed_mouse_down(canvas, 1, EVAS_BUTTON_NONE, t++, nullptr);
		m_screen->pumpFor(0.5);
		const int steps = 10;
		for (int i = 1; i <= steps; ++i) {
			int x = fx + fw / 2 + (tx + tw * 3 / 4 - fx - fw / 2) * i / steps;
			int y = fy + fh / 2 + (ty + th / 2 - fy - fh / 2) * i / steps;
			evas_event_feed_mouse_move(canvas, x, y, t++, nullptr);
			m_screen->pumpFrames(2);
		}
		evas_event_feed_mouse_up(canvas, 1, EVAS_BUTTON_NONE, t++, nullptr);
		m_screen->pumpUntilIdle();
	}

	std::string m_blue, m_red, m_green;
	int m_doneCalls = 0;
};

TEST_F(CtProfileChangeOrderViewTest, ShowsPicturesInPictureOrderWithDoneDisabled)
{
	std::shared_ptr<CtData> data = editedProfile();
	CtProfileChangeOrderView* view = show(data);
	EXPECT_EQ("Reorder", ScreenHarness::naviText(view));
	EXPECT_EQ((std::vector<std::string>{m_red, m_green, m_blue}), cellPaths(view));
	ASSERT_NE(nullptr, view->getDoneButton());
	EXPECT_TRUE(ScreenHarness::isDisabled(view->getDoneButton()));
	EXPECT_FALSE(ScreenHarness::click(view->getDoneButton()));
	EXPECT_EQ(1, m_screen->viewCount());
	shot("change-order");
}

TEST_F(CtProfileChangeOrderViewTest, DoneAfterAMoveNumbersPicturesInGridOrderAndCallsBack)
{
	std::shared_ptr<CtData> data = editedProfile();
	CtProfileChangeOrderView* view = show(data);
	dragFirstToLast(view);
	ASSERT_FALSE(ScreenHarness::isDisabled(view->getDoneButton())) << "the grid never reported a move";
	std::vector<contacts_record_h> cells = view->getCellImages();
	ASSERT_EQ(3u, cells.size());
	EXPECT_EQ((std::vector<std::string>{m_green, m_blue, m_red}), cellPaths(view));
	size_t before = usage("CT15").size();
	EXPECT_TRUE(ScreenHarness::click(view->getDoneButton()));
	m_screen->pumpUntilIdle();
	EXPECT_EQ((std::vector<int>{1, 2, 3}), (std::vector<int>{orderOf(cells[0]), orderOf(cells[1]), orderOf(cells[2])}));
	EXPECT_EQ(m_green, data->getImagePath(1));
	EXPECT_EQ(m_red, data->getImagePath(3));
	EXPECT_EQ(3, data->getImageCount());
	EXPECT_EQ(1, m_doneCalls);
	EXPECT_EQ(before + 1, usage("CT15").size());
	EXPECT_EQ(0, m_screen->viewCount());
}

TEST_F(CtProfileChangeOrderViewTest, CancelLeavesTheOrderAsItWas)
{
	std::shared_ptr<CtData> data = editedProfile();
	CtProfileChangeOrderView* view = show(data);
	dragFirstToLast(view);
	EXPECT_TRUE(ScreenHarness::click(m_screen->findButton("Cancel")));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(m_red, data->getImagePath(2));
	EXPECT_EQ(m_green, data->getImagePath(4));
	EXPECT_EQ(m_blue, data->getImagePath(5));
	EXPECT_EQ(0, m_doneCalls);
}

TEST_F(CtProfileChangeOrderViewTest, CallerRowDeletedBeforeDoneIsLeftAlone)
{
	auto* host = new ListHostView();
	ASSERT_TRUE(m_screen->push(host));
	static Elm_Genlist_Item_Class itc = [] {
		Elm_Genlist_Item_Class c = {};
		c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
		c.item_style = "1line";
		return c;
	}();
	Elm_Object_Item* row = elm_genlist_item_append(host->genlist, &itc, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
	std::shared_ptr<CtData> data = editedProfile();
	CtProfileChangeOrderView* view = show(data, row);
	elm_object_item_del(row);
	dragFirstToLast(view);
	EXPECT_TRUE(ScreenHarness::click(view->getDoneButton()));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(m_green, data->getImagePath(1));
	EXPECT_EQ(1, m_screen->viewCount());
}
