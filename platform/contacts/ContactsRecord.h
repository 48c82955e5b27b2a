// contacts_record_s: one record of a view in memory, with its child records.
#pragma once

#include "ContactsSchema.h"
#include "contacts_types.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

struct contacts_record_s {
	struct Value {
		bool set = false;
		int64_t i = 0;
		double d = 0;
		std::optional<std::string> s;
	};

	explicit contacts_record_s(const ct::contacts::ViewInfo& v);
	~contacts_record_s();
	contacts_record_s(const contacts_record_s&) = delete;
	contacts_record_s& operator=(const contacts_record_s&) = delete;

	// A deep copy; the caller owns it.
	contacts_record_s* clone() const;

	// Typed access by slot, for the service itself (no checks).
	int getInt(const char* name) const;
	int64_t getInt64(const char* name) const;
	const char* getStr(const char* name) const;
	void setInt(const char* name, int64_t value);
	void setStr(const char* name, const char* value);
	Value* value(const char* name);
	const Value* value(const char* name) const;
	std::vector<contacts_record_s*>* children(const char* propName);
	const std::vector<contacts_record_s*>* children(const char* propName) const;

	const ct::contacts::ViewInfo* view;
	std::vector<Value> values;
	std::vector<std::vector<contacts_record_s*>> childLists;
	contacts_record_s* parent = nullptr;
};
