#include "ContactsVcard.h"

#include "ContactsConnection.h"
#include "ContactsDebug.h"
#include "ContactsPersons.h"
#include "ContactsReader.h"
#include "contacts_service.h"

#include <cstdlib>
#include <cstring>
#include <memory>

namespace ct::contacts {
namespace {

const std::vector<contacts_record_s*>& childrenOf(const contacts_record_s& r, const char* prop)
{
	static const std::vector<contacts_record_s*> none;
	const auto* list = r.children(prop);
	return list ? *list : none;
}

bool hasText(const char* s) { return s && *s; }

std::string typeParam(int type, const char* label, std::initializer_list<std::pair<int, const char*>> bits)
{
	std::string types;
	for (const auto& [bit, name] : bits)
		if (type & bit)
			types += (types.empty() ? "" : ",") + std::string(name);
	if ((type & 1) && hasText(label))
		types += (types.empty() ? "X-" : ",X-") + std::string(label);
	return types.empty() ? "" : ";TYPE=" + types;
}

void addLine(std::string& out, const std::string& line)
{
	out += ContactsVcard::fold(line);
	out += "\r\n";
}

void addName(std::string& out, const std::vector<const contacts_record_s*>& sources)
{
	for (const contacts_record_s* s : sources) {
		for (const contacts_record_s* n : childrenOf(*s, "name")) {
			addLine(out, "N:" + ContactsVcard::escape(n->getStr("last")) + ";" + ContactsVcard::escape(n->getStr("first"))
				+ ";" + ContactsVcard::escape(n->getStr("addition")) + ";" + ContactsVcard::escape(n->getStr("prefix"))
				+ ";" + ContactsVcard::escape(n->getStr("suffix")));
			return;
		}
	}
	addLine(out, "N:;;;;");
}

void addFields(std::string& out, const contacts_record_s& s)
{
	using V = ContactsVcard;
	for (const contacts_record_s* c : childrenOf(s, "nickname"))
		if (hasText(c->getStr("name")))
			addLine(out, "NICKNAME:" + V::escape(c->getStr("name")));
	for (const contacts_record_s* c : childrenOf(s, "number"))
		if (hasText(c->getStr("number")))
			addLine(out, "TEL" + typeParam(c->getInt("type"), c->getStr("label"),
				{ { 2, "HOME" }, { 4, "WORK" }, { 8, "VOICE" }, { 16, "FAX" }, { 32, "MSG" }, { 64, "CELL" },
					{ 128, "PAGER" }, { 256, "BBS" }, { 512, "MODEM" }, { 1024, "CAR" }, { 2048, "ISDN" },
					{ 4096, "VIDEO" }, { 8192, "PCS" } }) + ":" + V::escape(c->getStr("number")));
	for (const contacts_record_s* c : childrenOf(s, "email"))
		if (hasText(c->getStr("email")))
			addLine(out, "EMAIL" + typeParam(c->getInt("type"), c->getStr("label"), { { 2, "HOME" }, { 4, "WORK" } })
				+ ":" + V::escape(c->getStr("email")));
	for (const contacts_record_s* c : childrenOf(s, "address"))
		addLine(out, "ADR" + typeParam(c->getInt("type"), c->getStr("label"),
			{ { 2, "HOME" }, { 4, "WORK" }, { 8, "DOM" }, { 16, "INTL" }, { 32, "POSTAL" }, { 64, "PARCEL" } })
			+ ":" + V::escape(c->getStr("postbox")) + ";" + V::escape(c->getStr("extended")) + ";"
			+ V::escape(c->getStr("street")) + ";" + V::escape(c->getStr("locality")) + ";"
			+ V::escape(c->getStr("region")) + ";" + V::escape(c->getStr("postal_code")) + ";"
			+ V::escape(c->getStr("country")));
	for (const contacts_record_s* c : childrenOf(s, "company")) {
		if (hasText(c->getStr("name")) || hasText(c->getStr("department")))
			addLine(out, "ORG:" + V::escape(c->getStr("name")) + ";" + V::escape(c->getStr("department")));
		if (hasText(c->getStr("job_title")))
			addLine(out, "TITLE:" + V::escape(c->getStr("job_title")));
	}
	for (const contacts_record_s* c : childrenOf(s, "url"))
		if (hasText(c->getStr("url")))
			addLine(out, "URL:" + V::escape(c->getStr("url")));
	for (const contacts_record_s* c : childrenOf(s, "note"))
		if (hasText(c->getStr("note")))
			addLine(out, "NOTE:" + V::escape(c->getStr("note")));
	for (const contacts_record_s* c : childrenOf(s, "event")) {
		int date = c->getInt("date");
		if (c->getInt("type") != CONTACTS_EVENT_TYPE_BIRTH || date <= 0)
			continue;
		char buf[16];
		snprintf(buf, sizeof buf, "%04d-%02d-%02d", date / 10000, date / 100 % 100, date % 100);
		addLine(out, std::string("BDAY:") + buf);
	}
}

} // namespace

std::string ContactsVcard::escape(const char* text)
{
	std::string out;
	for (const char* c = text ? text : ""; *c; ++c) {
		switch (*c) {
		case '\\': out += "\\\\"; break;
		case ',': out += "\\,"; break;
		case ';': out += "\\;"; break;
		case '\n': out += "\\n"; break;
		case '\r': break;
		default: out += *c;
		}
	}
	return out;
}

std::string ContactsVcard::fold(const std::string& line)
{
	const size_t kMax = 75;
	std::string out;
	size_t pos = 0;
	size_t room = kMax;
	while (line.size() - pos > room) {
		size_t cut = pos + room;
		while (cut > pos && (static_cast<unsigned char>(line[cut]) & 0xC0) == 0x80)
			--cut;
		out.append(line, pos, cut - pos);
		out += "\r\n ";
		pos = cut;
		room = kMax - 1;
	}
	out.append(line, pos, std::string::npos);
	return out;
}

std::string ContactsVcard::make(const std::vector<const contacts_record_s*>& sources, const std::string& displayName)
{
	std::string out;
	addLine(out, "BEGIN:VCARD");
	addLine(out, "VERSION:3.0");
	addLine(out, "FN:" + escape(displayName.c_str()));
	addName(out, sources);
	for (const contacts_record_s* s : sources)
		addFields(out, *s);
	addLine(out, "END:VCARD");
	return out;
}

} // namespace ct::contacts

