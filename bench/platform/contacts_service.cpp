// The contacts service on a generated database (100,000 persons unless
// CONTACTS_BENCH_PERSONS says otherwise), each figure next to a hand-written
// bare-SQLite lower bound for the same work.
#include "ContactsBenchData.h"
#include "SqliteDatabase.h"

#include <Ecore.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <filesystem>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

ct::bench::BenchDatabase g_db;

const char* kChildTables[] = { "names", "images", "companies", "notes", "numbers", "emails", "events", "messengers",
	"addresses", "urls", "nicknames", "relationships", "group_relations" };

void BM_LoadPerson_Service(benchmark::State& state)
{
	for (auto _ : state) {
		contacts_record_h person = nullptr;
		contacts_db_get_record(_contacts_person._uri, g_db.bigPersonId, &person);
		contacts_query_h query = nullptr;
		contacts_filter_h filter = nullptr;
		contacts_query_create(_contacts_contact._uri, &query);
		contacts_filter_create(_contacts_contact._uri, &filter);
		contacts_filter_add_int(filter, _contacts_contact.person_id, CONTACTS_MATCH_EQUAL, g_db.bigPersonId);
		contacts_query_set_filter(query, filter);
		unsigned ids[] = { _contacts_contact.id };
		contacts_query_set_projection(query, ids, 1);
		contacts_list_h list = nullptr;
		contacts_db_get_records_with_query(query, 0, 0, &list);
		int count = 0, children = 0;
		contacts_list_get_count(list, &count);
		for (int i = 0; i < count; ++i) {
			contacts_record_h r = nullptr;
			contacts_list_get_current_record_p(list, &r);
			int id = 0;
			contacts_record_get_int(r, _contacts_contact.id, &id);
			contacts_record_h contact = nullptr;
			contacts_db_get_record(_contacts_contact._uri, id, &contact);
			for (unsigned prop : { _contacts_contact.number, _contacts_contact.email, _contacts_contact.address,
					 _contacts_contact.event, _contacts_contact.name, _contacts_contact.image }) {
				int n = 0;
				contacts_record_get_child_record_count(contact, prop, &n);
				children += n;
			}
			contacts_record_destroy(contact, true);
			contacts_list_next(list);
		}
		benchmark::DoNotOptimize(children);
		state.counters["contacts"] = count;
		state.counters["children"] = children;
		contacts_list_destroy(list, true);
		contacts_filter_destroy(filter);
		contacts_query_destroy(query);
		contacts_record_destroy(person, true);
	}
}

void BM_LoadPerson_BareSqlite(benchmark::State& state)
{
	ct::db::Database db;
	db.open(g_db.dbPath, ct::db::OpenMode::ReadOnly);
	ct::db::Statement person = db.prepare("SELECT * FROM persons WHERE id = ?");
	ct::db::Statement contacts = db.prepare("SELECT * FROM contacts WHERE person_id = ? ORDER BY id");
	std::vector<ct::db::Statement> children;
	for (const char* t : kChildTables)
		children.push_back(db.prepare((std::string("SELECT * FROM ") + t + " WHERE contact_id = ? AND owner = 0 ORDER BY id").c_str()));
	for (auto _ : state) {
		int rows = 0;
		person.reset();
		person.bind(1, g_db.bigPersonId);
		while (person.step() == SQLITE_ROW)
			benchmark::DoNotOptimize(person.columnTextPtr(1));
		contacts.reset();
		contacts.bind(1, g_db.bigPersonId);
		while (contacts.step() == SQLITE_ROW) {
			int id = contacts.columnInt(0);
			for (auto& st : children) {
				st.reset();
				st.bind(1, id);
				while (st.step() == SQLITE_ROW) {
					for (int c = 0; c < sqlite3_column_count(st.handle()); ++c)
						benchmark::DoNotOptimize(st.columnTextPtr(c));
					++rows;
				}
			}
		}
		state.counters["children"] = rows;
	}
}

void searchService(benchmark::State& state, const char* text)
{
	for (auto _ : state) {
		contacts_query_h query = nullptr;
		contacts_filter_h filter = nullptr;
		contacts_query_create(_contacts_person._uri, &query);
		contacts_filter_create(_contacts_person._uri, &filter);
		contacts_filter_add_str(filter, _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, text);
		contacts_query_set_filter(query, filter);
		contacts_query_set_sort(query, _contacts_person.display_name, true);
		contacts_list_h list = nullptr;
		contacts_db_get_records_with_query(query, 0, 10, &list);
		int count = 0;
		contacts_list_get_count(list, &count);
		state.counters["found"] = count;
		contacts_list_destroy(list, true);
		contacts_filter_destroy(filter);
		contacts_query_destroy(query);
	}
}

