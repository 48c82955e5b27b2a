// Renders the screen layouts that are not list rows (the profile wizard, the
// profile body with its bottom button, the picture viewer, the date popup
// content) and checks where their areas end up.
#include "ResourcePaths.h"
#include "ShotRows.h"
#include "ThemeShot.h"

#include <gtest/gtest.h>

#include <string>

using namespace ct::test::res;

namespace {

struct Box {
	int x = 0, y = 0, w = 0, h = 0;
};

Box geometryOf(Evas_Object* obj)
{
	Box b;
	evas_object_geometry_get(obj, &b.x, &b.y, &b.w, &b.h);
	return b;
}

Evas_Object* fill(Evas_Object* obj)
{
	evas_object_size_hint_weight_set(obj, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(obj, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(obj);
	return obj;
}

Evas_Object* textLayout(Evas_Object* parent, const char* group, const char* part, const char* text)
{
	Evas_Object* l = layout("detail_layout.edj", group)(parent);
	elm_object_part_text_set(l, part, text);
	return l;
}

} // namespace

TEST(LayoutShot, WizardStacksBannerTitleTextAndButton)
{
	ThemeShot canvas(360, 640);
	Evas_Object* base = fill(layout("detail_layout.edj", "profile/wizard/base")(canvas.box()));
	elm_box_pack_end(canvas.box(), base);
	Evas_Object* top = textLayout(base, "profile/wizard/top/sharing", "elm.text", "Profile sharing");
	Evas_Object* title = textLayout(base, "profile/wizard/title", "elm.text.title", "Self-promotion made easy");
	Evas_Object* contents = textLayout(base, "profile/wizard/contents", "elm.text.contents",
		"Share your profile picture and status with the people you contact, so they always see your "
		"latest details.");
	Evas_Object* bottom = layout("detail_layout.edj", "detail/profile/bottom/layout",
		{{"button", button("Next")}})(base);
	elm_object_part_content_set(base, "elm.swallow.top", top);
	elm_object_part_content_set(base, "elm.swallow.title", title);
	elm_object_part_content_set(base, "elm.swallow.contents", contents);
	elm_object_part_content_set(base, "elm.swallow.button", bottom);
	canvas.settle();
	EXPECT_TRUE(canvas.save(outputDir() + "/layout_wizard.png"));

	Box t = geometryOf(top), ti = geometryOf(title), c = geometryOf(contents), b = geometryOf(bottom);
	EXPECT_EQ(t.y, 0);
	EXPECT_EQ(t.h, 56);
	EXPECT_GT(ti.y, t.y + t.h) << "title below the banner";
	EXPECT_GT(ti.h, 0);
	EXPECT_GT(c.y, ti.y + ti.h - 1) << "explanation below the title";
	EXPECT_EQ(b.y + b.h, 640) << "button bar at the bottom";
	EXPECT_EQ(b.h, 64);
}

TEST(LayoutShot, ProfileBodyKeepsTheListAboveTheButtonBar)
{
	ThemeShot canvas(360, 640);
	Evas_Object* base = fill(layout("detail_layout.edj", "detail/profile/base/layout")(canvas.box()));
	elm_box_pack_end(canvas.box(), base);
	Evas_Object* list = elm_genlist_add(base);
	Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
	itc->item_style = "1line";
	itc->func.text_get = [](void*, Evas_Object*, const char*) { return strdup("Profile sharing"); };
	elm_genlist_item_append(list, itc, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
	elm_genlist_item_class_free(itc);
	Evas_Object* bottom = layout("detail_layout.edj", "detail/profile/bottom/layout",
		{{"button", button("Share")}})(base);
	elm_object_part_content_set(base, "elm.swallow.content", list);
	elm_object_part_content_set(base, "bottom.button", bottom);
	canvas.settle();
	EXPECT_TRUE(canvas.save(outputDir() + "/layout_profile_body.png"));

	Box l = geometryOf(list), b = geometryOf(bottom);
	EXPECT_EQ(b.y + b.h, 640);
	EXPECT_EQ(l.y + l.h, b.y) << "the list ends where the bar starts";
}

TEST(LayoutShot, PictureViewerShowsPageIndicatorAndBackButton)
{
	ThemeShot canvas(360, 640);
	Evas_Object* viewer = fill(layout("detail_layout.edj", "layout/detail_image/multi_image")(canvas.box()));
	elm_box_pack_end(canvas.box(), viewer);
	Evas_Object* page = icon("contacts_caller_id_default_full.png", 360)(viewer);
	Evas_Object* index = elm_index_add(viewer);
	elm_index_horizontal_set(index, EINA_TRUE);
	elm_index_autohide_disabled_set(index, EINA_TRUE);
	for (const char* label : {"1", "2", "3"})
		elm_index_item_append(index, label, nullptr, nullptr);
	elm_index_level_go(index, 0);
	Evas_Object* back = button("<")(viewer);
	elm_object_part_content_set(viewer, "scroller", page);
	elm_object_part_content_set(viewer, "controller", index);
	elm_object_part_content_set(viewer, "elm.back.btn", back);
	canvas.settle();
	EXPECT_TRUE(canvas.save(outputDir() + "/layout_viewer.png"));

	Box i = geometryOf(index), bb = geometryOf(back);
	EXPECT_EQ(i.y + i.h, 640 - 8) << "indicator along the bottom edge";
	EXPECT_EQ(bb.x, 4);
	EXPECT_EQ(bb.y, 4);
}

TEST(LayoutShot, DatePopupContentPutsTheCalendarSwitchUnderThePicker)
{
	ThemeShot canvas(360, 240);
	Evas_Object* content = fill(layout("contacts.edj", "popup_input_date")(canvas.box()));
	elm_box_pack_end(canvas.box(), content);
	Evas_Object* picker = elm_datetime_add(content);
	Evas_Object* toggle = button("Lunar")(content);
	elm_object_part_content_set(content, "elm.swallow.content", picker);
	elm_object_part_content_set(content, "elm.button", toggle);
	canvas.settle();
	EXPECT_TRUE(canvas.save(outputDir() + "/layout_date_popup.png"));

	Box p = geometryOf(picker), t = geometryOf(toggle);
	EXPECT_GE(t.y, p.y + p.h);
	EXPECT_EQ(t.x + t.w, 360 - 16);
}
