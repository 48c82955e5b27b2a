// Where the tests find the built resources and the source tree.
#pragma once

#include <cstdlib>
#include <string>

namespace ct::test::res {

// The build's resource folder (edje/, locale/, images/), as the test runner sets it.
inline std::string buildResDir()
{
	const char* dir = getenv("CONTACTS_RES_DIR");
	return dir ? dir : "";
}

inline std::string edjePath(const std::string& name)
{
	return buildResDir() + "/edje/" + name;
}

// The source tree: this file lives in <root>/tests/res/.
inline std::string sourceRoot()
{
	std::string file = __FILE__;
	for (int i = 0; i < 3; ++i)
		file = file.substr(0, file.find_last_of('/'));
	return file;
}

// A folder for pictures a person reviews; kept after the run.
inline std::string outputDir()
{
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	return std::string(bin ? bin : "/tmp") + "/test-output/res";
}

} // namespace ct::test::res
