#include "ContactsVcardReader.h"

#include "ContactsDebug.h"
#include "ContactsRecord.h"
#include "ContactsVcard.h"
#include "ContactsVcardTypes.h"
#include "contacts_record.h"
#include "contacts_views.h"

#include <glib.h>
#include <strings.h>

#include <algorithm>
#include <cctype>
#include <cstring>

namespace ct::contacts {
namespace {

using Kind = ContactsVcardTypes::Kind;

std::string upper(std::string s)
{
	for (char& c : s)
		c = static_cast<char>(toupper(static_cast<unsigned char>(c)));
	return s;
}

bool same(const std::string& a, const char* b) { return strcasecmp(a.c_str(), b) == 0; }

int hexValue(char c)
{
	if (c >= '0' && c <= '9')
		return c - '0';
	c = static_cast<char>(toupper(static_cast<unsigned char>(c)));
	return c >= 'A' && c <= 'F' ? c - 'A' + 10 : -1;
}

std::string quotedPrintableDecoded(const std::string& in)
{
	std::string out;
	out.reserve(in.size());
	for (size_t i = 0; i < in.size(); ++i) {
		if (in[i] == '=' && i + 2 < in.size() && hexValue(in[i + 1]) >= 0 && hexValue(in[i + 2]) >= 0) {
			out += static_cast<char>(hexValue(in[i + 1]) * 16 + hexValue(in[i + 2]));
			i += 2;
		} else if (in[i] != '=' || i + 1 < in.size()) {
			out += in[i]; // a stray '=' is kept; a final one is a soft break
		}
	}
	return out;
}

bool isBase64Char(char c) { return isalnum(static_cast<unsigned char>(c)) || c == '+' || c == '/'; }

// The base64 text without white space, padded to whole quads; empty when it
// is not base64.
std::string cleanBase64(const std::string& in)
{
	std::string out;
	out.reserve(in.size());
	size_t padding = 0;
	for (char c : in) {
		if (c == ' ' || c == '\t' || c == '\r' || c == '\n')
			continue;
		if (c == '=')
			++padding;
		else if (!isBase64Char(c) || padding > 0)
			return {};
		else
			out += c;
	}
	if (padding > 2 || out.empty() || out.size() % 4 == 1)
		return {};
	while (out.size() % 4 != 0)
		out += '=';
	return out;
}

bool base64Decoded(const std::string& in, std::string* out)
{
	std::string clean = cleanBase64(in);
	if (clean.empty())
		return false;
	gsize size = 0;
	guchar* bytes = g_base64_decode(clean.c_str(), &size);
	out->assign(reinterpret_cast<const char*>(bytes), size);
	g_free(bytes);
	return true;
}

// The value's bytes as UTF-8: transfer encoding undone, charset converted.
// 2.1 cards without a charset that are not UTF-8 are read as Windows-1252,
// which is what such cards are written in.
bool decodedValue(const VcardProperty& p, const std::string& version, std::string* out, std::string* error)
{
	std::string encoding = upper(p.param("ENCODING"));
	if (encoding == "QUOTED-PRINTABLE") {
		*out = quotedPrintableDecoded(p.value);
	} else if (encoding == "B" || encoding == "BASE64") {
		if (!base64Decoded(p.value, out)) {
			*error = "value is not valid base64";
			return false;
		}
	} else {
		*out = p.value;
	}
	std::string charset = p.param("CHARSET");
	bool utf8 = charset.empty() || same(charset, "UTF-8") || same(charset, "UTF8");
	if (utf8 && g_utf8_validate(out->data(), static_cast<gssize>(out->size()), nullptr))
		return true;
	const char* from = !utf8 ? charset.c_str() : version == "2.1" ? "WINDOWS-1252" : nullptr;
	if (!from) {
		*error = "text is not UTF-8";
		return false;
	}
	gsize written = 0;
	gchar* converted = g_convert(out->data(), static_cast<gssize>(out->size()), "UTF-8", from, nullptr, &written, nullptr);
	if (!converted || !g_utf8_validate(converted, static_cast<gssize>(written), nullptr)) {
		g_free(converted);
		*error = "text cannot be read as " + std::string(from);
		return false;
	}
	out->assign(converted, written);
	g_free(converted);
	return true;
}

// Line breaks inside values (quoted-printable =0D=0A) stored as "\n".
void normaliseLineBreaks(std::string& text)
{
	size_t to = 0;
	for (size_t i = 0; i < text.size(); ++i) {
		if (text[i] == '\r') {
			text[to++] = '\n';
			if (i + 1 < text.size() && text[i + 1] == '\n')
				++i;
		} else {
			text[to++] = text[i];
		}
	}
	text.resize(to);
}

// Backslash escapes undone; an unknown escape keeps its backslash.
std::string unescaped(const std::string& in, size_t from, size_t to)
{
	std::string out;
	out.reserve(to - from);
	for (size_t i = from; i < to; ++i) {
		char c = in[i];
		if (c != '\\' || i + 1 >= to) {
			out += c;
			continue;
		}
		char n = in[++i];
		if (n == 'n' || n == 'N')
			out += '\n';
		else if (n == ',' || n == ';' || n == '\\' || n == ':')
			out += n;
		else
			out.append({ '\\', n });
	}
	return out;
}

// "_$!<Mobile>!$_" -> "Mobile"; other labels unchanged.
std::string bareLabel(const std::string& label)
{
	if (label.size() > 8 && label.compare(0, 4, "_$!<") == 0 && label.compare(label.size() - 4, 4, ">!$_") == 0)
		return label.substr(4, label.size() - 8);
	return label;
}

bool isDigits(const std::string& s, size_t from, size_t count)
{
	if (s.size() < from + count)
		return false;
	for (size_t i = from; i < from + count; ++i)
		if (!isdigit(static_cast<unsigned char>(s[i])))
			return false;
	return true;
}

// YYYY-MM-DD, YYYYMMDD, --MM-DD or --MMDD (a time after T is ignored) as
// YYYYMMDD; year `omitYear` means no year. 0 when it is not a date.
int parsedDate(std::string text, int omitYear)
{
	text = text.substr(0, text.find_first_of("Tt"));
	while (!text.empty() && isspace(static_cast<unsigned char>(text.back())))
		text.pop_back();
	text.erase(0, text.find_first_not_of(" \t"));
	int year = 0;
	std::string rest;
	if (text.compare(0, 2, "--") == 0) {
		rest = text.substr(2);
	} else if (isDigits(text, 0, 4)) {
		year = std::stoi(text.substr(0, 4));
		rest = text.substr(4);
		if (!rest.empty() && rest[0] == '-')
			rest.erase(0, 1);
	} else {
		return 0;
	}
	if (rest.size() == 5 && rest[2] == '-')
		rest.erase(2, 1);
	if (rest.size() != 4 || !isDigits(rest, 0, 4))
		return 0;
	int month = std::stoi(rest.substr(0, 2));
	int day = std::stoi(rest.substr(2, 2));
	if (month < 1 || month > 12 || day < 1 || day > 31)
		return 0;
	if (year == omitYear)
		year = 0;
	return year * 10000 + month * 100 + day;
}

} // namespace

void VcardRecordDeleter::operator()(contacts_record_h record) const { contacts_record_destroy(record, true); }

bool ContactsVcardReader::read(const VcardRawCard& card, VcardEntry& entry, std::string* refusal)
{
	entry = VcardEntry();
	ContactsVcardReader reader(card, entry);
	bool ok = reader.__read();
	if (refusal)
		*refusal = ok ? std::string() : reader.m_refusal;
	if (!ok)
		entry.contact.reset();
	return ok;
}

ContactsVcardReader::ContactsVcardReader(const VcardRawCard& card, VcardEntry& entry) : m_card(card), m_entry(entry)
{
}

bool ContactsVcardReader::__read()
{
	if (!m_card.refusal.empty()) {
		m_refusal = m_card.refusal;
		return false;
	}
	if (!m_card.version.empty() && m_card.version != "2.1" && m_card.version != "3.0" && m_card.version != "4.0") {
		m_refusal = "vCard version " + m_card.version + " is not supported";
		return false;
	}
	contacts_record_h contact = nullptr;
	if (contacts_record_create(_contacts_contact._uri, &contact) != CONTACTS_ERROR_NONE) {
		m_refusal = "out of memory";
		return false;
	}
	m_entry.contact.reset(contact);
	for (const VcardProperty& p : m_card.properties)
		if (!__readProperty(p))
			return false;
	return __finish();
}

bool ContactsVcardReader::__refuse(const VcardProperty& p, const std::string& why)
{
	m_refusal = p.name + " (line " + std::to_string(p.line) + "): " + why;
	return false;
}

bool ContactsVcardReader::__text(const VcardProperty& p, std::string* out)
{
	std::string decoded, error;
	if (!decodedValue(p, m_card.version, &decoded, &error))
		return __refuse(p, error);
	normaliseLineBreaks(decoded);
	*out = unescaped(decoded, 0, decoded.size());
	return true;
}

bool ContactsVcardReader::__components(const VcardProperty& p, std::vector<std::string>* out, char separator)
{
	std::string decoded, error;
	if (!decodedValue(p, m_card.version, &decoded, &error))
		return __refuse(p, error);
	normaliseLineBreaks(decoded);
	out->clear();
	size_t start = 0;
	for (size_t i = 0; i <= decoded.size(); ++i) {
		if (i + 1 < decoded.size() && decoded[i] == '\\') {
			++i; // an escaped character never separates
			continue;
		}
		if (i == decoded.size() || decoded[i] == separator) {
			out->push_back(unescaped(decoded, start, std::min(i, decoded.size())));
			start = i + 1;
		}
	}
	return true;
}

bool ContactsVcardReader::__setStr(contacts_record_h record, unsigned property, const std::string& value)
{
	if (value.empty())
		return true;
	m_hasData = true;
	if (contacts_record_set_str(record, property, value.c_str()) == CONTACTS_ERROR_NONE)
		return true;
	m_refusal = "a text cannot be stored";
	return false;
}

contacts_record_h ContactsVcardReader::__child(unsigned property, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(m_entry.contact.get(), property, child);
	return child;
}

contacts_record_h ContactsVcardReader::__name()
{
	if (!m_nameRecord)
		m_nameRecord = __child(_contacts_contact.name, _contacts_name._uri);
	return m_nameRecord;
}

contacts_record_h ContactsVcardReader::__company(const std::string& group, const char* field)
{
	contacts_record_h& company = m_companies[group];
	// Ungrouped lines: a second ORG or TITLE starts the next company.
	bool taken = company && group.empty() && company->getStr(field) && *company->getStr(field);
	if (!company || taken)
		company = __child(_contacts_contact.company, _contacts_company._uri);
	return company;
}

std::string ContactsVcardReader::__groupLabel(const std::string& group) const
{
	if (group.empty())
		return {};
	for (const VcardProperty& p : m_card.properties) {
		if (p.group != group || p.name != "X-ABLABEL")
			continue;
		std::string decoded, error;
		if (decodedValue(p, m_card.version, &decoded, &error))
			return unescaped(decoded, 0, decoded.size());
	}
	return {};
}

bool ContactsVcardReader::__readProperty(const VcardProperty& p)
{
	const std::string& n = p.name;
	if (n == "FN")
		return __text(p, &m_fn);
	if (n == "N")
		return __readName(p);
	if (n == "X-PHONETIC-FIRST-NAME" || n == "X-PHONETIC-MIDDLE-NAME" || n == "X-PHONETIC-LAST-NAME") {
		std::string value;
		unsigned prop = n == "X-PHONETIC-FIRST-NAME" ? _contacts_name.phonetic_first
			: n == "X-PHONETIC-MIDDLE-NAME"          ? _contacts_name.phonetic_middle
													 : _contacts_name.phonetic_last;
		return __text(p, &value) && (value.empty() || __setStr(__name(), prop, value));
	}
	if (n == "NICKNAME" || n == "CATEGORIES")
		return __readList(p);
	if (n == "TEL" || n == "EMAIL" || n == "ADR" || n == "URL")
		return __readTyped(p);
	if (n == "ORG" || n == "TITLE" || n == "ROLE" || n == "X-ASSISTANT" || n == "X-PHONETIC-ORG"
		|| n == "X-COMPANY-LOCATION" || n == "X-COMPANY-DESCRIPTION" || n == "LOGO")
		return __readCompany(p);
	if (n == "NOTE" || n == "UID") {
		std::string value;
		if (!__text(p, &value) || value.empty())
			return m_refusal.empty();
		if (n == "UID")
			return __setStr(m_entry.contact.get(), _contacts_contact.uid, value);
		return __setStr(__child(_contacts_contact.note, _contacts_note._uri), _contacts_note.note, value);
	}
	if (n == "BDAY" || n == "ANNIVERSARY" || n == "X-ANNIVERSARY" || n == "X-ABDATE")
		return __readEvent(p);
	if (n == "IMPP" || ContactsVcardTypes::messengerOfProperty(n))
		return __readMessenger(p);
	if (n == "X-ABRELATEDNAMES" || n == "RELATED")
		return __readRelationship(p);
	if (n == "X-SOCIALPROFILE")
		return __readSocialProfile(p);
	if (n == "PHOTO") {
		VcardPicture picture;
		if (!__readPicture(p, &picture))
			return false;
		if (!picture.bytes.empty())
			m_entry.pictures.push_back(std::move(picture));
		return true;
	}
	return true;
}

bool ContactsVcardReader::__readName(const VcardProperty& p)
{
	std::vector<std::string> parts;
	if (!__components(p, &parts))
		return false;
	parts.resize(5);
	bool any = false;
	for (const std::string& part : parts)
		any = any || !part.empty();
	if (!any)
		return true;
	contacts_record_h name = __name();
	return __setStr(name, _contacts_name.last, parts[0]) && __setStr(name, _contacts_name.first, parts[1])
		&& __setStr(name, _contacts_name.addition, parts[2]) && __setStr(name, _contacts_name.prefix, parts[3])
		&& __setStr(name, _contacts_name.suffix, parts[4]);
}

bool ContactsVcardReader::__readTyped(const VcardProperty& p)
{
	Kind kind = p.name == "TEL" ? Kind::Number : p.name == "EMAIL" ? Kind::Email : p.name == "ADR" ? Kind::Address : Kind::Url;
	std::vector<std::string> parts;
	if (!__components(p, &parts, kind == Kind::Address ? ';' : '\0'))
		return false;
	parts.resize(7);
	if (kind == Kind::Number && strncasecmp(parts[0].c_str(), "tel:", 4) == 0)
		parts[0].erase(0, 4);
	bool empty = std::all_of(parts.begin(), parts.end(), [](const std::string& part) { return part.empty(); });
	if (empty || (kind != Kind::Address && parts[0].empty()))
		return true;
	TypedValue typed = __typedValue(p, kind);
	switch (kind) {
	case Kind::Number: return __addNumber(parts[0], typed);
	case Kind::Email: return __addEmail(parts[0], typed);
	case Kind::Address: return __addAddress(parts, typed);
	case Kind::Url: return __addUrl(parts[0], typed);
	}
	return true;
}

// TYPE values (PREF, known names, X-names as labels) and the label of the
// property's group.
ContactsVcardReader::TypedValue ContactsVcardReader::__typedValue(const VcardProperty& p, Kind kind) const
{
	TypedValue typed;
	typed.pref = !p.param("PREF").empty();
	auto addBit = [&](int bit) { typed.type = kind == Kind::Url ? bit : typed.type | bit; };
	for (const std::string& t : p.types()) {
		int bit = ContactsVcardTypes::typeBit(kind, t);
		if (t == "PREF")
			typed.pref = true;
		else if (bit)
			addBit(bit);
		else if (t.size() > 2 && t.compare(0, 2, "X-") == 0 && typed.label.empty())
			typed.label = t.substr(2);
	}
	std::string groupLabel = bareLabel(__groupLabel(p.group));
	if (int bit = groupLabel.empty() ? 0 : ContactsVcardTypes::typeBit(kind, groupLabel))
		addBit(bit);
	else if (!groupLabel.empty() && !same(groupLabel, "Other"))
		typed.label = groupLabel;
	if (!typed.label.empty())
		typed.type = kind == Kind::Url ? CONTACTS_URL_TYPE_CUSTOM : typed.type | 1;
	return typed;
}

bool ContactsVcardReader::__addNumber(const std::string& number, const TypedValue& typed)
{
	contacts_record_h r = __child(_contacts_contact.number, _contacts_number._uri);
	contacts_record_set_int(r, _contacts_number.type, typed.type);
	contacts_record_set_bool(r, _contacts_number.is_default, typed.pref);
	return __setStr(r, _contacts_number.number, number) && __setStr(r, _contacts_number.label, typed.label);
}

bool ContactsVcardReader::__addEmail(const std::string& email, const TypedValue& typed)
{
	contacts_record_h r = __child(_contacts_contact.email, _contacts_email._uri);
	contacts_record_set_int(r, _contacts_email.type, typed.type);
	contacts_record_set_bool(r, _contacts_email.is_default, typed.pref);
	return __setStr(r, _contacts_email.email, email) && __setStr(r, _contacts_email.label, typed.label);
}

bool ContactsVcardReader::__addAddress(const std::vector<std::string>& parts, const TypedValue& typed)
{
	contacts_record_h r = __child(_contacts_contact.address, _contacts_address._uri);
	contacts_record_set_int(r, _contacts_address.type, typed.type);
	contacts_record_set_bool(r, _contacts_address.is_default, typed.pref);
	const unsigned props[] = { _contacts_address.postbox, _contacts_address.extended, _contacts_address.street,
		_contacts_address.locality, _contacts_address.region, _contacts_address.postal_code, _contacts_address.country };
	for (size_t i = 0; i < 7; ++i)
		if (!__setStr(r, props[i], parts[i]))
			return false;
	return __setStr(r, _contacts_address.label, typed.label);
}

bool ContactsVcardReader::__addUrl(const std::string& url, const TypedValue& typed)
{
	contacts_record_h r = __child(_contacts_contact.url, _contacts_url._uri);
	contacts_record_set_int(r, _contacts_url.type, typed.type);
	return __setStr(r, _contacts_url.url, url) && __setStr(r, _contacts_url.label, typed.label);
}

bool ContactsVcardReader::__readCompany(const VcardProperty& p)
{
	if (p.name == "LOGO") {
		VcardPicture picture;
		if (!__readPicture(p, &picture))
			return false;
		if (!picture.bytes.empty())
			m_entry.logos.emplace_back(__company(p.group, "logo"), std::move(picture));
		return true;
	}
	if (p.name == "ORG") {
		std::vector<std::string> parts;
		if (!__components(p, &parts))
			return false;
		std::string department;
		for (size_t i = 1; i < parts.size(); ++i)
			if (!parts[i].empty())
				department += (department.empty() ? "" : ";") + parts[i];
		if (parts[0].empty() && department.empty())
			return true;
		contacts_record_h company = __company(p.group, "name");
		return __setStr(company, _contacts_company.name, parts[0])
			&& __setStr(company, _contacts_company.department, department);
	}
	static const std::pair<const char*, std::pair<const char*, unsigned>> fields[] = {
		{ "TITLE", { "job_title", _contacts_company.job_title } }, { "ROLE", { "role", _contacts_company.role } },
		{ "X-ASSISTANT", { "assistant_name", _contacts_company.assistant_name } },
		{ "X-PHONETIC-ORG", { "phonetic_name", _contacts_company.phonetic_name } },
		{ "X-COMPANY-LOCATION", { "location", _contacts_company.location } },
		{ "X-COMPANY-DESCRIPTION", { "description", _contacts_company.description } } };
	std::string value;
	if (!__text(p, &value))
		return false;
	for (const auto& [name, field] : fields)
		if (p.name == name && !value.empty())
			return __setStr(__company(p.group, field.first), field.second, value);
	return true;
}

bool ContactsVcardReader::__readEvent(const VcardProperty& p)
{
	std::string value;
	if (!__text(p, &value))
		return false;
	if (value.empty())
		return true;
	std::string omit = p.param("X-APPLE-OMIT-YEAR");
	int date = parsedDate(value, omit.empty() ? -1 : atoi(omit.c_str()));
	if (date <= 0)
		return __refuse(p, "'" + value + "' is not a date");
	int type = CONTACTS_EVENT_TYPE_BIRTH;
	std::string label;
	if (p.name == "ANNIVERSARY" || p.name == "X-ANNIVERSARY") {
		type = CONTACTS_EVENT_TYPE_ANNIVERSARY;
	} else if (p.name == "X-ABDATE") {
		label = bareLabel(__groupLabel(p.group));
		type = same(label, "Anniversary") ? CONTACTS_EVENT_TYPE_ANNIVERSARY
			: label.empty() || same(label, "Other") ? CONTACTS_EVENT_TYPE_OTHER
													: CONTACTS_EVENT_TYPE_CUSTOM;
		if (type != CONTACTS_EVENT_TYPE_CUSTOM)
			label.clear();
	}
	contacts_record_h event = __child(_contacts_contact.event, _contacts_event._uri);
	m_hasData = true;
	contacts_record_set_int(event, _contacts_event.type, type);
	contacts_record_set_int(event, _contacts_event.date, date);
	std::string calendar = p.param("X-CALSCALE");
	if (same(calendar, "LUNAR") || same(p.param("CALSCALE"), "chinese"))
		contacts_record_set_int(event, _contacts_event.calendar_type, CONTACTS_EVENT_CALENDAR_TYPE_LUNAR);
	if (same(p.param("X-LEAP-MONTH"), "TRUE") || p.param("X-LEAP-MONTH") == "1")
		contacts_record_set_bool(event, _contacts_event.is_leap_month, true);
	return __setStr(event, _contacts_event.label, label);
}

bool ContactsVcardReader::__readMessenger(const VcardProperty& p)
{
	std::string value;
	if (!__text(p, &value))
		return false;
	if (value.empty())
		return true;
	const VcardMessenger* m = nullptr;
	std::string label;
	if (p.name == "IMPP") {
		std::string service = p.param("X-SERVICE-TYPE");
		size_t colon = value.find(':');
		std::string scheme = colon == std::string::npos ? "" : value.substr(0, colon);
		value.erase(0, colon == std::string::npos ? 0 : colon + 1);
		m = !service.empty() ? ContactsVcardTypes::messengerOfService(service) : ContactsVcardTypes::messengerOfScheme(scheme);
		if (!m && !service.empty())
			label = service;
		if (value.empty())
			return true;
	} else {
		m = ContactsVcardTypes::messengerOfProperty(p.name);
	}
	int type = m ? m->type : label.empty() ? CONTACTS_MESSENGER_TYPE_OTHER : CONTACTS_MESSENGER_TYPE_CUSTOM;
	contacts_record_h messenger = __child(_contacts_contact.messenger, _contacts_messenger._uri);
	contacts_record_set_int(messenger, _contacts_messenger.type, type);
	return __setStr(messenger, _contacts_messenger.im_id, value) && __setStr(messenger, _contacts_messenger.label, label);
}

bool ContactsVcardReader::__readRelationship(const VcardProperty& p)
{
	std::string value;
	if (!__text(p, &value))
		return false;
	if (value.empty())
		return true;
	std::string label = p.name == "RELATED" ? (p.types().empty() ? "" : p.types().front()) : __groupLabel(p.group);
	int type = label.empty() ? CONTACTS_RELATIONSHIP_TYPE_OTHER : ContactsVcardTypes::relationType(label);
	if (type < 0)
		type = CONTACTS_RELATIONSHIP_TYPE_CUSTOM;
	contacts_record_h relation = __child(_contacts_contact.relationship, _contacts_relationship._uri);
	contacts_record_set_int(relation, _contacts_relationship.type, type);
	return __setStr(relation, _contacts_relationship.name, value)
		&& (type != CONTACTS_RELATIONSHIP_TYPE_CUSTOM || __setStr(relation, _contacts_relationship.label, label));
}

bool ContactsVcardReader::__readSocialProfile(const VcardProperty& p)
{
	static const std::pair<const char*, unsigned> params[] = { { "TYPE", _contacts_profile.label },
		{ "X-USER", _contacts_profile.uid }, { "X-TEXT", _contacts_profile.text },
		{ "X-APP-ID", _contacts_profile.app_id }, { "X-OPERATION", _contacts_profile.service_operation },
		{ "X-MIME", _contacts_profile.mime }, { "X-CATEGORY", _contacts_profile.category },
		{ "X-EXTRA", _contacts_profile.extra_data } };
	std::string uri;
	if (!__text(p, &uri))
		return false;
	contacts_record_h profile = __child(_contacts_contact.profile, _contacts_profile._uri);
	contacts_record_set_int(profile, _contacts_profile.type, atoi(p.param("X-PROFILE-TYPE").c_str()));
	for (const auto& [param, prop] : params) {
		std::string value = p.param(param);
		if (!g_utf8_validate(value.c_str(), static_cast<gssize>(value.size()), nullptr))
			return __refuse(p, "parameter " + std::string(param) + " is not UTF-8");
		if (!__setStr(profile, prop, value))
			return false;
	}
	return __setStr(profile, _contacts_profile.uri, uri);
}

bool ContactsVcardReader::__readPicture(const VcardProperty& p, VcardPicture* picture)
{
	std::string encoding = upper(p.param("ENCODING"));
	std::string payload;
	if (strncasecmp(p.value.c_str(), "data:", 5) == 0) {
		size_t comma = p.value.find(',');
		if (comma == std::string::npos || upper(p.value.substr(0, comma)).find(";BASE64") == std::string::npos)
			return __refuse(p, "picture is not base64 data");
		payload = p.value.substr(comma + 1);
	} else if (encoding == "B" || encoding == "BASE64") {
		payload = p.value;
	} else {
		return true; // a link to a picture elsewhere: nothing is fetched
	}
	if (payload.size() / 4 * 3 > kMaxPictureBytes + kMaxPictureBytes / 8)
		return __refuse(p, "picture larger than " + std::to_string(kMaxPictureBytes >> 20) + " MB");
	if (!base64Decoded(payload, &picture->bytes))
		return __refuse(p, "picture is not valid base64");
	if (picture->bytes.size() > kMaxPictureBytes)
		return __refuse(p, "picture larger than " + std::to_string(kMaxPictureBytes >> 20) + " MB");
	picture->format = ContactsVcard::pictureType(picture->bytes);
	if (!picture->format)
		return __refuse(p, "picture is not a JPEG, PNG, GIF, BMP or WEBP image");
	m_hasData = true;
	return true;
}

bool ContactsVcardReader::__readList(const VcardProperty& p)
{
	std::vector<std::string> items;
	if (!__components(p, &items, ','))
		return false;
	for (const std::string& item : items) {
		if (item.empty())
			continue;
		if (p.name == "CATEGORIES") {
			if (std::find(m_entry.groups.begin(), m_entry.groups.end(), item) == m_entry.groups.end())
				m_entry.groups.push_back(item);
		} else if (!__setStr(__child(_contacts_contact.nickname, _contacts_nickname._uri), _contacts_nickname.name, item)) {
			return false;
		}
	}
	return true;
}

bool ContactsVcardReader::__finish()
{
	const char* first = m_nameRecord ? m_nameRecord->getStr("first") : nullptr;
	const char* last = m_nameRecord ? m_nameRecord->getStr("last") : nullptr;
	bool named = (first && *first) || (last && *last) || (m_nameRecord && m_nameRecord->getStr("addition"));
	if (!named && !m_fn.empty() && !__setStr(__name(), _contacts_name.first, m_fn))
		return false;
	if (!m_hasData) {
		m_refusal = "the card holds no contact data";
		return false;
	}
	m_entry.name = !m_fn.empty() ? m_fn : std::string(first ? first : "") + (first && last ? " " : "") + (last ? last : "");
	return true;
}

} // namespace ct::contacts
