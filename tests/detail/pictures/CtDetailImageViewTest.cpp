// The full-screen picture view, headless: the default picture, one picture
// without a pager, pages labelled with the pictures' orders, the page shown
// first, broken picture files, closing, and the detail screen's picture row
// opening it.
#include "PictureScreenTest.h"

#include "ContactsDetails.h"
#include "CtDetailData.h"
#include "CtDetailImageView.h"
#include "CtDetailView.h"
#include "CtDetailViewGenlistItem.h"
#include "CtMyProfileDetailData.h"

#include <vconf.h>

using namespace ct::test;

namespace {

std::vector<std::string> indexLabels(Evas_Object* index)
{
	std::vector<std::string> labels;
	for (int i = 0; Elm_Object_Item* item = elm_index_item_find(index, reinterpret_cast<void*>(intptr_t(i + 1))); ++i)
		labels.push_back(elm_index_item_letter_get(item));
	return labels;
}

std::string selectedLabel(Evas_Object* index)
{
	Elm_Object_Item* item = elm_index_selected_item_get(index, 0);
	return item ? elm_index_item_letter_get(item) : "<none>";
}

int currentPage(Evas_Object* pager)
{
	int page = -1;
	elm_scroller_current_page_get(pager, &page, nullptr);
	return page;
}

// Files of the shown Elm_Image widgets, top-most first.
std::vector<std::string> shownFiles(ScreenHarness& screen)
{
	std::vector<std::string> files;
	for (Evas_Object* image : screen.findWidgets("Elm_Image")) {
		const char* file = nullptr;
		elm_image_file_get(image, &file, nullptr);
		if (file && evas_object_visible_get(image))
			files.push_back(file);
	}
	return files;
}

} // namespace

class CtDetailImageViewTest : public PictureScreenTest {
protected:
	CtDetailImageView* showProfile(const std::vector<std::pair<std::string, int>>& pictures, int page)
	{
		if (!pictures.empty()) {
			contacts_record_h profile = newProfile("Me");
			addProfilePictures(profile, pictures);
			storeProfile(profile);
		}
		m_data = std::make_unique<CtMyProfileDetailData>();
		auto* view = new CtDetailImageView(m_data.get(), true, page);
		EXPECT_TRUE(m_screen->push(view));
		m_screen->pumpUntilIdle();
		return view;
	}

	std::unique_ptr<CtMyProfileDetailData> m_data;
};

TEST_F(CtDetailImageViewTest, ProfileWithoutPicturesShowsTheSettingsDefaultPictureElseTheThemes)
{
	std::string custom = writePicture("custom-default.png", 200, 80, 40);
	struct Case {
		const char* setting;
		bool expectCustom;
	};
	const Case cases[] = {{custom.c_str(), true}, {"", false}, {"/no/such/default.png", false}};
	for (const Case& c : cases) {
		vconf_set_str("db/deco-contact-image-editor/contact_default_image_path", c.setting);
		CtDetailImageView* view = showProfile({}, 0);
		EXPECT_EQ(nullptr, view->getPager());
		std::vector<std::string> files = shownFiles(*m_screen);
		ASSERT_EQ(1u, files.size()) << c.setting;
		EXPECT_EQ(c.expectCustom, files[0] == custom) << files[0];
		EXPECT_EQ(!c.expectCustom, files[0].find("image_layout.edj") != std::string::npos) << files[0];
		m_screen->sendBackKey();
		m_screen->pumpUntilIdle();
	}
	vconf_set_str("db/deco-contact-image-editor/contact_default_image_path", "");
}

TEST_F(CtDetailImageViewTest, OnePictureOrOnlyOneThatLoadsShowsItAloneWithoutPager)
{
	std::string good = writePicture("good.png", 20, 120, 200);
	std::string text = writeText("notes.png");
	const std::vector<std::pair<std::string, int>> cases[] = {
		{{good, 1}},
		{{good, 1}, {m_dir.file("gone.png"), 2}, {text, 3}},
		{{text, 1}, {good, 2}},
	};
	for (const auto& pictures : cases) {
		CtDetailImageView* view = showProfile(pictures, 0);
		EXPECT_EQ(nullptr, view->getPager());
		EXPECT_EQ(nullptr, view->getPageIndex());
		EXPECT_EQ(std::vector<std::string>{good}, shownFiles(*m_screen)) << pictures.size();
		m_screen->sendBackKey();
		m_screen->pumpUntilIdle();
		contacts_db_delete_record(_contacts_my_profile._uri, m_data->getPersonId());
	}
}

