// The form of a SIM contact inside the create/edit screen: which rows it
// shows for the card, what it reports as empty and changed, moving a contact
// to another storage, and what reaches the card.
#include "../../data/input/InputTestStore.h"

#include "ContactsCommon.h"
#include "ContactsDetails.h"
#include "CtAddressbookPopup.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonTextUtil.h"
#include "CtData.h"
#include "CtInputView.h"
#include "CtInputViewAddrBookItem.h"
#include "CtInputViewSimControl.h"
#include "CtInputViewSimEmailItem.h"
#include "CtInputViewSimNameItem.h"
#include "CtInputViewSimNumberItem.h"
#include "CtView.h"
#include "ScreenHarness.h"
#include "WPopup.h"

#include <app_preference.h>
#include <ui_extension.h>
#include <vconf.h>

#include <filesystem>
#include <fstream>

using namespace ct::test;

namespace {

using Strings = std::vector<std::string>;

class SimControlTest : public InputStoreTest {
protected:
	void SetUp() override
	{
		InputStoreTest::SetUp();
		writeSimConf("[SIM1]\nname_max=14\nnumber_max=4\nemail_max=20\n[SIM2]\nname_max=10\nemail_max=0\n");
		reopenStore();
		vconf_set_int("db/telephony/sim_power_state2", 1);
		CtView::changeLanguage("en_US.UTF-8");
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		preference_set_boolean("hide_storage_popup", true);
		m_sim1 = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
		m_sim2 = ctCommonGetAddressBookId(CONTACTS_SIM2_ADDRESS_BOOK_NAME);
		m_screen = std::make_unique<ScreenHarness>(360, 640);
	}
	void TearDown() override
	{
		m_screen.reset();
		InputStoreTest::TearDown();
	}

	void writeSimConf(const char* text) { std::ofstream(m_dir.file("sim.conf")) << text; }

	// The form of a new contact on the first SIM, or of a stored contact.
	CtInputView* open(contacts_record_h record = nullptr)
	{
		preference_set_string("input_base_addressbook", CONTACTS_SIM1_ADDRESS_BOOK_NAME);
		auto* view = dynamic_cast<CtInputView*>(createCtInputView(record, nullptr));
		EXPECT_TRUE(view && m_screen->push(view));
		if (view && !view->getInputControl() && view->getData()->checkAddressbookIsSimOrNot(view->getStorageId()))
			__createSimControl(view);
		return view;
	}
	// A screen that does not make its SIM form yet gets one as it would.
	void __createSimControl(CtInputView* view)
	{
		auto* control = new CtInputViewSimControl(view->getData(), view);
		ASSERT_TRUE(control->create(view->getLayout(), nullptr));
		elm_object_part_content_set(view->getLayout(), "elm.swallow.content", control->getEvasObj());
		m_ownControl = control->getWeakPtr();
		m_screen->pumpUntilIdle();
	}
	// Ends the screen whatever it would ask, and starts a new window.
	void close()
	{
		m_screen.reset();
		m_screen = std::make_unique<ScreenHarness>(360, 640);
	}
	CtInputViewSimControl* simControl(CtInputView* view)
	{
		if (auto* control = dynamic_cast<CtInputViewSimControl*>(view->getInputControl()))
			return control;
		auto own = m_ownControl.lock();
		return own && !own->isDestroying() ? static_cast<CtInputViewSimControl*>(own.get()) : nullptr;
	}
	Evas_Object* genlist(CtInputView* view)
	{
		CtInputViewSimControl* control = simControl(view);
		return control ? control->getEvasObj() : nullptr;
	}
	// The kinds of rows, top to bottom.
	Strings rowKinds(CtInputView* view)
	{
		Strings kinds;
		for (Elm_Object_Item* item : ScreenHarness::genlistItems(genlist(view))) {
			auto* row = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
			if (dynamic_cast<CtInputViewSimNameItem*>(row))
				kinds.push_back("name");
			else if (dynamic_cast<CtInputViewSimNumberItem*>(row))
				kinds.push_back("number");
			else if (dynamic_cast<CtInputViewSimEmailItem*>(row))
				kinds.push_back("email");
			else if (dynamic_cast<CtInputViewAddrBookItem*>(row))
				kinds.push_back(elm_object_item_disabled_get(item) ? "storage (disabled)" : "storage");
		}
		return kinds;
	}
	template <class Row>
	Evas_Object* entryOf(CtInputView* view)
	{
		auto rows = ScreenHarness::rowsOf<Row>(genlist(view));
		return rows.empty() ? nullptr : rows.front()->getEntry();
	}
	void replaceText(Evas_Object* entry, const char* text)
	{
		elm_entry_select_all(entry);
		elm_entry_entry_insert(entry, ctCommonUtf8ToMarkup(text).c_str());
		if (!*text)
			elm_entry_entry_set(entry, "");
		m_screen->pumpUntilIdle();
	}
	// Chooses `row` of the storage list the storage row opens.
	void chooseStorage(CtInputView* view, int row)
	{
		auto storage = ScreenHarness::rowsOf<CtInputViewAddrBookItem>(genlist(view));
		ASSERT_EQ(1u, storage.size());
		ScreenHarness::selectItem(storage.front()->getElmObjectItem());
		m_screen->pumpUntilIdle();
		auto* popup = dynamic_cast<CtAddressbookPopup*>(view->getPopup());
		ASSERT_TRUE(popup);
		auto items = ScreenHarness::genlistItems(popup->getGenlist());
		ASSERT_LT(row, static_cast<int>(items.size()));
		ScreenHarness::selectItem(items[row]);
		m_screen->pumpUntilIdle();
	}
	static std::string tr(const char* id) { return ContactsCommon::translate(id); }
	static std::string outputDir()
	{
		std::string dir = std::string(getenv("CONTACTS_TEST_BIN_DIR") ? getenv("CONTACTS_TEST_BIN_DIR") : "/tmp")
			+ "/test-output/input";
		std::filesystem::create_directories(dir);
		return dir;
	}

