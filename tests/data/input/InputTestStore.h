// Helpers of the editable-contact tests: the store with the SIMs set and
// reading stored contacts back (the rest comes from the detail store helpers).
#pragma once

#include "../detail/DetailTestStore.h"

#include <app_preference.h>
#include <vconf.h>

namespace ct::test {

// The store with SIM 1 on (and SIM 2 off) for one test.
class InputStoreTest : public StoreTest {
protected:
	void SetUp() override
	{
		StoreTest::SetUp();
		vconf_set_int("db/telephony/sim_power_state1", 1);
		vconf_set_int("db/telephony/sim_power_state2", 0);
	}
	void TearDown() override
	{
		preference_close_store();
		vconf_close_store();
		StoreTest::TearDown();
	}
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

} // namespace ct::test
