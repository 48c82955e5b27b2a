/* Contacts service: handles, error codes and enumerations. */
#ifndef CT_PLATFORM_CONTACTS_TYPES_H
#define CT_PLATFORM_CONTACTS_TYPES_H

#include <stdbool.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef struct contacts_record_s *contacts_record_h;
typedef struct contacts_list_s *contacts_list_h;
typedef struct contacts_filter_s *contacts_filter_h;
typedef struct contacts_query_s *contacts_query_h;

typedef enum {
	CONTACTS_ERROR_NONE = 0,
	CONTACTS_ERROR_OUT_OF_MEMORY = -12,
	CONTACTS_ERROR_PERMISSION_DENIED = -13,
	CONTACTS_ERROR_DB_LOCKED = -16,
	CONTACTS_ERROR_INVALID_PARAMETER = -22,
	CONTACTS_ERROR_FILE_NO_SPACE = -28,
	CONTACTS_ERROR_NO_DATA = -61,
	CONTACTS_ERROR_NOT_SUPPORTED = -95,
	CONTACTS_ERROR_DB = -1000,
	CONTACTS_ERROR_SYSTEM = -1001,
	CONTACTS_ERROR_INTERNAL = -1002
} contacts_error_e;

/* Property ids encode their view (bits 16-31) and data type (bits 12-15). */
typedef enum {
	CONTACTS_PROPERTY_TYPE_STR = 1,
	CONTACTS_PROPERTY_TYPE_INT = 2,
	CONTACTS_PROPERTY_TYPE_BOOL = 3,
	CONTACTS_PROPERTY_TYPE_LLI = 4,
	CONTACTS_PROPERTY_TYPE_DOUBLE = 5,
	CONTACTS_PROPERTY_TYPE_RECORD = 6
} contacts_property_type_e;

#define CONTACTS_PROPERTY_TYPE_OF(property_id) (((property_id) >> 12) & 0xF)

typedef enum {
	CONTACTS_MATCH_EXACTLY,    /* equal, case-sensitive */
	CONTACTS_MATCH_FULLSTRING, /* equal, ignoring ASCII case */
	CONTACTS_MATCH_CONTAINS,
	CONTACTS_MATCH_STARTSWITH,
	CONTACTS_MATCH_ENDSWITH,
	CONTACTS_MATCH_EXISTS      /* the text is set (the value is ignored) */
} contacts_match_str_flag_e;

typedef enum {
	CONTACTS_MATCH_EQUAL,
	CONTACTS_MATCH_GREATER_THAN,
	CONTACTS_MATCH_GREATER_THAN_OR_EQUAL,
	CONTACTS_MATCH_LESS_THAN,
	CONTACTS_MATCH_LESS_THAN_OR_EQUAL,
	CONTACTS_MATCH_NOT_EQUAL,
	CONTACTS_MATCH_NONE        /* the value is not set */
} contacts_match_int_flag_e;

typedef enum {
	CONTACTS_FILTER_OPERATOR_AND,
	CONTACTS_FILTER_OPERATOR_OR
} contacts_filter_operator_e;

typedef enum {
	CONTACTS_CHANGE_INSERTED = 0,
	CONTACTS_CHANGE_UPDATED = 1,
	CONTACTS_CHANGE_DELETED = 2
} contacts_changed_e;

typedef enum {
	CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST = 0,
	CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST = 1
} contacts_name_display_order_e;

typedef enum {
	CONTACTS_PERSON_PROPERTY_NAME_CONTACT = 0,
	CONTACTS_PERSON_PROPERTY_NUMBER = 1,
	CONTACTS_PERSON_PROPERTY_EMAIL = 2,
	CONTACTS_PERSON_PROPERTY_IMAGE = 3
} contacts_person_property_e;

typedef enum {
	CONTACTS_DISPLAY_NAME_SOURCE_TYPE_INVALID = 0,
	CONTACTS_DISPLAY_NAME_SOURCE_TYPE_EMAIL = 1,
	CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NUMBER = 2,
	CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NICKNAME = 3,
	CONTACTS_DISPLAY_NAME_SOURCE_TYPE_COMPANY = 4,
	CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NAME = 5
} contacts_display_name_source_type_e;

typedef enum {
	CONTACTS_ADDRESS_BOOK_MODE_NONE = 0,
	CONTACTS_ADDRESS_BOOK_MODE_READONLY = 1
} contacts_address_book_mode_e;

/* Link mode of a contact on insert: IGNORE_ONCE keeps it in a person of its own. */
typedef enum {
	CONTACTS_CONTACT_LINK_MODE_NONE = 0,
	CONTACTS_CONTACT_LINK_MODE_IGNORE_ONCE = 1
} contacts_contact_link_mode_e;

