// The contact detail screen, headless: which rows a person gets and in what
// order, how the screen follows changes of the person, the favourite star,
// power saving and the call-block list, and what bad requests give.
#include "../../data/detail/DetailTestStore.h"
#include "FailingAllocation.h"

#include "AppControlRouter.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDetails.h"
#include "CtDetailData.h"
#include "CtDetailView.h"
#include "CtDetailViewGenlistItem.h"
#include "CtDetailViewNumberItem.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtRegistryMgr.h"
#include "CtSimMgr.h"
#include "LogSink.h"
#include "ScreenHarness.h"

#include <phone_misc.h>
#include <vconf.h>

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>

using namespace ct::test;

namespace {

// Where the screen tests leave pictures for review.
std::string shotPath(const std::string& file)
{
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/detail";
	std::filesystem::create_directories(dir);
	return dir + "/" + file;
}

// A screen pushed above the detail screen.
class CoverView : public app_assist::WView {
public:
	const char* getClassName() override { return "CoverView"; }

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override { return elm_label_add(parent); }
};

// A host launch request around an application-control request the test owns.
struct Launch {
	Launch(const char* operation, const std::map<std::string, std::string>& extras) : owned(request(operation, extras))
	{
		launch.appControl = owned.get();
	}
	CtLaunchRequest* get() { return &launch; }
	Request owned;
	CtLaunchRequest launch;
};

class CtDetailViewTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		m_screen = std::make_unique<ScreenHarness>();
	}
	void TearDown() override
	{
		m_screen.reset();
		contacts_disconnect();
	}

	CtDetailView* show(int personId)
	{
		auto* view = static_cast<CtDetailView*>(createCtDetailView(personId, nullptr));
		EXPECT_TRUE(m_screen->push(view));
		EXPECT_TRUE(m_screen->pumpUntil([view] { return !view->isBuildingRows(); }));
		return view;
	}

	static std::vector<int> kinds(CtDetailView* view)
	{
		std::vector<int> types;
		for (auto* row : ScreenHarness::rowsOf<CtDetailViewGenlistItem>(view->getGenlist()))
			types.push_back(row->getItemType());
		return types;
	}

	static std::vector<CtDetailViewGenlistItem*> rowsOfKind(CtDetailView* view, int kind)
	{
		return ScreenHarness::rowsWhere<CtDetailViewGenlistItem>(view->getGenlist(),
				[kind](CtDetailViewGenlistItem* row) { return row->getItemType() == kind; });
	}

	static Evas_Object* favoriteCheck(CtDetailView* view)
	{
		Evas_Object* layout = elm_object_item_part_content_get(view->getNaviItem(), "title_right_btn");
		return layout ? elm_object_part_content_get(layout, "icon.favorite") : nullptr;
	}

	static void tap(Evas_Object* check)
	{
		elm_layout_signal_emit(check, "mouse,clicked,1", "event");
		edje_object_message_signal_process(elm_layout_edje_get(check));
	}

	// A person with a picture, 2 numbers, an e-mail, 2 addresses, a note,
	// an event, a web site and a ringtone.
	int storeRichPerson()
	{
		contacts_record_h contact = newContact(0, "Mina");
		addNumber(contact, "010-1111-2222", CONTACTS_NUMBER_TYPE_CELL);
		addNumber(contact, "02-333-4444", CONTACTS_NUMBER_TYPE_HOME);
		addEmail(contact, "mina@example.com");
		for (const char* street : {"1 Main St", "2 Side St"})
			addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, street);
		addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "Met at the fair");
		contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.date, 19900315);
		contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
		addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url, "example.com");
		std::string ringtone = m_dir.file("Over_the_horizon.ogg");
		fclose(fopen(ringtone.c_str(), "w"));
		contacts_record_set_str(contact, _contacts_contact.ringtone_path, ringtone.c_str());
		// Stored without a place in the picture order, as an edit form stores it.
		addImage(contact, writePicture("mina.png").c_str());
		return personOf(store(contact));
	}

	std::string writePicture(const char* name)
	{
		std::string path = m_dir.file(name);
		Evas_Object* image = evas_object_image_filled_add(evas_object_evas_get(m_screen->win()));
		evas_object_image_size_set(image, 320, 320);
		// Two colour bands, so a picture shown can be told from none.
		auto* pixels = static_cast<uint32_t*>(evas_object_image_data_get(image, EINA_TRUE));
		for (int i = 0; pixels && i < 320 * 320; ++i)
			pixels[i] = i < 320 * 160 ? 0xFF3C78B4 : 0xFFE8A33C;
		evas_object_image_data_set(image, pixels);
		evas_object_image_save(image, path.c_str(), nullptr, nullptr);
		evas_object_del(image);
		return path;
	}

	TempDataDir m_dir;
	std::unique_ptr<ScreenHarness> m_screen;
};

