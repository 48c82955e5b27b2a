// A headless window with the application themes loaded, for building a
// screen's widgets, letting the toolkit lay them out and saving a picture.
#pragma once

#include <Elementary.h>

#include <string>

namespace ct::test::res {

class ThemeShot {
public:
	// Makes a window of the given size with a white background and a
	// vertical box filling it; adds "contacts.edj" and "detail_layout.edj"
	// of the build as theme extensions.
	ThemeShot(int width, int height);
	~ThemeShot();
	ThemeShot(const ThemeShot&) = delete;
	ThemeShot& operator=(const ThemeShot&) = delete;

	Evas_Object* window() const { return m_window; }
	Evas_Object* box() const { return m_box; }

	// Runs the main loop until jobs and idlers are done and renders once.
	void settle();
	// Saves the rendered window as a PNG; false when that failed.
	bool save(const std::string& path);

private:
	Evas_Object* m_window = nullptr;
	Evas_Object* m_box = nullptr;
	int m_width;
	int m_height;
};

} // namespace ct::test::res
