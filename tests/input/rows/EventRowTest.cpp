// The event row: dates with and without year, birthday offered once, the
// date popup with the lunar calendar, and impossible stored dates.
#include "InputRowTestSupport.h"

#include "CtInputViewEventItem.h"
#include "DatePickerProbe.h"

#include <ui_extension.h>

using namespace ct::test;

namespace {

using Strings = std::vector<std::string>;

contacts_record_h addEvent(contacts_record_h contact, int date, int type, int calendar = 0, bool leap = false)
{
	contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
	contacts_record_set_int(event, _contacts_event.date, date);
	contacts_record_set_int(event, _contacts_event.type, type);
	contacts_record_set_int(event, _contacts_event.calendar_type, calendar);
	contacts_record_set_bool(event, _contacts_event.is_leap_month, leap);
	return event;
}

class EventRowTest : public InputRowTest {
protected:
	void SetUp() override
	{
		InputRowTest::SetUp();
		vconf_set_str(VCONFKEY_REGIONFORMAT, "en_US.UTF-8");
		vconf_set_int(VCONFKEY_REGIONFORMAT_TIME1224, 1);
		vconf_set_str(VCONFKEY_CSC_COUNTRY_ISO, "US");
	}
	// Shows one row per stored event of the contact, sharing the birthday flag.
	std::vector<CtInputViewEventItem*> showEvents(int contactId)
	{
		m_data = edit(contactId);
		Eina_List* events = m_data->getEventList();
		void* record;
		std::vector<CtInputViewEventItem*> rows;
		EINA_LIST_FREE(events, record) {
			auto event = static_cast<contacts_record_h>(record);
			*m_hasBirthday |= m_data->getDataType(event, _contacts_event.type) == CONTACTS_EVENT_TYPE_BIRTH;
			auto* row = new CtInputViewEventItem(m_data, event, std::to_string(m_data->getEventEvent(event)).c_str(),
					m_hasBirthday, m_calls.callbacks(), [this] { refreshEventRows(); });
			rows.push_back(row);
			show(row);
		}
		return rows;
	}
	void refreshEventRows()
	{
		++m_refreshes;
		for (Elm_Object_Item* item : ScreenHarness::genlistItems(m_view->genlist))
			elm_genlist_item_update(item);
	}
	bool offersBirthday(CtInputViewEventItem* row)
	{
		Strings menu = menuLabels(row->getHoverselObj());
		return std::find(menu.begin(), menu.end(), tr("IDS_PB_OPT_BIRTHDAY")) != menu.end();
	}
	std::string shownDate(const struct tm& tm)
	{
		return std::to_string(tm.tm_year + 1900) + "-" + std::to_string(tm.tm_mon + 1) + "-" + std::to_string(tm.tm_mday);
	}

	std::shared_ptr<CtInputData> m_data;
	std::shared_ptr<bool> m_hasBirthday = std::make_shared<bool>(false);
	int m_refreshes = 0;
};

} // namespace

TEST_F(EventRowTest, DatesShowWithTheYearOrDayAndMonthOnlyAndThePopupOpensOn1902WithoutYear)
{
	contacts_record_h contact = newContact(0, "Ada");
	addEvent(contact, 20230315, CONTACTS_EVENT_TYPE_BIRTH);
	addEvent(contact, 315, CONTACTS_EVENT_TYPE_ANNIVERSARY);
	auto rows = showEvents(store(contact));
	ASSERT_EQ(2u, rows.size());
	EXPECT_EQ("March 15, 2023", ScreenHarness::buttonLabel(rows[0]->getDateButton()));
	EXPECT_EQ("March 15", ScreenHarness::buttonLabel(rows[1]->getDateButton()));
	EXPECT_EQ(tr("IDS_PB_OPT_BIRTHDAY"), ScreenHarness::buttonLabel(rows[0]->getHoverselObj()));

	ASSERT_TRUE(ScreenHarness::click(rows[1]->getDateButton()));
	m_screen->pumpUntilIdle();
	EXPECT_EQ("1902-3-15", shownPickerDate(*m_screen));
	// Without lunar support there is no calendar button.
	EXPECT_EQ(nullptr, m_screen->findButton(tr("IDS_PB_ACBUTTON_SOLAR_ABB")));

	turnPicker(*m_screen, 1984, 2, 30);
	EXPECT_EQ("1984-2-29", shownPickerDate(*m_screen)) << "no 30 February";
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_SK_SET"))));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(19840229, m_data->getEventEvent(rows[1]->getRecord()));
	EXPECT_EQ("February 29, 1984", ScreenHarness::buttonLabel(rows[1]->getDateButton()));
	EXPECT_TRUE(rows[1]->getIsChanged());
	EXPECT_EQ(1, m_calls.changed);
}

