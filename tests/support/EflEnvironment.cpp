#include "EflEnvironment.h"

#include <Elementary.h>

#include <dlfcn.h>

#include <fstream>
#include <set>
#include <string>

namespace ct::test {

namespace {

// The toolkit unloads its engine and loader modules at shutdown; their own
// start-up allocations then show as leaks with no library to name. Keeping
// them mapped lets the leak checker see (and the suppressions cover) them.
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

} // namespace

void EflEnvironment::SetUp()
{
	elm_init(0, nullptr);
	// Transitions still run through the main loop, just without waiting.
	elm_config_transition_duration_factor_set(0.0);
	elm_config_scale_set(1.0);
}

void EflEnvironment::TearDown()
{
	keepToolkitModulesLoaded();
	elm_shutdown();
}

bool EflEnvironment::registerOnce()
{
	static bool registered = [] {
		testing::AddGlobalTestEnvironment(new EflEnvironment());
		return true;
	}();
	return registered;
}

} // namespace ct::test

// Leaks inside the toolkit's own loadable modules (kept mapped above), in the
// same spirit as tests/lsan.supp for its libraries. Only sanitizer builds read it.
extern "C" __attribute__((visibility("default"), used)) const char* __lsan_default_suppressions()
{
	return "leak:/edje/modules/\n"
	       "leak:/evas/modules/\n"
	       "leak:/ecore_evas/engines/\n"
	       "leak:/ecore_imf/modules/\n"
	       "leak:/elementary/modules/\n";
}
