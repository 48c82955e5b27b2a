#include "ContactsList.h"

#include "ContactsDebug.h"
#include "ContactsRecord.h"
#include "contacts_list.h"
#include "contacts_record.h"

#include <algorithm>
#include <new>

extern "C" {

int contacts_list_create(contacts_list_h* list)
{
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	*list = new (std::nothrow) contacts_list_s;
	return *list ? CONTACTS_ERROR_NONE : CONTACTS_ERROR_OUT_OF_MEMORY;
}

int contacts_list_destroy(contacts_list_h list, bool delete_child)
{
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	if (delete_child)
		for (contacts_record_h r : list->records)
			if (!r->parent)
				delete r;
	delete list;
	return CONTACTS_ERROR_NONE;
}

int contacts_list_get_count(contacts_list_h list, int* count)
{
	WPRET_VM(!count, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : count");
	*count = 0;
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	*count = static_cast<int>(list->records.size());
	return CONTACTS_ERROR_NONE;
}

int contacts_list_add(contacts_list_h list, contacts_record_h record)
{
	WPRET_VM(!list || !record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	list->records.push_back(record);
	return CONTACTS_ERROR_NONE;
}

int contacts_list_prepend(contacts_list_h list, contacts_record_h record)
{
	WPRET_VM(!list || !record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	bool wasEmpty = list->records.empty();
	list->records.insert(list->records.begin(), record);
	if (!wasEmpty)
		++list->cursor;
	return CONTACTS_ERROR_NONE;
}

int contacts_list_remove(contacts_list_h list, contacts_record_h record)
{
	WPRET_VM(!list || !record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	auto it = std::find(list->records.begin(), list->records.end(), record);
	if (it == list->records.end())
		return CONTACTS_ERROR_NO_DATA;
	size_t index = static_cast<size_t>(it - list->records.begin());
	list->records.erase(it);
	if (index < list->cursor)
		--list->cursor;
	if (list->cursor >= list->records.size())
		list->cursor = list->records.empty() ? 0 : list->records.size() - 1;
	return CONTACTS_ERROR_NONE;
}

int contacts_list_get_current_record_p(contacts_list_h list, contacts_record_h* record)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	*record = nullptr;
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	if (list->cursor >= list->records.size())
		return CONTACTS_ERROR_NO_DATA;
	*record = list->records[list->cursor];
	return CONTACTS_ERROR_NONE;
}

int contacts_list_prev(contacts_list_h list)
{
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	if (list->cursor == 0)
		return CONTACTS_ERROR_NO_DATA;
	--list->cursor;
	return CONTACTS_ERROR_NONE;
}

int contacts_list_next(contacts_list_h list)
{
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	if (list->cursor + 1 >= list->records.size())
		return CONTACTS_ERROR_NO_DATA;
	++list->cursor;
	return CONTACTS_ERROR_NONE;
}

int contacts_list_first(contacts_list_h list)
{
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	list->cursor = 0;
	return list->records.empty() ? CONTACTS_ERROR_NO_DATA : CONTACTS_ERROR_NONE;
}

int contacts_list_last(contacts_list_h list)
{
	WPRET_VM(!list, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : list");
	if (list->records.empty())
		return CONTACTS_ERROR_NO_DATA;
	list->cursor = list->records.size() - 1;
	return CONTACTS_ERROR_NONE;
}

} // extern "C"
