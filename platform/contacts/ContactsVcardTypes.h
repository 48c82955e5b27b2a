// The names that vCards give to the service's field types, shared by the
// vCard maker and reader so that a card written here reads back the same.
#pragma once

#include <string>
#include <vector>

namespace ct::contacts {

// A service type bit and the TYPE parameter value written for it.
struct VcardTypeName {
	int bit;
	const char* name;
};

// A messenger type: the property written for it (empty: IMPP), the service
// name of IMPP's X-SERVICE-TYPE and the scheme of an IMPP value.
struct VcardMessenger {
	int type;
	const char* property;
	const char* service;
	const char* scheme;
};

class ContactsVcardTypes {
public:
	enum class Kind { Number, Email, Address, Url };

	// TYPE parameter values for a type bit set, comma separated ("" for none).
	static std::string typeList(Kind kind, int type);
	// The bit of a TYPE value (any case), 0 when it has none.
	static int typeBit(Kind kind, const std::string& name);

	static const VcardMessenger* messengerOfType(int type);
	// By property name ("X-SKYPE"), service name or IMPP scheme, any case.
	static const VcardMessenger* messengerOfProperty(const std::string& property);
	static const VcardMessenger* messengerOfService(const std::string& service);
	static const VcardMessenger* messengerOfScheme(const std::string& scheme);

	// The address-book label of a relationship type ("_$!<Father>!$_"),
	// null for other and custom types.
	static const char* relationLabel(int type);
	// The type of a label ("_$!<Father>!$_" or "father"), -1 when unknown.
	static int relationType(const std::string& label);

	// Label of an anniversary and of an other event in grouped X-ABDATE lines.
	static const char* anniversaryLabel() { return "_$!<Anniversary>!$_"; }
	static const char* otherLabel() { return "_$!<Other>!$_"; }
};

} // namespace ct::contacts
