#include "CtDetailViewNumberItem.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"

#include <app_control.h>

#include <Ecore.h>

#include <cstring>

namespace {

const char* const kUsageExtra = "Contacts_detail";
const double kIconTapWindow = 1.0;

} // namespace

CtDetailViewNumberItem::CtDetailViewNumberItem(CtDetailDataBase* data, contacts_record_h record, bool isBlocked,
		bool isSimContact)
	: CtDetailViewGenlistItem(data), m_record(record), m_isBlocked(isBlocked), m_isSimContact(isSimContact)
{
}

std::string CtDetailViewNumberItem::getCopyText()
{
	return __getNumber();
}

std::string CtDetailViewNumberItem::__getNumber() const
{
	const char* number = getData()->getNumber(m_record);
	return number ? number : "";
}

std::string CtDetailViewNumberItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0) {
		if (m_isSimContact)
			return translate("IDS_PB_HEADER_PHONE_M_CALL");
		int type = getData()->getDataType(m_record, _contacts_number.type);
		return typeLabel(CtCommonGetNumberTypeStr(m_record, type));
	}
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return highlightMain(toMarkup(__getNumber().c_str()));
	return std::string();
}

Evas_Object* CtDetailViewNumberItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.left.bottom") == 0) {
		if (!m_isBlocked)
			return nullptr;
		return createIconLayout(genlist, "list/A/log/block_icon");
	}
	if (strcmp(part, "elm.icon.2") == 0) {
		Evas_Object* layout = createIconLayout(genlist, "list/C/detail/number_icon");
		addIconButton(layout, "elm.icon1", "contacts_btn_ic_call.png", "touch.call", false);
		addIconButton(layout, "elm.icon3", "contacts_btn_ic_message.png", "touch.message", false);
		return layout;
	}
	if (strcmp(part, "copy.text.area") == 0)
		return createCopyArea(genlist, "elm.text.main.left.bottom");
	return nullptr;
}

void CtDetailViewNumberItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	call();
}

void CtDetailViewNumberItem::onIconClicked(const char* touchPart)
{
	if (strcmp(touchPart, "touch.message") == 0)
		sendMessage();
	else
		call();
}

void CtDetailViewNumberItem::call()
{
	WENTER();
	if (m_iconTapped) {
		// The message icon's tap also selects the row; that must not call too.
		// A flag left from a tap that never selected the row must not swallow
		// a later call, so it only counts right after the tap.
		m_iconTapped = false;
		if (ecore_loop_time_get() - m_iconTapTime < kIconTapWindow)
			return;
	}
	if (!ContactsCommon::checkCallManagerReady()) {
		WWARNING("call manager is not ready");
		return;
	}
	std::string uri = "tel:" + __getNumber();
	app_control_h handle = nullptr;
	int err = app_control_create(&handle);
	WPRET_M(err != APP_CONTROL_ERROR_NONE, "app_control_create() Failed(%d)", err);
	app_control_set_operation(handle, APP_CONTROL_OPERATION_CALL);
	app_control_set_uri(handle, uri.c_str());
	int personId = getData()->getPersonId();
	if (personId > 0)
		app_control_add_extra_data(handle, "ctindex", std::to_string(personId).c_str());
	err = app_control_send_launch_request(handle, nullptr, nullptr);
	if (err != APP_CONTROL_ERROR_NONE)
		WFAILED("app_control_send_launch_request", err);
	app_control_destroy(handle);
	insertUsageLog("PH01", kUsageExtra);
}

void CtDetailViewNumberItem::sendMessage()
{
	WENTER();
	m_iconTapped = true;
	m_iconTapTime = ecore_loop_time_get();
	int numberId = 0;
	contacts_record_get_int(m_record, _contacts_number.id, &numberId);
	std::string numberIndex = __getNumber() + "/" + std::to_string(numberId);
	app_control_h handle = nullptr;
	int err = app_control_create(&handle);
	WPRET_M(err != APP_CONTROL_ERROR_NONE, "app_control_create() Failed(%d)", err);
	app_control_set_launch_mode(handle, APP_CONTROL_LAUNCH_MODE_GROUP);
	app_control_set_app_id(handle, MESSAGE_COMPOSER_APP_ID);
	app_control_set_operation(handle, APP_CONTROL_OPERATION_COMPOSE);
	app_control_add_extra_data(handle, "number/index", numberIndex.c_str());
	if (!ContactsAppControlLauncher::getInstance()->sendLaunchRequest(handle))
		WERROR("launch Failed");
	app_control_destroy(handle);
	insertUsageLog("PH03", kUsageExtra);
}
