// contacts_filter_s and contacts_query_s, and their translation into SQL with
// bound parameters.
#pragma once

#include "ContactsSchema.h"
#include "SqliteDatabase.h"
#include "contacts_types.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace ct::contacts {

// One parameter of a generated statement.
struct SqlParam {
	enum class Kind { Int, Double, Text, Null } kind = Kind::Int;
	int64_t i = 0;
	double d = 0;
	std::string text;
};

// Binds params to st starting at index 1.
void bindParams(db::Statement& st, const std::vector<SqlParam>& params);

// Quotes an identifier for SQL ("name").
std::string quoted(const char* identifier);

// The full-text phrase that matches `text` literally.
std::string ftsPhrase(const std::string& text);

// How a "person display name contains" condition finds its rows.
struct ContainsPlan {
	enum class Kind {
		Walk,    // test every row the read walks
		Phrase,  // narrow through the trigram index first
		Matches, // narrow to rows already found through the index
	} kind = Kind::Phrase;
	std::string matchIds; // Matches: their ids as a JSON array
};

} // namespace ct::contacts

struct contacts_filter_s {
	struct Item {
		enum class Kind { Condition, Operator, Filter } kind = Kind::Condition;
		unsigned propertyId = 0;
		ct::contacts::PropType type = ct::contacts::PropType::Int;
		int match = 0;
		ct::contacts::SqlParam value;
		contacts_filter_operator_e op = CONTACTS_FILTER_OPERATOR_AND;
		std::shared_ptr<contacts_filter_s> filter;
	};

	const ct::contacts::ViewInfo* view = nullptr;
	std::vector<Item> items;

	// How a "display name contains" text that the trigram index can serve
	// should find its rows; null means always through the index.
	using IndexChoice = std::function<ct::contacts::ContainsPlan(const std::string& text)>;

	// Appends "(...)" for this filter to sql; CONTACTS_ERROR_INVALID_PARAMETER
	// when the filter is empty or ends with an operator.
	int toSql(std::string& sql, std::vector<ct::contacts::SqlParam>& params, const IndexChoice& useIndex = nullptr) const;

};

struct contacts_query_s {
	const ct::contacts::ViewInfo* view = nullptr;
	std::shared_ptr<contacts_filter_s> filter;
	std::vector<std::pair<const ct::contacts::PropertyInfo*, bool>> sort;
	std::vector<const ct::contacts::PropertyInfo*> projection;
	bool distinct = false;
};
