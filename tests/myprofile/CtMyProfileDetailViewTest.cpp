// The user's own profile screen, headless: the rows and their order for the
// sharing states, the picture style, homogeneity, power saving, changes and
// deletion of the profile, the share button and the more menu.
#include "../sharing/SharingScreenTest.h"

#include "ContactsDetails.h"
#include "CtDetailImageView.h"
#include "CtDetailViewGenlistItem.h"
#include "CtDetailViewNumberItem.h"
#include "CtEsuAgentMgr.h"
#include "CtMyProfileDetailData.h"
#include "CtMyProfileDetailView.h"
#include "CtMyProfileInputView.h"
#include "CtProfileSettingKeys.h"
#include "CtProfileSharingView.h"
#include "CtRegistryMgr.h"
#include "LogSink.h"

using namespace ct::test;
namespace appcontrol = ct::appcontrol;
namespace usagelog = ct::usagelog;

namespace {

// The more menu on the window, if one is open.
Evas_Object* openMenu(ScreenHarness& screen)
{
	auto menus = screen.findWidgets("Elm_Ctxpopup");
	return menus.empty() ? nullptr : menus.front();
}

// Labels of the menu's entries, " (off)" after a disabled one.
std::vector<std::string> menuLabels(Evas_Object* menu)
{
	std::vector<std::string> labels;
	for (Elm_Object_Item* it = elm_ctxpopup_first_item_get(menu); it; it = elm_ctxpopup_item_next_get(it))
		labels.push_back(std::string(elm_object_item_text_get(it)) + (elm_object_item_disabled_get(it) ? " (off)" : ""));
	return labels;
}

Elm_Object_Item* menuItem(Evas_Object* menu, const std::string& label)
{
	for (Elm_Object_Item* it = elm_ctxpopup_first_item_get(menu); it; it = elm_ctxpopup_item_next_get(it))
		if (label == elm_object_item_text_get(it))
			return it;
	return nullptr;
}

std::string tr(const char* id)
{
	return ContactsCommon::translate(id);
}

} // namespace

class CtMyProfileDetailViewTest : public SharingScreenTest {
protected:
	void SetUp() override
	{
		SharingScreenTest::SetUp();
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		setenv("CONTACTS_FEATURES", "13", 1);
		m_shareTarget = appcontrol::registerOperationHandler(APP_CONTROL_OPERATION_SHARE,
			[](app_control_h, const appcontrol::Reply&) { return 0; });
	}
	void TearDown() override
	{
		unsetenv("CONTACTS_FEATURES");
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		SharingScreenTest::TearDown();
	}

	CtMyProfileDetailView* show()
	{
		auto* view = static_cast<CtMyProfileDetailView*>(createCtMyProfileDetailView());
		EXPECT_TRUE(m_screen->push(view));
		return view;
	}

	void close(CtMyProfileDetailView* view)
	{
		view->popOut();
		ASSERT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	}

	static std::vector<int> kinds(CtMyProfileDetailView* view)
	{
		std::vector<int> out;
		for (auto* row : ScreenHarness::rowsOf<CtDetailViewGenlistItem>(view->getGenlist()))
			out.push_back(row->getItemType());
		return out;
	}

	static std::vector<CtDetailViewGenlistItem*> rowsOfKind(CtMyProfileDetailView* view, int kind)
	{
		return ScreenHarness::rowsWhere<CtDetailViewGenlistItem>(view->getGenlist(),
			[kind](CtDetailViewGenlistItem* row) { return row->getItemType() == kind; });
	}