using namespace ct::contacts;

namespace {

int giveStream(const std::string& text, char** stream)
{
	*stream = strdup(text.c_str());
	return *stream ? CONTACTS_ERROR_NONE : CONTACTS_ERROR_OUT_OF_MEMORY;
}

int nameOrder()
{
	ContactsConnection* conn = ContactsConnection::current();
	return conn ? conn->nameDisplayOrder() : CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST;
}

} // namespace

extern "C" {

int contacts_vcard_make_from_contact(contacts_record_h contact, char** vcard_stream)
{
	WPRET_VM(!vcard_stream, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : stream");
	*vcard_stream = nullptr;
	WPRET_VM(!contact || contact->view->number != kContactView, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : contact");
	DisplayName name = ContactsPersons::displayNameOf(*contact, nameOrder());
	return giveStream(ContactsVcard::make({ contact }, name.text), vcard_stream);
}

int contacts_vcard_make_from_my_profile(contacts_record_h my_profile, char** vcard_stream)
{
	WPRET_VM(!vcard_stream, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : stream");
	*vcard_stream = nullptr;
	WPRET_VM(!my_profile || my_profile->view->number != kMyProfileView, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : my_profile");
	DisplayName name = ContactsPersons::displayNameOf(*my_profile, nameOrder());
	return giveStream(ContactsVcard::make({ my_profile }, name.text), vcard_stream);
}

int contacts_vcard_make_from_person(contacts_record_h person, char** vcard_stream)
{
	WPRET_VM(!vcard_stream, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : stream");
	*vcard_stream = nullptr;
	WPRET_VM(!person || person->view->number != kPersonView, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : person");
	ContactsConnection* conn = ContactsConnection::current();
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected");
	ContactsReader reader(*conn);
	const ViewInfo* contactView = ContactsSchema::view("contacts.view.contact");
	std::vector<std::unique_ptr<contacts_record_s>> contacts;
	for (int id : reader.contactIdsOfPerson(person->getInt("id"))) {
		contacts_record_s* r = nullptr;
		int err = reader.readRecord(*contactView, id, &r);
		if (err != CONTACTS_ERROR_NONE)
			return err;
		contacts.emplace_back(r);
	}
	if (contacts.empty())
		return CONTACTS_ERROR_NO_DATA;
	// The name contact first, so that N comes from it.
	int nameContact = person->getInt("display_contact_id");
	std::vector<const contacts_record_s*> sources;
	for (const auto& c : contacts)
		if (c->getInt("id") == nameContact)
			sources.push_back(c.get());
	for (const auto& c : contacts)
		if (c->getInt("id") != nameContact)
			sources.push_back(c.get());
	const char* displayName = person->getStr("display_name");
	return giveStream(ContactsVcard::make(sources, displayName ? displayName : ""), vcard_stream);
}

} // extern "C"
