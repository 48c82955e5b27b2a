// The light overlay theme: the toolkit's widgets rendered headless, saved as
// pictures for review, with the colours a person sees checked at a few points.
#include "CtLightTheme.h"
#include "../CommonTestSupport.h"
#include "CtThemeMgr.h"
#include "ContactsCommon.h"
#include "ScreenHarness.h"
#include "WPopup.h"

#include <Ecore_Evas.h>

using namespace ct::test;

namespace {

struct Rgb {
	int r, g, b;
	int luma() const { return (r * 299 + g * 587 + b * 114) / 1000; }
};

Rgb pixelAt(Evas_Object* win, int x, int y)
{
	Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(win));
	int w = 0;
	ecore_evas_geometry_get(ee, nullptr, nullptr, &w, nullptr);
	auto* pixels = static_cast<const unsigned int*>(ecore_evas_buffer_pixels_get(ee));
	unsigned int argb = pixels[y * w + x];
	return {int((argb >> 16) & 0xff), int((argb >> 8) & 0xff), int(argb & 0xff)};
}

// A screen that loads no application theme.
class PlainView : public app_assist::WView {
protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override { return elm_box_add(parent); }
};

// A screen with the toolkit's widgets over an empty list (the detail rows in
// the light look are pictured by the detail rows' own picture test).
class ShowcaseView : public app_assist::WView {
protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		for (const char* name : {"contacts/contacts.edj", "contacts/detail_layout.edj"}) {
			std::string path;
			ContactsCommon::getAppEdjePath(name, path);
			CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
		}
		Evas_Object* box = elm_box_add(parent);
		evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
		Evas_Object* entry = elm_entry_add(box);
		elm_entry_single_line_set(entry, EINA_TRUE);
		elm_object_text_set(entry, "Search");
		pack(box, entry, 0.0);
		Evas_Object* row = elm_box_add(box);
		elm_box_horizontal_set(row, EINA_TRUE);
		for (auto add : {elm_button_add, elm_check_add, elm_radio_add}) {
			Evas_Object* widget = add(row);
			elm_object_text_set(widget, "Choice");
			if (add == elm_check_add)
				elm_check_state_set(widget, EINA_TRUE);
			pack(row, widget, 0.0);
		}
		pack(box, row, 0.0);
		pack(box, elm_genlist_add(box), EVAS_HINT_EXPAND);
		return box;
	}

private:
	static void pack(Evas_Object* box, Evas_Object* obj, double weightY)
	{
		evas_object_size_hint_weight_set(obj, EVAS_HINT_EXPAND, weightY);
		evas_object_size_hint_align_set(obj, EVAS_HINT_FILL, EVAS_HINT_FILL);
		evas_object_show(obj);
		elm_box_pack_end(box, obj);
	}
};

} // namespace

TEST(LightTheme, ToolkitWidgetsAndPopupsLookLight)
{
	CtLightTheme::remove();
	Rgb darkTitle{0, 0, 0};
	{
		ScreenHarness screen(360, 640);
		ASSERT_TRUE(screen.push(new PlainView));
		darkTitle = pixelAt(screen.win(), 180, 5);
	}
	// Screens pick the light look up through the theme manager.
	EXPECT_FALSE(CtLightTheme::isApplied());
	ScreenHarness screen(360, 640);
	auto* view = new ShowcaseView;
	ASSERT_TRUE(screen.push(view));
	EXPECT_TRUE(CtLightTheme::isApplied());
	EXPECT_TRUE(CtLightTheme::apply());
	screen.pumpUntilIdle();
	ASSERT_TRUE(screen.savePng(shotPath("light-widgets")));

	Rgb title = pixelAt(screen.win(), 180, 5);
	EXPECT_LT(darkTitle.luma(), 100);
	EXPECT_GT(title.luma(), 200) << title.r << "," << title.g << "," << title.b;
	Rgb content = pixelAt(screen.win(), 5, 630);
	EXPECT_GT(content.luma(), 200);

	auto* popup = new app_assist::WPopup("Delete", "This contact will be deleted.");
	popup->addButton("Cancel", nullptr);
	popup->addButton("Delete", nullptr);
	popup->attachToView(view);
	screen.pumpUntilIdle();
	ASSERT_TRUE(screen.savePng(shotPath("light-popup")));
	// Popups sit at the bottom of the window.
	EXPECT_GT(pixelAt(screen.win(), 60, 560).luma(), 220);
	CtLightTheme::remove();
	EXPECT_FALSE(CtLightTheme::isApplied());
}

TEST(LightTheme, MissingOverlayKeepsTheDefaultLook)
{
	CtLightTheme::remove();
	EnvScope noResources("CONTACTS_RES_DIR", "/nonexistent-res");
	EXPECT_FALSE(CtLightTheme::apply());
	EXPECT_FALSE(CtLightTheme::isApplied());
	EXPECT_TRUE(ScreenHarness::logContains("contacts/light.edj is missing"));
}
