#include "ContactsQuery.h"

#include "ContactsDebug.h"
#include "ContactsRawValue.h"
#include "contacts_query.h"
#include "contacts_views.h"

#include <glib.h>

#include <new>

using ct::contacts::PropertyInfo;
using ct::contacts::PropType;
using ct::contacts::SqlParam;
using ct::contacts::ViewInfo;

namespace ct::contacts {

void bindParams(db::Statement& st, const std::vector<SqlParam>& params)
{
	int index = 1;
	for (const SqlParam& p : params) {
		switch (p.kind) {
		case SqlParam::Kind::Int:
			st.bind(index, static_cast<int64_t>(p.i));
			break;
		case SqlParam::Kind::Double:
			st.bind(index, p.d);
			break;
		case SqlParam::Kind::Text:
			st.bind(index, p.text);
			break;
		case SqlParam::Kind::Null:
			st.bindNull(index);
			break;
		}
		++index;
	}
}

std::string quoted(const char* identifier)
{
	return std::string("\"") + identifier + "\"";
}

std::string ftsPhrase(const std::string& text)
{
	std::string out = "\"";
	for (char c : text) {
		if (c == '"')
			out += '"';
		out += c;
	}
	return out + "\"";
}

} // namespace ct::contacts

namespace {

SqlParam textParam(const std::string& text)
{
	SqlParam p;
	p.kind = SqlParam::Kind::Text;
	p.text = text;
	return p;
}

// Trigram index lookup for "person display name contains", which narrows the
// rows before the exact test. Texts under 3 characters cannot use it; very
// long ones would build huge index queries and are tested by scanning.
constexpr size_t kMaxIndexedSearchBytes = 256;

bool usesTrigramIndex(const contacts_filter_s::Item& item, const ViewInfo& view)
{
	return item.match == CONTACTS_MATCH_CONTAINS && view.number == (_contacts_person.id >> 16)
		&& item.propertyId == _contacts_person.display_name
		&& g_utf8_strlen(item.value.text.c_str(), -1) >= 3 && item.value.text.size() <= kMaxIndexedSearchBytes;
}

// LIKE folds ASCII case only, as lower() does, and tests a row about three
// times faster than instr(lower(...)); texts too long for a LIKE pattern use
// the latter. The pattern is an expression, not a bare parameter: SQLite
// prepares a statement again at every new value of a bare LIKE parameter.
constexpr size_t kMaxLikeTextBytes = 1024;

std::string likePattern(const std::string& text)
{
	std::string out = "%";
	for (char c : text) {
		if (c == '%' || c == '_' || c == '\\')
			out += '\\';
		out += c;
	}
	return out + "%";
}

void containsTest(const std::string& col, const std::string& text, std::string& sql, std::vector<SqlParam>& params)
{
	if (text.size() <= kMaxLikeTextBytes) {
		sql += col + " LIKE (? || '') ESCAPE '\\'";
		params.push_back(textParam(likePattern(text)));
	} else {
		sql += "instr(lower(" + col + "), lower(?)) > 0";
		params.push_back(textParam(text));
	}
}

void narrowContains(const ct::contacts::ContainsPlan& plan, const std::string& text, std::string& sql,
	std::vector<SqlParam>& params)
{
	using Kind = ct::contacts::ContainsPlan::Kind;
	if (plan.kind == Kind::Phrase) {
		sql += "\"id\" IN (SELECT rowid FROM persons_fts WHERE persons_fts MATCH ?) AND ";
		params.push_back(textParam(ct::contacts::ftsPhrase(text)));
	} else if (plan.kind == Kind::Matches) {
		sql += "\"id\" IN (SELECT value FROM json_each(?)) AND ";
		params.push_back(textParam(plan.matchIds));
	}
}

void stringCondition(const contacts_filter_s::Item& item, const ViewInfo& view, const std::string& col,
	std::string& sql, std::vector<SqlParam>& params, const contacts_filter_s::IndexChoice& useIndex)
{
	const std::string& v = item.value.text;
	switch (item.match) {
	case CONTACTS_MATCH_EXACTLY:
		sql += col + " = ?";
		params.push_back(textParam(v));
		break;
	case CONTACTS_MATCH_FULLSTRING:
		sql += col + " = ? COLLATE NOCASE";
		params.push_back(textParam(v));
		break;
	case CONTACTS_MATCH_CONTAINS:
		if (usesTrigramIndex(item, view))
			narrowContains(useIndex ? useIndex(v) : ct::contacts::ContainsPlan(), v, sql, params);
		containsTest(col, v, sql, params);
		break;
	case CONTACTS_MATCH_STARTSWITH:
		sql += "lower(substr(" + col + ", 1, length(?))) = lower(?)";
		params.push_back(textParam(v));
		params.push_back(textParam(v));
		break;
	case CONTACTS_MATCH_ENDSWITH:
		sql += "(length(" + col + ") >= length(?) AND lower(substr(" + col + ", -length(?))) = lower(?))";
		params.push_back(textParam(v));
		params.push_back(textParam(v));
		params.push_back(textParam(v));
		break;
	default: // CONTACTS_MATCH_EXISTS
		sql += col + " IS NOT NULL";
		break;
	}
}

const char* comparison(int match)
{
	switch (match) {
	case CONTACTS_MATCH_GREATER_THAN: return " > ?";
	case CONTACTS_MATCH_GREATER_THAN_OR_EQUAL: return " >= ?";
	case CONTACTS_MATCH_LESS_THAN: return " < ?";
	case CONTACTS_MATCH_LESS_THAN_OR_EQUAL: return " <= ?";
	case CONTACTS_MATCH_NOT_EQUAL: return " <> ?";
	default: return " = ?";
	}
}

void condition(const contacts_filter_s::Item& item, const ViewInfo& view, std::string& sql,
	std::vector<SqlParam>& params, const contacts_filter_s::IndexChoice& useIndex)
{
	const PropertyInfo* p = view.find(item.propertyId);
	std::string col = ct::contacts::quoted(p->name);
	if (item.type == PropType::Str) {
		stringCondition(item, view, col, sql, params, useIndex);
	} else if (item.type != PropType::Bool && item.match == CONTACTS_MATCH_NONE) {
		sql += col + " IS NULL";
	} else {
		sql += col + comparison(item.type == PropType::Bool ? CONTACTS_MATCH_EQUAL : item.match);
		params.push_back(item.value);
	}
}

contacts_filter_s::Item* newCondition(contacts_filter_h filter, unsigned propertyId, PropType type, int& err)
{
	err = CONTACTS_ERROR_INVALID_PARAMETER;
	WPRET_VM(!filter, nullptr, "Invalid param : filter");
	const PropertyInfo* p = filter->view->find(propertyId);
	WPRET_VM(!p, nullptr, "property 0x%x is not in view %s", propertyId, filter->view->uri);
	WPRET_VM(p->type != type, nullptr, "property %s is not of the filter's type", p->name);
	WPRET_VM(!filter->items.empty() && filter->items.back().kind != contacts_filter_s::Item::Kind::Operator,
		nullptr, "a condition must follow an operator");
	filter->items.emplace_back();
	auto& item = filter->items.back();
	item.propertyId = propertyId;
	item.type = type;
	err = CONTACTS_ERROR_NONE;
	return &item;
}

int addNumberCondition(contacts_filter_h filter, unsigned propertyId, PropType type, int match, SqlParam value)
{
	WPRET_VM(match < CONTACTS_MATCH_EQUAL || match > CONTACTS_MATCH_NONE, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : match %d", match);
	int err;
	auto* item = newCondition(filter, propertyId, type, err);
	if (!item)
		return err;
	item->match = match;
	item->value = value;
	return CONTACTS_ERROR_NONE;
}

SqlParam intParam(int64_t v)
{
	SqlParam p;
	p.i = v;
	return p;
}

} // namespace

int contacts_filter_s::toSql(std::string& sql, std::vector<SqlParam>& params, const IndexChoice& useIndex) const
{
	WPRET_VM(items.empty(), CONTACTS_ERROR_INVALID_PARAMETER, "empty filter");
	WPRET_VM(items.back().kind == Item::Kind::Operator, CONTACTS_ERROR_INVALID_PARAMETER,
		"filter ends with an operator");
	sql += "(";
	for (const Item& item : items) {
		if (item.kind == Item::Kind::Operator) {
			sql += item.op == CONTACTS_FILTER_OPERATOR_AND ? " AND " : " OR ";
		} else if (item.kind == Item::Kind::Filter) {
			int err = item.filter->toSql(sql, params, useIndex);
			if (err != CONTACTS_ERROR_NONE)
				return err;
		} else {
			sql += "(";
			condition(item, *view, sql, params, useIndex);
			sql += ")";
		}
	}
	sql += ")";
	return CONTACTS_ERROR_NONE;
}

extern "C" {

int contacts_filter_create(const char* view_uri, contacts_filter_h* filter)
{
	WPRET_VM(!filter, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : filter");
	*filter = nullptr;
	const ViewInfo* v = ct::contacts::ContactsSchema::view(view_uri);
	WPRET_VM(!v, CONTACTS_ERROR_INVALID_PARAMETER, "unknown view %s", view_uri ? view_uri : "(null)");
	*filter = new (std::nothrow) contacts_filter_s;
	if (!*filter)
		return CONTACTS_ERROR_OUT_OF_MEMORY;
	(*filter)->view = v;
	return CONTACTS_ERROR_NONE;
}

int contacts_filter_destroy(contacts_filter_h filter)
{
	WPRET_VM(!filter, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : filter");
	delete filter;
	return CONTACTS_ERROR_NONE;
}

int contacts_filter_add_str(contacts_filter_h filter, unsigned int property_id, contacts_match_str_flag_e match,
	const char* match_value)
{
	int m = ct::contacts::rawValue(match);
	WPRET_VM(m < CONTACTS_MATCH_EXACTLY || m > CONTACTS_MATCH_EXISTS, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : match %d", m);
	WPRET_VM(!match_value && m != CONTACTS_MATCH_EXISTS, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : match_value");
	WPRET_VM(match_value && !g_utf8_validate(match_value, -1, nullptr), CONTACTS_ERROR_INVALID_PARAMETER,
		"match_value is not valid UTF-8");
	int err;
	auto* item = newCondition(filter, property_id, PropType::Str, err);
	if (!item)
		return err;
	item->match = m;
	item->value = textParam(match_value ? match_value : "");
	return CONTACTS_ERROR_NONE;
}

int contacts_filter_add_int(contacts_filter_h filter, unsigned int property_id, contacts_match_int_flag_e match,
	int match_value)
{
	return addNumberCondition(filter, property_id, PropType::Int, ct::contacts::rawValue(match), intParam(match_value));
}

int contacts_filter_add_lli(contacts_filter_h filter, unsigned int property_id, contacts_match_int_flag_e match,
	long long int match_value)
{
	return addNumberCondition(filter, property_id, PropType::Lli, ct::contacts::rawValue(match), intParam(match_value));
}

int contacts_filter_add_double(contacts_filter_h filter, unsigned int property_id, contacts_match_int_flag_e match,
	double match_value)
{
	SqlParam p;
	p.kind = SqlParam::Kind::Double;
	p.d = match_value;
	return addNumberCondition(filter, property_id, PropType::Double, ct::contacts::rawValue(match), p);
}

int contacts_filter_add_bool(contacts_filter_h filter, unsigned int property_id, bool match_value)
{
	return addNumberCondition(filter, property_id, PropType::Bool, CONTACTS_MATCH_EQUAL, intParam(match_value ? 1 : 0));
}

int contacts_filter_add_operator(contacts_filter_h filter, contacts_filter_operator_e operator_type)
{
	WPRET_VM(!filter, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : filter");
	int op = ct::contacts::rawValue(operator_type);
	WPRET_VM(op != CONTACTS_FILTER_OPERATOR_AND && op != CONTACTS_FILTER_OPERATOR_OR,
		CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : operator %d", op);
	WPRET_VM(filter->items.empty() || filter->items.back().kind == contacts_filter_s::Item::Kind::Operator,
		CONTACTS_ERROR_INVALID_PARAMETER, "an operator must follow a condition");
	filter->items.emplace_back();
	filter->items.back().kind = contacts_filter_s::Item::Kind::Operator;
	filter->items.back().op = op == CONTACTS_FILTER_OPERATOR_AND ? CONTACTS_FILTER_OPERATOR_AND : CONTACTS_FILTER_OPERATOR_OR;
	return CONTACTS_ERROR_NONE;
}

int contacts_filter_add_filter(contacts_filter_h filter, contacts_filter_h added_filter)
{
	WPRET_VM(!filter || !added_filter || filter == added_filter, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	WPRET_VM(filter->view != added_filter->view, CONTACTS_ERROR_INVALID_PARAMETER, "filters of different views");
	WPRET_VM(added_filter->items.empty(), CONTACTS_ERROR_INVALID_PARAMETER, "empty filter");
	WPRET_VM(!filter->items.empty() && filter->items.back().kind != contacts_filter_s::Item::Kind::Operator,
		CONTACTS_ERROR_INVALID_PARAMETER, "a filter must follow an operator");
	filter->items.emplace_back();
	filter->items.back().kind = contacts_filter_s::Item::Kind::Filter;
	filter->items.back().filter = std::make_shared<contacts_filter_s>(*added_filter);
	return CONTACTS_ERROR_NONE;
}

int contacts_query_create(const char* view_uri, contacts_query_h* query)
{
	WPRET_VM(!query, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : query");
	*query = nullptr;
	const ViewInfo* v = ct::contacts::ContactsSchema::view(view_uri);
	WPRET_VM(!v, CONTACTS_ERROR_INVALID_PARAMETER, "unknown view %s", view_uri ? view_uri : "(null)");
	*query = new (std::nothrow) contacts_query_s;
	if (!*query)
		return CONTACTS_ERROR_OUT_OF_MEMORY;
	(*query)->view = v;
	return CONTACTS_ERROR_NONE;
}

int contacts_query_destroy(contacts_query_h query)
{
	WPRET_VM(!query, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : query");
	delete query;
	return CONTACTS_ERROR_NONE;
}

int contacts_query_set_filter(contacts_query_h query, contacts_filter_h filter)
{
	WPRET_VM(!query || !filter, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	WPRET_VM(query->view != filter->view, CONTACTS_ERROR_INVALID_PARAMETER, "filter of another view");
	query->filter = std::make_shared<contacts_filter_s>(*filter);
	return CONTACTS_ERROR_NONE;
}

int contacts_query_set_sort(contacts_query_h query, unsigned int property_id, bool is_ascending)
{
	WPRET_VM(!query, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : query");
	const PropertyInfo* p = query->view->find(property_id);
	WPRET_VM(!p || p->type == PropType::Record, CONTACTS_ERROR_INVALID_PARAMETER, "cannot sort by 0x%x", property_id);
	query->sort.emplace_back(p, is_ascending);
	return CONTACTS_ERROR_NONE;
}

int contacts_query_set_projection(contacts_query_h query, unsigned int property_ids[], int count)
{
	WPRET_VM(!query || !property_ids || count <= 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	std::vector<const PropertyInfo*> projection;
	for (int i = 0; i < count; ++i) {
		const PropertyInfo* p = query->view->find(property_ids[i]);
		WPRET_VM(!p || p->type == PropType::Record, CONTACTS_ERROR_INVALID_PARAMETER, "cannot project 0x%x",
			property_ids[i]);
		projection.push_back(p);
	}
	query->projection = projection;
	return CONTACTS_ERROR_NONE;
}

int contacts_query_set_distinct(contacts_query_h query, bool set)
{
	WPRET_VM(!query, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : query");
	query->distinct = set;
	return CONTACTS_ERROR_NONE;
}

} // extern "C"
