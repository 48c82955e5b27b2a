#include "LeakCheckSupport.h"

#if defined(__SANITIZE_ADDRESS__)
#include <dlfcn.h>

#include <fstream>
#include <set>
#include <string>
#endif

namespace ct::demo {

#if defined(__SANITIZE_ADDRESS__)

void keepToolkitModulesLoaded()
{
	std::ifstream maps("/proc/self/maps");
	std::set<std::string> modules;
	std::string line;
	while (std::getline(maps, line)) {
		size_t slash = line.find('/');
		if (slash == std::string::npos)
			continue;
		std::string path = line.substr(slash);
		if (path.find("/modules/") != std::string::npos && path.find("module.so") != std::string::npos)
			modules.insert(path);
	}
	for (const std::string& path : modules)
		dlopen(path.c_str(), RTLD_NOW | RTLD_NOLOAD | RTLD_NODELETE);
}

#else

void keepToolkitModulesLoaded()
{
}

#endif

} // namespace ct::demo

#if defined(__SANITIZE_ADDRESS__)
// Leaks inside the toolkit's own loadable modules, in the same spirit as the
// suppressions for its libraries.
extern "C" __attribute__((visibility("default"), used)) const char* __lsan_default_suppressions()
{
	return "leak:/edje/modules/\n"
	       "leak:/evas/modules/\n"
	       "leak:/ecore_evas/engines/\n"
	       "leak:/ecore_imf/modules/\n"
	       "leak:/elementary/modules/\n";
}
#endif
