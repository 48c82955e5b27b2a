#include "CtMyProfileDetailData.h"

#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"
#include "CtDbChangeSubscription.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

constexpr int kMinImageOrder = 1;
constexpr int kMaxImageOrder = 5;
constexpr size_t kMaxExtraNameLength = 1024;
constexpr size_t kMaxAddressLength = 1024;

bool isEmpty(const char* text)
{
	return !text || !*text;
}

void freeText(char*& text)
{
	free(text);
	text = nullptr;
}

// Cuts `text` to at most `maxBytes` bytes without splitting a UTF-8 sequence.
void cutUtf8(std::string& text, size_t maxBytes)
{
	if (text.size() <= maxBytes)
		return;
	size_t end = maxBytes;
	while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
		--end;
	text.resize(end);
}

char* dupOrNull(const std::string& text)
{
	return text.empty() ? nullptr : strdup(text.c_str());
}

// The text property, borrowed from the record; null (logged) when it cannot be read.
const char* textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	int err = contacts_record_get_str_p(record, property, &value);
	if (err != CONTACTS_ERROR_NONE)
		WERROR("contacts_record_get_str_p() Failed(%d)", err);
	return value;
}

int intOf(contacts_record_h record, unsigned int property)
{
	int value = 0;
	int err = contacts_record_get_int(record, property, &value);
	if (err != CONTACTS_ERROR_NONE)
		WERROR("contacts_record_get_int() Failed(%d)", err);
	return value;
}

contacts_record_h childAt(contacts_record_h record, unsigned int property, int index)
{
	contacts_record_h child = nullptr;
	if (contacts_record_get_child_record_at_p(record, property, index, &child) != CONTACTS_ERROR_NONE)
		return nullptr;
	return child;
}

void appendPart(std::string& text, const char* part, const char* separator)
{
	if (isEmpty(part))
		return;
	if (!text.empty())
		text += separator;
	text += part;
}

// "name department, job title", each part only when set.
char* companyLine(contacts_record_h company)
{
	std::string line;
	appendPart(line, textOf(company, _contacts_company.name), "");
	appendPart(line, textOf(company, _contacts_company.department), " ");
	appendPart(line, textOf(company, _contacts_company.job_title), ", ");
	return dupOrNull(line);
}

// The phonetic name parts joined by blanks in the name display order.
char* phoneticName(contacts_record_h name)
{
	const char* first = textOf(name, _contacts_name.phonetic_first);
	const char* middle = textOf(name, _contacts_name.phonetic_middle);
	const char* last = textOf(name, _contacts_name.phonetic_last);
	contacts_name_display_order_e order = CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST;
	int err = contacts_setting_get_name_display_order(&order);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_setting_get_name_display_order", err);
	std::string text;
	const char* parts[3] = {first, middle, last};
	if (order == CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST) {
		parts[0] = last;
		parts[1] = first;
		parts[2] = middle;
	}
	for (const char* part : parts)
		appendPart(text, part, " ");
	return dupOrNull(text);
}

char* joinExtraNames(const char* phonetic, const char* nickname)
{
	std::string joined;
	appendPart(joined, phonetic, "");
	appendPart(joined, nickname, ", ");
	cutUtf8(joined, kMaxExtraNameLength);
	return dupOrNull(joined);
}

void destroyRecordList(Eina_List*& list)
{
	void* data = nullptr;
	EINA_LIST_FREE(list, data) {
		int err = contacts_record_destroy(static_cast<contacts_record_h>(data), true);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_record_destroy", err);
	}
}

} // namespace

CtMyProfileDetailData::CtMyProfileDetailData()
{
	WENTER();
	init();
	m_subscription = std::make_unique<CtDbChangeSubscription>(_contacts_my_profile._uri, __onPersonChanged, this);
}

CtMyProfileDetailData::~CtMyProfileDetailData()
{
	m_subscription.reset();
	deInit();
}

void CtMyProfileDetailData::attachListener(ICtChangeListener* listener)
{
	WPRET_M(!listener, "WASSERT! listener");
	m_listener = listener;
}

void CtMyProfileDetailData::detachListener()
{
	m_listener = nullptr;
}

char* CtMyProfileDetailData::getVcardStream()
{
	WPRET_VM(!m_profileRecord, nullptr, "no profile to share");
	char* stream = nullptr;
	int err = contacts_vcard_make_from_my_profile(m_profileRecord, &stream);
	if (err != CONTACTS_ERROR_NONE) {
		WERROR("contacts_vcard_make_from_my_profile() Failed(%d)", err);
		return nullptr;
	}
	return stream;
}

