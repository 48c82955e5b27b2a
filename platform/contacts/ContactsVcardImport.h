// Stores the cards of a vCard file as new contacts of one address book, in
// one write transaction: every good card is stored, or none when the write
// fails; refused cards are listed with the reason.
#pragma once

#include "ContactsConnection.h"
#include "ContactsRecord.h"
#include "ContactsVcardReader.h"
#include "ContactsWriter.h"

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace ct::contacts {

struct VcardImportReport {
	// CONTACTS_ERROR_NONE, or why nothing was stored (errorText says it in words).
	int error = 0;
	std::string errorText;
	int cards = 0;                    // cards found in the file
	std::vector<int> contactIds;      // the stored contacts, in card order
	std::vector<std::string> refused; // "card 3 (line 40, Anna): why", one per refused card
};

class ContactsVcardImport {
public:
	static constexpr size_t kMaxFileBytes = 256u * 1024 * 1024;
	// More cards than this in one file are refused as a whole (split the file).
	static constexpr size_t kMaxCards = 50000;

	// Needs a connection on this thread (contacts_connect).
	static VcardImportReport importFile(const std::string& path, int addressBookId);
	static VcardImportReport importText(std::string_view text, int addressBookId);

	~ContactsVcardImport();
	ContactsVcardImport(const ContactsVcardImport&) = delete;
	ContactsVcardImport& operator=(const ContactsVcardImport&) = delete;

private:
	ContactsVcardImport(ContactsConnection& conn, int addressBookId);
	int __checkAddressBook(std::string* why);
	int __importAll(std::string_view text, WriteContext& ctx, VcardImportReport& report);
	int __store(VcardEntry& entry, ContactsWriter& writer, WriteContext& ctx, int* id);
	int __savePicture(const VcardPicture& picture, std::string* path);
	int __groupId(const std::string& name, ContactsWriter& writer, int* id);
	void __removeSavedPictures();

	ContactsConnection& m_conn;
	int m_addressBookId;
	std::vector<std::string> m_savedPictures;
	std::map<std::string, int> m_groupIds;
	// New group records get their ids at the commit, so they live until then.
	std::vector<std::unique_ptr<contacts_record_s>> m_newGroups;
};

} // namespace ct::contacts
