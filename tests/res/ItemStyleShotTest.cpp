// Renders the list item styles with sample rows, saves a picture of each set
// for review, and checks the sizes the styles give their rows.
#include "ResourcePaths.h"
#include "ShotRows.h"
#include "ThemeShot.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

using namespace ct::test::res;

namespace {

const std::string longText =
	"Flat 12, Rosewood Court, 221 Long Meadow Road, Little Hampton on the Water, "
	"West Sussex BN17 5AB, United Kingdom";

struct Shot {
	std::vector<int> heights;
	bool saved = false;
};

Shot shoot(const std::string& name, std::vector<ShotRow>& rows, int height = 640)
{
	ThemeShot canvas(360, height);
	Evas_Object* genlist = elm_genlist_add(canvas.box());
	elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_box_pack_end(canvas.box(), genlist);
	evas_object_show(genlist);
	std::vector<Elm_Object_Item*> items = appendShotRows(genlist, rows);
	canvas.settle();

	Shot shot;
	for (Elm_Object_Item* item : items) {
		Evas_Object* track = elm_object_item_track(item);
		int h = 0;
		if (track)
			evas_object_geometry_get(track, nullptr, nullptr, nullptr, &h);
		elm_object_item_untrack(item);
		shot.heights.push_back(h);
	}
	shot.saved = canvas.save(outputDir() + "/" + name + ".png");
	return shot;
}

} // namespace

TEST(ItemStyleShot, PlainRowsKeepTheirHeightsAndWrapLongTexts)
{
	std::vector<ShotRow> rows = {
		{"1line", {{"elm.text.main.left", "Video call"}},
			{{"elm.icon.2", icon("contacts_btn_ic_video_call.png")}}},
		{"1line", {{"elm.text.main.left", "Business profile"}}, {{"elm.icon.1", radio(true)}}},
		{"1line", {{"elm.text.main.left", "From gallery"}}, {}, ShotRow::State::Selected},
		{"2line.top", {{"elm.text.main.left.top", "Personal profile"},
			{"elm.text.sub.left.bottom", "Selected contacts"}},
			{{"elm.icon.1", radio(false)}, {"elm.icon.2", icon("contacts_btn_ic_setting.png")}}},
		{"2line.bottom", {{"elm.text.sub.left.top", "Ringtone"},
			{"elm.text.main.left.bottom", "Default"}}},
		{"2line.bottom", {{"elm.text.sub.left.top", "Status"},
			{"elm.text.main.left.bottom", "Out hiking, back Monday"}}, {}, ShotRow::State::Disabled},
		{"multiline_sub", {{"elm.text.multiline", "Short note."}}},
		{"multiline_sub", {{"elm.text.multiline", longText}}},
		{"multiline_sub.main.1icon", {{"elm.text.main", "Business profile"},
			{"elm.text.multiline", "Share your business profile with everyone."}},
			{{"elm.icon", radio(true)}}},
		{"prediction.1line", {{"elm.text.main.left", "<match>Ann</match>a Berg"}}},
		{"prediction.2line.top", {{"elm.text.main.left.top", "<match>Ann</match>ika Holm"},
			{"elm.text.sub.left.bottom", "+46 70 123 45 67"}}},
	};
	Shot shot = shoot("items_plain", rows, 900);
	EXPECT_TRUE(shot.saved);
	ASSERT_EQ(shot.heights.size(), rows.size());
	EXPECT_EQ(shot.heights[0], 56);
	EXPECT_EQ(shot.heights[1], 56);
	EXPECT_EQ(shot.heights[3], 72);
	EXPECT_EQ(shot.heights[4], 72);
	EXPECT_GT(shot.heights[7], shot.heights[6]) << "a long text wraps onto more lines";
	EXPECT_EQ(shot.heights[9], 48);
	EXPECT_EQ(shot.heights[10], 72);
}
