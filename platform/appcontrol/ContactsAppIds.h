/* Ids of the applications the contacts screens launch, named by role, and the
 * contacts application's own launch identifiers. */
#ifndef CT_PLATFORM_CONTACTS_APP_IDS_H
#define CT_PLATFORM_CONTACTS_APP_IDS_H

#define CONTACTS_APP_ID "org.velmora.contacts"
#define CONTACTS_LIST_APP_ID "org.velmora.contacts-list"
#define MAPS_APP_ID "org.velmora.maps"
#define GALLERY_APP_ID "org.velmora.gallery"
#define IMAGE_VIEWER_APP_ID "org.velmora.image-viewer"
#define IMAGE_EDITOR_APP_ID "org.velmora.image-editor"
#define RINGTONE_PICKER_APP_ID "org.velmora.ringtone-picker"
#define MESSAGE_COMPOSER_APP_ID "org.velmora.message-composer"
#define FACEBOOK_APP_ID "org.velmora.facebook"
/* The account settings application: lists accounts and adds one
 * ("mode" = "add_account", "capability_filter" = a capability). */
#define ACCOUNT_SETTINGS_APP_ID "settings-accounts"
/* Capability of the accounts that store contacts. */
#define ACCOUNT_SUPPORTS_CAPABILITY_CONTACT "http://velmora.org/accounts/capability/contact"

/* Operation of a video call ("tel:" URI). */
#define VIDEO_CALL_OPERATION "http://velmora.org/appcontrol/operation/vt"

/* Extra key asking the e-mail composer to reply with the result. */
#define RETURN_RESULT_DATA_KEY "http://velmora.org/appcontrol/data/return_result"

#endif
