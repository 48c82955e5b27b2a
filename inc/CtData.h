#ifndef _CT_DATA_H_
#define _CT_DATA_H_

#include <Eina.h>
#include <contacts.h>

#include <string>
#include <vector>

class ICtChangeListener;

// Type tables shared by the editable contacts: contacts-service type values
// and the positions of the type menus of the input rows, both ways.
namespace CtDataType {

// Positions of the number type menu.
enum NumberMenuPosition {
	NUMBER_MENU_OTHER = 0,
	NUMBER_MENU_CUSTOM = 1,
	NUMBER_MENU_MOBILE = 2,
	NUMBER_MENU_WORK = 3,
	NUMBER_MENU_HOME = 4,
	NUMBER_MENU_MAIN = 5,
	NUMBER_MENU_WORK_FAX = 6,
	NUMBER_MENU_HOME_FAX = 7,
	NUMBER_MENU_PAGER = 8,
	NUMBER_MENU_OTHER_OR_CUSTOM = 9, // what a custom or unknown type shows
};

// Positions of the messenger type menu.
enum MessengerMenuPosition {
	MESSENGER_MENU_CUSTOM = 0,
	MESSENGER_MENU_AIM = 1,
	MESSENGER_MENU_YAHOO = 2,
	MESSENGER_MENU_SKYPE = 3,
	MESSENGER_MENU_QQ = 4,
	MESSENGER_MENU_HANGOUTS = 5,
	MESSENGER_MENU_ICQ = 6,
	MESSENGER_MENU_JABBER = 7,
};

constexpr int kNumberWorkVoice = CONTACTS_NUMBER_TYPE_WORK | CONTACTS_NUMBER_TYPE_VOICE;
constexpr int kNumberHomeVoice = CONTACTS_NUMBER_TYPE_HOME | CONTACTS_NUMBER_TYPE_VOICE;
constexpr int kNumberWorkFax = CONTACTS_NUMBER_TYPE_WORK | CONTACTS_NUMBER_TYPE_FAX;
constexpr int kNumberHomeFax = CONTACTS_NUMBER_TYPE_HOME | CONTACTS_NUMBER_TYPE_FAX;

// Menu position -> number type. Positions above 8 give other (0); a
// negative position comes back unchanged.
constexpr int numberTypeByIndex(int index)
{
	constexpr int types[] = {
		CONTACTS_NUMBER_TYPE_OTHER, CONTACTS_NUMBER_TYPE_CUSTOM, CONTACTS_NUMBER_TYPE_CELL,
		kNumberWorkVoice, kNumberHomeVoice, CONTACTS_NUMBER_TYPE_MAIN,
		kNumberWorkFax, kNumberHomeFax, CONTACTS_NUMBER_TYPE_PAGER,
	};
	if (index < 0)
		return index;
	return index <= NUMBER_MENU_PAGER ? types[index] : CONTACTS_NUMBER_TYPE_OTHER;
}

// Number type -> menu position, bits tested in a fixed order. A voice or
// fax type without home or work bit gives `plainVoiceOrFax` (mobile for an
// ordinary contact).
constexpr int numberIndexByType(int type, int plainVoiceOrFax = NUMBER_MENU_MOBILE)
{
	if (type & CONTACTS_NUMBER_TYPE_CUSTOM)
		return NUMBER_MENU_OTHER_OR_CUSTOM;
	if (type & CONTACTS_NUMBER_TYPE_CELL)
		return NUMBER_MENU_MOBILE;
	if (type & CONTACTS_NUMBER_TYPE_VOICE) {
		if (type & CONTACTS_NUMBER_TYPE_HOME)
			return NUMBER_MENU_HOME;
		return (type & CONTACTS_NUMBER_TYPE_WORK) ? NUMBER_MENU_WORK : plainVoiceOrFax;
	}
	if (type & CONTACTS_NUMBER_TYPE_FAX) {
		if (type & CONTACTS_NUMBER_TYPE_HOME)
			return NUMBER_MENU_HOME_FAX;
		return (type & CONTACTS_NUMBER_TYPE_WORK) ? NUMBER_MENU_WORK_FAX : plainVoiceOrFax;
	}
	if (type & CONTACTS_NUMBER_TYPE_PAGER)
		return NUMBER_MENU_PAGER;
	if (type & CONTACTS_NUMBER_TYPE_MAIN)
		return NUMBER_MENU_MAIN;
	if (type == CONTACTS_NUMBER_TYPE_HOME)
		return NUMBER_MENU_HOME;
	if (type == CONTACTS_NUMBER_TYPE_WORK)
		return NUMBER_MENU_WORK;
	return NUMBER_MENU_OTHER_OR_CUSTOM;
}

// Messenger menu position -> type. `hangoutsType` is what position 5 gives
// (Hangouts for an ordinary contact, Jabber for the profile).
constexpr int messengerTypeByIndex(int index, int hangoutsType = CONTACTS_MESSENGER_TYPE_GOOGLE)
{
	constexpr int types[] = {
		CONTACTS_MESSENGER_TYPE_CUSTOM, CONTACTS_MESSENGER_TYPE_AIM, CONTACTS_MESSENGER_TYPE_YAHOO,
		CONTACTS_MESSENGER_TYPE_SKYPE, CONTACTS_MESSENGER_TYPE_QQ, CONTACTS_MESSENGER_TYPE_GOOGLE,
		CONTACTS_MESSENGER_TYPE_ICQ,
	};
	if (index < 0)
		return index;
	if (index == MESSENGER_MENU_HANGOUTS)
		return hangoutsType;
	return index < MESSENGER_MENU_JABBER ? types[index] : CONTACTS_MESSENGER_TYPE_JABBER;
}

// Messenger type -> menu position; every unlisted type gives Jabber's (7).
constexpr int messengerIndexByType(int type, int hangoutsPosition = MESSENGER_MENU_HANGOUTS)
{
	switch (type) {
	case CONTACTS_MESSENGER_TYPE_CUSTOM: return MESSENGER_MENU_CUSTOM;
	case CONTACTS_MESSENGER_TYPE_GOOGLE: return hangoutsPosition;
	case CONTACTS_MESSENGER_TYPE_YAHOO: return MESSENGER_MENU_YAHOO;
	case CONTACTS_MESSENGER_TYPE_ICQ: return MESSENGER_MENU_ICQ;
	case CONTACTS_MESSENGER_TYPE_AIM: return MESSENGER_MENU_AIM;
	case CONTACTS_MESSENGER_TYPE_QQ: return MESSENGER_MENU_QQ;
	case CONTACTS_MESSENGER_TYPE_SKYPE: return MESSENGER_MENU_SKYPE;
	default: return MESSENGER_MENU_JABBER;
	}
}

// The two messenger menus: an ordinary contact's, and the profile's, where
// position 5 gives Jabber, type 2 (Hangouts) sits on position 7 and a full
// menu gives custom.
struct MessengerMenu {
	int hangoutsType;
	int hangoutsPosition;
	int whenFull;
};
constexpr MessengerMenu kContactMessengerMenu {
	CONTACTS_MESSENGER_TYPE_GOOGLE, MESSENGER_MENU_HANGOUTS, CONTACTS_MESSENGER_TYPE_JABBER};
constexpr MessengerMenu kProfileMessengerMenu {
	CONTACTS_MESSENGER_TYPE_JABBER, MESSENGER_MENU_JABBER, CONTACTS_MESSENGER_TYPE_CUSTOM};

constexpr int messengerTypeByIndex(int index, const MessengerMenu& menu)
{
	return messengerTypeByIndex(index, menu.hangoutsType);
}

constexpr int messengerIndexByType(int type, const MessengerMenu& menu)
{
	return messengerIndexByType(type, menu.hangoutsPosition);
}

// Next types from the types already used by the contact's children.

// First free number menu position from 2 to 8, as a type; other (0) when all are taken.
inline int nextNumberType(const std::vector<int>& usedTypes)
{
	bool taken[NUMBER_MENU_OTHER_OR_CUSTOM + 1] = {};
	for (int type : usedTypes)
		taken[numberIndexByType(type)] = true;
	for (int i = NUMBER_MENU_MOBILE; i <= NUMBER_MENU_PAGER; ++i)
		if (!taken[i])
			return numberTypeByIndex(i);
	return CONTACTS_NUMBER_TYPE_OTHER;
}

// Home (2) while no type has the home bit, else work (4) while none has the
// work bit, else other (0). E-mails and addresses share these values.
inline int nextHomeWorkType(const std::vector<int>& usedTypes)
{
	int all = 0;
	for (int type : usedTypes)
		all |= type;
	if (!(all & CONTACTS_EMAIL_TYPE_HOME))
		return CONTACTS_EMAIL_TYPE_HOME;
	if (!(all & CONTACTS_EMAIL_TYPE_WORK))
		return CONTACTS_EMAIL_TYPE_WORK;
	return CONTACTS_EMAIL_TYPE_OTHER;
}

// Birthday, then anniversary, then other.
inline int nextEventType(const std::vector<int>& usedTypes)
{
	bool birthday = false, anniversary = false;
	for (int type : usedTypes) {
		birthday |= type == CONTACTS_EVENT_TYPE_BIRTH;
		anniversary |= type == CONTACTS_EVENT_TYPE_ANNIVERSARY;
	}
	if (!birthday)
		return CONTACTS_EVENT_TYPE_BIRTH;
	return anniversary ? CONTACTS_EVENT_TYPE_OTHER : CONTACTS_EVENT_TYPE_ANNIVERSARY;
}

// First unused type from 1 to 14; 14 when all are used.
inline int nextRelationshipType(const std::vector<int>& usedTypes)
{
	bool taken[CONTACTS_RELATIONSHIP_TYPE_SPOUSE + 1] = {};
	for (int type : usedTypes)
		if (type >= 0 && type <= CONTACTS_RELATIONSHIP_TYPE_SPOUSE)
			taken[type] = true;
	for (int type = CONTACTS_RELATIONSHIP_TYPE_ASSISTANT; type <= CONTACTS_RELATIONSHIP_TYPE_SPOUSE; ++type)
		if (!taken[type])
			return type;
	return CONTACTS_RELATIONSHIP_TYPE_SPOUSE;
}

// First free messenger position from 1 to 6, as a type; `whenFull` (Jabber
// for an ordinary contact) when none is free.
inline int nextMessengerType(const std::vector<int>& usedTypes, const MessengerMenu& menu)
{
	bool taken[MESSENGER_MENU_JABBER + 1] = {};
	for (int type : usedTypes)
		taken[messengerIndexByType(type, menu)] = true;
	for (int i = MESSENGER_MENU_AIM; i < MESSENGER_MENU_JABBER; ++i)
		if (!taken[i])
			return messengerTypeByIndex(i, menu);
	return menu.whenFull;
}

inline int nextMessengerType(const std::vector<int>& usedTypes, int whenFull = CONTACTS_MESSENGER_TYPE_JABBER)
{
	MessengerMenu menu = kContactMessengerMenu;
	menu.whenFull = whenFull;
	return nextMessengerType(usedTypes, menu);
}

} // namespace CtDataType

