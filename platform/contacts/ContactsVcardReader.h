// Turns one card of the vCard lexer into a new contact record, or tells why
// the card cannot be stored as it is.
#pragma once

#include "ContactsVcardLexer.h"
#include "ContactsVcardTypes.h"
#include "contacts_types.h"

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace ct::contacts {

struct VcardRecordDeleter {
	void operator()(contacts_record_h record) const;
};
using VcardRecordPtr = std::unique_ptr<contacts_record_s, VcardRecordDeleter>;

// A decoded picture: its bytes and their format ("JPEG", "PNG", ...).
struct VcardPicture {
	std::string bytes;
	const char* format = nullptr;
};

// What one card holds. Pictures and groups need the store (files, group
// ids), so they are kept beside the record for the importer.
struct VcardEntry {
	VcardRecordPtr contact;             // a contacts.view.contact record
	std::string name;                   // FN, else the name, for reports
	std::vector<VcardPicture> pictures; // PHOTO lines in order
	// LOGO lines: the company record (owned by contact) and its picture.
	std::vector<std::pair<contacts_record_h, VcardPicture>> logos;
	std::vector<std::string> groups; // CATEGORIES
};

class ContactsVcardReader {
public:
	// Largest picture a card may carry (decoded).
	static constexpr size_t kMaxPictureBytes = 4 * 1024 * 1024;

	// Reads the card into `entry`. False, with the reason in *refusal, when a
	// value cannot be stored faithfully (bad charset or UTF-8, bad base64,
	// a picture too big or of no known format, a date that is not one) or
	// the card holds nothing to store. Unknown properties are skipped.
	static bool read(const VcardRawCard& card, VcardEntry& entry, std::string* refusal);

private:
	ContactsVcardReader(const VcardRawCard& card, VcardEntry& entry);
	bool __read();
	bool __readProperty(const VcardProperty& p);
	bool __text(const VcardProperty& p, std::string* out);
	bool __components(const VcardProperty& p, std::vector<std::string>* out, char separator = ';');
	bool __setStr(contacts_record_h record, unsigned property, const std::string& value);
	bool __refuse(const VcardProperty& p, const std::string& why);
	contacts_record_h __child(unsigned property, const char* uri);
	contacts_record_h __name();
	contacts_record_h __company(const std::string& group, const char* field);
	std::string __groupLabel(const std::string& group) const;
	bool __readName(const VcardProperty& p);
	bool __readTyped(const VcardProperty& p);
	struct TypedValue {
		int type = 0;
		bool pref = false;
		std::string label;
	};
	TypedValue __typedValue(const VcardProperty& p, ContactsVcardTypes::Kind kind) const;
	bool __addNumber(const std::string& number, const TypedValue& typed);
	bool __addEmail(const std::string& email, const TypedValue& typed);
	bool __addAddress(const std::vector<std::string>& parts, const TypedValue& typed);
	bool __addUrl(const std::string& url, const TypedValue& typed);
	bool __readCompany(const VcardProperty& p);
	bool __readEvent(const VcardProperty& p);
	bool __readMessenger(const VcardProperty& p);
	bool __readRelationship(const VcardProperty& p);
	bool __readSocialProfile(const VcardProperty& p);
	bool __readPicture(const VcardProperty& p, VcardPicture* picture);
	bool __readList(const VcardProperty& p);
	bool __finish();

	const VcardRawCard& m_card;
	VcardEntry& m_entry;
	std::string m_refusal;
	std::string m_fn;
	contacts_record_h m_nameRecord = nullptr;
	std::map<std::string, contacts_record_h> m_companies; // by group ("" for ungrouped lines)
	bool m_hasData = false;
};

} // namespace ct::contacts
