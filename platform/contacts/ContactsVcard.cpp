#include "ContactsVcard.h"

#include "ContactsConnection.h"
#include "ContactsDebug.h"
#include "ContactsPersons.h"
#include "ContactsReader.h"
#include "ContactsVcardTypes.h"
#include "contacts_service.h"

#include <glib.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <memory>
#include <set>

namespace ct::contacts {
namespace {

using V = ContactsVcard;
using Kind = ContactsVcardTypes::Kind;

// The text of one card being written; `items` numbers the property groups
// ("item1.") that tie a custom label to its line.
struct Card {
	std::string text;
	int items = 0;
};

const std::vector<contacts_record_s*>& childrenOf(const contacts_record_s& r, const char* prop)
{
	static const std::vector<contacts_record_s*> none;
	const auto* list = r.children(prop);
	return list ? *list : none;
}

bool hasText(const char* s) { return s && *s; }

std::string text(const char* s) { return s ? s : ""; }

void addLine(Card& card, const std::string& line)
{
	card.text += V::fold(line);
	card.text += "\r\n";
}

// A parameter value, quoted when it holds a separator; quotes cannot be kept.
std::string paramValue(const char* value)
{
	std::string out = text(value);
	out.erase(std::remove(out.begin(), out.end(), '"'), out.end());
	out.erase(std::remove_if(out.begin(), out.end(), [](char c) { return c == '\r' || c == '\n'; }), out.end());
	return out.find_first_of(";:,") == std::string::npos ? out : "\"" + out + "\"";
}

// NAME;params:value, or itemN.NAME;params:value plus itemN.X-ABLabel:label
// when the field carries a custom label.
void addLabelled(Card& card, const std::string& nameAndParams, const std::string& value, const char* label)
{
	if (!hasText(label)) {
		addLine(card, nameAndParams + ":" + value);
		return;
	}
	std::string group = "item" + std::to_string(++card.items) + ".";
	addLine(card, group + nameAndParams + ":" + value);
	addLine(card, group + "X-ABLabel:" + V::escape(label));
}

std::string typeParams(const std::string& types, bool pref)
{
	std::string all = types;
	if (pref)
		all += (all.empty() ? "" : ",") + std::string("PREF");
	return all.empty() ? "" : ";TYPE=" + all;
}

const char* customLabel(const contacts_record_s& r, bool isCustom)
{
	return isCustom && hasText(r.getStr("label")) ? r.getStr("label") : nullptr;
}

std::string readPicture(const char* path)
{
	std::ifstream in(path, std::ios::binary | std::ios::ate);
	if (!in)
		return {};
	std::streamoff size = in.tellg();
	if (size <= 0 || static_cast<size_t>(size) > V::kMaxPictureBytes) {
		WWARNING("picture %s left out of the vCard: %lld bytes", path, static_cast<long long>(size));
		return {};
	}
	std::string bytes(static_cast<size_t>(size), '\0');
	in.seekg(0);
	in.read(bytes.data(), size);
	return in ? bytes : std::string();
}

void addPicture(Card& card, const char* property, const char* path)
{
	if (!hasText(path))
		return;
	std::string bytes = readPicture(path);
	const char* type = V::pictureType(bytes);
	if (!type) {
		if (!bytes.empty())
			WWARNING("picture %s left out of the vCard: not a known picture format", path);
		return;
	}
	gchar* encoded = g_base64_encode(reinterpret_cast<const guchar*>(bytes.data()), bytes.size());
	addLine(card, std::string(property) + ";ENCODING=b;TYPE=" + type + ":" + encoded);
	g_free(encoded);
}

void addName(Card& card, const std::vector<const contacts_record_s*>& sources)
{
	for (const contacts_record_s* s : sources) {
		for (const contacts_record_s* n : childrenOf(*s, "name")) {
			addLine(card, "N:" + V::escape(n->getStr("last")) + ";" + V::escape(n->getStr("first")) + ";"
				+ V::escape(n->getStr("addition")) + ";" + V::escape(n->getStr("prefix")) + ";"
				+ V::escape(n->getStr("suffix")));
			for (const auto& [prop, line] : { std::pair{ "phonetic_first", "X-PHONETIC-FIRST-NAME:" },
					 { "phonetic_middle", "X-PHONETIC-MIDDLE-NAME:" }, { "phonetic_last", "X-PHONETIC-LAST-NAME:" } })
				if (hasText(n->getStr(prop)))
					addLine(card, line + V::escape(n->getStr(prop)));
			return;
		}
	}
	addLine(card, "N:;;;;");
}

void addNumbers(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "number")) {
		if (!hasText(c->getStr("number")))
			continue;
		int type = c->getInt("type");
		addLabelled(card,
			"TEL" + typeParams(ContactsVcardTypes::typeList(Kind::Number, type), c->getInt("is_default")),
			V::escape(c->getStr("number")), customLabel(*c, type & CONTACTS_NUMBER_TYPE_CUSTOM));
	}
}

