#include "CtDetailViewProfileSharingItem.h"

#include "CtContactsAgentUtil.h"
#include "CtEsuAgentMgr.h"

#include <cstring>

namespace {

const int kBusinessProfile = 1;

} // namespace

CtDetailViewProfileSharingItem::CtDetailViewProfileSharingItem(CtDetailDataBase* data)
	: CtDetailViewGenlistItem(data)
{
}

std::string CtDetailViewProfileSharingItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return translate("IDS_PB_MBODY_PROFILE_SHARING");
	if (strcmp(part, "elm.text.main.left.bottom") != 0)
		return std::string();
	if (!CtEsuAgentMgr::getInstance()->getProfileSharingStatus())
		return translate("IDS_PB_BODY_OFF_M_NOT_USED");
	if (CtContactsAgentUtil::getPreferenceProfileType() == kBusinessProfile)
		return translate("IDS_PB_HEADER_BUSINESS_PROFILE_ABB");
	return translate("IDS_PB_HEADER_PERSONAL_PROFILE_ABB");
}
