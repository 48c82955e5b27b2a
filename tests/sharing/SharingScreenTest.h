// Headless profile-sharing screens: a fresh settings state per test (no
// stored choices, network up, one SIM), the host's look, usage-log and launch
// records, and a place for screenshots.
#pragma once

#include "../data/myprofile/MyProfileTestStore.h"

#include "AppControlRouter.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "CtCommonWidgetUtil.h"
#include "CtLightTheme.h"
#include "CtProfileSharingRow.h"
#include "CtThemeMgr.h"
#include "CtView.h"
#include "ScreenHarness.h"
#include "TempDataDir.h"
#include "UsageLog.h"
#include "WView.h"

#include <app_preference.h>
#include <vconf.h>

#include <cstdlib>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

namespace ct::test {

// A plain screen with a genlist, for rows appended by a control.
class ListHostView : public app_assist::WView {
public:
	const char* getClassName() override { return "ListHostView"; }
	Evas_Object* genlist = nullptr;

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		for (const char* edj : {"contacts/contacts.edj", "contacts/detail_layout.edj"}) {
			std::string path;
			ContactsCommon::getAppEdjePath(edj, path, true);
			CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
		}
		genlist = elm_genlist_add(parent);
		CtThemeMgr::getInstance()->setObjectTheme(genlist);
		elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
		evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
		evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
		return genlist;
	}
};

class SharingScreenTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		CtView::changeLanguage("en_US.UTF-8");
		CtLightTheme::apply();
		preference_remove_all();
		removeProfiles();
		setNetwork(true);
		setSimInserted(true);
		ScreenHarness::clearNotices();
		appcontrol::clearLaunches();
		m_registration = appcontrol::registerAppHandler(CONTACTS_LIST_APP_ID,
			[](app_control_h, const appcontrol::Reply&) { return 0; });
		m_screen = std::make_unique<ScreenHarness>(360, 640);
	}
	void TearDown() override
	{
		m_screen.reset();
		CtLightTheme::remove();
		contacts_disconnect();
	}

	static void removeProfiles()
	{
		contacts_list_h list = nullptr;
		if (contacts_db_get_all_records(_contacts_my_profile._uri, 0, 0, &list) != CONTACTS_ERROR_NONE)
			return;
		std::vector<int> ids;
		contacts_record_h record = nullptr;
		while (contacts_list_get_current_record_p(list, &record) == CONTACTS_ERROR_NONE && record) {
			int id = 0;
			contacts_record_get_int(record, _contacts_my_profile.id, &id);
			ids.push_back(id);
			if (contacts_list_next(list) != CONTACTS_ERROR_NONE)
				break;
		}
		contacts_list_destroy(list, true);
		for (int id : ids)
			contacts_db_delete_record(_contacts_my_profile._uri, id);
	}

	// A PNG of one colour, `size` pixels square.
	std::string writePicture(const char* name, int r, int g, int b, int size = 200)
	{
		std::string path = m_dir.file(name);
		Evas_Object* image = evas_object_image_filled_add(evas_object_evas_get(m_screen->win()));
		evas_object_image_size_set(image, size, size);
		evas_object_image_alpha_set(image, EINA_FALSE);
		auto* pixels = static_cast<uint32_t*>(evas_object_image_data_get(image, EINA_TRUE));
		for (int i = 0; i < size * size; ++i)
			pixels[i] = 0xff000000u | (r << 16) | (g << 8) | b;
		evas_object_image_data_set(image, pixels);
		evas_object_image_save(image, path.c_str(), nullptr, nullptr);
		evas_object_del(image);
		return path;
	}

	static void setNetwork(bool up) { vconf_set_int(CT_NETWORK_STATUS_KEY, up ? 1 : 0); }
	static void setSimInserted(bool inserted)
	{
		vconf_set_int("db/telephony/sim_power_state1", inserted ? 1 : 0);
		vconf_set_int("db/telephony/sim_power_state2", 0);
	}

	static std::vector<usagelog::Record> usage(const std::string& feature)
	{
		std::vector<usagelog::Record> out;
		for (const usagelog::Record& record : usagelog::records())
			if (record.feature == feature)
				out.push_back(record);
		return out;
	}

	static std::vector<CtProfileSharingRow*> rows(Evas_Object* genlist)
	{
		return ScreenHarness::rowsOf<CtProfileSharingRow>(genlist);
	}

	// A finger on the switch: it flips, then tells its listeners. Returns
	// whether it could be touched.
	static bool toggle(Evas_Object* check)
	{
		if (!check || ScreenHarness::isDisabled(check))
			return false;
		elm_check_state_set(check, !elm_check_state_get(check));
		evas_object_smart_callback_call(check, "changed", nullptr);
		return true;
	}

	static bool isOn(Evas_Object* check) { return check && elm_check_state_get(check); }

	// Launches of the contacts picker.
	static int pickerLaunches()
	{
		int count = 0;
		for (const appcontrol::LaunchRecord& launch : appcontrol::launches())
			if (launch.appId == CONTACTS_LIST_APP_ID)
				++count;
		return count;
	}

	void shot(const std::string& name)
	{
		const char* dir = getenv("CONTACTS_TEST_BIN_DIR");
		std::string folder = std::string(dir ? dir : "/tmp") + "/test-output/sharing";
		std::filesystem::create_directories(folder);
		m_screen->pumpUntilIdle();
		EXPECT_TRUE(m_screen->savePng(folder + "/" + name + ".png"));
	}

	TempDataDir m_dir;
	std::unique_ptr<ScreenHarness> m_screen;
	appcontrol::Registration m_registration;
};

} // namespace ct::test
