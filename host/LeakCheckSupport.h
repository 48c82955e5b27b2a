// Sanitizer builds only: the toolkit unloads its engine and loader modules at
// shutdown, and their own start-up allocations then show as leaks with no
// library to name. Keeping them mapped lets the leak report name (and the
// suppressions below cover) them. Does nothing in other builds.
#pragma once

namespace ct::demo {

// Call right before elm_shutdown().
void keepToolkitModulesLoaded();

} // namespace ct::demo
