// Writes vCard 3.0 text for contacts, persons and my profile.
#pragma once

#include "ContactsRecord.h"

#include <string>
#include <vector>

namespace ct::contacts {

class ContactsVcard {
public:
	// Largest picture file embedded (base64) in a card; bigger ones are left
	// out, logged, so that a card stays small enough to send.
	static constexpr size_t kMaxPictureBytes = 1024 * 1024;

	// One vCard for the merged fields of `sources` (a person's contacts, or
	// one contact or profile): FN is displayName, N and the phonetic name come
	// from the first name found. Every stored field is written: numbers,
	// e-mails, addresses, web sites with their types and custom labels,
	// messengers, relationships, events, notes, nicknames, companies,
	// social-network profiles, pictures (embedded), groups (CATEGORIES) and
	// the profile status.
	// CRLF line ends, lines folded at 75 bytes, values escaped.
	static std::string make(const std::vector<const contacts_record_s*>& sources, const std::string& displayName);
	// The text escaped for a vCard 3.0 value.
	static std::string escape(const char* text);
	// The line folded into 75-byte pieces (never splitting a UTF-8 character).
	static std::string fold(const std::string& line);
	// "JPEG", "PNG", "GIF", "BMP" or "WEBP" by the picture's first bytes; null otherwise.
	static const char* pictureType(const std::string& bytes);
};

} // namespace ct::contacts