TEST_F(CtDetailViewTest, PersonIdComesFromTheRequestOnlyWhenNoIdIsGiven)
{
	struct Case {
		const char* operation;
		std::map<std::string, std::string> extras;
		int expected;
	};
	const Case cases[] = {
		{nullptr, {{"person_id", "12"}, {"ct_person_id", "34"}}, 34},
		{APP_CONTROL_OPERATION_DEFAULT, {{"person_id", "12"}}, 12},
		{APP_CONTROL_OPERATION_VIEW, {{APP_CONTROL_DATA_ID, "7"}, {"person_id", "12"}}, 7},
		{APP_CONTROL_OPERATION_VIEW, {}, 0},
		{nullptr, {{"person_id", "twelve"}}, 0},
		{nullptr, {{"person_id", "99999999999999"}}, 0},
		{nullptr, {{"person_id", "-3"}}, -3},
	};
	for (const Case& c : cases) {
		EXPECT_EQ(c.expected, CtDetailView::personIdFromRequest(Launch(c.operation, c.extras).get()))
				<< (c.operation ? c.operation : "none");
	}

	ct::log::clear();
	EXPECT_EQ(0, CtDetailView::personIdFromRequest(Launch(APP_CONTROL_OPERATION_PICK, {{"person_id", "12"}}).get()));
	EXPECT_TRUE(ct::log::contains("* Critical * wrong operation requested " APP_CONTROL_OPERATION_PICK));
	EXPECT_EQ(0, CtDetailView::personIdFromRequest(nullptr));
}

TEST_F(CtDetailViewTest, TheFactoryShowsThePersonTheRequestNamesUnlessAnIdIsGiven)
{
	const std::string first = std::to_string(addSimplePerson("First"));
	const std::string second = std::to_string(addSimplePerson("Second"));
	struct Case {
		int givenId;
		const char* operation;
		std::map<std::string, std::string> extras;
		std::string title; // empty: the screen of no person
	};
	const Case cases[] = {
		{0, nullptr, {{"person_id", first}, {"ct_person_id", second}}, "Second"},
		{0, APP_CONTROL_OPERATION_DEFAULT, {{"person_id", first}}, "First"},
		{0, APP_CONTROL_OPERATION_VIEW, {{APP_CONTROL_DATA_ID, second}, {"person_id", first}}, "Second"},
		{0, APP_CONTROL_OPERATION_VIEW, {{"person_id", first}}, ""},
		{0, APP_CONTROL_OPERATION_PICK, {{"person_id", first}}, ""},
		{std::stoi(first), nullptr, {{"ct_person_id", second}}, "First"},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.title + " " + (c.operation ? c.operation : "none"));
		Launch launch(c.operation, c.extras);
		auto* view = static_cast<CtDetailView*>(createCtDetailView(c.givenId, launch.get()));
		ASSERT_TRUE(m_screen->push(view));
		EXPECT_EQ(c.title.empty() ? 0 : std::stoi(c.title == "First" ? first : second), view->getPersoinId());
		EXPECT_EQ(c.title.empty() ? ContactsCommon::translate("IDS_LOGS_MBODY_UNKNOWN") : c.title, ScreenHarness::naviText(view));
		view->popOut();
		ASSERT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	}
}

