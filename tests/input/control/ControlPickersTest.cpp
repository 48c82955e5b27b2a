// The pickers the edit form starts, answered by stand-in applications
// through the app-control router: pictures (copied once per pick, bad
// answers ignored), the ringtone, groups (Base64 id lists), the event date
// with the lunar calendar, and answers that arrive after the form closed.
#include "ControlTestSupport.h"
#include "DatePickerProbe.h"

#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewImportantFieldsItem.h"
#include "CtRegistryMgr.h"

#include <Edje.h>
#include <glib.h>
#include <vconf.h>

#include <filesystem>
#include <fstream>

using namespace ct::test;
namespace fs = std::filesystem;

namespace {

std::vector<std::string> filesIn(const fs::path& folder)
{
	std::vector<std::string> files;
	std::error_code ec;
	for (const auto& entry : fs::directory_iterator(folder, ec))
		files.push_back(entry.path().string());
	return files;
}

std::string base64Ids(const std::vector<int32_t>& ids)
{
	gchar* text = g_base64_encode(reinterpret_cast<const guchar*>(ids.data()), ids.size() * sizeof(int32_t));
	std::string out = text;
	g_free(text);
	return out;
}

std::vector<int32_t> decodeIds(const std::string& text)
{
	gsize length = 0;
	guchar* bytes = g_base64_decode(text.c_str(), &length);
	std::vector<int32_t> ids(length / sizeof(int32_t));
	memcpy(ids.data(), bytes, ids.size() * sizeof(int32_t));
	g_free(bytes);
	return ids;
}

class ControlPickersTest : public InputControlTest {
protected:
	void SetUp() override
	{
		InputControlTest::SetUp();
		const char* res = getenv("CONTACTS_RES_DIR");
		m_pictures[0] = std::string(res ? res : "") + "/images/contacts_ic_linked.png";
		m_pictures[1] = std::string(res ? res : "") + "/images/contacts_ic_ringtone.png";
	}
	void tapPicture()
	{
		Evas_Object* picture = elm_object_item_part_content_get(itemAt("basic"), "elm.icon");
		ASSERT_NE(nullptr, picture);
		elm_layout_signal_emit(picture, "mouse,clicked,1", "touch_area");
		edje_object_message_signal_process(elm_layout_edje_get(picture));
		m_screen->pumpUntilIdle();
	}
	void chooseFromMore(const char* textId)
	{
		openMorePopup();
		ASSERT_TRUE(choosePopupRow(tr(textId)));
	}
	std::string imagePath() const
	{
		const char* path = m_view->getData()->getImagePath();
		return path ? path : "";
	}
	std::vector<int> groupIds() const
	{
		std::vector<int> ids;
		m_view->getData()->getAllGroupsId(ids);
		std::sort(ids.begin(), ids.end());
		return ids;
	}
	std::string lastExtra(const char* key) const
	{
		auto sent = ct::appcontrol::launches();
		return sent.empty() ? "" : sent.back().extra(key);
	}
	std::string m_pictures[2];
};

} // namespace

TEST_F(ControlPickersTest, EachPickedPictureReplacesTheCopyOfTheOneBeforeAndBadAnswersChangeNothing)
{
	standIn(GALLERY_APP_ID);
	open(0);
	tapPicture();
	EXPECT_EQ(3u, popupRows().size());
	for (const std::string& picture : m_pictures) {
		tapPicture();
		ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_FROM_GALLERY_ABB2")));
		EXPECT_EQ("callerid", lastExtra("setas-type"));
		answer(GALLERY_APP_ID, { { APP_CONTROL_DATA_SELECTED, picture } }, { APP_CONTROL_DATA_SELECTED });
		EXPECT_EQ(control()->getCopiedImagePath(), imagePath());
	}
	fs::path folder = fs::path(imagePath()).parent_path();
	EXPECT_EQ((std::vector<std::string>{ imagePath() }), filesIn(folder)) << "one copy: the second";

	std::string notPicture = (folder.parent_path() / "notes.png").string();
	std::ofstream(notPicture) << "not a picture";
	std::string kept = imagePath();
	struct Case {
		const char* name;
		std::map<std::string, std::string> extras;
	} bad[] = {
		{ "no key", {} },
		{ "missing file", { { APP_CONTROL_DATA_SELECTED, "/no/such/picture.png" } } },
		{ "not a picture", { { APP_CONTROL_DATA_SELECTED, notPicture } } },
	};
	for (const Case& c : bad) {
		SCOPED_TRACE(c.name);
		tapPicture();
		EXPECT_EQ(4u, popupRows().size()) << "remove is offered";
		ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_FROM_GALLERY_ABB2")));
		answer(GALLERY_APP_ID, c.extras, { APP_CONTROL_DATA_SELECTED });
		EXPECT_EQ(kept, imagePath());
		EXPECT_EQ(1u, filesIn(folder).size());
	}

	tapPicture();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_REMOVE")));
	EXPECT_EQ("", imagePath());
	EXPECT_TRUE(filesIn(folder).empty()) << "the removed copy is not left behind";

	// A form closed without saving leaves no copy; a saved one keeps it.
	for (bool save : { false, true }) {
		SCOPED_TRACE(save);
		tapPicture();
		ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_FROM_GALLERY_ABB2")));
		answer(GALLERY_APP_ID, { { APP_CONTROL_DATA_SELECTED, m_pictures[0] } }, { APP_CONTROL_DATA_SELECTED });
		std::string copy = imagePath();
		if (save) {
			auto* basic = static_cast<CtInputViewBasicInfoItem*>(rowAt("basic"));
			elm_entry_entry_insert(basic->getFieldEntry(CtInputViewBasicInfoItem::NAME), "Ada");
			m_screen->pumpUntilIdle();
			ASSERT_TRUE(ScreenHarness::click(m_view->getDoneButton()));
			m_screen->pumpUntilIdle();
		}
		close();
		EXPECT_EQ(save, fs::exists(copy));
		if (!save)
			open(0);
	}
}

