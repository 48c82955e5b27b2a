// The more menu of the detail screen: which entries a person gets, the
// delete and hide questions, sharing, linking, and what happens when the
// person changes elsewhere while the menu or a popup is open.
#include "DetailActionsTest.h"

#include "CtContactPickerView.h"
#include "CtContactsAgentUtil.h"
#include "CtDetailMarkAsDefaultView.h"
#include "CtDetailPersonActions.h"
#include "CtUnlinkContactView.h"
#include "LogSink.h"
#include "SqliteFaultInjector.h"

using namespace ct::test;

namespace {

std::vector<int> sharedWith()
{
	int* ids = nullptr;
	int count = CtContactsAgentUtil::getPreferenceSelectedContactsList(&ids);
	std::vector<int> list(ids, ids + std::max(count, 0));
	free(ids);
	return list;
}

bool personExists(int personId)
{
	contacts_record_h person = nullptr;
	if (contacts_db_get_record(_contacts_person._uri, personId, &person) != CONTACTS_ERROR_NONE)
		return false;
	contacts_record_destroy(person, true);
	return true;
}

bool isLeftOf(Evas_Object* left, Evas_Object* right)
{
	if (!left || !right)
		return false;
	Evas_Coord leftX = 0, rightX = 0;
	evas_object_geometry_get(left, &leftX, nullptr, nullptr, nullptr);
	evas_object_geometry_get(right, &rightX, nullptr, nullptr, nullptr);
	return leftX < rightX;
}

constexpr const char* EDIT = "IDS_PB_OPT_EDIT";
constexpr const char* DELETE = "IDS_PB_BUTTON_DELETE_ABB4";
constexpr const char* HIDE = "IDS_PB_OPT_HIDE";
constexpr const char* SHARE = "IDS_PB_OPT_SHARE";
constexpr const char* SET_DEFAULT = "IDS_PB_OPT_SET_DEFAULT_CONTACT_INFO_ABB";
constexpr const char* LINK = "IDS_PB_TMBODY_LINK_CONTACTS";
constexpr const char* MANAGE = "IDS_PB_OPT_MANAGE_LINKED_CONTACTS_ABB2";

} // namespace

TEST_F(DetailActionsTest, MenuEntriesFollowTheStoragesAndTheLinkedContacts)
{
	struct Case {
		const char* what;
		std::vector<Book> books;
		int named;
		Strings entries;
	};
	const Case cases[] = {
		{"phone", {PHONE}, 1, {EDIT, DELETE, SHARE, LINK}},
		{"3 linked, 3 names", {PHONE, ACCOUNT, PHONE}, 3, {EDIT, DELETE, SHARE, SET_DEFAULT, MANAGE}},
		{"2 linked, 1 name", {PHONE, ACCOUNT}, 1, {EDIT, DELETE, SHARE, MANAGE}},
		{"social only", {SOCIAL}, 1, {HIDE, LINK}},
		{"social and phone", {SOCIAL, PHONE}, 1, {EDIT, DELETE, SHARE, MANAGE}},
		{"read-only account", {READ_ONLY}, 1, {DELETE, SHARE, LINK}},
		{"read-only SIM", {SIM}, 1, {EDIT, DELETE, SHARE}},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.what);
		show(person(c.books, c.named));
		EXPECT_EQ(translated(c.entries), openMenu());
		if (std::string(c.what) == "3 linked, 3 names")
			m_screen->savePng(actionShotPath("detail-more-menu.png"));
		// The more key again closes the menu; a third press opens it once.
		m_screen->sendMoreKey();
		m_screen->pumpUntilIdle();
		EXPECT_EQ(nullptr, menu());
		closeAll();
	}
}

