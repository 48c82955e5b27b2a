#include "DemoProfile.h"

#include "ContactsDebug.h"

#include <contacts.h>

namespace ct::demo {

namespace {

contacts_record_h addChild(contacts_record_h profile, unsigned int property, const char* uri)
{
	contacts_record_h child = nullptr;
	if (contacts_record_create(uri, &child) != CONTACTS_ERROR_NONE)
		return nullptr;
	contacts_record_add_child_record(profile, property, child);
	return child;
}

void addText(contacts_record_h profile, unsigned int list, const char* uri, unsigned int property, const char* text)
{
	if (contacts_record_h child = addChild(profile, list, uri))
		contacts_record_set_str(child, property, text);
}

void addNumber(contacts_record_h profile, const char* number, int type, bool isOwn)
{
	contacts_record_h child = addChild(profile, _contacts_my_profile.number, _contacts_number._uri);
	if (!child)
		return;
	contacts_record_set_str(child, _contacts_number.number, number);
	contacts_record_set_int(child, _contacts_number.type, type);
	contacts_record_set_bool(child, _contacts_number.is_default, isOwn);
}

bool hasProfile()
{
	int count = 0;
	return contacts_db_get_count(_contacts_my_profile._uri, &count) == CONTACTS_ERROR_NONE && count > 0;
}

} // namespace

int DemoProfile::ensure(const std::vector<std::string>& pictures)
{
	if (hasProfile())
		return CONTACTS_ERROR_NONE;
	contacts_record_h profile = nullptr;
	int err = contacts_record_create(_contacts_my_profile._uri, &profile);
	WPRET_VM(err != CONTACTS_ERROR_NONE, err, "contacts_record_create() Failed(%d)", err);
	if (contacts_record_h name = addChild(profile, _contacts_my_profile.name, _contacts_name._uri)) {
		contacts_record_set_str(name, _contacts_name.first, "Alex");
		contacts_record_set_str(name, _contacts_name.last, "Morgan");
	}
	contacts_record_set_str(profile, _contacts_my_profile_ex.status, "Out hiking until Monday");
	if (!pictures.empty() && !pictures.front().empty()) {
		contacts_record_h image = addChild(profile, _contacts_my_profile.image, _contacts_image._uri);
		contacts_record_set_str(image, _contacts_image.path, pictures.front().c_str());
		contacts_record_set_int(image, _contacts_image_ex.order, 1);
	}
	addNumber(profile, "+44 7700 900777", CONTACTS_NUMBER_TYPE_CELL, true);
	addNumber(profile, "+44 20 7946 0777", CONTACTS_NUMBER_TYPE_WORK, false);
	if (contacts_record_h email = addChild(profile, _contacts_my_profile.email, _contacts_email._uri)) {
		contacts_record_set_str(email, _contacts_email.email, "alex.morgan@example.com");
		contacts_record_set_int(email, _contacts_email.type, CONTACTS_EMAIL_TYPE_HOME);
	}
	addText(profile, _contacts_my_profile.address, _contacts_address._uri, _contacts_address.street, "12 Harbour Road");
	if (contacts_record_h event = addChild(profile, _contacts_my_profile.event, _contacts_event._uri)) {
		contacts_record_set_int(event, _contacts_event.date, 19880704);
		contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	}
	addText(profile, _contacts_my_profile.url, _contacts_url._uri, _contacts_url.url, "alexmorgan.example.org");
	int id = 0;
	err = contacts_db_insert_record(profile, &id);
	contacts_record_destroy(profile, true);
	WPRET_VM(err != CONTACTS_ERROR_NONE, err, "contacts_db_insert_record() Failed(%d)", err);
	return CONTACTS_ERROR_NONE;
}

} // namespace ct::demo
