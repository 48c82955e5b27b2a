#include "CtDllViewFactory.h"

#include "ContactsDebug.h"
#include "CtContactPickerView.h"
#include "CtRelationshipPickerView.h"
#include "CtUnlinkContactView.h"

CtDllViewFactory* CtDllViewFactory::getInstance()
{
	static CtDllViewFactory instance;
	return &instance;
}

app_assist::WView* CtDllViewFactory::getCtListViewClass(ContactsData* data)
{
	WENTER();
	WPRET_VM(!data, nullptr, "Invalid param : data");
	WPRET_VM(!data->appControl, nullptr, "Invalid param : appControl");
	return new CtContactPickerView(data->appControl);
}

app_assist::WView* CtDllViewFactory::getCtListUnlinkContactViewClass(int personId)
{
	WENTER();
	WPRET_VM(personId < 1, nullptr, "Invalid param : personId %d", personId);
	return new CtUnlinkContactView(personId);
}

app_assist::WView* CtDllViewFactory::getCtListViewClassForRelationship()
{
	WENTER();
	return new CtRelationshipPickerView();
}
