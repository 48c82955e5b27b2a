#include "CtShareContactViewItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"
#include "CtCommonWidgetUtil.h"

#include <algorithm>
#include <cstring>

namespace {

const char* const kCheckEdj = "contacts/contacts.edj";
const int kAddressBytes = 1024;
const int kMinYear = 1902;

std::string orEmpty(const char* text)
{
	return text ? text : "";
}

Elm_Genlist_Item_Class makeItemClass(const char* style, Elm_Gen_Item_Text_Get_Cb textGet,
		Elm_Gen_Item_Content_Get_Cb contentGet)
{
	Elm_Genlist_Item_Class itc = {};
	itc.version = ELM_GENLIST_ITEM_CLASS_VERSION;
	itc.item_style = style;
	itc.func.text_get = textGet;
	itc.func.content_get = contentGet;
	return itc;
}

} // namespace

CtShareContactViewItem::CtShareContactViewItem(CtDetailDataBase* data, contacts_record_h record, const char* kind)
	: m_data(data), m_record(record), m_kind(orEmpty(kind))
{
}

void CtShareContactViewItem::setMarked(bool marked)
{
	m_marked = marked;
	if (Elm_Object_Item* item = getElmObjectItem())
		elm_genlist_item_fields_update(item, "elm.icon.2", ELM_GENLIST_ITEM_FIELD_CONTENT);
}

std::string CtShareContactViewItem::getFieldKey() const
{
	int id = 0;
	unsigned int idProperty = 0;
	if (__isKind(_contacts_number._uri))
		idProperty = _contacts_number.id;
	else if (__isKind(_contacts_email._uri))
		idProperty = _contacts_email.id;
	else if (__isKind(_contacts_address._uri))
		idProperty = _contacts_address.id;
	else if (__isKind(_contacts_messenger._uri))
		idProperty = _contacts_messenger.id;
	else if (__isKind(_contacts_url._uri))
		idProperty = _contacts_url.id;
	else if (__isKind(_contacts_relationship._uri))
		idProperty = _contacts_relationship.id;
	else if (__isKind(_contacts_event._uri))
		idProperty = _contacts_event.id;
	else if (__isKind(_contacts_note._uri))
		idProperty = _contacts_note.id;
	if (idProperty)
		contacts_record_get_int(m_record, idProperty, &id);
	return m_kind + "/" + std::to_string(id);
}

std::string CtShareContactViewItem::getShareLabel() const
{
	if (__isKind(_contacts_number._uri))
		return orEmpty(CtCommonGetNumberTypeStr(__type(_contacts_number.type), __custom(_contacts_number.label)));
	if (__isKind(_contacts_email._uri))
		return orEmpty(CtCommonGetEmailTypeStr(__type(_contacts_email.type), __custom(_contacts_email.label)));
	if (__isKind(_contacts_address._uri))
		return orEmpty(CtCommonGetAddressTypeStr(__type(_contacts_address.type), __custom(_contacts_address.label)));
	if (__isKind(_contacts_messenger._uri))
		return orEmpty(CtCommonGetMessengerTypeStr(__type(_contacts_messenger.type), __custom(_contacts_messenger.label)));
	// A shared web address is always labelled as a home one.
	if (__isKind(_contacts_url._uri))
		return ContactsCommon::translate("IDS_PB_OPT_HOME_ABB2");
	if (__isKind(_contacts_relationship._uri))
		return orEmpty(CtCommonGetRelationshipTypeStr(__type(_contacts_relationship.type),
				__custom(_contacts_relationship.label)));
	if (__isKind(_contacts_event._uri))
		return orEmpty(CtCommonGetEventTypeStr(__type(_contacts_event.type), __custom(_contacts_event.label)));
	return std::string();
}

std::string CtShareContactViewItem::getShareValue() const
{
	WPRET_VM(!m_data || !m_record, std::string(), "Invalid param : record");
	if (__isKind(_contacts_number._uri))
		return orEmpty(m_data->getNumber(m_record));
	if (__isKind(_contacts_email._uri))
		return orEmpty(m_data->getEmail(m_record));
	if (__isKind(_contacts_address._uri)) {
		char address[kAddressBytes] = {0};
		m_data->getAddress(m_record, address, sizeof(address));
		return address;
	}
	if (__isKind(_contacts_messenger._uri))
		return orEmpty(m_data->getMessenger(m_record));
	if (__isKind(_contacts_url._uri))
		return orEmpty(m_data->getUrl(m_record));
	if (__isKind(_contacts_relationship._uri))
		return orEmpty(m_data->getRelationship(m_record));
	if (__isKind(_contacts_event._uri))
		return __eventDate();
	if (__isKind(_contacts_note._uri))
		return orEmpty(m_data->getNote(m_record));
	WERROR("unknown kind %s", m_kind.c_str());
	return std::string();
}