// The contact being edited, as the edit screens see it. Implemented by
// CtInputData (phone, account and SIM contacts) and CtMyProfileInputData.
// Child handles come from the list and add operations, stay owned by the
// contact record and are valid until removed or until this object dies.
// Lists are new Eina_Lists the caller frees with eina_list_free (not their
// records). Texts point into the record and may be null.
class CtData {
public:
	virtual ~CtData() {}

	// Saving and names.
	virtual int insertContact(int* outId) = 0;
	virtual int updateContact() = 0;
	virtual int insertSIMContact(int* outId) = 0;
	virtual int updateSIMContact() = 0;
	virtual int separateFullName(contacts_record_h nameRecord, const char* fullName) = 0;
	virtual int separatePhoneticFullName(contacts_record_h nameRecord, const char* fullName) = 0;
	virtual int setPrefixName(const char* text) = 0;
	virtual int setSuffixName(const char* text) = 0;
	virtual int setPhoneticFullName(const char* text) = 0;
	virtual int setPhoneticFirstName(const char* text) = 0;
	virtual int setPhoneticMiddleName(const char* text) = 0;
	virtual int setPhoneticLastName(const char* text) = 0;
	virtual int setNickname(const char* text) = 0;
	virtual int setCompany(const char* text) = 0;
	virtual int setJobTitle(const char* text) = 0;
	virtual int setFullName(const char* text) = 0;
	virtual int setFirstName(const char* text) = 0;
	virtual int setMiddleName(const char* text) = 0;
	virtual int setLastName(const char* text) = 0;

