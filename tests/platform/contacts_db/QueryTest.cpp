// Queries: string and number filters, AND/OR, sort, offset, limit, projection.
#include "ContactsTestSupport.h"

using namespace ct::test;

namespace {

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
	std::vector<int> run(unsigned idProp, int offset = 0, int limit = 0)
	{
		contacts_query_set_filter(query, filter);
		return queryIds(query, idProp, offset, limit);
	}
};

std::vector<int> personsWhoseNameMatches(contacts_match_str_flag_e match, const char* text)
{
	QueryOwner q(_contacts_person._uri);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_filter_add_str(q.filter, _contacts_person.display_name, match, text));
	contacts_query_set_sort(q.query, _contacts_person.id, true);
	return q.run(_contacts_person.id);
}

} // namespace

TEST(Query, StringMatchesAreLiteralAndCaseInsensitiveWhereTheyShouldBe)
{
	ConnectedStore store;
	int p1 = personOf(insertContact({ "100%", "Sure" }));
	int p2 = personOf(insertContact({ "a_b", "C\\D" }));
	int p3 = personOf(insertContact({ "Ábel", "Ørsted" }));
	int p4 = personOf(insertContact({ "Maria", "Anna" }));
	int p5 = personOf(insertContact({ "Annabel", "" }));

	EXPECT_EQ(std::vector<int>{ p1 }, personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "0%"));
	EXPECT_EQ(std::vector<int>{ p1 }, personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "00% s"));
	EXPECT_EQ(std::vector<int>{ p2 }, personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "_"));
	EXPECT_EQ(std::vector<int>{ p2 }, personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "b C\\d"));
	EXPECT_EQ(std::vector<int>{ p2 }, personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "\\"));
	EXPECT_TRUE(personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "%%").empty());
	EXPECT_TRUE(personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "' OR 1=1 --").empty());
	EXPECT_EQ((std::vector<int>{ p4, p5 }), personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "ANNA"));
	EXPECT_EQ((std::vector<int>{ p4, p5 }), personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "an"));
	EXPECT_EQ(std::vector<int>{ p3 }, personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, "Ørst"));
	EXPECT_EQ(std::vector<int>{ p5 }, personsWhoseNameMatches(CONTACTS_MATCH_STARTSWITH, "ann"));
	EXPECT_EQ(std::vector<int>{ p4 }, personsWhoseNameMatches(CONTACTS_MATCH_ENDSWITH, "ANNA"));
	EXPECT_EQ(std::vector<int>{ p4 }, personsWhoseNameMatches(CONTACTS_MATCH_EXACTLY, "Maria Anna"));
	EXPECT_TRUE(personsWhoseNameMatches(CONTACTS_MATCH_EXACTLY, "maria anna").empty());
	EXPECT_EQ(std::vector<int>{ p4 }, personsWhoseNameMatches(CONTACTS_MATCH_FULLSTRING, "maria anna"));
	std::string huge(300000, 'z');
	EXPECT_TRUE(personsWhoseNameMatches(CONTACTS_MATCH_CONTAINS, huge.c_str()).empty());
	EXPECT_TRUE(personsWhoseNameMatches(CONTACTS_MATCH_STARTSWITH, huge.c_str()).empty());
}

TEST(Query, NumberFiltersOperatorsSortOffsetLimitAndProjection)
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

	// Nested filter: (id = first OR id = last) AND favourite.
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

	// All records, with offset and limit; bad arguments.
	contacts_list_h all = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_all_records(_contacts_person._uri, 3, 0, &all));
	ListPtr allOwner(all);
	contacts_list_get_count(all, &count);
	EXPECT_EQ(2, count);
	contacts_list_h bad = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_all_records(_contacts_person._uri, -1, 0, &bad));
	QueryOwner dangling(_contacts_contact._uri);
	contacts_filter_add_int(dangling.filter, _contacts_contact.id, CONTACTS_MATCH_EQUAL, 1);
	contacts_filter_add_operator(dangling.filter, CONTACTS_FILTER_OPERATOR_AND);
	contacts_query_set_filter(dangling.query, dangling.filter);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_records_with_query(dangling.query, 0, 0, &bad));
}

TEST(Query, ChildViewsCanBeSearchedByContact)
{
	ConnectedStore store;
	int a = insertContact({ "A", "", { "+82 10 1234", "5678" } });
	insertContact({ "B", "", { "999" } });
	QueryOwner q(_contacts_number._uri);
	contacts_filter_add_int(q.filter, _contacts_number.contact_id, CONTACTS_MATCH_EQUAL, a);
	EXPECT_EQ(2u, q.run(_contacts_number.id).size());
	QueryOwner byNumber(_contacts_number._uri);
	contacts_filter_add_str(byNumber.filter, _contacts_number.cleaned_number, CONTACTS_MATCH_STARTSWITH, "+8210");
	EXPECT_EQ(1u, byNumber.run(_contacts_number.id).size());
}

TEST(Query, CommonAndRareSearchTextsGiveTheSameFirstPageEitherWay)
{
	ConnectedStore store;
	contacts_list_h list = nullptr;
	contacts_list_create(&list);
	for (int i = 0; i < 700; ++i)
		contacts_list_add(list, makeContact({ "Anna", "N" + std::to_string(1000 - i) }).release());
	contacts_list_add(list, makeContact({ "Zanna", "Aaron" }).release());
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_records(list, nullptr, nullptr));
	contacts_list_destroy(list, true);

	for (const char* text : { "ann", "anna n30", "Zann" }) {
		QueryOwner q(_contacts_person._uri);
		contacts_filter_add_str(q.filter, _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, text);
		contacts_query_set_sort(q.query, _contacts_person.display_name, true);
		std::vector<int> all = q.run(_contacts_person.id);
		std::vector<int> page = q.run(_contacts_person.id, 0, 10);
		ASSERT_FALSE(all.empty()) << text;
		all.resize(std::min<size_t>(all.size(), 10));
		EXPECT_EQ(all, page) << text;
		int count = 0;
		contacts_db_get_count_with_query(q.query, &count);
		EXPECT_EQ(std::string(text) == "ann" ? 701 : (std::string(text) == "Zann" ? 1 : 9), count) << text;
	}
}
