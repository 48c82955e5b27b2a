#ifndef _CT_THEME_MGR_H_
#define _CT_THEME_MGR_H_

#include <Elementary.h>

// The application's edje files as extensions of the toolkit theme, so the
// screens' layouts and list item styles resolve like built-in ones.
class CtThemeMgr {
public:
	static CtThemeMgr* getInstance();

	// Adds an edje file once; later calls with the same path do nothing.
	void addExtensionTheme(const char* edjPath);
	// Gives `obj` the theme that holds the extensions.
	void setObjectTheme(Evas_Object* obj);
	bool hasExtensionTheme(const char* edjPath) const;

private:
	CtThemeMgr() = default;
};

#endif