std::string CtShareContactViewItem::__eventDate() const
{
	int date = m_data->getEvent(m_record);
	int year = date / 10000;
	int month = date / 100 % 100;
	int day = date % 100;
	if (month < 1 || month > 12 || day < 1 || day > 31) {
		WERROR("Invalid date(mon=%d,day=%d)", month, day);
		return std::string();
	}
	std::string text = year == 0
		? CtCommonGetDatetimeStr(m_data->getTimeFormatterWithoutYear(), year, month, day)
		: CtCommonGetDatetimeStr(m_data->getTimeFormatter(), std::max(year, kMinYear), month, day);
	if (m_data->getCalendarType(m_record) == 1)
		text += std::string("(") + ContactsCommon::translate("IDS_PB_SBODY_LUNAR_M_STATUS") + ")";
	return text;
}

Elm_Gen_Item_Class* CtShareContactViewItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class multiline = makeItemClass("detail/multiline_main.sub.1icon", __textGetCb, __contentGetCb);
	static Elm_Genlist_Item_Class twoLine = makeItemClass("2line.bottom", __textGetCb, __contentGetCb);
	return __isMultiline() ? &multiline : &twoLine;
}

bool CtShareContactViewItem::__isMultiline() const
{
	return __isKind(_contacts_note._uri) || __isKind(_contacts_address._uri);
}

bool CtShareContactViewItem::__isKind(const char* uri) const
{
	return m_kind == uri;
}

int CtShareContactViewItem::__type(unsigned int typeProperty) const
{
	return m_data ? m_data->getDataType(m_record, typeProperty) : 0;
}

const char* CtShareContactViewItem::__custom(unsigned int labelProperty) const
{
	return m_data ? m_data->getDataTypeCustom(m_record, labelProperty) : nullptr;
}

std::string CtShareContactViewItem::__text(const char* part) const
{
	bool multiline = __isMultiline();
	if (strcmp(part, multiline ? "elm.text.sub" : "elm.text.sub.left.top") == 0) {
		const char* label = __isKind(_contacts_note._uri) ? ContactsCommon::translate("IDS_PB_BUTTON_NOTES")
			: nullptr;
		return ctCommonUtf8ToMarkup(label ? label : getShareLabel().c_str());
	}
	if (strcmp(part, multiline ? "elm.text.multiline" : "elm.text.main.left.bottom") == 0)
		return ctCommonUtf8ToMarkup(getShareValue().c_str());
	return std::string();
}

Evas_Object* CtShareContactViewItem::__content(Evas_Object* genlist, const char* part) const
{
	if (strcmp(part, "elm.icon.2") != 0)
		return nullptr;
	Evas_Object* layout = ctCommonCreateLayout(genlist, kCheckEdj, "list/C/type.2");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* check = elm_check_add(layout);
	elm_check_state_set(check, m_marked ? EINA_TRUE : EINA_FALSE);
	elm_object_part_content_set(layout, "elm.swallow.content", check);
	// Taps belong to the row, whose selection toggles the mark.
	elm_layout_signal_emit(layout, "elm,event,pass,enabled", "");
	evas_object_pass_events_set(layout, EINA_TRUE);
	return layout;
}

char* CtShareContactViewItem::__textGetCb(void* data, Evas_Object*, const char* part)
{
	auto* row = static_cast<CtShareContactViewItem*>(data);
	std::string text = row && part ? row->__text(part) : std::string();
	return text.empty() ? nullptr : strdup(text.c_str());
}

Evas_Object* CtShareContactViewItem::__contentGetCb(void* data, Evas_Object* obj, const char* part)
{
	auto* row = static_cast<CtShareContactViewItem*>(data);
	return row && part ? row->__content(obj, part) : nullptr;
}