	// Name getters.
	virtual const char* getPrefixName() = 0;
	virtual const char* getSuffixName() = 0;
	virtual std::string getPhoneticFullName() = 0;
	virtual const char* getPhoneticFirstName() = 0;
	virtual const char* getPhoneticMiddleName() = 0;
	virtual const char* getPhoneticLastName() = 0;
	virtual const char* getNickname() = 0;
	virtual std::string getCompany() = 0;
	virtual const char* getJobTitle() = 0;
	virtual std::string getFullName() = 0;
	virtual const char* getFirstName() = 0;
	virtual const char* getMiddleName() = 0;
	virtual const char* getLastName() = 0;

	// Contact, storage and SIM facts.
	virtual bool getIsFavorite() = 0;
	virtual int getPersonId() = 0;
	virtual int getAddressbookId() = 0;
	virtual const char* getAddressbookName() = 0;
	virtual const char* getUserName() = 0;
	virtual void setAddressbookInfo(int addressbookId) = 0;
	virtual bool checkAddressbookIsSimOrNot(int addressbookId) = 0;
	virtual void setPreferenceHideStoragePopup(bool hide) = 0;
	virtual contacts_record_h getEmergencyNumber() = 0;

	// Numbers.
	virtual Eina_List* getNumberList() = 0;
	virtual contacts_record_h addNumber(const char* number) = 0;
	virtual int setNumberNumber(contacts_record_h record, const char* number) = 0;
	virtual int getDataType(contacts_record_h record, unsigned int propertyId) = 0;
	virtual int setNumberType(contacts_record_h record, int type, const char* label) = 0;
	virtual int removeNumber(contacts_record_h record) = 0;
	virtual const char* getNumberNumber(contacts_record_h record) = 0;
	virtual const char* getDataTypeCustom(contacts_record_h record, unsigned int propertyId) = 0;
	virtual int getNumberTypeByIndex(int index) = 0;
	virtual int getNumberIndexType(int type) = 0;
	virtual int getNextNumberType() = 0;

