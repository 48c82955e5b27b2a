// The contact detail screen on the generated 100,000-person database,
// headless: from the factory call to the first rendered frame that shows six
// rows, for a person of 10 linked contacts with over 100 child records,
// against a bare six-row genlist pushed the same way in the same run; and
// how many rebuilds a burst of ten changes within two seconds costs.
#include "BenchLoop.h"
#include "ContactsBenchData.h"
#include "ContactsDetails.h"
#include "CtDetailView.h"
#include "WGenlistItem.h"
#include "WNaviframe.h"
#include "WView.h"
#include "WWindow.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

namespace {

using ct::bench::pumpFor;
using ct::bench::pumpUntil;

using Clock = std::chrono::steady_clock;

constexpr unsigned kFirstRows = 6;

ct::bench::BenchDatabase g_db;

class BareRow : public app_assist::WGenlistItem {
public:
	Elm_Genlist_Item_Class* getItemClassStatic() override
	{
		static Elm_Genlist_Item_Class itc = [] {
			Elm_Genlist_Item_Class c = {};
			c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
			c.item_style = "double_label";
			c.func.text_get = [](void*, Evas_Object*, const char* part) -> char* {
				return strdup(strcmp(part, "elm.text") == 0 ? "Mobile" : "010-1234-5678");
			};
			return c;
		}();
		return &itc;
	}
};

class BareListView : public app_assist::WView {
protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		Evas_Object* genlist = elm_genlist_add(parent);
		elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
		for (unsigned i = 0; i < kFirstRows; ++i) {
			auto* row = new BareRow();
			row->setElmObjectItem(elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr));
		}
		return genlist;
	}
};

// A window with a naviframe, torn down with everything pushed on it.
class Screen {
public:
	Screen()
		: m_window("bench", 480, 800)
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

	struct Timing {
		double pushed = -1.0; // seconds from `make()` until push returned
		double firstFrame = -1.0; // until the first frame with six rows was drawn; -1 when none
	};

	// How long `make()` and pushing its view take, and how long until the end
	// of the first rendered frame in which the view's genlist holds six rows.
	template <class Make>
	Timing timeToFirstFrame(Make make)
	{
		struct Probe {
			Evas_Object* genlist = nullptr;
			Clock::time_point at;
			bool shown = false;
		} probe;
		Evas* canvas = evas_object_evas_get(m_window.getEvasObj());
		auto renderPost = [](void* data, Evas*, void*) {
			auto* p = static_cast<Probe*>(data);
			if (!p->shown && p->genlist && elm_genlist_items_count(p->genlist) >= kFirstRows) {
				p->shown = true;
				p->at = Clock::now();
			}
		};
		evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		Clock::time_point start = Clock::now();
		app_assist::WView* view = make();
		m_naviframe->push(view);
		Timing timing;
		timing.pushed = std::chrono::duration<double>(Clock::now() - start).count();
		probe.genlist = genlistOf(view);
		pumpUntil([&] { return probe.shown; }, 5.0);
		evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		m_naviframe->getTopView()->destroy();
		pumpFor(0.02);
		if (probe.shown)
			timing.firstFrame = std::chrono::duration<double>(probe.at - start).count();
		return timing;
	}

private:
	static Evas_Object* genlistOf(app_assist::WView* view)
	{
		if (auto* detail = dynamic_cast<CtDetailView*>(view))
			return detail->getGenlist();
		return view->getEvasObj();
	}

	app_assist::WWindow m_window;
	app_assist::WNaviframe* m_naviframe = nullptr;
};

double median(std::vector<double> values)
{
	std::sort(values.begin(), values.end());
	return values.empty() ? 0.0 : values[values.size() / 2];
}

void BM_DetailViewFirstFrame_BigPerson(benchmark::State& state)
{
	Screen screen;
	std::vector<double> detail, bare, detailPushed, barePushed;
	for (auto _ : state) {
		Screen::Timing bareTiming = screen.timeToFirstFrame([] { return new BareListView(); });
		Screen::Timing detailTiming = screen.timeToFirstFrame([] { return createCtDetailView(g_db.bigPersonId, nullptr); });
		if (bareTiming.firstFrame < 0 || detailTiming.firstFrame < 0) {
			state.SkipWithError("no frame with six rows was rendered");
			break;
		}
		bare.push_back(bareTiming.firstFrame);
		detail.push_back(detailTiming.firstFrame);
		barePushed.push_back(bareTiming.pushed);
		detailPushed.push_back(detailTiming.pushed);
		state.SetIterationTime(detailTiming.firstFrame);
	}
	state.counters["detail_median_ms"] = median(detail) * 1000;
	state.counters["bare_median_ms"] = median(bare) * 1000;
	// The canvas draws on animation ticks: the first frame waits for the
	// next tick after the push, so the push times show the work itself.
	state.counters["detail_push_ms"] = median(detailPushed) * 1000;
	state.counters["bare_push_ms"] = median(barePushed) * 1000;
	state.counters["ratio"] = median(bare) > 0 ? median(detail) / median(bare) : 0;
}
BENCHMARK(BM_DetailViewFirstFrame_BigPerson)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(40);

// Ten changes of the shown person 0.15 s apart, then quiet until the
// coalescing period is over: the rebuild count is the figure.
void BM_DetailViewChangeBurst(benchmark::State& state)
{
	Screen screen;
	int contactId = ct::bench::firstContactId(g_db.bigPersonId, CONTACTS_MATCH_EQUAL);
	int rebuilds = 0;
	for (auto _ : state) {
		auto* view = static_cast<CtDetailView*>(createCtDetailView(g_db.bigPersonId, nullptr));
		screen.naviframe()->push(view);
		pumpUntil([view] { return !view->isBuildingRows(); }, 5.0);
		Clock::time_point start = Clock::now();
		for (int i = 0; i < 10; ++i) {
			ct::bench::touchContact(contactId, i);
			pumpFor(0.15);
		}
		pumpFor(4.5);
		state.SetIterationTime(std::chrono::duration<double>(Clock::now() - start).count());
		rebuilds = view->getRebuildCount();
		view->destroy();
		pumpFor(0.02);
	}
	state.counters["rebuilds"] = rebuilds;
	if (rebuilds != 2)
		state.SkipWithError("a burst of ten changes did not cost exactly two rebuilds");
}
BENCHMARK(BM_DetailViewChangeBurst)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(1);

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