	static void setSharing(int signUpStatus, bool sharingOn)
	{
		preference_set_int(CT_PREF_EASY_SIGNUP_STATUS, signUpStatus);
		preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, sharingOn);
	}

	// A profile with a status, its own number after another one, and one
	// field of every other kind; `addresses` addresses.
	static int storeRichProfile(int addresses = 1)
	{
		contacts_record_h profile = newProfile("Ines");
		contacts_record_set_str(profile, _contacts_my_profile_ex.status, "On holiday");
		addProfileNumber(profile, "010-2222-3333");
		addProfileNumber(profile, "010-1111-0000", true);
		contacts_record_h email = addText(profile, _contacts_my_profile.email, _contacts_email._uri,
			_contacts_email.email, "ines@example.com");
		contacts_record_set_int(email, _contacts_email.type, CONTACTS_EMAIL_TYPE_HOME);
		addText(profile, _contacts_my_profile.note, _contacts_note._uri, _contacts_note.note, "Allergic to cats");
		for (int i = 0; i < addresses; ++i)
			addText(profile, _contacts_my_profile.address, _contacts_address._uri, _contacts_address.street,
				i ? "2 Side St" : "1 Main St");
		contacts_record_h event = addChild(profile, _contacts_my_profile.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.date, 19900315);
		contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
		addText(profile, _contacts_my_profile.relationship, _contacts_relationship._uri, _contacts_relationship.name,
			"Tomas");
		addText(profile, _contacts_my_profile.url, _contacts_url._uri, _contacts_url.url, "ines.example.org");
		addText(profile, _contacts_my_profile.messenger, _contacts_messenger._uri, _contacts_messenger.im_id,
			"ines.chat");
		return storeProfile(profile);
	}

	static void addNumberToProfile(int id, const char* number)
	{
		contacts_record_h profile = nullptr;
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_my_profile._uri, id, &profile));
		addProfileNumber(profile, number);
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(profile));
		contacts_record_destroy(profile, true);
	}

	// Runs `action` and waits until the screen it pushes has slid in (a
	// screen is popped only then), briefly when none is `expected`.
	// Returns whether one came.
	bool pushedBy(const std::function<void()>& action, bool expected = true)
	{
		bool slidIn = false;
		int before = m_screen->viewCount();
		Evas_Object* naviframe = m_screen->naviframe()->getEvasObj();
		Evas_Smart_Cb onSlidIn = [](void* data, Evas_Object*, void*) { *static_cast<bool*>(data) = true; };
		evas_object_smart_callback_add(naviframe, "transition,finished", onSlidIn, &slidIn);
		action();
		bool pushed = m_screen->pumpUntil([&] { return slidIn; }, expected ? 5.0 : 0.5);
		evas_object_smart_callback_del_full(naviframe, "transition,finished", onSlidIn, &slidIn);
		m_screen->pumpUntilIdle();
		return pushed && m_screen->viewCount() > before;
	}

	void shotOf(const std::string& name)
	{
		const char* dir = getenv("CONTACTS_TEST_BIN_DIR");
		std::string folder = std::string(dir ? dir : "/tmp") + "/test-output/myprofile";
		std::filesystem::create_directories(folder);
		m_screen->pumpUntilIdle();
		EXPECT_TRUE(m_screen->savePng(folder + "/" + name + ".png"));
	}

	appcontrol::Registration m_shareTarget;
};

