/* Reading and writing the contacts database. Every write is one SQLite
 * transaction: on any failure the database is left as it was. Errors:
 * INVALID_PARAMETER (bad handle, view or id), NO_DATA (no such record),
 * FILE_NO_SPACE (-28, disk full), DB_LOCKED, PERMISSION_DENIED (read-only
 * address book or file), DB (other SQLite failures). */
#ifndef CT_PLATFORM_CONTACTS_DB_H
#define CT_PLATFORM_CONTACTS_DB_H

#include "contacts_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/* Connections are counted per thread; the database opens on the first
 * connect and closes on the last disconnect. A corrupt or foreign file is
 * reported (CONTACTS_ERROR_DB) and left untouched. */
int contacts_connect(void);
int contacts_disconnect(void);
int contacts_connect_on_thread(void);
int contacts_disconnect_on_thread(void);

/* Inserts the record (contact, my profile, group, group relation, address
 * book, phone log, emergency, or a child record with its contact_id set) and
 * its children; the new id goes to *id when id is not NULL. */
int contacts_db_insert_record(contacts_record_h record, int *id);
/* Writes the record and its children back: children added since reading are
 * inserted, removed ones deleted. Persons take ringtone, vibration, message
 * alert and favourite (applied to every linked contact). */
int contacts_db_update_record(contacts_record_h record);
/* Deletes by id; a person's contacts go with it, a contact's person goes when
 * it was its last contact. NO_DATA when there is no such record. */
int contacts_db_delete_record(const char *view_uri, int record_id);
/* Replaces the stored record `id` with this one (children included). */
int contacts_db_replace_record(contacts_record_h record, int id);
/* A new record (children included) that the caller destroys. */
int contacts_db_get_record(const char *view_uri, int record_id, contacts_record_h *record);
/* New lists the caller destroys with their records. offset/limit 0 = all. */
int contacts_db_get_all_records(const char *view_uri, int offset, int limit, contacts_list_h *record_list);
int contacts_db_get_records_with_query(contacts_query_h query, int offset, int limit, contacts_list_h *record_list);
int contacts_db_get_count(const char *view_uri, int *count);
int contacts_db_get_count_with_query(contacts_query_h query, int *count);
/* Several records in one transaction (all or nothing). ids: a new array of
 * the new ids that the caller frees, may be NULL. */
int contacts_db_insert_records(contacts_list_h record_list, int **ids, int *count);
int contacts_db_update_records(contacts_list_h record_list);
int contacts_db_delete_records(const char *view_uri, int record_id_array[], int count);

/* The version of the last committed write (0 for a new database). */
int contacts_db_get_current_version(int *contacts_db_version);
/* Version of the last write made through this connection. */
int contacts_db_get_last_change_version(int *last_change_version);
/* Contact changes after `contacts_db_version` in the address book
 * (-1: all), as records of _contacts_contact_updated_info, oldest first;
 * the current version goes to *current_contacts_db_version. */
int contacts_db_get_changes_by_version(const char *view_uri, int address_book_id, int contacts_db_version,
	contacts_list_h *change_record_list, int *current_contacts_db_version);

/* Calls cb(view_uri, user_data) on the EFL main loop after a write to the
 * view committed, in this process or another one. The pair (cb, user_data)
 * is registered once per view; remove it before user_data dies. */
int contacts_db_add_changed_cb(const char *view_uri, contacts_db_changed_cb cb, void *user_data);
int contacts_db_remove_changed_cb(const char *view_uri, contacts_db_changed_cb cb, void *user_data);

#ifdef __cplusplus
}
#endif

#endif
