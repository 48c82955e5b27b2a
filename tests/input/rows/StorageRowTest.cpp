// The storage row: the save-location label over the icon of the contact's
// storage (the SIM card's chosen icon for a SIM book), selectable only while
// the contact is new.
#include "InputRowTestSupport.h"

#include "CtInputViewAddrBookItem.h"

#include <vconf.h>

using namespace ct::test;

namespace {

using Row = CtInputViewAddrBookItem;

int bookNamed(const char* name, const char* provider)
{
	contacts_list_h books = nullptr;
	contacts_db_get_all_records(_contacts_address_book._uri, 0, 0, &books);
	int found = -1, count = 0;
	contacts_list_get_count(books, &count);
	for (int i = 0; i < count; ++i, contacts_list_next(books)) {
		contacts_record_h book = nullptr;
		contacts_list_get_current_record_p(books, &book);
		if (textOf(book, _contacts_address_book.name) == name)
			contacts_record_get_int(book, _contacts_address_book.id, &found);
	}
	contacts_list_destroy(books, true);
	return found >= 0 ? found : addAddressbook(name, 0, 0, provider);
}

std::string shownIconFile(Elm_Object_Item* item)
{
	Evas_Object* icon = elm_object_item_part_content_get(item, "elm.icon.1");
	const char* file = nullptr;
	if (icon)
		elm_image_file_get(icon, &file, nullptr);
	std::string path = file ? file : "";
	return path.substr(path.find_last_of('/') + 1);
}

class StorageRowTest : public InputRowTest {
protected:
	Row* showRow(std::shared_ptr<CtInputData> data)
	{
		auto* row = new Row(data, [this] { ++m_selections; });
		m_item = show(row);
		return row;
	}
	Elm_Object_Item* m_item = nullptr;
	int m_selections = 0;
};

} // namespace

TEST_F(StorageRowTest, ShowsTheIconOfEachStorage)
{
	int sim1 = bookNamed(CONTACTS_SIM1_ADDRESS_BOOK_NAME, CONTACTS_SIM1_PROVIDER_NAME);
	int sim2 = bookNamed(CONTACTS_SIM2_ADDRESS_BOOK_NAME, CONTACTS_SIM2_PROVIDER_NAME);
	int account = addAddressbook("mail", 0, 7, "Mail");
	vconf_set_int(VCONFKEY_SETAPPL_SIM1_ICON, 6);
	vconf_set_int(VCONFKEY_SETAPPL_SIM2_ICON, 99); // out of range: the slot's own icon
	struct Case {
		int book;
		const char* icon;
	} cases[] = {
		{ 0, "contacts_list_ic_device.png" },
		{ sim1, "logs_icon_sim_home_62.png" },
		{ sim2, "logs_icon_sim_2_62.png" },
		{ account, "" },
	};
	for (const Case& c : cases) {
		auto data = editNew();
		data->setAddressbookInfo(c.book);
		Row* row = showRow(data);
		EXPECT_EQ(tr("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB"), ScreenHarness::itemText(m_item, "elm.text"));
		EXPECT_EQ("linked.1text.8icon", ScreenHarness::itemStyle(m_item));
		EXPECT_EQ(c.icon, shownIconFile(m_item)) << "book " << c.book;
		EXPECT_TRUE(row->getIsEmpty()) << "the storage is not a field";
		elm_object_item_del(m_item);
	}
}

TEST_F(StorageRowTest, NewContactsCanChangeTheirStorageStoredOnesCannot)
{
	int sim1 = bookNamed(CONTACTS_SIM1_ADDRESS_BOOK_NAME, CONTACTS_SIM1_PROVIDER_NAME);
	auto fresh = editNew();
	Row* row = showRow(fresh);
	EXPECT_FALSE(elm_object_item_disabled_get(m_item));
	ScreenHarness::selectItem(m_item);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(1, m_selections);
	EXPECT_FALSE(elm_genlist_item_selected_get(m_item));

	fresh->setAddressbookInfo(sim1);
	row->update();
	m_screen->pumpUntilIdle();
	EXPECT_EQ("logs_icon_sim_1_62.png", shownIconFile(m_item)) << "the icon follows the storage";

	auto stored = edit(store(newContact(0, "Ada")));
	showRow(stored);
	EXPECT_TRUE(elm_object_item_disabled_get(m_item));
	ScreenHarness::selectItem(m_item);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(1, m_selections);
}
