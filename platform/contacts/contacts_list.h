/* Lists of records with a cursor. A list owns its records only when it is
 * destroyed with delete_child = true. */
#ifndef CT_PLATFORM_CONTACTS_LIST_H
#define CT_PLATFORM_CONTACTS_LIST_H

#include "contacts_types.h"

#ifdef __cplusplus
extern "C" {
#endif

int contacts_list_create(contacts_list_h *list);
int contacts_list_destroy(contacts_list_h list, bool delete_child);
int contacts_list_get_count(contacts_list_h list, int *count);
/* Appends / prepends; the cursor stays where it is (on the first record when
 * the list was empty). */
int contacts_list_add(contacts_list_h list, contacts_record_h record);
int contacts_list_prepend(contacts_list_h list, contacts_record_h record);
/* Takes the record out without destroying it. NO_DATA when not in the list. */
int contacts_list_remove(contacts_list_h list, contacts_record_h record);
/* The record under the cursor, owned by the list's owner. NO_DATA when empty. */
int contacts_list_get_current_record_p(contacts_list_h list, contacts_record_h *record);
/* Move the cursor. NO_DATA when it would leave the list. */
int contacts_list_prev(contacts_list_h list);
int contacts_list_next(contacts_list_h list);
int contacts_list_first(contacts_list_h list);
int contacts_list_last(contacts_list_h list);

#ifdef __cplusplus
}
#endif

#endif
