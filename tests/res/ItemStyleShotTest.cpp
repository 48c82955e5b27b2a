// Renders the list item styles with sample rows in one list, saves the
// picture for review, and checks the heights the styles give their rows (a
// style the toolkit cannot find falls back to its default look and height).
#include "ResourcePaths.h"
#include "ScreenHarness.h"
#include "WView.h"

#include <gtest/gtest.h>

#include <cstring>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

using namespace ct::test::res;

namespace {

const char* const longText = "Flat 12, Rosewood Court, 221 Long Meadow Road, Little Hampton on the Water, "
	"West Sussex BN17 5AB, United Kingdom";

struct Row {
	std::string style;
	std::map<std::string, std::string> texts;
	// Content parts, each an image of "image_layout.edj" at a square size.
	std::map<std::string, std::pair<std::string, int>> icons;
	int height; // the expected height; 0 when only compared with a neighbour
	std::vector<std::string> signals = {};
};

char* textCb(void* data, Evas_Object*, const char* part)
{
	const auto& texts = static_cast<Row*>(data)->texts;
	auto found = texts.find(part);
	return found == texts.end() ? nullptr : strdup(found->second.c_str());
}

Evas_Object* contentCb(void* data, Evas_Object* parent, const char* part)
{
	const auto& icons = static_cast<Row*>(data)->icons;
	auto found = icons.find(part);
	if (found == icons.end())
		return nullptr;
	Evas_Object* image = elm_image_add(parent);
	elm_image_file_set(image, edjePath("image_layout.edj").c_str(), found->second.first.c_str());
	evas_object_size_hint_min_set(image, found->second.second, found->second.second);
	return image;
}

class ListView : public app_assist::WView {
public:
	explicit ListView(std::vector<Row>& rows) : m_rows(rows) {}
	std::vector<Elm_Object_Item*> items;

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		for (const char* file : {"contacts.edj", "detail_layout.edj"})
			elm_theme_extension_add(nullptr, edjePath(file).c_str());
		Evas_Object* genlist = elm_genlist_add(parent);
		elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
		for (Row& row : m_rows) {
			Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
			itc->item_style = row.style.c_str();
			itc->func.text_get = textCb;
			itc->func.content_get = contentCb;
			items.push_back(elm_genlist_item_append(genlist, itc, &row, nullptr, ELM_GENLIST_ITEM_NONE, nullptr,
				nullptr));
			elm_genlist_item_class_free(itc);
		}
		return genlist;
	}
	void onDestroy() override
	{
		for (const char* file : {"contacts.edj", "detail_layout.edj"})
			elm_theme_extension_del(nullptr, edjePath(file).c_str());
	}

private:
	std::vector<Row>& m_rows;
};

} // namespace

TEST(ItemStyleShot, RowsKeepTheirHeightsAndWrapLongTexts)
{
	const std::pair<std::string, int> call{"contacts_btn_ic_call.png", 32};
	std::vector<Row> rows = {
		{"1line", {{"elm.text.main.left", "Video call"}}, {{"elm.icon.2", call}}, 56},
		{"2line.top", {{"elm.text.main.left.top", "Personal profile"}, {"elm.text.sub.left.bottom", "Selected"}}, {},
			72},
		{"2line.bottom", {{"elm.text.sub.left.top", "Ringtone"}, {"elm.text.main.left.bottom", "Default"}}, {}, 72},
		{"multiline_sub", {{"elm.text.multiline", "Short note."}}, {}, 0},
		{"multiline_sub", {{"elm.text.multiline", longText}}, {}, 0},
		{"prediction.1line", {{"elm.text.main.left", "<match>Ann</match>a Berg"}}, {}, 48},
		{"prediction.2line.top", {{"elm.text.main.left.top", "Annika"}, {"elm.text.sub.left.bottom", "+46"}}, {}, 72},
		{"input.4icon", {}, {{"elm.icon.1", {"contacts_circle_btn_ic_call.png", 40}},
			{"elm.icon.4", {"contacts_circle_btn_ic_more.png", 40}}}, 96},
		{"detail.multi.image", {}, {{"elm.icon", {"contacts_caller_id_default_full.png", 270}}}, 270},
		{"detail.multi.image/low", {}, {{"elm.icon", {"contacts_caller_id_default_02.png", 96}}}, 270},
		{"detail/2line.bottom", {{"elm.text.sub.left.top", "Mobile"}, {"elm.text.main.left.bottom",
			"<backing=on backing_color=#BFF6FF linesize=20>08 555 010 20</backing>"}},
			{{"elm.icon.2", call}, {"elm.icon.left.bottom", {"contacts_ic_block.png", 24}}}, 72},
		{"detail/multiline_main.sub.1icon.2", {{"elm.text.main", "Home"}, {"elm.text.multiline", longText}},
			{{"elm.icon.right", {"contacts_btn_ic_map.png", 32}}}, 0},
		{"detail/multiline_main.sub", {{"elm.text.sub", "Notes"}, {"elm.text.multiline", "Met at the fair."}}, {}, 0},
		{"input.multi.image", {}, {{"elm.icon.1", {"contacts_caller_id_default_02.png", 48}}}, 288,
			{"show,2icon", "hide,bg"}},
		{"display_name_4line", {{"main.name", "Anna Berg"}, {"sub.name1", "Anya"}, {"sub.name2", "Nordic AB"}}, {}, 0},
		{"display_name_1line", {{"main.name", "Jonas Ek"}}, {}, 0},
	};
	ct::test::ScreenHarness screen(360, 2400);
	auto* view = new ListView(rows);
	ASSERT_TRUE(screen.push(view));
	for (size_t i = 0; i < rows.size(); ++i)
		for (const std::string& signal : rows[i].signals)
			elm_object_item_signal_emit(view->items[i], signal.c_str(), "");
	screen.pumpUntilIdle();
	std::filesystem::create_directories(outputDir());
	EXPECT_TRUE(screen.savePng(outputDir() + "/item_styles.png"));

	std::vector<int> heights;
	for (Elm_Object_Item* item : view->items) {
		int h = 0;
		evas_object_geometry_get(elm_object_item_track(item), nullptr, nullptr, nullptr, &h);
		elm_object_item_untrack(item);
		heights.push_back(h);
	}
	for (size_t i = 0; i < rows.size(); ++i)
		EXPECT_TRUE(!rows[i].height || heights[i] == rows[i].height) << rows[i].style << ": " << heights[i];
	EXPECT_GT(heights[4], heights[3]) << "a long text wraps onto more lines";
	EXPECT_GT(heights[11], heights[12]) << "a long address wraps";
	EXPECT_GE(heights[14], heights[15]);
}
