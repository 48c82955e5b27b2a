#include "AppControlRouter.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "CtCommonTextUtil.h"
#include "CtCommonWidgetUtil.h"
#include "LogSink.h"
#include "ScreenHarness.h"
#include "../CommonTestSupport.h"

#include <vconf.h>

using namespace ct::test;

namespace {

const char* const kImageEdj = "contacts/image_layout.edj";

class WidgetUtilTest : public ::testing::Test {
protected:
	Evas_Object* parent() { return m_screen.win(); }
	std::string picture(int w, int h)
	{
		std::string path = m_dir.path() + "/pic" + std::to_string(w) + "x" + std::to_string(h) + ".png";
		Evas_Object* image = evas_object_image_filled_add(evas_object_evas_get(parent()));
		evas_object_image_size_set(image, w, h);
		evas_object_image_data_update_add(image, 0, 0, w, h);
		EXPECT_TRUE(evas_object_image_save(image, path.c_str(), nullptr, nullptr));
		evas_object_del(image);
		return path;
	}
	static bool colorClass(Evas_Object* image, int* r, int* g, int* b, int* a)
	{
		int r2, g2, b2, a2, r3, g3, b3, a3;
		return edje_object_color_class_get(elm_image_object_get(image), "ct_icon", r, g, b, a, &r2, &g2, &b2, &a2,
				&r3, &g3, &b3, &a3);
	}

	TempDataDir m_dir;
	ScreenHarness m_screen;
};

void countCb(void* data, Evas_Object*, void*)
{
	++*static_cast<int*>(data);
}

} // namespace

TEST_F(WidgetUtilTest, LayoutComesFromAResourceNameOrAPathAndBadInputGivesNull)
{
	Evas_Object* layout = ctCommonCreateLayout(parent(), "contacts/detail_layout.edj", "list/C/detail/icon");
	ASSERT_NE(nullptr, layout);
	const char* group = nullptr;
	elm_layout_file_get(layout, nullptr, &group);
	EXPECT_STREQ("list/C/detail/icon", group);
	std::string path;
	ASSERT_TRUE(ContactsCommon::getAppEdjePath("contacts/detail_layout.edj", path, true));
	EXPECT_NE(nullptr, ctCommonCreateLayout(parent(), path.c_str(), "layout/multi_image"));

	ct::log::clear();
	EXPECT_EQ(nullptr, ctCommonCreateLayout(nullptr, "contacts/detail_layout.edj", "list/C/detail/icon"));
	EXPECT_EQ(nullptr, ctCommonCreateLayout(parent(), "contacts/missing.edj", "list/C/detail/icon"));
	EXPECT_EQ(nullptr, ctCommonCreateLayout(parent(), "contacts/detail_layout.edj", "no/such/group"));
	EXPECT_EQ(nullptr, ctCommonCreateLayout(parent(), "contacts/detail_layout.edj", nullptr));
	EXPECT_TRUE(ct::log::contains("* Critical * "));
}

TEST_F(WidgetUtilTest, ImageTakesTheColourOfItsCode)
{
	int r, g, b, a, br, bg, bb, ba;
	ASSERT_TRUE(ctCommonGetThemeColor("A03O004", &br, &bg, &bb, &ba));
	Evas_Object* normal = ctCommonCreateImage(parent(), kImageEdj, "contacts_btn_ic_call.png", "A03O004");
	ASSERT_NE(nullptr, normal);
	ASSERT_TRUE(colorClass(normal, &r, &g, &b, &a));
	EXPECT_EQ(std::vector<int>({br, bg, bb, ba}), std::vector<int>({r, g, b, a}));
	// The pressed variant is darker (the detail rows check both variants on their icons).
	ASSERT_TRUE(ctCommonGetThemeColor("A03O004P", &r, &g, &b, &a));
	EXPECT_LT(r + g + b, br + bg + bb);
	for (const char* unknown : {"NOPE", "NOPEP", "P"})
		EXPECT_FALSE(ctCommonGetThemeColor(unknown, &r, &g, &b, &a)) << unknown;
	// An unknown code still gives the image, in its own colours.
	EXPECT_NE(nullptr, ctCommonCreateImage(parent(), kImageEdj, "contacts_btn_ic_call.png", "NOPE"));
	EXPECT_EQ(nullptr, ctCommonCreateImage(parent(), kImageEdj, "no_such.png"));
	EXPECT_EQ(nullptr, ctCommonCreateImage(parent(), "/no/such/file.png", nullptr));
	EXPECT_EQ(nullptr, ctCommonCreateImage(nullptr, kImageEdj, "contacts_btn_ic_call.png"));

	// A plain picture file is tinted as a whole.
	Evas_Object* plain = ctCommonCreateImage(parent(), picture(8, 8).c_str(), nullptr);
	ASSERT_NE(nullptr, plain);
	ASSERT_TRUE(ctCommonSetImageColor(plain, "A03O004"));
	evas_object_color_get(plain, &r, &g, &b, &a);
	EXPECT_EQ(ba, a);
	EXPECT_FALSE(ctCommonSetImageColor(plain, "NOPE"));
}

