// The folder of the compiled resources (themes, images, translations) the
// host and the library read: $CONTACTS_RES_DIR, else the build's or the
// installed one.
#pragma once

#include <string>

namespace ct::demo {

class DemoResourceDir {
public:
	// Resolves the folder to an absolute path once and hands it to the
	// library through CONTACTS_RES_DIR: the toolkit takes a relative theme
	// path for the name of one of its own themes. Returns false, with a
	// message for the user in `error`, when the folder does not exist or
	// lacks the themes.
	static bool resolve(std::string& error);
};

} // namespace ct::demo
