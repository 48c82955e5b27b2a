// Builds the user's own profile in the contacts service for the my-profile
// data and screen tests.
#pragma once

#include "../detail/DetailTestStore.h"

#include <string>
#include <utility>
#include <vector>

namespace ct::test {

inline contacts_record_h newProfile(const char* firstName)
{
	contacts_record_h profile = nullptr;
	contacts_record_create(_contacts_my_profile._uri, &profile);
	if (firstName) {
		contacts_record_h name = addChild(profile, _contacts_my_profile.name, _contacts_name._uri);
		contacts_record_set_str(name, _contacts_name.first, firstName);
	}
	return profile;
}

inline contacts_record_h addProfileNumber(contacts_record_h profile, const char* number, bool isDefault = false,
	const char* label = nullptr)
{
	contacts_record_h child = addChild(profile, _contacts_my_profile.number, _contacts_number._uri);
	contacts_record_set_str(child, _contacts_number.number, number);
	contacts_record_set_int(child, _contacts_number.type, CONTACTS_NUMBER_TYPE_CELL);
	contacts_record_set_bool(child, _contacts_number.is_default, isDefault);
	if (label)
		contacts_record_set_str(child, _contacts_number.label, label);
	return child;
}

inline void addProfilePictures(contacts_record_h profile, const std::vector<std::pair<std::string, int>>& pictures)
{
	for (const auto& [path, order] : pictures) {
		contacts_record_h image = addChild(profile, _contacts_my_profile.image, _contacts_image._uri);
		contacts_record_set_str(image, _contacts_image.path, path.c_str());
		contacts_record_set_int(image, _contacts_image_ex.order, order);
	}
}

// Stores the profile (and destroys the handle); returns its id.
inline int storeProfile(contacts_record_h profile)
{
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(profile, &id));
	contacts_record_destroy(profile, true);
	return id;
}

inline int profileCount()
{
	contacts_list_h list = nullptr;
	int count = 0;
	if (contacts_db_get_all_records(_contacts_my_profile._uri, 0, 0, &list) == CONTACTS_ERROR_NONE) {
		contacts_list_get_count(list, &count);
		contacts_list_destroy(list, true);
	}
	return count;
}

} // namespace ct::test
