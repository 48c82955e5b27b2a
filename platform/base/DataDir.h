// Where the platform services keep their files.
#pragma once

#include <string>

namespace ct::platform {

// $CONTACTS_DATA_DIR, else $XDG_DATA_HOME/contacts-demo, else
// ~/.local/share/contacts-demo. Created on first use; empty if that fails.
std::string dataDir();

// dataDir() joined with `name`.
std::string dataPath(const std::string& name);

// Creates `path` and its parents. Returns 0 or a negative errno.
int makeDirectories(const std::string& path);

} // namespace ct::platform
