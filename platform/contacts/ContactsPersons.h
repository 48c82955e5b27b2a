// Persons: the aggregate of linked contacts, and the texts derived from a
// contact's children (display name and its source).
#pragma once

#include "ContactsConnection.h"
#include "ContactsRecord.h"

#include <string>

namespace ct::contacts {

struct DisplayName {
	std::string text;
	int source = CONTACTS_DISPLAY_NAME_SOURCE_TYPE_INVALID;
};

class ContactsPersons {
public:
	ContactsPersons(ContactsConnection& conn, WriteContext& ctx) : m_conn(conn), m_ctx(ctx) {}

	// The display name of a contact or profile record in the given order:
	// name, else nickname, company, number, e-mail.
	static DisplayName displayNameOf(const contacts_record_s& record, int nameDisplayOrder);
	// The upper-case first character of a display name, "#" when it is not a letter.
	static std::string indexOf(const std::string& displayName);

	// A new empty person; its id goes to *id.
	int create(int* id);
	// Recomputes every aggregated property of the person from its contacts
	// and moves its change marker; deletes the person when no contact is left.
	int refresh(int personId);

private:
	int __delete(int personId);

	ContactsConnection& m_conn;
	WriteContext& m_ctx;
};

} // namespace ct::contacts
