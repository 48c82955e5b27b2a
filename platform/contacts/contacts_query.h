/* Filters and queries over one view. A filter is a sequence of conditions
 * joined by operators: condition (operator condition)*; conditions are
 * evaluated left to right as written, with AND binding tighter than OR.
 * Text matches are literal: %, _ and \ in the value have no special meaning. */
#ifndef CT_PLATFORM_CONTACTS_QUERY_H
#define CT_PLATFORM_CONTACTS_QUERY_H

#include "contacts_types.h"

#ifdef __cplusplus
extern "C" {
#endif

int contacts_filter_create(const char *view_uri, contacts_filter_h *filter);
int contacts_filter_destroy(contacts_filter_h filter);
int contacts_filter_add_str(contacts_filter_h filter, unsigned int property_id, contacts_match_str_flag_e match, const char *match_value);
int contacts_filter_add_int(contacts_filter_h filter, unsigned int property_id, contacts_match_int_flag_e match, int match_value);
int contacts_filter_add_lli(contacts_filter_h filter, unsigned int property_id, contacts_match_int_flag_e match, long long int match_value);
int contacts_filter_add_double(contacts_filter_h filter, unsigned int property_id, contacts_match_int_flag_e match, double match_value);
int contacts_filter_add_bool(contacts_filter_h filter, unsigned int property_id, bool match_value);
/* Joins the previous and the next condition. INVALID_PARAMETER before the
 * first condition or after another operator. */
int contacts_filter_add_operator(contacts_filter_h filter, contacts_filter_operator_e operator_type);
/* Adds a copy of another filter of the same view as one parenthesised condition. */
int contacts_filter_add_filter(contacts_filter_h filter, contacts_filter_h added_filter);

int contacts_query_create(const char *view_uri, contacts_query_h *query);
int contacts_query_destroy(contacts_query_h query);
/* The query keeps a copy of the filter. */
int contacts_query_set_filter(contacts_query_h query, contacts_filter_h filter);
/* Several calls sort by several properties, in call order. */
int contacts_query_set_sort(contacts_query_h query, unsigned int property_id, bool is_ascending);
/* Only these properties are read (records then hold only them and the id). */
int contacts_query_set_projection(contacts_query_h query, unsigned int property_ids[], int count);
int contacts_query_set_distinct(contacts_query_h query, bool set);

#ifdef __cplusplus
}
#endif

#endif
