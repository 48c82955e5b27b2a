// Helpers for the contacts service tests: a connected fresh data folder and
// short ways to build and read contacts.
#pragma once

#include "SqliteDatabase.h"
#include "TempDataDir.h"

#include <contacts.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace ct::test {

struct RecordDeleter {
	void operator()(contacts_record_h r) const { contacts_record_destroy(r, true); }
};
using RecordPtr = std::unique_ptr<contacts_record_s, RecordDeleter>;

struct ListDeleter {
	void operator()(contacts_list_h l) const { contacts_list_destroy(l, true); }
};
using ListPtr = std::unique_ptr<contacts_list_s, ListDeleter>;

// A fresh data folder with the service connected for the scope.
class ConnectedStore {
public:
	ConnectedStore() { EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_connect()); }
	~ConnectedStore() { contacts_disconnect(); }
	void reopen()
	{
		contacts_disconnect();
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	}
	const TempDataDir& dir() const { return m_dir; }

private:
	TempDataDir m_dir;
};

inline contacts_record_h addChild(contacts_record_h parent, unsigned prop, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_add_child_record(parent, prop, child));
	return child;
}

struct ContactSpec {
	ContactSpec(std::string f, std::string l, std::vector<std::string> n = {}, std::vector<std::string> e = {},
		int book = 0, std::string img = "")
		: first(std::move(f)), last(std::move(l)), numbers(std::move(n)), emails(std::move(e)), addressBook(book),
		  image(std::move(img))
	{
	}
	std::string first;
	std::string last;
	std::vector<std::string> numbers;
	std::vector<std::string> emails;
	int addressBook = 0;
	std::string image;
};

inline RecordPtr makeContact(const ContactSpec& wanted)
{
	contacts_record_h contact = nullptr;
	contacts_record_create(_contacts_contact._uri, &contact);
	contacts_record_set_int(contact, _contacts_contact.address_book_id, wanted.addressBook);
	if (!wanted.first.empty() || !wanted.last.empty()) {
		contacts_record_h name = addChild(contact, _contacts_contact.name, _contacts_name._uri);
		if (!wanted.first.empty())
			contacts_record_set_str(name, _contacts_name.first, wanted.first.c_str());
		if (!wanted.last.empty())
			contacts_record_set_str(name, _contacts_name.last, wanted.last.c_str());
	}
	for (const auto& n : wanted.numbers) {
		contacts_record_h number = addChild(contact, _contacts_contact.number, _contacts_number._uri);
		contacts_record_set_str(number, _contacts_number.number, n.c_str());
		contacts_record_set_int(number, _contacts_number.type, CONTACTS_NUMBER_TYPE_CELL);
	}
	for (const auto& e : wanted.emails) {
		contacts_record_h email = addChild(contact, _contacts_contact.email, _contacts_email._uri);
		contacts_record_set_str(email, _contacts_email.email, e.c_str());
	}
	if (!wanted.image.empty()) {
		contacts_record_h image = addChild(contact, _contacts_contact.image, _contacts_image._uri);
		contacts_record_set_str(image, _contacts_image.path, wanted.image.c_str());
	}
	return RecordPtr(contact);
}

// Inserts the contact; returns its id (0 on failure).
inline int insertContact(const ContactSpec& wanted)
{
	RecordPtr contact = makeContact(wanted);
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(contact.get(), &id));
	return id;
}

inline RecordPtr getRecord(const char* uri, int id)
{
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(uri, id, &r));
	return RecordPtr(r);
}

inline int intOf(contacts_record_h r, unsigned prop)
{
	int v = -1;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_int(r, prop, &v));
	return v;
}

inline std::string strOf(contacts_record_h r, unsigned prop)
{
	char* v = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_str_p(r, prop, &v));
	return v ? v : "";
}

inline int personOf(int contactId)
{
	RecordPtr c = getRecord(_contacts_contact._uri, contactId);
	return c ? intOf(c.get(), _contacts_contact.person_id) : 0;
}

inline int childCount(contacts_record_h r, unsigned prop)
{
	int count = -1;
	contacts_record_get_child_record_count(r, prop, &count);
	return count;
}

inline int countOf(const char* uri)
{
	int count = -1;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_count(uri, &count));
	return count;
}

// Ids of the records returned by a query, in order.
inline std::vector<int> queryIds(contacts_query_h query, unsigned idProp, int offset = 0, int limit = 0)
{
	contacts_list_h list = nullptr;
	std::vector<int> ids;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_records_with_query(query, offset, limit, &list));
	ListPtr owner(list);
	int count = 0;
	contacts_list_get_count(list, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h r = nullptr;
		contacts_list_get_current_record_p(list, &r);
		ids.push_back(intOf(r, idProp));
		contacts_list_next(list);
	}
	return ids;
}

} // namespace ct::test
