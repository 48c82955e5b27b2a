// The demo persons' pictures: simple portraits drawn once into the data
// folder ("demo-pictures/"), so the store points at files it can keep.
#pragma once

#include <string>
#include <vector>

namespace ct::demo {

class DemoPictures {
public:
	static constexpr int kCount = 8;

	// Writes the missing pictures. Returns their paths (index 0..kCount-1);
	// a picture that could not be written is an empty path (logged).
	static std::vector<std::string> ensure();
};

} // namespace ct::demo
