// Builds persons in the contacts service for the detail-data tests: address
// books, contacts with child records, linking, launch requests, a main-loop
// pump and a per-test store.
#pragma once

#include "CtRegistryMgr.h"
#include "ICtChangeListener.h"
#include "TempDataDir.h"

#include <Ecore.h>
#include <app_control.h>
#include <contacts.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace ct::test {

// Records the registry's change signals as (key, value) while it lives.
class SignalRecorder {
public:
	SignalRecorder()
	{
		m_id = CtRegistryMgr::getInstance()->addChangeListener(
			[this](ctRegistryKey key, int value) { signals.emplace_back(key, value); });
	}
	~SignalRecorder() { CtRegistryMgr::getInstance()->removeChangeListener(m_id); }
	int count(ctRegistryKey key) const
	{
		return std::count_if(signals.begin(), signals.end(), [key](const auto& s) { return s.first == key; });
	}
	std::vector<std::pair<ctRegistryKey, int>> signals;

private:
	int m_id = 0;
};

// Records the view URIs a change listener hears; `onChange` runs after each.
struct RecordingListener : ICtChangeListener {
	void onDbChanged(const char* viewUri) override
	{
		uris.push_back(viewUri ? viewUri : "");
		if (onChange)
			onChange();
	}
	void onCompleteGetContacts() override {}
	void onConditionChagned() override {}
	std::vector<std::string> uris;
	std::function<void()> onChange;
};

// A fresh data folder, the main loop and a store connection per test.
class StoreTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ecore_init();
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	}
	void TearDown() override
	{
		contacts_disconnect();
		ecore_shutdown();
	}
	TempDataDir m_dir;
};

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

template <typename Pred>
bool pumpUntil(Pred done, double seconds)
{
	double end = ecore_time_get() + seconds;
	while (!done() && ecore_time_get() < end)
		ecore_main_loop_iterate();
	return done();
}

// Lets every pending change notification arrive.
inline void settle(double seconds = 0.7)
{
	pumpUntil([] { return false; }, seconds);
}

inline int addAddressbook(const char* name, int mode, int accountId, const char* provider)
{
	contacts_record_h book = nullptr;
	contacts_record_create(_contacts_address_book._uri, &book);
	contacts_record_set_str(book, _contacts_address_book.name, name);
	contacts_record_set_int(book, _contacts_address_book.mode, mode);
	contacts_record_set_int(book, _contacts_address_book.account_id, accountId);
	contacts_record_set_str(book, _contacts_address_book.provider_name, provider);
	contacts_record_set_str(book, _contacts_address_book.user_name, "user@example.com");
	int id = -1;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(book, &id));
	contacts_record_destroy(book, true);
	return id;
}

inline contacts_record_h addChild(contacts_record_h contact, unsigned int property, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(contact, property, child);
	return child;
}

// Adds a child record with one text set; returns it (the contact owns it).
inline contacts_record_h addText(contacts_record_h contact, unsigned int list, const char* uri, unsigned int property,
	const char* text)
{
	contacts_record_h child = addChild(contact, list, uri);
	contacts_record_set_str(child, property, text);
	return child;
}

inline contacts_record_h newContact(int addressbookId, const char* firstName)
{
	contacts_record_h contact = nullptr;
	contacts_record_create(_contacts_contact._uri, &contact);
	contacts_record_set_int(contact, _contacts_contact.address_book_id, addressbookId);
	contacts_record_set_int(contact, _contacts_contact.link_mode, CONTACTS_CONTACT_LINK_MODE_IGNORE_ONCE);
	if (firstName) {
		contacts_record_h name = addChild(contact, _contacts_contact.name, _contacts_name._uri);
		contacts_record_set_str(name, _contacts_name.first, firstName);
	}
	return contact;
}

inline void addNumber(contacts_record_h contact, const char* number, int type, const char* label = nullptr)
{
	contacts_record_h child = addChild(contact, _contacts_contact.number, _contacts_number._uri);
	contacts_record_set_str(child, _contacts_number.number, number);
	contacts_record_set_int(child, _contacts_number.type, type);
	if (label)
		contacts_record_set_str(child, _contacts_number.label, label);
}

inline void addEmail(contacts_record_h contact, const char* email)
{
	contacts_record_h child = addChild(contact, _contacts_contact.email, _contacts_email._uri);
	contacts_record_set_str(child, _contacts_email.email, email);
	contacts_record_set_int(child, _contacts_email.type, CONTACTS_EMAIL_TYPE_HOME);
}

inline void addImage(contacts_record_h contact, const char* path, int order = 0)
{
	contacts_record_h child = addChild(contact, _contacts_contact.image, _contacts_image._uri);
	contacts_record_set_str(child, _contacts_image.path, path);
	contacts_record_set_int(child, _contacts_image_ex.order, order);
}

// Stores the contact (and destroys the handle); returns the new contact id.
inline int store(contacts_record_h contact)
{
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(contact, &id));
	contacts_record_destroy(contact, true);
	return id;
}

inline int personOf(int contactId)
{
	contacts_record_h contact = nullptr;
	if (contacts_db_get_record(_contacts_contact._uri, contactId, &contact) != CONTACTS_ERROR_NONE)
		return 0;
	int personId = 0;
	contacts_record_get_int(contact, _contacts_contact.person_id, &personId);
	contacts_record_destroy(contact, true);
	return personId;
}

// A person of one phone contact with just a name; returns the person id.
inline int addSimplePerson(const char* firstName, int* contactId = nullptr)
{
	int id = store(newContact(0, firstName));
	if (contactId)
		*contactId = id;
	return personOf(id);
}

// Links the persons of the contacts into the first one's person.
inline int linkContacts(const std::vector<int>& contactIds)
{
	int base = personOf(contactIds.front());
	for (int id : contactIds) {
		int person = personOf(id);
		if (person != base) {
			EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(base, person));
		}
	}
	return base;
}

inline void addNumberToStoredContact(int contactId, const char* number)
{
	contacts_record_h contact = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_contact._uri, contactId, &contact));
	addNumber(contact, number, CONTACTS_NUMBER_TYPE_CELL);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(contact));
	contacts_record_destroy(contact, true);
}

// Stores a group of the address book; returns its id.
inline int addGroup(int addressbookId, const char* name, const char* systemId = nullptr)
{
	contacts_record_h group = nullptr;
	contacts_record_create(_contacts_group._uri, &group);
	contacts_record_set_int(group, _contacts_group.address_book_id, addressbookId);
	if (name)
		contacts_record_set_str(group, _contacts_group.name, name);
	if (systemId)
		contacts_record_set_str(group, _contacts_group.system_id, systemId);
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(group, &id));
	contacts_record_destroy(group, true);
	return id;
}

// Reopens the database (last connection closes it), as a restart would.
inline void reopenStore()
{
	contacts_disconnect();
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
}

} // namespace ct::test
