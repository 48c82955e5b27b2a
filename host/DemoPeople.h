// The persons of the demo database: about thirty varied people (linked
// contacts, SIM contacts, favourites, blocked numbers, pictures, events with
// and without year and lunar ones, long texts, several scripts).
#pragma once

#include <string>
#include <vector>

namespace ct::demo {

class DemoPeople {
public:
	static constexpr int kPersonCount = 30;
	// Numbers put on the call-block list.
	static const std::vector<std::string>& blockedNumbers();

	// Stores every demo person through the contacts service (connected by
	// the caller); `pictures` are DemoPictures paths (empty ones are left
	// out). Returns 0 or the first negative contacts error.
	static int fill(const std::vector<std::string>& pictures);
};

} // namespace ct::demo
