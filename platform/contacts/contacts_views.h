/* Views of the contacts service: one global struct per view with its URI
 * (`_uri`) and its property ids, e.g. `_contacts_person.display_name`. */
#ifndef CT_PLATFORM_CONTACTS_VIEWS_H
#define CT_PLATFORM_CONTACTS_VIEWS_H

#ifdef __cplusplus
extern "C" {
#endif

#define CONTACTS_VIEW(view, number, uri, index_base) typedef struct { const char *_uri;
#define CONTACTS_PROP(view, name, type, access) unsigned int name;
#define CONTACTS_CHILD(view, name, child_view) unsigned int name;
#define CONTACTS_VIEW_END(view) } view##_property_ids; extern const view##_property_ids view;
#include "contacts_view_list.h"
#undef CONTACTS_VIEW
#undef CONTACTS_PROP
#undef CONTACTS_CHILD
#undef CONTACTS_VIEW_END

#ifdef __cplusplus
}
#endif

#endif
