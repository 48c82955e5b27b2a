#ifndef _CT_DATA_TEXT_RULES_H_
#define _CT_DATA_TEXT_RULES_H_

#include <contacts.h>

// How the editable contacts turn typed texts into record fields and back;
// shared by every CtData so that a contact and the profile split names and
// join addresses alike. Texts longer than 1023 bytes are cut at a character.
namespace CtDataTextRules {

// "first [middle] last[, suffix]": the last word is the last name, the one
// before it the middle name, the rest the first name; the prefix is cleared.
int separateFullName(contacts_record_h nameRecord, const char* fullName);
// "first [middle] last": phonetic parts, split at blanks.
int separatePhoneticFullName(contacts_record_h nameRecord, const char* fullName);
// The whole address text goes into the region; the other parts are cleared.
int setAddressText(contacts_record_h address, const char* text);
// The set address parts, one per line, into `buffer` (always terminated).
int getAddressText(contacts_record_h address, char* buffer, unsigned int size);

} // namespace CtDataTextRules

#endif
