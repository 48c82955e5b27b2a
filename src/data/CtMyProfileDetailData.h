#ifndef _CT_MY_PROFILE_DETAIL_DATA_H_
#define _CT_MY_PROFILE_DETAIL_DATA_H_

#include "CtDetailDataBase.h"
#include "ICtChangeListener.h"

#include <memory>

class CtDbChangeSubscription;

// The user's own profile as the detail screens show it: a private copy of
// the one my-profile record of the contacts service and of its children,
// reloaded whole when the profile changes while a listener is attached.
// Without a stored profile every getter answers null, 0 or an empty list.
// Pointers handed out stay valid until the next reload. Main loop only.
class CtMyProfileDetailData : public CtDetailDataBase {
public:
	CtMyProfileDetailData();
	~CtMyProfileDetailData() override;
	CtMyProfileDetailData(const CtMyProfileDetailData&) = delete;
	CtMyProfileDetailData& operator=(const CtMyProfileDetailData&) = delete;

	// The one listener told after each reload; null is refused (logged).
	void attachListener(ICtChangeListener* listener);
	void detachListener();
	// The profile record (owned here); null when none is stored.
	contacts_record_h getPersonRecord() { return m_profileRecord; }
	// The profile's own number (owned here); null when none.
	contacts_record_h getDefaultNumberRecord() { return m_defaultNumber; }
	// The profile as vCard text, newly allocated (the caller frees); null on failure.
	char* getVcardStream();

public: // CtDetailDataBase
	void init() override;
	void deInit() override;
	int getPersonId() override;
	int getDefaultImageId() override { return 0; }
	int getNameContactId() override { return 0; }
	Eina_List* getContactsList() override { return nullptr; }
	void setFavorite(bool) override {}
	void setRingtone(const char*) override {}
	const char* getImageThumbnailPath() override { return m_thumbnailPath; }
	// A new string the caller frees, like every CtDetailDataBase.
	char* getImagePath(int order) override;
	const char* getDisplayName() override { return m_displayName; }
	const char* getExtraName2() override { return m_extraName2; }
	const char* getExtraName1Second() override { return m_phoneticName; }
	const char* getExtraName1First() override { return m_nickname; }
	const char* getCompany() override { return m_company; }
	const char* getRingtonePath() override { return nullptr; }
	const char* getMessageAlert() override { return nullptr; }
	const char* getVibration() override { return nullptr; }
	const char* getStatus() override { return m_status; }
	bool isFavorite() override { return false; }
	int getDataType(contacts_record_h record, int property) override;
	Eina_List* getNumberList() override { return m_numberList; }
	const char* getNumber(contacts_record_h record) override;
	Eina_List* getEmailList() override { return m_emailList; }
	const char* getEmail(contacts_record_h record) override;
	Eina_List* getAddressList() override { return m_addressList; }
	void getAddress(contacts_record_h record, char* buf, int size) override;
	const char* getDataTypeCustom(contacts_record_h record, int property) override;
	Eina_List* getMessengerList() override { return m_messengerList; }
	const char* getMessenger(contacts_record_h record) override;
	Eina_List* getUrlList() override { return m_urlList; }
	const char* getUrl(contacts_record_h record) override;
	Eina_List* getRelationshipList() override { return m_relationshipList; }
	const char* getRelationship(contacts_record_h record) override;
	Eina_List* getEventList() override { return m_eventList; }
	int getEvent(contacts_record_h record) override;
	Eina_List* getNoteList() override { return m_noteList; }
	const char* getNote(contacts_record_h record) override;
	// Made at first use: most profiles have no event to format.
	i18n_udate_h getTimeFormatter() override;
	i18n_udate_h getTimeFormatterWithoutYear() override { return nullptr; }
	bool getReadOnlyMode() override { return false; }
	Eina_List* getNameList() override { return nullptr; }
	Eina_List* getImageList() override { return nullptr; }
	std::string getGroupNames() override { return std::string(); }
	int getCalendarType(contacts_record_h record) override;
	bool getIsLeapMonth(contacts_record_h record) override;

private:
	static void __onPersonChanged(const char* viewUri, void* userData);
	void __loadProfileRecord();
	void __getBasicInfo();
	void __getCompany();
	void __getExtraName1();
	void __getStatus();
	void __getDefaultNumber();
	void __getChildNumberList();
	Eina_List* __getChildDataList(unsigned int property);

	int m_profileId = 0;
	contacts_record_h m_profileRecord = nullptr;
	contacts_record_h m_defaultNumber = nullptr;
	char* m_thumbnailPath = nullptr;
	char* m_displayName = nullptr;
	char* m_extraName2 = nullptr;
	char* m_phoneticName = nullptr;
	char* m_nickname = nullptr;
	char* m_company = nullptr;
	char* m_status = nullptr;
	Eina_List* m_numberList = nullptr;
	Eina_List* m_emailList = nullptr;
	Eina_List* m_addressList = nullptr;
	Eina_List* m_messengerList = nullptr;
	Eina_List* m_urlList = nullptr;
	Eina_List* m_relationshipList = nullptr;
	Eina_List* m_eventList = nullptr;
	Eina_List* m_noteList = nullptr;
	i18n_udate_h m_timeFormatter = nullptr;
	ICtChangeListener* m_listener = nullptr;
	bool m_connected = false;
	std::unique_ptr<CtDbChangeSubscription> m_subscription;
};

#endif