TEST_F(CtDetailViewTest, SubtitleShowsPhoneticNameNicknameAndCompanyOnceEach)
{
	struct Case {
		const char* phonetic;
		const char* nickname;
		const char* company;
		std::string subtitle;
	};
	const Case cases[] = {
		{"An", "Annie", "Acme", "An,Annie,Acme"},
		{nullptr, "Dieguito", nullptr, "Dieguito"},
		{"An", nullptr, "Acme", "An,Acme"},
		{nullptr, "Annie", "Acme", "Annie,Acme"},
		{"An", "Annie", nullptr, "An,Annie"},
		{nullptr, nullptr, nullptr, ""},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.subtitle);
		contacts_record_h contact = newContact(0, "Ann");
		contacts_record_h name = nullptr;
		contacts_record_get_child_record_at_p(contact, _contacts_contact.name, 0, &name);
		if (c.phonetic)
			contacts_record_set_str(name, _contacts_name.phonetic_first, c.phonetic);
		if (c.nickname)
			addText(contact, _contacts_contact.nickname, _contacts_nickname._uri, _contacts_nickname.name, c.nickname);
		if (c.company)
			addText(contact, _contacts_contact.company, _contacts_company._uri, _contacts_company.name, c.company);
		CtDetailView* view = show(personOf(store(contact)));
		EXPECT_EQ(c.subtitle, ScreenHarness::naviText(view, "subtitle"));
		view->popOut();
		ASSERT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	}
}

TEST_F(CtDetailViewTest, RowsFollowTheKindOrderSixInTheFirstFrameThenOnePerFrame)
{
	int personId = storeRichPerson();
	auto* view = static_cast<CtDetailView*>(createCtDetailView(personId, nullptr));
	// Row counts in each drawn frame.
	struct Frames {
		CtDetailView* view = nullptr;
		std::vector<size_t> counts;
	} frames;
	Evas* canvas = evas_object_evas_get(m_screen->win());
	Evas_Event_Cb recorder = [](void* data, Evas*, void*) {
		auto* f = static_cast<Frames*>(data);
		if (f->view && f->view->getGenlist())
			f->counts.push_back(kinds(f->view).size());
	};
	evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, recorder, &frames);
	ASSERT_TRUE(m_screen->naviframe()->push(view));
	frames.view = view;
	ASSERT_TRUE(m_screen->pumpUntil([view] { return !view->isBuildingRows(); }));
	m_screen->pumpFrames(2);
	evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, recorder, &frames);
	ASSERT_FALSE(frames.counts.empty());
	EXPECT_EQ(6u, frames.counts.front());
	for (size_t i = 1; i < frames.counts.size(); ++i)
		EXPECT_LE(frames.counts[i] - frames.counts[i - 1], 1u) << "frame " << i;

	const std::vector<int> expected = {DETAIL_ITEM_MULTI_IMAGE, DETAIL_ITEM_NUMBER, DETAIL_ITEM_NUMBER,
		DETAIL_ITEM_VIDEO_CALL, DETAIL_ITEM_EMAIL, DETAIL_ITEM_ADDRESS, DETAIL_ITEM_ADDRESS, DETAIL_ITEM_WEBSITE,
		DETAIL_ITEM_EVENT, DETAIL_ITEM_NOTE, DETAIL_ITEM_RINGTONE, DETAIL_ITEM_LINK};
	EXPECT_EQ(expected, kinds(view));
	char* picture = view->getDetailData()->getImagePath(1);
	EXPECT_NE(nullptr, picture);
	free(picture);
	// Two addresses make rows of different heights.
	EXPECT_FALSE(view->isCompactLayout());
	EXPECT_FALSE(elm_genlist_homogeneous_get(view->getGenlist()));
	EXPECT_NE(nullptr, favoriteCheck(view));
}

