// The user's own profile in the demo database: a picture, a status, the
// phone's own number and a few fields of other kinds.
#pragma once

#include <string>
#include <vector>

namespace ct::demo {

class DemoProfile {
public:
	// Stores the profile through the contacts service (connected by the
	// caller) unless one is stored; `pictures` are DemoPictures paths.
	// Returns 0 or a negative contacts error.
	static int ensure(const std::vector<std::string>& pictures);
};

} // namespace ct::demo