	// E-mails.
	virtual Eina_List* getEmailList() = 0;
	virtual contacts_record_h addEmail(const char* email) = 0;
	virtual int setEmailEmail(contacts_record_h record, const char* email) = 0;
	virtual int setEmailType(contacts_record_h record, int type, const char* label) = 0;
	virtual const char* getEmailEmail(contacts_record_h record) = 0;
	virtual int getNextEmailType() = 0;
	virtual int removeEmail(contacts_record_h record) = 0;

	// Note.
	virtual Eina_List* getNoteList() = 0;
	virtual contacts_record_h getNoteRecord() = 0;
	virtual contacts_record_h addNote(const char* note) = 0;
	virtual int setNote(contacts_record_h record, const char* note) = 0;
	virtual const char* getNote(contacts_record_h record) = 0;
	virtual int removeNote(contacts_record_h record) = 0;

	// Addresses.
	virtual Eina_List* getAddressList() = 0;
	virtual contacts_record_h addAddress(const char* address) = 0;
	virtual int setAddressAddress(contacts_record_h record, const char* address) = 0;
	virtual int setAddressType(contacts_record_h record, int type, const char* label) = 0;
	virtual int getAddressAddress(contacts_record_h record, char* buffer, unsigned int size) = 0;
	virtual int getNextAddressType() = 0;
	virtual int removeAddress(contacts_record_h record) = 0;