TEST_F(DetailActionsTest, DeleteQuestionSaysWhatHappensToSyncedAndReadOnlyContacts)
{
	struct Case {
		std::vector<Book> books;
		const char* text;
	};
	const Case cases[] = {
		{{PHONE}, "IDS_PB_POP_THIS_CONTACT_WILL_BE_DELETED"},
		{{PHONE, SIM}, "IDS_PB_POP_THIS_CONTACT_AND_ALL_ITS_LINKED_CONTACTS_WILL_BE_DELETED"},
		{{ACCOUNT}, "IDS_PB_POP_WHEN_SYNC_IS_ENABLED_THIS_CONTACT_WILL_BE_DELETED_FROM_ANY_SYNCED_ACCOUNTS_IT_IS_SAVED_IN"},
		{{PHONE, ACCOUNT}, "IDS_PB_POP_WHEN_SYNC_IS_ENABLED_THIS_CONTACT_AND_ALL_ITS_LINKED_CONTACTS_IN_OTHER_SYNCED_ACCOUNTS_WILL_BE_DELETED"},
		{{READ_ONLY}, "IDS_PB_POP_YOU_CANNOT_DELETE_CONTACTS_FROM_READ_ONLY_ACCOUNTS_BUT_YOU_CAN_HIDE_THEM_IN_CONTACTS"},
		{{READ_ONLY, READ_ONLY}, "IDS_PB_POP_WHEN_SYNC_IS_ENABLED_THIS_CONTACT_AND_ALL_ITS_LINKED_CONTACTS_IN_OTHER_SYNCED_ACCOUNTS_WILL_BE_DELETED_OR_HIDDEN_IF_THE_INFORMATION_MSG"},
		// Read-only but on the device: nothing is synced.
		{{SIM}, "IDS_PB_POP_THIS_CONTACT_WILL_BE_DELETED"},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.text);
		int id = person(c.books);
		show(id);
		ASSERT_TRUE(choose(DELETE));
		EXPECT_EQ((Strings{ContactsCommon::translate(DELETE), ContactsCommon::translate(c.text)}),
				(Strings{popupText("title,text"), popupText()}));
		if (c.books.size() == 2 && c.books[1] == ACCOUNT)
			m_screen->savePng(actionShotPath("detail-delete-popup.png"));
		EXPECT_TRUE(isLeftOf(m_screen->findButton(ContactsCommon::translate("IDS_PB_BUTTON_CANCEL")),
				m_screen->findButton(ContactsCommon::translate(DELETE))));
		EXPECT_TRUE(clickPopupButton("IDS_PB_BUTTON_CANCEL"));
		EXPECT_EQ(nullptr, popup());
		EXPECT_TRUE(personExists(id));
		closeAll();
	}
	EXPECT_EQ(Strings(7, "Delete"), usageExtras("CT06"));
}

TEST_F(DetailActionsTest, DeletingRemovesThePersonFromStoreAndShareListAndClosesTheScreen)
{
	int kept = person({PHONE});
	struct Case {
		const char* what;
		std::vector<Book> books;
		const char* entry;
		const char* button;
	};
	const Case cases[] = {
		{"linked", {PHONE, ACCOUNT}, DELETE, DELETE},
		{"SIM", {SIM}, DELETE, DELETE},
		{"social", {SOCIAL}, HIDE, HIDE},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.what);
		int id = person(c.books);
		ASSERT_TRUE(CtContactsAgentUtil::setPreferenceSelectedContactsList(std::vector<int>{kept, id}.data(), 2));
		SignalRecorder signals;
		show(id);
		ASSERT_TRUE(choose(c.entry));
		if (c.entry == HIDE) {
			EXPECT_EQ(ContactsCommon::translate("IDS_PB_POP_THIS_ACCOUNT_IS_READ_ONLY_THE_CONTACT_WILL_BE_HIDDEN_FROM_CONTACTS"), popupText());
		}
		ASSERT_TRUE(clickPopupButton(c.button));
		EXPECT_FALSE(personExists(id));
		EXPECT_EQ(std::vector<int>{kept}, sharedWith());
		EXPECT_EQ(1, signals.count(CT_REGISTRY_KEY_PERSON_DELETED));
		EXPECT_TRUE(std::find(signals.signals.begin(), signals.signals.end(),
				std::make_pair(CT_REGISTRY_KEY_PERSON_DELETED, id)) != signals.signals.end());
		EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
		EXPECT_TRUE(ScreenHarness::notices().empty());
	}
	EXPECT_TRUE(personExists(kept));
}

