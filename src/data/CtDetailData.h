#ifndef _CT_DETAIL_DATA_H_
#define _CT_DETAIL_DATA_H_

#include "CtDetailDataBase.h"
#include "CtGalSearchData.h"
#include "ICtChangeListener.h"

#include <memory>

class CtDbChangeSubscription;

// One person as the detail screens show it: the person record, its linked
// contacts and their child records, kept current by the contacts service's
// change callbacks. Also built, with nothing stored, from a GAL search
// result. Main loop only.
class CtDetailData : public CtDetailDataBase {
public:
	// Person id below 1, or of a deleted person: an object without a person
	// whose getters answer null, 0 and empty lists.
	explicit CtDetailData(int personId);
	// `galData` is owned by the caller and must outlive the object.
	explicit CtDetailData(const CtGalSearchData* galData);
	virtual ~CtDetailData();
	CtDetailData(const CtDetailData&) = delete;
	CtDetailData& operator=(const CtDetailData&) = delete;

	// The one listener told when the shown person changed; null is refused.
	void attachListener(ICtChangeListener* listener);
	void detachListener();
	bool isSimContact();
	// True when every linked contact lies in a social (mode 101) address book.
	bool getFacebookMode();
	// Clones of the linked contacts outside social address books: a new list
	// the caller frees with ctCommonDestroyRecordList.
	Eina_List* getContactsWithoutFacebook();
	bool isCurrentPersonValid();
	// The person as vCard text, newly allocated (the caller frees); null on failure.
	char* getVcardStream();
	contacts_record_h getPersonRecord() { return m_personRecord; }

public: // CtDetailDataBase
	void init() override;
	void deInit() override;
	int getPersonId() override { return m_personId; }
	int getDefaultImageId() override { return m_defaultImageId; }
	int getNameContactId() override { return m_nameContactId; }
	Eina_List* getContactsList() override { return m_contactsList; }
	void setFavorite(bool isFavorite) override;
	void setRingtone(const char* path) override;
	const char* getImageThumbnailPath() override { return m_thumbnailPath; }
	char* getImagePath(int order) override;
	const char* getDisplayName() override { return m_displayName; }
	const char* getExtraName2() override { return m_extraName2; }
	const char* getExtraName1Second() override { return m_extraName1Second; }
	const char* getExtraName1First() override { return m_extraName1First; }
	const char* getCompany() override { return m_company; }
	const char* getRingtonePath() override { return m_ringtonePath; }
	const char* getMessageAlert() override { return m_messageAlert; }
	const char* getVibration() override { return m_vibration; }
	const char* getStatus() override { return m_status; }
	bool isFavorite() override { return m_isFavorite; }
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
	// Made at first use: most persons have no event to format.
	i18n_udate_h getTimeFormatter() override;
	i18n_udate_h getTimeFormatterWithoutYear() override;
	bool getReadOnlyMode() override;
	Eina_List* getNameList() override { return m_nameList; }
	Eina_List* getImageList() override { return m_imageList; }
	std::string getGroupNames() override { return m_groupNames; }
	int getCalendarType(contacts_record_h record) override;
	bool getIsLeapMonth(contacts_record_h record) override;

private:
	static void __onDbChangedCb(const char* viewUri, void* data);
	void __clear();
	void __connect();
	void __subscribe();
	void __loadBasicInfo();
	void __checkRingtoneFile();
	void __loadExtraNames();
	void __loadChildLists();
	void __loadDefaultIds(int* defaultImageId, int* nameContactId);
	void __loadGroupNames();
	void __loadGal(const CtGalSearchData* galData);
	void __addGalNumber(const char* number, int type);
	void __addGalEmail(const char* email);
	bool __isPersonChanged();
	bool __hasContactChangedSinceVersion();
	bool __isPersonContact(int contactId);
	bool __addressbooksAllMatch(bool (*test)(int mode));
	void __freeTexts();

	int m_version = 0;
	int m_personId = 0;
	int m_nameContactId = 0;
	int m_defaultImageId = 0;
	contacts_record_h m_personRecord = nullptr;
	int m_changeMarker = 0;
	char* m_thumbnailPath = nullptr;
	char* m_displayName = nullptr;
	char* m_extraName2 = nullptr;
	char* m_extraName1Second = nullptr;
	char* m_extraName1First = nullptr;
	char* m_company = nullptr;
	char* m_ringtonePath = nullptr;
	char* m_messageAlert = nullptr;
	char* m_vibration = nullptr;
	char* m_status = nullptr;
	bool m_isFavorite = false;
	Eina_List* m_contactsList = nullptr;
	Eina_List* m_numberList = nullptr;
	Eina_List* m_emailList = nullptr;
	Eina_List* m_addressList = nullptr;
	Eina_List* m_messengerList = nullptr;
	Eina_List* m_urlList = nullptr;
	Eina_List* m_relationshipList = nullptr;
	Eina_List* m_eventList = nullptr;
	Eina_List* m_noteList = nullptr;
	Eina_List* m_nameList = nullptr;
	Eina_List* m_imageList = nullptr;
	i18n_udate_h m_timeFormatter = nullptr;
	i18n_udate_h m_timeFormatterWithoutYear = nullptr;
	ICtChangeListener* m_listener = nullptr;
	const CtGalSearchData* m_galData = nullptr;
	std::string m_groupNames;

	bool m_connected = false;
	std::unique_ptr<CtDbChangeSubscription> m_personSubscription;
	std::unique_ptr<CtDbChangeSubscription> m_phoneLogSubscription;
};

#endif
