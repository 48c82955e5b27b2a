// The library's entry points, one per screen.
#include "ContactsDetails.h"

#include "ContactsDebug.h"
#include "CtDetailView.h"
#include "CtInputView.h"
#include "CtMyProfileDetailView.h"
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

// The input view's framework base is not its first base: the pointer handed
// out is that of the framework base, which the host deletes through.
app_assist::WView* createCtInputView(contacts_record_h record, CtLaunchRequest* request)
{
	WENTER();
	return new CtInputView(record, request);
}

app_assist::WView* createCtInputViewForEditAppControl(CtLaunchRequest* request)
{
	WENTER();
	return new CtInputView(request);
}

app_assist::WView* createCtMyProfileDetailView()
{
	WENTER();
	return new CtMyProfileDetailView(false);
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
