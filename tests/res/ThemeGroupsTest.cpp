// Every item style, layout group, image and part that the screens' code
// names (and every image of the source tree) exists in the file it is loaded
// from, and the switches of the styles reach their parts. The names are read from the sources, so a renamed
// group or part fails here rather than as an empty row on a device.
#include "ResourcePaths.h"

#include <Ecore_Evas.h>
#include <Ecore_File.h>
#include <Edje.h>
#include <Elementary.h>
#include "EflEnvironment.h"
#include <glib.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <map>
#include <vector>
#include <set>
#include <sstream>
#include <string>

using namespace ct::test::res;

namespace {

struct AskedNames {
	std::set<std::string> styles, layouts, images, parts, files;
};

// Capture 1 of every match of the pattern in the text.
std::vector<std::string> captures(const std::string& text, const char* pattern)
{
	std::vector<std::string> out;
	GRegex* regex = g_regex_new(pattern, G_REGEX_RAW, GRegexMatchFlags(0), nullptr);
	GMatchInfo* info = nullptr;
	g_regex_match(regex, text.c_str(), GRegexMatchFlags(0), &info);
	for (; g_match_info_matches(info); g_match_info_next(info, nullptr)) {
		gchar* found = g_match_info_fetch(info, 1);
		out.emplace_back(found ? found : "");
		g_free(found);
	}
	g_match_info_free(info);
	g_regex_unref(regex);
	return out;
}

// The "quoted" literals inside each capture of the pattern.
void collect(const std::string& text, const char* pattern, std::set<std::string>& into)
{
	for (const std::string& found : captures(text, pattern)) {
		for (const std::string& literal : captures(found, "\"([^\"]+)\""))
			into.insert(literal);
	}
}

// The names the screens (src/ and its folders), the shared widgets (common/)
// and the host application ask for.
AskedNames scanSources()
{
	const char* style = R"(getItemStyle\(\) override \{ return ([^;]+);)";
	const char* styleDefinition = R"(::getItemStyle\(\)(?: const)?\s*\{([^}]*)\})";
	const char* itemClass = R"(createItemClass\(([^;]+)\);)";
	const char* layout = R"((?:createIconLayout|ctCommonCreateLayout)\([^;{\n]*?("[^"]+")\))";
	const char* wizardArea = R"(("profile/wizard/[a-z/]+"))";
	const char* image = R"(("[A-Za-z0-9_]+\.png"))";
	const char* part = R"(("(?:elm|touch|copy|main|sub|image|favor)\.[a-z0-9._]+"))";
	AskedNames names;
	for (const char* dir : {"src", "common", "host"}) {
		for (const auto& entry : std::filesystem::recursive_directory_iterator(sourceRoot() + "/" + dir)) {
			if (!entry.is_regular_file())
				continue;
			std::stringstream read;
			read << std::ifstream(entry.path()).rdbuf();
			const std::string text = read.str();
			collect(text, style, names.styles);
			collect(text, styleDefinition, names.styles);
			collect(text, itemClass, names.styles);
			collect(text, layout, names.layouts);
			collect(text, wizardArea, names.layouts);
			collect(text, image, names.images);
			for (const std::string& file : captures(text, R"re("contacts/([a-z_]+\.edj)")re"))
				names.files.insert(file);
			if (std::string(dir) == "src")
				collect(text, part, names.parts);
		}
	}
	return names;
}

// A buffer canvas to load groups into.
struct EdjeCanvas {
	Ecore_Evas* ee = ecore_evas_buffer_new(360, 640);
	~EdjeCanvas() { ecore_evas_free(ee); }

	// A new edje object showing the group (the canvas owns it), or null.
	Evas_Object* load(const std::string& file, const std::string& group)
	{
		Evas_Object* obj = edje_object_add(ecore_evas_get(ee));
		if (!edje_object_file_set(obj, edjePath(file).c_str(), group.c_str())) {
			evas_object_del(obj);
			return nullptr;
		}
		evas_object_resize(obj, 360, 200);
		return obj;
	}
};

std::string stateAfter(Evas_Object* obj, const char* signal, const char* source, const char* part)
{
	edje_object_signal_emit(obj, signal, source);
	edje_object_message_signal_process(obj);
	double value = 0;
	const char* state = edje_object_part_state_get(obj, part, &value);
	return state ? state : "";
}

