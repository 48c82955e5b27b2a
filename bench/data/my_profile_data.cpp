// The user's own profile with five pictures and 50 child records: loading it
// for display (the read side, as the profile screen makes it) and for editing.
#include "CtMyProfileDetailData.h"
#include "CtMyProfileInputData.h"

#include <Ecore.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>

namespace {

std::string g_dataDir;

contacts_record_h addChild(contacts_record_h profile, unsigned int property, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(profile, property, child);
	return child;
}

// Five pictures and 10 numbers, 10 e-mails, 10 addresses, 5 messengers,
// 5 web sites, 5 events and 5 notes.
void storeProfile()
{
	contacts_record_h profile = nullptr;
	contacts_record_create(_contacts_my_profile._uri, &profile);
	contacts_record_set_str(addChild(profile, _contacts_my_profile.name, _contacts_name._uri), _contacts_name.first,
		"Benchmark");
	contacts_record_set_str(profile, _contacts_my_profile_ex.status, "Measuring");
	for (int i = 1; i <= 5; ++i) {
		contacts_record_h image = addChild(profile, _contacts_my_profile.image, _contacts_image._uri);
		contacts_record_set_str(image, _contacts_image.path, ("/pictures/me-" + std::to_string(i) + ".jpg").c_str());
		contacts_record_set_int(image, _contacts_image_ex.order, i);
	}
	const struct {
		unsigned int list;
		const char* uri;
		unsigned int text;
		int count;
	} kinds[] = {
		{_contacts_my_profile.number, _contacts_number._uri, _contacts_number.number, 10},
		{_contacts_my_profile.email, _contacts_email._uri, _contacts_email.email, 10},
		{_contacts_my_profile.address, _contacts_address._uri, _contacts_address.street, 10},
		{_contacts_my_profile.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, 5},
		{_contacts_my_profile.url, _contacts_url._uri, _contacts_url.url, 5},
		{_contacts_my_profile.note, _contacts_note._uri, _contacts_note.note, 5},
	};
	for (const auto& kind : kinds)
		for (int i = 0; i < kind.count; ++i)
			contacts_record_set_str(addChild(profile, kind.list, kind.uri), kind.text, ("text " + std::to_string(i)).c_str());
	for (int i = 0; i < 5; ++i)
		contacts_record_set_int(addChild(profile, _contacts_my_profile.event, _contacts_event._uri), _contacts_event.date,
			19800101 + i);
	int id = 0;
	if (contacts_db_insert_record(profile, &id) != CONTACTS_ERROR_NONE)
		fprintf(stderr, "cannot store the profile\n");
	contacts_record_destroy(profile, true);
}

void BM_MyProfileDetailDataLoad(benchmark::State& state)
{
	size_t numbers = 0;
	for (auto _ : state) {
		CtMyProfileDetailData data;
		numbers = eina_list_count(data.getNumberList());
		benchmark::DoNotOptimize(data.getDisplayName());
	}
	if (numbers != 10)
		state.SkipWithError("the profile was not loaded whole");
}
BENCHMARK(BM_MyProfileDetailDataLoad)->Unit(benchmark::kMicrosecond)->Repetitions(5)->ReportAggregatesOnly(true);

void BM_MyProfileInputDataLoad(benchmark::State& state)
{
	for (auto _ : state) {
		CtMyProfileInputData data;
		benchmark::DoNotOptimize(data.getImageCount());
	}
}
BENCHMARK(BM_MyProfileInputDataLoad)->Unit(benchmark::kMicrosecond)->Repetitions(5)->ReportAggregatesOnly(true);

} // namespace

int main(int argc, char** argv)
{
	setenv("CONTACTS_LOG_LEVEL", "error", 0);
	char pattern[] = "/tmp/my-profile-bench-XXXXXX";
	if (!mkdtemp(pattern))
		return 1;
	g_dataDir = pattern;
	setenv("CONTACTS_DATA_DIR", g_dataDir.c_str(), 1);
	ecore_init();
	if (contacts_connect() != CONTACTS_ERROR_NONE)
		return 1;
	storeProfile();
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	ecore_shutdown();
	std::error_code ec;
	std::filesystem::remove_all(g_dataDir, ec);
	return 0;
}
