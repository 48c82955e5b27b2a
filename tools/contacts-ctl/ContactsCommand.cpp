// contacts-ctl contacts add|list|link|unlink|delete: change the contacts
// database from outside while a screen is open.
#include "CtlCommand.h"
#include "CtlText.h"

#include <contacts.h>

#include <cstdio>

namespace {

using namespace ct::ctl;

const char kName[] = "contacts";

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

contacts_record_h addChild(contacts_record_h contact, unsigned prop, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(contact, prop, child);
	return child;
}

// add FIRST [LAST] [number=N]... [email=E]... [book=ID]
int add(const Args& args)
{
	if (args.size() < 2)
		return usageError(kName, "add needs a first name");
	contacts_record_h contact = nullptr;
	contacts_record_create(_contacts_contact._uri, &contact);
	contacts_record_h name = addChild(contact, _contacts_contact.name, _contacts_name._uri);
	int rc = contacts_record_set_str(name, _contacts_name.first, args[1].c_str());
	for (size_t i = 2; i < args.size() && rc == CONTACTS_ERROR_NONE; ++i) {
		const std::string& a = args[i];
		int book = 0;
		if (a.rfind("number=", 0) == 0) {
			contacts_record_h n = addChild(contact, _contacts_contact.number, _contacts_number._uri);
			contacts_record_set_int(n, _contacts_number.type, CONTACTS_NUMBER_TYPE_CELL);
			rc = contacts_record_set_str(n, _contacts_number.number, a.c_str() + 7);
		} else if (a.rfind("email=", 0) == 0) {
			rc = contacts_record_set_str(addChild(contact, _contacts_contact.email, _contacts_email._uri),
				_contacts_email.email, a.c_str() + 6);
		} else if (a.rfind("book=", 0) == 0 && parseInt(a.substr(5), &book)) {
			rc = contacts_record_set_int(contact, _contacts_contact.address_book_id, book);
		} else if (i == 2) {
			rc = contacts_record_set_str(name, _contacts_name.last, a.c_str());
		} else {
			contacts_record_destroy(contact, true);
			return usageError(kName, "unknown argument '" + a + "'");
		}
	}
	int id = 0;
	if (rc == CONTACTS_ERROR_NONE)
		rc = contacts_db_insert_record(contact, &id);
	int person = 0;
	contacts_record_get_int(contact, _contacts_contact.person_id, &person);
	contacts_record_destroy(contact, true);
	if (rc != CONTACTS_ERROR_NONE)
		return fail("contacts add failed (" + std::to_string(rc) + ")");
	printf("person %d contact %d\n", person, id);
	return kExitOk;
}

// list [TEXT]: persons whose display name contains TEXT, by name.
int list(const Args& args)
{
	contacts_query_h query = nullptr;
	contacts_query_create(_contacts_person._uri, &query);
	contacts_filter_h filter = nullptr;
	if (args.size() > 1) {
		contacts_filter_create(_contacts_person._uri, &filter);
		contacts_filter_add_str(filter, _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, args[1].c_str());
		contacts_query_set_filter(query, filter);
	}
	contacts_query_set_sort(query, _contacts_person.display_name, true);
	contacts_list_h records = nullptr;
	int rc = contacts_db_get_records_with_query(query, 0, 0, &records);
	int count = 0;
	contacts_list_get_count(records, &count);
	for (int i = 0; i < count; ++i, contacts_list_next(records)) {
		contacts_record_h r = nullptr;
		contacts_list_get_current_record_p(records, &r);
		int id = 0, links = 0;
		char* name = nullptr;
		contacts_record_get_int(r, _contacts_person.id, &id);
		contacts_record_get_int(r, _contacts_person.link_count, &links);
		contacts_record_get_str_p(r, _contacts_person.display_name, &name);
		printf("%d\t%s\t%d contact(s)\n", id, name ? name : "", links);
	}
	if (records)
		contacts_list_destroy(records, true);
	if (filter)
		contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	return rc == CONTACTS_ERROR_NONE ? kExitOk : fail("contacts list failed (" + std::to_string(rc) + ")");
}

int twoIds(const Args& args, int* a, int* b)
{
	if (args.size() != 3 || !parseInt(args[1], a) || !parseInt(args[2], b))
		return usageError(kName, args[0] + " needs two ids");
	return kExitOk;
}

int runContacts(const Args& args)
{
	if (args.empty())
		return usageError(kName, "missing verb");
	Connection connection;
	if (connection.status() != CONTACTS_ERROR_NONE)
		return fail("cannot open the contacts database (" + std::to_string(connection.status()) + ")");
	const std::string& verb = args[0];
	if (verb == "add")
		return add(args);
	if (verb == "list")
		return list(args);
	int a = 0, b = 0, rc = 0;
	if (verb == "link" || verb == "unlink") {
		int usage = twoIds(args, &a, &b);
		if (usage != kExitOk)
			return usage;
		int newPerson = 0;
		rc = verb == "link" ? contacts_person_link_person(a, b) : contacts_person_unlink_contact(a, b, &newPerson);
		if (rc == CONTACTS_ERROR_NONE && verb == "unlink")
			printf("person %d\n", newPerson);
	} else if (verb == "delete") {
		if (args.size() != 2 || !parseInt(args[1], &a))
			return usageError(kName, "delete needs a person id");
		rc = contacts_db_delete_record(_contacts_person._uri, a);
	} else {
		return usageError(kName, "unknown verb '" + verb + "'");
	}
	return rc == CONTACTS_ERROR_NONE ? kExitOk : fail("contacts " + verb + " failed (" + std::to_string(rc) + ")");
}

CtlCommandRegistration registration{ { kName,
	"contacts add FIRST [LAST] [number=N]... [email=E]... [book=ID]\n"
	"contacts list [TEXT]\n"
	"contacts link BASE_PERSON PERSON\n"
	"contacts unlink PERSON CONTACT\n"
	"contacts delete PERSON",
	runContacts } };

} // namespace