void addEmails(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "email")) {
		if (!hasText(c->getStr("email")))
			continue;
		int type = c->getInt("type");
		std::string types = ContactsVcardTypes::typeList(Kind::Email, type);
		addLabelled(card, "EMAIL" + typeParams("INTERNET" + (types.empty() ? "" : "," + types), c->getInt("is_default")),
			V::escape(c->getStr("email")), customLabel(*c, type & CONTACTS_EMAIL_TYPE_CUSTOM));
	}
}

void addAddresses(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "address")) {
		std::string value;
		for (const char* part : { "postbox", "extended", "street", "locality", "region", "postal_code", "country" })
			value += (value.empty() && strcmp(part, "postbox") == 0 ? "" : ";") + V::escape(c->getStr(part));
		if (value.find_first_not_of(';') == std::string::npos)
			continue;
		int type = c->getInt("type");
		addLabelled(card,
			"ADR" + typeParams(ContactsVcardTypes::typeList(Kind::Address, type), c->getInt("is_default")), value,
			customLabel(*c, type & CONTACTS_ADDRESS_TYPE_CUSTOM));
	}
}

void addUrls(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "url")) {
		if (!hasText(c->getStr("url")))
			continue;
		int type = c->getInt("type");
		addLabelled(card, "URL" + typeParams(ContactsVcardTypes::typeList(Kind::Url, type), false),
			V::escape(c->getStr("url")), customLabel(*c, type == CONTACTS_URL_TYPE_CUSTOM));
	}
}

void addMessengers(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "messenger")) {
		if (!hasText(c->getStr("im_id")))
			continue;
		int type = c->getInt("type");
		const VcardMessenger* m = ContactsVcardTypes::messengerOfType(type);
		if (m && *m->property) {
			addLine(card, std::string(m->property) + ":" + V::escape(c->getStr("im_id")));
			continue;
		}
		const char* service = m ? m->service : customLabel(*c, type == CONTACTS_MESSENGER_TYPE_CUSTOM);
		std::string params = service ? ";X-SERVICE-TYPE=" + paramValue(service) : "";
		addLine(card, "IMPP" + params + ":" + (m ? m->scheme : "x-apple") + ":" + V::escape(c->getStr("im_id")));
	}
}

void addRelationships(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "relationship")) {
		if (!hasText(c->getStr("name")))
			continue;
		int type = c->getInt("type");
		const char* label = ContactsVcardTypes::relationLabel(type);
		if (!label)
			label = type == CONTACTS_RELATIONSHIP_TYPE_CUSTOM && hasText(c->getStr("label"))
				? c->getStr("label")
				: ContactsVcardTypes::otherLabel();
		addLabelled(card, "X-ABRELATEDNAMES", V::escape(c->getStr("name")), label);
	}
}

