// The host's look: the application's themes added to the toolkit and its
// own widgets (title bar, buttons, window background) in the light palette.
#pragma once

namespace ct::demo {

class DemoLook {
public:
	// Once at start, before the window is made.
	static void apply();
};

} // namespace ct::demo
