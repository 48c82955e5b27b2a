// The contacts service on a generated database (100,000 persons unless
// CONTACTS_BENCH_PERSONS says otherwise). Each figure is measured beside a
// hand-written bare-SQLite floor for the same work, interleaved in the same
// loop so that the load of the machine weighs on both alike. Times are the
// thread's CPU time (the machine is shared; wall-clock ratios are given as
// x_floor_wall): counters give the floor's time (floor_us), the ratio
// (x_floor), and the statements each ran (statements, floor_statements).
#include "ContactsBenchData.h"
#include "SqliteDatabase.h"

#include <Ecore.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <spawn.h>
#include <time.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <string>
#include <vector>

extern char** environ;

namespace {

using Clock = std::chrono::steady_clock;

double threadCpuSeconds()
{
	timespec ts {};
	clock_gettime(CLOCK_THREAD_CPUTIME_ID, &ts);
	return static_cast<double>(ts.tv_sec) + ts.tv_nsec * 1e-9;
}

ct::bench::BenchDatabase g_db;

const char* kChildTables[] = { "names", "images", "companies", "notes", "numbers", "emails", "events", "messengers",
	"addresses", "urls", "nicknames", "relationships", "group_relations", "profiles" };

// Times `service` and `floor` alternately; the benchmark's own time is the
// service's, the floor's goes into counters.
class SideBySide {
public:
	explicit SideBySide(benchmark::State& state) : m_state(state) {}

	void run(const std::function<void()>& service, const std::function<void()>& floor)
	{
		int64_t before = ct::db::statementsStarted();
		auto start = Clock::now();
		double cpuStart = threadCpuSeconds();
		service();
		double serviceSeconds = threadCpuSeconds() - cpuStart;
		m_serviceWall += std::chrono::duration<double>(Clock::now() - start).count();
		m_statements = ct::db::statementsStarted() - before;
		before = ct::db::statementsStarted();
		start = Clock::now();
		cpuStart = threadCpuSeconds();
		floor();
		double floorSeconds = threadCpuSeconds() - cpuStart;
		m_floorWall += std::chrono::duration<double>(Clock::now() - start).count();
		m_floorStatements = ct::db::statementsStarted() - before;
		m_serviceTotal += serviceSeconds;
		m_floorTotal += floorSeconds;
		m_state.SetIterationTime(serviceSeconds);
	}

	~SideBySide()
	{
		if (m_floorTotal <= 0)
			return;
		double iterations = static_cast<double>(m_state.iterations());
		m_state.counters["floor_us"] = m_floorTotal / iterations * 1e6;
		m_state.counters["x_floor"] = m_serviceTotal / m_floorTotal;
		m_state.counters["x_floor_wall"] = m_serviceWall / m_floorWall;
		m_state.counters["statements"] = static_cast<double>(m_statements);
		m_state.counters["floor_statements"] = static_cast<double>(m_floorStatements);
	}

private:
	benchmark::State& m_state;
	double m_serviceTotal = 0;
	double m_floorTotal = 0;
	double m_serviceWall = 0;
	double m_floorWall = 0;
	int64_t m_statements = 0;
	int64_t m_floorStatements = 0;
};

int loadPersonThroughService()
{
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
	contacts_list_destroy(list, true);
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	contacts_record_destroy(person, true);
	return children;
}

// The floor reads the person, its contacts, and each child table once for
// all of the person's contacts: 16 statements.
struct PersonFloor {
	ct::db::Database db;
	ct::db::Statement person, contacts;
	std::vector<ct::db::Statement> children;

	PersonFloor()
	{
		db.open(g_db.dbPath, ct::db::OpenMode::ReadOnly);
		person = db.prepare("SELECT * FROM persons WHERE id = ?");
		contacts = db.prepare("SELECT * FROM contacts WHERE person_id = ? ORDER BY id");
		for (const char* t : kChildTables)
			children.push_back(db.prepare((std::string("SELECT * FROM ") + t
				+ " WHERE contact_id IN (SELECT id FROM contacts WHERE person_id = ?) AND owner = 0 "
				  "ORDER BY contact_id, id").c_str()));
	}

