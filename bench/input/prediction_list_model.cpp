// Loading the prediction list for a typed name on a generated database
// (100,000 persons unless CONTACTS_BENCH_PERSONS says otherwise): the first
// ten persons with their address book and default number. Each load is timed
// beside a hand-written bare-SQLite floor for the same work, alternately in
// the same loop. Times are the thread's CPU time (the machine is shared),
// with wall-clock medians beside them; counters give the median and the 99th
// percentile of each (ms) and the predictions each found.
#include "ContactsBenchData.h"
#include "CtPredictionListModel.h"
#include "SqliteDatabase.h"

#include <Ecore.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <time.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <string>
#include <vector>

namespace {

ct::bench::BenchDatabase g_db;

double threadCpuSeconds()
{
	timespec ts {};
	clock_gettime(CLOCK_THREAD_CPUTIME_ID, &ts);
	return static_cast<double>(ts.tv_sec) + ts.tv_nsec * 1e-9;
}

double wallSeconds()
{
	return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch()).count();
}

double percentile(std::vector<double> values, double p)
{
	if (values.empty())
		return 0;
	std::sort(values.begin(), values.end());
	size_t at = static_cast<size_t>(p * (values.size() - 1) + 0.5);
	return values[std::min(at, values.size() - 1)];
}

// The least any store of this schema must do: the first ten matching persons
// in row order (the trigram index for three letters or more, a scan below
// that), then each display contact's address book and default number.
struct PredictionFloor {
	ct::db::Database db;
	ct::db::Statement indexed, scanned, book, number;

	PredictionFloor()
	{
		db.open(g_db.dbPath, ct::db::OpenMode::ReadOnly);
		indexed = db.prepare("SELECT id, display_name, display_contact_id FROM persons WHERE id IN "
			"(SELECT rowid FROM persons_fts WHERE persons_fts MATCH ?) ORDER BY id LIMIT 10");
		scanned = db.prepare("SELECT id, display_name, display_contact_id FROM persons "
			"WHERE display_name LIKE ? ORDER BY id LIMIT 10");
		book = db.prepare("SELECT address_book_id FROM contacts WHERE id = ?");
		number = db.prepare("SELECT number FROM numbers WHERE contact_id = ? AND owner = 0 AND is_default = 1 LIMIT 1");
	}

	int load(const std::string& text)
	{
		ct::db::Statement& persons = text.size() >= 3 ? indexed : scanned;
		persons.reset();
		persons.bind(1, text.size() >= 3 ? "\"" + text + "\"" : "%" + text + "%");
		int found = 0;
		while (persons.step() == SQLITE_ROW) {
			int contactId = persons.columnInt(2);
			book.reset();
			book.bind(1, contactId);
			book.step();
			number.reset();
			number.bind(1, contactId);
			number.step();
			++found;
		}
		return found;
	}
};

void loadPredictions(benchmark::State& state, const char* text)
{
	PredictionFloor floor;
	std::vector<double> cpu, floorCpu, wall, floorWall;
	int found = 0, floorFound = 0;
	for (auto _ : state) {
		double w = wallSeconds(), c = threadCpuSeconds();
		{
			CtPredictionListModel model(text);
			found = model.getCount();
		}
		double serviceCpu = threadCpuSeconds() - c;
		wall.push_back(wallSeconds() - w);
		cpu.push_back(serviceCpu);
		w = wallSeconds(), c = threadCpuSeconds();
		floorFound = floor.load(text);
		floorCpu.push_back(threadCpuSeconds() - c);
		floorWall.push_back(wallSeconds() - w);
		state.SetIterationTime(serviceCpu);
	}
	state.counters["p50_ms"] = percentile(cpu, 0.5) * 1e3;
	state.counters["p99_ms"] = percentile(cpu, 0.99) * 1e3;
	state.counters["wall_p50_ms"] = percentile(wall, 0.5) * 1e3;
	state.counters["wall_p99_ms"] = percentile(wall, 0.99) * 1e3;
	state.counters["floor_p50_ms"] = percentile(floorCpu, 0.5) * 1e3;
	state.counters["floor_p99_ms"] = percentile(floorCpu, 0.99) * 1e3;
	state.counters["floor_wall_p50_ms"] = percentile(floorWall, 0.5) * 1e3;
	state.counters["found"] = found;
	state.counters["floor_found"] = floorFound;
}

// Three letters found in many names, in none, and one letter.
void BM_PredictionLoad_ThreeLetters(benchmark::State& s) { loadPredictions(s, "ann"); }
void BM_PredictionLoad_ThreeLettersLate(benchmark::State& s) { loadPredictions(s, "Zoë"); }
void BM_PredictionLoad_NoMatch(benchmark::State& s) { loadPredictions(s, "qxz"); }
void BM_PredictionLoad_OneLetter(benchmark::State& s) { loadPredictions(s, "a"); }
void BM_PredictionLoad_OneRareLetter(benchmark::State& s) { loadPredictions(s, "q"); }

} // namespace

#define CT_PREDICTION(b) BENCHMARK(b)->UseManualTime()->Unit(benchmark::kMicrosecond)->Iterations(500)
CT_PREDICTION(BM_PredictionLoad_ThreeLetters);
CT_PREDICTION(BM_PredictionLoad_ThreeLettersLate);
CT_PREDICTION(BM_PredictionLoad_NoMatch);
CT_PREDICTION(BM_PredictionLoad_OneLetter);
CT_PREDICTION(BM_PredictionLoad_OneRareLetter);

int main(int argc, char** argv)
{
	setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
	const char* env = getenv("CONTACTS_BENCH_PERSONS");
	int persons = env ? atoi(env) : 100000;
	g_db = ct::bench::ensureDatabase(persons > 0 ? persons : 100000);
	ecore_init();
	if (contacts_connect() != CONTACTS_ERROR_NONE) {
		fprintf(stderr, "cannot open %s\n", g_db.dbPath.c_str());
		return 1;
	}
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	ecore_shutdown();
	return 0;
}
