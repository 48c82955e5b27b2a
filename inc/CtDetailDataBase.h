#ifndef _CT_DETAIL_DATA_BASE_H_
#define _CT_DETAIL_DATA_BASE_H_

#include <Eina.h>
#include <contacts.h>
#include <utils_i18n.h>

#include <string>

// Read interface over one person (or the user's own profile) as the detail
// screens show it. Lists are Eina_List* of contacts_record_h owned by the
// data object; texts are borrowed unless said otherwise.
class CtDetailDataBase {
public:
	virtual ~CtDetailDataBase() {}

	// Connects to the contacts service and loads everything.
	virtual void init() = 0;
	// Unsubscribes, frees all lists and texts, disconnects.
	virtual void deInit() = 0;

	virtual int getPersonId() = 0;
	virtual int getDefaultImageId() = 0;
	virtual int getNameContactId() = 0;
	virtual Eina_List* getContactsList() = 0;
	virtual void setFavorite(bool isFavorite) = 0;
	virtual void setRingtone(const char* path) = 0;
	virtual const char* getImageThumbnailPath() = 0;
	// Path of the image with that order (1 to 5): a new string the caller
	// frees, null if there is none or the order is out of range.
	virtual char* getImagePath(int order) = 0;
	virtual const char* getDisplayName() = 0;
	virtual const char* getExtraName2() = 0;
	virtual const char* getExtraName1Second() = 0;
	virtual const char* getExtraName1First() = 0;
	virtual const char* getCompany() = 0;
	virtual const char* getRingtonePath() = 0;
	virtual const char* getMessageAlert() = 0;
	virtual const char* getVibration() = 0;
	virtual const char* getStatus() = 0;
	virtual bool isFavorite() = 0;
	virtual int getDataType(contacts_record_h record, int property) = 0;
	virtual Eina_List* getNumberList() = 0;
	virtual const char* getNumber(contacts_record_h record) = 0;
	virtual Eina_List* getEmailList() = 0;
	virtual const char* getEmail(contacts_record_h record) = 0;
	virtual Eina_List* getAddressList() = 0;
	// Writes the full address text into `buf` (at most `size` bytes with the end).
	virtual void getAddress(contacts_record_h record, char* buf, int size) = 0;
	virtual const char* getDataTypeCustom(contacts_record_h record, int property) = 0;
	virtual Eina_List* getMessengerList() = 0;
	virtual const char* getMessenger(contacts_record_h record) = 0;
	virtual Eina_List* getUrlList() = 0;
	virtual const char* getUrl(contacts_record_h record) = 0;
	virtual Eina_List* getRelationshipList() = 0;
	virtual const char* getRelationship(contacts_record_h record) = 0;
	virtual Eina_List* getEventList() = 0;
	// YYYYMMDD (year 0: no year).
	virtual int getEvent(contacts_record_h record) = 0;
	virtual Eina_List* getNoteList() = 0;
	virtual const char* getNote(contacts_record_h record) = 0;
	virtual i18n_udate_h getTimeFormatter() = 0;
	virtual i18n_udate_h getTimeFormatterWithoutYear() = 0;
	virtual bool getReadOnlyMode() = 0;
	virtual Eina_List* getNameList() = 0;
	virtual Eina_List* getImageList() = 0;
	virtual std::string getGroupNames() = 0;
	virtual int getCalendarType(contacts_record_h record) = 0;
	virtual bool getIsLeapMonth(contacts_record_h record) = 0;
};

#endif
