#ifndef _CONTACTS_DATA_H_
#define _CONTACTS_DATA_H_

#include <app_control.h>

// What a screen hands to the contact picker (CtDllViewFactory::
// getCtListViewClass): the app-control handle whose extras drive the picker
// ("type", "ct_selected_person_id", "ct_max", ...). The caller keeps
// ownership of the handle; the picker works on its own copy.
struct ContactsData {
	int viewType = 0;
	app_control_h appControl = nullptr;
	void* ugHandle = nullptr;
	int reserved = 0;
};

#endif
