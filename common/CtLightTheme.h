#ifndef _CT_LIGHT_THEME_H_
#define _CT_LIGHT_THEME_H_

#include <string>

// The light look of the toolkit's own widgets: "contacts/light.edj" as a
// theme overlay, with its palette set for the whole application. The host
// applies it once at start; tests apply and remove it around a scope.
class CtLightTheme {
public:
	// Returns false, logged, when the file is missing or unreadable (the
	// toolkit then keeps its default look). Applying twice does nothing.
	static bool apply();
	// Back to the toolkit's default look.
	static void remove();
	static bool isApplied();
	// Full path of the overlay file; empty when it is not installed.
	static std::string getPath();
};

#endif