	std::unique_ptr<ScreenHarness> m_screen;
	std::weak_ptr<app_assist::WControl> m_ownControl;
	int m_sim1 = -1;
	int m_sim2 = -1;
};

// Storage rows of the list the storage row opens, with both cards on.
const int kDeviceRow = 0;
const int kSim2Row = 2;

} // namespace

TEST_F(SimControlTest, EmailRowByCardRoomOrAStoredEmailAndStorageRowDisabledForAStoredContact)
{
	struct Case {
		const char* why;
		const char* conf;
		const char* storedEmail; // null: a new contact; "": stored without e-mail
		Strings rows;
	} cases[] = {
		{"room for e-mails", "[SIM1]\nemail_max=20\n", nullptr, {"name", "number", "email", "storage"}},
		{"no e-mail field", "[SIM1]\nemail_max=0\n", nullptr, {"name", "number", "storage"}},
		{"e-mails full", "[SIM1]\nemail_max=20\nemail_capacity=0\n", nullptr, {"name", "number", "storage"}},
		{"full, stored e-mail", "[SIM1]\nemail_max=20\nemail_capacity=0\n", "ada@x", {"name", "number", "email", "storage (disabled)"}},
		{"full, none stored", "[SIM1]\nemail_max=20\nemail_capacity=0\n", "", {"name", "number", "storage (disabled)"}},
	};
	for (const Case& c : cases) {
		writeSimConf(c.conf);
		contacts_record_h record = nullptr;
		if (c.storedEmail) {
			contacts_record_h contact = newContact(m_sim1, "Ada");
			if (*c.storedEmail)
				addEmail(contact, c.storedEmail);
			record = readContact(store(contact));
		}
		CtInputView* view = open(record);
		ASSERT_TRUE(simControl(view)) << c.why;
		EXPECT_EQ(c.rows, rowKinds(view)) << c.why;
		close();
	}
}

TEST_F(SimControlTest, EmptyAndChangedFollowTypingAndDeletingAndDrivesDone)
{
	CtInputView* view = open();
	CtInputViewSimControl* control = simControl(view);
	ASSERT_TRUE(control);
	Evas_Object* name = entryOf<CtInputViewSimNameItem>(view);
	Evas_Object* number = entryOf<CtInputViewSimNumberItem>(view);
	ASSERT_TRUE(name && number);
	auto state = [&] {
		return Strings{control->getIsEmpty() ? "empty" : "filled", control->getIsChanged() ? "changed" : "unchanged",
			ScreenHarness::isDisabled(view->getDoneButton()) ? "done off" : "done on"};
	};
	EXPECT_EQ((Strings{"empty", "unchanged", "done off"}), state());
	EXPECT_TRUE(m_screen->savePng(outputDir() + "/sim_form_new.png"));
	replaceText(number, "+1234");
	EXPECT_EQ((Strings{"filled", "changed", "done on"}), state());
	replaceText(number, "");
	EXPECT_EQ((Strings{"empty", "unchanged", "done off"}), state());
	replaceText(name, "Ada");
	EXPECT_EQ((Strings{"filled", "changed", "done on"}), state());
	close();

	contacts_record_h contact = newContact(m_sim1, "Ada");
	addNumber(contact, "0101", CONTACTS_NUMBER_TYPE_CELL);
	view = open(readContact(store(contact)));
	control = simControl(view);
	ASSERT_TRUE(control);
	number = entryOf<CtInputViewSimNumberItem>(view);
	ASSERT_TRUE(number);
	EXPECT_EQ((Strings{"filled", "unchanged", "done on"}), state());
	replaceText(number, "");
	EXPECT_EQ((Strings{"filled", "changed", "done on"}), state());
	replaceText(number, "0101");
	EXPECT_EQ((Strings{"filled", "unchanged", "done on"}), state());
	close();
}