TEST_F(CtDetailViewTest, SimContactAndPersonWithoutNumbersGetFewerRows)
{
	int sim = addAddressbook(CONTACTS_SIM1_ADDRESS_BOOK_NAME, 0, 0, CONTACTS_SIM1_PROVIDER_NAME);
	contacts_record_h simContact = newContact(sim, "Taxi");
	addNumber(simContact, "+44 20 7946 0000", CONTACTS_NUMBER_TYPE_CELL);
	contacts_record_set_str(simContact, _contacts_contact.ringtone_path, "/opt/ringtones/Bell.ogg");
	CtDetailView* simView = show(personOf(store(simContact)));
	EXPECT_TRUE(simView->isSimContactView());
	EXPECT_EQ((std::vector<int> {DETAIL_ITEM_NUMBER, DETAIL_ITEM_VIDEO_CALL, DETAIL_ITEM_LINK}), kinds(simView));
	EXPECT_EQ(nullptr, favoriteCheck(simView));

	contacts_record_h plain = newContact(0, "Quiet");
	addText(plain, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "no numbers");
	addText(plain, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, "3 Quiet Lane");
	CtDetailView* plainView = show(personOf(store(plain)));
	EXPECT_EQ((std::vector<int> {DETAIL_ITEM_MULTI_IMAGE, DETAIL_ITEM_ADDRESS, DETAIL_ITEM_NOTE, DETAIL_ITEM_LINK}),
			kinds(plainView));
	// One address and one note keep every row the same height.
	EXPECT_TRUE(elm_genlist_homogeneous_get(plainView->getGenlist()));
}

TEST_F(CtDetailViewTest, ChangesRebuildAtOnceAndOnceMoreAfterTheCoalescingPeriod)
{
	int contactId = 0;
	int personId = addSimplePerson("Burst", &contactId);
	CtDetailView* view = show(personId);
	SignalRecorder signals;

	for (int i = 0; i < 10; ++i) {
		addNumberToStoredContact(contactId, ("010-555-00" + std::to_string(10 + i)).c_str());
		m_screen->pumpFor(0.1);
	}
	EXPECT_EQ(1, view->getRebuildCount());
	ASSERT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() == 2; }, 4.0));
	ASSERT_TRUE(m_screen->pumpUntil([view] { return !view->isBuildingRows(); }));
	EXPECT_EQ(10u, rowsOfKind(view, DETAIL_ITEM_NUMBER).size());
	m_screen->pumpFor(2.2);
	EXPECT_EQ(2, view->getRebuildCount());

	// After a transition the other screens hear that the contact changed,
	// and an input screen left under the detail screen is removed.
	auto* cover = new CoverView();
	ASSERT_TRUE(m_screen->naviframe()->push(cover));
	Evas_Object* naviframe = m_screen->naviframe()->getEvasObj();
	evas_object_data_set(naviframe, "input_navi_item", cover->getNaviItem());
	evas_object_smart_callback_call(naviframe, "transition,finished", nullptr);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, evas_object_data_get(naviframe, "input_navi_item"));
	EXPECT_EQ(1, m_screen->viewCount());
	EXPECT_EQ(1, signals.count(CT_REGISTRY_KEY_CONTACT_DATA_CHANGED));
	EXPECT_EQ(1, signals.count(CT_REGISTRY_KEY_CONTACT_LIST_CHANGED));
}

TEST_F(CtDetailViewTest, DeletingThePersonClosesTheScreenAndThoseAboveIt)
{
	int personId = storeRichPerson();
	show(personId);
	ASSERT_TRUE(m_screen->push(new CoverView()));
	ASSERT_TRUE(m_screen->push(new CoverView()));
	ASSERT_EQ(3, m_screen->viewCount());
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, personId));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));

	// Deleted while its rows are still being added.
	int other = storeRichPerson();
	auto* view = static_cast<CtDetailView*>(createCtDetailView(other, nullptr));
	ASSERT_TRUE(m_screen->naviframe()->push(view));
	ASSERT_TRUE(view->isBuildingRows());
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, other));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
}

TEST_F(CtDetailViewTest, FavouriteTapsSettleIntoOneSignalWithoutRebuilding)
{
	int personId = addSimplePerson("Star");
	CtDetailView* view = show(personId);
	Evas_Object* check = favoriteCheck(view);
	ASSERT_NE(nullptr, check);
	EXPECT_FALSE(elm_check_state_get(check));
	SignalRecorder signals;

	tap(check);
	m_screen->pumpFor(0.3);
	EXPECT_TRUE(CtDetailData(personId).isFavorite());
	tap(check);
	m_screen->pumpFor(0.5);
	EXPECT_EQ(0, signals.count(CT_REGISTRY_KEY_FAVORITE_CHANGED));
	ASSERT_TRUE(m_screen->pumpUntil([&] { return signals.count(CT_REGISTRY_KEY_FAVORITE_CHANGED) > 0; }, 2.0));
	m_screen->pumpFor(0.5);
	EXPECT_EQ(1, signals.count(CT_REGISTRY_KEY_FAVORITE_CHANGED));
	EXPECT_EQ(0, view->getRebuildCount());
	EXPECT_FALSE(CtDetailData(personId).isFavorite());
}

