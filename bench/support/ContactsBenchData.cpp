#include "ContactsBenchData.h"

#include <contacts.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <random>
#include <string>
#include <unistd.h>
#include <vector>

namespace ct::bench {
namespace {

namespace fs = std::filesystem;

const char* kFirst[] = { "Anna", "James", "Maria", "Lukas", "Sofia", "Noah", "Emma", "Oliver", "Chloé", "Jürgen",
	"Zoë", "Mateo", "Aisha", "Omar", "Ольга", "Дмитрий", "Анна", "민준", "서연", "지호", "하은", "伟", "芳", "娜",
	"秀英", "أحمد", "فاطمة", "Ανδρέας", "Ελένη", "Ngọc", "Thảo", "Priya", "Arjun" };
const char* kLast[] = { "Smith", "Garcia", "Müller", "Rossi", "Dubois", "Novak", "Kowalski", "Johansson", "O'Brien",
	"Иванов", "Петрова", "김", "이", "박", "최", "王", "李", "张", "刘", "الحسن", "Παπαδόπουλος", "Nguyễn", "Trần",
	"Patel", "Sharma", "Tanaka", "Suzuki", "Silva", "Santos", "Kim" };
const char* kCities[] = { "Seoul", "Berlin", "Paris", "Lagos", "Lima", "Hanoi", "Austin", "Kyiv" };

contacts_record_h child(contacts_record_h parent, unsigned prop, const char* uri)
{
	contacts_record_h c = nullptr;
	contacts_record_create(uri, &c);
	contacts_record_add_child_record(parent, prop, c);
	return c;
}

// A real date between 1950 and 2009, YYYYMMDD.
int randomBirthday(std::mt19937& rng)
{
	int year = 1950 + static_cast<int>(rng() % 60);
	int month = 1 + static_cast<int>(rng() % 12);
	int day = 1 + static_cast<int>(rng() % 28);
	return year * 10000 + month * 100 + day;
}

contacts_record_h randomContact(std::mt19937& rng, const std::vector<int>& groups, int extraChildren)
{
	auto pick = [&](auto& arr) { return arr[rng() % (sizeof(arr) / sizeof(arr[0]))]; };
	contacts_record_h c = nullptr;
	contacts_record_create(_contacts_contact._uri, &c);
	contacts_record_h name = child(c, _contacts_contact.name, _contacts_name._uri);
	contacts_record_set_str(name, _contacts_name.first, pick(kFirst));
	contacts_record_set_str(name, _contacts_name.last, pick(kLast));
	int numbers = 1 + static_cast<int>(rng() % 3);
	for (int i = 0; i < numbers + extraChildren; ++i) {
		contacts_record_h n = child(c, _contacts_contact.number, _contacts_number._uri);
		std::string text = "+82 10 " + std::to_string(1000 + rng() % 9000) + " " + std::to_string(1000 + rng() % 9000);
		contacts_record_set_str(n, _contacts_number.number, text.c_str());
		contacts_record_set_int(n, _contacts_number.type, i == 0 ? CONTACTS_NUMBER_TYPE_CELL : CONTACTS_NUMBER_TYPE_HOME);
	}
	if (rng() % 10 < 6) {
		contacts_record_h e = child(c, _contacts_contact.email, _contacts_email._uri);
		std::string text = "user" + std::to_string(rng() % 1000000) + "@example.com";
		contacts_record_set_str(e, _contacts_email.email, text.c_str());
	}
	if (rng() % 10 < 2 || extraChildren) {
		contacts_record_h a = child(c, _contacts_contact.address, _contacts_address._uri);
		contacts_record_set_str(a, _contacts_address.locality, pick(kCities));
		contacts_record_set_str(a, _contacts_address.street, "1 Main Street");
	}
	if (rng() % 10 < 3 || extraChildren) {
		contacts_record_h ev = child(c, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(ev, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
		contacts_record_set_int(ev, _contacts_event.date, randomBirthday(rng));
	}
	if (!groups.empty() && rng() % 5 == 0) {
		contacts_record_h r = child(c, _contacts_contact.group_relation, _contacts_group_relation._uri);
		contacts_record_set_int(r, _contacts_group_relation.group_id, groups[rng() % groups.size()]);
	}
	return c;
}

std::vector<int> makeGroups()
{
	std::vector<int> ids;
	for (const char* name : { "Family", "Friends", "Work", "Gym", "School" }) {
		contacts_record_h g = nullptr;
		contacts_record_create(_contacts_group._uri, &g);
		contacts_record_set_str(g, _contacts_group.name, name);
		int id = 0;
		if (contacts_db_insert_record(g, &id) == CONTACTS_ERROR_NONE)
			ids.push_back(id);
		contacts_record_destroy(g, true);
	}
	return ids;
}

int insertBatch(std::vector<contacts_record_h>& batch)
{
	contacts_list_h list = nullptr;
	contacts_list_create(&list);
	for (contacts_record_h r : batch)
		contacts_list_add(list, r);
	int* ids = nullptr;
	int count = 0;
	int err = contacts_db_insert_records(list, &ids, &count);
	int first = err == CONTACTS_ERROR_NONE && count > 0 ? ids[0] : 0;
	free(ids);
	contacts_list_destroy(list, true);
	batch.clear();
	return first;
}

int personOf(int contactId)
{
	contacts_record_h c = nullptr;
	int person = 0;
	if (contacts_db_get_record(_contacts_contact._uri, contactId, &c) == CONTACTS_ERROR_NONE) {
		contacts_record_get_int(c, _contacts_contact.person_id, &person);
		contacts_record_destroy(c, true);
	}
	return person;
}

// Person 1: ten linked contacts with 12+ children each.
int makeBigPerson(std::mt19937& rng, const std::vector<int>& groups)
{
	std::vector<contacts_record_h> batch;
	for (int i = 0; i < 10; ++i)
		batch.push_back(randomContact(rng, groups, 8));
	int first = insertBatch(batch);
	int base = personOf(first);
	for (int i = 1; i < 10; ++i)
		contacts_person_link_person(base, personOf(first + i));
	return base;
}

void generate(const std::string& dir, int persons)
{
	setenv("CONTACTS_DATA_DIR", dir.c_str(), 1);
	if (contacts_connect() != CONTACTS_ERROR_NONE) {
		fprintf(stderr, "cannot create the bench database in %s\n", dir.c_str());
		exit(1);
	}
	std::mt19937 rng(12345);
	std::vector<int> groups = makeGroups();
	makeBigPerson(rng, groups);
	// 5% of the persons hold two linked contacts.
	int linkedPairs = persons / 20;
	int contacts = persons - 1 + linkedPairs;
	std::vector<contacts_record_h> batch;
	for (int i = 0; i < contacts; ++i) {
		batch.push_back(randomContact(rng, groups, 0));
		if (batch.size() == 1000)
			insertBatch(batch);
	}
	if (!batch.empty())
		insertBatch(batch);
	// Contacts 11, 12, ... : link pairs (11+2k, 12+2k).
	for (int k = 0; k < linkedPairs; ++k)
		contacts_person_link_person(personOf(11 + 2 * k), personOf(12 + 2 * k));
	contacts_disconnect();
}

// Bumped whenever the generator changes, so that an old cache is not reused.
const char* kGeneratorVersion = "g2";

} // namespace

BenchDatabase::~BenchDatabase()
{
	if (dataDir.empty())
		return;
	std::error_code ec;
	fs::remove_all(dataDir, ec);
}

BenchDatabase::BenchDatabase(BenchDatabase&& other) noexcept
{
	*this = std::move(other);
}

BenchDatabase& BenchDatabase::operator=(BenchDatabase&& other) noexcept
{
	if (this == &other)
		return *this;
	if (!dataDir.empty()) {
		std::error_code ec;
		fs::remove_all(dataDir, ec);
	}
	dataDir = std::move(other.dataDir);
	dbPath = std::move(other.dbPath);
	bigPersonId = other.bigPersonId;
	persons = other.persons;
	other.dataDir.clear();
	return *this;
}

long residentBytes()
{
	long pages = 0, resident = 0;
	FILE* f = fopen("/proc/self/statm", "r");
	if (f) {
		if (fscanf(f, "%ld %ld", &pages, &resident) != 2)
			resident = 0;
		fclose(f);
	}
	return resident * sysconf(_SC_PAGESIZE);
}

BenchDatabase ensureDatabase(int persons)
{
	const char* cacheEnv = getenv("CONTACTS_BENCH_CACHE");
	fs::path cache = fs::path(cacheEnv ? cacheEnv : "/tmp/contacts-bench-cache")
		/ ("persons-" + std::to_string(persons) + "-" + kGeneratorVersion);
	fs::path cached = cache / "contacts.db";
	if (!fs::exists(cached)) {
		fs::path building = cache.string() + ".building-" + std::to_string(getpid());
		fs::remove_all(building);
		fs::create_directories(building);
		fprintf(stderr, "generating %d persons into %s ...\n", persons, cache.c_str());
		generate(building.string(), persons);
		fs::remove_all(cache);
		fs::rename(building, cache);
	}
	char pattern[] = "/tmp/contacts-bench-XXXXXX";
	BenchDatabase out;
	out.dataDir = mkdtemp(pattern);
	out.dbPath = out.dataDir + "/contacts.db";
	for (const auto& entry : fs::directory_iterator(cache))
		fs::copy(entry.path(), fs::path(out.dataDir) / entry.path().filename());
	setenv("CONTACTS_DATA_DIR", out.dataDir.c_str(), 1);
	out.bigPersonId = 1;
	out.persons = persons;
	return out;
}

int firstContactId(int personId, contacts_match_int_flag_e match)
{
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	contacts_query_create(_contacts_simple_contact._uri, &query);
	contacts_filter_create(_contacts_simple_contact._uri, &filter);
	contacts_filter_add_int(filter, _contacts_simple_contact.person_id, match, personId);
	contacts_query_set_filter(query, filter);
	contacts_list_h list = nullptr;
	contacts_db_get_records_with_query(query, 0, 1, &list);
	contacts_record_h record = nullptr;
	int id = 0;
	if (contacts_list_get_current_record_p(list, &record) == CONTACTS_ERROR_NONE)
		contacts_record_get_int(record, _contacts_simple_contact.id, &id);
	contacts_list_destroy(list, true);
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	return id;
}

void touchContact(int contactId, int round)
{
	contacts_record_h contact = nullptr;
	if (contacts_db_get_record(_contacts_contact._uri, contactId, &contact) != CONTACTS_ERROR_NONE)
		return;
	contacts_record_set_str(contact, _contacts_contact.uid, std::to_string(round).c_str());
	contacts_db_update_record(contact);
	contacts_record_destroy(contact, true);
}

} // namespace ct::bench
