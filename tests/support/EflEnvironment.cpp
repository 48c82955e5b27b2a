#include "EflEnvironment.h"
#include "ToolkitModules.h"

#include <Elementary.h>

namespace ct::test {

void EflEnvironment::SetUp()
{
	elm_init(0, nullptr);
	// Transitions still run through the main loop, just without waiting.
	elm_config_transition_duration_factor_set(0.0);
	elm_config_scale_set(1.0);
}

void EflEnvironment::TearDown()
{
	ct::platform::keepToolkitModulesLoaded();
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

// Leaks inside the toolkit's own loadable modules (kept mapped at tear-down), in the
// same spirit as tests/lsan.supp for its libraries. Only sanitizer builds read it.
extern "C" __attribute__((visibility("default"), used)) const char* __lsan_default_suppressions()
{
	return ct::platform::toolkitModuleLeakSuppressions();
}