std::string item(const std::string& style, const char* kind = "item")
{
	return std::string("elm/genlist/") + kind + "/" + style + "/default";
}

const bool eflRegistered = ct::test::EflEnvironment::registerOnce();

} // namespace

TEST(ThemeGroups, EveryStyleGroupImageAndPartTheCodeNamesExists)
{
	AskedNames asked = scanSources();
	ASSERT_GE(asked.styles.size(), 8u) << "the scan no longer finds the item styles";
	ASSERT_GE(asked.layouts.size(), 5u);
	ASSERT_GE(asked.parts.size(), 10u);
	ASSERT_GE(asked.files.size(), 3u);

	for (const std::string& file : asked.files) {
		Eina_List* groups = edje_file_collection_list(edjePath(file).c_str());
		EXPECT_NE(groups, nullptr) << file << " is missing or empty";
		edje_file_collection_list_free(groups);
	}
	EdjeCanvas canvas;
	std::vector<Evas_Object*> loaded;
	for (const std::string& style : asked.styles) {
		Evas_Object* row = canvas.load("detail_layout.edj", item(style));
		if (!row)
			row = canvas.load("contacts.edj", item(style));
		EXPECT_NE(row, nullptr) << "item style " << style;
		if (row)
			loaded.push_back(row);
		// Compress-mode and odd rows look the style up under these names too.
		for (const char* kind : {"item_odd", "item_compress", "item_compress_odd"}) {
			EXPECT_TRUE(edje_file_group_exists(edjePath("detail_layout.edj").c_str(), item(style, kind).c_str())
				|| edje_file_group_exists(edjePath("contacts.edj").c_str(), item(style, kind).c_str()))
				<< item(style, kind);
		}
	}
	for (const std::string& group : asked.layouts) {
		Evas_Object* layout = canvas.load("detail_layout.edj", group);
		if (!layout) // the edit form's layouts live in contacts.edj
			layout = canvas.load("contacts.edj", group);
		EXPECT_NE(layout, nullptr) << "layout " << group;
		if (layout)
			loaded.push_back(layout);
	}
	// Title-bar parts belong to the naviframe item of the light theme, the
	// indicator area to the window's base layout.
	for (const char* group : {"elm/naviframe/item/basic/default", "elm/layout/application/default"}) {
		Evas_Object* obj = canvas.load("light.edj", group);
		EXPECT_NE(obj, nullptr) << group;
		if (obj)
			loaded.push_back(obj);
	}
	// The entries' guide text is a part of the toolkit's own entry theme.
	asked.parts.erase("elm.guide");
	for (const std::string& part : asked.parts) {
		bool found = false;
		for (Evas_Object* obj : loaded) // "sub.name" names the numbered parts sub.name1...
			found = found || edje_object_part_exists(obj, part.c_str())
				|| edje_object_part_exists(obj, (part + "1").c_str());
		EXPECT_TRUE(found) << "part " << part;
	}
	for (const auto& entry : std::filesystem::directory_iterator(sourceRoot() + "/res/images"))
		asked.images.insert(entry.path().filename().string());
	for (const std::string& image : asked.images) {
		EXPECT_TRUE(edje_file_group_exists(edjePath("image_layout.edj").c_str(), image.c_str())) << image;
		EXPECT_TRUE(ecore_file_exists((buildResDir() + "/images/" + image).c_str())) << image;
	}
}

