#include "DemoLook.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtThemeMgr.h"

#include <Edje.h>

#include <string>

namespace ct::demo {

namespace {

const char* const kThemeFiles[] = {"contacts/contacts.edj", "contacts/detail_layout.edj", "contacts/list.edj"};

void addThemes()
{
	for (const char* name : kThemeFiles) {
		std::string path;
		if (ContactsCommon::getAppEdjePath(name, path))
			CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
		else
			WERROR("missing theme %s (resources not built?)", name);
	}
}

// The toolkit's own widgets (title bar, window background) in the light
// palette of the application's themes.
void applyLightLook()
{
	struct ColourClass {
		const char* name;
		int r, g, b;
	};
	const ColourClass classes[] = {
		{"/bg/normal/background", 244, 246, 249},
		{"/bg/normal/naviframe/top", 255, 255, 255},
		{"/fg/normal/naviframe/text/title", 31, 35, 40},
		{"/fg/normal/naviframe/text/subtitle", 107, 114, 128},
		{"/fg/normal/naviframe/top/overlap", 227, 230, 235},
		{"/bg/normal/button", 255, 255, 255},
		{"/bg/pressed/button", 225, 238, 252},
		{"/fg/normal/button", 30, 136, 229},
		{"/fg/pressed/button", 30, 136, 229},
	};
	for (const ColourClass& c : classes)
		edje_color_class_set(c.name, c.r, c.g, c.b, 255, 0, 0, 0, 0, 0, 0, 0, 0);
}

} // namespace

void DemoLook::apply()
{
	addThemes();
	applyLightLook();
}

} // namespace ct::demo