TEST_F(CtMyProfileDetailViewTest, RowsFollowTheFixedOrderForEachSharingState)
{
	const std::vector<int> fields = {DETAIL_ITEM_NUMBER, DETAIL_ITEM_NUMBER, DETAIL_ITEM_EMAIL, DETAIL_ITEM_NOTE,
		DETAIL_ITEM_ADDRESS, DETAIL_ITEM_EVENT, DETAIL_ITEM_RELATION, DETAIL_ITEM_WEBSITE, DETAIL_ITEM_MESSENGER};
	auto withHead = [&fields](std::vector<int> head) {
		head.insert(head.end(), fields.begin(), fields.end());
		return head;
	};
	struct Case {
		const char* name;
		int signUp;
		bool sharing;
		int addresses;
		std::vector<int> kinds;
		bool homogeneous;
		std::string sharingText;
	};
	const Case cases[] = {
		{"signed out", 0, false, 1, withHead({DETAIL_ITEM_PROFILE_MULTI_IMAGE}), true, ""},
		{"signed up, sharing off", 1, false, 1,
			withHead({DETAIL_ITEM_PROFILE_MULTI_IMAGE, DETAIL_ITEM_PROFILE_SHARING}), true, "IDS_PB_BODY_OFF_M_NOT_USED"},
		{"sharing on", 1, true, 2,
			withHead({DETAIL_ITEM_PROFILE_MULTI_IMAGE, DETAIL_ITEM_PROFILE_SHARING, DETAIL_ITEM_STATUS}), false,
			"IDS_PB_HEADER_PERSONAL_PROFILE_ABB"},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		removeProfiles();
		setSharing(c.signUp, c.sharing);
		int id = storeRichProfile(c.addresses);
		CtMyProfileDetailView* view = show();
		std::vector<int> expected = c.kinds;
		if (c.addresses == 2)
			expected.insert(std::find(expected.begin(), expected.end(), DETAIL_ITEM_ADDRESS), DETAIL_ITEM_ADDRESS);
		EXPECT_EQ(expected, kinds(view));
		EXPECT_EQ(id, view->getPersoinId());
		EXPECT_EQ("Ines", ScreenHarness::naviText(view));
		// The profile's own number comes first.
		auto numbers = ScreenHarness::rowsOf<CtDetailViewNumberItem>(view->getGenlist());
		ASSERT_EQ(2u, numbers.size());
		EXPECT_EQ("010-1111-0000", numbers[0]->getCopyText());
		EXPECT_EQ(c.homogeneous, bool(elm_genlist_homogeneous_get(view->getGenlist())));
		EXPECT_EQ(c.signUp != 0, view->getProfileSharingItem() != nullptr);
		EXPECT_EQ(c.sharing, view->getStatusItem() != nullptr);
		if (!c.sharingText.empty()) {
			EXPECT_EQ(tr(c.sharingText.c_str()),
				ScreenHarness::itemText(view->getProfileSharingItem(), "elm.text.main.left.bottom"));
		}
		// Share sends the profile as a contact.
		appcontrol::clearLaunches();
		ASSERT_TRUE(ScreenHarness::click(view->getShareButton()));
		m_screen->pumpUntilIdle();
		auto launches = appcontrol::launches();
		ASSERT_EQ(1u, launches.size());
		EXPECT_EQ(APP_CONTROL_OPERATION_SHARE, launches[0].operation);
		EXPECT_EQ("application/vnd.velmora.contact", launches[0].mime);
		EXPECT_EQ(std::to_string(id), launches[0].extra(APP_CONTROL_DATA_ID));
		EXPECT_EQ("my_profile", launches[0].extra(APP_CONTROL_DATA_TYPE));
		if (c.sharing) {
			// After the rebuild the store's change notice brings.
			m_screen->pumpUntil([view] { return view->getRebuildCount() > 0; }, 1.0);
			shotOf("profile-sharing-on");
		}
		close(view);
	}

	// No stored profile: the picture area alone, and nothing to share.
	removeProfiles();
	setSharing(0, false);
	m_screen->pumpFor(0.7);
	CtMyProfileDetailView* empty = show();
	EXPECT_EQ(std::vector<int>{DETAIL_ITEM_PROFILE_MULTI_IMAGE}, kinds(empty));
	EXPECT_EQ(tr("IDS_LOGS_MBODY_UNKNOWN"), ScreenHarness::naviText(empty));
	EXPECT_TRUE(ScreenHarness::isDisabled(empty->getShareButton()));
	EXPECT_EQ(3u, usage("CT16").size());
	shotOf("profile-none");
	// It stays open for the profile that is stored next.
	storeRichProfile();
	ASSERT_TRUE(m_screen->pumpUntil([empty] { return ScreenHarness::naviText(empty) == "Ines"; }));
	EXPECT_EQ(1, m_screen->viewCount());
	EXPECT_FALSE(ScreenHarness::isDisabled(empty->getShareButton()));
}

