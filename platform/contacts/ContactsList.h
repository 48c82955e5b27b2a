// contacts_list_s: records with a cursor.
#pragma once

#include "contacts_types.h"

#include <cstddef>
#include <vector>

struct contacts_list_s {
	std::vector<contacts_record_h> records;
	size_t cursor = 0;
};