TEST_F(SimControlTest, MovingAFilledContactOffTheCardAsksAndAnEmptyOneMovesAtOnce)
{
	struct Case {
		const char* why;
		const char* name;
		bool confirm;
		bool asked;
		int storage; // -1: still the first SIM
	} cases[] = {
		{"empty", "", false, false, 0},
		{"filled, cancelled", "Ada", false, true, -1},
		{"filled, changed", "Ada", true, true, 0},
	};
	for (const Case& c : cases) {
		CtInputView* view = open();
		ASSERT_TRUE(simControl(view));
		if (*c.name)
			replaceText(entryOf<CtInputViewSimNameItem>(view), c.name);
		chooseStorage(view, kDeviceRow);
		auto* ask = dynamic_cast<app_assist::WPopup*>(view->getPopup());
		// The popup is on top of the title's own Cancel button.
		Evas_Object* button = ask ? m_screen->findButton(tr(c.confirm ? "IDS_PB_BUTTON_CHANGE_ABB" : "IDS_PB_BUTTON_CANCEL")) : nullptr;
		EXPECT_EQ(c.asked, ask && button) << c.why;
		if (button) {
			ScreenHarness::click(button);
			m_screen->pumpUntilIdle();
		}
		int expected = c.storage < 0 ? m_sim1 : c.storage;
		EXPECT_EQ(expected, view->getData()->getAddressbookId()) << c.why;
		EXPECT_EQ(c.storage < 0, simControl(view) != nullptr) << c.why;
		if (*c.name) {
			EXPECT_EQ(c.name, view->getData()->getFullName()) << c.why << ": what was typed goes along";
		}
		close();
	}
}

TEST_F(SimControlTest, MovingToAnotherCardFollowsItsRoomForEmailsAndItsLimits)
{
	CtInputView* view = open();
	ASSERT_TRUE(simControl(view));
	replaceText(entryOf<CtInputViewSimNameItem>(view), "Abcdefghijkl");
	auto nameRow = [&] { return ScreenHarness::rowsOf<CtInputViewSimNameItem>(genlist(view)).front(); };
	EXPECT_EQ("2 of 14 left", nameRow()->getCounterText());

	chooseStorage(view, kSim2Row);
	EXPECT_FALSE(view->getPopup());
	EXPECT_EQ(m_sim2, view->getData()->getAddressbookId());
	EXPECT_EQ((Strings{"name", "number", "storage"}), rowKinds(view));
	EXPECT_EQ("2 over the limit of 10", ScreenHarness::itemText(nameRow()->getElmObjectItem(), "elm.text.sub"));
	close();
}

TEST_F(SimControlTest, TheCardGetsTheNameAsOneFieldAndTheNumberWithItsPlus)
{
	contacts_record_h contact = newContact(m_sim1, "Ada");
	contacts_record_set_str(childAt(contact, _contacts_contact.name, 0), _contacts_name.last, "Lovelace");
	CtInputView* view = open(readContact(store(contact)));
	CtInputViewSimControl* control = simControl(view);
	ASSERT_TRUE(control);
	replaceText(entryOf<CtInputViewSimNumberItem>(view), "+1234");
	replaceText(entryOf<CtInputViewSimEmailItem>(view), "ada@example.com");
	control->updateNameRecordForSim();
	std::shared_ptr<CtData> data = view->getData();
	EXPECT_EQ((Strings{"Ada Lovelace", ""}), (Strings{str(data->getFirstName()), data->getLastName() ? data->getLastName() : ""}));
	ASSERT_EQ(CONTACTS_ERROR_NONE, data->updateSIMContact());

	contacts_record_h stored = readContact(data->getContactId());
	EXPECT_EQ("Ada Lovelace", textOf(childAt(stored, _contacts_contact.name, 0), _contacts_name.first));
	EXPECT_EQ("+1234", textOf(childAt(stored, _contacts_contact.number, 0), _contacts_number.number));
	EXPECT_EQ("ada@example.com", textOf(childAt(stored, _contacts_contact.email, 0), _contacts_email.email));
	contacts_record_destroy(stored, true);

	EXPECT_TRUE(m_screen->savePng(outputDir() + "/sim_form.png"));
	close();
}