TEST_F(ControlPickersTest, RingtoneAnswersSetOrClearTheRingtoneAndKeepTheRow)
{
	standIn(RINGTONE_PICKER_APP_ID);
	contacts_record_h contact = newContact(0, "Ada");
	contacts_record_set_str(contact, _contacts_contact.ringtone_path, "/usr/share/sounds/ringtones/a.ogg");
	open(store(contact));
	ScreenHarness::selectItem(itemAt("ringtone"));
	m_screen->pumpUntilIdle();
	EXPECT_EQ("/usr/share/sounds/ringtones/a.ogg", lastExtra("marked_mode"));
	answer(RINGTONE_PICKER_APP_ID, {});
	EXPECT_STREQ("/usr/share/sounds/ringtones/a.ogg", m_view->getData()->getRingtone()) << "an empty answer";
	for (app_control_result_e result : { APP_CONTROL_RESULT_CANCELED, APP_CONTROL_RESULT_FAILED }) {
		ScreenHarness::selectItem(itemAt("ringtone"));
		m_screen->pumpUntilIdle();
		answer(RINGTONE_PICKER_APP_ID, { { "result", "default" } }, {}, result);
		EXPECT_STREQ("/usr/share/sounds/ringtones/a.ogg", m_view->getData()->getRingtone()) << "backed out: " << result;
	}
	EXPECT_FALSE(control()->getIsChanged());

	ScreenHarness::selectItem(itemAt("ringtone"));
	m_screen->pumpUntilIdle();
	answer(RINGTONE_PICKER_APP_ID, { { "result", "default" } });
	EXPECT_EQ(nullptr, m_view->getData()->getRingtone());
	ASSERT_NE(nullptr, itemAt("ringtone")) << "the row stays";
	EXPECT_EQ(tr("IDS_PB_BODY_DEFAULT"), ScreenHarness::itemText(itemAt("ringtone"), "elm.text.main.left.bottom"));
	EXPECT_TRUE(control()->getIsChanged());
	close();

	open(0);
	chooseFromMore("IDS_PB_OPT_RINGTONE");
	EXPECT_EQ("default", lastExtra("marked_mode"));
	answer(RINGTONE_PICKER_APP_ID, { { "result", "/usr/share/sounds/ringtones/b.ogg" } });
	EXPECT_STREQ("/usr/share/sounds/ringtones/b.ogg", m_view->getData()->getRingtone());
	std::vector<std::string> shown = kinds();
	EXPECT_EQ((std::vector<std::string>{ "basic", "number", "ringtone", "buttons" }), shown);
}

