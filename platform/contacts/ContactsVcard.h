// Writes vCard 3.0 text for contacts, persons and my profile.
#pragma once

#include "ContactsRecord.h"

#include <string>
#include <vector>

namespace ct::contacts {

class ContactsVcard {
public:
	// One vCard for the merged fields of `sources` (a person's contacts, or
	// one contact or profile): FN is displayName, N comes from the first name
	// found. CRLF line ends, lines folded at 75 bytes, values escaped.
	static std::string make(const std::vector<const contacts_record_s*>& sources, const std::string& displayName);
	// The text escaped for a vCard 3.0 value.
	static std::string escape(const char* text);
	// The line folded into 75-byte pieces (never splitting a UTF-8 character).
	static std::string fold(const std::string& line);
};

} // namespace ct::contacts