// YYYY-MM-DD; a date without a year is written the way address books that
// keep such dates read it: year 1604 marked as left out.
std::string eventDate(int date, std::string* params)
{
	int year = date / 10000;
	if (year == 0) {
		year = 1604;
		*params += ";X-APPLE-OMIT-YEAR=1604";
	}
	char buf[32];
	snprintf(buf, sizeof buf, "%04d-%02d-%02d", year, date / 100 % 100, date % 100);
	return buf;
}

const char* eventLabel(const contacts_record_s& event)
{
	bool custom = event.getInt("type") == CONTACTS_EVENT_TYPE_CUSTOM && hasText(event.getStr("label"));
	return custom ? event.getStr("label") : ContactsVcardTypes::otherLabel();
}

void addEvents(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "event")) {
		int date = c->getInt("date");
		if (date <= 0)
			continue;
		std::string params;
		if (c->getInt("calendar_type") == CONTACTS_EVENT_CALENDAR_TYPE_LUNAR)
			params += ";X-CALSCALE=LUNAR";
		if (c->getInt("is_leap_month"))
			params += ";X-LEAP-MONTH=TRUE";
		std::string value = eventDate(date, &params);
		int type = c->getInt("type");
		if (type == CONTACTS_EVENT_TYPE_BIRTH)
			addLine(card, "BDAY" + params + ":" + value);
		else if (type == CONTACTS_EVENT_TYPE_ANNIVERSARY)
			addLine(card, "X-ANNIVERSARY" + params + ":" + value);
		else
			addLabelled(card, "X-ABDATE" + params, value, eventLabel(*c));
	}
}

void addCompanies(Card& card, const contacts_record_s& s)
{
	const auto& companies = childrenOf(s, "company");
	for (const contacts_record_s* c : companies) {
		// Several companies: each one's lines share a group so they stay together.
		std::string group = companies.size() > 1 ? "item" + std::to_string(++card.items) + "." : "";
		if (hasText(c->getStr("name")) || hasText(c->getStr("department")))
			addLine(card, group + "ORG:" + V::escape(c->getStr("name"))
				+ (hasText(c->getStr("department")) ? ";" + V::escape(c->getStr("department")) : ""));
		for (const auto& [prop, name] : { std::pair{ "job_title", "TITLE" }, { "role", "ROLE" },
				 { "assistant_name", "X-ASSISTANT" }, { "phonetic_name", "X-PHONETIC-ORG" },
				 { "location", "X-COMPANY-LOCATION" }, { "description", "X-COMPANY-DESCRIPTION" } })
			if (hasText(c->getStr(prop)))
				addLine(card, group + name + ":" + V::escape(c->getStr(prop)));
		addPicture(card, (group + "LOGO").c_str(), c->getStr("logo"));
	}
}

void addPictures(Card& card, const contacts_record_s& s)
{
	std::vector<const contacts_record_s*> images(childrenOf(s, "image").begin(), childrenOf(s, "image").end());
	// The default picture first, then the picture order.
	std::stable_sort(images.begin(), images.end(), [](const contacts_record_s* a, const contacts_record_s* b) {
		if (a->getInt("is_default") != b->getInt("is_default"))
			return a->getInt("is_default") > b->getInt("is_default");
		return a->getInt("order") < b->getInt("order");
	});
	for (const contacts_record_s* c : images)
		addPicture(card, "PHOTO", c->getStr("path"));
}

// Social-network profiles: the service as TYPE (what address books show),
// the rest of the launch data in extension parameters.
void addSocialProfiles(Card& card, const contacts_record_s& s)
{
	static const std::pair<const char*, const char*> params[] = { { "label", "TYPE" }, { "uid", "X-USER" },
		{ "text", "X-TEXT" }, { "app_id", "X-APP-ID" }, { "service_operation", "X-OPERATION" }, { "mime", "X-MIME" },
		{ "category", "X-CATEGORY" }, { "extra_data", "X-EXTRA" } };
	for (const contacts_record_s* c : childrenOf(s, "profile")) {
		std::string line = "X-SOCIALPROFILE";
		if (c->getInt("type"))
			line += ";X-PROFILE-TYPE=" + std::to_string(c->getInt("type"));
		for (const auto& [prop, param] : params)
			if (hasText(c->getStr(prop)))
				line += std::string(";") + param + "=" + paramValue(c->getStr(prop));
		addLine(card, line + ":" + V::escape(c->getStr("uri")));
	}
}

