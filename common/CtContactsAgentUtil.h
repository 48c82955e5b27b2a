#ifndef _CT_CONTACTS_AGENT_UTIL_H_
#define _CT_CONTACTS_AGENT_UTIL_H_

// The profile-sharing settings as stored in the application preferences.
class CtContactsAgentUtil {
public:
	// Number of person ids in the stored share-with list; *out gets a
	// malloc'ed array the caller frees (null when the list is empty).
	static int getPreferenceSelectedContactsList(int** out);
	// Stores the share-with list; false when the preference could not be written.
	static bool setPreferenceSelectedContactsList(const int* personIds, int count);
	// 0 personal, 1 business.
	static int getPreferenceProfileType();
	// 1 all contacts, 2 favourites, 3 selected contacts.
	static int getPreferenceProfilePrivacyLevel();
};

#endif