TEST_F(CtMyProfileDetailViewTest, OnlyASingleSmallPictureUsesTheLowStyleAndTappingOpensThePictures)
{
	std::string small = writePicture("small.png", 200, 80, 60, 120);
	std::string large = writePicture("large.png", 60, 120, 200, 400);
	struct Case {
		std::vector<std::pair<std::string, int>> pictures;
		std::string style;
	};
	const Case cases[] = {
		{{{large, 1}}, "detail.multi.image"},
		{{{small, 1}, {small, 2}}, "detail.multi.image"},
		{{}, "detail.multi.image"},
		{{{small, 1}}, "detail.multi.image/low"},
	};
	CtMyProfileDetailView* view = nullptr;
	for (const Case& c : cases) {
		SCOPED_TRACE(c.pictures.size());
		m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; });
		removeProfiles();
		contacts_record_h profile = newProfile("Pia");
		addProfilePictures(profile, c.pictures);
		storeProfile(profile);
		view = show();
		auto pictures = rowsOfKind(view, DETAIL_ITEM_PROFILE_MULTI_IMAGE);
		ASSERT_EQ(1u, pictures.size());
		EXPECT_EQ(c.style, ScreenHarness::itemStyle(pictures[0]->getElmObjectItem()));
		if (c.style != "detail.multi.image/low")
			view->popOut();
	}
	shotOf("profile-small-picture");
	// Rows are remade on every change: the row of now.
	Elm_Object_Item* picture = rowsOfKind(view, DETAIL_ITEM_PROFILE_MULTI_IMAGE).at(0)->getElmObjectItem();
	ASSERT_TRUE(pushedBy([&] { ScreenHarness::selectItem(picture); }));
	auto* pictureView = dynamic_cast<CtDetailImageView*>(m_screen->topView());
	ASSERT_NE(nullptr, pictureView);
	EXPECT_TRUE(pictureView->isMyProfile());
}

TEST_F(CtMyProfileDetailViewTest, PowerSavingGreysEmailAndAddressRowsAndTheSharingEntry)
{
	setSharing(1, true);
	storeRichProfile(2);
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 1);
	CtMyProfileDetailView* view = show();
	auto greyed = [view](bool disabled) {
		for (auto* row : ScreenHarness::rowsOf<CtDetailViewGenlistItem>(view->getGenlist())) {
			bool affected = row->getItemType() == DETAIL_ITEM_EMAIL || row->getItemType() == DETAIL_ITEM_ADDRESS;
			if (bool(elm_object_item_disabled_get(row->getElmObjectItem())) != (affected && disabled))
				return false;
		}
		return true;
	};
	const std::string sharing = tr("IDS_PB_OPT_PROFILE_SHARING_ABB");
	const std::string edit = tr("IDS_PB_OPT_EDIT");
	struct Step {
		int psmode;
		std::vector<std::string> menu;
	};
	const Step steps[] = {
		{1, {edit, sharing + " (off)"}},
		{0, {edit, sharing}},
		{1, {edit, sharing + " (off)"}},
	};
	for (const Step& s : steps) {
		SCOPED_TRACE(s.psmode);
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, s.psmode);
		EXPECT_TRUE(m_screen->pumpUntil([&] { return greyed(s.psmode != 0); }));
		EXPECT_EQ(s.psmode != 0, view->isPowerSaving());
		m_screen->sendMoreKey();
		Evas_Object* menu = openMenu(*m_screen);
		ASSERT_NE(nullptr, menu);
		EXPECT_EQ(s.menu, menuLabels(menu));
		if (s.psmode) {
			// The greyed entry does nothing.
			elm_ctxpopup_item_selected_set(menuItem(menu, sharing), EINA_TRUE);
			m_screen->pumpUntilIdle();
			EXPECT_EQ(1, m_screen->viewCount());
			shotOf("profile-power-saving-menu");
		}
		m_screen->sendBackKey();
		EXPECT_TRUE(m_screen->pumpUntil([this] { return openMenu(*m_screen) == nullptr; }));
		EXPECT_EQ(1, m_screen->viewCount());
	}
}