TEST_F(CtDetailViewTest, TheStarShowsTheStoredStateAfterEveryRebuild)
{
	int personId = addSimplePerson("Star");
	CtDetailView* view = show(personId);
	ASSERT_NE(nullptr, favoriteCheck(view));
	EXPECT_FALSE(elm_check_state_get(favoriteCheck(view)));

	// Made a favourite elsewhere (another screen, another process).
	CtDetailData(personId).setFavorite(true);
	ASSERT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() == 1; }, 4.0));
	ASSERT_NE(nullptr, favoriteCheck(view));
	EXPECT_TRUE(elm_check_state_get(favoriteCheck(view)));

	// So the next tap does what the user sees: it takes the star away.
	tap(favoriteCheck(view));
	m_screen->pumpUntilIdle();
	EXPECT_FALSE(elm_check_state_get(favoriteCheck(view)));
	EXPECT_FALSE(CtDetailData(personId).isFavorite());
}

// The picture shown in a picture row: the file of its image (an edje file
// for the default silhouette).
std::string shownPicture(CtDetailViewGenlistItem* row)
{
	Evas_Object* layout = elm_object_item_part_content_get(row->getElmObjectItem(), "elm.icon");
	Evas_Object* image = layout ? elm_object_part_content_get(layout, "elm.swallow.content") : nullptr;
	const char* file = nullptr;
	if (image)
		elm_image_file_get(image, &file, nullptr);
	return file ? file : "";
}

TEST_F(CtDetailViewTest, ADirectoryEntryShowsItsPictureAndNoStar)
{
	std::string picture = writePicture("gal.png");
	CtGalSearchData gal = {nullptr, picture.c_str(), "Gal Person", "0201234567", nullptr, "02 555 0188",
		"gal@example.com", "Corp"};
	auto* view = static_cast<CtDetailView*>(createCtDetailViewForGalSearch(&gal));
	// At the phone's size, in English and with the host's title colour, saved for review.
	m_screen = std::make_unique<ScreenHarness>(360, 640);
	CtView::changeLanguage("en_US.UTF-8");
	for (const char* text : {"/fg/normal/naviframe/text/title", "/fg/normal/naviframe/text/subtitle"})
		edje_color_class_set(text, 31, 35, 40, 255, 0, 0, 0, 0, 0, 0, 0, 0);
	ASSERT_TRUE(m_screen->push(view));
	EXPECT_TRUE(m_screen->savePng(shotPath("directory-entry.png")));
	for (const char* text : {"/fg/normal/naviframe/text/title", "/fg/normal/naviframe/text/subtitle"})
		edje_color_class_del(text);
	auto pictures = rowsOfKind(view, DETAIL_ITEM_MULTI_IMAGE);
	ASSERT_EQ(1u, pictures.size());
	EXPECT_EQ(picture, shownPicture(pictures[0]));
	EXPECT_EQ(picture, pictures[0]->getCopyText());
	EXPECT_EQ(nullptr, favoriteCheck(view));
	EXPECT_EQ("Corp", ScreenHarness::naviText(view, "subtitle"));
}

TEST_F(CtDetailViewTest, EventsWhoseStoredDateIsNoCalendarDateAreNotShown)
{
	contacts_record_h contact = newContact(0, "Dates");
	// No year, month 7, day 0; February 30; a month 13; a real date.
	for (int date : {700, 19900230, 20011315, 19900315, 229}) {
		contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.date, date);
		contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	}
	ct::log::clear();
	CtDetailView* view = show(personOf(store(contact)));
	auto events = rowsOfKind(view, DETAIL_ITEM_EVENT);
	std::vector<std::string> shown;
	for (auto* row : events)
		shown.push_back(ScreenHarness::itemText(row->getElmObjectItem(), "elm.text.main.left.bottom"));
	CtDetailData* data = view->getDetailData();
	// February 29 without a year is a birthday some years have.
	EXPECT_EQ((std::vector<std::string>{CtCommonGetDatetimeStr(data->getTimeFormatter(), 1990, 3, 15),
				  CtCommonGetDatetimeStr(data->getTimeFormatterWithoutYear(), 0, 2, 29)}),
			shown);
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid date(mon=7,day=0)"));
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid date(mon=2,day=30)"));
}

