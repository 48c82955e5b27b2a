#include "CtThemeMgr.h"

#include "ContactsDebug.h"
#include "CtLightTheme.h"

#include <cstring>

CtThemeMgr* CtThemeMgr::getInstance()
{
	static CtThemeMgr instance;
	return &instance;
}

void CtThemeMgr::addExtensionTheme(const char* edjPath)
{
	WPRET_M(!edjPath || !*edjPath, "Invalid param : edjPath");
	// The toolkit's widgets around the application's layouts look light too;
	// the overlay also brings the application's base layout.
	CtLightTheme::apply();
	if (hasExtensionTheme(edjPath))
		return;
	// Extensions of the default theme reach every widget, popups on the
	// window included, not only those below one layout.
	elm_theme_extension_add(nullptr, edjPath);
}

void CtThemeMgr::setObjectTheme(Evas_Object* obj)
{
	WPRET_M(!obj, "Invalid param : obj");
	elm_object_theme_set(obj, nullptr);
}

bool CtThemeMgr::hasExtensionTheme(const char* edjPath) const
{
	if (!edjPath)
		return false;
	// Asked of the toolkit, not remembered: the default theme is rebuilt
	// when the toolkit restarts.
	const Eina_List* l;
	void* item;
	EINA_LIST_FOREACH(elm_theme_extension_list_get(nullptr), l, item)
		if (item && strcmp(static_cast<const char*>(item), edjPath) == 0)
			return true;
	return false;
}
