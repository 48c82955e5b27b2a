#include "CtProfileOptionSelectControl.h"

#include "ContactsDebug.h"
#include "CtProfileOptionItem.h"

int CtProfileOptionSelectControl::append(Evas_Object* genlist)
{
	WENTER();
	WPRET_VM(!genlist, 0, "Invalid param : genlist");
	int count = 0;
	auto* group = new CtProfileSharingRow("group_index");
	group->setTextId("elm.text", "IDS_PB_HEADER_ADDITIONAL_INFO_TO_SHARE_ABB");
	count += CtProfileSharingRow::append(genlist, group) ? 1 : 0;

	auto* info = new CtProfileSharingRow("multiline_sub");
	info->setTextId("elm.text.multiline",
		"IDS_PB_BODY_YOUR_NAME_STATUS_AND_PROFILE_PICTURE_WILL_BE_SHARED_WITH_YOUR_CONTACTS_MSG");
	count += CtProfileSharingRow::append(genlist, info) ? 1 : 0;

	for (int p = CT_PROFILE_PROPERTY_EMAIL; p < CT_PROFILE_PROPERTY_MAX; ++p) {
		auto* option = new CtProfileOptionItem(static_cast<CtProfileProperty>(p), m_onChanged);
		count += CtProfileSharingRow::append(genlist, option) ? 1 : 0;
	}
	return count;
}
