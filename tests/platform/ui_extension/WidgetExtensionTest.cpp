#include "ScreenHarness.h"

#include "LogSink.h"
#include "efl_assist.h"
#include "efl_extension.h"
#include "ui_extension.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

using ct::test::ScreenHarness;

namespace {

struct Hits { std::vector<std::string> order; };

void recordA(void* data, Evas_Object*, void*) { static_cast<Hits*>(data)->order.push_back("A"); }
void recordB(void* data, Evas_Object*, void*) { static_cast<Hits*>(data)->order.push_back("B"); }

Evas_Object* shownBox(ScreenHarness& screen)
{
	Evas_Object* box = elm_box_add(screen.win());
	evas_object_show(box);
	return box;
}

} // namespace

TEST(BackKeyHooks, NewestShownHookTakesTheKeyAndHooksDieWithTheirObject)
{
	ScreenHarness screen;
	Hits hits;
	Evas_Object* older = shownBox(screen);
	Evas_Object* newer = shownBox(screen);
	ASSERT_EQ(eext_object_event_callback_add(older, EEXT_CALLBACK_BACK, recordA, &hits), 0);
	ASSERT_EQ(ea_object_event_callback_add(newer, EA_CALLBACK_BACK, recordB, &hits), 0);

	screen.sendBackKey();
	EXPECT_EQ(hits.order, (std::vector<std::string> { "B" }));
	evas_object_hide(newer);
	screen.sendBackKey();
	evas_object_show(newer);
	EXPECT_TRUE(eext_win_back_request(screen.win()));
	EXPECT_EQ(hits.order, (std::vector<std::string> { "B", "A", "B" }));

	EXPECT_EQ(ea_object_event_callback_del(newer, EA_CALLBACK_BACK, recordB), &hits);
	EXPECT_EQ(ea_object_event_callback_del(newer, EA_CALLBACK_BACK, recordB), nullptr);
	screen.sendBackKey();
	EXPECT_EQ(hits.order.back(), "A");

	evas_object_del(older);
	hits.order.clear();
	EXPECT_FALSE(eext_win_back_request(screen.win()) && !screen.naviframe());
	EXPECT_TRUE(hits.order.empty());

	ASSERT_EQ(eext_object_event_callback_add(newer, EEXT_CALLBACK_MORE, recordA, &hits), 0);
	screen.sendMoreKey();
	EXPECT_EQ(hits.order, (std::vector<std::string> { "A" }));
	evas_object_del(newer);

	ct::log::clear();
	EXPECT_EQ(eext_object_event_callback_add(nullptr, EEXT_CALLBACK_BACK, recordA, nullptr), -22);
	EXPECT_EQ(ea_object_event_callback_add(screen.win(), EA_CALLBACK_BACK, nullptr, nullptr), -22);
	EXPECT_TRUE(ct::log::contains("Invalid param"));
	EXPECT_FALSE(eext_win_back_request(nullptr));
}

TEST(EditField, SingleAndMultiLineFieldsWithAClearButton)
{
	ScreenHarness screen;
	Evas_Object* single = uxt_edit_field_layout_add(screen.win(), UXT_EDIT_FIELD_LAYOUT_STYLE_SINGLELINE);
	Evas_Object* multi = uxt_edit_field_layout_add(screen.win(), UXT_EDIT_FIELD_LAYOUT_STYLE_MULTILINE);
	ASSERT_TRUE(single && multi);
	Evas_Object* entry = uxt_edit_field_layout_get_entry(single);
	EXPECT_TRUE(elm_entry_single_line_get(entry));
	EXPECT_FALSE(elm_entry_single_line_get(uxt_edit_field_layout_get_entry(multi)));

	evas_object_resize(single, 400, 60);
	Evas_Object* clear = uxt_edit_field_layout_get_clear_button(single);
	elm_object_focus_set(entry, EINA_TRUE);
	elm_entry_entry_set(entry, "Alice");
	screen.pumpUntilIdle();
	EXPECT_TRUE(evas_object_visible_get(clear));
	ScreenHarness::click(clear);
	EXPECT_TRUE(elm_entry_is_empty(entry));
	EXPECT_FALSE(evas_object_visible_get(clear));

	EXPECT_EQ(uxt_edit_field_layout_set_clear_button_enabled(multi, EINA_FALSE), 0);
	EXPECT_EQ(uxt_edit_field_layout_add(nullptr, 2), nullptr);
	EXPECT_EQ(uxt_edit_field_layout_add(screen.win(), 9), nullptr);
	EXPECT_LT(uxt_edit_field_layout_set_clear_button_enabled(screen.win(), EINA_TRUE), 0);
	evas_object_del(single);
	evas_object_del(multi);
}

TEST(EditField, TypedCharactersFollowEachOtherWhileTheClearButtonShows)
{
	ScreenHarness screen;
	Evas_Object* field = uxt_edit_field_layout_add(screen.win(), UXT_EDIT_FIELD_LAYOUT_STYLE_SINGLELINE);
	evas_object_resize(field, 300, 50);
	Evas_Object* entry = uxt_edit_field_layout_get_entry(field);
	for (const char* typed : { "6", "5", "0" }) {
		elm_entry_entry_insert(entry, typed);
		screen.pumpUntilIdle();
	}
	EXPECT_STREQ(elm_entry_entry_get(entry), "650");
	EXPECT_EQ(elm_entry_cursor_pos_get(entry), 3);
	evas_object_del(field);
}

TEST(ButtonsScrollerAndTheme, StylesColoursAndLocaleFormatsApplyAndBadInputIsRefused)
{
	ScreenHarness screen;
	Evas_Object* button = uxt_button_add(screen.win(), "naviframe/back_btn/default");
	ASSERT_NE(button, nullptr);
	EXPECT_EQ(uxt_button_add(nullptr, "circle"), nullptr);
	EXPECT_LT(uxt_scroller_set_auto_scroll_enabled(nullptr, EINA_TRUE), 0);

	int r = -1, g = -1, b = -1, a = -1;
	EXPECT_EQ(uxt_theme_get_color("transparent", &r, &g, &b, &a), 0);
	EXPECT_EQ(a, 0);
	EXPECT_LT(uxt_theme_get_color("NOPE", &r, &g, &b, &a), 0);
	EXPECT_LT(uxt_theme_get_color(nullptr, &r, &g, &b, &a), 0);
	EXPECT_EQ(uxt_theme_object_replace_color(button, "B043A", "A08O001A"), 0);
	int r2, g2, b2, a2, r3, g3, b3, a3;
	ASSERT_TRUE(edje_object_color_class_get(elm_layout_edje_get(button), "B043A", &r, &g, &b, &a, &r2, &g2, &b2, &a2,
		&r3, &g3, &b3, &a3));
	EXPECT_EQ(a, 128);
	EXPECT_LT(uxt_theme_object_replace_color(button, "B043", "NOPE"), 0);
	EXPECT_LT(uxt_theme_object_replace_color(nullptr, "B043", "A08O001"), 0);
	evas_object_del(button);

	Evas_Object* datetime = elm_datetime_add(screen.win());
	EXPECT_EQ(uxt_date_time_set_format_by_locale(datetime, "en_US.UTF-8"), 0);
	EXPECT_STREQ(elm_datetime_format_get(datetime), "%b %d, %Y");
	EXPECT_EQ(uxt_date_time_set_format_by_locale(datetime, "de_DE"), 0);
	EXPECT_STREQ(elm_datetime_format_get(datetime), "%d. %b %Y");
	EXPECT_LT(uxt_date_time_set_format_by_locale(nullptr, "en_US"), 0);
	evas_object_del(datetime);
}
