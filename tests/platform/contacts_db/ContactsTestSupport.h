// Helpers for the contacts service tests: a connected fresh data folder and
// short ways to build, read and query contacts.
#pragma once

#include "SqliteDatabase.h"
#include "TempDataDir.h"

#include <contacts.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace ct::test {

struct RecordDeleter { void operator()(contacts_record_h r) const { contacts_record_destroy(r, true); } };
using RecordPtr = std::unique_ptr<contacts_record_s, RecordDeleter>;

struct ListDeleter { void operator()(contacts_list_h l) const { contacts_list_destroy(l, true); } };
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

inline RecordPtr newRecord(const char* uri)
{
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_create(uri, &r));
	return RecordPtr(r);
}

inline contacts_record_h addChild(contacts_record_h parent, unsigned prop, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_add_child_record(parent, prop, child));
	return child;
}

// The i-th child under prop, owned by the parent (null when missing).
inline contacts_record_h childAt(contacts_record_h parent, unsigned prop, int i = 0)
{
	contacts_record_h child = nullptr;
	contacts_record_get_child_record_at_p(parent, prop, i, &child);
	return child;
}

struct ContactSpec {
	std::string first;
	std::string last;
	std::vector<std::string> numbers = {};
	std::vector<std::string> emails = {};
	int addressBook = 0;
	std::string image = "";
};

inline RecordPtr makeContact(const ContactSpec& wanted)
{
	RecordPtr contact = newRecord(_contacts_contact._uri);
	contacts_record_set_int(contact.get(), _contacts_contact.address_book_id, wanted.addressBook);
	if (!wanted.first.empty() || !wanted.last.empty()) {
		contacts_record_h name = addChild(contact.get(), _contacts_contact.name, _contacts_name._uri);
		if (!wanted.first.empty())
			contacts_record_set_str(name, _contacts_name.first, wanted.first.c_str());
		if (!wanted.last.empty())
			contacts_record_set_str(name, _contacts_name.last, wanted.last.c_str());
	}
	for (const auto& n : wanted.numbers) {
		contacts_record_h number = addChild(contact.get(), _contacts_contact.number, _contacts_number._uri);
		contacts_record_set_str(number, _contacts_number.number, n.c_str());
		contacts_record_set_int(number, _contacts_number.type, CONTACTS_NUMBER_TYPE_CELL);
	}
	for (const auto& e : wanted.emails)
		contacts_record_set_str(addChild(contact.get(), _contacts_contact.email, _contacts_email._uri),
			_contacts_email.email, e.c_str());
	if (!wanted.image.empty())
		contacts_record_set_str(addChild(contact.get(), _contacts_contact.image, _contacts_image._uri),
			_contacts_image.path, wanted.image.c_str());
	return contact;
}

// Inserts the record; returns its id (0 on failure).
inline int insertRecord(contacts_record_h record)
{
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(record, &id));
	return id;
}

inline int insertContact(const ContactSpec& wanted)
{
	return insertRecord(makeContact(wanted).get());
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

inline bool boolOf(contacts_record_h r, unsigned prop)
{
	bool v = false;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_bool(r, prop, &v));
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

// The text property of every child under list, in order.
inline std::vector<std::string> texts(contacts_record_h r, unsigned list, unsigned prop)
{
	std::vector<std::string> out;
	for (int i = 0; contacts_record_h child = childAt(r, list, i); ++i)
		out.push_back(strOf(child, prop));
	return out;
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

// A query with its filter on one view, destroyed with the scope.
struct QueryOwner {
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	explicit QueryOwner(const char* uri)
	{
		contacts_query_create(uri, &query);
		contacts_filter_create(uri, &filter);
	}
	~QueryOwner()
	{
		contacts_filter_destroy(filter);
		contacts_query_destroy(query);
	}
	// Ids of the records found, in order.
	std::vector<int> run(unsigned idProp, int offset = 0, int limit = 0)
	{
		contacts_query_set_filter(query, filter);
		contacts_list_h list = nullptr;
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_records_with_query(query, offset, limit, &list));
		ListPtr owner(list);
		int count = 0;
		contacts_list_get_count(list, &count);
		std::vector<int> ids;
		for (int i = 0; i < count; ++i, contacts_list_next(list)) {
			contacts_record_h r = nullptr;
			contacts_list_get_current_record_p(list, &r);
			ids.push_back(intOf(r, idProp));
		}
		return ids;
	}
};

} // namespace ct::test
