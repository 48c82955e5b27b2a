#ifndef _CT_MY_PROFILE_INPUT_DATA_H_
#define _CT_MY_PROFILE_INPUT_DATA_H_

#include "CtData.h"

#include <contacts.h>

#include <string>
#include <vector>

// The user's own profile behind the profile edit form: the one my-profile
// record of the contacts service (or a new one when none is stored), changed
// field by field and written back on save. It keeps up to five ordered
// pictures, a status text, and the phone's own number apart from the other
// numbers. Storage, person, group, ringtone and SIM operations answer fixed
// values. Main loop only.
class CtMyProfileInputData : public CtData {
public:
	// Loads the stored profile, else starts a new empty one (id 0).
	CtMyProfileInputData();
	// Takes over `record` (may be null); a stored profile replaces it.
	explicit CtMyProfileInputData(contacts_record_h record);
	~CtMyProfileInputData() override;
	CtMyProfileInputData(const CtMyProfileInputData&) = delete;
	CtMyProfileInputData& operator=(const CtMyProfileInputData&) = delete;

	// The profile record itself (owned by this object).
	contacts_record_h getProfileRecord() const { return m_profileRecord; }

	// CtData
	int insertContact(int* outId) override;
	int updateContact() override;
	int insertSIMContact(int* outId) override;
	int updateSIMContact() override;
	int separateFullName(contacts_record_h nameRecord, const char* fullName) override;
	int separatePhoneticFullName(contacts_record_h nameRecord, const char* fullName) override;
	int setPrefixName(const char* text) override;
	int setSuffixName(const char* text) override;
	int setPhoneticFullName(const char* text) override;
	int setPhoneticFirstName(const char* text) override;
	int setPhoneticMiddleName(const char* text) override;
	int setPhoneticLastName(const char* text) override;
	int setNickname(const char* text) override;
	int setCompany(const char* text) override;
	int setJobTitle(const char* text) override;
	int setFullName(const char* text) override;
	int setFirstName(const char* text) override;
	int setMiddleName(const char* text) override;
	int setLastName(const char* text) override;

	const char* getPrefixName() override;
	const char* getSuffixName() override;
	std::string getPhoneticFullName() override;
	const char* getPhoneticFirstName() override;
	const char* getPhoneticMiddleName() override;
	const char* getPhoneticLastName() override;
	const char* getNickname() override;
	std::string getCompany() override;
	const char* getJobTitle() override;
	std::string getFullName() override;
	const char* getFirstName() override;
	const char* getMiddleName() override;
	const char* getLastName() override;

	bool getIsFavorite() override;
	int getPersonId() override;
	int getAddressbookId() override;
	const char* getAddressbookName() override;
	const char* getUserName() override;
	void setAddressbookInfo(int addressbookId) override;
	bool checkAddressbookIsSimOrNot(int addressbookId) override;
	void setPreferenceHideStoragePopup(bool hide) override;
	contacts_record_h getEmergencyNumber() override;

	Eina_List* getNumberList() override;
	contacts_record_h addNumber(const char* number) override;
	int setNumberNumber(contacts_record_h record, const char* number) override;
	int getDataType(contacts_record_h record, unsigned int propertyId) override;
	int setNumberType(contacts_record_h record, int type, const char* label) override;
	int removeNumber(contacts_record_h record) override;
	const char* getNumberNumber(contacts_record_h record) override;
	const char* getDataTypeCustom(contacts_record_h record, unsigned int propertyId) override;
	int getNumberTypeByIndex(int index) override;
	int getNumberIndexType(int type) override;
	int getNextNumberType() override;

	Eina_List* getEmailList() override;
	contacts_record_h addEmail(const char* email) override;
	int setEmailEmail(contacts_record_h record, const char* email) override;
	int setEmailType(contacts_record_h record, int type, const char* label) override;
	const char* getEmailEmail(contacts_record_h record) override;
	int getNextEmailType() override;
	int removeEmail(contacts_record_h record) override;

	Eina_List* getNoteList() override;
	contacts_record_h getNoteRecord() override;
	contacts_record_h addNote(const char* note) override;
	int setNote(contacts_record_h record, const char* note) override;
	const char* getNote(contacts_record_h record) override;
	int removeNote(contacts_record_h record) override;