TEST_F(CtDetailViewTest, AnAllocationFailureWhileLoadingThePersonLeavesNoSettingsListenerBehind)
{
	int personId = addSimplePerson("Spare");
	size_t listeners = CtRegistryMgr::getInstance()->getVconfListenerCount(VCONFKEY_SETAPPL_PSMODE);
	failNextAllocationOf(sizeof(CtDetailData));
	EXPECT_THROW(createCtDetailView(personId, nullptr), std::bad_alloc);
	failNextAllocationOf(0);
	EXPECT_EQ(listeners, CtRegistryMgr::getInstance()->getVconfListenerCount(VCONFKEY_SETAPPL_PSMODE));
	// A change of the setting reaches no half-built screen.
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1);
	m_screen->pumpUntilIdle();
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);

	// The next screen is built as usual.
	CtDetailView* view = show(personId);
	EXPECT_EQ("Spare", ScreenHarness::naviText(view));
	EXPECT_EQ(listeners + 1, CtRegistryMgr::getInstance()->getVconfListenerCount(VCONFKEY_SETAPPL_PSMODE));
}

// The PNG of the screen of a person with just a name, saved for review.
std::string shotOfPersonNamed(ScreenHarness& screen, CtDetailView* view, const std::string& file)
{
	std::string path = shotPath(file);
	EXPECT_TRUE(screen.savePng(path));
	view->popOut();
	screen.pumpUntil([&screen] { return screen.viewCount() == 0; });
	std::ifstream in(path, std::ios::binary);
	return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

TEST_F(CtDetailViewTest, ChineseAndKoreanNamesAreDrawnInTheirOwnLetters)
{
	// The title in the host's dark text colour (the toolkit's own is white).
	edje_color_class_set("/fg/normal/naviframe/text/title", 31, 35, 40, 255, 0, 0, 0, 0, 0, 0, 0, 0);
	// Names of as many letters: drawn as boxes (no font has the letters),
	// two names give the same picture.
	const std::pair<const char*, const char*> pairs[] = {{"王芳", "李娜"}, {"김민준", "이서연"}};
	int shot = 0;
	for (const auto& [first, second] : pairs) {
		SCOPED_TRACE(first);
		CtDetailView* view = show(addSimplePerson(first));
		ASSERT_EQ(first, ScreenHarness::naviText(view));
		std::string firstShot = shotOfPersonNamed(*m_screen, view, "script-name-" + std::to_string(++shot) + ".png");
		view = show(addSimplePerson(second));
		std::string secondShot = shotOfPersonNamed(*m_screen, view, "script-name-" + std::to_string(++shot) + ".png");
		ASSERT_FALSE(firstShot.empty());
		EXPECT_TRUE(firstShot != secondShot) << "the same picture for " << first << " and " << second;
	}
	edje_color_class_del("/fg/normal/naviframe/text/title");
}

TEST_F(CtDetailViewTest, PowerSavingDisablesVideoCallEmailAndAddressRowsWhileOn)
{
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1);
	CtDetailView* view = show(storeRichPerson());
	auto affected = [view] {
		std::vector<CtDetailViewGenlistItem*> rows;
		for (int kind : {DETAIL_ITEM_VIDEO_CALL, DETAIL_ITEM_EMAIL, DETAIL_ITEM_ADDRESS})
			for (auto* row : rowsOfKind(view, kind))
				rows.push_back(row);
		return rows;
	};
	auto allDisabled = [&](bool disabled) {
		for (auto* row : affected())
			if (elm_object_item_disabled_get(row->getElmObjectItem()) != disabled)
				return false;
		return true;
	};
	ASSERT_EQ(4u, affected().size());
	EXPECT_TRUE(allDisabled(true));
	for (auto* row : rowsOfKind(view, DETAIL_ITEM_NUMBER))
		EXPECT_FALSE(elm_object_item_disabled_get(row->getElmObjectItem()));

	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
	EXPECT_TRUE(m_screen->pumpUntil([&] { return allDisabled(false); }));
}

