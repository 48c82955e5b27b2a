// The library's entry points, one per screen.
#include "ContactsDetails.h"

#include "ContactsDebug.h"
#include "CtDetailView.h"
#include "CtMyProfileInputView.h"
#include "CtProfileWizardView.h"
#include "CtShareContactView.h"

app_assist::WView* createCtDetailView(int personId, CtLaunchRequest* request)
{
	WENTER();
	if (personId < 1)
		return new CtDetailView(request);
	return new CtDetailView(personId, request);
}

app_assist::WView* createCtDetailViewForGalSearch(void* galData)
{
	WENTER();
	return new CtDetailView(static_cast<const CtGalSearchData*>(galData));
}

app_assist::WView* createCtShareContactView(int personId, CtLaunchRequest* request)
{
	return new CtShareContactView(personId, request);
}

app_assist::WView* createCtMyProfileInputView(contacts_record_h record, void* hostData)
{
	return new CtMyProfileInputView(record, static_cast<CtLaunchRequest*>(hostData));
}

app_assist::WView* createCtProfileWizardView()
{
	return new CtProfileWizardView();
}
