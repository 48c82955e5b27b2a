// The storage chooser, headless: which storages are offered for SIM power,
// the launch type and power saving, their texts and order, choosing one,
// and a SIM switched on while the chooser is open.
#include "../../data/detail/DetailTestStore.h"

#include "CtAddressbookPopup.h"
#include "CtView.h"
#include "ScreenHarness.h"

#include <vconf.h>

#include <filesystem>

using namespace ct::test;

namespace {

struct Shown {
	std::string style;
	std::string main;
	std::string sub;
	bool operator==(const Shown& o) const { return style == o.style && main == o.main && sub == o.sub; }
};

std::ostream& operator<<(std::ostream& os, const Shown& s)
{
	return os << "{" << s.style << ", " << s.main << ", " << s.sub << "}";
}

class CtAddressbookPopupTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		m_screen = std::make_unique<ScreenHarness>(360, 640);
		CtView::changeLanguage("en_US.UTF-8");
		m_host = new HostView;
		ASSERT_TRUE(m_screen->push(m_host));
		setVconf(0, 0, 0);
		vconf_set_str(VCONFKEY_SETAPPL_SIM1_NAME, "");
		vconf_set_str(VCONFKEY_SETAPPL_SIM2_NAME, "");
		m_sim1 = bookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
		if (m_sim1 < 0)
			m_sim1 = addAddressbook(CONTACTS_SIM1_ADDRESS_BOOK_NAME, 0, 0, CONTACTS_SIM1_PROVIDER_NAME);
		m_sim2 = addAddressbook(CONTACTS_SIM2_ADDRESS_BOOK_NAME, 0, 0, CONTACTS_SIM2_PROVIDER_NAME);
		m_account = addAddressbook("mail", 0, 7, "Mail");
		m_readOnly = addAddressbook("news", 1, 8, "News");
	}
	void TearDown() override
	{
		m_screen.reset();
		setVconf(0, 0, 0);
		contacts_disconnect();
	}

	class HostView : public app_assist::WView {
	protected:
		Evas_Object* onCreate(Evas_Object* parent, void*) override { return elm_box_add(parent); }
	};

	static int bookId(const char* name)
	{
		contacts_list_h list = nullptr;
		contacts_db_get_all_records(_contacts_address_book._uri, 0, 0, &list);
		int found = -1, count = 0;
		contacts_list_get_count(list, &count);
		for (int i = 0; i < count; ++i, contacts_list_next(list)) {
			contacts_record_h book = nullptr;
			contacts_list_get_current_record_p(list, &book);
			char* text = nullptr;
			contacts_record_get_str_p(book, _contacts_address_book.name, &text);
			if (text && !strcmp(text, name))
				contacts_record_get_int(book, _contacts_address_book.id, &found);
		}
		contacts_list_destroy(list, true);
		return found;
	}
	static void setVconf(int sim1, int sim2, int powerSaving)
	{
		vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, sim1);
		vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, sim2);
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, powerSaving);
	}

	CtAddressbookPopup* open(int inputType, int selectedId = 0)
	{
		m_popup = new CtAddressbookPopup(inputType, selectedId);
		m_popup->setOnResultCb([this](int id) { m_results.push_back(id); });
		m_popup->setTitle("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB");
		m_popup->setTextTranslatable("contacts");
		m_popup->attachToView(m_host);
		m_alive = m_popup->getWeakPtr();
		m_screen->pumpUntilIdle();
		return m_popup;
	}
	std::vector<Elm_Object_Item*> items() const { return ScreenHarness::genlistItems(m_popup->getGenlist()); }
	std::vector<std::string> mains() const
	{
		std::vector<std::string> out;
		for (const Shown& s : shown())
			out.push_back(s.main);
		return out;
	}
	std::vector<Shown> shown() const
	{
		std::vector<Shown> out;
		for (Elm_Object_Item* item : items()) {
			std::string style = ScreenHarness::itemStyle(item);
			if (style == "1line")
				out.push_back({ style, ScreenHarness::itemText(item, "elm.text.main.left"), "" });
			else
				out.push_back({ style, ScreenHarness::itemText(item, "elm.text.main.left.top"),
					ScreenHarness::itemText(item, "elm.text.sub.left.bottom") });
		}
		return out;
	}
	int radioValue() const
	{
		auto* group = static_cast<Evas_Object*>(evas_object_data_get(m_popup->getGenlist(), "radioGroup"));
		return group ? elm_radio_value_get(group) : -99;
	}

	TempDataDir m_dir;
	std::unique_ptr<ScreenHarness> m_screen;
	HostView* m_host = nullptr;
	CtAddressbookPopup* m_popup = nullptr;
	std::weak_ptr<app_assist::WControl> m_alive;
	std::vector<int> m_results;
	int m_sim1 = -1, m_sim2 = -1, m_account = -1, m_readOnly = -1;
};

