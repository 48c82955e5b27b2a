// Every edje group, part and signal that the screens name exists in the
// file they load it from and does what its name says.
#include "ResourcePaths.h"

#include <Ecore_Evas.h>
#include <Ecore_File.h>
#include <Edje.h>
#include <Elementary.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

using namespace ct::test::res;

namespace {

struct GroupParts {
	std::string group;
	std::vector<std::string> parts;
};

std::string item(const std::string& style)
{
	return "elm/genlist/item/" + style + "/default";
}

// The holder layouts are loaded through whichever application theme a screen
// registered, so all three files carry them.
const std::vector<GroupParts> holderLayouts = {
	{"list/C/type.1", {"elm.swallow.content"}},
	{"list/C/type.2", {"elm.swallow.content"}},
	{"list/C/type.3", {"elm.swallow.content"}},
	{"list/B/type.2", {"image.thumbnail", "favor.icon"}},
	{"list/B/type.4", {"elm.swallow.content"}},
	{"list/B/accountIcon", {"elm.swallow.content"}},
	{"list/A/contact/thumbnail", {"elm.swallow.content"}},
	{"list/A/log/block_icon", {}},
	{"input/number/type", {"elm.swallow.content"}},
	{"list/C/detail/number_icon", {"elm.icon1", "elm.icon3", "touch.call", "touch.message"}},
	{"list/C/detail/icon", {"elm.icon", "touch.icon"}},
	{"list/C/detail/icon/facebook", {"elm.icon", "touch.icon"}},
	{"list/C/ringtone/icon", {"elm.icon1"}},
	{"list/C/profile/my_profile", {"touch.event.area"}},
};

const std::vector<GroupParts> contactsGroups = {
	{item("1line"), {"elm.text.main.left", "elm.icon.1", "elm.icon.2"}},
	{item("2line.top"), {"elm.text.main.left.top", "elm.text.sub.left.bottom", "elm.icon.1", "elm.icon.2"}},
	{item("2line.bottom"), {"elm.text.sub.left.top", "elm.text.main.left.bottom", "elm.icon.1", "elm.icon.2"}},
	{item("multiline_sub"), {"elm.text.multiline"}},
	{item("multiline_sub.main.1icon"), {"elm.text.main", "elm.text.multiline", "elm.icon"}},
	{item("input.2icon"), {"elm.icon.entry", "elm.icon.2", "elm.icon.edit"}},
	{item("input.3icon"), {"elm.icon.1", "elm.icon.entry", "elm.icon.2"}},
	{item("input.3icon.1"), {"elm.icon.1", "elm.icon.entry", "elm.icon.2"}},
	{item("input.3icon.2"), {"elm.icon.1", "elm.icon.entry", "elm.icon.2", "elm.icon.3"}},
	{item("input.4icon"), {"elm.icon.1", "elm.icon.2", "elm.icon.3", "elm.icon.4"}},
	{item("input.multi.image"), {"elm.icon.default", "elm.icon.1", "elm.icon.2", "elm.icon.3",
		"elm.icon.4", "elm.icon.5", "elm.icon.add", "elm.button"}},
	{item("input.multi.image.z1"), {"elm.icon.default", "elm.icon.1", "elm.icon.5", "elm.button"}},
	{item("baseinfo.image.contract"), {"elm.icon", "elm.icon.1"}},
	{item("baseinfo.image.contract.dim"), {"elm.icon", "elm.icon.1"}},
	{item("baseinfo.contract"), {"elm.text", "elm.icon.1"}},
	{item("baseinfo.contract.dim"), {"elm.text", "elm.icon.1"}},
	{item("baseinfo.primary"), {"elm.icon.1"}},
	{item("prediction.1line"), {"elm.text.main.left"}},
	{item("prediction.2line.top"), {"elm.text.main.left.top", "elm.text.sub.left.bottom"}},
	{"popup_input_text", {"elm.swallow.content"}},
	{"popup_input_date", {"elm.swallow.content", "elm.button"}},
	{"baseinfo_sub_layout", {"elm.icon.1", "elm.icon.2"}},
	{"baseinfo_sub_layout_esu", {"elm.icon.1", "elm.icon.2"}},
	{"layout/basicInfo/callerId", {"elm.swallow.content", "touch_area"}},
	{"layout/myprofile/photo", {"elm.swallow.content"}},
	{"layout/myprofile/add_photo/default", {"myprofile_add_photo", "elm.text"}},
	{"layout/myprofile/add_photo/ups", {"myprofile_add_photo", "elm.text"}},
	{"layout/prediction_list", {"elm.swallow.content"}},
};

const std::vector<GroupParts> detailGroups = {
	{item("detail/2line.bottom"), {"elm.text.sub.left.top", "elm.text.main.left.bottom",
		"elm.icon.left.bottom", "elm.icon.2", "elm.icon.right.top", "copy.text.area"}},
	{item("detail/multiline_main.sub"), {"elm.text.sub", "elm.text.multiline", "copy.text.area"}},
	{item("detail/multiline_main.sub.1icon"), {"elm.text.main", "elm.text.multiline", "elm.icon.2"}},
	{item("detail/multiline_main.sub.1icon.2"), {"elm.text.main", "elm.text.multiline",
		"elm.icon.right", "copy.text.area"}},
	{item("detail.multi.image"), {"elm.icon"}},
	{item("detail.multi.image/low"), {"elm.icon"}},
	{item("linked.1text.8icon"), {"elm.text", "elm.icon.1", "elm.icon.2", "elm.icon.3", "elm.icon.4",
		"elm.icon.5", "elm.icon.6", "elm.icon.7", "elm.icon.8"}},
	{item("display_name_1line"), {"main.name", "sub.name1", "sub.name2", "sub.name3", "elm.icon.2"}},
	{item("display_name_4line"), {"main.name", "sub.name1", "sub.name2", "sub.name3", "elm.icon.2"}},
	{"layout/favorite", {"icon.favorite"}},
	{"layout/detail/contact_image", {"elm.swallow.content"}},
	{"layout/detail/contact_image/low_resolution", {"elm.swallow.content"}},
	{"layout/multi_image", {"scroller", "controller"}},
	{"layout/multi_image/page", {"elm.swallow.content"}},
	{"layout/detail_image/multi_image", {"scroller", "controller", "elm.back.btn"}},
	{"layout/detail_image/multi_image/page", {"sizer", "elm.swallow.content"}},
	{"layout/default_image", {"elm.swallow.content"}},
	{"detail/profile/base/layout", {"elm.swallow.content", "bottom.button", "elm.swallow.bg"}},
	{"detail/profile/bottom/layout", {"button"}},
	{"layout/reorder", {"elm.swallow.content"}},
	{"layout/reorder/item", {"elm.swallow.content"}},
	{"profile/wizard/base", {"elm.swallow.top", "elm.swallow.title", "elm.swallow.contents",
		"elm.swallows.full", "elm.swallow.button"}},
	{"profile/wizard/top/sharing", {"elm.text"}},
	{"profile/wizard/title", {"elm.text.title"}},
	{"profile/wizard/contents", {"elm.text.contents"}},
	{"layout/myprofile/add_photo/default", {"myprofile_add_photo", "elm.text"}},
	{"elm/check/base/favorite_contact", {"elm.swallow.content", "elm.text"}},
};

// The images the screens load from "image_layout.edj" by name.
const std::vector<std::string> namedImages = {
	"contacts_btn_ic_Internet.png", "contacts_btn_ic_call.png", "contacts_btn_ic_email.png",
	"contacts_btn_ic_message.png", "contacts_btn_ic_setting.png", "contacts_btn_ic_video_call.png",
	"contacts_caller_id_default_02.png", "contacts_caller_id_default_05.png",
	"contacts_caller_id_default_full.png", "contacts_circle_btn_ic_call.png",
	"contacts_circle_btn_ic_email.png", "contacts_circle_btn_ic_more.png",
	"contacts_circle_btn_ic_note.png", "contacts_ic_linked.png", "contacts_icon_favorite.png",
	"contacts_list_ic_device.png", "core_icon_expand_close.png", "core_icon_expand_open.png",
	"logs_icon_sim_1_52.png", "logs_icon_sim_1_62.png", "logs_icon_sim_2_52.png",
	"logs_icon_sim_2_62.png", "logs_icon_sim_52.png", "logs_icon_sim_62.png",
	"logs_icon_sim_data_52.png", "logs_icon_sim_data_62.png", "logs_icon_sim_heart_52.png",
	"logs_icon_sim_heart_62.png", "logs_icon_sim_home_52.png", "logs_icon_sim_home_62.png",
	"logs_icon_sim_internet_52.png", "logs_icon_sim_internet_62.png",
	"logs_icon_sim_message_52.png", "logs_icon_sim_message_62.png",
	"logs_icon_sim_office_52.png", "logs_icon_sim_office_62.png", "logs_icon_sim_phone_52.png",
	"logs_icon_sim_phone_62.png",
};

// A buffer canvas to load groups into.
class EdjeCanvas {
public:
	EdjeCanvas() : m_ee(ecore_evas_buffer_new(360, 640)) {}
	~EdjeCanvas() { ecore_evas_free(m_ee); }
	EdjeCanvas(const EdjeCanvas&) = delete;
	EdjeCanvas& operator=(const EdjeCanvas&) = delete;

