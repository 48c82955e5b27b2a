#include "ToolkitModules.h"

#include <dlfcn.h>

#include <fstream>
#include <set>
#include <string>

namespace ct::platform {

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

const char* toolkitModuleLeakSuppressions()
{
	return "leak:/edje/modules/\n"
	       "leak:/evas/modules/\n"
	       "leak:/ecore_evas/engines/\n"
	       "leak:/ecore_imf/modules/\n"
	       "leak:/elementary/modules/\n";
}

} // namespace ct::platform