void searchBare(benchmark::State& state, const char* text)
{
	ct::db::Database db;
	db.open(g_db.dbPath, ct::db::OpenMode::ReadOnly);
	ct::db::Statement st = db.prepare("SELECT * FROM persons WHERE id IN (SELECT rowid FROM persons_fts WHERE "
		"persons_fts MATCH ?) ORDER BY display_name LIMIT 10");
	std::string phrase = std::string("\"") + text + "\"";
	for (auto _ : state) {
		st.reset();
		st.bind(1, phrase);
		int count = 0;
		while (st.step() == SQLITE_ROW)
			++count;
		state.counters["found"] = count;
	}
}

void BM_SearchContains_Service_Common(benchmark::State& s) { searchService(s, "ann"); }
void BM_SearchContains_Service_Rare(benchmark::State& s) { searchService(s, "na Smi"); }
void BM_SearchContains_Service_Cyrillic(benchmark::State& s) { searchService(s, "етр"); }
void BM_SearchContains_Service_None(benchmark::State& s) { searchService(s, "qxz"); }
void BM_SearchContains_Service_Short(benchmark::State& s) { searchService(s, "an"); }
void BM_SearchContains_Bare_Common(benchmark::State& s) { searchBare(s, "ann"); }
void BM_SearchContains_Bare_None(benchmark::State& s) { searchBare(s, "qxz"); }

contacts_record_h contactWith20Children(int i)
{
	contacts_record_h c = nullptr;
	contacts_record_create(_contacts_contact._uri, &c);
	auto add = [&](unsigned prop, const char* uri) {
		contacts_record_h child = nullptr;
		contacts_record_create(uri, &child);
		contacts_record_add_child_record(c, prop, child);
		return child;
	};
	contacts_record_h name = add(_contacts_contact.name, _contacts_name._uri);
	contacts_record_set_str(name, _contacts_name.first, ("Bench" + std::to_string(i)).c_str());
	for (int n = 0; n < 10; ++n)
		contacts_record_set_str(add(_contacts_contact.number, _contacts_number._uri), _contacts_number.number, "+1 555 0100");
	for (int n = 0; n < 5; ++n)
		contacts_record_set_str(add(_contacts_contact.email, _contacts_email._uri), _contacts_email.email, "a@b.c");
	for (int n = 0; n < 4; ++n)
		contacts_record_set_str(add(_contacts_contact.url, _contacts_url._uri), _contacts_url.url, "http://x");
	return c;
}

void BM_InsertContact20_Service(benchmark::State& state)
{
	int i = 0;
	for (auto _ : state) {
		state.PauseTiming();
		contacts_record_h c = contactWith20Children(i++);
		state.ResumeTiming();
		contacts_db_insert_record(c, nullptr);
		state.PauseTiming();
		contacts_record_destroy(c, true);
		state.ResumeTiming();
	}
}

void BM_InsertContact20_BareSqlite(benchmark::State& state)
{
	ct::db::Database db;
	db.open(g_db.dbPath);
	ct::db::Statement person = db.prepare("INSERT INTO persons(display_name) VALUES (?)");
	ct::db::Statement contact = db.prepare("INSERT INTO contacts(person_id, display_name) VALUES (?, ?)");
	ct::db::Statement name = db.prepare("INSERT INTO names(contact_id, first) VALUES (?, ?)");
	ct::db::Statement number = db.prepare("INSERT INTO numbers(contact_id, number) VALUES (?, ?)");
	for (auto _ : state) {
		ct::db::Transaction tx(db);
		person.reset();
		person.bind(1, "Bare").run();
		int64_t personId = db.lastInsertRowId();
		contact.reset();
		contact.bind(1, personId).bind(2, "Bare").run();
		int64_t contactId = db.lastInsertRowId();
		name.reset();
		name.bind(1, contactId).bind(2, "Bare").run();
		for (int n = 0; n < 19; ++n) {
			number.reset();
			number.bind(1, contactId).bind(2, "+1 555 0100").run();
		}
		tx.commit();
	}
}

void BM_Insert10000Contacts_Service(benchmark::State& state)
{
	for (auto _ : state) {
		for (int i = 0; i < 10000; ++i) {
			state.PauseTiming();
			contacts_record_h c = contactWith20Children(i);
			state.ResumeTiming();
			contacts_db_insert_record(c, nullptr);
			state.PauseTiming();
			contacts_record_destroy(c, true);
			state.ResumeTiming();
		}
	}
}

struct Flag {
	bool hit = false;
	static void cb(const char*, void* data) { static_cast<Flag*>(data)->hit = true; }
};