	int load()
	{
		int rows = 0;
		for (ct::db::Statement* st : { &person, &contacts }) {
			st->reset();
			st->bind(1, g_db.bigPersonId);
			while (st->step() == SQLITE_ROW)
				readRow(*st);
		}
		for (auto& st : children) {
			st.reset();
			st.bind(1, g_db.bigPersonId);
			while (st.step() == SQLITE_ROW) {
				readRow(st);
				++rows;
			}
		}
		return rows;
	}

	static void readRow(ct::db::Statement& st)
	{
		for (int c = 0; c < sqlite3_column_count(st.handle()); ++c)
			benchmark::DoNotOptimize(st.columnTextPtr(c));
	}
};

void BM_LoadPerson(benchmark::State& state)
{
	PersonFloor floor;
	int children = 0, floorRows = 0;
	{
		SideBySide pair(state);
		for (auto _ : state)
			pair.run([&] { children = loadPersonThroughService(); }, [&] { floorRows = floor.load(); });
	}
	state.counters["children"] = children;
	state.counters["floor_rows"] = floorRows;
}

// Bare SQLite's answer to the same search: the trigram index, then sorting.
struct SearchFloor {
	ct::db::Database db;
	ct::db::Statement st;

	SearchFloor()
	{
		db.open(g_db.dbPath, ct::db::OpenMode::ReadOnly);
		st = db.prepare("SELECT * FROM persons WHERE id IN (SELECT rowid FROM persons_fts WHERE "
			"persons_fts MATCH ?) ORDER BY display_name LIMIT 10");
	}

	int search(const std::string& phrase)
	{
		st.reset();
		st.bind(1, phrase);
		int count = 0;
		while (st.step() == SQLITE_ROW)
			++count;
		return count;
	}
};

int searchThroughService(const char* text)
{
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
	contacts_list_destroy(list, true);
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	return count;
}

void searchContains(benchmark::State& state, const char* text)
{
	SearchFloor floor;
	std::string phrase = std::string("\"") + text + "\"";
	int found = 0, floorFound = 0;
	{
		SideBySide pair(state);
		for (auto _ : state)
			pair.run([&] { found = searchThroughService(text); }, [&] { floorFound = floor.search(phrase); });
	}
	state.counters["found"] = found;
	state.counters["floor_found"] = floorFound;
}

// Texts whose matches are many and sort early, few, none, many but sorting
// late (after most Latin names), and Cyrillic.
void BM_SearchContains_Common(benchmark::State& s) { searchContains(s, "ann"); }
void BM_SearchContains_Rare(benchmark::State& s) { searchContains(s, "na Smi"); }
void BM_SearchContains_None(benchmark::State& s) { searchContains(s, "qxz"); }
void BM_SearchContains_LateZoe(benchmark::State& s) { searchContains(s, "Zoë"); }
void BM_SearchContains_LateAnn(benchmark::State& s) { searchContains(s, "Анн"); }
void BM_SearchContains_Cyrillic(benchmark::State& s) { searchContains(s, "етр"); }

void BM_SearchContains_ShortNoIndex(benchmark::State& state)
{
	for (auto _ : state)
		state.counters["found"] = searchThroughService("an");
}

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

// The floor writes what any store of this schema must for such a contact:
// a version, the person, the contact, 20 children, the change row and the
// change key of the views, in one transaction: 27 statements.
struct InsertFloor {
	ct::db::Database db;
	ct::db::Statement version, person, contact, name, number, email, url, change, viewVersion;

	InsertFloor()
	{
		db.open(g_db.dbPath);
		version = db.prepare("UPDATE meta SET value = value + 1 WHERE key = 'version' RETURNING value");
		person = db.prepare("INSERT INTO persons(display_name, display_name_index, link_count, addressbook_ids, "
			"has_phonenumber, has_email, changed_ver) VALUES (?, 'B', 1, '0', 1, 1, ?)");
		contact = db.prepare("INSERT INTO contacts(person_id, display_name, has_phonenumber, has_email, changed_ver) "
			"VALUES (?, ?, 1, 1, ?)");
		name = db.prepare("INSERT INTO names(contact_id, first) VALUES (?, ?)");
		number = db.prepare("INSERT INTO numbers(contact_id, number, cleaned_number, normalized_number) VALUES (?, ?, ?, ?)");
		email = db.prepare("INSERT INTO emails(contact_id, email) VALUES (?, ?)");
		url = db.prepare("INSERT INTO urls(contact_id, url) VALUES (?, ?)");
		change = db.prepare("INSERT INTO contact_changes(contact_id, address_book_id, type, version) VALUES (?, 0, 0, ?)");
		viewVersion = db.prepare("INSERT OR REPLACE INTO view_versions(uri, version) VALUES ('bench', ?)");
	}

