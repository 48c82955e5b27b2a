#ifndef _CT_COMMON_ADDRESSBOOK_UTIL_H_
#define _CT_COMMON_ADDRESSBOOK_UTIL_H_

#include <Eina.h>
#include <contacts.h>

#include <string>

// Address-book (storage) helpers of the contacts common library. All read
// the contacts service; the caller must be connected (contacts_connect).

// Book names and provider names follow the contacts service's convention
// (contacts_types.h). Name of the slotless SIM address book; the per-slot
// books add the slot number ("1", "2").
#define SIM_ADDRESSBOOK_NAME CONTACTS_SIM_ADDRESS_BOOK_NAME
#define PHONE_ADDRESSBOOK_NAME CONTACTS_PHONE_ADDRESS_BOOK_NAME
// Address-book mode of the social (Facebook) accounts.
#define CT_ADDRESSBOOK_MODE_SOCIAL 101

// True when the address book is one of the SIM books.
bool ctCommonIsSimAddressbook(int addressbookId);
// True when a book of that name belongs to an account (the device and SIM
// books do not): its contacts are synced. False for null.
bool ctCommonIsAccountAddressbookName(const char* addressbookName);
// Id of the address book with that name; -1 when there is none.
int ctCommonGetAddressBookId(const char* addressbookName);
// Name of the address book as a new string the caller frees; null when
// there is no such book.
char* ctCommonGetAddressBookName(int addressbookId);
// Provider and user name of the address book as new strings the caller
// frees (each null when absent); the device book's provider name is the
// translated "IDS_PB_OPT_DEVICE". Returns 0 or a negative contacts error.
int ctCommonGetProviderNameByAddressbookId(int addressbookId, char** providerName, char** userName);
// The two texts that name an account in lists: first the provider text
// ("IDS_PB_OPT_DEVICE" for the phone, "IDS_PB_OPT_SIM_CARD" for SIM books,
// else the provider name), second the user name (may be null). New strings
// the caller frees. Returns 0 or a negative contacts error.
int ctCommonGetAccountInforByAddressbookId(int addressbookId, char** firstText, char** secondText);
// Full path of the icon of the address book's account; empty when unknown.
std::string ctCommonGetAccountIconPathByAddressbookId(int addressbookId);
// The person's contacts whose address book is writable (mode bit 0 clear),
// at most `maxCount` of them (0: all): a new Eina_List of contact records
// that the caller frees with ctCommonDestroyRecordList. Null when none.
Eina_List* ctCommonGetWritableContactList(int personId, int maxCount);
// The shown name of a group with a system id ("coworkers" ->
// the translated "IDS_PB_BODY_CO_WORKERS", ...); the system id itself when
// it is not one of the known ones, empty for null.
std::string ctCommonGetDisplayGroupName(const char* systemId);
// Id of the default group of an Exchange (EAS) address book: its group with
// the system id "contacts"; 0 when there is none.
int ctCommonGetEasDefaultGroupId(int addressbookId);

#endif