TEST_F(WidgetUtilTest, SmallPicturesAreLowSizeAndUnreadableOnesAreNot)
{
	EXPECT_TRUE(ctCommonIsLowSizeImage(parent(), picture(120, 120).c_str()));
	EXPECT_TRUE(ctCommonIsLowSizeImage(parent(), picture(900, 100).c_str()));
	EXPECT_FALSE(ctCommonIsLowSizeImage(parent(), picture(720, 540).c_str()));
	EXPECT_FALSE(ctCommonIsLowSizeImage(parent(), "/no/such/picture.png"));
	EXPECT_FALSE(ctCommonIsLowSizeImage(nullptr, picture(10, 10).c_str()));
	EXPECT_FALSE(ctCommonIsLowSizeImage(parent(), nullptr));

	std::string path = picture(100, 80);
	Evas_Object* low = ctCommonCreateMaskImageForLowSizeImage(parent(), path.c_str());
	ASSERT_NE(nullptr, low);
	Eina_Bool up = EINA_TRUE, down = EINA_FALSE;
	elm_image_resizable_get(low, &up, &down);
	EXPECT_FALSE(up);
	Evas_Object* callerId = ctCommonCreateMaskImageForCallerId(parent(), path.c_str(), 56);
	ASSERT_NE(nullptr, callerId);
	EXPECT_TRUE(elm_image_fill_outside_get(callerId));
	EXPECT_EQ(nullptr, ctCommonCreateMaskImageForCallerId(parent(), "", 56));
}

TEST_F(WidgetUtilTest, CheckStateNetworkAndHighlightSwitches)
{
	// The check state is set without a change event.
	Evas_Object* check = elm_check_add(parent());
	int changes = 0;
	evas_object_smart_callback_add(check, "changed", countCb, &changes);
	ctCommonChecktStateSet(check, EINA_TRUE, 0);
	EXPECT_TRUE(elm_check_state_get(check));
	ctCommonChecktStateSet(check, EINA_FALSE, 0);
	EXPECT_FALSE(elm_check_state_get(check));
	EXPECT_EQ(0, changes);
	ctCommonChecktStateSet(nullptr, EINA_TRUE, 0);

	// The network is connected unless the status says off.
	EXPECT_TRUE(ctCommonCheckNetworkEnable());
	for (int status : {0, 2}) {
		ASSERT_EQ(0, vconf_set_int(CT_NETWORK_STATUS_KEY, status));
		EXPECT_EQ(status != 0, ctCommonCheckNetworkEnable());
	}

	// Highlight is off for scripts that join letters.
	{
		EnvScope arabic("LANGUAGE", "ar_AE");
		EXPECT_FALSE(ctCommonCheckHighlightSupported());
	}
	EnvScope english("LANGUAGE", "en_US");
	EXPECT_TRUE(ctCommonCheckHighlightSupported());
}

TEST_F(WidgetUtilTest, ApplicationsAreAvailableWhileTheirHandlersAreRegistered)
{
	auto accept = [](app_control_h, const ct::appcontrol::Reply&) { return 0; };
	std::string maps;
	EXPECT_FALSE(ctCommoncheckEmailAppEnable());
	EXPECT_FALSE(ctCommoncheckAccountAppEnable());
	EXPECT_FALSE(ctCommontGetMapsAppId(maps));
	EXPECT_EQ("", maps);
	{
		auto email = ct::appcontrol::registerOperationHandler(APP_CONTROL_OPERATION_COMPOSE, accept);
		auto account = ct::appcontrol::registerAppHandler(CT_ACCOUNT_APP_ID, accept);
		auto viewer = ct::appcontrol::registerOperationHandler(APP_CONTROL_OPERATION_VIEW, accept);
		EXPECT_TRUE(ctCommoncheckEmailAppEnable());
		EXPECT_TRUE(ctCommoncheckAccountAppEnable());
		EXPECT_TRUE(ctCommontGetMapsAppId(maps));
		EXPECT_EQ(CT_GEO_VIEWER_ID, maps);
		auto mapsApp = ct::appcontrol::registerAppHandler(MAPS_APP_ID, accept);
		EXPECT_TRUE(ctCommontGetMapsAppId(maps));
		EXPECT_EQ(MAPS_APP_ID, maps);
	}
	EXPECT_FALSE(ctCommoncheckEmailAppEnable());
	EXPECT_FALSE(ctCommontGetMapsAppId(maps));
}

TEST_F(WidgetUtilTest, AddAccountStartsTheCheckedApplicationAskingForContactAccounts)
{
	EXPECT_FALSE(ctCommonLaunchAddAccount());
	std::string extras;
	auto account = ct::appcontrol::registerAppHandler("settings-accounts",
		[&](app_control_h request, const ct::appcontrol::Reply&) {
			for (const char* key : {"mode", "capability_filter"}) {
				char* value = nullptr;
				app_control_get_extra_data(request, key, &value);
				extras += std::string(key) + "=" + (value ? value : "") + ";";
				free(value);
			}
			return 0;
		});
	EXPECT_TRUE(ctCommoncheckAccountAppEnable());
	ASSERT_TRUE(ctCommonLaunchAddAccount());
	EXPECT_EQ(extras, "mode=add_account;capability_filter=" ACCOUNT_SUPPORTS_CAPABILITY_CONTACT ";");
}
