#include "CtLightTheme.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"

#include <Elementary.h>

#include <string>
#include <vector>

namespace {

constexpr const char* kLightEdj = "contacts/light.edj";

std::string& appliedPath()
{
	static std::string path;
	return path;
}

// The names of the colour classes the file defines, each set for the whole
// application from the file's values.
std::vector<std::string> setPaletteOf(const std::string& path)
{
	std::vector<std::string> names;
	Eina_File* file = eina_file_open(path.c_str(), EINA_FALSE);
	if (!file)
		return names;
	Eina_Iterator* it = edje_mmap_color_class_iterator_new(file);
	Edje_Color_Class* cc = nullptr;
	EINA_ITERATOR_FOREACH(it, cc) {
		edje_color_class_set(cc->name, cc->r, cc->g, cc->b, cc->a, cc->r2, cc->g2, cc->b2, cc->a2, cc->r3, cc->g3,
			cc->b3, cc->a3);
		names.emplace_back(cc->name);
	}
	eina_iterator_free(it);
	eina_file_close(file);
	return names;
}

std::vector<std::string>& paletteNames()
{
	static std::vector<std::string> names;
	return names;
}

} // namespace

std::string CtLightTheme::getPath()
{
	std::string path;
	if (!ContactsCommon::getAppEdjePath(kLightEdj, path))
		return "";
	return path;
}

bool CtLightTheme::apply()
{
	if (isApplied())
		return true;
	std::string path = getPath();
	WPRET_VM(path.empty(), false, "%s is missing", kLightEdj);
	std::vector<std::string> names = setPaletteOf(path);
	WPRET_VM(names.empty(), false, "%s has no palette", path.c_str());
	elm_theme_overlay_add(nullptr, path.c_str());
	paletteNames() = std::move(names);
	appliedPath() = path;
	return true;
}

void CtLightTheme::remove()
{
	if (!isApplied())
		return;
	for (const std::string& name : paletteNames())
		edje_color_class_del(name.c_str());
	paletteNames().clear();
	elm_theme_overlay_del(nullptr, appliedPath().c_str());
	appliedPath().clear();
}

bool CtLightTheme::isApplied()
{
	return !appliedPath().empty();
}
