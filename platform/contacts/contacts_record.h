/* Records: one row of a view in memory. A record owns its child records.
 * Every call returns CONTACTS_ERROR_NONE or a negative error:
 * INVALID_PARAMETER for null handles, property ids of another view or of
 * another type, OUT_OF_MEMORY when a copy fails. */
#ifndef CT_PLATFORM_CONTACTS_RECORD_H
#define CT_PLATFORM_CONTACTS_RECORD_H

#include "contacts_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/* A new empty record of the view; the caller destroys it. */
int contacts_record_create(const char *view_uri, contacts_record_h *record);
/* Destroys the record; with delete_child also its child records (always the
 * case for children that the record owns). */
int contacts_record_destroy(contacts_record_h record, bool delete_child);
/* A deep copy (children included) that the caller destroys. */
int contacts_record_clone(contacts_record_h record, contacts_record_h *cloned_record);
/* The view URI of the record; valid while the record lives. */
int contacts_record_get_uri_p(contacts_record_h record, const char **view_uri);

/* A copy of the text (NULL when unset) that the caller frees with free(). */
int contacts_record_get_str(contacts_record_h record, unsigned int property_id, char **value);
/* The text inside the record (NULL when unset); valid until it is set again. */
int contacts_record_get_str_p(contacts_record_h record, unsigned int property_id, char **value);
/* Copies the text; NULL clears it. Invalid UTF-8 is refused. */
int contacts_record_set_str(contacts_record_h record, unsigned int property_id, const char *value);
int contacts_record_get_int(contacts_record_h record, unsigned int property_id, int *value);
int contacts_record_set_int(contacts_record_h record, unsigned int property_id, int value);
int contacts_record_get_bool(contacts_record_h record, unsigned int property_id, bool *value);
int contacts_record_set_bool(contacts_record_h record, unsigned int property_id, bool value);
int contacts_record_get_lli(contacts_record_h record, unsigned int property_id, long long int *value);
int contacts_record_set_lli(contacts_record_h record, unsigned int property_id, long long int value);
int contacts_record_get_double(contacts_record_h record, unsigned int property_id, double *value);
int contacts_record_set_double(contacts_record_h record, unsigned int property_id, double value);

/* Child records (property of type record, e.g. _contacts_contact.number).
 * add: the record takes ownership of child (which must be of the child view
 * and have no other parent). remove: ownership goes back to the caller. */
int contacts_record_add_child_record(contacts_record_h record, unsigned int property_id, contacts_record_h child);
int contacts_record_remove_child_record(contacts_record_h record, unsigned int property_id, contacts_record_h child);
int contacts_record_get_child_record_count(contacts_record_h record, unsigned int property_id, int *count);
/* The child at index, still owned by the record. NO_DATA past the end. */
int contacts_record_get_child_record_at_p(contacts_record_h record, unsigned int property_id, int index, contacts_record_h *child);
/* A new list of clones of the children; the caller destroys it with children. */
int contacts_record_clone_child_record_list(contacts_record_h record, unsigned int property_id, contacts_list_h *cloned_list);

#ifdef __cplusplus
}
#endif

#endif
