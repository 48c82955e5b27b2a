// The share-fields screen on the generated 100,000-person database,
// headless, for a person of 10 linked contacts with over 100 child records:
// from the factory call to the first drawn frame; one mark (recount, title
// and preview, which composes the whole text again); and composing the text
// of a hundred marked fields on its own.
#include "BenchLoop.h"
#include "ContactsBenchData.h"
#include "ContactsDetails.h"
#include "CtShareContactText.h"
#include "CtShareContactView.h"
#include "CtShareContactViewItem.h"
#include "WNaviframe.h"
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

double seconds(Clock::time_point from, Clock::time_point to)
{
	return std::chrono::duration<double>(to - from).count();
}

// A window with a naviframe, torn down with everything pushed on it.
class Screen {
public:
	Screen() : m_window("bench", 360, 640)
	{
		m_naviframe = new app_assist::WNaviframe(&m_window);
		m_naviframe->create(m_window.getBaseLayoutEvasObj(), nullptr);
		m_window.setContent(m_naviframe->getEvasObj());
		pumpFor(0.1);
	}
	~Screen()
	{
		m_naviframe->destroy();
		pumpFor(0.05);
	}
	app_assist::WNaviframe* naviframe() { return m_naviframe; }
	Evas* canvas() { return evas_object_evas_get(m_window.getEvasObj()); }

private:
	app_assist::WWindow m_window;
	app_assist::WNaviframe* m_naviframe = nullptr;
};

std::vector<CtShareContactViewItem*> fieldRows(CtShareContactView* view)
{
	std::vector<CtShareContactViewItem*> rows;
	for (Elm_Object_Item* item = elm_genlist_first_item_get(view->getGenlist()); item; item = elm_genlist_item_next_get(item)) {
		auto* base = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
		if (auto* row = dynamic_cast<CtShareContactViewItem*>(base))
			rows.push_back(row);
	}
	return rows;
}

void select(CtShareContactViewItem* row)
{
	elm_genlist_item_selected_set(row->getElmObjectItem(), EINA_FALSE);
	elm_genlist_item_selected_set(row->getElmObjectItem(), EINA_TRUE);
}

void BM_ShareViewFirstFrame_BigPerson(benchmark::State& state)
{
	Screen screen;
	int frames = 0;
	Evas_Event_Cb counter = [](void* data, Evas*, void*) { ++*static_cast<int*>(data); };
	evas_event_callback_add(screen.canvas(), EVAS_CALLBACK_RENDER_POST, counter, &frames);
	size_t rows = 0;
	for (auto _ : state) {
		int before = frames;
		Clock::time_point start = Clock::now();
		auto* view = static_cast<CtShareContactView*>(createCtShareContactView(g_db.bigPersonId, nullptr));
		screen.naviframe()->push(view);
		pumpUntil([&] { return frames > before; }, 5.0);
		state.SetIterationTime(seconds(start, Clock::now()));
		rows = fieldRows(view).size();
		view->destroy();
		pumpFor(0.02);
	}
	evas_event_callback_del_full(screen.canvas(), EVAS_CALLBACK_RENDER_POST, counter, &frames);
	state.counters["field_rows"] = static_cast<double>(rows);
}
BENCHMARK(BM_ShareViewFirstFrame_BigPerson)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(20);

// Marks every field one after the other; the figure is the time of one mark.
void BM_ShareViewMarkOneField_BigPerson(benchmark::State& state)
{
	Screen screen;
	auto* view = static_cast<CtShareContactView*>(createCtShareContactView(g_db.bigPersonId, nullptr));
	screen.naviframe()->push(view);
	pumpFor(0.2);
	std::vector<CtShareContactViewItem*> rows = fieldRows(view);
	if (rows.empty()) {
		state.SkipWithError("the person has no fields");
		return;
	}
	size_t next = 0;
	for (auto _ : state) {
		select(rows[next]);
		next = (next + 1) % rows.size();
	}
	state.counters["text_bytes"] = static_cast<double>(view->composeText().size());
	view->destroy();
	pumpFor(0.02);
}
BENCHMARK(BM_ShareViewMarkOneField_BigPerson)->Unit(benchmark::kMicrosecond);

void BM_ShareTextOfAHundredFields(benchmark::State& state)
{
	const std::string value(60, 'x');
	for (auto _ : state) {
		CtShareContactText text("Maximiliana Alexandra");
		for (int i = 0; i < 100; ++i)
			text.appendField("Mobile", value);
		benchmark::DoNotOptimize(text.getText());
	}
}
BENCHMARK(BM_ShareTextOfAHundredFields)->Unit(benchmark::kMicrosecond);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	g_db = ct::bench::ensureDatabase(100000);
	elm_init(0, nullptr);
	elm_config_transition_duration_factor_set(0.0);
	contacts_connect();
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	elm_shutdown();
	return 0;
}
