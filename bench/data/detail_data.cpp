// The detail data on the generated 100,000-person database: loading a person
// of 10 linked contacts with over 100 child records, and the cost of a
// change notification about a contact that is not the shown person's.
#include "ContactsBenchData.h"
#include "CtDetailData.h"

#include <Ecore.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>

namespace {

using Clock = std::chrono::steady_clock;

ct::bench::BenchDatabase g_db;

class CountingListener : public ICtChangeListener {
public:
	void onDbChanged(const char*) override { ++calls; }
	void onCompleteGetContacts() override {}
	void onConditionChagned() override {}
	int calls = 0;
};

// Notes when the person view's change callbacks reach it.
struct Probe {
	Clock::time_point at;
	bool hit = false;
	static void cb(const char*, void* data)
	{
		Probe* probe = static_cast<Probe*>(data);
		probe->at = Clock::now();
		probe->hit = true;
	}
};

void BM_ConstructDetailData_BigPerson(benchmark::State& state)
{
	size_t numbers = 0;
	for (auto _ : state) {
		CtDetailData data(g_db.bigPersonId);
		numbers = eina_list_count(data.getNumberList());
		benchmark::DoNotOptimize(numbers);
	}
	state.counters["contacts"] = 0;
	CtDetailData data(g_db.bigPersonId);
	state.counters["contacts"] = eina_list_count(data.getContactsList());
	size_t children = 0;
	for (Eina_List* list : {data.getNumberList(), data.getEmailList(), data.getAddressList(), data.getMessengerList(),
		     data.getUrlList(), data.getRelationshipList(), data.getEventList(), data.getNoteList(),
		     data.getNameList(), data.getImageList()})
		children += eina_list_count(list);
	state.counters["children"] = children;
}

// Time from the callback registered before the detail data's to the one
// registered after it: the detail data's own handling of the change.
void BM_UnrelatedContactChange(benchmark::State& state)
{
	Probe before, after;
	contacts_db_add_changed_cb(_contacts_person._uri, Probe::cb, &before);
	CountingListener listener;
	CtDetailData data(g_db.bigPersonId);
	data.attachListener(&listener);
	contacts_db_add_changed_cb(_contacts_person._uri, Probe::cb, &after);
	int unrelated = ct::bench::firstContactId(g_db.bigPersonId, CONTACTS_MATCH_NOT_EQUAL);
	int round = 0;
	for (auto _ : state) {
		before.hit = after.hit = false;
		ct::bench::touchContact(unrelated, ++round);
		double start = ecore_time_get();
		while (!after.hit && ecore_time_get() - start < 5)
			ecore_main_loop_iterate();
		state.SetIterationTime(std::chrono::duration<double>(after.at - before.at).count());
	}
	contacts_db_remove_changed_cb(_contacts_person._uri, Probe::cb, &after);
	contacts_db_remove_changed_cb(_contacts_person._uri, Probe::cb, &before);
	state.counters["notified"] = listener.calls;
	if (listener.calls)
		state.SkipWithError("an unrelated contact change notified the listener");
}

} // namespace

BENCHMARK(BM_ConstructDetailData_BigPerson)->Unit(benchmark::kMillisecond)->Repetitions(5)->ReportAggregatesOnly(true);
BENCHMARK(BM_UnrelatedContactChange)->UseManualTime()->Unit(benchmark::kMicrosecond)->Iterations(50)->Repetitions(5)
	->ReportAggregatesOnly(true);

int main(int argc, char** argv)
{
	setenv("CONTACTS_LOG_LEVEL", "error", 0);
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
	std::error_code ec;
	std::filesystem::remove_all(g_db.dataDir, ec);
	return 0;
}