	// A new edje object showing the group, or null when it does not load.
	Evas_Object* load(const std::string& file, const std::string& group)
	{
		Evas_Object* obj = edje_object_add(ecore_evas_get(m_ee));
		if (!edje_object_file_set(obj, edjePath(file).c_str(), group.c_str())) {
			evas_object_del(obj);
			return nullptr;
		}
		evas_object_resize(obj, 360, 200);
		return obj;
	}

private:
	Ecore_Evas* m_ee;
};

std::string stateAfter(Evas_Object* obj, const char* signal, const char* source, const char* part)
{
	edje_object_signal_emit(obj, signal, source);
	edje_object_message_signal_process(obj);
	double value = 0;
	const char* state = edje_object_part_state_get(obj, part, &value);
	return state ? state : "";
}

void expectGroups(const std::string& file, const std::vector<GroupParts>& groups)
{
	EdjeCanvas canvas;
	for (const GroupParts& g : groups) {
		SCOPED_TRACE(file + ": " + g.group);
		EXPECT_TRUE(edje_file_group_exists(edjePath(file).c_str(), g.group.c_str()));
		Evas_Object* obj = canvas.load(file, g.group);
		ASSERT_NE(obj, nullptr);
		for (const std::string& part : g.parts)
			EXPECT_TRUE(edje_object_part_exists(obj, part.c_str())) << part;
		evas_object_del(obj);
	}
}

} // namespace