TEST_F(CtDetailViewTest, BlockingANumberMarksItsRowWithoutARebuild)
{
	CtDetailView* view = show(storeRichPerson());
	auto numbers = ScreenHarness::rowsOf<CtDetailViewNumberItem>(view->getGenlist());
	ASSERT_EQ(2u, numbers.size());
	EXPECT_FALSE(numbers[0]->isBlocked());

	phone_misc_h blockList = nullptr;
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_connect(&blockList));
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_block_add(blockList, PHONE_MISC_BLOCK_TYPE_CALL, "01011112222"));
	auto blockMark = [&] {
		m_screen->pumpUntilIdle();
		return elm_object_item_part_content_get(numbers[0]->getElmObjectItem(), "elm.icon.left.bottom");
	};
	EXPECT_TRUE(m_screen->pumpUntil([&] { return numbers[0]->isBlocked(); }));
	EXPECT_NE(nullptr, blockMark());
	EXPECT_FALSE(numbers[1]->isBlocked());
	EXPECT_EQ(0, view->getRebuildCount());

	phone_misc_block_remove(blockList, PHONE_MISC_BLOCK_TYPE_CALL, "01011112222");
	EXPECT_TRUE(m_screen->pumpUntil([&] { return !numbers[0]->isBlocked(); }));
	EXPECT_EQ(nullptr, blockMark());
	phone_misc_disconnect(blockList);
}

// The "ct_icon" colour class of the call icon of a number row, as r,g,b.
std::string callIconColor(CtDetailViewNumberItem* row)
{
	Evas_Object* layout = elm_object_item_part_content_get(row->getElmObjectItem(), "elm.icon.2");
	Evas_Object* button = layout ? elm_object_part_content_get(layout, "elm.icon1") : nullptr;
	Evas_Object* image = button ? elm_object_content_get(button) : nullptr;
	Evas_Object* edje = image ? elm_image_object_get(image) : nullptr;
	int c[12] = {};
	if (!edje || !edje_object_color_class_get(edje, "ct_icon", &c[0], &c[1], &c[2], &c[3], &c[4], &c[5], &c[6],
			&c[7], &c[8], &c[9], &c[10], &c[11]))
		return "none";
	return std::to_string(c[0]) + "," + std::to_string(c[1]) + "," + std::to_string(c[2]);
}

std::string themeColor(const char* code)
{
	int r = -1, g = -1, b = -1, a = -1;
	EXPECT_TRUE(ctCommonGetThemeColor(code, &r, &g, &b, &a)) << code;
	return std::to_string(r) + "," + std::to_string(g) + "," + std::to_string(b);
}

TEST_F(CtDetailViewTest, ASimSwitchedOffRecoloursTheShownIconsWithoutARebuild)
{
	CtDetailView* view = show(storeRichPerson());
	auto numbers = ScreenHarness::rowsOf<CtDetailViewNumberItem>(view->getGenlist());
	ASSERT_FALSE(numbers.empty());
	const std::string bothSims = themeColor(CtDetailViewGenlistItem::getIconColorCode().c_str());
	EXPECT_EQ(bothSims, callIconColor(numbers[0]));

	ASSERT_EQ(0, vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, 0));
	const std::string firstSim = themeColor(CtSimMgr::getInstance()->getSimColor(0));
	ASSERT_NE(bothSims, firstSim);
	EXPECT_TRUE(m_screen->pumpUntil([&] { return callIconColor(numbers[0]) == firstSim; }));
	EXPECT_EQ(0, view->getRebuildCount());
	vconf_set_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE2, 1);
	EXPECT_TRUE(m_screen->pumpUntil([&] { return callIconColor(numbers[0]) == bothSims; }));
}

