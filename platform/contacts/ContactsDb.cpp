// The contacts_db_*, contacts_person_*, contacts_group_* and setting entry points.
#include "ContactsConnection.h"
#include "ContactsDebug.h"
#include "ContactsList.h"
#include "ContactsRawValue.h"
#include "ContactsReader.h"
#include "ContactsWriter.h"
#include "contacts_db.h"
#include "contacts_list.h"
#include "contacts_record.h"
#include "contacts_service.h"

#include <cstdlib>
#include <cstring>
#include <memory>

using namespace ct::contacts;

namespace {

#define CT_CONNECTION_OR_RETURN(conn) \
	ContactsConnection* conn = ContactsConnection::current(); \
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected")

// Runs fn in one write transaction of the current connection.
int write(const std::function<int(ContactsWriter&)>& fn)
{
	CT_CONNECTION_OR_RETURN(conn);
	return conn->write([&](WriteContext& ctx) {
		ContactsWriter writer(*conn, ctx);
		return fn(writer);
	});
}

const ViewInfo* viewOrLog(const char* uri)
{
	const ViewInfo* v = ContactsSchema::view(uri);
	if (!v)
		WERROR("unknown view %s", uri ? uri : "(null)");
	return v;
}

} // namespace

extern "C" {

int contacts_db_insert_record(contacts_record_h record, int* id)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	WPRET_VM(record->parent, CONTACTS_ERROR_INVALID_PARAMETER, "a child record is saved with its parent");
	if (id)
		*id = 0;
	int newId = 0;
	int err = write([&](ContactsWriter& w) { return w.insert(*record, &newId); });
	if (err == CONTACTS_ERROR_NONE && id)
		*id = newId;
	return err;
}

int contacts_db_update_record(contacts_record_h record)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	WPRET_VM(record->parent, CONTACTS_ERROR_INVALID_PARAMETER, "a child record is saved with its parent");
	return write([&](ContactsWriter& w) { return w.update(*record); });
}