	void insert(int i)
	{
		std::string display = "Bare" + std::to_string(i);
		ct::db::Transaction tx(db);
		version.reset();
		version.step();
		int v = version.columnInt(0);
		version.step();
		person.reset();
		person.bind(1, display).bind(2, v).run();
		int64_t personId = db.lastInsertRowId();
		contact.reset();
		contact.bind(1, personId).bind(2, display).bind(3, v).run();
		int64_t contactId = db.lastInsertRowId();
		name.reset();
		name.bind(1, contactId).bind(2, display).run();
		for (int n = 0; n < 10; ++n) {
			number.reset();
			number.bind(1, contactId).bind(2, "+1 555 0100").bind(3, "15550100").bind(4, "15550100").run();
		}
		for (int n = 0; n < 5; ++n) {
			email.reset();
			email.bind(1, contactId).bind(2, "a@b.c").run();
		}
		for (int n = 0; n < 4; ++n) {
			url.reset();
			url.bind(1, contactId).bind(2, "http://x").run();
		}
		change.reset();
		change.bind(1, contactId).bind(2, v).run();
		viewVersion.reset();
		viewVersion.bind(1, v).run();
		tx.commit();
	}
};

void BM_InsertContact20(benchmark::State& state)
{
	InsertFloor floor;
	int i = 0;
	SideBySide pair(state);
	for (auto _ : state) {
		contacts_record_h c = contactWith20Children(i);
		pair.run([&] { contacts_db_insert_record(c, nullptr); }, [&] { floor.insert(i); });
		contacts_record_destroy(c, true);
		++i;
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
	double at = 0;
	static void cb(const char*, void* data)
	{
		auto* self = static_cast<Flag*>(data);
		self->hit = true;
		self->at = ecore_time_get();
	}
};

const char* kWriterArgument = "--insert-one-contact";

// In a process of its own (this program started again): inserts a contact
// and prints the monotonic time right after the commit.
int insertOneContactAndReport()
{
	if (contacts_connect() != CONTACTS_ERROR_NONE)
		return 1;
	contacts_record_h c = contactWith20Children(0);
	int err = contacts_db_insert_record(c, nullptr);
	double committed = ecore_time_get();
	printf("%.9f\n", committed);
	contacts_record_destroy(c, true);
	contacts_disconnect();
	return err == CONTACTS_ERROR_NONE ? 0 : 1;
}

// Starts the writer; *out receives its output's read end.
pid_t startWriter(int* out)
{
	int fds[2];
	if (pipe(fds) != 0)
		return -1;
	posix_spawn_file_actions_t actions;
	posix_spawn_file_actions_init(&actions);
	posix_spawn_file_actions_adddup2(&actions, fds[1], STDOUT_FILENO);
	posix_spawn_file_actions_addclose(&actions, fds[0]);
	char self[] = "/proc/self/exe";
	char arg[64];
	snprintf(arg, sizeof(arg), "%s", kWriterArgument);
	char* argv[] = { self, arg, nullptr };
	pid_t pid = -1;
	if (posix_spawn(&pid, self, &actions, nullptr, argv, environ) != 0)
		pid = -1;
	posix_spawn_file_actions_destroy(&actions);
	close(fds[1]);
	*out = fds[0];
	return pid;
}

double readCommitTime(int fd)
{
	char buf[64] = {};
	ssize_t n = read(fd, buf, sizeof(buf) - 1);
	close(fd);
	return n > 0 ? atof(buf) : 0;
}

Eina_Bool quitLoopCb(void*)
{
	ecore_main_loop_quit();
	return ECORE_CALLBACK_CANCEL;
}

// Blocks in the main loop (no busy waiting) until the callback ran or 2 s
// passed.
Eina_Bool expireCb(void* data)
{
	*static_cast<bool*>(data) = true;
	return ECORE_CALLBACK_CANCEL;
}

void waitForCallback(Flag& flag)
{
	bool expired = false;
	Ecore_Timer* guard = ecore_timer_add(2.0, expireCb, &expired);
	while (!flag.hit && !expired)
		ecore_main_loop_iterate_may_block(1);
	if (!expired)
		ecore_timer_del(guard);
}

double percentile(std::vector<double> values, double p)
{
	if (values.empty())
		return 0;
	std::sort(values.begin(), values.end());
	size_t at = static_cast<size_t>(p * (values.size() - 1) + 0.5);
	return values[std::min(at, values.size() - 1)];
}

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

// From the commit in another process to the callback here; the process start
// is not counted.
void BM_ChangeCallback_OtherProcess(benchmark::State& state)
{
	Flag flag;
	contacts_db_add_changed_cb(_contacts_person._uri, Flag::cb, &flag);
	std::vector<double> latencies;
	for (auto _ : state) {
		flag.hit = false;
		int out = -1;
		pid_t child = startWriter(&out);
		if (child < 0) {
			state.SkipWithError("cannot start the writer");
			break;
		}
		waitForCallback(flag);
		double committed = readCommitTime(out);
		int status = 0;
		waitpid(child, &status, 0);
		double latency = flag.hit && committed > 0 ? std::max(0.0, flag.at - committed) : 2.0;
		latencies.push_back(latency);
		state.SetIterationTime(latency);
	}
	state.counters["p50_ms"] = percentile(latencies, 0.5) * 1e3;
	state.counters["p99_ms"] = percentile(latencies, 0.99) * 1e3;
	state.counters["max_ms"] = percentile(latencies, 1.0) * 1e3;
	contacts_db_remove_changed_cb(_contacts_person._uri, Flag::cb, &flag);
}

Eina_Bool countWakeUpCb(void* data)
{
	++*static_cast<int*>(data);
	return ECORE_CALLBACK_RENEW;
}

// How often the main loop wakes while a change callback is registered and
// nothing changes (the timer that ends each second counts as one).
void BM_IdleWakeUps(benchmark::State& state)
{
	Flag flag;
	contacts_db_add_changed_cb(_contacts_person._uri, Flag::cb, &flag);
	ecore_main_loop_iterate();
	int wakeUps = 0;
	Ecore_Idle_Exiter* exiter = ecore_idle_exiter_add(countWakeUpCb, &wakeUps);
	for (auto _ : state) {
		ecore_timer_add(1.0, quitLoopCb, nullptr);
		ecore_main_loop_begin();
	}
	ecore_idle_exiter_del(exiter);
	state.counters["wakeups_per_s"] = static_cast<double>(wakeUps) / state.iterations();
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

#define CT_MEDIAN(b) \
	BENCHMARK(b)->UseManualTime()->Unit(benchmark::kMicrosecond)->Repetitions(5)->ReportAggregatesOnly(true)
CT_MEDIAN(BM_LoadPerson);
CT_MEDIAN(BM_SearchContains_Common);
CT_MEDIAN(BM_SearchContains_Rare);
CT_MEDIAN(BM_SearchContains_None);
CT_MEDIAN(BM_SearchContains_LateZoe);
CT_MEDIAN(BM_SearchContains_LateAnn);
CT_MEDIAN(BM_SearchContains_Cyrillic);
BENCHMARK(BM_SearchContains_ShortNoIndex)->Unit(benchmark::kMicrosecond)->Repetitions(5)->ReportAggregatesOnly(true);
CT_MEDIAN(BM_InsertContact20);
BENCHMARK(BM_Insert10000Contacts_Service)->Unit(benchmark::kSecond)->Iterations(1);
BENCHMARK(BM_ChangeCallback_SameProcess)->Iterations(50);
BENCHMARK(BM_ChangeCallback_OtherProcess)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(100);
BENCHMARK(BM_IdleWakeUps)->Unit(benchmark::kSecond)->Iterations(2);
BENCHMARK(BM_ThousandWrites_NoVersionLost)->Unit(benchmark::kSecond)->Iterations(1);

int main(int argc, char** argv)
{
	// The system modules only try to reach D-Bus and log about it.
	setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
	if (argc > 1 && strcmp(argv[1], kWriterArgument) == 0) {
		ecore_init();
		int rc = insertOneContactAndReport();
		ecore_shutdown();
		return rc;
	}
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
