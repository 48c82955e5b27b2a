// The tabbed edit's title bar (Cancel, title, Done, tab bar) and the widget
// styles of the light theme, over a screen and in a "theme_bg" popup: where
// they land, and a picture for review.
#include "ResourcePaths.h"
#include "ScreenHarness.h"
#include "WView.h"

#include <gtest/gtest.h>

#include <filesystem>

using namespace ct::test::res;

namespace {

Evas_Object* button(Evas_Object* parent, const char* style, const char* text, const char* icon = nullptr)
{
	Evas_Object* obj = elm_button_add(parent);
	elm_object_style_set(obj, style);
	if (text)
		elm_object_text_set(obj, text);
	if (icon) {
		Evas_Object* image = elm_image_add(obj);
		elm_image_file_set(image, edjePath("image_layout.edj").c_str(), icon);
		elm_object_content_set(obj, image);
	}
	evas_object_show(obj);
	return obj;
}

class TabbedEditView : public app_assist::WView {
public:
	Evas_Object* toolbar = nullptr;
	Evas_Object* done = nullptr;
	Evas_Object* cancel = nullptr;

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		elm_theme_extension_add(nullptr, edjePath("image_layout.edj").c_str());
		Evas_Object* box = elm_box_add(parent);
		elm_box_padding_set(box, 0, 16);
		Evas_Object* row = elm_box_add(box);
		elm_box_horizontal_set(row, EINA_TRUE);
		Evas_Object* check = elm_check_add(row);
		elm_object_style_set(check, "on&off");
		elm_check_state_set(check, EINA_TRUE);
		evas_object_show(check);
		elm_box_pack_end(row, check);
		elm_box_pack_end(row, button(row, "circle", "Phone", "contacts_circle_btn_ic_call.png"));
		elm_box_pack_end(row, button(row, "arrow_btn_with_swallow", nullptr, "core_icon_expand_close.png"));
		elm_box_pack_end(row, button(row, "on_gradient_bg", "Solar"));
		evas_object_show(row);
		elm_box_pack_end(box, row);
		Evas_Object* bottom = button(box, "bottom", "Share");
		evas_object_size_hint_weight_set(bottom, EVAS_HINT_EXPAND, 0);
		evas_object_size_hint_align_set(bottom, EVAS_HINT_FILL, 0.5);
		elm_box_pack_end(box, bottom);
		return box;
	}
	void onPushToNaviframe(Evas_Object* naviframeObj) override
	{
		toolbar = elm_toolbar_add(naviframeObj);
		elm_object_style_set(toolbar, "tabbar_with_title");
		elm_toolbar_shrink_mode_set(toolbar, ELM_TOOLBAR_SHRINK_EXPAND);
		elm_toolbar_select_mode_set(toolbar, ELM_OBJECT_SELECT_MODE_ALWAYS);
		elm_toolbar_transverse_expanded_set(toolbar, EINA_TRUE);
		for (const char* tab : {"Device", "Google", "Exchange"})
			elm_toolbar_item_append(toolbar, nullptr, tab, nullptr, nullptr);
		elm_toolbar_item_selected_set(elm_toolbar_first_item_get(toolbar), EINA_TRUE);
		Elm_Object_Item* item = elm_naviframe_item_push(naviframeObj, "Edit", nullptr, nullptr, getEvasObj(), "tabbar");
		elm_object_item_part_content_set(item, "tabbar", toolbar);
		cancel = button(naviframeObj, "naviframe/title_left", "Cancel");
		done = button(naviframeObj, "naviframe/title_right", "Done");
		elm_object_disabled_set(done, EINA_TRUE);
		elm_object_item_part_content_set(item, "title_left_btn", cancel);
		elm_object_item_part_content_set(item, "title_right_btn", done);
	}
};

struct Box {
	int x, y, w, h;
};

Box boxOf(Evas_Object* obj)
{
	Box b {};
	evas_object_geometry_get(obj, &b.x, &b.y, &b.w, &b.h);
	return b;
}

} // namespace

TEST(WidgetStyleShot, TabbedTitleBarAndThemedPopupLandWhereAPersonLooks)
{
	const std::string light = edjePath("light.edj");
	elm_theme_overlay_add(nullptr, light.c_str());
	{
		ct::test::ScreenHarness screen;
		auto* view = new TabbedEditView();
		ASSERT_TRUE(screen.push(view));
		screen.pumpUntilIdle();

		// Cancel at the left, Done at the right, the tabs under the title, the content under the tabs.
		Box cancel = boxOf(view->cancel), done = boxOf(view->done), tabs = boxOf(view->toolbar),
			content = boxOf(view->getEvasObj());
		EXPECT_TRUE(evas_object_visible_get(view->cancel));
		EXPECT_LT(cancel.x, 40);
		EXPECT_GT(done.x + done.w, 300);
		EXPECT_GE(cancel.w, 60);
		EXPECT_GE(tabs.y, cancel.y + cancel.h);
		EXPECT_GE(tabs.h, 40);
		EXPECT_GE(content.y, tabs.y + tabs.h);
		EXPECT_EQ(tabs.w, boxOf(screen.win()).w);

		std::filesystem::create_directories(outputDir());
		EXPECT_TRUE(screen.savePng(outputDir() + "/widget_styles_screen.png"));

		Evas_Object* popup = elm_popup_add(screen.win());
		elm_object_style_set(popup, "theme_bg");
		elm_object_part_text_set(popup, "title,text", "Share");
		elm_object_text_set(popup, "Choose how to share this contact.");
		Evas_Object* no = button(popup, "popup", "Cancel");
		elm_object_part_content_set(popup, "button1", no);
		elm_object_part_content_set(popup, "button2", button(popup, "popup", "OK"));
		evas_object_show(popup);
		screen.pumpUntilIdle();
		Box sheet = boxOf(popup), cancelButton = boxOf(no);
		EXPECT_GT(cancelButton.w, 100) << "the two buttons share the row";
		EXPECT_GE(cancelButton.h, 40);
		EXPECT_GT(cancelButton.y, sheet.y);

		EXPECT_TRUE(screen.savePng(outputDir() + "/widget_styles_popup.png"));
		evas_object_del(popup);
	}
	elm_theme_overlay_del(nullptr, light.c_str());
}
