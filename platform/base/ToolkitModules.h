// Leak checking around the toolkit's loadable modules. The toolkit unloads
// its engine and loader modules at shutdown; their own start-up allocations
// then show as leaks with no library to name.
#pragma once

namespace ct::platform {

// Keeps every loaded toolkit module mapped for the rest of the process, so
// the leak report can name them. Call right before elm_shutdown().
void keepToolkitModulesLoaded();

// Leak-checker suppressions for those modules, for a program's
// __lsan_default_suppressions hook.
const char* toolkitModuleLeakSuppressions();

} // namespace ct::platform
