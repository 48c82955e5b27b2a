#include "DemoContactBuilder.h"

#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"

namespace ct::demo {

DemoContactBuilder::DemoContactBuilder(const char* first, const char* last, int addressBookId)
	: m_addressBookId(addressBookId)
	, m_sim(addressBookId > 0 && ctCommonIsSimAddressbook(addressBookId))
{
	contacts_record_create(_contacts_contact._uri, &m_contact);
	contacts_record_set_int(m_contact, _contacts_contact.address_book_id, addressBookId);
	// Demo persons are linked on purpose, never by the service's guess.
	contacts_record_set_int(m_contact, _contacts_contact.link_mode, CONTACTS_CONTACT_LINK_MODE_IGNORE_ONCE);
	contacts_record_h name = __addChild(_contacts_contact.name, _contacts_name._uri);
	contacts_record_set_str(name, _contacts_name.first, first);
	contacts_record_set_str(name, _contacts_name.last, last);
}

DemoContactBuilder::~DemoContactBuilder()
{
	if (m_contact)
		contacts_record_destroy(m_contact, true);
}

contacts_record_h DemoContactBuilder::__addChild(unsigned int property, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(m_contact, property, child);
	return child;
}

DemoContactBuilder& DemoContactBuilder::prefix(const char* text)
{
	contacts_record_h name = nullptr;
	contacts_record_get_child_record_at_p(m_contact, _contacts_contact.name, 0, &name);
	contacts_record_set_str(name, _contacts_name.prefix, text);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::phonetic(const char* first, const char* last)
{
	contacts_record_h name = nullptr;
	contacts_record_get_child_record_at_p(m_contact, _contacts_contact.name, 0, &name);
	contacts_record_set_str(name, _contacts_name.phonetic_first, first);
	contacts_record_set_str(name, _contacts_name.phonetic_last, last);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::nickname(const char* text)
{
	contacts_record_set_str(__addChild(_contacts_contact.nickname, _contacts_nickname._uri),
			_contacts_nickname.name, text);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::number(const char* text, int type, const char* label)
{
	contacts_record_h child = __addChild(_contacts_contact.number, _contacts_number._uri);
	contacts_record_set_str(child, _contacts_number.number, text);
	contacts_record_set_int(child, _contacts_number.type, type);
	if (label)
		contacts_record_set_str(child, _contacts_number.label, label);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::email(const char* text, int type)
{
	contacts_record_h child = __addChild(_contacts_contact.email, _contacts_email._uri);
	contacts_record_set_str(child, _contacts_email.email, text);
	contacts_record_set_int(child, _contacts_email.type, type);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::address(const char* street, const char* locality,
		const char* postalCode, const char* country, int type)
{
	contacts_record_h child = __addChild(_contacts_contact.address, _contacts_address._uri);
	contacts_record_set_str(child, _contacts_address.street, street);
	contacts_record_set_str(child, _contacts_address.locality, locality);
	contacts_record_set_str(child, _contacts_address.postal_code, postalCode);
	contacts_record_set_str(child, _contacts_address.country, country);
	contacts_record_set_int(child, _contacts_address.type, type);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::company(const char* name, const char* jobTitle, const char* department)
{
	contacts_record_h child = __addChild(_contacts_contact.company, _contacts_company._uri);
	contacts_record_set_str(child, _contacts_company.name, name);
	contacts_record_set_str(child, _contacts_company.job_title, jobTitle);
	if (department)
		contacts_record_set_str(child, _contacts_company.department, department);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::note(const char* text)
{
	contacts_record_set_str(__addChild(_contacts_contact.note, _contacts_note._uri), _contacts_note.note, text);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::url(const char* text)
{
	contacts_record_h child = __addChild(_contacts_contact.url, _contacts_url._uri);
	contacts_record_set_str(child, _contacts_url.url, text);
	contacts_record_set_int(child, _contacts_url.type, CONTACTS_URL_TYPE_HOME);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::messenger(const char* imId, int type)
{
	contacts_record_h child = __addChild(_contacts_contact.messenger, _contacts_messenger._uri);
	contacts_record_set_str(child, _contacts_messenger.im_id, imId);
	contacts_record_set_int(child, _contacts_messenger.type, type);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::relationship(const char* name, int type)
{
	contacts_record_h child = __addChild(_contacts_contact.relationship, _contacts_relationship._uri);
	contacts_record_set_str(child, _contacts_relationship.name, name);
	contacts_record_set_int(child, _contacts_relationship.type, type);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::event(int date, int type, bool lunar, bool leapMonth)
{
	contacts_record_h child = __addChild(_contacts_contact.event, _contacts_event._uri);
	contacts_record_set_int(child, _contacts_event.date, date);
	contacts_record_set_int(child, _contacts_event.type, type);
	contacts_record_set_int(child, _contacts_event.calendar_type,
			lunar ? CONTACTS_EVENT_CALENDAR_TYPE_LUNAR : CONTACTS_EVENT_CALENDAR_TYPE_GREGORIAN);
	contacts_record_set_bool(child, _contacts_event.is_leap_month, leapMonth);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::image(const char* path)
{
	contacts_record_h child = __addChild(_contacts_contact.image, _contacts_image._uri);
	contacts_record_set_str(child, _contacts_image.path, path);
	contacts_record_set_bool(child, _contacts_image.is_default, true);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::ringtone(const char* path)
{
	contacts_record_set_str(m_contact, _contacts_contact.ringtone_path, path);
	return *this;
}

DemoContactBuilder& DemoContactBuilder::favourite()
{
	contacts_record_set_bool(m_contact, _contacts_contact.is_favorite, true);
	return *this;
}

int DemoContactBuilder::store() const
{
	int id = 0;
	int err = m_sim ? contacts_sim_insert(m_contact, &id) : contacts_db_insert_record(m_contact, &id);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED(m_sim ? "contacts_sim_insert" : "contacts_db_insert_record", err);
		return err < 0 ? err : -1;
	}
	return id;
}

} // namespace ct::demo