// The widget styles the code names (widget style setters, styled buttons and
// toolbars, naviframe item styles).
std::set<std::string> scanWidgetStyles()
{
	const char* const patterns[] = {R"re(elm_object_style_set\([^,;]+, "([^"]+)"\))re",
		R"re((?:uxt_button_add|uxt_toolbar_add|ctCommonCreateButton)\([^,;]+, "([^"]+)")re",
		R"re(elm_naviframe_item_push\([^;]*, "([^"]+)"\);)re"};
	std::set<std::string> styles;
	for (const char* dir : {"src", "common", "framework", "host"}) {
		for (const auto& entry : std::filesystem::recursive_directory_iterator(sourceRoot() + "/" + dir)) {
			if (!entry.is_regular_file())
				continue;
			std::stringstream read;
			read << std::ifstream(entry.path()).rdbuf();
			for (const char* pattern : patterns)
				for (const std::string& style : captures(read.str(), pattern))
					styles.insert(style);
		}
	}
	return styles;
}

// Where the toolkit looks for a group: the light overlay, the screens' theme
// files (added as extensions) and the toolkit's own theme.
bool groupFound(const std::string& group)
{
	std::vector<std::string> files = {edjePath("light.edj"), edjePath("contacts.edj"), edjePath("detail_layout.edj")};
	if (const char* system = elm_theme_list_item_path_get("default", nullptr))
		files.push_back(system);
	for (const std::string& file : files)
		if (edje_file_group_exists(file.c_str(), group.c_str()))
			return true;
	return false;
}

TEST(ThemeGroups, EveryWidgetStyleTheCodeNamesExists)
{
	// Each style with the groups the toolkit loads for it; a widget whose
	// style is missing falls back to the default look (a popup to none).
	auto popup = [](const std::string& style) {
		std::vector<std::string> groups = {"elm/popup/base/" + style, "elm/popup/content/popup/" + style,
			"elm/notify/block_events/popup/" + style, "elm/label/base/popup/" + style,
			"elm/scroller/base/popup/" + style};
		for (const char* part : {"buttons1", "buttons2", "buttons3"})
			groups.push_back(std::string("elm/popup/") + part + "/popup/" + style);
		for (const char* place : {"center", "bottom", "top"})
			groups.push_back(std::string("elm/notify/") + place + "/popup/" + style);
		return groups;
	};
	// The more menu keeps the toolkit's own context-popup look on purpose.
	const std::set<std::string> defaultLook = {"more/default"};
	const std::map<std::string, std::vector<std::string>> known = {
		{"naviframe/title_right", {"elm/button/base/naviframe/title_right"}},
		{"naviframe/title_left", {"elm/button/base/naviframe/title_left"}},
		{"naviframe/back_btn/default", {"elm/button/base/naviframe/back_btn/default"}},
		{"naviframe/more/default", {"elm/button/base/naviframe/more/default"}},
		{"circle", {"elm/button/base/circle"}}, {"transparent", {"elm/button/base/transparent"}},
		{"arrow_btn_with_swallow", {"elm/button/base/arrow_btn_with_swallow"}},
		{"btn_with_swallow", {"elm/button/base/btn_with_swallow"}},
		{"on_gradient_bg", {"elm/button/base/on_gradient_bg"}}, {"bottom", {"elm/button/base/bottom"}},
		{"theme_bg", popup("theme_bg")}, {"toast", popup("toast")}, {"popup", {"elm/genlist/base/popup", "elm/button/base/popup"}}, {"on&off", {"elm/check/base/on&off"}},
		{"favorite_contact", {"elm/check/base/favorite_contact"}}, {"effect", {"elm/scroller/base/effect"}},
		{"pagecontrol", {"elm/index/base/horizontal/pagecontrol", "elm/index/item/horizontal/pagecontrol"}},
		{"wheel", {"elm/progressbar/horizontal/wheel"}},
		{"tabbar_with_title", {"elm/toolbar/base/tabbar_with_title", "elm/toolbar/item/tabbar_with_title"}},
		{"tabbar", {"elm/naviframe/item/tabbar/default"}}, {"basic", {"elm/naviframe/item/basic/default"}},
		{"datetime", {"elm/uiclock/base/default"}},
		// The indicator looks the picture viewer switches between.
		{"indicator", {"elm/layout/indicator/headerbg", "elm/layout/indicator/image/viewer"}},
		{"default", {"elm/radio/base/default", "elm/check/base/default", "elm/button/base/default"}}};
	const std::set<std::string> asked = scanWidgetStyles();
	ASSERT_GE(asked.size(), 5u) << "the scan no longer finds the widget styles";
	for (const std::string& style : asked)
		EXPECT_TRUE(known.count(style) || defaultLook.count(style))
			<< "style \"" << style << "\" is named in the code but not listed here";
	for (const auto& [style, groups] : known)
		for (const std::string& group : groups)
			EXPECT_TRUE(groupFound(group)) << "style " << style << ": no group " << group;
}

TEST(ThemeGroups, SwitchesReachTheirParts)
{
	struct Switch {
		const char *file, *group, *signal, *source, *part, *state;
	};
	const Switch switches[] = {
		{"contacts.edj", "2line.top", "elm,state,selected", "elm", "base", "selected"},
		{"contacts.edj", "2line.top", "elm,state,unselected", "elm", "base", "default"},
		{"contacts.edj", "2line.top", "elm,state,disabled", "elm", "clip", "disabled"},
		{"contacts.edj", "2line.top", "elm,state,enabled", "elm", "clip", "default"},
		{"contacts.edj", "2line.top", "elm,state,bottomline,hide", "", "bottomline", "hidden"},
		{"contacts.edj", "2line.top", "play_sound", "", "base", "selected"}, // a tap flashes the row
		{"contacts.edj", "input.multi.image", "show,2icon", "", "elm.icon.2", "visible"},
		{"contacts.edj", "input.multi.image", "show,2icon", "", "elm.icon.3", "default"},
		{"contacts.edj", "input.multi.image", "show,5icon", "", "elm.icon.5", "visible"},
		{"contacts.edj", "input.multi.image", "show,1icon", "", "elm.icon.2", "default"},
		{"contacts.edj", "input.multi.image", "hide,bg", "", "area.main", "hidden"},
		{"contacts.edj", "input.multi.image", "button,disable", "", "btnclip", "disabled"},
		{"image_layout.edj", "=contacts_btn_ic_call.png", "btn.disable", "image", "image", "dim"},
		{"image_layout.edj", "=contacts_btn_ic_call.png", "btn.enable", "image", "image", "default"},
		{"detail_layout.edj", "linked.1text.8icon", "link,contacts,disable", "", "linkclip", "disabled"},
		{"detail_layout.edj", "linked.1text.8icon", "link,contacts,enable", "", "linkclip", "default"},
		{"contacts.edj", "=layout/basicInfo/callerId", "enable", "touch_area", "touch_area", "enabled"},
		{"contacts.edj", "=layout/basicInfo/callerId", "disable", "touch_area", "touch_area", "default"},
		{"detail_layout.edj", "=list/C/profile/my_profile", "btn.disable", "touch.event.area", "touch.event.area",
			"disabled"},
		// Title-bar buttons on both sides hide with the title; the tab bar too.
		{"light.edj", "=elm/naviframe/item/basic/default", "elm,state,title,hide", "elm", "title_left_btn",
			"title-hidden"},
		{"light.edj", "=elm/naviframe/item/basic/default", "elm,state,title,show", "elm", "title_left_btn", "default"},
		{"light.edj", "=elm/naviframe/item/tabbar/default", "elm,state,title,hide", "elm", "title_right_btn",
			"title-hidden"},
		{"light.edj", "=elm/toolbar/item/tabbar_with_title", "elm,state,selected", "elm", "bar", "selected"},
		{"light.edj", "=elm/toolbar/item/tabbar_with_title", "elm,state,unselected", "elm", "bar", "default"},
		{"light.edj", "=elm/check/base/on&off", "elm,state,check,on", "elm", "knob", "on"},
		{"light.edj", "=elm/check/base/on&off", "elm,state,disabled", "elm", "clip", "disabled"},
		{"light.edj", "=elm/button/base/naviframe/title_right", "elm,state,disabled", "elm", "clip", "disabled"},
		{"light.edj", "=elm/popup/base/theme_bg", "elm,state,title_area,visible", "elm", "title_area", "visible"},
		{"light.edj", "=elm/popup/base/theme_bg", "elm,state,action_area,visible", "elm", "elm.swallow.action_area",
			"visible"},
	};
	EdjeCanvas canvas;
	Evas_Object* obj = nullptr;
	std::string shown;
	for (const Switch& s : switches) {
		// Consecutive rows of one group drive the same object, in order.
		const std::string group = s.group[0] == '=' ? std::string(s.group + 1) : item(s.group);
		SCOPED_TRACE(group + " " + s.signal);
		if (group != shown) {
			obj = canvas.load(s.file, group);
			shown = group;
		}
		ASSERT_NE(obj, nullptr);
		EXPECT_EQ(stateAfter(obj, s.signal, s.source, s.part), s.state);
	}
}
