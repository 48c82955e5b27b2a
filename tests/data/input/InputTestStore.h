// Helpers of the editable-contact tests: a fresh store per test, reading
// stored contacts back and launch requests (contacts, groups, address books
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
#include <memory>
#include <string>

namespace ct::test {

// A fresh data folder, the main loop, a connection and SIM 1 on for one test.
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

	TempDataDir m_dir;
};

inline std::string str(const char* text)
{
	return text ? text : "<null>";
}

inline contacts_record_h readContact(int contactId)
{
	contacts_record_h contact = nullptr;
	contacts_db_get_record(_contacts_contact._uri, contactId, &contact);
	return contact;
}

inline std::string textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	contacts_record_get_str_p(record, property, &value);
	return value ? value : "";
}

inline contacts_record_h childAt(contacts_record_h record, unsigned int property, int index)
{
	contacts_record_h child = nullptr;
	contacts_record_get_child_record_at_p(record, property, index, &child);
	return child;
}

// A launch request with an operation (may be null) and extra data; the test owns it.
using Request = std::unique_ptr<app_control_s, int (*)(app_control_h)>;
inline Request request(const char* operation, const std::map<std::string, std::string>& extras = {})
{
	app_control_h handle = nullptr;
	app_control_create(&handle);
	if (operation)
		app_control_set_operation(handle, operation);
	for (const auto& [key, value] : extras)
		app_control_add_extra_data(handle, key.c_str(), value.c_str());
	return Request(handle, app_control_destroy);
}

} // namespace ct::test
