#include "CtProfileOptionItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"

#include <notification.h>

namespace {

struct PropertyTexts {
	const char* textId;
	const char* logName;
};

constexpr PropertyTexts kTexts[CT_PROFILE_PROPERTY_MAX] = {
	{"IDS_PB_BODY_EMAIL", "Email"},
	{"IDS_PB_OPT_ORGANISATION_ABB", "Organisation"},
	{"IDS_PB_BODY_ADDRESS_ABB2", "Address"},
	{"IDS_PB_MBODY_DATE_OF_BIRTH", "Birthday"},
};

bool isValid(CtProfileProperty property)
{
	return property >= CT_PROFILE_PROPERTY_EMAIL && property < CT_PROFILE_PROPERTY_MAX;
}

} // namespace

CtProfileOptionItem::CtProfileOptionItem(CtProfileProperty property, std::function<void()> onChanged)
	: CtProfileSharingRow("1line"),
	  m_property(property),
	  m_shared(CtContactsAgentMgr::getInstance()->getProfileProperty(property)),
	  m_onChanged(std::move(onChanged))
{
	setTextId("elm.text.main.left", textIdOf(property));
	setContent("elm.icon.2", [this](Evas_Object* parent) {
		return createSwitch(parent, m_shared, __checkButtonChangedCb, this);
	});
	// Rows with a handler are selectable; the real work is in onSelect.
	setSelectHandler([](CtProfileSharingRow*) {});
}

const char* CtProfileOptionItem::textIdOf(CtProfileProperty property)
{
	return isValid(property) ? kTexts[property].textId : "";
}

const char* CtProfileOptionItem::logNameOf(CtProfileProperty property)
{
	return isValid(property) ? kTexts[property].logName : "";
}

void CtProfileOptionItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (Evas_Object* check = getCheck())
		ctCommonChecktStateSet(check, !elm_check_state_get(check), 1);
	__toggle();
}

void CtProfileOptionItem::__toggle()
{
	if (!ctCommonCheckNetworkEnable()) {
		int err = notification_status_message_post(
			ContactsCommon::translate("IDS_PB_TPOP_UNABLE_TO_CHANGE_STATUS_CHECK_NETWORK_CONNECTION_AND_TRY_AGAIN"));
		if (err != NOTIFICATION_ERROR_NONE)
			WWARNING("notification_status_message_post() Failed(%d)", err);
	} else if (CtContactsAgentMgr::getInstance()->setProfileProperty(m_property, !m_shared)) {
		m_shared = !m_shared;
	} else {
		WERROR("setProfileProperty() failed");
	}
	if (Evas_Object* check = getCheck())
		ctCommonChecktStateSet(check, m_shared, 1);
	ctCommonInsertUsageLog("CT19", logNameOf(m_property));
	if (m_onChanged)
		m_onChanged();
}

void CtProfileOptionItem::__checkButtonChangedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* row = static_cast<CtProfileOptionItem*>(data);
	WPRET_M(!row, "data is NULL");
	row->__toggle();
}
