// Chooses how a limited read finds the persons whose display name contains a
// text: through the trigram index, whose cost grows with the number of
// matches (all of them are fetched and sorted), or by walking the rows in the
// read's order until enough match, whose cost grows with how far in that
// order the matches lie. Both are estimated from the number of matches, the
// names of a few of them and a sample of all display names.
#pragma once

#include "ContactsConnection.h"
#include "ContactsQuery.h"

#include <string>
#include <vector>

namespace ct::contacts {

class ContactsSearchPlanner {
public:
	enum class Order { Rowid, NameAscending, NameDescending, Other };

	explicit ContactsSearchPlanner(ContactsConnection& conn) : m_conn(conn) {}
	ContactsSearchPlanner(const ContactsSearchPlanner&) = delete;
	ContactsSearchPlanner& operator=(const ContactsSearchPlanner&) = delete;

	// The cheaper way to read the first `wanted` persons in `order` whose
	// display name contains `text`. The index is asked once: when it wins,
	// the plan carries what it found.
	ContainsPlan choose(const std::string& text, int wanted, Order order);

private:
	std::vector<int> __indexMatches(const std::string& text);
	// Display names of a few of the matches.
	std::vector<std::string> __namesOf(const std::vector<int>& ids);
	// Rows walked before `wanted` of the matches turn up.
	double __rowsToWalk(const std::vector<int>& matches, int wanted, Order order);
	// Share of all display names that sort before `name`.
	double __shareBefore(const std::string& name) const;
	void __refreshSample();

	ContactsConnection& m_conn;
	int m_rowEstimate = 0;
	int m_sampledAt = -1;
	std::vector<std::string> m_sample; // sorted names of evenly spaced persons
};

} // namespace ct::contacts