	// Messengers.
	virtual Eina_List* getMessengerList() = 0;
	virtual contacts_record_h addMessenger(const char* messenger) = 0;
	virtual int setMessengerMessenger(contacts_record_h record, const char* messenger) = 0;
	virtual int setMessengerType(contacts_record_h record, int type, const char* label) = 0;
	virtual int getMessengerIndexType(int type) = 0;
	virtual int getMessengerTypeByIndex(int index) = 0;
	virtual const char* getMessengerMessenger(contacts_record_h record) = 0;
	virtual int getNextMessengerType() = 0;
	virtual int removeMessenger(contacts_record_h record) = 0;

	// Websites.
	virtual Eina_List* getWebsiteList() = 0;
	virtual contacts_record_h addWebsite(const char* website) = 0;
	virtual int setWebsiteWebsite(contacts_record_h record, const char* website) = 0;
	virtual const char* getWebsiteWebsite(contacts_record_h record) = 0;
	virtual int removeWebsite(contacts_record_h record) = 0;

	// Relationships.
	virtual Eina_List* getRelationshipList() = 0;
	virtual contacts_record_h addRelationship(const char* relationship) = 0;
	virtual int setRelationshipRelationship(contacts_record_h record, const char* relationship) = 0;
	virtual int setRelationshipType(contacts_record_h record, int type, const char* label) = 0;
	virtual const char* getRelationshipRelationship(contacts_record_h record) = 0;
	virtual int getNextRelationshipType() = 0;
	virtual int removeRelationship(contacts_record_h record) = 0;

	// Events (dates as YYYYMMDD).
	virtual Eina_List* getEventList() = 0;
	virtual contacts_record_h addEvent(int date) = 0;
	virtual int setEventEvent(contacts_record_h record, int date) = 0;
	virtual int setEventType(contacts_record_h record, int type, const char* label) = 0;
	virtual int getEventEvent(contacts_record_h record) = 0;
	virtual int getNextEventType() = 0;
	virtual int removeEvent(contacts_record_h record) = 0;

	// Contact-wide operations.
	virtual const char* getRingtone() = 0;
	virtual int setRingtone(const char* path, const char* position = nullptr) = 0;
	virtual int getContactId() = 0;
	virtual contacts_record_h getDefaultEmail() = 0;
	virtual contacts_record_h getDefaultNumber() = 0;
	virtual bool checkChangedTypeIsDeleted() = 0;
	virtual void attachListener(ICtChangeListener* listener) = 0;
	virtual void detachListener() = 0;
	virtual int getSimUnusedFieldCount(int fieldType) = 0;
	virtual int getSimFieldTextMaxLen(int fieldType) = 0;
	virtual bool getSimFieldStatus(int fieldType) = 0;
	virtual contacts_record_h addGroupRelation(int groupId) = 0;
	virtual void setAddressbookItemShown(bool shown) = 0;
	virtual bool getAddressbookItemShown() = 0;
	virtual void setStatusText(const char* status) = 0;
	virtual void setStatus(const char* status) = 0;
	// The ordinary contact returns a heap copy the caller frees; the profile
	// returns a pointer into its record.
	virtual const char* getStatus() = 0;
	virtual int getSimNo() = 0;
	virtual void removeAllGroups() = 0;
	virtual void getAllGroupsId(std::vector<int>& groupIds) = 0;
	virtual void updateGroupsName() = 0;
	virtual std::string getGroupsName() = 0;

	// Images and lunar calendar.
	virtual const char* getImagePath() = 0;
	virtual const char* getImagePath(int order) = 0;
	virtual contacts_record_h getImageRecord() = 0;
	virtual contacts_record_h getImageRecord(int order) = 0;
	virtual int getImageOrder(int index) = 0;
	virtual void setImageOrder(int index, int order) = 0;
	virtual int getImageIndex(int order) = 0;
	virtual int setImage(contacts_record_h image, const char* path, int type) = 0;
	virtual int getImageCount() = 0;
	virtual int removeImage(contacts_record_h image) = 0;
	virtual bool isInEmergencyGroup() = 0;
	virtual int setCalendarType(contacts_record_h event, int calendarType) = 0;
	virtual int getCalendarType(contacts_record_h event) = 0;
	virtual int setIsLeapMonth(contacts_record_h event, bool isLeapMonth) = 0;
	virtual bool getIsLeapMonth(contacts_record_h event) = 0;
};

#endif