TEST(ThemeGroups, ContactsFileHasTheEditFormStylesAndLayouts)
{
	expectGroups("contacts.edj", contactsGroups);
	expectGroups("contacts.edj", holderLayouts);
}

TEST(ThemeGroups, DetailFileHasTheDetailAndProfileStylesAndLayouts)
{
	expectGroups("detail_layout.edj", detailGroups);
	expectGroups("detail_layout.edj", holderLayouts);
}

TEST(ThemeGroups, ListFileHasTheHolderLayouts)
{
	expectGroups("list.edj", holderLayouts);
}

TEST(ThemeGroups, EveryItemStyleAnswersTheListsOddAndCompressLookups)
{
	for (const auto* groups : {&contactsGroups, &detailGroups}) {
		const std::string file = groups == &contactsGroups ? "contacts.edj" : "detail_layout.edj";
		for (const GroupParts& g : *groups) {
			if (g.group.rfind("elm/genlist/item/", 0) != 0)
				continue;
			std::string style = g.group.substr(17);
			for (const char* kind : {"item_odd/", "item_compress/", "item_compress_odd/"}) {
				std::string name = std::string("elm/genlist/") + kind + style;
				EXPECT_TRUE(edje_file_group_exists(edjePath(file).c_str(), name.c_str())) << name;
			}
		}
	}
}

TEST(ThemeGroups, ImageFileHasEveryNamedImageAndTheBuildCopiesIt)
{
	EdjeCanvas canvas;
	for (const std::string& name : namedImages) {
		SCOPED_TRACE(name);
		Evas_Object* obj = canvas.load("image_layout.edj", name);
		ASSERT_NE(obj, nullptr);
		EXPECT_TRUE(edje_object_part_exists(obj, "image"));
		EXPECT_EQ(stateAfter(obj, "btn.disable", "image", "image"), "dim");
		EXPECT_EQ(stateAfter(obj, "btn.enable", "image", "image"), "default");
		evas_object_del(obj);
		EXPECT_TRUE(ecore_file_exists((buildResDir() + "/images/" + name).c_str()));
	}
}

TEST(ThemeGroups, ItemsShowSelectionDisablingAndHiddenDivider)
{
	EdjeCanvas canvas;
	Evas_Object* row = canvas.load("contacts.edj", item("2line.top"));
	ASSERT_NE(row, nullptr);
	EXPECT_EQ(stateAfter(row, "elm,state,selected", "elm", "base"), "selected");
	EXPECT_EQ(stateAfter(row, "elm,state,unselected", "elm", "base"), "default");
	EXPECT_EQ(stateAfter(row, "elm,state,disabled", "elm", "clip"), "disabled");
	EXPECT_EQ(stateAfter(row, "elm,state,enabled", "elm", "clip"), "default");
	EXPECT_EQ(stateAfter(row, "elm,state,bottomline,hide", "", "bottomline"), "hidden");
	EXPECT_EQ(stateAfter(row, "play_sound", "", "base"), "selected") << "a tap flashes the row";
	evas_object_del(row);
}

