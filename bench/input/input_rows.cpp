// The edit form rows, headless: formatting a typed number for the region,
// and a 100 KB paste into a 1000-character entry with the rows' length limit
// against the toolkit's size filter alone (which trims one character at a
// time).
#include "CtInputViewGenlistItem.h"
#include "CtInputViewNumberItem.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>

#include <cstdlib>
#include <string>

namespace {

Evas_Object* g_win = nullptr;

std::string pastedText()
{
	std::string text;
	while (text.size() < 100 * 1024)
		text += "\xc3\xa9";
	return text;
}

void BM_FormatTypedNumber(benchmark::State& state)
{
	for (auto _ : state)
		benchmark::DoNotOptimize(CtInputViewNumberItem::formatNumber("+1 (650) 253-0000"));
}
BENCHMARK(BM_FormatTypedNumber);

void paste(benchmark::State& state, bool rowLimit)
{
	std::string text = pastedText();
	Elm_Entry_Filter_Limit_Size toolkitLimit = {1000, 0};
	for (auto _ : state) {
		Evas_Object* entry = elm_entry_add(g_win);
		elm_entry_single_line_set(entry, EINA_TRUE);
		if (rowLimit)
			CtInputViewGenlistItem::addLengthLimit(entry, 1000);
		else
			elm_entry_markup_filter_append(entry, elm_entry_filter_limit_size, &toolkitLimit);
		elm_entry_entry_insert(entry, text.c_str());
		benchmark::DoNotOptimize(elm_entry_entry_get(entry));
		evas_object_del(entry);
	}
}

void BM_Paste100KbWithRowLimit(benchmark::State& state)
{
	paste(state, true);
}
BENCHMARK(BM_Paste100KbWithRowLimit)->Unit(benchmark::kMillisecond);

void BM_Paste100KbWithToolkitFilterOnly(benchmark::State& state)
{
	paste(state, false);
}
BENCHMARK(BM_Paste100KbWithToolkitFilterOnly)->Unit(benchmark::kMillisecond)->Iterations(2);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	elm_init(argc, argv);
	g_win = elm_win_add(nullptr, "bench", ELM_WIN_BASIC);
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	evas_object_del(g_win);
	elm_shutdown();
	return 0;
}
