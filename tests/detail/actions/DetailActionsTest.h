// The detail screen's actions, headless: persons stored in phone, account,
// read-only, social and SIM address books, the screen pushed, its more menu
// opened and chosen from, and what the popups and launches then show.
#pragma once

#include "../../data/detail/DetailTestStore.h"

#include "AppControlRouter.h"
#include "ContactsCommon.h"
#include "ContactsDetails.h"
#include "CtView.h"
#include "CtCommonAddressbookUtil.h"
#include "CtDetailData.h"
#include "CtDetailView.h"
#include "ScreenHarness.h"
#include "UsageLog.h"

#include <sys/wait.h>
#include <unistd.h>
#include <vconf.h>

#include <filesystem>
#include <string>
#include <vector>

namespace ct::test {

using Strings = std::vector<std::string>;

// Where the screen tests leave pictures for review.
inline std::string actionShotPath(const std::string& file)
{
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/detail";
	std::filesystem::create_directories(dir);
	return dir + "/" + file;
}

inline Strings translated(const Strings& ids)
{
	Strings texts;
	for (const std::string& id : ids)
		texts.push_back(ContactsCommon::translate(id.c_str()));
	return texts;
}

// The extras of the usage-log records of `feature`, oldest first.
inline Strings usageExtras(const std::string& feature)
{
	Strings extras;
	for (const ct::usagelog::Record& record : ct::usagelog::records())
		if (record.feature == feature)
			extras.push_back(record.extra);
	return extras;
}

// Runs `change` in a child process with its own store connection, as another
// application would; true when it succeeded.
template <typename Change>
bool changeFromAnotherProcess(Change change)
{
	pid_t child = fork();
	if (child == 0) {
		int rc = contacts_connect();
		if (rc == CONTACTS_ERROR_NONE)
			rc = change();
		_exit(rc == CONTACTS_ERROR_NONE ? 0 : 1);
	}
	int status = 0;
	waitpid(child, &status, 0);
	return child > 0 && WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

class DetailActionsTest : public ::testing::Test {
protected:
	enum Book { PHONE, ACCOUNT, READ_ONLY, SOCIAL, SIM };

	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		CtView::changeLanguage("en_US.UTF-8");
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		m_books = {0, addAddressbook("Mail account", 0, 1, "Mail"), addAddressbook("Work directory", 1, 2, "Directory"),
			addAddressbook("Social network", 101, 3, "Social"),
			readOnlySimBook()};
		m_screen = std::make_unique<ScreenHarness>();
		ct::appcontrol::clearLaunches();
		ScreenHarness::clearNotices();
	}
	void TearDown() override
	{
		m_screen.reset();
		contacts_disconnect();
	}

	// The first SIM card's book, made read-only as some cards are.
	static int readOnlySimBook()
	{
		int id = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
		contacts_record_h book = nullptr;
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_address_book._uri, id, &book));
		contacts_record_set_int(book, _contacts_address_book.mode, 1);
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(book));
		contacts_record_destroy(book, true);
		return id;
	}

	// A person of one contact per book, linked; the first `named` contacts
	// have a name ("Name 1", ...). `contactIds` gets the contacts' ids.
	int person(const std::vector<Book>& books, int named = 1, std::vector<int>* contactIds = nullptr)
	{
		std::vector<int> ids;
		for (size_t i = 0; i < books.size(); ++i) {
			std::string name = "Name " + std::to_string(i + 1);
			contacts_record_h contact = newContact(m_books[books[i]], static_cast<int>(i) < named ? name.c_str() : nullptr);
			addNumber(contact, ("010-555-000" + std::to_string(i)).c_str(), CONTACTS_NUMBER_TYPE_CELL);
			ids.push_back(store(contact));
		}
		if (contactIds)
			*contactIds = ids;
		return linkContacts(ids);
	}

	CtDetailView* show(int personId)
	{
		auto* view = static_cast<CtDetailView*>(createCtDetailView(personId, nullptr));
		EXPECT_TRUE(m_screen->push(view));
		EXPECT_TRUE(m_screen->pumpUntil([view] { return !view->isBuildingRows(); }));
		return view;
	}

	void closeAll()
	{
		while (m_screen->viewCount() > 0 && m_screen->naviframe()->pop())
			m_screen->pumpUntilIdle();
		m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; });
	}

	Evas_Object* menu() const
	{
		auto menus = m_screen->findWidgets("Elm_Ctxpopup");
		return menus.empty() ? nullptr : menus.front();
	}

	// Presses the more key and reads the menu's entries.
	Strings openMenu()
	{
		m_screen->sendMoreKey();
		m_screen->pumpUntilIdle();
		Strings labels;
		for (Elm_Object_Item* it = menu() ? elm_ctxpopup_first_item_get(menu()) : nullptr; it; it = elm_ctxpopup_item_next_get(it))
			labels.push_back(elm_object_item_text_get(it));
		return labels;
	}

	// Opens the menu and chooses the entry of translation id `id`.
	bool choose(const char* id)
	{
		openMenu();
		const std::string label = ContactsCommon::translate(id);
		for (Elm_Object_Item* it = menu() ? elm_ctxpopup_first_item_get(menu()) : nullptr; it; it = elm_ctxpopup_item_next_get(it)) {
			if (label == elm_object_item_text_get(it)) {
				elm_ctxpopup_item_selected_set(it, EINA_TRUE);
				m_screen->pumpUntilIdle();
				return true;
			}
		}
		return false;
	}

	Evas_Object* popup() const
	{
		auto popups = m_screen->findWidgets("Elm_Popup");
		return popups.empty() ? nullptr : popups.front();
	}
	std::string popupText(const char* part = nullptr) const
	{
		const char* text = popup() ? elm_object_part_text_get(popup(), part) : nullptr;
		return text ? text : "";
	}
	bool clickPopupButton(const char* id)
	{
		Evas_Object* button = m_screen->findButton(ContactsCommon::translate(id));
		bool clicked = button && ScreenHarness::click(button);
		m_screen->pumpUntilIdle();
		return clicked;
	}

	TempDataDir m_dir;
	std::vector<int> m_books;
	std::unique_ptr<ScreenHarness> m_screen;
};

} // namespace ct::test
