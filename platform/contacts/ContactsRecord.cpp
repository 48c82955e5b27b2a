#include "ContactsRecord.h"

#include "ContactsDebug.h"
#include "contacts_record.h"
#include "contacts_list.h"

#include <glib.h>

#include <cstdlib>
#include <cstring>
#include <new>

using ct::contacts::PropertyInfo;
using ct::contacts::PropType;
using ct::contacts::ViewInfo;

namespace {

// Texts above this size are refused rather than stored.
constexpr size_t kMaxTextBytes = 16 * 1024 * 1024;

const PropertyInfo* checkedProperty(contacts_record_h record, unsigned propertyId, PropType type)
{
	if (!record) {
		WERROR("Invalid param : record");
		return nullptr;
	}
	const PropertyInfo* p = record->view->find(propertyId);
	if (!p) {
		WERROR("property 0x%x is not in view %s", propertyId, record->view->uri);
		return nullptr;
	}
	if (p->type != type) {
		WERROR("property %s is not of the requested type", p->name);
		return nullptr;
	}
	return p;
}

template <typename T>
int getNumber(contacts_record_h record, unsigned propertyId, PropType type, T* out)
{
	WPRET_VM(!out, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : value");
	const PropertyInfo* p = checkedProperty(record, propertyId, type);
	if (!p) {
		*out = T();
		return CONTACTS_ERROR_INVALID_PARAMETER;
	}
	const auto& v = record->values[p->slot];
	if (type == PropType::Double)
		*out = static_cast<T>(v.d);
	else
		*out = static_cast<T>(v.i);
	return CONTACTS_ERROR_NONE;
}

int setNumber(contacts_record_h record, unsigned propertyId, PropType type, int64_t i, double d)
{
	const PropertyInfo* p = checkedProperty(record, propertyId, type);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	auto& v = record->values[p->slot];
	v.set = true;
	v.i = i;
	v.d = d;
	return CONTACTS_ERROR_NONE;
}

const PropertyInfo* childProperty(contacts_record_h record, unsigned propertyId)
{
	return checkedProperty(record, propertyId, PropType::Record);
}

} // namespace

contacts_record_s::contacts_record_s(const ViewInfo& v)
	: view(&v), values(v.props.size()), childLists(v.props.size())
{
}

contacts_record_s::~contacts_record_s()
{
	for (auto& list : childLists)
		for (contacts_record_s* child : list)
			delete child;
}

contacts_record_s* contacts_record_s::clone() const
{
	auto* copy = new contacts_record_s(*view);
	copy->values = values;
	for (size_t i = 0; i < childLists.size(); ++i) {
		for (const contacts_record_s* child : childLists[i]) {
			contacts_record_s* c = child->clone();
			c->parent = copy;
			copy->childLists[i].push_back(c);
		}
	}
	return copy;
}

contacts_record_s::Value* contacts_record_s::value(const char* name)
{
	const PropertyInfo* p = view->findByName(name);
	return p ? &values[p->slot] : nullptr;
}

const contacts_record_s::Value* contacts_record_s::value(const char* name) const
{
	const PropertyInfo* p = view->findByName(name);
	return p ? &values[p->slot] : nullptr;
}

int contacts_record_s::getInt(const char* name) const
{
	const Value* v = value(name);
	return v ? static_cast<int>(v->i) : 0;
}

int64_t contacts_record_s::getInt64(const char* name) const
{
	const Value* v = value(name);
	return v ? v->i : 0;
}

const char* contacts_record_s::getStr(const char* name) const
{
	const Value* v = value(name);
	return v && v->s ? v->s->c_str() : nullptr;
}

void contacts_record_s::setInt(const char* name, int64_t i)
{
	if (Value* v = value(name)) {
		v->set = true;
		v->i = i;
	}
}

void contacts_record_s::setStr(const char* name, const char* s)
{
	if (Value* v = value(name)) {
		v->set = true;
		if (s)
			v->s = std::string(s);
		else
			v->s.reset();
	}
}

std::vector<contacts_record_s*>* contacts_record_s::children(const char* propName)
{
	const PropertyInfo* p = view->findByName(propName);
	return p && p->type == PropType::Record ? &childLists[p->slot] : nullptr;
}

const std::vector<contacts_record_s*>* contacts_record_s::children(const char* propName) const
{
	const PropertyInfo* p = view->findByName(propName);
	return p && p->type == PropType::Record ? &childLists[p->slot] : nullptr;
}

extern "C" {

int contacts_record_create(const char* view_uri, contacts_record_h* record)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	*record = nullptr;
	const ViewInfo* v = ct::contacts::ContactsSchema::view(view_uri);
	WPRET_VM(!v, CONTACTS_ERROR_INVALID_PARAMETER, "unknown view %s", view_uri ? view_uri : "(null)");
	*record = new (std::nothrow) contacts_record_s(*v);
	return *record ? CONTACTS_ERROR_NONE : CONTACTS_ERROR_OUT_OF_MEMORY;
}

int contacts_record_destroy(contacts_record_h record, bool delete_child)
{
	(void)delete_child; // children always belong to their record
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	WPRET_VM(record->parent, CONTACTS_ERROR_INVALID_PARAMETER, "record is owned by its parent record");
	delete record;
	return CONTACTS_ERROR_NONE;
}

int contacts_record_clone(contacts_record_h record, contacts_record_h* cloned_record)
{
	WPRET_VM(!record || !cloned_record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	*cloned_record = record->clone();
	return CONTACTS_ERROR_NONE;
}

int contacts_record_get_uri_p(contacts_record_h record, const char** view_uri)
{
	WPRET_VM(!record || !view_uri, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	*view_uri = record->view->uri;
	return CONTACTS_ERROR_NONE;
}

int contacts_record_get_str_p(contacts_record_h record, unsigned int property_id, char** value)
{
	WPRET_VM(!value, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : value");
	*value = nullptr;
	const PropertyInfo* p = checkedProperty(record, property_id, PropType::Str);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	auto& s = record->values[p->slot].s;
	if (s)
		*value = s->data();
	return CONTACTS_ERROR_NONE;
}

int contacts_record_get_str(contacts_record_h record, unsigned int property_id, char** value)
{
	char* inner = nullptr;
	int err = contacts_record_get_str_p(record, property_id, &inner);
	if (err != CONTACTS_ERROR_NONE || !inner)
		return err;
	*value = strdup(inner);
	return *value ? CONTACTS_ERROR_NONE : CONTACTS_ERROR_OUT_OF_MEMORY;
}

int contacts_record_set_str(contacts_record_h record, unsigned int property_id, const char* value)
{
	const PropertyInfo* p = checkedProperty(record, property_id, PropType::Str);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	if (value) {
		size_t size = strlen(value);
		WPRET_VM(size > kMaxTextBytes, CONTACTS_ERROR_INVALID_PARAMETER, "text of %zu bytes is too long", size);
		WPRET_VM(!g_utf8_validate(value, static_cast<gssize>(size), nullptr), CONTACTS_ERROR_INVALID_PARAMETER,
			"text for %s is not valid UTF-8", p->name);
	}
	record->setStr(p->name, value);
	return CONTACTS_ERROR_NONE;
}

int contacts_record_get_int(contacts_record_h record, unsigned int property_id, int* value)
{
	return getNumber(record, property_id, PropType::Int, value);
}

int contacts_record_set_int(contacts_record_h record, unsigned int property_id, int value)
{
	return setNumber(record, property_id, PropType::Int, value, 0);
}

int contacts_record_get_bool(contacts_record_h record, unsigned int property_id, bool* value)
{
	return getNumber(record, property_id, PropType::Bool, value);
}

int contacts_record_set_bool(contacts_record_h record, unsigned int property_id, bool value)
{
	return setNumber(record, property_id, PropType::Bool, value ? 1 : 0, 0);
}

int contacts_record_get_lli(contacts_record_h record, unsigned int property_id, long long int* value)
{
	return getNumber(record, property_id, PropType::Lli, value);
}

int contacts_record_set_lli(contacts_record_h record, unsigned int property_id, long long int value)
{
	return setNumber(record, property_id, PropType::Lli, value, 0);
}

int contacts_record_get_double(contacts_record_h record, unsigned int property_id, double* value)
{
	return getNumber(record, property_id, PropType::Double, value);
}

int contacts_record_set_double(contacts_record_h record, unsigned int property_id, double value)
{
	return setNumber(record, property_id, PropType::Double, 0, value);
}

int contacts_record_add_child_record(contacts_record_h record, unsigned int property_id, contacts_record_h child)
{
	const PropertyInfo* p = childProperty(record, property_id);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	WPRET_VM(!child, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : child");
	WPRET_VM(child->view != p->child, CONTACTS_ERROR_INVALID_PARAMETER, "child of view %s does not fit %s",
		child->view->uri, p->name);
	WPRET_VM(child->parent || child == record, CONTACTS_ERROR_INVALID_PARAMETER, "child already has a parent");
	child->parent = record;
	record->childLists[p->slot].push_back(child);
	return CONTACTS_ERROR_NONE;
}

int contacts_record_remove_child_record(contacts_record_h record, unsigned int property_id, contacts_record_h child)
{
	const PropertyInfo* p = childProperty(record, property_id);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	WPRET_VM(!child, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : child");
	auto& list = record->childLists[p->slot];
	for (auto it = list.begin(); it != list.end(); ++it) {
		if (*it == child) {
			list.erase(it);
			child->parent = nullptr;
			return CONTACTS_ERROR_NONE;
		}
	}
	WERROR("child is not a %s of this record", p->name);
	return CONTACTS_ERROR_INVALID_PARAMETER;
}

int contacts_record_get_child_record_count(contacts_record_h record, unsigned int property_id, int* count)
{
	WPRET_VM(!count, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : count");
	*count = 0;
	const PropertyInfo* p = childProperty(record, property_id);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	*count = static_cast<int>(record->childLists[p->slot].size());
	return CONTACTS_ERROR_NONE;
}

int contacts_record_get_child_record_at_p(contacts_record_h record, unsigned int property_id, int index,
	contacts_record_h* child)
{
	WPRET_VM(!child, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : child");
	*child = nullptr;
	const PropertyInfo* p = childProperty(record, property_id);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	WPRET_VM(index < 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : index %d", index);
	const auto& list = record->childLists[p->slot];
	if (static_cast<size_t>(index) >= list.size())
		return CONTACTS_ERROR_NO_DATA;
	*child = list[index];
	return CONTACTS_ERROR_NONE;
}

int contacts_record_clone_child_record_list(contacts_record_h record, unsigned int property_id,
	contacts_list_h* cloned_list)
{
	WPRET_VM(!cloned_list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	*cloned_list = nullptr;
	const PropertyInfo* p = childProperty(record, property_id);
	if (!p)
		return CONTACTS_ERROR_INVALID_PARAMETER;
	const auto& list = record->childLists[p->slot];
	if (list.empty())
		return CONTACTS_ERROR_NO_DATA;
	contacts_list_create(cloned_list);
	for (const contacts_record_s* child : list)
		contacts_list_add(*cloned_list, child->clone());
	return CONTACTS_ERROR_NONE;
}

} // extern "C"