void CtMyProfileDetailData::init()
{
	WENTER();
	int err = contacts_connect();
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_connect", err);
	m_connected = err == CONTACTS_ERROR_NONE;
	__loadProfileRecord();
	if (!m_profileRecord)
		return;
	__getBasicInfo();
	__getStatus();
	__getDefaultNumber();
	__getChildNumberList();
	m_emailList = __getChildDataList(_contacts_my_profile.email);
	m_addressList = __getChildDataList(_contacts_my_profile.address);
	m_messengerList = __getChildDataList(_contacts_my_profile.messenger);
	m_urlList = __getChildDataList(_contacts_my_profile.url);
	m_relationshipList = __getChildDataList(_contacts_my_profile.relationship);
	m_eventList = __getChildDataList(_contacts_my_profile.event);
	m_noteList = __getChildDataList(_contacts_my_profile.note);
}

void CtMyProfileDetailData::__loadProfileRecord()
{
	contacts_list_h list = nullptr;
	int err = contacts_db_get_all_records(_contacts_my_profile._uri, 0, 0, &list);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_get_all_records", err);
	contacts_record_h record = nullptr;
	int count = 0;
	if (list && contacts_list_get_count(list, &count) == CONTACTS_ERROR_NONE && count > 0
		&& contacts_list_get_current_record_p(list, &record) == CONTACTS_ERROR_NONE)
		m_profileId = intOf(record, _contacts_my_profile.id);
	if (list)
		contacts_list_destroy(list, true);
	if (!record) {
		WDEBUG("record is NULL");
		return;
	}
	// Records of a list come without their children: the profile is read whole.
	err = contacts_db_get_record(_contacts_my_profile._uri, m_profileId, &m_profileRecord);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_get_record", err);
}

void CtMyProfileDetailData::deInit()
{
	if (m_timeFormatter)
		i18n_udate_destroy(m_timeFormatter);
	m_timeFormatter = nullptr;
	for (Eina_List** list : {&m_numberList, &m_emailList, &m_addressList, &m_messengerList, &m_relationshipList,
			 &m_urlList, &m_eventList, &m_noteList})
		destroyRecordList(*list);
	for (contacts_record_h* record : {&m_defaultNumber, &m_profileRecord}) {
		if (*record)
			contacts_record_destroy(*record, true);
		*record = nullptr;
	}
	for (char** text : {&m_thumbnailPath, &m_displayName, &m_extraName2, &m_phoneticName, &m_nickname, &m_company,
			 &m_status})
		freeText(*text);
	m_profileId = 0;
	if (m_connected) {
		int err = contacts_disconnect();
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_disconnect", err);
	}
	m_connected = false;
}

void CtMyProfileDetailData::__getBasicInfo()
{
	char* name = nullptr;
	int err = contacts_record_get_str(m_profileRecord, _contacts_my_profile.display_name, &name);
	if (err != CONTACTS_ERROR_NONE)
		WWARNING("contacts_record_get_str display_name %d", err);
	m_displayName = ctCommonRemoveNewline(name);
	free(name);
	err = contacts_record_get_str(m_profileRecord, _contacts_my_profile.image_thumbnail_path, &m_thumbnailPath);
	if (err != CONTACTS_ERROR_NONE)
		WWARNING("contacts_record_get_str image_thumbnail_path %d", err);
	__getCompany();
	__getExtraName1();
	m_extraName2 = joinExtraNames(m_phoneticName, m_nickname);
}

void CtMyProfileDetailData::__getCompany()
{
	contacts_record_h company = childAt(m_profileRecord, _contacts_my_profile.company, 0);
	if (!company) {
		WDEBUG("no company");
		return;
	}
	m_company = companyLine(company);
}

void CtMyProfileDetailData::__getExtraName1()
{
	contacts_record_h name = childAt(m_profileRecord, _contacts_my_profile.name, 0);
	contacts_record_h nickname = childAt(m_profileRecord, _contacts_my_profile.nickname, 0);
	if (!name && !nickname)
		return;
	if (nickname) {
		const char* text = textOf(nickname, _contacts_nickname.name);
		m_nickname = isEmpty(text) ? nullptr : strdup(text);
	}
	if (name)
		m_phoneticName = phoneticName(name);
}

void CtMyProfileDetailData::__getStatus()
{
	const char* status = textOf(m_profileRecord, _contacts_my_profile_ex.status);
	m_status = status ? strdup(status) : nullptr;
}

// The phone's own number: the default one, kept apart from the number list.
void CtMyProfileDetailData::__getDefaultNumber()
{
	for (int i = 0; contacts_record_h number = childAt(m_profileRecord, _contacts_my_profile.number, i); ++i) {
		bool isDefault = false;
		contacts_record_get_bool(number, _contacts_number.is_default, &isDefault);
		if (!isDefault)
			continue;
		int err = contacts_record_clone(number, &m_defaultNumber);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_record_clone", err);
		return;
	}
}

