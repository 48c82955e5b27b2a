#include "../contacts_db/ContactsTestSupport.h"

#include <cstdlib>
#include <string>

using ct::test::newRecord;
using ct::test::RecordPtr;

TEST(ContactsRecord, TypedPropertiesRoundTripAndBadTypesViewsTextsAndHandlesAreRefused)
{
	RecordPtr person = newRecord(_contacts_person._uri);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_set_str(person.get(), _contacts_person.ringtone_path, "/a.ogg"));
	char* text = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_str_p(person.get(), _contacts_person.ringtone_path, &text));
	EXPECT_STREQ("/a.ogg", text);
	char* copy = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_str(person.get(), _contacts_person.ringtone_path, &copy));
	EXPECT_STREQ("/a.ogg", copy);
	EXPECT_NE(text, copy);
	free(copy);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_set_str(person.get(), _contacts_person.ringtone_path, nullptr));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_str_p(person.get(), _contacts_person.ringtone_path, &text));
	EXPECT_EQ(nullptr, text);

	int value = 7;
	long long big = 0;
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_get_int(person.get(), _contacts_person.display_name, &value));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_set_int(person.get(), _contacts_contact.id, 1));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_set_str(person.get(), 0xdeadbeef, "x"));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_get_int(nullptr, _contacts_person.id, &value));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_get_int(person.get(), _contacts_person.id, nullptr));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_get_lli(person.get(), _contacts_person.id, &big));

	contacts_record_h r = reinterpret_cast<contacts_record_h>(0x1);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_create("no.such.view", &r));
	EXPECT_EQ(nullptr, r);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_create(nullptr, &r));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_destroy(nullptr, true));
	RecordPtr name = newRecord(_contacts_name._uri);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_set_str(name.get(), _contacts_name.first, "bad \xC3\x28 utf8"));
	std::string huge(17 * 1024 * 1024, 'a');
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_set_str(name.get(), _contacts_name.first, huge.c_str()));
	huge.resize(2 * 1024 * 1024);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_set_str(name.get(), _contacts_name.first, huge.c_str()));
}

TEST(ContactsRecord, ChildRecordsAreOwnedCountedRemovedAndCloned)
{
	RecordPtr contact = newRecord(_contacts_contact._uri);
	for (const char* n : { "1", "2", "3" }) {
		contacts_record_h number = newRecord(_contacts_number._uri).release();
		contacts_record_set_str(number, _contacts_number.number, n);
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_add_child_record(contact.get(), _contacts_contact.number, number));
		// A child belongs to one parent only and is destroyed with it.
		EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_add_child_record(contact.get(), _contacts_contact.number, number));
		EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_destroy(number, true));
	}
	RecordPtr email = newRecord(_contacts_email._uri);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_add_child_record(contact.get(), _contacts_contact.number, email.get()));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_add_child_record(contact.get(), _contacts_contact.display_name, email.get()));

	contacts_record_h second = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, 1, &second));
	contacts_record_h none = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, 3, &none));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, -1, &none));

	contacts_record_h clone = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_clone(contact.get(), &clone));
	RecordPtr cloneOwner(clone);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_remove_child_record(contact.get(), _contacts_contact.number, second));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_record_remove_child_record(contact.get(), _contacts_contact.number, second));
	contacts_record_destroy(second, true);
	EXPECT_EQ(2, ct::test::childCount(contact.get(), _contacts_contact.number));
	EXPECT_EQ(3, ct::test::childCount(clone, _contacts_contact.number));

	contacts_list_h list = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_clone_child_record_list(clone, _contacts_contact.number, &list));
	int count = 0;
	contacts_list_get_count(list, &count);
	EXPECT_EQ(3, count);
	contacts_list_destroy(list, true);
}

TEST(ContactsList, CursorWalksAddsPrependsAndRemoves)
{
	contacts_list_h list = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_list_create(&list));
	ct::test::ListPtr owner(list);
	auto current = [list] {
		contacts_record_h r = nullptr;
		return contacts_list_get_current_record_p(list, &r) == CONTACTS_ERROR_NONE ? r : nullptr;
	};
	EXPECT_EQ(nullptr, current());
	contacts_record_h a = newRecord(_contacts_group._uri).release(), b = newRecord(_contacts_group._uri).release(),
					  c = newRecord(_contacts_group._uri).release();
	contacts_list_add(list, b);
	contacts_list_add(list, c);
	contacts_list_prepend(list, a);
	EXPECT_EQ(b, current());
	contacts_list_first(list);
	EXPECT_EQ(a, current());
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_list_prev(list));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_list_next(list));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_list_next(list));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_list_next(list));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_list_remove(list, c));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_list_remove(list, c));
	contacts_record_destroy(c, true);
	EXPECT_EQ(b, current());
	int count = 0;
	contacts_list_get_count(list, &count);
	EXPECT_EQ(2, count);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_list_get_count(nullptr, &count));
}

TEST(ContactsFilter, ConditionsAndOperatorsMustAlternate)
{
	contacts_filter_h filter = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_filter_create(_contacts_person._uri, &filter));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_filter_add_operator(filter, CONTACTS_FILTER_OPERATOR_AND));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_filter_add_str(filter, _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, "a"));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_filter_add_bool(filter, _contacts_person.is_favorite, true));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_filter_add_operator(filter, CONTACTS_FILTER_OPERATOR_OR));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_filter_add_int(filter, _contacts_person.display_name, CONTACTS_MATCH_EQUAL, 1));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_filter_add_int(filter, _contacts_contact.id, CONTACTS_MATCH_EQUAL, 1));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_filter_add_str(filter, _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, nullptr));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_filter_add_str(filter, _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, "\xff"));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_filter_add_bool(filter, _contacts_person.is_favorite, true));

	contacts_query_h query = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_query_create(_contacts_contact._uri, &query));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_query_set_filter(query, filter));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_query_set_sort(query, _contacts_person.display_name, true));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_query_set_sort(query, _contacts_contact.number, true));
	unsigned int projection[] = { _contacts_contact.id, _contacts_person.id };
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_query_set_projection(query, projection, 2));
	contacts_query_destroy(query);
	contacts_filter_destroy(filter);
}
