#include "ContactsVcardTypes.h"

#include "contacts_types.h"

#include <strings.h>

namespace ct::contacts {
namespace {

const std::vector<VcardTypeName> kNumberTypes = { { CONTACTS_NUMBER_TYPE_HOME, "HOME" },
	{ CONTACTS_NUMBER_TYPE_WORK, "WORK" }, { CONTACTS_NUMBER_TYPE_VOICE, "VOICE" }, { CONTACTS_NUMBER_TYPE_FAX, "FAX" },
	{ CONTACTS_NUMBER_TYPE_MSG, "MSG" }, { CONTACTS_NUMBER_TYPE_CELL, "CELL" }, { CONTACTS_NUMBER_TYPE_PAGER, "PAGER" },
	{ CONTACTS_NUMBER_TYPE_BBS, "BBS" }, { CONTACTS_NUMBER_TYPE_MODEM, "MODEM" }, { CONTACTS_NUMBER_TYPE_CAR, "CAR" },
	{ CONTACTS_NUMBER_TYPE_ISDN, "ISDN" }, { CONTACTS_NUMBER_TYPE_VIDEO, "VIDEO" }, { CONTACTS_NUMBER_TYPE_PCS, "PCS" },
	{ CONTACTS_NUMBER_TYPE_COMPANY_MAIN, "X-COMPANY-MAIN" }, { CONTACTS_NUMBER_TYPE_RADIO, "X-RADIO" },
	{ CONTACTS_NUMBER_TYPE_MAIN, "MAIN" }, { CONTACTS_NUMBER_TYPE_ASSISTANT, "X-ASSISTANT" } };

const std::vector<VcardTypeName> kEmailTypes = { { CONTACTS_EMAIL_TYPE_HOME, "HOME" },
	{ CONTACTS_EMAIL_TYPE_WORK, "WORK" }, { CONTACTS_EMAIL_TYPE_MOBILE, "X-MOBILE" } };

const std::vector<VcardTypeName> kAddressTypes = { { CONTACTS_ADDRESS_TYPE_HOME, "HOME" },
	{ CONTACTS_ADDRESS_TYPE_WORK, "WORK" }, { CONTACTS_ADDRESS_TYPE_DOM, "DOM" }, { CONTACTS_ADDRESS_TYPE_INTL, "INTL" },
	{ CONTACTS_ADDRESS_TYPE_POSTAL, "POSTAL" }, { CONTACTS_ADDRESS_TYPE_PARCEL, "PARCEL" } };

// URL types are values, not bits; HOME and WORK are the ones vCards name.
const std::vector<VcardTypeName> kUrlTypes = { { CONTACTS_URL_TYPE_HOME, "HOME" }, { CONTACTS_URL_TYPE_WORK, "WORK" } };

// Names other writers use for the same bits, read but never written.
const std::vector<VcardTypeName> kNumberAliases = { { CONTACTS_NUMBER_TYPE_CELL, "MOBILE" },
	{ CONTACTS_NUMBER_TYPE_CELL, "IPHONE" }, { CONTACTS_NUMBER_TYPE_VOICE, "TEXTPHONE" },
	{ CONTACTS_NUMBER_TYPE_MSG, "TEXT" } };
const std::vector<VcardTypeName> kEmailAliases = { { CONTACTS_EMAIL_TYPE_MOBILE, "CELL" } };

const std::vector<VcardMessenger> kMessengers = {
	{ CONTACTS_MESSENGER_TYPE_GOOGLE, "X-GOOGLE-TALK", "GoogleTalk", "xmpp" },
	{ CONTACTS_MESSENGER_TYPE_WLM, "X-MSN", "MSN", "msnim" },
	{ CONTACTS_MESSENGER_TYPE_YAHOO, "X-YAHOO", "Yahoo", "ymsgr" },
	{ CONTACTS_MESSENGER_TYPE_FACEBOOK, "", "Facebook", "xmpp" },
	{ CONTACTS_MESSENGER_TYPE_ICQ, "X-ICQ", "ICQ", "icq" },
	{ CONTACTS_MESSENGER_TYPE_AIM, "X-AIM", "AIM", "aim" },
	{ CONTACTS_MESSENGER_TYPE_QQ, "X-QQ", "QQ", "x-apple" },
	{ CONTACTS_MESSENGER_TYPE_JABBER, "X-JABBER", "Jabber", "xmpp" },
	{ CONTACTS_MESSENGER_TYPE_SKYPE, "X-SKYPE", "Skype", "skype" },
	{ CONTACTS_MESSENGER_TYPE_IRC, "", "IRC", "irc" },
};

// Property names of other writers for the same services.
const std::vector<std::pair<const char*, int>> kMessengerAliases = { { "X-SKYPE-USERNAME", CONTACTS_MESSENGER_TYPE_SKYPE },
	{ "X-GTALK", CONTACTS_MESSENGER_TYPE_GOOGLE }, { "X-GOOGLE TALK", CONTACTS_MESSENGER_TYPE_GOOGLE } };

const std::vector<std::pair<int, const char*>> kRelations = { { CONTACTS_RELATIONSHIP_TYPE_ASSISTANT, "Assistant" },
	{ CONTACTS_RELATIONSHIP_TYPE_BROTHER, "Brother" }, { CONTACTS_RELATIONSHIP_TYPE_CHILD, "Child" },
	{ CONTACTS_RELATIONSHIP_TYPE_DOMESTIC_PARTNER, "DomesticPartner" }, { CONTACTS_RELATIONSHIP_TYPE_FATHER, "Father" },
	{ CONTACTS_RELATIONSHIP_TYPE_FRIEND, "Friend" }, { CONTACTS_RELATIONSHIP_TYPE_MANAGER, "Manager" },
	{ CONTACTS_RELATIONSHIP_TYPE_MOTHER, "Mother" }, { CONTACTS_RELATIONSHIP_TYPE_PARENT, "Parent" },
	{ CONTACTS_RELATIONSHIP_TYPE_PARTNER, "Partner" }, { CONTACTS_RELATIONSHIP_TYPE_REFERRED_BY, "ReferredBy" },
	{ CONTACTS_RELATIONSHIP_TYPE_RELATIVE, "Relative" }, { CONTACTS_RELATIONSHIP_TYPE_SISTER, "Sister" },
	{ CONTACTS_RELATIONSHIP_TYPE_SPOUSE, "Spouse" } };

const std::vector<VcardTypeName>& tableOf(ContactsVcardTypes::Kind kind)
{
	switch (kind) {
	case ContactsVcardTypes::Kind::Number: return kNumberTypes;
	case ContactsVcardTypes::Kind::Email: return kEmailTypes;
	case ContactsVcardTypes::Kind::Address: return kAddressTypes;
	case ContactsVcardTypes::Kind::Url: return kUrlTypes;
	}
	return kUrlTypes;
}

const std::vector<VcardTypeName>& aliasesOf(ContactsVcardTypes::Kind kind)
{
	static const std::vector<VcardTypeName> none;
	if (kind == ContactsVcardTypes::Kind::Number)
		return kNumberAliases;
	return kind == ContactsVcardTypes::Kind::Email ? kEmailAliases : none;
}

bool same(const std::string& a, const char* b) { return strcasecmp(a.c_str(), b) == 0; }

// "_$!<Father>!$_" -> "Father"; other texts unchanged.
std::string bareLabel(const std::string& label)
{
	if (label.size() > 8 && label.compare(0, 4, "_$!<") == 0 && label.compare(label.size() - 4, 4, ">!$_") == 0)
		return label.substr(4, label.size() - 8);
	return label;
}

} // namespace

std::string ContactsVcardTypes::typeList(Kind kind, int type)
{
	std::string out;
	for (const VcardTypeName& t : tableOf(kind)) {
		bool has = kind == Kind::Url ? type == t.bit : (type & t.bit) != 0;
		if (has)
			out += (out.empty() ? "" : ",") + std::string(t.name);
	}
	return out;
}

int ContactsVcardTypes::typeBit(Kind kind, const std::string& name)
{
	for (const auto* table : { &tableOf(kind), &aliasesOf(kind) })
		for (const VcardTypeName& t : *table)
			if (same(name, t.name))
				return t.bit;
	return 0;
}

const VcardMessenger* ContactsVcardTypes::messengerOfType(int type)
{
	for (const VcardMessenger& m : kMessengers)
		if (m.type == type)
			return &m;
	return nullptr;
}

const VcardMessenger* ContactsVcardTypes::messengerOfProperty(const std::string& property)
{
	for (const VcardMessenger& m : kMessengers)
		if (*m.property && same(property, m.property))
			return &m;
	for (const auto& [name, type] : kMessengerAliases)
		if (same(property, name))
			return messengerOfType(type);
	return nullptr;
}

const VcardMessenger* ContactsVcardTypes::messengerOfService(const std::string& service)
{
	for (const VcardMessenger& m : kMessengers)
		if (same(service, m.service))
			return &m;
	if (same(service, "Google Talk") || same(service, "GTalk") || same(service, "Hangouts"))
		return messengerOfType(CONTACTS_MESSENGER_TYPE_GOOGLE);
	if (same(service, "Windows Live") || same(service, "WLM"))
		return messengerOfType(CONTACTS_MESSENGER_TYPE_WLM);
	return nullptr;
}

const VcardMessenger* ContactsVcardTypes::messengerOfScheme(const std::string& scheme)
{
	for (const VcardMessenger& m : kMessengers)
		if (same(scheme, m.scheme) && strcasecmp(m.scheme, "xmpp") != 0 && strcasecmp(m.scheme, "x-apple") != 0)
			return &m;
	if (same(scheme, "xmpp"))
		return messengerOfType(CONTACTS_MESSENGER_TYPE_JABBER);
	return nullptr;
}

const char* ContactsVcardTypes::relationLabel(int type)
{
	static const std::vector<std::string> labels = [] {
		std::vector<std::string> out;
		for (const auto& relation : kRelations)
			out.push_back("_$!<" + std::string(relation.second) + ">!$_");
		return out;
	}();
	for (size_t i = 0; i < kRelations.size(); ++i)
		if (kRelations[i].first == type)
			return labels[i].c_str();
	return nullptr;
}

int ContactsVcardTypes::relationType(const std::string& label)
{
	std::string bare = bareLabel(label);
	for (const auto& [type, name] : kRelations)
		if (same(bare, name))
			return type;
	if (same(bare, "Other"))
		return CONTACTS_RELATIONSHIP_TYPE_OTHER;
	if (same(bare, "Domestic partner"))
		return CONTACTS_RELATIONSHIP_TYPE_DOMESTIC_PARTNER;
	if (same(bare, "Referred by"))
		return CONTACTS_RELATIONSHIP_TYPE_REFERRED_BY;
	return -1;
}

} // namespace ct::contacts
