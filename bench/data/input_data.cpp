// The editable contact on the generated 100,000-person database: loading a
// stored contact of 50 child records for editing, and saving it back after
// one field changed. Persons: CONTACTS_BENCH_PERSONS (default 100000).
#include "ContactsBenchData.h"
#include "CtInputData.h"

#include <Ecore.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <cstdio>
#include <cstdlib>
#include <memory>
#include <string>

namespace {

ct::bench::BenchDatabase g_db;
int g_contactId = 0;

void addChild(contacts_record_h contact, unsigned int property, const char* uri, unsigned int textProperty,
	const std::string& text)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_set_str(child, textProperty, text.c_str());
	contacts_record_add_child_record(contact, property, child);
}

// A phone contact with a name and 50 more children of several kinds.
int storeContactWith50Children()
{
	contacts_record_h contact = nullptr;
	contacts_record_create(_contacts_contact._uri, &contact);
	contacts_record_set_int(contact, _contacts_contact.link_mode, CONTACTS_CONTACT_LINK_MODE_IGNORE_ONCE);
	addChild(contact, _contacts_contact.name, _contacts_name._uri, _contacts_name.first, "Benchmark");
	for (int i = 0; i < 20; ++i)
		addChild(contact, _contacts_contact.number, _contacts_number._uri, _contacts_number.number,
			"+4930" + std::to_string(1000000 + i));
	for (int i = 0; i < 10; ++i)
		addChild(contact, _contacts_contact.email, _contacts_email._uri, _contacts_email.email,
			"bench" + std::to_string(i) + "@example.com");
	for (int i = 0; i < 8; ++i)
		addChild(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street,
			std::to_string(i) + " Bench Street");
	for (int i = 0; i < 6; ++i)
		addChild(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url,
			"https://bench" + std::to_string(i) + ".example.com");
	for (int i = 0; i < 6; ++i)
		addChild(contact, _contacts_contact.messenger, _contacts_messenger._uri, _contacts_messenger.im_id,
			"im" + std::to_string(i));
	int id = 0;
	int err = contacts_db_insert_record(contact, &id);
	contacts_record_destroy(contact, true);
	if (err != CONTACTS_ERROR_NONE)
		fprintf(stderr, "storing the benchmark contact failed: %d\n", err);
	return id;
}

contacts_record_h readContact()
{
	contacts_record_h contact = nullptr;
	contacts_db_get_record(_contacts_contact._uri, g_contactId, &contact);
	return contact;
}

void BM_LoadContactForEditing(benchmark::State& state)
{
	for (auto _ : state) {
		CtInputData data(readContact());
		benchmark::DoNotOptimize(data.getNumberList());
	}
}

void BM_UpdateContactAfterOneChange(benchmark::State& state)
{
	int round = 0;
	for (auto _ : state) {
		state.PauseTiming();
		auto data = std::make_unique<CtInputData>(readContact());
		std::string last = "Changed" + std::to_string(++round);
		data->setLastName(last.c_str());
		state.ResumeTiming();
		int err = data->updateContact();
		state.PauseTiming();
		if (err != CONTACTS_ERROR_NONE)
			state.SkipWithError("updateContact failed");
		data.reset();
		ecore_main_loop_iterate(); // let the change notification go out of the measured part
		state.ResumeTiming();
	}
}

} // namespace

BENCHMARK(BM_LoadContactForEditing)->Unit(benchmark::kMillisecond)->Repetitions(5)->ReportAggregatesOnly(true);
BENCHMARK(BM_UpdateContactAfterOneChange)->Unit(benchmark::kMillisecond)->Iterations(100)->Repetitions(5)
	->ReportAggregatesOnly(true);

int main(int argc, char** argv)
{
	const char* personsText = getenv("CONTACTS_BENCH_PERSONS");
	int persons = personsText ? atoi(personsText) : 0;
	g_db = ct::bench::ensureDatabase(persons > 0 ? persons : 100000);
	setenv("ELM_ENGINE", "buffer", 0);
	ecore_init();
	if (contacts_connect() != CONTACTS_ERROR_NONE)
		return 1;
	g_contactId = storeContactWith50Children();
	if (g_contactId <= 0)
		return 1;
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	ecore_shutdown();
	return 0;
}
