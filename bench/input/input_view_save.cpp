// The edit form's Done on the generated 100,000-person database, headless:
// a contact of 20 field records is edited from its detail screen (the form
// pushed over it, as the detail screen's Edit does); from the tap on Done
// until the end of the first rendered frame of the detail screen rebuilt
// with the saved person. Beside it: how long the tap's own work took (the
// write and the pop), and the write alone (the same contact written by its
// editable data, outside any screen).
#include "BenchLoop.h"
#include "ContactsBenchData.h"
#include "ContactsDetails.h"
#include "CtData.h"
#include "CtDetailView.h"
#include "CtInputData.h"
#include "CtInputView.h"
#include "WNaviframe.h"
#include "WView.h"
#include "WWindow.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

using ct::bench::pumpFor;
using ct::bench::pumpUntil;
using Clock = std::chrono::steady_clock;

ct::bench::BenchDatabase g_db;
int g_contactId = 0;
int g_personId = 0;

void addText(contacts_record_h contact, unsigned int list, const char* uri, unsigned int property, const std::string& text)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_set_str(child, property, text.c_str());
	contacts_record_add_child_record(contact, list, child);
}

// 6 numbers, 5 e-mails, 3 addresses, 2 web sites, 2 messengers, an event and
// a note: 20 field records, besides the name.
void storeTwentyFieldContact()
{
	contacts_record_h contact = nullptr;
	contacts_record_create(_contacts_contact._uri, &contact);
	contacts_record_h name = nullptr;
	contacts_record_create(_contacts_name._uri, &name);
	contacts_record_set_str(name, _contacts_name.first, "Bench");
	contacts_record_set_str(name, _contacts_name.last, "Twenty Fields");
	contacts_record_add_child_record(contact, _contacts_contact.name, name);
	for (int i = 0; i < 6; ++i)
		addText(contact, _contacts_contact.number, _contacts_number._uri, _contacts_number.number, "010-555-01" + std::to_string(10 + i));
	for (int i = 0; i < 5; ++i)
		addText(contact, _contacts_contact.email, _contacts_email._uri, _contacts_email.email, "bench" + std::to_string(i) + "@example.com");
	for (int i = 0; i < 3; ++i)
		addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, std::to_string(i + 1) + " Main Street");
	for (int i = 0; i < 2; ++i)
		addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url, "https://example.com/" + std::to_string(i));
	for (int i = 0; i < 2; ++i)
		addText(contact, _contacts_contact.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, "bench" + std::to_string(i));
	contacts_record_h event = nullptr;
	contacts_record_create(_contacts_event._uri, &event);
	contacts_record_set_int(event, _contacts_event.date, 19800214);
	contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	contacts_record_add_child_record(contact, _contacts_contact.event, event);
	addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "note 0");
	contacts_db_insert_record(contact, &g_contactId);
	contacts_record_destroy(contact, true);
	contacts_record_h stored = nullptr;
	contacts_db_get_record(_contacts_contact._uri, g_contactId, &stored);
	contacts_record_get_int(stored, _contacts_contact.person_id, &g_personId);
	contacts_record_destroy(stored, true);
}

contacts_record_h loadContact()
{
	contacts_record_h contact = nullptr;
	contacts_db_get_record(_contacts_contact._uri, g_contactId, &contact);
	return contact;
}

// Changes the note, so that every save writes something.
void editNote(CtData* data, int round)
{
	if (contacts_record_h note = data->getNoteRecord())
		data->setNote(note, ("note " + std::to_string(round)).c_str());
}

double median(std::vector<double> values)
{
	std::sort(values.begin(), values.end());
	return values.empty() ? 0.0 : values[values.size() / 2];
}

double msSince(Clock::time_point start)
{
	return std::chrono::duration<double, std::milli>(Clock::now() - start).count();
}

void BM_InputViewDoneToDetailDrawn_TwentyFields(benchmark::State& state)
{
	app_assist::WWindow window("bench", 480, 800);
	auto* naviframe = new app_assist::WNaviframe(&window);
	naviframe->create(window.getBaseLayoutEvasObj(), nullptr);
	window.setContent(naviframe->getEvasObj());
	pumpFor(0.1);
	Evas* canvas = evas_object_evas_get(window.getEvasObj());

	std::vector<double> total, tap;
	int round = 0;
	for (auto _ : state) {
		auto* detail = static_cast<CtDetailView*>(createCtDetailView(g_personId, nullptr));
		naviframe->push(detail);
		pumpUntil([detail] { return !detail->isBuildingRows(); }, 5.0);
		auto* form = new CtInputView(loadContact());
		naviframe->push(form);
		pumpFor(0.6);
		editNote(form->getData().get(), ++round);
		int rebuildsBefore = detail->getRebuildCount();

		struct Probe {
			CtDetailView* detail;
			int rebuildsBefore;
			bool drawn = false;
			Clock::time_point at;
		} probe{detail, rebuildsBefore, false, Clock::time_point()};
		auto renderPost = [](void* data, Evas*, void*) {
			auto* p = static_cast<Probe*>(data);
			if (!p->drawn && p->detail->getRebuildCount() > p->rebuildsBefore) {
				p->drawn = true;
				p->at = Clock::now();
			}
		};
		evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		Clock::time_point start = Clock::now();
		evas_object_smart_callback_call(form->getDoneButton(), "clicked", nullptr);
		tap.push_back(msSince(start));
		pumpUntil([&probe] { return probe.drawn; }, 5.0);
		evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		if (!probe.drawn) {
			state.SkipWithError("the detail screen was not drawn again after the save");
			break;
		}
		double ms = std::chrono::duration<double, std::milli>(probe.at - start).count();
		total.push_back(ms);
		state.SetIterationTime(ms / 1000.0);
		detail->destroy();
		pumpFor(0.05);
	}
	naviframe->destroy();
	pumpFor(0.05);

	// The write alone: the same contact saved by its editable data.
	std::vector<double> write;
	for (int i = 0; i < 15; ++i) {
		CtInputData data(loadContact());
		editNote(&data, 1000 + i);
		Clock::time_point start = Clock::now();
		data.updateContact();
		write.push_back(msSince(start));
		pumpFor(0.01);
	}
	state.counters["done_to_drawn_median_ms"] = median(total);
	state.counters["done_tap_median_ms"] = median(tap);
	state.counters["write_median_ms"] = median(write);
}
BENCHMARK(BM_InputViewDoneToDetailDrawn_TwentyFields)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(15);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	setenv("CONTACTS_LOG_LEVEL", "error", 0);
	g_db = ct::bench::ensureDatabase(100000);
	elm_init(0, nullptr);
	elm_config_transition_duration_factor_set(0.0);
	contacts_connect();
	storeTwentyFieldContact();
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	elm_shutdown();
	return 0;
}