TEST_F(CtDetailImageViewTest, PagesAreLabelledWithTheOrdersOfThePicturesTheyShow)
{
	CtDetailImageView* view = showProfile({{writePicture("1.png", 200, 0, 0), 1}, {writePicture("2.png", 0, 200, 0), 2},
		{writePicture("4.png", 0, 0, 200), 4}}, 0);
	ASSERT_NE(nullptr, view->getPager());
	EXPECT_EQ((std::vector<std::string>{"1", "2", "4"}), indexLabels(view->getPageIndex()));
	EXPECT_EQ(0, currentPage(view->getPager()));
	EXPECT_EQ("1", selectedLabel(view->getPageIndex()));

	// The third page shows the picture of order 4: its item is selected.
	elm_scroller_page_show(view->getPager(), 2, 0);
	m_screen->pumpUntilIdle();
	EXPECT_EQ("4", selectedLabel(view->getPageIndex()));
}

TEST_F(CtDetailImageViewTest, OpeningAtAPageShowsThatPageAndSelectsItsItem)
{
	struct Case {
		int page;
		int shown;
		const char* selected;
	};
	const Case cases[] = {{2, 2, "3"}, {1, 1, "2"}, {7, 0, "1"}, {-1, 0, "1"}};
	std::vector<std::pair<std::string, int>> pictures = {{writePicture("a.png", 250, 200, 0), 1},
		{writePicture("b.png", 0, 160, 160), 2}, {writePicture("c.png", 120, 0, 160), 3}};
	contacts_record_h profile = newProfile("Me");
	addProfilePictures(profile, pictures);
	storeProfile(profile);
	for (const Case& c : cases) {
		CtDetailImageView* view = showProfile({}, c.page);
		ASSERT_NE(nullptr, view->getPager());
		EXPECT_EQ(c.shown, currentPage(view->getPager())) << c.page;
		EXPECT_EQ(c.selected, selectedLabel(view->getPageIndex())) << c.page;
		if (c.page == 2) {
			EXPECT_TRUE(m_screen->savePng(shotPath("detail-image-view-pages")));
		}
		m_screen->sendBackKey();
		m_screen->pumpUntilIdle();
	}
}

TEST_F(CtDetailImageViewTest, BackButtonAndBackKeyCloseTheView)
{
	showProfile({}, 0);
	ASSERT_EQ(1, m_screen->viewCount());
	std::vector<Evas_Object*> buttons = m_screen->findWidgets("Elm_Button");
	ASSERT_FALSE(buttons.empty());
	EXPECT_TRUE(ScreenHarness::click(buttons.front()));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));

	showProfile({}, 0);
	m_screen->sendBackKey();
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
}

TEST_F(CtDetailImageViewTest, TappingTheDetailPictureRowOpensThePictureViewAtTheShownPage)
{
	contacts_record_h contact = newContact(0, "Pia");
	addImage(contact, writePicture("pia-1.png", 200, 100, 0).c_str(), 1);
	addImage(contact, writePicture("pia-2.png", 0, 100, 200).c_str(), 2);
	int personId = personOf(store(contact));
	auto* detail = static_cast<CtDetailView*>(createCtDetailView(personId, nullptr));
	ASSERT_TRUE(m_screen->push(detail));
	ASSERT_TRUE(m_screen->pumpUntil([detail] { return !detail->isBuildingRows(); }));
	auto rows = ScreenHarness::rowsWhere<CtDetailViewGenlistItem>(detail->getGenlist(),
		[](CtDetailViewGenlistItem* row) { return row->getItemType() == DETAIL_ITEM_MULTI_IMAGE; });
	ASSERT_EQ(1u, rows.size());
	ScreenHarness::selectItem(rows[0]->getElmObjectItem());
	ASSERT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 2; }));
	auto* pictures = dynamic_cast<CtDetailImageView*>(m_screen->topView());
	ASSERT_NE(nullptr, pictures);
	EXPECT_FALSE(pictures->isMyProfile());
	m_screen->pumpUntilIdle();
	ASSERT_NE(nullptr, pictures->getPager());
	EXPECT_EQ((std::vector<std::string>{"1", "2"}), indexLabels(pictures->getPageIndex()));

	// The detail data is replaced while the picture view is open: nothing it shows depends on it.
	contacts_db_delete_record(_contacts_person._uri, personId);
	m_screen->pumpFor(0.3);
	m_screen->sendBackKey();
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() <= 1; }));
}