TEST_F(DetailActionsTest, FailedDeleteKeepsPersonAndScreenAndSaysSo)
{
	int id = person({PHONE, PHONE}, 2);
	ASSERT_TRUE(CtContactsAgentUtil::setPreferenceSelectedContactsList(&id, 1));
	CtDetailView* view = show(id);
	SignalRecorder signals;
	ASSERT_TRUE(choose(DELETE));
	{
		ct::db::ScopedWriteFailure diskFull(1);
		ASSERT_TRUE(clickPopupButton(DELETE));
	}
	EXPECT_EQ(nullptr, m_screen->findButton(ContactsCommon::translate(DELETE)));
	EXPECT_EQ(translated({"IDS_PB_TPOP_FAILED_TO_DELETE_CONTACTS_TRY_AGAIN"}), ScreenHarness::notices());
	reopenStore();
	EXPECT_TRUE(personExists(id));
	m_screen->pumpFor(0.7);
	EXPECT_EQ(view, m_screen->topView());
	EXPECT_EQ(2u, eina_list_count(view->getDetailData()->getContactsList()));
	EXPECT_EQ(std::vector<int>{id}, sharedWith());
	EXPECT_EQ(0, signals.count(CT_REGISTRY_KEY_PERSON_DELETED));

	// The same question again deletes.
	ASSERT_TRUE(choose(DELETE));
	ASSERT_TRUE(clickPopupButton(DELETE));
	EXPECT_FALSE(personExists(id));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
}

TEST_F(DetailActionsTest, ShareOffersACardOrTextAndHandsThePersonToTheShareTarget)
{
	auto accept = [](app_control_h, const ct::appcontrol::Reply&) { return 0; };
	std::vector<ct::appcontrol::Registration> targets;
	for (const char* op : {APP_CONTROL_OPERATION_SHARE, APP_CONTROL_OPERATION_SHARE_TEXT})
		targets.push_back(ct::appcontrol::registerOperationHandler(op, accept));
	int id = person({PHONE});
	show(id);
	for (int row : {0, 1}) {
		ASSERT_TRUE(choose(SHARE));
		EXPECT_EQ(ContactsCommon::translate(SHARE), popupText("title,text"));
		Evas_Object* list = elm_object_content_get(popup());
		EXPECT_EQ(id, static_cast<int>(reinterpret_cast<intptr_t>(evas_object_data_get(list, "selected_personid"))));
		std::vector<Elm_Object_Item*> rows = ScreenHarness::genlistItems(list);
		ASSERT_EQ(2u, rows.size());
		if (row == 0)
			m_screen->savePng(actionShotPath("detail-share-popup.png"));
		EXPECT_EQ(translated({"IDS_PB_OPT_VCARD_HVCF_ABB", "IDS_PB_OPT_TEXT"}),
				(Strings{ScreenHarness::itemText(rows[0], "elm.text"), ScreenHarness::itemText(rows[1], "elm.text")}));
		elm_genlist_item_selected_set(rows[row], EINA_TRUE);
		m_screen->pumpUntilIdle();
		EXPECT_EQ(nullptr, popup());
	}
	auto launches = ct::appcontrol::launches();
	ASSERT_EQ(2u, launches.size());
	EXPECT_EQ((Strings{APP_CONTROL_OPERATION_SHARE, "application/vnd.velmora.contact", std::to_string(id), "person"}),
			(Strings{launches[0].operation, launches[0].mime, launches[0].extra(APP_CONTROL_DATA_ID),
				launches[0].extra(APP_CONTROL_DATA_TYPE)}));
	EXPECT_EQ(APP_CONTROL_OPERATION_SHARE_TEXT, launches[1].operation);
	EXPECT_NE(std::string::npos, launches[1].extra(APP_CONTROL_DATA_TEXT).find("Name 1"));
	EXPECT_NE(std::string::npos, launches[1].extra(APP_CONTROL_DATA_TEXT).find("010-555-0000"));
	for (const auto& launch : launches)
		EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, launch.launchMode);

	// Without a share target nothing changes on the screen.
	targets.clear();
	ct::log::clear();
	ASSERT_TRUE(choose(SHARE));
	elm_genlist_item_selected_set(ScreenHarness::genlistItems(elm_object_content_get(popup())).at(0), EINA_TRUE);
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(ct::log::contains("* Critical * launch Failed"));
	EXPECT_EQ(1, m_screen->viewCount());
	EXPECT_EQ((Strings{"Share", "Share", "Share"}), usageExtras("CT06"));
}

