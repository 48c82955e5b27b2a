// contacts-ctl vcard export|import: a person out as a vCard, a vCard file in
// as new contacts.
#include "CtlCommand.h"
#include "CtlText.h"

#include "ContactsVcardImport.h"

#include <contacts.h>

#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

using namespace ct::ctl;

const char kName[] = "vcard";

class Connection {
public:
	Connection() : m_status(contacts_connect()) {}
	~Connection()
	{
		if (m_status == CONTACTS_ERROR_NONE)
			contacts_disconnect();
	}
	Connection(const Connection&) = delete;
	Connection& operator=(const Connection&) = delete;
	int status() const { return m_status; }

private:
	int m_status;
};

// Writes beside the target and renames, so a failed write leaves no half file.
bool writeFile(const std::string& path, const std::string& text)
{
	std::string temporary = path + ".part";
	FILE* out = fopen(temporary.c_str(), "wb");
	if (!out)
		return false;
	bool ok = fwrite(text.data(), 1, text.size(), out) == text.size();
	ok = fclose(out) == 0 && ok;
	ok = ok && rename(temporary.c_str(), path.c_str()) == 0;
	if (!ok)
		remove(temporary.c_str());
	return ok;
}

int exportPerson(const Args& args)
{
	int personId = 0;
	if (args.size() < 2 || args.size() > 3 || !parseInt(args[1], &personId))
		return usageError(kName, "export needs a person id");
	contacts_record_h person = nullptr;
	int rc = contacts_db_get_record(_contacts_person._uri, personId, &person);
	if (rc != CONTACTS_ERROR_NONE)
		return fail("no person " + args[1] + " (" + std::to_string(rc) + ")");
	char* stream = nullptr;
	rc = contacts_vcard_make_from_person(person, &stream);
	contacts_record_destroy(person, true);
	if (rc != CONTACTS_ERROR_NONE)
		return fail("vcard export failed (" + std::to_string(rc) + ")");
	std::string text = stream;
	free(stream);
	if (args.size() == 2) {
		fwrite(text.data(), 1, text.size(), stdout);
		return kExitOk;
	}
	return writeFile(args[2], text) ? kExitOk : fail("cannot write " + args[2]);
}

int importFile(const Args& args)
{
	int book = 0;
	if (args.size() < 2 || args.size() > 3)
		return usageError(kName, "import needs a file");
	if (args.size() == 3 && (args[2].rfind("book=", 0) != 0 || !parseInt(args[2].substr(5), &book)))
		return usageError(kName, "unknown argument '" + args[2] + "'");
	ct::contacts::VcardImportReport report = ct::contacts::ContactsVcardImport::importFile(args[1], book);
	if (report.error != CONTACTS_ERROR_NONE)
		return fail("cannot import " + args[1] + ": " + report.errorText);
	for (const std::string& refused : report.refused)
		printf("refused %s\n", refused.c_str());
	printf("imported %zu of %d cards into address book %d\n", report.contactIds.size(), report.cards, book);
	return report.refused.empty() ? kExitOk : kExitFailed;
}

int runVcard(const Args& args)
{
	if (args.empty())
		return usageError(kName, "missing verb");
	if (args[0] != "export" && args[0] != "import")
		return usageError(kName, "unknown verb '" + args[0] + "'");
	Connection connection;
	if (connection.status() != CONTACTS_ERROR_NONE)
		return fail("cannot open the contacts database (" + std::to_string(connection.status()) + ")");
	return args[0] == "export" ? exportPerson(args) : importFile(args);
}

CtlCommandRegistration registration{ { kName,
	"vcard export PERSON [FILE]    (to standard output without FILE)\n"
	"vcard import FILE [book=ID]   (new contacts in address book ID, 0 the phone; exit 1 when a card was refused)",
	runVcard } };

} // namespace
