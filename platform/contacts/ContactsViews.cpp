// The `_contacts_*` view structs, built from contacts_view_list.h.
#include "contacts_views.h"

namespace {

enum { TYPE_STR = 1, TYPE_INT = 2, TYPE_BOOL = 3, TYPE_LLI = 4, TYPE_DOUBLE = 5, TYPE_RECORD = 6 };

#define CONTACTS_VIEW(view, number, uri, index_base) namespace view##_idx { enum {
#define CONTACTS_PROP(view, name, type, access) name,
#define CONTACTS_CHILD(view, name, child_view) name,
#define CONTACTS_VIEW_END(view) count }; }
#include "contacts_view_list.h"
#undef CONTACTS_VIEW
#undef CONTACTS_PROP
#undef CONTACTS_CHILD
#undef CONTACTS_VIEW_END

#define CONTACTS_VIEW(view, number, uri, index_base) namespace view##_meta { enum { num = number, base = index_base }; }
#define CONTACTS_PROP(view, name, type, access)
#define CONTACTS_CHILD(view, name, child_view)
#define CONTACTS_VIEW_END(view)
#include "contacts_view_list.h"
#undef CONTACTS_VIEW
#undef CONTACTS_PROP
#undef CONTACTS_CHILD
#undef CONTACTS_VIEW_END

constexpr unsigned propertyId(unsigned view, unsigned type, unsigned index)
{
	return (view << 16) | (type << 12) | index;
}

} // namespace

#define CT_PID(view, type, name) propertyId(view##_meta::num, type, view##_meta::base + view##_idx::name)
#define CONTACTS_VIEW(view, number, uri, index_base) extern "C" const view##_property_ids view = { uri,
#define CONTACTS_PROP(view, name, type, access) CT_PID(view, TYPE_##type, name),
#define CONTACTS_CHILD(view, name, child_view) CT_PID(view, TYPE_RECORD, name),
#define CONTACTS_VIEW_END(view) };
#include "contacts_view_list.h"
#undef CONTACTS_VIEW
#undef CONTACTS_PROP
#undef CONTACTS_CHILD
#undef CONTACTS_VIEW_END
