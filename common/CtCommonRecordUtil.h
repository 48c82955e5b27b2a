#ifndef _CT_COMMON_RECORD_UTIL_H_
#define _CT_COMMON_RECORD_UTIL_H_

#include <Eina.h>
#include <contacts.h>
#include <utils_i18n.h>

#include <string>

// Record helpers of the contacts common library. All read the contacts
// service; the caller must be connected (contacts_connect).

// The person's contact records (children included), oldest first: a new
// list the caller frees with ctCommonDestroyRecordList. Null when none.
Eina_List* ctCommonGetContactsList(int personId);
// The child records of kind `property` (e.g. _contacts_contact.number) of
// every contact in `contacts`, in contact order. The list is new; the
// records stay owned by their contacts (free the list with eina_list_free).
Eina_List* CtCommonGetChildDataList(Eina_List* contacts, unsigned int property);
// Destroys every record of the list, then the list.
void ctCommonDestroyRecordList(Eina_List* records);
// True when the person's only contact lies in a SIM address book.
bool ctCommonIsSimContact(int personId);

// Company text of the first contact that has one: "name, department"
// parts that are set, joined by ", ". A new string the caller frees; null
// when there is none.
char* CtCommonGetCompany(Eina_List* contacts);
// The extra-name parts of the first contact that has them: the nickname
// (first) and the phonetic name (second). New strings the caller frees, each
// null when absent.
void CtCommonGetExtraName1(Eina_List* contacts, char** first, char** second);
// Copy of `text` with line breaks replaced by blanks; null for null.
// The caller frees it.
char* ctCommonRemoveNewline(const char* text);
// The person as text to share: name, then one line per number, e-mail,
// address, URL and note. A new string the caller frees; null when the
// person cannot be read.
char* CtCommonGetShareText(int personId);

// Date formatters of the current region format ("db/menu_widget/regionformat")
// with and without the year; null on failure. The caller destroys them with
// i18n_udate_destroy.
i18n_udate_h CtCommonGetTimeFormatter();
i18n_udate_h CtCommonGetTimeFormatterWithoutYear();
// The day (year 0: no year) formatted with `formatter`; "" for an
// impossible date or a null formatter.
std::string CtCommonGetDatetimeStr(i18n_udate_h formatter, int year, int month, int day);

// Names of every group of the contacts, in first-seen order without
// repeats, joined by ", "; empty when there are none.
std::string ctCommonGetGroupNames(Eina_List* contacts);

// Type labels: the translated label of a type, or `customLabel` for the
// custom type (and for an unknown type that carries a label). Borrowed
// strings, valid until the language changes or the record changes.
const char* CtCommonGetNumberTypeStr(int type, const char* customLabel);
const char* CtCommonGetEmailTypeStr(int type, const char* customLabel);
const char* CtCommonGetAddressTypeStr(int type, const char* customLabel);
const char* CtCommonGetMessengerTypeStr(int type, const char* customLabel);
const char* CtCommonGetUrlTypeStr(int type, const char* customLabel);
const char* CtCommonGetRelationshipTypeStr(int type, const char* customLabel);
const char* CtCommonGetEventTypeStr(int type, const char* customLabel);
// The same, with the custom label read from the child record (may be null).
const char* CtCommonGetNumberTypeStr(contacts_record_h record, int type);
const char* CtCommonGetEmailTypeStr(contacts_record_h record, int type);
const char* CtCommonGetAddressTypeStr(contacts_record_h record, int type);
const char* CtCommonGetMessengerTypeStr(contacts_record_h record, int type);
const char* CtCommonGetUrlTypeStr(contacts_record_h record, int type);
const char* CtCommonGetRelationshipTypeStr(contacts_record_h record, int type);
const char* CtCommonGetEventTypeStr(contacts_record_h record, int type);

#endif
