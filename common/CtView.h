#ifndef _CT_VIEW_H_
#define _CT_VIEW_H_

#include <Elementary.h>

// A base of every contacts screen: tells the open screens when the user
// interface language changed, and builds their root layout.
class CtView {
public:
	CtView();
	virtual ~CtView();
	CtView(const CtView&) = delete;
	CtView& operator=(const CtView&) = delete;

	// The language changed: re-translate titles, refresh rows.
	virtual void onLanguageChanged() {}

	// The root layout: group `group` of the application edje file `edjName`
	// (like "contacts/detail_layout.edj"), or, with both null, the
	// application's base layout with an "elm.swallow.content" part.
	// Null, logged, when the layout cannot be built.
	Evas_Object* createBaseLayout(Evas_Object* parent, const char* edjName, const char* group);

	// Switches the user interface language and tells every open screen.
	static void changeLanguage(const char* locale);
	static int getOpenViewCount();
};

#endif