TEST_F(EventRowTest, BirthdayIsOfferedOnlyOnTheBirthdayRowUntilItBecomesAnAnniversary)
{
	contacts_record_h contact = newContact(0, "Ada");
	addEvent(contact, 20230315, CONTACTS_EVENT_TYPE_BIRTH);
	addEvent(contact, 20200101, CONTACTS_EVENT_TYPE_OTHER);
	auto rows = showEvents(store(contact));
	ASSERT_EQ(2u, rows.size());
	EXPECT_TRUE(offersBirthday(rows[0]));
	EXPECT_FALSE(offersBirthday(rows[1]));

	ASSERT_TRUE(chooseMenu(rows[0]->getHoverselObj(), tr("IDS_PB_OPT_ANNIVERSARY_ABB")));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_refreshes > 0; }));
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(*m_hasBirthday);
	EXPECT_EQ(CONTACTS_EVENT_TYPE_ANNIVERSARY, m_data->getDataType(rows[0]->getRecord(), _contacts_event.type));
	EXPECT_TRUE(offersBirthday(rows[0]));
	EXPECT_TRUE(offersBirthday(rows[1]));

	ASSERT_TRUE(chooseMenu(rows[1]->getHoverselObj(), tr("IDS_PB_OPT_BIRTHDAY")));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_refreshes > 1; }));
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(*m_hasBirthday);
	EXPECT_FALSE(offersBirthday(rows[0]));
	EXPECT_TRUE(offersBirthday(rows[1]));
}

TEST_F(EventRowTest, LunarDateInALeapMonthKeepsCalendarTypeAndLeapFlagAfterSaving)
{
	vconf_set_str(VCONFKEY_CSC_COUNTRY_ISO, "KR");
	contacts_record_h contact = newContact(0, "Ada");
	addEvent(contact, 20230322, CONTACTS_EVENT_TYPE_BIRTH);
	int contactId = store(contact);
	auto rows = showEvents(contactId);
	ASSERT_TRUE(ScreenHarness::click(rows[0]->getDateButton()));
	m_screen->pumpUntilIdle();
	Evas_Object* toLunar = m_screen->findButton(tr("IDS_PB_ACBUTTON_SOLAR_ABB"));
	ASSERT_NE(nullptr, toLunar);
	ASSERT_TRUE(ScreenHarness::click(toLunar));
	m_screen->pumpUntilIdle();
	ASSERT_NE(nullptr, m_screen->findButton(tr("IDS_PB_ACBUTTON_LUNAR_ABB")));
	// 22 March 2023 is the first day of the leap second month of the lunar year 2023.
	EXPECT_EQ("2023-2-1", shownPickerDate(*m_screen));
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_SK_SET"))));
	m_screen->pumpUntilIdle();
	ASSERT_EQ(CONTACTS_ERROR_NONE, m_data->updateContact());

	reopenStore();
	contacts_record_h saved = readContact(contactId);
	contacts_record_h event = childAt(saved, _contacts_contact.event, 0);
	int date = 0, calendar = 0;
	bool leap = false;
	contacts_record_get_int(event, _contacts_event.date, &date);
	contacts_record_get_int(event, _contacts_event.calendar_type, &calendar);
	contacts_record_get_bool(event, _contacts_event.is_leap_month, &leap);
	EXPECT_EQ(20230201, date);
	EXPECT_EQ(1, calendar);
	EXPECT_TRUE(leap);
	contacts_record_destroy(saved, true);
}

TEST_F(EventRowTest, ImpossibleStoredDatesShowSetDateAndThePopupOpensOnTheNearestRealDay)
{
	vconf_set_str(VCONFKEY_CSC_COUNTRY_ISO, "KR");
	contacts_record_h contact = newContact(0, "Ada");
	addEvent(contact, 0, CONTACTS_EVENT_TYPE_OTHER);
	addEvent(contact, 20230230, CONTACTS_EVENT_TYPE_OTHER);
	// 2024 has no leap month: the stored leap flag cannot hold.
	addEvent(contact, 20240505, CONTACTS_EVENT_TYPE_ANNIVERSARY, 1, true);
	auto rows = showEvents(store(contact));
	ASSERT_EQ(3u, rows.size());
	EXPECT_EQ(tr("IDS_ST_BODY_SET_DATE"), ScreenHarness::buttonLabel(rows[0]->getDateButton()));
	EXPECT_EQ("1902-1-1", shownDate(CtInputViewEventItem::popupStartDate(0)));
	EXPECT_EQ("2023-2-28", shownDate(CtInputViewEventItem::popupStartDate(20230230)));
	EXPECT_EQ("2024-2-29", shownDate(CtInputViewEventItem::popupStartDate(20240231)));
	EXPECT_EQ("1902-1-1", shownDate(CtInputViewEventItem::popupStartDate(-1)));

	ASSERT_TRUE(ScreenHarness::click(rows[2]->getDateButton()));
	m_screen->pumpUntilIdle();
	ASSERT_NE(nullptr, m_screen->findButton(tr("IDS_PB_ACBUTTON_LUNAR_ABB")));
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_SK_SET"))));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(20240505, m_data->getEventEvent(rows[2]->getRecord()));
	EXPECT_EQ(1, m_data->getCalendarType(rows[2]->getRecord()));
	EXPECT_FALSE(m_data->getIsLeapMonth(rows[2]->getRecord()));
}
