// Time from pushing a view with a 50-row genlist to its first rendered frame,
// headless (buffer engine).
#include "BenchLoop.h"
#include "WGenlistItem.h"
#include "WNaviframe.h"
#include "WView.h"
#include "WWindow.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>

#include <cstdlib>
#include <cstring>
#include <string>

namespace {

using ct::bench::pumpFor;
using ct::bench::pumpUntil;

constexpr int kRows = 50;

class BenchRow : public app_assist::WGenlistItem {
public:
	explicit BenchRow(int index)
		: m_text("Contact " + std::to_string(index))
	{
	}
	Elm_Genlist_Item_Class* getItemClassStatic() override
	{
		static Elm_Genlist_Item_Class itc = [] {
			Elm_Genlist_Item_Class c = {};
			c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
			c.item_style = "double_label";
			c.func.text_get = [](void* data, Evas_Object*, const char* part) -> char* {
				auto* row = static_cast<BenchRow*>(data);
				return strcmp(part, "elm.text") == 0 ? strdup(row->m_text.c_str()) : strdup("010-1234-5678");
			};
			return c;
		}();
		return &itc;
	}

private:
	std::string m_text;
};

class ListView : public app_assist::WView {
protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		Evas_Object* genlist = elm_genlist_add(parent);
		elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
		elm_genlist_homogeneous_set(genlist, EINA_TRUE);
		for (int i = 0; i < kRows; ++i) {
			auto* row = new BenchRow(i);
			row->setElmObjectItem(elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr));
		}
		return genlist;
	}
};

void renderPostCb(void* data, Evas*, void*)
{
	*static_cast<bool*>(data) = true;
}

void BM_PushListViewToFirstFrame(benchmark::State& state)
{
	app_assist::WWindow window("bench", 480, 800);
	auto* naviframe = new app_assist::WNaviframe(&window);
	naviframe->create(window.getBaseLayoutEvasObj(), nullptr);
	window.setContent(naviframe->getEvasObj());
	Evas* canvas = evas_object_evas_get(window.getEvasObj());
	pumpFor(0.1);
	for (auto _ : state) {
		bool rendered = false;
		evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, renderPostCb, &rendered);
		naviframe->push(new ListView());
		pumpUntil([&] { return rendered; }, 5.0);
		evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, renderPostCb, &rendered);
		state.PauseTiming();
		if (!rendered)
			state.SkipWithError("no frame was rendered");
		naviframe->getTopView()->destroy();
		pumpFor(0.02);
		state.ResumeTiming();
	}
	state.counters["rows"] = kRows;
	naviframe->destroy();
	pumpFor(0.02);
}
BENCHMARK(BM_PushListViewToFirstFrame)->Unit(benchmark::kMillisecond)->Iterations(30);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	elm_init(0, nullptr);
	elm_config_transition_duration_factor_set(0.0);
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	elm_shutdown();
	return 0;
}
