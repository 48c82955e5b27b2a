#include "ContactsReader.h"

#include "ContactsDebug.h"
#include "ContactsList.h"
#include "ContactsSearchPlanner.h"
#include "contacts_list.h"
#include "contacts_views.h"

#include <algorithm>
#include <memory>
#include <optional>

namespace ct::contacts {

void fillRecord(contacts_record_s& record, db::Statement& st, const std::vector<const PropertyInfo*>& props,
	int firstColumn)
{
	for (size_t i = 0; i < props.size(); ++i) {
		const PropertyInfo* p = props[i];
		auto& v = record.values[p->slot];
		int col = firstColumn + static_cast<int>(i);
		v.set = true;
		switch (p->type) {
		case PropType::Str:
			if (const char* text = st.columnTextPtr(col))
				v.s = std::string(text, static_cast<size_t>(st.columnBytes(col)));
			else
				v.s.reset();
			break;
		case PropType::Double:
			v.d = st.columnDouble(col);
			break;
		default:
			v.i = st.columnInt64(col);
			break;
		}
	}
}

bool ContactsReader::exists(const ViewInfo& view, int id)
{
	if (!view.table || id < 0)
		return false;
	CachedStatement st(m_conn.statement(std::string("SELECT 1 FROM ") + view.table + " WHERE id = ?"));
	return st->bind(1, id).step() == SQLITE_ROW;
}

std::vector<int> ContactsReader::contactIdsOfPerson(int personId)
{
	std::vector<int> ids;
	CachedStatement st(m_conn.statement("SELECT id FROM contacts WHERE person_id = ? ORDER BY id"));
	st->bind(1, personId);
	while (st->step() == SQLITE_ROW)
		ids.push_back(st->columnInt(0));
	return ids;
}

int ContactsReader::readRecord(const ViewInfo& view, int id, contacts_record_s** out)
{
	*out = nullptr;
	WPRET_VM(!view.findByName("id") || !view.readSource, CONTACTS_ERROR_INVALID_PARAMETER,
		"records of %s cannot be read by id", view.uri);
	WPRET_VM(id < 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : id %d", id);
	auto record = std::make_unique<contacts_record_s>(view);
	int err = view.selectWithChildrenSql.empty() ? __readRow(*record, id) : __readWithChildren(*record, id);
	if (err == CONTACTS_ERROR_NONE)
		*out = record.release();
	return err;
}

int ContactsReader::__readRow(contacts_record_s& record, int id)
{
	const ViewInfo& view = *record.view;
	CachedStatement st(m_conn.statement(view.selectByIdSql));
	int rc = st->bind(1, id).step();
	if (rc == SQLITE_DONE)
		return CONTACTS_ERROR_NO_DATA;
	if (rc != SQLITE_ROW)
		return m_conn.failed(view.uri, rc);
	fillRecord(record, *st, view.columns);
	return CONTACTS_ERROR_NONE;
}

int ContactsReader::__readWithChildren(contacts_record_s& record, int id)
{
	const ViewInfo& view = *record.view;
	std::vector<const PropertyInfo*> parts;
	for (const PropertyInfo& p : view.props)
		if (p.type == PropType::Record)
			parts.push_back(&p);
	// One statement reads one state of the file: no transaction is needed.
	CachedStatement st(m_conn.statement(view.selectWithChildrenSql));
	st->bind(1, id).bind(2, view.number == kMyProfileView ? 1 : 0);
	bool found = false;
	int rc;
	while ((rc = st->step()) == SQLITE_ROW) {
		size_t part = static_cast<size_t>(st->columnInt(ViewInfo::kPartColumn));
		if (part == 0) {
			fillRecord(record, *st, view.columns, ViewInfo::kFirstValueColumn);
			found = true;
		} else if (part <= parts.size()) {
			const PropertyInfo& p = *parts[part - 1];
			auto* c = new contacts_record_s(*p.child);
			fillRecord(*c, *st, p.child->columns, ViewInfo::kFirstValueColumn);
			c->parent = &record;
			record.childLists[p.slot].push_back(c);
		}
	}
	if (rc != SQLITE_DONE)
		return m_conn.failed(view.uri, rc);
	for (const PropertyInfo* p : parts) {
		auto& list = record.childLists[p->slot];
		std::stable_sort(list.begin(), list.end(), [](const contacts_record_s* a, const contacts_record_s* b) {
			return a->getInt64("id") < b->getInt64("id");
		});
	}
	return found ? CONTACTS_ERROR_NONE : CONTACTS_ERROR_NO_DATA;
}

contacts_filter_s::IndexChoice ContactsReader::__indexChoice(const contacts_query_s* query, int offset, int limit)
{
	if (limit <= 0)
		return nullptr;
	using Order = ContactsSearchPlanner::Order;
	Order order = Order::Rowid;
	if (query && !query->sort.empty()) {
		bool byName = query->sort.front().first->id == _contacts_person.display_name;
		order = !byName ? Order::Other : query->sort.front().second ? Order::NameAscending : Order::NameDescending;
	}
	ContactsSearchPlanner& planner = m_conn.searchPlanner();
	return [&planner, order, wanted = offset + limit](const std::string& text) {
		return planner.choose(text, wanted, order);
	};
}

int ContactsReader::__where(const ViewInfo& view, const contacts_query_s* query, std::string& sql,
	std::vector<SqlParam>& params, const contacts_filter_s::IndexChoice& useIndex)
{
	bool hasBase = view.baseWhere != nullptr;
	bool hasFilter = query && query->filter;
	if (!hasBase && !hasFilter)
		return CONTACTS_ERROR_NONE;
	sql += " WHERE ";
	if (hasBase)
		sql += view.baseWhere;
	if (hasBase && hasFilter)
		sql += " AND ";
	return hasFilter ? query->filter->toSql(sql, params, useIndex) : CONTACTS_ERROR_NONE;
}

int ContactsReader::readList(const ViewInfo& view, const contacts_query_s* query, int offset, int limit,
	contacts_list_h* out)
{
	*out = nullptr;
	WPRET_VM(!view.readSource || offset < 0 || limit < 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	const std::vector<const PropertyInfo*>* props = &view.columns;
	std::string cols;
	if (query && !query->projection.empty())
		props = &query->projection;
	for (const PropertyInfo* p : *props)
		cols += (cols.empty() ? "" : ", ") + quoted(p->name);
	std::string sql = std::string("SELECT ") + (query && query->distinct ? "DISTINCT " : "") + cols + " FROM "
		+ view.readSource;
	std::vector<SqlParam> params;
	// A planned read sees one state of the file from planning to reading,
	// and takes the read lock once.
	std::optional<db::ReadSnapshot> snapshot;
	contacts_filter_s::IndexChoice plan = __indexChoice(query, offset, limit);
	contacts_filter_s::IndexChoice choice = !plan ? plan : [&](const std::string& text) {
		if (!snapshot)
			snapshot.emplace(m_conn.database());
		return plan(text);
	};
	int err = __where(view, query, sql, params, choice);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	if (query && !query->sort.empty()) {
		sql += " ORDER BY ";
		for (size_t i = 0; i < query->sort.size(); ++i)
			sql += (i ? ", " : "") + quoted(query->sort[i].first->name) + (query->sort[i].second ? " ASC" : " DESC");
	}
	sql += " LIMIT ? OFFSET ?";
	SqlParam lim, off;
	lim.i = limit > 0 ? limit : -1;
	off.i = offset;
	params.push_back(lim);
	params.push_back(off);

	CachedStatement st(m_conn.statement(sql));
	WPRET_VM(!st->valid(), CONTACTS_ERROR_DB, "bad query");
	contacts_list_create(out);
	bindParams(*st, params);
	int rc;
	while ((rc = st->step()) == SQLITE_ROW) {
		auto* r = new contacts_record_s(view);
		fillRecord(*r, *st, *props);
		(*out)->records.push_back(r);
	}
	if (rc != SQLITE_DONE) {
		contacts_list_destroy(*out, true);
		*out = nullptr;
		return m_conn.failed("query", rc);
	}
	return CONTACTS_ERROR_NONE;
}

int ContactsReader::count(const ViewInfo& view, const contacts_query_s* query, int* out)
{
	*out = 0;
	WPRET_VM(!view.readSource, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	std::string sql = std::string("SELECT count(*) FROM ") + view.readSource;
	if (query && query->distinct && !query->projection.empty()) {
		std::string cols;
		for (const PropertyInfo* p : query->projection)
			cols += (cols.empty() ? "" : ", ") + quoted(p->name);
		sql = "SELECT count(*) FROM (SELECT DISTINCT " + cols + " FROM " + view.readSource;
	}
	std::vector<SqlParam> params;
	int err = __where(view, query, sql, params);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	if (query && query->distinct && !query->projection.empty())
		sql += ")";
	CachedStatement st(m_conn.statement(sql));
	bindParams(*st, params);
	int rc = st->step();
	if (rc != SQLITE_ROW)
		return m_conn.failed("count", rc);
	*out = st->columnInt(0);
	return CONTACTS_ERROR_NONE;
}

} // namespace ct::contacts