TEST_F(CtDetailViewTest, VideoCallAndAddressRowsLaunchTheirApplications)
{
	auto accept = [](app_control_h, const ct::appcontrol::Reply&) { return 0; };
	std::vector<ct::appcontrol::Registration> handlers;
	handlers.push_back(ct::appcontrol::registerOperationHandler(VIDEO_CALL_OPERATION, accept));
	handlers.push_back(ct::appcontrol::registerAppHandler(MAPS_APP_ID, accept));
	ct::appcontrol::clearLaunches();

	contacts_record_h contact = newContact(0, "Solo");
	addNumber(contact, "010-7777-8888", CONTACTS_NUMBER_TYPE_CELL);
	addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, "5 Harbour Road");
	int personId = personOf(store(contact));
	CtDetailView* view = show(personId);
	ScreenHarness::selectItem(rowsOfKind(view, DETAIL_ITEM_VIDEO_CALL).at(0)->getElmObjectItem());
	ScreenHarness::selectItem(rowsOfKind(view, DETAIL_ITEM_ADDRESS).at(0)->getElmObjectItem());
	ASSERT_TRUE(m_screen->pumpUntil([] { return ct::appcontrol::launches().size() == 2; }));
	auto launches = ct::appcontrol::launches();
	EXPECT_EQ((std::vector<std::string>{VIDEO_CALL_OPERATION, "tel:010-7777-8888", std::to_string(personId)}),
			(std::vector<std::string>{launches[0].operation, launches[0].uri, launches[0].extra("ctindex")}));
	EXPECT_EQ(MAPS_APP_ID, launches[1].appId);
	EXPECT_NE(std::string::npos, launches[1].extra("searchByName").find("5 Harbour Road"));

	// With two numbers the user picks one first.
	int two = storeRichPerson();
	CtDetailView* twoView = show(two);
	ct::appcontrol::clearLaunches();
	ScreenHarness::selectItem(rowsOfKind(twoView, DETAIL_ITEM_VIDEO_CALL).at(0)->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(ct::appcontrol::launches().empty());
	Evas_Object* chooser = m_screen->findWidgets("Elm_Genlist").front();
	ASSERT_NE(twoView->getGenlist(), chooser);
	std::vector<Elm_Object_Item*> choices = ScreenHarness::genlistItems(chooser);
	ASSERT_EQ(2u, choices.size());
	elm_genlist_item_selected_set(choices[1], EINA_TRUE);
	ASSERT_TRUE(m_screen->pumpUntil([] { return ct::appcontrol::launches().size() == 1; }));
	EXPECT_EQ("tel:02-333-4444", ct::appcontrol::launches()[0].uri);
}

TEST_F(CtDetailViewTest, GalResultsAndMissingPersonsGiveQuietScreens)
{
	CtGalSearchData gal = {nullptr, nullptr, "Gal Person", "0201234567", nullptr, nullptr, "gal@example.com", "Corp"};
	auto* galView = static_cast<CtDetailView*>(createCtDetailViewForGalSearch(&gal));
	ASSERT_TRUE(m_screen->push(galView));
	EXPECT_EQ((std::vector<int> {DETAIL_ITEM_MULTI_IMAGE, DETAIL_ITEM_NUMBER, DETAIL_ITEM_EMAIL}), kinds(galView));
	EXPECT_EQ("Gal Person", ScreenHarness::naviText(galView));
	m_screen->sendMoreKey();
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(ct::log::contains("* Critical * list is nullptr"));
	galView->popOut();
	m_screen->pumpUntilIdle();

	ASSERT_TRUE(m_screen->push(createCtDetailViewForGalSearch(nullptr)));
	// A screen the host made but never pushed is ended quietly.
	createCtDetailView(addSimplePerson("Unpushed"), nullptr)->destroy();
	Launch pick(APP_CONTROL_OPERATION_PICK, {});
	auto* nobody = static_cast<CtDetailView*>(createCtDetailView(0, pick.get()));
	ASSERT_TRUE(m_screen->push(nobody));
	ASSERT_TRUE(m_screen->pumpUntil([nobody] { return !nobody->isBuildingRows(); }));
	EXPECT_EQ(0, nobody->getPersoinId());
	CtView::changeLanguage("de_DE.UTF-8");
	EXPECT_EQ("Unbekannt", ScreenHarness::naviText(nobody));
	CtView::changeLanguage("en_US.UTF-8");
	EXPECT_EQ("Unknown", ScreenHarness::naviText(nobody));
	m_screen->sendMoreKey();
	m_screen->sendBackKey();
	m_screen->sendBackKey();
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
}

} // namespace
