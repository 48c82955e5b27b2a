// Renders the list item styles with sample rows, saves a picture of each set
// for review, and checks the sizes the styles give their rows.
#include "ResourcePaths.h"
#include "ShotRows.h"
#include "ThemeShot.h"

#include <gtest/gtest.h>

#include <cstdarg>
#include <cstdio>
#include <cstring>

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
	std::vector<std::string> missingStyles;
};

// Collects the toolkit's complaints about item styles it could not find
// while it is installed.
class MissingStyleLog {
public:
	MissingStyleLog() { eina_log_print_cb_set(&MissingStyleLog::printCb, this); }
	~MissingStyleLog() { eina_log_print_cb_set(eina_log_print_cb_stderr, nullptr); }
	MissingStyleLog(const MissingStyleLog&) = delete;
	MissingStyleLog& operator=(const MissingStyleLog&) = delete;

	std::vector<std::string> lines;

private:
	static void printCb(const Eina_Log_Domain*, Eina_Log_Level, const char*, const char*, int,
		const char* fmt, void* data, va_list args)
	{
		char text[512];
		vsnprintf(text, sizeof(text), fmt, args);
		if (strstr(text, "not a valid genlist item style"))
			static_cast<MissingStyleLog*>(data)->lines.emplace_back(text);
	}
};

Shot shoot(const std::string& name, std::vector<ShotRow>& rows, int height = 640)
{
	MissingStyleLog log;
	ThemeShot canvas(360, height);
	Evas_Object* genlist = elm_genlist_add(canvas.box());
	elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_box_pack_end(canvas.box(), genlist);
	evas_object_show(genlist);
	std::vector<Elm_Object_Item*> items = appendShotRows(genlist, rows);
	canvas.settle();
	for (size_t i = 0; i < rows.size(); ++i)
		for (const std::string& signal : rows[i].signals)
			elm_object_item_signal_emit(items[i], signal.c_str(), "");
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
	shot.missingStyles = log.lines;
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
	EXPECT_TRUE(shot.missingStyles.empty()) << shot.missingStyles.front();
	ASSERT_EQ(shot.heights.size(), rows.size());
	EXPECT_EQ(shot.heights[0], 56);
	EXPECT_EQ(shot.heights[1], 56);
	EXPECT_EQ(shot.heights[3], 72);
	EXPECT_EQ(shot.heights[4], 72);
	EXPECT_GT(shot.heights[7], shot.heights[6]) << "a long text wraps onto more lines";
	EXPECT_EQ(shot.heights[9], 48);
	EXPECT_EQ(shot.heights[10], 72);
}

TEST(ItemStyleShot, InputRowsHoldTheirFieldsAndGrowWithThem)
{
	auto nameField = [](const std::string& text, const std::string& guide) {
		return layout("contacts.edj", "baseinfo_sub_layout", {{"elm.icon.1", entry(text, guide)},
			{"elm.icon.2", icon("core_icon_expand_close.png", 28)}});
	};
	auto nameBox = [nameField](Evas_Object* parent) {
		Evas_Object* box = elm_box_add(parent);
		evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, 0);
		evas_object_size_hint_align_set(box, EVAS_HINT_FILL, 0.0);
		for (auto [text, guide] : {std::pair{"Anna Berg", "Name"}, {"", "Company"}}) {
			Evas_Object* field = nameField(text, guide)(box);
			evas_object_size_hint_weight_set(field, EVAS_HINT_EXPAND, 0);
			evas_object_size_hint_align_set(field, EVAS_HINT_FILL, 0.0);
			evas_object_show(field);
			elm_box_pack_end(box, field);
		}
		return box;
	};
	std::vector<ShotRow> rows = {
		{"baseinfo.image.contract", {},
			{{"elm.icon", layout("contacts.edj", "layout/basicInfo/callerId",
				{{"elm.swallow.content", icon("contacts_caller_id_default_05.png", 96)}})},
			{"elm.icon.1", nameBox}}},
		{"input.3icon", {}, {{"elm.icon.1", typeSelector("Mobile")},
			{"elm.icon.entry", entry("070 123 45 67")},
			{"elm.icon.2", icon("core_icon_expand_open.png", 28)}}},
		{"input.3icon.1", {}, {{"elm.icon.1", typeSelector("Birthday")},
			{"elm.icon.entry", button("12 March 1990")}}},
		{"input.3icon.2", {}, {{"elm.icon.1", typeSelector("Sister")},
			{"elm.icon.entry", entry("", "Relationship")},
			{"elm.icon.3", icon("contacts_btn_ic_setting.png")}}},
		{"input.2icon", {}, {{"elm.icon.entry", entry("", "Notes")}}},
		{"baseinfo.contract.dim", {{"elm.text", "Name"}}, {{"elm.icon.1", entry("Jonas")}}},
		{"input.4icon", {}, {{"elm.icon.1", icon("contacts_circle_btn_ic_call.png", 40)},
			{"elm.icon.2", icon("contacts_circle_btn_ic_email.png", 40)},
			{"elm.icon.3", icon("contacts_circle_btn_ic_note.png", 40)},
			{"elm.icon.4", icon("contacts_circle_btn_ic_more.png", 40)}}},
		{"linked.1text.8icon", {{"elm.text", "Save contact to"}},
			{{"elm.icon.1", icon("logs_icon_sim_1_62.png")}}},
	};
	Shot shot = shoot("items_input", rows, 720);
	EXPECT_TRUE(shot.saved);
	EXPECT_TRUE(shot.missingStyles.empty()) << shot.missingStyles.front();
	ASSERT_EQ(shot.heights.size(), rows.size());
	EXPECT_GE(shot.heights[0], 120) << "two name fields and the picture fit";
	for (size_t i = 1; i <= 4; ++i)
		EXPECT_GE(shot.heights[i], 64) << rows[i].style;
	EXPECT_EQ(shot.heights[6], 96);
}