TEST_F(CtMyProfileDetailViewTest, ChangesRebuildAtOnceThenOnceMoreAndDeletionClosesTheScreen)
{
	int id = storeRichProfile();
	CtMyProfileDetailView* view = show();
	for (const char* number : {"010-5555-0001", "010-5555-0002", "010-5555-0003"}) {
		addNumberToProfile(id, number);
		m_screen->pumpFor(0.2);
	}
	EXPECT_EQ(1, view->getRebuildCount());
	// The rows still show what they showed, without touching freed records.
	m_screen->pumpFrames(3);
	EXPECT_EQ(3u, rowsOfKind(view, DETAIL_ITEM_NUMBER).size());
	ASSERT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() == 2; }, 4.0));
	EXPECT_EQ(5u, rowsOfKind(view, DETAIL_ITEM_NUMBER).size());

	// The sharing state changing elsewhere rebuilds for its values 0 and 2 only.
	for (int value : {1, 0, 2})
		CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PROFILE_SHARING_STATE, value);
	EXPECT_EQ(4, view->getRebuildCount());

	// Deleted elsewhere, even while changes are being coalesced.
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_my_profile._uri, id));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }, 4.0));
}

TEST_F(CtMyProfileDetailViewTest, MoreMenuWorksWithTheKeypadUpAndReachesProfileSharing)
{
	storeRichProfile();
	app_control_result_e signUpAnswer = APP_CONTROL_RESULT_CANCELED;
	int signUps = 0;
	auto signUp = appcontrol::registerAppHandler(CtEsuAgentMgr::kSignUpAppId,
		[&](app_control_h, const appcontrol::Reply& reply) {
			++signUps;
			reply(nullptr, signUpAnswer);
			return 0;
		});
	CtMyProfileDetailView* view = show();
	ASSERT_EQ(nullptr, view->getProfileSharingItem());
	const std::string sharing = tr("IDS_PB_OPT_PROFILE_SHARING_ABB");

	struct Step {
		const char* name;
		app_control_result_e answer;
		int signUps;
		bool opens;
	};
	const Step steps[] = {
		{"sign-up cancelled", APP_CONTROL_RESULT_CANCELED, 1, false},
		{"signed up", APP_CONTROL_RESULT_SUCCEEDED, 2, true},
		{"already signed up", APP_CONTROL_RESULT_CANCELED, 2, true},
	};
	for (const Step& s : steps) {
		SCOPED_TRACE(s.name);
		signUpAnswer = s.answer;
		m_screen->raiseKeypad();
		m_screen->sendMoreKey();
		m_screen->sendMoreKey(); // the second press closes the menu
		EXPECT_EQ(nullptr, openMenu(*m_screen));
		m_screen->sendMoreKey();
		Evas_Object* menu = openMenu(*m_screen);
		ASSERT_NE(nullptr, menu);
		EXPECT_EQ(1u, m_screen->findWidgets("Elm_Ctxpopup").size());
		EXPECT_EQ((std::vector<std::string>{tr("IDS_PB_OPT_EDIT"), sharing}), menuLabels(menu));
		m_screen->lowerKeypad();
		bool slidIn = pushedBy([&] { elm_ctxpopup_item_selected_set(menuItem(menu, sharing), EINA_TRUE); }, s.opens);
		EXPECT_EQ(s.opens, slidIn);
		EXPECT_EQ(s.signUps, signUps);
		ASSERT_EQ(s.opens ? 2 : 1, m_screen->viewCount());
		if (s.opens) {
			EXPECT_NE(nullptr, dynamic_cast<CtProfileSharingView*>(m_screen->topView()));
			// Back on the profile, its sharing row shows the state.
			m_screen->topView()->popOut();
			ASSERT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 1; }));
			EXPECT_NE(nullptr, view->getProfileSharingItem());
		}
	}
	EXPECT_EQ(3u, usage("CT12").size());
	for (const usagelog::Record& record : usage("CT12")) {
		EXPECT_EQ("Profile sharing", record.extra);
	}

	// The edit entry opens the profile's edit form.
	m_screen->sendMoreKey();
	ASSERT_NE(nullptr, openMenu(*m_screen));
	EXPECT_TRUE(pushedBy([&] {
		elm_ctxpopup_item_selected_set(menuItem(openMenu(*m_screen), tr("IDS_PB_OPT_EDIT")), EINA_TRUE);
	}));
	auto* editor = dynamic_cast<CtMyProfileInputView*>(m_screen->topView());
	ASSERT_NE(nullptr, editor);
	EXPECT_FALSE(editor->isNewProfile());
	ASSERT_EQ(4u, usage("CT12").size());
	EXPECT_EQ("Edit", usage("CT12").back().extra);
}