int contacts_db_delete_record(const char* view_uri, int record_id)
{
	const ViewInfo* view = viewOrLog(view_uri);
	WPRET_VM(!view, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : view");
	return write([&](ContactsWriter& w) { return w.remove(*view, record_id); });
}

int contacts_db_replace_record(contacts_record_h record, int id)
{
	WPRET_VM(!record || id <= 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	auto* value = record->value("id");
	WPRET_VM(!value, CONTACTS_ERROR_INVALID_PARAMETER, "records of %s have no id", record->view->uri);
	int previous = static_cast<int>(value->i);
	value->i = id;
	int err = contacts_db_update_record(record);
	if (err != CONTACTS_ERROR_NONE)
		value->i = previous;
	return err;
}

int contacts_db_get_record(const char* view_uri, int record_id, contacts_record_h* record)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	*record = nullptr;
	const ViewInfo* view = viewOrLog(view_uri);
	WPRET_VM(!view, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : view");
	CT_CONNECTION_OR_RETURN(conn);
	return ContactsReader(*conn).readRecord(*view, record_id, record);
}

int contacts_db_get_all_records(const char* view_uri, int offset, int limit, contacts_list_h* record_list)
{
	WPRET_VM(!record_list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	*record_list = nullptr;
	const ViewInfo* view = viewOrLog(view_uri);
	WPRET_VM(!view, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : view");
	CT_CONNECTION_OR_RETURN(conn);
	return ContactsReader(*conn).readList(*view, nullptr, offset, limit, record_list);
}

int contacts_db_get_records_with_query(contacts_query_h query, int offset, int limit, contacts_list_h* record_list)
{
	WPRET_VM(!record_list || !query, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	*record_list = nullptr;
	CT_CONNECTION_OR_RETURN(conn);
	return ContactsReader(*conn).readList(*query->view, query, offset, limit, record_list);
}

int contacts_db_get_count(const char* view_uri, int* count)
{
	WPRET_VM(!count, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : count");
	*count = 0;
	const ViewInfo* view = viewOrLog(view_uri);
	WPRET_VM(!view, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : view");
	CT_CONNECTION_OR_RETURN(conn);
	return ContactsReader(*conn).count(*view, nullptr, count);
}

int contacts_db_get_count_with_query(contacts_query_h query, int* count)
{
	WPRET_VM(!count || !query, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	*count = 0;
	CT_CONNECTION_OR_RETURN(conn);
	return ContactsReader(*conn).count(*query->view, query, count);
}

int contacts_db_insert_records(contacts_list_h record_list, int** ids, int* count)
{
	WPRET_VM(!record_list || record_list->records.empty(), CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	std::vector<int> newIds(record_list->records.size());
	int err = write([&](ContactsWriter& w) {
		for (size_t i = 0; i < record_list->records.size(); ++i) {
			int e = w.insert(*record_list->records[i], &newIds[i]);
			if (e != CONTACTS_ERROR_NONE)
				return e;
		}
		return static_cast<int>(CONTACTS_ERROR_NONE);
	});
	if (err != CONTACTS_ERROR_NONE)
		return err;
	if (ids) {
		*ids = static_cast<int*>(malloc(sizeof(int) * newIds.size()));
		if (!*ids)
			return CONTACTS_ERROR_OUT_OF_MEMORY;
		for (size_t i = 0; i < newIds.size(); ++i)
			(*ids)[i] = newIds[i];
	}
	if (count)
		*count = static_cast<int>(newIds.size());
	return CONTACTS_ERROR_NONE;
}

int contacts_db_update_records(contacts_list_h record_list)
{
	WPRET_VM(!record_list || record_list->records.empty(), CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	return write([&](ContactsWriter& w) {
		for (contacts_record_h r : record_list->records) {
			int e = w.update(*r);
			if (e != CONTACTS_ERROR_NONE)
				return e;
		}
		return static_cast<int>(CONTACTS_ERROR_NONE);
	});
}

int contacts_db_delete_records(const char* view_uri, int record_id_array[], int count)
{
	const ViewInfo* view = viewOrLog(view_uri);
	WPRET_VM(!view || !record_id_array || count <= 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	return write([&](ContactsWriter& w) {
		for (int i = 0; i < count; ++i) {
			int e = w.remove(*view, record_id_array[i]);
			if (e != CONTACTS_ERROR_NONE)
				return e;
		}
		return static_cast<int>(CONTACTS_ERROR_NONE);
	});
}

int contacts_db_get_changes_by_version(const char* view_uri, int address_book_id, int contacts_db_version,
	contacts_list_h* change_record_list, int* current_contacts_db_version)
{
	WPRET_VM(!change_record_list || !current_contacts_db_version, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	*change_record_list = nullptr;
	*current_contacts_db_version = 0;
	const ViewInfo* view = viewOrLog(view_uri);
	WPRET_VM(!view || view->number != kUpdatedInfoView, CONTACTS_ERROR_INVALID_PARAMETER,
		"changes are read from the contact-updated view");
	WPRET_VM(contacts_db_version < 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : version");
	CT_CONNECTION_OR_RETURN(conn);
	contacts_list_create(change_record_list);
	CachedStatement st(conn->statement(view->selectSql
		+ " WHERE version > ? AND (? < 0 OR address_book_id = ?) ORDER BY version, rowid"));
	st->bind(1, contacts_db_version).bind(2, address_book_id).bind(3, address_book_id);
	int rc;
	while ((rc = st->step()) == SQLITE_ROW) {
		auto* r = new contacts_record_s(*view);
		fillRecord(*r, *st, view->columns);
		(*change_record_list)->records.push_back(r);
	}
	if (rc != SQLITE_DONE) {
		contacts_list_destroy(*change_record_list, true);
		*change_record_list = nullptr;
		return conn->failed("changes", rc);
	}
	*current_contacts_db_version = conn->currentVersion();
	return CONTACTS_ERROR_NONE;
}

int contacts_person_link_person(int base_person_id, int person_id)
{
	return write([&](ContactsWriter& w) { return w.linkPersons(base_person_id, person_id); });
}

int contacts_person_unlink_contact(int person_id, int contact_id, int* unlinked_person_id)
{
	int newId = 0;
	int err = write([&](ContactsWriter& w) { return w.unlinkContact(person_id, contact_id, &newId); });
	if (unlinked_person_id)
		*unlinked_person_id = err == CONTACTS_ERROR_NONE ? newId : 0;
	return err;
}

int contacts_person_set_default_property(contacts_person_property_e property, int person_id, int id)
{
	WPRET_VM(person_id <= 0 || id <= 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : %d, %d", person_id, id);
	int kind = rawValue(property);
	return write([&](ContactsWriter& w) { return w.setDefaultProperty(kind, person_id, id); });
}

int contacts_person_get_default_property(contacts_person_property_e property, int person_id, int* id)
{
	WPRET_VM(!id, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : id");
	*id = 0;
	WPRET_VM(person_id <= 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : person %d", person_id);
	CT_CONNECTION_OR_RETURN(conn);
	const char* sql = nullptr;
	switch (rawValue(property)) {
	case CONTACTS_PERSON_PROPERTY_NAME_CONTACT: sql = "SELECT display_contact_id FROM persons WHERE id = ?"; break;
	case CONTACTS_PERSON_PROPERTY_IMAGE: sql = "SELECT image_id FROM persons WHERE id = ?"; break;
	case CONTACTS_PERSON_PROPERTY_NUMBER:
		sql = "SELECT t.id FROM numbers t JOIN contacts c ON c.id = t.contact_id WHERE c.person_id = ? "
		      "AND t.owner = 0 ORDER BY t.is_default DESC, t.id LIMIT 1";
		break;
	case CONTACTS_PERSON_PROPERTY_EMAIL:
		sql = "SELECT t.id FROM emails t JOIN contacts c ON c.id = t.contact_id WHERE c.person_id = ? "
		      "AND t.owner = 0 ORDER BY t.is_default DESC, t.id LIMIT 1";
		break;
	default:
		WERROR("Invalid param : property %d", rawValue(property));
		return CONTACTS_ERROR_INVALID_PARAMETER;
	}
	if (!ContactsReader(*conn).exists(*ContactsSchema::view("contacts.view.person"), person_id))
		return CONTACTS_ERROR_NO_DATA;
	CachedStatement st(conn->statement(sql));
	if (st->bind(1, person_id).step() == SQLITE_ROW)
		*id = st->columnInt(0);
	return CONTACTS_ERROR_NONE;
}

int contacts_group_add_contact(int group_id, int contact_id)
{
	contacts_record_h relation = nullptr;
	int err = contacts_record_create("contacts.view.group_relation", &relation);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	relation->setInt("group_id", group_id);
	relation->setInt("contact_id", contact_id);
	err = contacts_db_insert_record(relation, nullptr);
	contacts_record_destroy(relation, true);
	return err;
}

int contacts_group_remove_contact(int group_id, int contact_id)
{
	CT_CONNECTION_OR_RETURN(conn);
	int relationId = 0;
	{
		CachedStatement st(conn->statement(
			"SELECT id FROM group_relations WHERE group_id = ? AND contact_id = ? AND owner = 0"));
		if (st->bind(1, group_id).bind(2, contact_id).step() != SQLITE_ROW)
			return CONTACTS_ERROR_NO_DATA;
		relationId = st->columnInt(0);
	}
	return contacts_db_delete_record("contacts.view.group_relation", relationId);
}

int contacts_setting_get_name_display_order(contacts_name_display_order_e* name_display_order)
{
	WPRET_VM(!name_display_order, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	*name_display_order = CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST;
	CT_CONNECTION_OR_RETURN(conn);
	*name_display_order = static_cast<contacts_name_display_order_e>(conn->nameDisplayOrder());
	return CONTACTS_ERROR_NONE;
}

int contacts_setting_set_name_display_order(contacts_name_display_order_e order)
{
	int value = rawValue(order);
	WPRET_VM(value != CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST && value != CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST,
		CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : order %d", value);
	CT_CONNECTION_OR_RETURN(conn);
	return conn->write([&](WriteContext& ctx) {
		{
			CachedStatement st(conn->statement("UPDATE meta SET value = ? WHERE key = 'name_display_order'"));
			int rc = st->bind(1, value).run();
			if (rc != SQLITE_DONE)
				return conn->failed("setting", rc);
		}
		std::vector<int> ids;
		{
			CachedStatement st(conn->statement("SELECT id FROM contacts"));
			while (st->step() == SQLITE_ROW)
				ids.push_back(st->columnInt(0));
		}
		ContactsWriter writer(*conn, ctx);
		for (int id : ids) {
			int err = writer.touchContact(id, CONTACTS_CHANGE_UPDATED);
			if (err != CONTACTS_ERROR_NONE)
				return err;
		}
		return static_cast<int>(CONTACTS_ERROR_NONE);
	});
}

} // extern "C"