void CtMyProfileDetailData::__getChildNumberList()
{
	for (int i = 0; contacts_record_h number = childAt(m_profileRecord, _contacts_my_profile.number, i); ++i) {
		bool isDefault = false;
		int err = contacts_record_get_bool(number, _contacts_number.is_default, &isDefault);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_record_get_bool", err);
			return;
		}
		contacts_record_h clone = nullptr;
		if (!isDefault && contacts_record_clone(number, &clone) == CONTACTS_ERROR_NONE)
			m_numberList = eina_list_append(m_numberList, clone);
	}
}

Eina_List* CtMyProfileDetailData::__getChildDataList(unsigned int property)
{
	Eina_List* list = nullptr;
	for (int i = 0; contacts_record_h child = childAt(m_profileRecord, property, i); ++i) {
		contacts_record_h clone = nullptr;
		int err = contacts_record_clone(child, &clone);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_list_get_current_record_p", err);
			break;
		}
		list = eina_list_append(list, clone);
	}
	return list;
}

int CtMyProfileDetailData::getPersonId()
{
	WPRET_VM(!m_profileRecord, 0, "no profile record");
	return intOf(m_profileRecord, _contacts_my_profile.id);
}

char* CtMyProfileDetailData::getImagePath(int order)
{
	WPRET_VM(order < kMinImageOrder || order > kMaxImageOrder, nullptr, "Invalid Param : order : %d", order);
	const char* path = nullptr;
	for (int i = 0; contacts_record_h image = childAt(m_profileRecord, _contacts_my_profile.image, i); ++i) {
		int imageOrder = 0;
		if (contacts_record_get_int(image, _contacts_image_ex.order, &imageOrder) != CONTACTS_ERROR_NONE)
			return nullptr;
		if (imageOrder == order)
			path = textOf(image, _contacts_image.path);
	}
	return isEmpty(path) ? nullptr : strdup(path);
}

int CtMyProfileDetailData::getDataType(contacts_record_h record, int property)
{
	return intOf(record, property);
}

const char* CtMyProfileDetailData::getDataTypeCustom(contacts_record_h record, int property)
{
	return textOf(record, property);
}

const char* CtMyProfileDetailData::getNumber(contacts_record_h record) { return textOf(record, _contacts_number.number); }
const char* CtMyProfileDetailData::getEmail(contacts_record_h record) { return textOf(record, _contacts_email.email); }
const char* CtMyProfileDetailData::getMessenger(contacts_record_h record) { return textOf(record, _contacts_messenger.im_id); }
const char* CtMyProfileDetailData::getUrl(contacts_record_h record) { return textOf(record, _contacts_url.url); }
const char* CtMyProfileDetailData::getNote(contacts_record_h record) { return textOf(record, _contacts_note.note); }
int CtMyProfileDetailData::getEvent(contacts_record_h record) { return intOf(record, _contacts_event.date); }

const char* CtMyProfileDetailData::getRelationship(contacts_record_h record)
{
	return textOf(record, _contacts_relationship.name);
}

// One part per line: post box, postal code, region, locality, street, country, extended.
void CtMyProfileDetailData::getAddress(contacts_record_h record, char* buf, int size)
{
	WPRET_M(!record || !buf || size <= 0, "Invalid param");
	std::string text;
	for (unsigned int part : {_contacts_address.postbox, _contacts_address.postal_code, _contacts_address.region,
			 _contacts_address.locality, _contacts_address.street, _contacts_address.country,
			 _contacts_address.extended})
		appendPart(text, textOf(record, part), "\n");
	cutUtf8(text, std::min(kMaxAddressLength, static_cast<size_t>(size)) - 1);
	memcpy(buf, text.c_str(), text.size() + 1);
}

i18n_udate_h CtMyProfileDetailData::getTimeFormatter()
{
	if (!m_timeFormatter)
		m_timeFormatter = CtCommonGetTimeFormatter();
	return m_timeFormatter;
}

int CtMyProfileDetailData::getCalendarType(contacts_record_h record)
{
	WENTER();
	return intOf(record, _contacts_event.calendar_type);
}

bool CtMyProfileDetailData::getIsLeapMonth(contacts_record_h record)
{
	bool leap = false;
	int err = contacts_record_get_bool(record, _contacts_event.is_leap_month, &leap);
	if (err != CONTACTS_ERROR_NONE)
		WERROR("contacts_record_get_bool() Failed(%d)", err);
	return leap;
}

void CtMyProfileDetailData::__onPersonChanged(const char*, void* userData)
{
	WHIT();
	WPRET_M(!userData, "userData is NULL");
	auto* data = static_cast<CtMyProfileDetailData*>(userData);
	WPRET_M(!data->m_listener, "__listener is NULL");
	data->deInit();
	data->init();
	data->m_listener->onDbChanged(_contacts_my_profile._uri);
}
