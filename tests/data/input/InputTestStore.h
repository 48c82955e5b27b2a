// Helpers of the editable-contact tests: a fresh store per test, groups,
// reading stored contacts back and launch requests (contacts, address books
// and the main-loop pump come from the detail tests' store helpers).
#pragma once

#include "../detail/DetailTestStore.h"
#include "TempDataDir.h"

#include <app_control.h>
#include <app_preference.h>
#include <contacts.h>
#include <gtest/gtest.h>
#include <vconf.h>

#include <map>
#include <string>

namespace ct::test {

// A fresh data folder, the main loop and a connection for one test.
class InputStoreTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ecore_init();
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		vconf_set_int("db/telephony/sim_power_state1", 1);
		vconf_set_int("db/telephony/sim_power_state2", 0);
	}
	void TearDown() override
	{
		contacts_disconnect();
		preference_close_store();
		vconf_close_store();
		ecore_shutdown();
	}

	// Closes and reopens the database, so reads come from the file.
	void reopen()
	{
		contacts_disconnect();
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	}

	TempDataDir m_dir;
};

inline contacts_record_h readContact(int contactId)
{
	contacts_record_h contact = nullptr;
	contacts_db_get_record(_contacts_contact._uri, contactId, &contact);
	return contact;
}

inline int addGroup(int addressbookId, const char* name, const char* systemId)
{
	contacts_record_h group = nullptr;
	contacts_record_create(_contacts_group._uri, &group);
	contacts_record_set_int(group, _contacts_group.address_book_id, addressbookId);
	contacts_record_set_str(group, _contacts_group.name, name);
	if (systemId)
		contacts_record_set_str(group, _contacts_group.system_id, systemId);
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(group, &id));
	contacts_record_destroy(group, true);
	return id;
}

inline int addressbookIdByName(const char* name)
{
	contacts_list_h list = nullptr;
	contacts_db_get_all_records(_contacts_address_book._uri, 0, 0, &list);
	contacts_record_h book = nullptr;
	int found = -1;
	while (found < 0 && contacts_list_get_current_record_p(list, &book) == CONTACTS_ERROR_NONE) {
		char* bookName = nullptr;
		contacts_record_get_str_p(book, _contacts_address_book.name, &bookName);
		if (bookName && std::string(bookName) == name)
			contacts_record_get_int(book, _contacts_address_book.id, &found);
		if (contacts_list_next(list) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(list, true);
	return found;
}

inline std::string textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	contacts_record_get_str_p(record, property, &value);
	return value ? value : "";
}

inline int childCount(contacts_record_h record, unsigned int property)
{
	int count = 0;
	contacts_record_get_child_record_count(record, property, &count);
	return count;
}

inline contacts_record_h childAt(contacts_record_h record, unsigned int property, int index)
{
	contacts_record_h child = nullptr;
	contacts_record_get_child_record_at_p(record, property, index, &child);
	return child;
}

// A launch request that the test owns.
class Request {
public:
	explicit Request(const char* operation, std::map<std::string, std::string> extras = {})
	{
		app_control_create(&m_handle);
		if (operation)
			app_control_set_operation(m_handle, operation);
		for (const auto& extra : extras)
			app_control_add_extra_data(m_handle, extra.first.c_str(), extra.second.c_str());
	}
	~Request() { app_control_destroy(m_handle); }
	Request(const Request&) = delete;
	Request& operator=(const Request&) = delete;
	app_control_h get() const { return m_handle; }

private:
	app_control_h m_handle = nullptr;
};

} // namespace ct::test
