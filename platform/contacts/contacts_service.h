/* Persons, groups, SIM cards, settings, utilities and vCards. */
#ifndef CT_PLATFORM_CONTACTS_SERVICE_H
#define CT_PLATFORM_CONTACTS_SERVICE_H

#include "contacts_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/* Moves every contact of person_id into base_person_id; person_id goes. */
int contacts_person_link_person(int base_person_id, int person_id);
/* Moves one contact of the person into a new person, whose id goes to
 * *unlinked_person_id (may be NULL). The last contact cannot be unlinked. */
int contacts_person_unlink_contact(int person_id, int contact_id, int *unlinked_person_id);
/* The default contact (NAME_CONTACT), number, e-mail or image id of the person. */
int contacts_person_get_default_property(contacts_person_property_e property, int person_id, int *id);
/* Makes a record of one of the person's contacts the default; INVALID_PARAMETER
 * when the id does not belong to the person. */
int contacts_person_set_default_property(contacts_person_property_e property, int person_id, int id);

int contacts_group_add_contact(int group_id, int contact_id);
int contacts_group_remove_contact(int group_id, int contact_id);

/* SIM cards. sim_slot_no 0 is the first SIM. Capacity and field limits come
 * from "sim.conf" in the data folder; a SIM whose vconf power key
 * ("db/telephony/sim_power_stateN") is 0 is not ready. */
int contacts_sim_is_ready(int sim_slot_no, bool *is_ready);
int contacts_sim_get_field_text_max_len(int sim_slot_no, contacts_sim_field_e field, int *max_len);
int contacts_sim_get_unused_field_count(int sim_slot_no, contacts_sim_field_e field, int *count);
int contacts_sim_get_field_status(int sim_slot_no, contacts_sim_field_e field, bool *supported);
/* Stores a contact record whose address_book_id is a SIM slot's book: first
 * name, first number, first e-mail. Texts longer than the SIM
 * takes: INVALID_PARAMETER; SIM full: FILE_NO_SPACE; not ready: NOT_SUPPORTED. */
int contacts_sim_insert(contacts_record_h contact, int *contact_id);
int contacts_sim_update(contacts_record_h contact);
/* Deletes the person's SIM contacts (and the person). */
int contacts_sim_delete(int person_id);

/* Ringtone kept for a person, contact or group: path, a flag and a start
 * position. get: *path is a copy the caller frees (NULL when none stored). */
int contacts_utils_get_ringtone_info(int kind, int id, char **path, int *flag, long long int *position);
int contacts_utils_set_ringtone_info(int kind, int id, const char *path, int flag, long long int position);
/* Finds needle in haystack ignoring case (Unicode case folding). Returns the
 * byte offset of the match in haystack and its byte length in *len, or -1
 * (and *len 0) when there is none or an argument is invalid. */
int contacts_utils_strstr(const char *haystack, const char *needle, int *len);

int contacts_setting_get_name_display_order(contacts_name_display_order_e *name_display_order);
int contacts_setting_set_name_display_order(contacts_name_display_order_e name_display_order);

/* vCard 3.0 text (UTF-8, CRLF, lines folded at 75 bytes) that the caller
 * frees, with every stored field: names and phonetic names, nicknames,
 * numbers, e-mails, addresses and web sites (types, custom labels), companies,
 * messengers, relationships, events, notes, groups, social-network profiles,
 * the profile status and the pictures (embedded, up to 1 MB each). A
 * person's card merges its contacts and prefers the person's default number
 * and e-mail. Cards are read back by
 * ContactsVcardImport (ContactsVcardImport.h, and contacts-ctl vcard import). */
int contacts_vcard_make_from_person(contacts_record_h person, char **vcard_stream);
int contacts_vcard_make_from_contact(contacts_record_h contact, char **vcard_stream);
int contacts_vcard_make_from_my_profile(contacts_record_h my_profile, char **vcard_stream);

#ifdef __cplusplus
}
#endif

#endif
