// A contact with every kind of field the store keeps, and a description of
// a stored record that compares two contacts field by field.
#pragma once

#include "../contacts_db/ContactsTestSupport.h"
#include "ContactsRecord.h"

#include <glib.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <set>
#include <sstream>

namespace ct::test {

inline std::string fileBytes(const std::string& path)
{
	std::ifstream in(path, std::ios::binary);
	return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

inline std::string sha1(const std::string& bytes)
{
	gchar* sum = g_compute_checksum_for_data(G_CHECKSUM_SHA1, reinterpret_cast<const guchar*>(bytes.data()), bytes.size());
	std::string out = sum;
	g_free(sum);
	return out;
}

// A small file that starts like a picture of the format.
inline std::string writePicture(const TempDataDir& dir, const std::string& name, const std::string& magic, size_t size)
{
	std::string bytes = magic;
	for (size_t i = bytes.size(); i < size; ++i)
		bytes += static_cast<char>((i * 7919) % 251);
	std::string path = dir.file(name);
	std::ofstream(path, std::ios::binary) << bytes;
	return path;
}

inline const std::string kPng = "\x89PNG\r\n\x1A\n";
inline const std::string kJpeg = "\xFF\xD8\xFF\xE0";

inline void setStr(contacts_record_h r, unsigned prop, const char* value) { contacts_record_set_str(r, prop, value); }

struct RichContact {
	std::string picture1, picture2, logo;
	std::vector<int> groupIds;
};

inline int addGroup(const char* name, int book = 0)
{
	RecordPtr group = newRecord(_contacts_group._uri);
	contacts_record_set_int(group.get(), _contacts_group.address_book_id, book);
	setStr(group.get(), _contacts_group.name, name);
	return insertRecord(group.get());
}

inline void setAll(contacts_record_h r, std::initializer_list<std::pair<unsigned, const char*>> values)
{
	for (const auto& [prop, value] : values)
		setStr(r, prop, value);
}

// A contact or profile record being filled: the child list of either view.
struct RichTarget {
	contacts_record_h record;
	bool isContact;
	contacts_record_h add(unsigned contactList, unsigned profileList, const char* uri, unsigned typeProp = 0, int type = 0) const
	{
		contacts_record_h child = addChild(record, isContact ? contactList : profileList, uri);
		if (typeProp)
			contacts_record_set_int(child, typeProp, type);
		return child;
	}
};

inline void fillNameNumbersAndEmails(const RichTarget& t)
{
	setAll(t.add(_contacts_contact.name, _contacts_my_profile.name, _contacts_name._uri),
		{ { _contacts_name.first, "Ánna" }, { _contacts_name.last, "O'Neil; Jr" }, { _contacts_name.addition, "Maria" },
			{ _contacts_name.prefix, "Dr." }, { _contacts_name.suffix, "PhD" }, { _contacts_name.phonetic_first, "Ana" },
			{ _contacts_name.phonetic_middle, "Mari" }, { _contacts_name.phonetic_last, "Oneel" } });
	struct { int type; const char* label; const char* number; } numbers[] = {
		{ CONTACTS_NUMBER_TYPE_CELL, nullptr, "+1 555 0100" },
		{ CONTACTS_NUMBER_TYPE_HOME | CONTACTS_NUMBER_TYPE_VOICE, nullptr, "+1 555 0101" },
		{ CONTACTS_NUMBER_TYPE_WORK | CONTACTS_NUMBER_TYPE_FAX, nullptr, "+1 555 0102" },
		{ CONTACTS_NUMBER_TYPE_CUSTOM, "Boat; deck", "+1 555 0103" },
		{ CONTACTS_NUMBER_TYPE_ASSISTANT, nullptr, "+1 555 0104" },
		{ CONTACTS_NUMBER_TYPE_COMPANY_MAIN, nullptr, "+1 555 0105" }, { CONTACTS_NUMBER_TYPE_OTHER, nullptr, "*31#" } };
	for (const auto& n : numbers) {
		contacts_record_h r = t.add(_contacts_contact.number, _contacts_my_profile.number, _contacts_number._uri,
			_contacts_number.type, n.type);
		setAll(r, { { _contacts_number.number, n.number }, { _contacts_number.label, n.label } });
		contacts_record_set_bool(r, _contacts_number.is_default, n.type == CONTACTS_NUMBER_TYPE_CELL);
	}
	struct { int type; const char* label; const char* email; } emails[] = {
		{ CONTACTS_EMAIL_TYPE_HOME, nullptr, "anna@home.example" }, { CONTACTS_EMAIL_TYPE_CUSTOM, "Club", "anna@club.example" },
		{ CONTACTS_EMAIL_TYPE_MOBILE, nullptr, "anna@mobile.example" }, { CONTACTS_EMAIL_TYPE_WORK, nullptr, "anna@work.example" } };
	for (const auto& m : emails) {
		contacts_record_h r = t.add(_contacts_contact.email, _contacts_my_profile.email, _contacts_email._uri,
			_contacts_email.type, m.type);
		setAll(r, { { _contacts_email.email, m.email }, { _contacts_email.label, m.label } });
		contacts_record_set_bool(r, _contacts_email.is_default, m.type == CONTACTS_EMAIL_TYPE_HOME);
	}
}

inline void fillAddressesAndOnlineIds(const RichTarget& t)
{
	contacts_record_h home = t.add(_contacts_contact.address, _contacts_my_profile.address, _contacts_address._uri,
		_contacts_address.type, CONTACTS_ADDRESS_TYPE_HOME);
	setAll(home, { { _contacts_address.postbox, "PO 7" }, { _contacts_address.extended, "Flat 2" },
		{ _contacts_address.street, "1 Main St, Rear\nBuilding B" }, { _contacts_address.locality, "Springfield" },
		{ _contacts_address.region, "IL" }, { _contacts_address.postal_code, "62701" }, { _contacts_address.country, "USA" } });
	contacts_record_set_bool(home, _contacts_address.is_default, true);
	setAll(t.add(_contacts_contact.address, _contacts_my_profile.address, _contacts_address._uri, _contacts_address.type,
			   CONTACTS_ADDRESS_TYPE_CUSTOM),
		{ { _contacts_address.label, "Cabin" }, { _contacts_address.locality, "Lakeside" } });
	for (int type = CONTACTS_MESSENGER_TYPE_OTHER; type <= CONTACTS_MESSENGER_TYPE_IRC; ++type)
		setAll(t.add(_contacts_contact.messenger, _contacts_my_profile.messenger, _contacts_messenger._uri,
				   _contacts_messenger.type, type),
			{ { _contacts_messenger.im_id, ("anna" + std::to_string(type) + "@im.example").c_str() },
				{ _contacts_messenger.label, type == CONTACTS_MESSENGER_TYPE_CUSTOM ? "Signal" : nullptr } });
	for (int type = CONTACTS_URL_TYPE_OTHER; type <= CONTACTS_URL_TYPE_WORK; ++type)
		setAll(t.add(_contacts_contact.url, _contacts_my_profile.url, _contacts_url._uri, _contacts_url.type, type),
			{ { _contacts_url.url, ("https://example.org/" + std::to_string(type) + "?a=1,b=2").c_str() },
				{ _contacts_url.label, type == CONTACTS_URL_TYPE_CUSTOM ? "Blog" : nullptr } });
	for (int type = CONTACTS_RELATIONSHIP_TYPE_OTHER; type <= CONTACTS_RELATIONSHIP_TYPE_CUSTOM; ++type)
		setAll(t.add(_contacts_contact.relationship, _contacts_my_profile.relationship, _contacts_relationship._uri,
				   _contacts_relationship.type, type),
			{ { _contacts_relationship.name, ("Person " + std::to_string(type)).c_str() },
				{ _contacts_relationship.label, type == CONTACTS_RELATIONSHIP_TYPE_CUSTOM ? "Godmother" : nullptr } });
}

inline void fillEventsAndTexts(const RichTarget& t)
{
	struct { int type; int date; const char* label; } events[] = { { CONTACTS_EVENT_TYPE_BIRTH, 19900102, nullptr },
		{ CONTACTS_EVENT_TYPE_ANNIVERSARY, 615, nullptr }, { CONTACTS_EVENT_TYPE_OTHER, 20200101, nullptr },
		{ CONTACTS_EVENT_TYPE_CUSTOM, 20120630, "Graduation" } };
	for (const auto& e : events) {
		contacts_record_h r = t.add(_contacts_contact.event, _contacts_my_profile.event, _contacts_event._uri,
			_contacts_event.type, e.type);
		contacts_record_set_int(r, _contacts_event.date, e.date);
		if (e.label) { // a lunar date in a leap month
			setStr(r, _contacts_event.label, e.label);
			contacts_record_set_int(r, _contacts_event.calendar_type, CONTACTS_EVENT_CALENDAR_TYPE_LUNAR);
			contacts_record_set_bool(r, _contacts_event.is_leap_month, true);
		}
	}
	for (const char* text : { "Line one; with, specials \\ and\nanother line", "Second note: ünïcödé 한국어" })
		setStr(t.add(_contacts_contact.note, _contacts_my_profile.note, _contacts_note._uri), _contacts_note.note, text);
	for (const char* text : { "Annie", "A, the great" })
		setStr(t.add(_contacts_contact.nickname, _contacts_my_profile.nickname, _contacts_nickname._uri),
			_contacts_nickname.name, text);
}

inline void fillCompaniesAndPictures(const RichTarget& t, const RichContact& rich)
{
	setAll(t.add(_contacts_contact.company, _contacts_my_profile.company, _contacts_company._uri),
		{ { _contacts_company.name, "ACME; Inc." }, { _contacts_company.department, "R&D" },
			{ _contacts_company.job_title, "Chief, Rockets" }, { _contacts_company.role, "Engineer" },
			{ _contacts_company.assistant_name, "Bob" }, { _contacts_company.phonetic_name, "Akmee" },
			{ _contacts_company.location, "Building 3" }, { _contacts_company.description, "Makes everything" },
			{ _contacts_company.logo, rich.logo.c_str() } });
	setAll(t.add(_contacts_contact.company, _contacts_my_profile.company, _contacts_company._uri),
		{ { _contacts_company.name, "Other Co" }, { _contacts_company.job_title, "Advisor" } });
	for (const std::string* picture : { &rich.picture1, &rich.picture2 })
		setStr(t.add(_contacts_contact.image, _contacts_my_profile.image, _contacts_image._uri), _contacts_image.path,
			picture->c_str());
}

// What only contacts keep: a uid, a social-network profile and groups.
inline void fillContactOnly(contacts_record_h c, RichContact& rich)
{
	contacts_record_set_str(c, _contacts_contact.uid, "uid-123@example");
	contacts_record_h social = addChild(c, _contacts_contact.profile, _contacts_profile._uri);
	contacts_record_set_int(social, _contacts_profile.type, 1);
	setAll(social, { { _contacts_profile.label, "Friendbook" }, { _contacts_profile.uid, "anna.oneil" },
		{ _contacts_profile.text, "Anna on Friendbook" }, { _contacts_profile.app_id, "com.example.friendbook" },
		{ _contacts_profile.service_operation, "http://example.org/appcontrol/operation/social/view" },
		{ _contacts_profile.mime, "vnd.example/profile" }, { _contacts_profile.category, "social" },
		{ _contacts_profile.extra_data, "aWQ=:MTIz,bmFtZQ==:QW5uYQ==" },
		{ _contacts_profile.uri, "https://friendbook.example/anna;p=1" } });
	for (const char* group : { "Family", "Work, Team" }) {
		rich.groupIds.push_back(addGroup(group));
		contacts_record_set_int(addChild(c, _contacts_contact.group_relation, _contacts_group_relation._uri),
			_contacts_group_relation.group_id, rich.groupIds.back());
	}
}

// Fills a contact or profile record with every field kind; a contact also
// gets a uid, a social-network profile and two groups of address book 0.
inline RichContact fillRich(contacts_record_h c, const TempDataDir& dir)
{
	RichContact rich;
	rich.picture1 = writePicture(dir, "one.png", kPng, 3000);
	rich.picture2 = writePicture(dir, "two.jpg", kJpeg, 1500);
	rich.logo = writePicture(dir, "logo.jpg", kJpeg, 700);
	const char* uri = nullptr;
	contacts_record_get_uri_p(c, &uri);
	RichTarget target{ c, strcmp(uri, _contacts_contact._uri) == 0 };
	fillNameNumbersAndEmails(target);
	fillAddressesAndOnlineIds(target);
	fillEventsAndTexts(target);
	fillCompaniesAndPictures(target, rich);
	if (target.isContact)
		fillContactOnly(c, rich);
	return rich;
}

// Every property of the record and its children as sorted "name=value"
// lines; ids, owners, times and paths left out, files compared by content.
inline std::string describe(const contacts_record_s& r, bool childrenOnly = false, const std::string& indent = "")
{
	static const std::set<std::string> skipped = { "id", "contact_id", "person_id", "changed_time", "changed_ver",
		"group_id", "address_book_id", "image_thumbnail_path", "link_mode" };
	std::vector<std::string> lines;
	for (const ct::contacts::PropertyInfo& p : r.view->props) {
		if (skipped.count(p.name))
			continue;
		if (p.type == ct::contacts::PropType::Record) {
			std::vector<std::string> children;
			for (const contacts_record_s* child : r.childLists[p.slot])
				children.push_back(describe(*child, false, indent + "  "));
			std::sort(children.begin(), children.end());
			for (const std::string& child : children)
				lines.push_back(indent + p.name + ":\n" + child);
			continue;
		}
		if (childrenOnly)
			continue;
		const auto& v = r.values[p.slot];
		std::string value = p.type == ct::contacts::PropType::Str ? (v.s ? *v.s : "") : std::to_string(v.i);
		if ((!strcmp(p.name, "path") || !strcmp(p.name, "logo")) && !value.empty())
			value = "file " + sha1(fileBytes(value));
		if (!value.empty() && value != "0")
			lines.push_back(indent + p.name + "=" + value + "\n");
	}
	std::string out;
	for (const std::string& line : lines)
		out += line;
	return out;
}

} // namespace ct::test