void BM_ChangeCallback_SameProcess(benchmark::State& state)
{
	Flag flag;
	contacts_db_add_changed_cb(_contacts_person._uri, Flag::cb, &flag);
	int maxIterations = 0;
	for (auto _ : state) {
		flag.hit = false;
		contacts_record_h c = contactWith20Children(0);
		contacts_db_insert_record(c, nullptr);
		contacts_record_destroy(c, true);
		int iterations = 0;
		while (!flag.hit && iterations < 100) {
			ecore_main_loop_iterate();
			++iterations;
		}
		maxIterations = std::max(maxIterations, iterations);
	}
	state.counters["max_loop_iterations"] = maxIterations;
	contacts_db_remove_changed_cb(_contacts_person._uri, Flag::cb, &flag);
}

void BM_ChangeCallback_OtherProcess(benchmark::State& state)
{
	Flag flag;
	contacts_db_add_changed_cb(_contacts_person._uri, Flag::cb, &flag);
	double worst = 0;
	for (auto _ : state) {
		flag.hit = false;
		pid_t child = fork();
		if (child == 0) {
			contacts_connect();
			contacts_record_h c = contactWith20Children(0);
			contacts_db_insert_record(c, nullptr);
			_exit(0);
		}
		int status = 0;
		waitpid(child, &status, 0);
		double start = ecore_time_get();
		while (!flag.hit && ecore_time_get() - start < 5) {
			ecore_main_loop_iterate();
			usleep(500);
		}
		double elapsed = ecore_time_get() - start;
		worst = std::max(worst, elapsed);
		state.SetIterationTime(elapsed);
	}
	state.counters["worst_s"] = worst;
	contacts_db_remove_changed_cb(_contacts_person._uri, Flag::cb, &flag);
}

void BM_ThousandWrites_NoVersionLost(benchmark::State& state)
{
	for (auto _ : state) {
		int before = 0, after = 0;
		contacts_db_get_current_version(&before);
		for (int i = 0; i < 1000; ++i) {
			contacts_record_h c = contactWith20Children(i);
			contacts_db_insert_record(c, nullptr);
			contacts_record_destroy(c, true);
		}
		contacts_db_get_current_version(&after);
		contacts_list_h changes = nullptr;
		int current = 0, count = 0;
		contacts_db_get_changes_by_version(_contacts_contact_updated_info._uri, -1, before, &changes, &current);
		contacts_list_get_count(changes, &count);
		contacts_list_destroy(changes, true);
		state.counters["versions"] = after - before;
		state.counters["changes"] = count;
	}
}

} // namespace

#define CT_MEDIAN(b) BENCHMARK(b)->Unit(benchmark::kMicrosecond)->Repetitions(5)->ReportAggregatesOnly(true)
CT_MEDIAN(BM_LoadPerson_Service);
CT_MEDIAN(BM_LoadPerson_BareSqlite);
CT_MEDIAN(BM_SearchContains_Service_Common);
CT_MEDIAN(BM_SearchContains_Service_Rare);
CT_MEDIAN(BM_SearchContains_Service_None);
CT_MEDIAN(BM_SearchContains_Service_Cyrillic);
CT_MEDIAN(BM_SearchContains_Service_Short);
CT_MEDIAN(BM_SearchContains_Bare_Common);
CT_MEDIAN(BM_SearchContains_Bare_None);
CT_MEDIAN(BM_InsertContact20_Service);
CT_MEDIAN(BM_InsertContact20_BareSqlite);
BENCHMARK(BM_Insert10000Contacts_Service)->Unit(benchmark::kSecond)->Iterations(1);
BENCHMARK(BM_ChangeCallback_SameProcess)->Iterations(50);
BENCHMARK(BM_ChangeCallback_OtherProcess)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(10);
BENCHMARK(BM_ThousandWrites_NoVersionLost)->Unit(benchmark::kSecond)->Iterations(1);

int main(int argc, char** argv)
{
	const char* env = getenv("CONTACTS_BENCH_PERSONS");
	int persons = env ? atoi(env) : 100000;
	g_db = ct::bench::ensureDatabase(persons > 0 ? persons : 100000);
	ecore_init();
	long before = ct::bench::residentBytes();
	if (contacts_connect() != CONTACTS_ERROR_NONE) {
		fprintf(stderr, "cannot open %s\n", g_db.dbPath.c_str());
		return 1;
	}
	int count = 0;
	contacts_db_get_count(_contacts_person._uri, &count);
	long after = ct::bench::residentBytes();
	fprintf(stderr, "persons: %d, resident memory added by opening: %.1f MB\n", count, (after - before) / 1048576.0);
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	ecore_shutdown();
	return 0;
}