TEST_F(ControlPickersTest, GroupAnswersAreBase64IdListsAndBadOnesChangeNothing)
{
	standIn(CONTACTS_LIST_APP_ID);
	int family = addGroup(0, "Family");
	int work = addGroup(0, "Work");
	int gone = addGroup(0, "Gone");
	contacts_db_delete_record(_contacts_group._uri, gone);
	int id = store(newContact(0, "Ada"));
	contacts_group_add_contact(family, id);
	contacts_group_add_contact(work, id);
	open(id);
	struct Case {
		const char* name;
		std::map<std::string, std::string> extras;
		std::vector<int> expected;
		app_control_result_e result = APP_CONTROL_RESULT_SUCCEEDED;
	} cases[] = {
		{ "no key", {}, {} },
		{ "length not a multiple of 4", { { "group_id_list", "AAAAAAA" } }, { family, work } },
		{ "not Base64", { { "group_id_list", "!!!!" } }, { family, work } },
		{ "a deleted group", { { "group_id_list", base64Ids({ gone }) } }, { family, work } },
		{ "backed out", {}, { family, work }, APP_CONTROL_RESULT_CANCELED },
		{ "failed", { { "group_id_list", base64Ids({ work }) } }, { family, work }, APP_CONTROL_RESULT_FAILED },
		{ "one group", { { "group_id_list", base64Ids({ work, gone }) } }, { work } },
	};
	// "No key" clears, so it goes last.
	std::rotate(std::begin(cases), std::begin(cases) + 1, std::end(cases));
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		ScreenHarness::selectItem(itemAt("groups"));
		m_screen->pumpUntilIdle();
		EXPECT_EQ("36", lastExtra("type"));
		std::vector<int32_t> sent = decodeIds(lastExtra("selected_group_id_list"));
		EXPECT_EQ(groupIds().size(), sent.size());
		answer(CONTACTS_LIST_APP_ID, c.extras, {}, c.result);
		EXPECT_EQ(c.expected, groupIds());
		EXPECT_NE(nullptr, itemAt("groups"));
	}
	EXPECT_EQ(tr("IDS_PB_BODY_NOT_ASSIGNED"), ScreenHarness::itemText(itemAt("groups"), "elm.text.main.left.bottom"));
}

TEST_F(ControlPickersTest, LunarEventInALeapMonthIsStoredWithItsLeapFlag)
{
	vconf_set_str(VCONFKEY_CSC_COUNTRY_ISO, "KR");
	open(0);
	chooseFromMore("IDS_PB_OPT_EVENT_HEG_BIRTHDAY_ABB");
	turnPicker(*m_screen, 2023, 3, 22);
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_ACBUTTON_SOLAR_ABB"))));
	m_screen->pumpUntilIdle();
	ASSERT_NE(nullptr, m_screen->findButton(tr("IDS_PB_ACBUTTON_LUNAR_ABB")));
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_SK_SET"))));
	m_screen->pumpUntilIdle();

	EXPECT_EQ((std::vector<std::string>{ "basic", "number", "event", "buttons" }), kinds());
	contacts_record_h event = static_cast<contacts_record_h>(eina_list_data_get(m_view->getData()->getEventList()));
	ASSERT_NE(nullptr, event);
	EXPECT_EQ(20230201, m_view->getData()->getEventEvent(event));
	EXPECT_EQ(1, m_view->getData()->getCalendarType(event));
	EXPECT_TRUE(m_view->getData()->getIsLeapMonth(event));
	EXPECT_FALSE(control()->__checkIsEmpty());
}

TEST_F(ControlPickersTest, AnswersArrivingAfterTheFormClosedChangeNothing)
{
	for (const char* app : { RINGTONE_PICKER_APP_ID, GALLERY_APP_ID, CONTACTS_LIST_APP_ID })
		standIn(app);
	int id = store(newContact(0, "Ada"));
	open(id);
	chooseFromMore("IDS_PB_OPT_RINGTONE");
	ScreenHarness::selectItem(itemAt("groups"));
	m_screen->pumpUntilIdle();
	tapPicture();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_FROM_GALLERY_ABB2")));
	close();
	answer(RINGTONE_PICKER_APP_ID, { { "result", "/usr/share/sounds/ringtones/b.ogg" } });
	answer(CONTACTS_LIST_APP_ID, { { "group_id_list", "" } });
	answer(GALLERY_APP_ID, { { APP_CONTROL_DATA_SELECTED, m_pictures[0] } }, { APP_CONTROL_DATA_SELECTED });
	contacts_record_h stored = readContact(id);
	EXPECT_EQ("", textOf(stored, _contacts_contact.ringtone_path));
	contacts_record_destroy(stored, true);
}