TEST_F(DetailActionsTest, LinkAsksThePickerForTheRoomLeftOfTenContacts)
{
	struct Case {
		int linked;
		const char* max;
	};
	for (const Case& c : {Case{0, "10"}, Case{1, "9"}, Case{9, "1"}, Case{10, "0"}, Case{12, "0"}, Case{-1, "10"}}) {
		app_control_h request = CtDetailPersonActions(42).createLinkRequest(c.linked);
		ASSERT_NE(nullptr, request);
		Strings extras;
		for (const char* key : {"type", "ct_selected_person_id", "ct_max", "person_linked_count", "hide_create_button", "view_id"}) {
			char* value = nullptr;
			app_control_get_extra_data(request, key, &value);
			extras.push_back(value ? value : "");
			free(value);
		}
		app_control_destroy(request);
		EXPECT_EQ((Strings{"131", "42", c.max, std::to_string(std::max(c.linked, 0)), "1", "50"}), extras) << c.linked;
	}

	int id = person({PHONE});
	show(id);
	ASSERT_TRUE(choose(LINK));
	auto* picker = dynamic_cast<CtContactPickerView*>(m_screen->topView());
	ASSERT_NE(nullptr, picker);
	EXPECT_EQ((std::vector<int>{131, id, 9}), (std::vector<int>{picker->getLaunchType(), picker->getBasePersonId(), picker->getMaxCount()}));
	EXPECT_EQ(1u, usageExtras("0026").size());
	EXPECT_EQ(Strings{"Link"}, usageExtras("CT06"));
}

TEST_F(DetailActionsTest, ManyLinkedContactsOpenTheUnlinkListAndTheChoiceOfDefaults)
{
	int id = person({PHONE, ACCOUNT, PHONE}, 3);
	show(id);
	ASSERT_TRUE(choose(MANAGE));
	auto* unlink = dynamic_cast<CtUnlinkContactView*>(m_screen->topView());
	ASSERT_NE(nullptr, unlink);
	EXPECT_EQ(id, unlink->getPersonId());
	m_screen->naviframe()->pop();
	ASSERT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 1; }));
	m_screen->pumpUntilIdle();

	ASSERT_TRUE(choose(SET_DEFAULT));
	auto* defaults = dynamic_cast<CtDetailMarkAsDefaultView*>(m_screen->topView());
	ASSERT_NE(nullptr, defaults);
	EXPECT_EQ(3u, ScreenHarness::rowsWhere<CtDetailMarkAsDefaultItem>(defaults->getGenlist(), [](CtDetailMarkAsDefaultItem* row) {
		return row->getEntry().kind == CtDetailMarkAsDefaultItem::Kind::Name;
	}).size());
	EXPECT_EQ((Strings{"Manage_linked_contacts", "Set_default_contact_info"}), usageExtras("CT06"));
}

TEST_F(DetailActionsTest, ChangesFromElsewhereCloseTheOpenMenuOrPopupSafely)
{
	// Deleted while the menu is open: the screen closes with its menu.
	int gone = person({PHONE});
	show(gone);
	ASSERT_FALSE(openMenu().empty());
	ASSERT_TRUE(changeFromAnotherProcess([gone] { return contacts_db_delete_record(_contacts_person._uri, gone); }));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));

	// Unlinked while the delete question is open: the question goes, the
	// screen shows the person that is left, whose menu offers linking.
	std::vector<int> contacts;
	int id = person({PHONE, PHONE}, 2, &contacts);
	CtDetailView* view = show(id);
	ASSERT_TRUE(choose(DELETE));
	ASSERT_NE(nullptr, popup());
	ASSERT_TRUE(changeFromAnotherProcess([&] { return contacts_person_unlink_contact(id, contacts[1], nullptr); }));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return popup() == nullptr; }));
	EXPECT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() > 0 && !view->isBuildingRows(); }));
	EXPECT_EQ(translated({EDIT, DELETE, SHARE, LINK}), openMenu());
	m_screen->sendMoreKey();
	closeAll();

	// A linked contact's address book removed while the share popup is open.
	int withAccount = person({PHONE, ACCOUNT});
	view = show(withAccount);
	ASSERT_TRUE(choose(SHARE));
	const int account = m_books[ACCOUNT];
	ASSERT_TRUE(changeFromAnotherProcess([account] { return contacts_db_delete_record(_contacts_address_book._uri, account); }));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return popup() == nullptr; }));
	EXPECT_TRUE(m_screen->pumpUntil([view] { return view->getRebuildCount() > 0 && !view->isBuildingRows(); }));
	EXPECT_EQ(1u, eina_list_count(view->getDetailData()->getContactsList()));
	ASSERT_TRUE(choose(DELETE));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_POP_THIS_CONTACT_WILL_BE_DELETED"), popupText());
}
