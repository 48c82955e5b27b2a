// The factories libcontacts-details.so exports, as the host resolves them by
// name. Each returns a new view for the host to push on its naviframe.
#pragma once

#include <CtLaunchRequest.h>

namespace app_assist {
class WView;
}

namespace ct::demo {

using CreateDetailViewFn = app_assist::WView* (*)(int personId, CtLaunchRequest* request);
using CreateMyProfileDetailViewFn = app_assist::WView* (*)();

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
