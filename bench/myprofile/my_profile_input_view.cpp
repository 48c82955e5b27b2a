// The profile editor, headless, on a rich stored profile (five pictures,
// five numbers, e-mails, addresses, websites, messengers, events and a note):
// from the factory call to the first drawn frame, and Done on a changed
// profile until the screen has left (the profile written back).
#include "BenchLoop.h"
#include "ContactsDetails.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtMyProfileInputView.h"
#include "WNaviframe.h"
#include "WWindow.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <chrono>
#include <cstdlib>
#include <string>

namespace {

using ct::bench::pumpFor;
using ct::bench::pumpUntil;
using Clock = std::chrono::steady_clock;

constexpr int kChildren = 5;

double seconds(Clock::time_point from, Clock::time_point to)
{
	return std::chrono::duration<double>(to - from).count();
}

contacts_record_h addChild(contacts_record_h parent, unsigned int property, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(parent, property, child);
	return child;
}

void addText(contacts_record_h parent, unsigned int property, const char* uri, unsigned int textProperty, const std::string& text)
{
	contacts_record_set_str(addChild(parent, property, uri), textProperty, text.c_str());
}

void storeRichProfile(const std::string& pictureDir)
{
	contacts_record_h profile = nullptr;
	contacts_record_create(_contacts_my_profile._uri, &profile);
	contacts_record_set_str(addChild(profile, _contacts_my_profile.name, _contacts_name._uri), _contacts_name.first, "Maximiliana");
	for (int i = 1; i <= kChildren; ++i) {
		std::string n = std::to_string(i);
		addText(profile, _contacts_my_profile.number, _contacts_number._uri, _contacts_number.number, "010555000" + n);
		addText(profile, _contacts_my_profile.email, _contacts_email._uri, _contacts_email.email, "me" + n + "@example.org");
		addText(profile, _contacts_my_profile.address, _contacts_address._uri, _contacts_address.street, n + " Long Street");
		addText(profile, _contacts_my_profile.url, _contacts_url._uri, _contacts_url.url, "https://example.org/" + n);
		addText(profile, _contacts_my_profile.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, "im" + n);
		contacts_record_h event = addChild(profile, _contacts_my_profile.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.date, 19800100 + i);
		contacts_record_h image = addChild(profile, _contacts_my_profile.image, _contacts_image._uri);
		contacts_record_set_str(image, _contacts_image.path, (pictureDir + "/missing" + n + ".png").c_str());
		contacts_record_set_int(image, _contacts_image_ex.order, i);
	}
	addText(profile, _contacts_my_profile.note, _contacts_note._uri, _contacts_note.note, "A note");
	contacts_db_insert_record(profile, nullptr);
	contacts_record_destroy(profile, true);
}

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

void BM_MyProfileEditorFirstFrame_RichProfile(benchmark::State& state)
{
	Screen screen;
	int frames = 0;
	Evas_Event_Cb counter = [](void* data, Evas*, void*) { ++*static_cast<int*>(data); };
	evas_event_callback_add(screen.canvas(), EVAS_CALLBACK_RENDER_POST, counter, &frames);
	int rows = 0;
	for (auto _ : state) {
		int before = frames;
		Clock::time_point start = Clock::now();
		auto* view = static_cast<CtMyProfileInputView*>(createCtMyProfileInputView(nullptr, nullptr));
		screen.naviframe()->push(view);
		pumpUntil([&] { return frames > before; }, 5.0);
		state.SetIterationTime(seconds(start, Clock::now()));
		rows = static_cast<int>(elm_genlist_items_count(view->getGenlist()));
		view->destroy();
		pumpFor(0.02);
	}
	evas_event_callback_del_full(screen.canvas(), EVAS_CALLBACK_RENDER_POST, counter, &frames);
	state.counters["rows"] = rows;
}
BENCHMARK(BM_MyProfileEditorFirstFrame_RichProfile)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(20);

void BM_MyProfileEditorSave_RichProfile(benchmark::State& state)
{
	Screen screen;
	int saved = 0;
	for (auto _ : state) {
		state.PauseTiming();
		auto* view = static_cast<CtMyProfileInputView*>(createCtMyProfileInputView(nullptr, nullptr));
		screen.naviframe()->push(view);
		pumpFor(0.1);
		Elm_Object_Item* basic = view->getFirstItem(CtMyProfileInputView::MYPROFILE_INPUT_BASIC_INFO);
		auto* row = dynamic_cast<CtInputViewBasicInfoItem*>(
			static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(basic)));
		elm_entry_entry_insert(row->getFieldEntry(CtInputViewBasicInfoItem::NAME), "x");
		pumpFor(0.02);
		int before = screen.naviframe()->getViewCount();
		state.ResumeTiming();
		Clock::time_point start = Clock::now();
		evas_object_smart_callback_call(view->getDoneButton(), "clicked", nullptr);
		pumpUntil([&] { return screen.naviframe()->getViewCount() < before; }, 5.0);
		state.SetIterationTime(seconds(start, Clock::now()));
		++saved;
	}
	state.counters["saves"] = saved;
}
BENCHMARK(BM_MyProfileEditorSave_RichProfile)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(20);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	char dir[] = "/tmp/bench-myprofile-XXXXXX";
	if (!mkdtemp(dir))
		return 1;
	setenv("CONTACTS_DATA_DIR", dir, 1);
	elm_init(0, nullptr);
	elm_config_transition_duration_factor_set(0.0);
	contacts_connect();
	storeRichProfile(dir);
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	elm_shutdown();
	std::string cleanup = std::string("rm -rf ") + dir;
	return std::system(cleanup.c_str()) == 0 ? 0 : 1;
}
