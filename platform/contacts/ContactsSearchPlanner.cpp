#include "ContactsSearchPlanner.h"

#include <algorithm>
#include <cmath>

namespace ct::contacts {
namespace {

// Measured on a 100,000-person store: fetching and sorting one index match
// costs about as much as walking six rows in display-name order.
constexpr double kCostPerIndexMatch = 6.0;
constexpr double kCostPerWalkedRow = 1.0;
constexpr int kMatchSample = 8;
constexpr int kNameSample = 64;

} // namespace

ContainsPlan ContactsSearchPlanner::choose(const std::string& text, int wanted, Order order)
{
	ContainsPlan plan;
	if (order == Order::Other || wanted <= 0)
		return plan;
	std::vector<int> matches = __indexMatches(text);
	size_t count = matches.size();
	if (count > static_cast<size_t>(wanted)) {
		double indexCost = kCostPerIndexMatch * count;
		double walkCost = kCostPerWalkedRow * __rowsToWalk(matches, wanted, order);
		if (walkCost < indexCost) {
			plan.kind = ContainsPlan::Kind::Walk;
			return plan;
		}
	}
	plan.kind = ContainsPlan::Kind::Matches;
	plan.matchIds = "[";
	for (size_t i = 0; i < count; ++i)
		plan.matchIds += (i ? "," : "") + std::to_string(matches[i]);
	plan.matchIds += "]";
	return plan;
}

std::vector<int> ContactsSearchPlanner::__indexMatches(const std::string& text)
{
	std::vector<int> ids;
	CachedStatement st(m_conn.statement("SELECT rowid FROM persons_fts WHERE persons_fts MATCH ?"));
	st->bind(1, ftsPhrase(text));
	while (st->step() == SQLITE_ROW)
		ids.push_back(st->columnInt(0));
	return ids;
}

std::vector<std::string> ContactsSearchPlanner::__namesOf(const std::vector<int>& ids)
{
	std::vector<std::string> names;
	std::string list;
	for (size_t i = 0; i < ids.size() && i < static_cast<size_t>(kMatchSample); ++i)
		list += (i ? "," : "") + std::to_string(ids[i]);
	CachedStatement st(m_conn.statement("SELECT display_name FROM persons WHERE id IN (SELECT value FROM json_each(?))"));
	st->bind(1, "[" + list + "]");
	while (st->step() == SQLITE_ROW)
		names.push_back(st->columnText(0));
	return names;
}

double ContactsSearchPlanner::__rowsToWalk(const std::vector<int>& matches, int wanted, Order order)
{
	__refreshSample();
	double rows = m_rowEstimate;
	if (order == Order::Rowid)
		return rows * wanted / matches.size();
	std::vector<std::string> names = __namesOf(matches);
	if (names.empty())
		return rows;
	std::sort(names.begin(), names.end());
	if (order == Order::NameDescending)
		std::reverse(names.begin(), names.end());
	// The sampled match that stands where the wanted-th match stands among all.
	size_t at = static_cast<size_t>(std::ceil(static_cast<double>(wanted) * names.size() / matches.size()));
	const std::string& last = names[std::clamp<size_t>(at, 1, names.size()) - 1];
	double share = __shareBefore(last);
	return std::max<double>(wanted, rows * (order == Order::NameAscending ? share : 1.0 - share));
}

double ContactsSearchPlanner::__shareBefore(const std::string& name) const
{
	if (m_sample.empty())
		return 0;
	auto it = std::lower_bound(m_sample.begin(), m_sample.end(), name);
	return static_cast<double>(it - m_sample.begin()) / m_sample.size();
}

void ContactsSearchPlanner::__refreshSample()
{
	int maxId = 0;
	{
		CachedStatement st(m_conn.statement("SELECT max(id) FROM persons"));
		if (st->step() == SQLITE_ROW)
			maxId = st->columnInt(0);
	}
	// Names move little between writes; the sample is taken again when the
	// store grew or shrank by a sixteenth.
	if (m_sampledAt >= 0 && std::abs(maxId - m_sampledAt) <= m_sampledAt / 16)
		return;
	m_sample.clear();
	int step = std::max(1, maxId / kNameSample);
	CachedStatement st(m_conn.statement("WITH RECURSIVE k(n) AS (SELECT 0 UNION ALL SELECT n + 1 FROM k WHERE n < ?) "
		"SELECT (SELECT display_name FROM persons WHERE id > n * ? ORDER BY id LIMIT 1) AS name FROM k "
		"WHERE name IS NOT NULL"));
	st->bind(1, kNameSample - 1).bind(2, step);
	while (st->step() == SQLITE_ROW)
		m_sample.push_back(st->columnText(0));
	std::sort(m_sample.begin(), m_sample.end());
	m_rowEstimate = maxId;
	m_sampledAt = maxId;
}

} // namespace ct::contacts
