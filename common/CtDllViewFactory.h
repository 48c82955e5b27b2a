#ifndef _CT_DLL_VIEW_FACTORY_H_
#define _CT_DLL_VIEW_FACTORY_H_

#include "ContactsData.h"
#include "WView.h"

// Makes the list screens of the contacts application that other screens
// push: each returns a new view for WNaviframe::push (the naviframe then
// owns it), or null, logged, for bad input.
class CtDllViewFactory {
public:
	static CtDllViewFactory* getInstance();

	// The contact picker driven by `data->appControl` (copied).
	app_assist::WView* getCtListViewClass(ContactsData* data);
	// The list of the person's linked contacts, each of which can be unlinked.
	app_assist::WView* getCtListUnlinkContactViewClass(int personId);
	// The person picker of a relationship (answers through the registry).
	app_assist::WView* getCtListViewClassForRelationship();

private:
	CtDllViewFactory() = default;
};

#endif
