// Reading records of any view from the database.
#pragma once

#include "ContactsConnection.h"
#include "ContactsQuery.h"
#include "ContactsRecord.h"

namespace ct::contacts {

class ContactsReader {
public:
	explicit ContactsReader(ContactsConnection& conn) : m_conn(conn) {}

	// A new record with its children, read in one statement, or NO_DATA /
	// INVALID_PARAMETER. The caller owns *out.
	int readRecord(const ViewInfo& view, int id, contacts_record_s** out);
	// Records matching the query (all of the view when query is null); the
	// caller owns the list and its records.
	int readList(const ViewInfo& view, const contacts_query_s* query, int offset, int limit, contacts_list_h* out);
	int count(const ViewInfo& view, const contacts_query_s* query, int* out);
	// Ids of the contacts of a person, ascending.
	std::vector<int> contactIdsOfPerson(int personId);
	// Whether a row with this id exists in the view's table.
	bool exists(const ViewInfo& view, int id);

private:
	int __readRow(contacts_record_s& record, int id);
	int __readWithChildren(contacts_record_s& record, int id);
	int __where(const ViewInfo& view, const contacts_query_s* query, std::string& sql, std::vector<SqlParam>& params,
		const contacts_filter_s::IndexChoice& useIndex = nullptr);
	// For a limited read, the search planner weighs the trigram index against
	// walking the rows in the read's order; an unlimited one always narrows.
	contacts_filter_s::IndexChoice __indexChoice(const contacts_query_s* query, int offset, int limit);

	ContactsConnection& m_conn;
};

// Fills record values from the row: column firstColumn + i holds props[i].
void fillRecord(contacts_record_s& record, db::Statement& st, const std::vector<const PropertyInfo*>& props,
	int firstColumn = 0);

} // namespace ct::contacts
