#ifndef _CT_PROFILE_SETTING_KEYS_H_
#define _CT_PROFILE_SETTING_KEYS_H_

// Preference keys of the profile-sharing agent.
#define CT_PREF_PROFILE_SHARING_STATUS "profile_sharing_status"
#define CT_PREF_PROFILE_TYPE "profile_sharing_type"
#define CT_PREF_PROFILE_PRIVACY_LEVEL "profile_sharing_privacy_level"
#define CT_PREF_PROFILE_PROPERTY_PREFIX "profile_sharing_property_"
#define CT_PREF_PROFILE_SHARE_WITH_LIST "profile_sharing_permitted_list"
#define CT_PREF_SELECTED_CONTACTS_SET "my_profile_sharing_selected_contacts_set"
#define CT_PREF_EASY_SIGNUP_STATUS "easy_signup_status"
#define CT_PREF_EASY_SIGNUP_ADDRESSBOOK "easy_signup_addressbook_id"

#endif