TEST_F(ControlPickersTest, RelationshipPersonAndMapAddressAreWrittenIntoTheirRows)
{
	standIn(MAPS_APP_ID);
	int annabella = store(newContact(0, "Annabella"));
	contacts_record_h contact = newContact(0, "Ada");
	addText(contact, _contacts_contact.relationship, _contacts_relationship._uri, _contacts_relationship.name, "Mother");
	addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, "St James's Square");
	open(store(contact));

	ASSERT_TRUE(ScreenHarness::click(elm_object_item_part_content_get(itemAt("relationship"), "elm.icon.3")));
	m_screen->pumpUntilIdle();
	// The picker the form pushed tells the person and closes.
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_RELATIONSHIP_PERSON, personOf(annabella));
	if (m_screen->topView() != m_view)
		m_screen->topView()->destroy();
	m_screen->pumpUntilIdle();
	contacts_record_h relation = static_cast<contacts_record_h>(eina_list_data_get(m_view->getData()->getRelationshipList()));
	EXPECT_EQ("Annabella", textOf(relation, _contacts_relationship.name));
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_RELATIONSHIP_PERSON, personOf(annabella) + 1000);
	EXPECT_EQ("Annabella", textOf(relation, _contacts_relationship.name)) << "no row waits for a person any more";

	elm_genlist_item_show(itemAt("address"), ELM_GENLIST_ITEM_SCROLLTO_TOP);
	m_screen->pumpUntilIdle();
	ASSERT_TRUE(ScreenHarness::click(elm_object_item_part_content_get(itemAt("address"), "elm.icon.3")));
	m_screen->pumpUntilIdle();
	EXPECT_EQ("St James&apos;s Square", lastExtra("searchByName"));
	answer(MAPS_APP_ID, {});
	char address[256] = {};
	contacts_record_h record = static_cast<contacts_record_h>(eina_list_data_get(m_view->getData()->getAddressList()));
	m_view->getData()->getAddressAddress(record, address, sizeof(address));
	EXPECT_STREQ("St James's Square", address) << "an empty answer";
	ASSERT_TRUE(ScreenHarness::click(elm_object_item_part_content_get(itemAt("address"), "elm.icon.3")));
	m_screen->pumpUntilIdle();
	answer(MAPS_APP_ID, { { APP_CONTROL_DATA_SELECTED, "10 Downing Street" } }, { APP_CONTROL_DATA_SELECTED });
	m_view->getData()->getAddressAddress(record, address, sizeof(address));
	EXPECT_STREQ("10 Downing Street", address);
	EXPECT_TRUE(control()->getIsChanged());
}

TEST_F(ControlPickersTest, PowerSavingEndsTheRingtonePickerAndDisablesTheRow)
{
	bool terminated = false;
	m_registrations.push_back(ct::appcontrol::registerAppHandler(RINGTONE_PICKER_APP_ID,
			[](app_control_h, const ct::appcontrol::Reply&) { return 0; }, [&terminated] { terminated = true; }));
	contacts_record_h contact = newContact(0, "Ada");
	contacts_record_set_str(contact, _contacts_contact.ringtone_path, "/usr/share/sounds/ringtones/a.ogg");
	open(store(contact));
	ScreenHarness::selectItem(itemAt("ringtone"));
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(elm_object_item_disabled_get(itemAt("ringtone")));
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1);
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(terminated);
	EXPECT_TRUE(elm_object_item_disabled_get(itemAt("ringtone")));
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(elm_object_item_disabled_get(itemAt("ringtone")));
}

TEST_F(ControlPickersTest, EventDatePopupStartsTodayAndSetsTheTurnedDateButNo30February)
{
	open(0);
	chooseFromMore("IDS_PB_OPT_EVENT_HEG_BIRTHDAY_ABB");
	time_t now = time(nullptr);
	struct tm today = {};
	localtime_r(&now, &today);
	EXPECT_EQ(std::to_string(today.tm_year + 1900) + "-" + std::to_string(today.tm_mon + 1) + "-"
			+ std::to_string(today.tm_mday), shownPickerDate(*m_screen));
	struct Turn {
		int year, month, day;
		const char* shown;
	};
	for (const Turn& turn : { Turn{ 1999, 12, 31, "1999-12-31" }, Turn{ 2021, 2, 30, "2021-2-28" },
			Turn{ 2024, 2, 30, "2024-2-29" }, Turn{ 2024, 4, 31, "2024-4-30" } }) {
		turnPicker(*m_screen, turn.year, turn.month, turn.day);
		EXPECT_EQ(turn.shown, shownPickerDate(*m_screen));
	}
	// The day follows a later change of the month too.
	turnPicker(*m_screen, 0, 0, 31);
	turnPicker(*m_screen, 0, 2, 0);
	EXPECT_EQ("2024-2-29", shownPickerDate(*m_screen));
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_SK_SET"))));
	m_screen->pumpUntilIdle();
	contacts_record_h event = static_cast<contacts_record_h>(eina_list_data_get(m_view->getData()->getEventList()));
	ASSERT_NE(nullptr, event);
	EXPECT_EQ(20240229, m_view->getData()->getEventEvent(event));
}
