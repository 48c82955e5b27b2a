// Writing records of every view inside one write transaction.
#pragma once

#include "ContactsConnection.h"
#include "ContactsPersons.h"
#include "ContactsQuery.h"
#include "ContactsReader.h"
#include "ContactsRecord.h"

#include <set>
#include <string>
#include <utility>
#include <vector>

namespace ct::contacts {

class ContactsWriter {
public:
	ContactsWriter(ContactsConnection& conn, WriteContext& ctx);

	// Each returns a CONTACTS_ERROR_*; the caller's transaction rolls back on
	// any error. New ids reach the records only after the commit.
	int insert(contacts_record_s& record, int* id);
	int update(contacts_record_s& record);
	int remove(const ViewInfo& view, int id);

	int linkPersons(int basePersonId, int personId);
	int unlinkContact(int personId, int contactId, int* newPersonId);
	// property: a contacts_person_property_e value, checked here.
	int setDefaultProperty(int property, int personId, int id);

	// Recomputes what a contact derives from its children, refreshes its
	// person and records the change.
	int touchContact(int contactId, contacts_changed_e change);

private:
	using Extra = std::vector<std::pair<std::string, SqlParam>>;

	int __insertRow(const ViewInfo& view, const contacts_record_s& record, const Extra& extra, int* id);
	int __updateRow(const ViewInfo& view, const contacts_record_s& record, const Extra& extra, int id, bool* found);
	int __run(const char* sql, std::initializer_list<int> values);
	// defaults: children stored as their contact's default whatever they hold.
	int __writeChildren(contacts_record_s& record, int ownerId, int owner, bool replace,
		const std::set<const contacts_record_s*>& defaults = {});
	void __numberImageOrder(contacts_record_s& record);
	// The name display order setting, read once per write.
	int __nameOrder();
	int __checkChild(const ViewInfo& view, const contacts_record_s& child);
	int __insertContact(contacts_record_s& record, int* id);
	int __updateContact(contacts_record_s& record);
	int __deleteContact(int id);
	int __insertProfile(contacts_record_s& record, int* id);
	int __updateProfile(contacts_record_s& record);
	int __deleteProfile(int id);
	int __updatePerson(contacts_record_s& record);
	int __deletePerson(int id);
	int __insertStandaloneChild(contacts_record_s& record, int* id);
	int __updateStandaloneChild(contacts_record_s& record);
	int __deleteStandaloneChild(const ViewInfo& view, int id);
	// Ids in the first column of `sql` with one int parameter.
	std::vector<int> __selectIds(const char* sql, int param);
	int __deleteAddressBook(int id);
	int __deleteGroup(int id);
	// The first number and e-mail of a contact become the defaults when its
	// person has none.
	int __ensureDefaults(int contactId, int personId);
	int __logChange(int contactId, contacts_changed_e change, int addressBookId = -1);
	int __setIdAfterCommit(contacts_record_s& record, int id);
	void __touchContactViews();

	ContactsConnection& m_conn;
	WriteContext& m_ctx;
	ContactsReader m_reader;
	ContactsPersons m_persons;
	int m_nameOrder = -1;
};

} // namespace ct::contacts
