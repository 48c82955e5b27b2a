// A picture of what a canvas shows, for headless runs (ELM_ENGINE=buffer):
// the host's screenshots and the screen tests save windows the same way.
#pragma once

#include <Evas.h>

#include <string>

namespace ct::platform {

// Renders the canvas that `obj` (usually a window) lives on and writes it to
// `path` as a PNG. Returns false, logged, when the canvas has no readable
// pixels (not a buffer engine) or the file cannot be written.
bool saveCanvasPng(Evas_Object* obj, const std::string& path);

} // namespace ct::platform