void addSimpleLines(Card& card, const contacts_record_s& s)
{
	for (const contacts_record_s* c : childrenOf(s, "nickname"))
		if (hasText(c->getStr("name")))
			addLine(card, "NICKNAME:" + V::escape(c->getStr("name")));
	for (const contacts_record_s* c : childrenOf(s, "note"))
		if (hasText(c->getStr("note")))
			addLine(card, "NOTE:" + V::escape(c->getStr("note")));
	if (s.view->findByName("status") && hasText(s.getStr("status")))
		addLine(card, "X-STATUS:" + V::escape(s.getStr("status")));
}

void addCategories(Card& card, const std::vector<const contacts_record_s*>& sources)
{
	std::string value;
	std::set<std::string> seen;
	for (const contacts_record_s* s : sources)
		for (const contacts_record_s* c : childrenOf(*s, "group_relation"))
			if (hasText(c->getStr("name")) && seen.insert(c->getStr("name")).second)
				value += (value.empty() ? "" : ",") + V::escape(c->getStr("name"));
	if (!value.empty())
		addLine(card, "CATEGORIES:" + value);
}

void addUid(Card& card, const std::vector<const contacts_record_s*>& sources)
{
	if (!sources.empty() && sources.front()->view->findByName("uid") && hasText(sources.front()->getStr("uid")))
		addLine(card, "UID:" + V::escape(sources.front()->getStr("uid")));
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
	out.reserve(line.size() + line.size() / 25);
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

const char* ContactsVcard::pictureType(const std::string& b)
{
	auto starts = [&](const char* magic, size_t at = 0) {
		size_t n = strlen(magic);
		return b.size() >= at + n && b.compare(at, n, magic) == 0;
	};
	if (starts("\xFF\xD8\xFF"))
		return "JPEG";
	if (starts("\x89PNG\r\n\x1A\n"))
		return "PNG";
	if (starts("GIF87a") || starts("GIF89a"))
		return "GIF";
	if (starts("BM") && b.size() > 26)
		return "BMP";
	if (starts("RIFF") && starts("WEBP", 8))
		return "WEBP";
	return nullptr;
}

std::string ContactsVcard::make(const std::vector<const contacts_record_s*>& sources, const std::string& displayName)
{
	Card card;
	addLine(card, "BEGIN:VCARD");
	addLine(card, "VERSION:3.0");
	addLine(card, "FN:" + escape(displayName.c_str()));
	addName(card, sources);
	for (const contacts_record_s* s : sources) {
		addSimpleLines(card, *s);
		addNumbers(card, *s);
		addEmails(card, *s);
		addAddresses(card, *s);
		addCompanies(card, *s);
		addUrls(card, *s);
		addMessengers(card, *s);
		addRelationships(card, *s);
		addEvents(card, *s);
		addSocialProfiles(card, *s);
	}
	addCategories(card, sources);
	addUid(card, sources);
	for (const contacts_record_s* s : sources)
		addPictures(card, *s);
	addLine(card, "END:VCARD");
	return std::move(card.text);
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
	// One preferred number and e-mail: the person's defaults, not each contact's.
	for (auto [prop, kind] : { std::pair{ "number", CONTACTS_PERSON_PROPERTY_NUMBER }, { "email", CONTACTS_PERSON_PROPERTY_EMAIL } }) {
		int defaultId = 0;
		contacts_person_get_default_property(kind, person->getInt("id"), &defaultId);
		for (const auto& c : contacts)
			for (contacts_record_s* child : *c->children(prop))
				child->setInt("is_default", child->getInt("id") == defaultId ? 1 : 0);
	}
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