typedef enum {
	CONTACTS_NUMBER_TYPE_OTHER = 0,
	CONTACTS_NUMBER_TYPE_CUSTOM = 1 << 0,
	CONTACTS_NUMBER_TYPE_HOME = 1 << 1,
	CONTACTS_NUMBER_TYPE_WORK = 1 << 2,
	CONTACTS_NUMBER_TYPE_VOICE = 1 << 3,
	CONTACTS_NUMBER_TYPE_FAX = 1 << 4,
	CONTACTS_NUMBER_TYPE_MSG = 1 << 5,
	CONTACTS_NUMBER_TYPE_CELL = 1 << 6,
	CONTACTS_NUMBER_TYPE_PAGER = 1 << 7,
	CONTACTS_NUMBER_TYPE_BBS = 1 << 8,
	CONTACTS_NUMBER_TYPE_MODEM = 1 << 9,
	CONTACTS_NUMBER_TYPE_CAR = 1 << 10,
	CONTACTS_NUMBER_TYPE_ISDN = 1 << 11,
	CONTACTS_NUMBER_TYPE_VIDEO = 1 << 12,
	CONTACTS_NUMBER_TYPE_PCS = 1 << 13,
	CONTACTS_NUMBER_TYPE_COMPANY_MAIN = 1 << 14,
	CONTACTS_NUMBER_TYPE_RADIO = 1 << 15,
	CONTACTS_NUMBER_TYPE_MAIN = 1 << 29,
	CONTACTS_NUMBER_TYPE_ASSISTANT = 1 << 30
} contacts_number_type_e;

typedef enum {
	CONTACTS_EMAIL_TYPE_OTHER = 0,
	CONTACTS_EMAIL_TYPE_CUSTOM = 1 << 0,
	CONTACTS_EMAIL_TYPE_HOME = 1 << 1,
	CONTACTS_EMAIL_TYPE_WORK = 1 << 2,
	CONTACTS_EMAIL_TYPE_MOBILE = 1 << 3
} contacts_email_type_e;

typedef enum {
	CONTACTS_ADDRESS_TYPE_OTHER = 0,
	CONTACTS_ADDRESS_TYPE_CUSTOM = 1 << 0,
	CONTACTS_ADDRESS_TYPE_HOME = 1 << 1,
	CONTACTS_ADDRESS_TYPE_WORK = 1 << 2,
	CONTACTS_ADDRESS_TYPE_DOM = 1 << 3,
	CONTACTS_ADDRESS_TYPE_INTL = 1 << 4,
	CONTACTS_ADDRESS_TYPE_POSTAL = 1 << 5,
	CONTACTS_ADDRESS_TYPE_PARCEL = 1 << 6
} contacts_address_type_e;

typedef enum {
	CONTACTS_MESSENGER_TYPE_OTHER = 0,
	CONTACTS_MESSENGER_TYPE_CUSTOM = 1,
	CONTACTS_MESSENGER_TYPE_GOOGLE = 2,
	CONTACTS_MESSENGER_TYPE_WLM = 3,
	CONTACTS_MESSENGER_TYPE_YAHOO = 4,
	CONTACTS_MESSENGER_TYPE_FACEBOOK = 5,
	CONTACTS_MESSENGER_TYPE_ICQ = 6,
	CONTACTS_MESSENGER_TYPE_AIM = 7,
	CONTACTS_MESSENGER_TYPE_QQ = 8,
	CONTACTS_MESSENGER_TYPE_JABBER = 9,
	CONTACTS_MESSENGER_TYPE_SKYPE = 10,
	CONTACTS_MESSENGER_TYPE_IRC = 11
} contacts_messenger_type_e;

typedef enum {
	CONTACTS_URL_TYPE_OTHER = 0,
	CONTACTS_URL_TYPE_CUSTOM = 1,
	CONTACTS_URL_TYPE_HOME = 2,
	CONTACTS_URL_TYPE_WORK = 3
} contacts_url_type_e;

typedef enum {
	CONTACTS_EVENT_TYPE_OTHER = 0,
	CONTACTS_EVENT_TYPE_CUSTOM = 1,
	CONTACTS_EVENT_TYPE_BIRTH = 2,
	CONTACTS_EVENT_TYPE_ANNIVERSARY = 3
} contacts_event_type_e;

typedef enum {
	CONTACTS_EVENT_CALENDAR_TYPE_GREGORIAN = 0,
	CONTACTS_EVENT_CALENDAR_TYPE_LUNAR = 1
} contacts_event_calendar_type_e;

typedef enum {
	CONTACTS_RELATIONSHIP_TYPE_OTHER = 0,
	CONTACTS_RELATIONSHIP_TYPE_ASSISTANT = 1,
	CONTACTS_RELATIONSHIP_TYPE_BROTHER = 2,
	CONTACTS_RELATIONSHIP_TYPE_CHILD = 3,
	CONTACTS_RELATIONSHIP_TYPE_DOMESTIC_PARTNER = 4,
	CONTACTS_RELATIONSHIP_TYPE_FATHER = 5,
	CONTACTS_RELATIONSHIP_TYPE_FRIEND = 6,
	CONTACTS_RELATIONSHIP_TYPE_MANAGER = 7,
	CONTACTS_RELATIONSHIP_TYPE_MOTHER = 8,
	CONTACTS_RELATIONSHIP_TYPE_PARENT = 9,
	CONTACTS_RELATIONSHIP_TYPE_PARTNER = 10,
	CONTACTS_RELATIONSHIP_TYPE_REFERRED_BY = 11,
	CONTACTS_RELATIONSHIP_TYPE_RELATIVE = 12,
	CONTACTS_RELATIONSHIP_TYPE_SISTER = 13,
	CONTACTS_RELATIONSHIP_TYPE_SPOUSE = 14,
	CONTACTS_RELATIONSHIP_TYPE_CUSTOM = 15
} contacts_relationship_type_e;

