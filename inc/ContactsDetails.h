#ifndef _CONTACTS_DETAILS_H_
#define _CONTACTS_DETAILS_H_

#include "CtLaunchRequest.h"

#include <contacts.h>

namespace app_assist {
class WView;
}

// The screens of the contact-detail library. Each factory returns a new view
// for the host to push on its naviframe (app_assist::WNaviframe::push), which
// then owns it. A launch request is owned by the host and must outlive the
// view; bad input gives a view that shows nothing or closes, never null.
extern "C" {

// The detail screen of a stored person. With `personId` below 1 the id is
// taken from the request: "person_id" or "ct_person_id" when it has no
// operation, APP_CONTROL_DATA_ID for APP_CONTROL_OPERATION_VIEW.
app_assist::WView* createCtDetailView(int personId, CtLaunchRequest* request);
// The detail screen of a global address list search result (a
// CtGalSearchData the host owns for the life of the view).
app_assist::WView* createCtDetailViewForGalSearch(void* galData);

// The create/edit form: of a new contact (`record` null) or of the given
// contact record, with initial values from the request when it is not null.
app_assist::WView* createCtInputView(contacts_record_h record, CtLaunchRequest* request);
// The edit form built from an application-control request alone.
app_assist::WView* createCtInputViewForEditAppControl(CtLaunchRequest* request);
// The detail screen of the user's own profile.
app_assist::WView* createCtMyProfileDetailView();
// The edit form of the user's own profile: the stored one, else a new one
// seeded from `record` (may be null; the view takes it over). `hostData` is
// the host's CtLaunchRequest or null, kept by the view.
app_assist::WView* createCtMyProfileInputView(contacts_record_h record, void* hostData);
// The first-time profile set-up wizard, at its first step.
app_assist::WView* createCtProfileWizardView();
// Picks fields of a person and returns them to the caller as text.
app_assist::WView* createCtShareContactView(int personId, CtLaunchRequest* request);

}

#endif
