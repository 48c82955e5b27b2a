// The plan of a limited "display name contains" read: walking in name order
// when the matches come early, the trigram index when they are few or sort
// late; either way the same page and count as an unlimited read.
#include "ContactsConnection.h"
#include "ContactsSearchPlanner.h"
#include "ContactsTestSupport.h"

using namespace ct::test;
using ct::contacts::ContactsConnection;
using ct::contacts::ContactsSearchPlanner;
using ct::contacts::ContainsPlan;

namespace {

// 600 persons sort first ("Aaron ..."), 300 between, and 40 "Zoë ..." last.
void insertPeople()
{
	contacts_list_h list = nullptr;
	contacts_list_create(&list);
	ListPtr owner(list);
	for (int i = 0; i < 600; ++i)
		contacts_list_add(list, makeContact({ "Aaron", "K" + std::to_string(1000 + i) }).release());
	for (int i = 0; i < 300; ++i)
		contacts_list_add(list, makeContact({ "Mia", "Q" + std::to_string(1000 + i) }).release());
	for (int i = 0; i < 40; ++i)
		contacts_list_add(list, makeContact({ "Zoë", "Ann" + std::to_string(i) }).release());
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_records(list, nullptr, nullptr));
}

ContainsPlan::Kind planOf(const char* text, ContactsSearchPlanner::Order order)
{
	return ContactsConnection::current()->searchPlanner().choose(text, 10, order).kind;
}

} // namespace

TEST(SearchPlan, EarlyCommonMatchesAreWalkedFewOrLateOnesGoThroughTheIndex)
{
	ConnectedStore store;
	insertPeople();
	using Order = ContactsSearchPlanner::Order;
	using Kind = ContainsPlan::Kind;
	struct Case {
		const char* text;
		Order order;
		Kind expected;
	} cases[] = {
		{ "Aaron", Order::NameAscending, Kind::Walk },
		{ "Aaron", Order::NameDescending, Kind::Walk },
		{ "Aaron K10", Order::NameAscending, Kind::Walk },
		{ "Aaron K10", Order::NameDescending, Kind::Matches },
		{ "Zoë", Order::NameAscending, Kind::Matches },
		{ "Zoë", Order::NameDescending, Kind::Walk },
		{ "K1003", Order::NameAscending, Kind::Matches },
		{ "qxz", Order::NameAscending, Kind::Matches },
		{ "Aaron", Order::Rowid, Kind::Walk },
		{ "Aaron", Order::Other, Kind::Phrase },
	};
	for (const Case& c : cases)
		EXPECT_EQ(c.expected, planOf(c.text, c.order)) << c.text << " " << static_cast<int>(c.order);
}

TEST(SearchPlan, EveryPlanGivesThePageOfTheUnlimitedRead)
{
	ConnectedStore store;
	insertPeople();
	insertContact({ "Quote\"d", "Zoë" });
	struct Sort {
		bool set;
		unsigned prop;
		bool ascending;
	} sorts[] = { { true, _contacts_person.display_name, true }, { true, _contacts_person.display_name, false },
		{ false, 0, true }, { true, _contacts_person.id, false } };
	for (const char* text : { "aaron", "Zoë", "ZOË", "K1003", "q10", "e\"d Z", "qxz", "Mia Q12" }) {
		for (const Sort& sort : sorts) {
			for (int offset : { 0, 7, 35 }) {
				QueryOwner q(_contacts_person._uri);
				contacts_filter_add_str(q.filter, _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, text);
				if (sort.set)
					contacts_query_set_sort(q.query, sort.prop, sort.ascending);
				contacts_query_set_sort(q.query, _contacts_person.id, true);
				std::vector<int> all = q.run(_contacts_person.id);
				int count = -1;
				EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_count_with_query(q.query, &count));
				EXPECT_EQ(static_cast<int>(all.size()), count) << text;
				std::vector<int> expected(all.begin() + std::min<size_t>(offset, all.size()),
					all.begin() + std::min<size_t>(offset + 10, all.size()));
				EXPECT_EQ(expected, q.run(_contacts_person.id, offset, 10))
					<< text << " sort " << sort.prop << (sort.ascending ? " asc" : " desc") << " offset " << offset;
			}
		}
	}
}