typedef enum {
	CONTACTS_IMAGE_TYPE_OTHER = 0,
	CONTACTS_IMAGE_TYPE_CUSTOM = 1
} contacts_image_type_e;

typedef enum {
	CONTACTS_COMPANY_TYPE_OTHER = 0,
	CONTACTS_COMPANY_TYPE_CUSTOM = 1,
	CONTACTS_COMPANY_TYPE_WORK = 2
} contacts_company_type_e;

typedef enum {
	CONTACTS_PLOG_TYPE_NONE = 0,
	CONTACTS_PLOG_TYPE_VOICE_INCOMING = 1,
	CONTACTS_PLOG_TYPE_VOICE_OUTGOING = 2,
	CONTACTS_PLOG_TYPE_VIDEO_INCOMING = 3,
	CONTACTS_PLOG_TYPE_VIDEO_OUTGOING = 4,
	CONTACTS_PLOG_TYPE_VOICE_INCOMING_UNSEEN = 5,
	CONTACTS_PLOG_TYPE_MMS_INCOMING = 101,
	CONTACTS_PLOG_TYPE_MMS_OUTGOING = 102,
	CONTACTS_PLOG_TYPE_SMS_INCOMING = 103,
	CONTACTS_PLOG_TYPE_SMS_OUTGOING = 104,
	CONTACTS_PLOG_TYPE_EMAIL_RECEIVED = 201,
	CONTACTS_PLOG_TYPE_EMAIL_SENT = 202
} contacts_phone_log_type_e;

/* SIM field numbers of contacts_sim_get_field_* (slot 0 is the first SIM). */
typedef enum {
	CONTACTS_SIM_FIELD_NAME = 0,
	CONTACTS_SIM_FIELD_NUMBER = 1,
	CONTACTS_SIM_FIELD_ANR = 2,
	CONTACTS_SIM_FIELD_GROUP = 3,
	CONTACTS_SIM_FIELD_NICKNAME = 4,
	CONTACTS_SIM_FIELD_EMAIL = 5
} contacts_sim_field_e;

/* Kinds of contacts_utils_*_ringtone_info. */
typedef enum {
	CONTACTS_RINGTONE_KIND_PERSON = 0,
	CONTACTS_RINGTONE_KIND_CONTACT = 1,
	CONTACTS_RINGTONE_KIND_GROUP = 2
} contacts_ringtone_kind_e;

/* Address-book naming. An address book has two texts:
 *
 * - its name (_contacts_address_book.name) says what kind of storage it is.
 *   The built-in books are named under CONTACTS_ADDRESS_BOOK_NAME_PREFIX:
 *   ".../addressbook/phone" (book 0, the device), ".../addressbook/sim1" and
 *   ".../addressbook/sim2" (one per SIM slot) and ".../addressbook/sim" (a
 *   SIM without slot). An account's book is named after the account (its
 *   user name, such as "someone@example.com") and never contains
 *   "addressbook/phone" or "addressbook/sim": a contact in such a book is
 *   synced to an account. Names are what preferences store
 *   ("input_base_addressbook"), since they do not change with the language.
 * - its provider name (_contacts_address_book.provider_name) says who
 *   provides it, as lists show it: the account's provider ("Google",
 *   "Exchange", ...), "SIM1", "SIM2" and "SIM" for the SIM books, and
 *   CONTACTS_PHONE_PROVIDER_NAME for the device book, which the common
 *   library shows as the translated "IDS_PB_OPT_DEVICE".
 */
#define CONTACTS_ADDRESS_BOOK_NAME_PREFIX "http://velmora.org/addressbook/"
#define CONTACTS_PHONE_ADDRESS_BOOK_NAME CONTACTS_ADDRESS_BOOK_NAME_PREFIX "phone"
#define CONTACTS_SIM_ADDRESS_BOOK_NAME CONTACTS_ADDRESS_BOOK_NAME_PREFIX "sim"
#define CONTACTS_SIM1_ADDRESS_BOOK_NAME CONTACTS_SIM_ADDRESS_BOOK_NAME "1"
#define CONTACTS_SIM2_ADDRESS_BOOK_NAME CONTACTS_SIM_ADDRESS_BOOK_NAME "2"
#define CONTACTS_PHONE_PROVIDER_NAME "Phone"
#define CONTACTS_SIM_PROVIDER_NAME "SIM"
#define CONTACTS_SIM1_PROVIDER_NAME "SIM1"
#define CONTACTS_SIM2_PROVIDER_NAME "SIM2"

/* Runs on the EFL main loop after a write to `view_uri` committed. */
typedef void (*contacts_db_changed_cb)(const char *view_uri, void *user_data);

#ifdef __cplusplus
}
#endif

#endif
