#include "ToolkitModules.h"

#if defined(__SANITIZE_ADDRESS__)
// Leaks inside the toolkit's own loadable modules, in the same spirit as the
// suppressions for its libraries.
extern "C" __attribute__((visibility("default"), used)) const char* __lsan_default_suppressions()
{
	return ct::platform::toolkitModuleLeakSuppressions();
}
#endif