	Eina_List* getAddressList() override;
	contacts_record_h addAddress(const char* address) override;
	int setAddressAddress(contacts_record_h record, const char* address) override;
	int setAddressType(contacts_record_h record, int type, const char* label) override;
	int getAddressAddress(contacts_record_h record, char* buffer, unsigned int size) override;
	int getNextAddressType() override;
	int removeAddress(contacts_record_h record) override;

	Eina_List* getMessengerList() override;
	contacts_record_h addMessenger(const char* messenger) override;
	int setMessengerMessenger(contacts_record_h record, const char* messenger) override;
	int setMessengerType(contacts_record_h record, int type, const char* label) override;
	int getMessengerIndexType(int type) override;
	int getMessengerTypeByIndex(int index) override;
	const char* getMessengerMessenger(contacts_record_h record) override;
	int getNextMessengerType() override;
	int removeMessenger(contacts_record_h record) override;

	Eina_List* getWebsiteList() override;
	contacts_record_h addWebsite(const char* website) override;
	int setWebsiteWebsite(contacts_record_h record, const char* website) override;
	const char* getWebsiteWebsite(contacts_record_h record) override;
	int removeWebsite(contacts_record_h record) override;

	Eina_List* getRelationshipList() override;
	contacts_record_h addRelationship(const char* relationship) override;
	int setRelationshipRelationship(contacts_record_h record, const char* relationship) override;
	int setRelationshipType(contacts_record_h record, int type, const char* label) override;
	const char* getRelationshipRelationship(contacts_record_h record) override;
	int getNextRelationshipType() override;
	int removeRelationship(contacts_record_h record) override;

	Eina_List* getEventList() override;
	contacts_record_h addEvent(int date) override;
	int setEventEvent(contacts_record_h record, int date) override;
	int setEventType(contacts_record_h record, int type, const char* label) override;
	int getEventEvent(contacts_record_h record) override;
	int getNextEventType() override;
	int removeEvent(contacts_record_h record) override;

	const char* getRingtone() override;
	int setRingtone(const char* path, const char* position = nullptr) override;
	int getContactId() override;
	contacts_record_h getDefaultEmail() override;
	contacts_record_h getDefaultNumber() override;
	bool checkChangedTypeIsDeleted() override;
	void attachListener(ICtChangeListener* listener) override;
	void detachListener() override;
	int getSimUnusedFieldCount(int fieldType) override;
	int getSimFieldTextMaxLen(int fieldType) override;
	bool getSimFieldStatus(int fieldType) override;
	contacts_record_h addGroupRelation(int groupId) override;
	void setAddressbookItemShown(bool shown) override;
	bool getAddressbookItemShown() override;
	void setStatusText(const char* status) override;
	void setStatus(const char* status) override;
	const char* getStatus() override;
	int getSimNo() override;
	void removeAllGroups() override;
	void getAllGroupsId(std::vector<int>& groupIds) override;
	void updateGroupsName() override;
	std::string getGroupsName() override;

	const char* getImagePath() override;
	const char* getImagePath(int order) override;
	contacts_record_h getImageRecord() override;
	contacts_record_h getImageRecord(int order) override;
	int getImageOrder(int index) override;
	void setImageOrder(int index, int order) override;
	int getImageIndex(int order) override;
	int setImage(contacts_record_h image, const char* path, int type) override;
	int getImageCount() override;
	int removeImage(contacts_record_h image) override;
	bool isInEmergencyGroup() override;
	int setCalendarType(contacts_record_h event, int calendarType) override;
	int getCalendarType(contacts_record_h event) override;
	int setIsLeapMonth(contacts_record_h event, bool isLeapMonth) override;
	bool getIsLeapMonth(contacts_record_h event) override;

private:
	void __init();
	contacts_record_h __firstChild(unsigned int property, bool create);
	contacts_record_h __addChild(unsigned int property, const char* childUri);
	contacts_record_h __addTextChild(unsigned int property, const char* childUri, unsigned int textProperty,
		const char* text, unsigned int typeProperty = 0, int type = 0);
	int __removeChild(unsigned int property, contacts_record_h child);
	std::vector<int> __childTypes(unsigned int property, unsigned int typeProperty);
	Eina_List* __childList(unsigned int property, contacts_record_h skipped = nullptr);
	int __setNamePart(unsigned int property, const char* text);
	const char* __getNamePart(unsigned int property);
	contacts_record_h __imageAt(int index);
	contacts_record_h __imageOfOrder(int order);

	contacts_record_h m_profileRecord = nullptr;
	int m_profileId = 0;
	bool m_connected = false;
};

#endif