TEST(ItemStyleShot, DetailRowsShowLabelValueAndActions)
{
	auto numberActions = layout("detail_layout.edj", "list/C/detail/number_icon",
		{{"elm.icon1", icon("contacts_btn_ic_call.png")}, {"elm.icon3", icon("contacts_btn_ic_message.png")}});
	auto action = [](const char* image) {
		return layout("detail_layout.edj", "list/C/detail/icon", {{"elm.icon", icon(image)}});
	};
	std::vector<ShotRow> rows = {
		{"detail.multi.image", {}, {{"elm.icon", layout("detail_layout.edj",
			"layout/detail/contact_image", {{"elm.swallow.content",
				icon("contacts_caller_id_default_full.png", 270)}})}}},
		{"detail/2line.bottom", {{"elm.text.sub.left.top", "Mobile"},
			{"elm.text.main.left.bottom", "+46 70 123 45 67"}}, {{"elm.icon.2", numberActions}}},
		{"detail/2line.bottom", {{"elm.text.sub.left.top", "Work"},
			{"elm.text.main.left.bottom", "<backing=on backing_color=#BFF6FF linesize=20>08 555 010 20</backing>"}},
			{{"elm.icon.2", numberActions},
			{"elm.icon.left.bottom", layout("detail_layout.edj", "list/A/log/block_icon")}}},
		{"1line", {{"elm.text.main.left", "Video call"}},
			{{"elm.icon.2", action("contacts_btn_ic_video_call.png")}}},
		{"detail/2line.bottom", {{"elm.text.sub.left.top", "Home"},
			{"elm.text.main.left.bottom", "anna.berg@example.org"}},
			{{"elm.icon.2", action("contacts_btn_ic_email.png")}}, ShotRow::State::Disabled},
		{"detail/multiline_main.sub.1icon.2", {{"elm.text.main", "Home"},
			{"elm.text.multiline", longText}},
			{{"elm.icon.right", action("contacts_btn_ic_map.png")}}},
		{"detail/multiline_main.sub", {{"elm.text.sub", "Notes"},
			{"elm.text.multiline", "Met at the spring fair."}}},
		{"detail.multi.image/low", {}, {{"elm.icon", layout("detail_layout.edj",
			"layout/detail/contact_image/low_resolution", {{"elm.swallow.content",
				icon("contacts_caller_id_default_02.png", 96)}})}}},
		{"linked.1text.8icon", {{"elm.text", "Linked contacts"}},
			{{"elm.icon.1", icon("contacts_list_ic_device.png")},
			{"elm.icon.2", icon("logs_icon_sim_1_62.png")},
			{"elm.icon.8", icon("contacts_ic_linked.png")}}},
	};
	Shot shot = shoot("items_detail", rows, 1300);
	EXPECT_TRUE(shot.saved);
	EXPECT_TRUE(shot.missingStyles.empty()) << shot.missingStyles.front();
	ASSERT_EQ(shot.heights.size(), rows.size());
	EXPECT_EQ(shot.heights[0], 270);
	EXPECT_EQ(shot.heights[1], 72);
	EXPECT_EQ(shot.heights[2], 72) << "the block mark and the backing keep the row height";
	EXPECT_GT(shot.heights[5], shot.heights[6]) << "a long address wraps";
	EXPECT_EQ(shot.heights[7], 270) << "a small picture keeps the picture row height";
}

TEST(ItemStyleShot, ProfileAndShareRows)
{
	auto photo = [](const char* image) {
		return layout("contacts.edj", "layout/myprofile/photo", {{"elm.swallow.content", icon(image, 48)}});
	};
	auto thumbnail = layout("detail_layout.edj", "list/B/type.2",
		{{"image.thumbnail", icon("contacts_caller_id_default_02.png", 56)},
		{"favor.icon", icon("contacts_icon_favorite.png", 20)}});
	std::vector<ShotRow> rows = {
		{"input.multi.image", {}, {{"elm.icon.default", layout("detail_layout.edj", "layout/default_image",
			{{"elm.swallow.content", icon("contacts_caller_id_default_full.png", 200)}})},
			{"elm.icon.1", photo("contacts_caller_id_default_02.png")},
			{"elm.icon.2", photo("contacts_caller_id_default_02.png")},
			{"elm.button", button("Reorder")}}},
		{"display_name_4line", {{"main.name", "Anna Berg"}, {"sub.name1", "Anya"},
			{"sub.name2", "Annie"}, {"sub.name3", "Nordic Trails AB"}}, {{"elm.icon.2", thumbnail}}},
		{"display_name_1line", {{"main.name", "Jonas Ek"}}, {{"elm.icon.2", thumbnail}}},
		{"2line.bottom", {{"elm.text.sub.left.top", "Mobile"}, {"elm.text.main.left.bottom", "+46 70 123 45 67"}},
			{{"elm.icon.2", layout("contacts.edj", "list/C/type.2", {{"elm.swallow.content", check(true)}})}}},
	};
	rows[0].signals = {"show,2icon", "hide,bg"};
	Shot shot = shoot("items_profile", rows, 720);
	EXPECT_TRUE(shot.saved);
	EXPECT_TRUE(shot.missingStyles.empty()) << shot.missingStyles.front();
	ASSERT_EQ(shot.heights.size(), rows.size());
	EXPECT_EQ(shot.heights[0], 288);
	EXPECT_GE(shot.heights[1], shot.heights[2]);
}
