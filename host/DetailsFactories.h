// The factories libcontacts-details.so exports, as the host resolves them by
// name. Each returns a new view for the host to push on its naviframe.
#pragma once

#include <ContactsDetails.h>

namespace ct::demo {

using CreateDetailViewFn = decltype(&createCtDetailView);
using CreateGalDetailViewFn = decltype(&createCtDetailViewForGalSearch);
using CreateInputViewFn = decltype(&createCtInputView);
using CreateInputViewForEditFn = decltype(&createCtInputViewForEditAppControl);
using CreateMyProfileDetailViewFn = decltype(&createCtMyProfileDetailView);
using CreateMyProfileInputViewFn = decltype(&createCtMyProfileInputView);
using CreateProfileWizardViewFn = decltype(&createCtProfileWizardView);
using CreateShareContactViewFn = decltype(&createCtShareContactView);

// Every export, in the order the host reports them.
inline constexpr const char* kFactoryNames[] = {
	"createCtDetailView",
	"createCtDetailViewForGalSearch",
	"createCtInputView",
	"createCtInputViewForEditAppControl",
	"createCtMyProfileDetailView",
	"createCtMyProfileInputView",
	"createCtProfileWizardView",
	"createCtShareContactView",
};

} // namespace ct::demo
