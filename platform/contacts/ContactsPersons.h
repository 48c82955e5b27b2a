// Persons: the aggregate of linked contacts, and the texts derived from a
// contact's children (display name and its source).
#pragma once

#include "ContactsConnection.h"
#include "ContactsRecord.h"

#include <optional>
#include <string>

namespace ct::contacts {

struct DisplayName {
	std::string text;
	int source = CONTACTS_DISPLAY_NAME_SOURCE_TYPE_INVALID;
};

// What a contact row derives from the contact's children.
struct ContactSummary {
	DisplayName name;
	bool hasNumber = false;
	bool hasEmail = false;
	std::optional<std::string> thumbnail; // the default picture's path, else the first's
};

class ContactsPersons {
public:
	ContactsPersons(ContactsConnection& conn, WriteContext& ctx) : m_conn(conn), m_ctx(ctx) {}

	// The display name of a contact or profile record in the given order:
	// name, else nickname, company, number, e-mail.
	static DisplayName displayNameOf(const contacts_record_s& record, int nameDisplayOrder);
	static ContactSummary summaryOf(const contacts_record_s& contact, int nameDisplayOrder);
	// The upper-case first character of a display name, "#" when it is not a letter.
	static std::string indexOf(const std::string& displayName);

	// A new empty person; its id goes to *id.
	int create(int* id);
	// The person of a contact about to be inserted as its only one, written
	// once and complete. *displayContactId is the id the contact's row will
	// get; when the insert gives another, call setDisplayContact().
	int createFor(const contacts_record_s& contact, const ContactSummary& summary, int* id, int* displayContactId);
	int setDisplayContact(int personId, int contactId);
	// Recomputes every aggregated property of the person from its contacts
	// and moves its change marker; deletes the person when no contact is left.
	int refresh(int personId);

private:
	int __delete(int personId);

	ContactsConnection& m_conn;
	WriteContext& m_ctx;
};

} // namespace ct::contacts
