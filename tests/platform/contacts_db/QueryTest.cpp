// Queries: string and number filters, AND/OR, sort, offset, limit, projection.
#include "ContactsTestSupport.h"

using namespace ct::test;

TEST(Query, StringMatchesAreLiteralAndCaseInsensitiveWhereTheyShouldBe)
{
	ConnectedStore store;
	std::vector<int> p;
	for (ContactSpec c : std::vector<ContactSpec>{ { "100%", "Sure" }, { "a_b", "C\\D" }, { "Ábel", "Ørsted" },
			 { "Maria", "Anna" }, { "Annabel", "" } })
		p.push_back(personOf(insertContact(c)));
	const std::string huge(300000, 'z');
	struct Case {
		contacts_match_str_flag_e match;
		std::string text;
		std::vector<int> expected;
	} cases[] = {
		{ CONTACTS_MATCH_CONTAINS, "0%", { p[0] } },
		{ CONTACTS_MATCH_CONTAINS, "00% s", { p[0] } },
		{ CONTACTS_MATCH_CONTAINS, "_", { p[1] } },
		{ CONTACTS_MATCH_CONTAINS, "b C\\d", { p[1] } },
		{ CONTACTS_MATCH_CONTAINS, "\\", { p[1] } },
		{ CONTACTS_MATCH_CONTAINS, "%%", {} },
		{ CONTACTS_MATCH_CONTAINS, "' OR 1=1 --", {} },
		{ CONTACTS_MATCH_CONTAINS, "ANNA", { p[3], p[4] } },
		{ CONTACTS_MATCH_CONTAINS, "an", { p[3], p[4] } },
		{ CONTACTS_MATCH_CONTAINS, "Ørst", { p[2] } },
		{ CONTACTS_MATCH_STARTSWITH, "ann", { p[4] } },
		{ CONTACTS_MATCH_ENDSWITH, "ANNA", { p[3] } },
		{ CONTACTS_MATCH_EXACTLY, "Maria Anna", { p[3] } },
		{ CONTACTS_MATCH_EXACTLY, "maria anna", {} },
		{ CONTACTS_MATCH_FULLSTRING, "maria anna", { p[3] } },
		{ CONTACTS_MATCH_CONTAINS, huge, {} },
		{ CONTACTS_MATCH_STARTSWITH, huge, {} },
	};
	for (const Case& c : cases) {
		QueryOwner q(_contacts_person._uri);
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_filter_add_str(q.filter, _contacts_person.display_name, c.match, c.text.c_str()));
		contacts_query_set_sort(q.query, _contacts_person.id, true);
		EXPECT_EQ(c.expected, q.run(_contacts_person.id)) << c.match << " " << c.text.substr(0, 20);
	}
}

TEST(Query, NumberFiltersNestingSortOffsetLimitProjectionChildViewsAndBadArguments)
{
	ConnectedStore store;
	std::vector<int> contacts;
	for (const char* name : { "Eve", "Dan", "Cid", "Bea", "Abe" })
		contacts.push_back(insertContact({ name, "" }));
	RecordPtr fav = getRecord(_contacts_person._uri, personOf(contacts[1]));
	contacts_record_set_bool(fav.get(), _contacts_person.is_favorite, true);
	contacts_db_update_record(fav.get());

	QueryOwner q(_contacts_contact._uri);
	contacts_filter_add_int(q.filter, _contacts_contact.id, CONTACTS_MATCH_GREATER_THAN_OR_EQUAL, contacts[1]);
	contacts_filter_add_operator(q.filter, CONTACTS_FILTER_OPERATOR_AND);
	contacts_filter_add_int(q.filter, _contacts_contact.id, CONTACTS_MATCH_LESS_THAN, contacts[4]);
	contacts_filter_add_operator(q.filter, CONTACTS_FILTER_OPERATOR_OR);
	contacts_filter_add_bool(q.filter, _contacts_contact.is_favorite, true);
	contacts_query_set_sort(q.query, _contacts_contact.display_name, true);
	EXPECT_EQ((std::vector<int>{ contacts[3], contacts[2], contacts[1] }), q.run(_contacts_contact.id));
	EXPECT_EQ((std::vector<int>{ contacts[2] }), q.run(_contacts_contact.id, 1, 1));
	int count = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_count_with_query(q.query, &count));
	EXPECT_EQ(3, count);

	// Nested filter: (id = first OR id = second) AND favourite.
	QueryOwner nested(_contacts_contact._uri);
	contacts_filter_h inner = nullptr;
	contacts_filter_create(_contacts_contact._uri, &inner);
	contacts_filter_add_int(inner, _contacts_contact.id, CONTACTS_MATCH_EQUAL, contacts[0]);
	contacts_filter_add_operator(inner, CONTACTS_FILTER_OPERATOR_OR);
	contacts_filter_add_int(inner, _contacts_contact.id, CONTACTS_MATCH_EQUAL, contacts[1]);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_filter_add_filter(nested.filter, inner));
	contacts_filter_destroy(inner);
	contacts_filter_add_operator(nested.filter, CONTACTS_FILTER_OPERATOR_AND);
	contacts_filter_add_bool(nested.filter, _contacts_contact.is_favorite, true);
	EXPECT_EQ(std::vector<int>{ contacts[1] }, nested.run(_contacts_contact.id));

	// Projection: only the asked properties are read.
	QueryOwner projected(_contacts_person._uri);
	unsigned props[] = { _contacts_person.id, _contacts_person.display_name };
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_query_set_projection(projected.query, props, 2));
	contacts_query_set_sort(projected.query, _contacts_person.display_name, false);
	contacts_list_h list = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_records_with_query(projected.query, 0, 2, &list));
	ListPtr owner(list);
	contacts_record_h first = nullptr;
	contacts_list_get_current_record_p(list, &first);
	EXPECT_EQ("Eve", strOf(first, _contacts_person.display_name));
	EXPECT_EQ(0, intOf(first, _contacts_person.link_count));

	contacts_list_h all = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_all_records(_contacts_person._uri, 3, 0, &all));
	ListPtr allOwner(all);
	contacts_list_get_count(all, &count);
	EXPECT_EQ(2, count);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_all_records(_contacts_person._uri, -1, 0, &list));
	QueryOwner dangling(_contacts_contact._uri);
	contacts_filter_add_int(dangling.filter, _contacts_contact.id, CONTACTS_MATCH_EQUAL, 1);
	contacts_filter_add_operator(dangling.filter, CONTACTS_FILTER_OPERATOR_AND);
	contacts_query_set_filter(dangling.query, dangling.filter);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_records_with_query(dangling.query, 0, 0, &list));

	// Child views can be searched by contact and by number.
	int withNumbers = insertContact({ "Fay", "", { "+82 10 1234", "5678" } });
	QueryOwner numbers(_contacts_number._uri);
	contacts_filter_add_int(numbers.filter, _contacts_number.contact_id, CONTACTS_MATCH_EQUAL, withNumbers);
	EXPECT_EQ(2u, numbers.run(_contacts_number.id).size());
	QueryOwner byNumber(_contacts_number._uri);
	contacts_filter_add_str(byNumber.filter, _contacts_number.cleaned_number, CONTACTS_MATCH_STARTSWITH, "+8210");
	EXPECT_EQ(1u, byNumber.run(_contacts_number.id).size());
}