TEST(ThemeGroups, ProfilePictureAreaShowsAsManyPlacesAsAsked)
{
	EdjeCanvas canvas;
	Evas_Object* row = canvas.load("contacts.edj", item("input.multi.image"));
	ASSERT_NE(row, nullptr);
	EXPECT_EQ(stateAfter(row, "show,2icon", "", "elm.icon.2"), "visible");
	EXPECT_EQ(stateAfter(row, "show,2icon", "", "elm.icon.3"), "default");
	EXPECT_EQ(stateAfter(row, "show,5icon", "", "elm.icon.5"), "visible");
	EXPECT_EQ(stateAfter(row, "show,1icon", "", "elm.icon.2"), "default");
	EXPECT_EQ(stateAfter(row, "hide,bg", "", "area.main"), "hidden");
	EXPECT_EQ(stateAfter(row, "button,disable", "", "btnclip"), "disabled");
	EXPECT_EQ(stateAfter(row, "button,enable", "", "btnclip"), "default");
	evas_object_del(row);
}

TEST(ThemeGroups, SwitchesOfTheScreensReachTheirParts)
{
	EdjeCanvas canvas;
	Evas_Object* linked = canvas.load("detail_layout.edj", item("linked.1text.8icon"));
	ASSERT_NE(linked, nullptr);
	EXPECT_EQ(stateAfter(linked, "link,contacts,disable", "", "linkclip"), "disabled");
	EXPECT_EQ(stateAfter(linked, "link,contacts,enable", "", "linkclip"), "default");
	evas_object_del(linked);

	Evas_Object* callerId = canvas.load("contacts.edj", "layout/basicInfo/callerId");
	ASSERT_NE(callerId, nullptr);
	EXPECT_EQ(stateAfter(callerId, "enable", "touch_area", "touch_area"), "enabled");
	EXPECT_EQ(stateAfter(callerId, "disable", "touch_area", "touch_area"), "default");
	evas_object_del(callerId);

	Evas_Object* shareWith = canvas.load("detail_layout.edj", "list/C/profile/my_profile");
	ASSERT_NE(shareWith, nullptr);
	EXPECT_EQ(stateAfter(shareWith, "btn.disable", "touch.event.area", "touch.event.area"), "disabled");
	EXPECT_EQ(stateAfter(shareWith, "btn.enable", "touch.event.area", "touch.event.area"), "default");
	evas_object_del(shareWith);
}

TEST(ThemeGroups, EveryImageOfTheSourceTreeIsAlsoAnImageGroup)
{
	int images = 0;
	for (const auto& entry : std::filesystem::directory_iterator(sourceRoot() + "/res/images")) {
		if (entry.path().extension() != ".png")
			continue;
		++images;
		std::string name = entry.path().filename().string();
		EXPECT_TRUE(edje_file_group_exists(edjePath("image_layout.edj").c_str(), name.c_str())) << name;
	}
	EXPECT_GE(images, static_cast<int>(namedImages.size()));
}

TEST(ThemeGroups, FavouriteStarFollowsTheCheckState)
{
	elm_theme_extension_add(nullptr, edjePath("detail_layout.edj").c_str());
	Evas_Object* win = elm_win_add(nullptr, "star", ELM_WIN_BASIC);
	Evas_Object* star = elm_check_add(win);
	EXPECT_TRUE(elm_object_style_set(star, "favorite_contact"));
	Evas_Object* edje = elm_layout_edje_get(star);
	ASSERT_NE(edje, nullptr);
	double value = 0;
	elm_check_state_set(star, EINA_TRUE);
	edje_object_message_signal_process(edje);
	EXPECT_STREQ(edje_object_part_state_get(edje, "star", &value), "on");
	elm_check_state_set(star, EINA_FALSE);
	edje_object_message_signal_process(edje);
	EXPECT_STREQ(edje_object_part_state_get(edje, "star", &value), "default");
	evas_object_del(win);
	elm_theme_extension_del(nullptr, edjePath("detail_layout.edj").c_str());
}
