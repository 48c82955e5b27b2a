// The full-screen picture view of a profile with five 720x720 pictures,
// headless at 360x640: from making the view to the end of the first rendered
// frame that shows its pager with five pages laid out, against a bare view
// showing one of the pictures, pushed the same way in the same run.
#include "BenchLoop.h"
#include "CtDetailImageView.h"
#include "CtMyProfileDetailData.h"
#include "WNaviframe.h"
#include "WWindow.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

namespace {

using ct::bench::pumpFor;
using ct::bench::pumpUntil;

using Clock = std::chrono::steady_clock;

constexpr int kPages = 5;
std::string g_dataDir;

void writePicture(Evas_Object* win, const std::string& path, uint32_t colour)
{
	Evas_Object* image = evas_object_image_filled_add(evas_object_evas_get(win));
	evas_object_image_size_set(image, 720, 720);
	auto* pixels = static_cast<uint32_t*>(evas_object_image_data_get(image, EINA_TRUE));
	for (int i = 0; i < 720 * 720; ++i)
		pixels[i] = 0xff000000u | (colour + i);
	evas_object_image_data_set(image, pixels);
	evas_object_image_save(image, path.c_str(), nullptr, nullptr);
	evas_object_del(image);
}

void storeProfile(Evas_Object* win)
{
	contacts_record_h profile = nullptr;
	contacts_record_create(_contacts_my_profile._uri, &profile);
	for (int order = 1; order <= kPages; ++order) {
		std::string path = g_dataDir + "/me-" + std::to_string(order) + ".png";
		writePicture(win, path, 0x203040u * order);
		contacts_record_h image = nullptr;
		contacts_record_create(_contacts_image._uri, &image);
		contacts_record_set_str(image, _contacts_image.path, path.c_str());
		contacts_record_set_int(image, _contacts_image_ex.order, order);
		contacts_record_add_child_record(profile, _contacts_my_profile.image, image);
	}
	int id = 0;
	contacts_db_insert_record(profile, &id);
	contacts_record_destroy(profile, true);
}

bool pagesLaidOut(CtDetailImageView* view)
{
	Evas_Object* pager = view->getPager();
	if (!pager)
		return false;
	Evas_Coord w = 0, contentW = 0;
	evas_object_geometry_get(pager, nullptr, nullptr, &w, nullptr);
	elm_scroller_child_size_get(pager, &contentW, nullptr);
	return w > 0 && contentW >= w * kPages;
}

class BarePictureView : public app_assist::WView {
public:
	explicit BarePictureView(std::string path) : m_path(std::move(path)) {}
	bool drawn() const { return m_image && evas_object_visible_get(m_image); }

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		m_image = elm_image_add(parent);
		elm_image_preload_disabled_set(m_image, EINA_TRUE);
		elm_image_file_set(m_image, m_path.c_str(), nullptr);
		return m_image;
	}

private:
	std::string m_path;
	Evas_Object* m_image = nullptr;
};

double median(std::vector<double> values)
{
	std::sort(values.begin(), values.end());
	return values.empty() ? 0.0 : values[values.size() / 2];
}

void BM_DetailImageViewFirstFrame_FivePages(benchmark::State& state)
{
	app_assist::WWindow window("bench", 360, 640);
	auto* naviframe = new app_assist::WNaviframe(&window);
	naviframe->create(window.getBaseLayoutEvasObj(), nullptr);
	window.setContent(naviframe->getEvasObj());
	storeProfile(window.getEvasObj());
	CtMyProfileDetailData data;
	pumpUntil([] { return false; }, 0.1);

	struct Probe {
		CtDetailImageView* view = nullptr;
		Clock::time_point at;
		bool shown = false;
	} probe;
	Evas* canvas = evas_object_evas_get(window.getEvasObj());
	auto renderPost = [](void* p, Evas*, void*) {
		auto* probe = static_cast<Probe*>(p);
		if (!probe->shown && probe->view && pagesLaidOut(probe->view)) {
			probe->shown = true;
			probe->at = Clock::now();
		}
	};
	evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
	std::vector<double> firstFrame, pushed, bare;
	for (auto _ : state) {
		bool bareDrawn = false;
		auto bareRender = [](void* p, Evas*, void*) { *static_cast<bool*>(p) = true; };
		Clock::time_point bareStart = Clock::now();
		auto* bareView = new BarePictureView(g_dataDir + "/me-1.png");
		naviframe->push(bareView);
		evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, bareRender, &bareDrawn);
		pumpUntil([&] { return bareDrawn && bareView->drawn(); }, 5.0);
		evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, bareRender, &bareDrawn);
		bare.push_back(std::chrono::duration<double>(Clock::now() - bareStart).count());
		bareView->destroy();
		pumpUntil([] { return false; }, 0.02);

		probe = Probe();
		Clock::time_point start = Clock::now();
		auto* view = new CtDetailImageView(&data, true, 0);
		naviframe->push(view);
		pushed.push_back(std::chrono::duration<double>(Clock::now() - start).count());
		probe.view = view;
		pumpUntil([&] { return probe.shown; }, 5.0);
		if (!probe.shown) {
			state.SkipWithError("no frame showed five pages");
			break;
		}
		double seconds = std::chrono::duration<double>(probe.at - start).count();
		firstFrame.push_back(seconds);
		state.SetIterationTime(seconds);
		probe.view = nullptr;
		view->destroy();
		pumpUntil([] { return false; }, 0.02);
	}
	evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
	state.counters["first_frame_median_ms"] = median(firstFrame) * 1000;
	// The canvas draws on animation ticks: the push time shows the work itself.
	state.counters["push_median_ms"] = median(pushed) * 1000;
	state.counters["bare_median_ms"] = median(bare) * 1000;
	naviframe->destroy();
	pumpUntil([] { return false; }, 0.05);
}
BENCHMARK(BM_DetailImageViewFirstFrame_FivePages)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(30);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	setenv("CONTACTS_LOG_LEVEL", "error", 0);
	char pattern[] = "/tmp/image-view-bench-XXXXXX";
	if (!mkdtemp(pattern))
		return 1;
	g_dataDir = pattern;
	setenv("CONTACTS_DATA_DIR", g_dataDir.c_str(), 1);
	elm_init(0, nullptr);
	elm_config_transition_duration_factor_set(0.0);
	contacts_connect();
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	elm_shutdown();
	std::error_code ec;
	std::filesystem::remove_all(g_dataDir, ec);
	return 0;
}
