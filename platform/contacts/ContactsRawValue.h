// The int a C caller passed for an enum parameter, read without assuming it
// is one of the enumerators (reading an out-of-range enum is undefined).
#pragma once

#include <cstring>

namespace ct::contacts {

template <typename E>
int rawValue(const E& e)
{
	static_assert(sizeof(E) == sizeof(int), "enum parameters are ints");
	int v = 0;
	std::memcpy(&v, &e, sizeof v);
	return v;
}

} // namespace ct::contacts