TEST_F(CtAddressbookPopupTest, StoragesFollowSimPowerLaunchTypeAndPowerSaving)
{
	struct Case {
		int sim1, sim2, powerSaving, inputType;
		std::vector<std::string> expected;
	};
	const Case cases[] = {
		{ 0, 0, 0, -1, { "Device", "Mail" } },
		{ 0, 1, 0, -1, { "Device", "SIM card", "Mail" } },
		{ 1, 1, 0, -1, { "Device", "SIM card", "SIM card", "Mail" } },
		{ 1, 1, 0, 41, { "Device", "Mail" } },
		{ 1, 0, 1, -1, { "Device", "SIM card" } },
		{ 0, 0, 1, 41, { "Device" } },
	};
	for (const Case& c : cases) {
		setVconf(c.sim1, c.sim2, c.powerSaving);
		open(c.inputType);
		EXPECT_EQ(c.expected, mains()) << c.sim1 << c.sim2 << c.powerSaving << " type " << c.inputType;
		m_popup->destroy();
		m_screen->pumpUntilIdle();
	}
}

TEST_F(CtAddressbookPopupTest, OnlySecondSimWhenFirstIsOffWithItsName)
{
	setVconf(0, 1, 0);
	vconf_set_str(VCONFKEY_SETAPPL_SIM2_NAME, "Work line");
	open(-1);
	std::vector<Shown> expected = { { "1line", "Device", "" }, { "2line.top", "SIM card", "Work line" },
		{ "2line.top", "Mail", "user@example.com" } };
	EXPECT_EQ(expected, shown());
}

TEST_F(CtAddressbookPopupTest, FirstSimComesFirstWhateverTheBookOrder)
{
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_address_book._uri, m_sim1));
	m_sim1 = addAddressbook(CONTACTS_SIM1_ADDRESS_BOOK_NAME, 0, 0, CONTACTS_SIM1_PROVIDER_NAME);
	ASSERT_GT(m_sim1, m_sim2);
	setVconf(1, 1, 0);
	vconf_set_str(VCONFKEY_SETAPPL_SIM1_NAME, "First");
	vconf_set_str(VCONFKEY_SETAPPL_SIM2_NAME, "Second");
	open(-1, m_sim1);
	auto rows = shown();
	ASSERT_EQ(4u, rows.size());
	EXPECT_EQ("First", rows[1].sub) << "the first SIM takes the place of the second";
	EXPECT_EQ("Mail", rows[2].main);
	EXPECT_EQ("Second", rows[3].sub);
	EXPECT_EQ(1, radioValue()) << "the chosen first SIM is the second row";
}

TEST_F(CtAddressbookPopupTest, ChoosingAStorageReportsItAndStaysOpen)
{
	setVconf(1, 0, 0);
	open(-1, 0);
	EXPECT_EQ(0, radioValue());
	auto list = items();
	ASSERT_EQ(3u, list.size());
	ScreenHarness::selectItem(list[2]);
	m_screen->pumpFrames(2);
	EXPECT_EQ(std::vector<int>({ m_account }), m_results);
	EXPECT_EQ(m_account, m_popup->getSelectedId());
	EXPECT_EQ(2, radioValue());
	EXPECT_FALSE(m_alive.expired());
	EXPECT_FALSE(elm_genlist_item_selected_get(list[2]));
}

TEST_F(CtAddressbookPopupTest, SimSwitchedOnWhileOpenAppearsAndOffDisappears)
{
	open(-1);
	EXPECT_EQ(std::vector<std::string>({ "Device", "Mail" }), mains());
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, 1);
	EXPECT_TRUE(m_screen->pumpUntil([&] { return items().size() == 3; }));
	EXPECT_EQ(std::vector<std::string>({ "Device", "SIM card", "Mail" }), mains());
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, 0);
	EXPECT_TRUE(m_screen->pumpUntil([&] { return items().size() == 2; }));
}

TEST_F(CtAddressbookPopupTest, ScreenshotOfTheChooser)
{
	setVconf(1, 1, 0);
	vconf_set_str(VCONFKEY_SETAPPL_SIM1_NAME, "Personal");
	open(-1, 0);
	m_screen->pumpUntilIdle();
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/input";
	std::filesystem::create_directories(dir);
	EXPECT_TRUE(m_screen->savePng(dir + "/storage_popup.png"));
}

} // namespace
