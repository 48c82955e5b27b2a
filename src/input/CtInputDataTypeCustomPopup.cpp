#include "CtInputDataTypeCustomPopup.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonTextUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtInputViewGenlistItem.h"

#include <notification.h>
#include <ui_extension.h>

#include <cstring>

namespace {

const double kLimitNoticeSeconds = 3.5;

bool isBlank(char c)
{
	return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

} // namespace

CtInputDataTypeCustomPopup::CtInputDataTypeCustomPopup()
{
	setTextTranslatable("contacts");
	setTitle("IDS_PB_HEADER_ENTER_CUSTOM_LABEL_ABB");
	addButton("IDS_PB_BUTTON_CANCEL", nullptr);
	addButton("IDS_PB_SK_CREATE_ABB", [this](bool*) { __saveCustomDataType(); },
			[](Evas_Object* button) { elm_object_disabled_set(button, EINA_TRUE); });
	setContent([this](Evas_Object* parent) { return __createContent(parent); });
}

std::string CtInputDataTypeCustomPopup::trimLabel(const char* text)
{
	if (!text)
		return std::string();
	const char* begin = text;
	while (*begin && isBlank(*begin))
		++begin;
	const char* end = begin + strlen(begin);
	while (end > begin && isBlank(end[-1]))
		--end;
	return std::string(begin, end);
}

Evas_Object* CtInputDataTypeCustomPopup::onCreate(Evas_Object* parent, void* param)
{
	m_popup = WPopup::onCreate(parent, param);
	return m_popup;
}

Evas_Object* CtInputDataTypeCustomPopup::__createContent(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/contacts.edj", "popup_input_text");
	WPRET_VM(!layout, nullptr, "layout is NULL");
	Evas_Object* field = uxt_edit_field_layout_add(layout, UXT_EDIT_FIELD_LAYOUT_STYLE_SINGLELINE);
	m_entry = uxt_edit_field_layout_get_entry(field);
	elm_object_domain_translatable_part_text_set(m_entry, "elm.guide", "contacts", "IDS_PB_NPBODY_CUSTOM_TYPE_ABB");
	elm_entry_input_panel_imdata_set(m_entry, "action=disable_emoticons", strlen("action=disable_emoticons"));
	CtInputViewGenlistItem::addLengthLimit(m_entry, kMaxChars);
	elm_entry_cnp_mode_set(m_entry, ELM_CNP_MODE_PLAINTEXT);
	elm_entry_autocapital_type_set(m_entry, ELM_AUTOCAPITAL_TYPE_WORD);
	elm_entry_input_panel_return_key_type_set(m_entry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_DONE);
	for (const char* signal : {"changed", "preedit,changed"})
		evas_object_smart_callback_add(m_entry, signal, __dataTypeCustomEntryChangedCb, this);
	evas_object_smart_callback_add(uxt_edit_field_layout_get_clear_button(field), "clicked",
			__dataTypeCustomEntryChangedCb, this);
	evas_object_smart_callback_add(m_entry, "activated", __entryActivatedCb, this);
	evas_object_smart_callback_add(m_entry, "maxlength,reached", __maxLengthReachedCb, this);
	evas_object_event_callback_add(m_entry, EVAS_CALLBACK_SHOW, __entryShowCb, this);
	elm_object_part_content_set(layout, "elm.swallow.content", field);
	return layout;
}

void CtInputDataTypeCustomPopup::__updateCreateButton()
{
	Evas_Object* create = m_popup ? elm_object_part_content_get(m_popup, "button2") : nullptr;
	if (!create || !m_entry)
		return;
	elm_object_disabled_set(create, CtInputViewGenlistItem::isEntryEmpty(m_entry) ? EINA_TRUE : EINA_FALSE);
}

void CtInputDataTypeCustomPopup::__saveCustomDataType()
{
	WPRET_M(!m_entry, "text is NULL");
	std::string text = CtInputViewGenlistItem::getEntryUtf8(m_entry);
	std::string label = trimLabel(text.c_str());
	if (label.empty() || m_resultSent)
		return;
	m_resultSent = true;
	if (m_resultCallback)
		m_resultCallback(label.c_str());
}

void CtInputDataTypeCustomPopup::__dataTypeCustomEntryChangedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputDataTypeCustomPopup*>(data)->__updateCreateButton();
}

void CtInputDataTypeCustomPopup::__entryActivatedCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtInputDataTypeCustomPopup*>(data);
	if (CtInputViewGenlistItem::isEntryEmpty(obj) || self->isDestroying())
		return;
	self->__saveCustomDataType();
	self->destroy();
}

void CtInputDataTypeCustomPopup::__entryShowCb(void* data, Evas*, Evas_Object* obj, void*)
{
	evas_object_event_callback_del_full(obj, EVAS_CALLBACK_SHOW, __entryShowCb, data);
	elm_object_focus_set(obj, EINA_TRUE);
}

void CtInputDataTypeCustomPopup::__maxLengthReachedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<CtInputDataTypeCustomPopup*>(data);
	if (app_assist::WUiTimer::isAlive(self->m_noticeTimer))
		return;
	int err = notification_status_message_post(ContactsCommon::translate("IDS_PB_POP_MAXIMUM_NUMBER_OF_CHARACTERS_REACHED"));
	if (err != NOTIFICATION_ERROR_NONE)
		WFAILED("notification_status_message_post", err);
	self->m_noticeTimer = app_assist::WUiTimer::addTimer(kLimitNoticeSeconds, [](void*) { return false; }, nullptr, self);
}
