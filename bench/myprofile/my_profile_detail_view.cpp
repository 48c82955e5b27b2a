// The user's own profile screen, headless: from the factory call to the
// first rendered frame that shows its rows, for a profile with a picture,
// a status and eleven fields, against a bare genlist of as many rows pushed
// the same way in the same run.
#include "BenchLoop.h"
#include "ContactsDetails.h"
#include "CtMyProfileDetailView.h"
#include "WGenlistItem.h"
#include "WNaviframe.h"
#include "WView.h"
#include "WWindow.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <contacts.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <string>
#include <vector>

namespace {

using ct::bench::pumpFor;
using ct::bench::pumpUntil;
using Clock = std::chrono::steady_clock;

// The picture row and eleven field rows.
constexpr unsigned kRows = 12;

std::string g_dataDir;

contacts_record_h addChild(contacts_record_h profile, unsigned int property, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(profile, property, child);
	return child;
}

void addText(contacts_record_h profile, unsigned int list, const char* uri, unsigned int property, const char* text)
{
	contacts_record_set_str(addChild(profile, list, uri), property, text);
}

std::string writePicture(Evas* canvas)
{
	std::string path = g_dataDir + "/me.png";
	Evas_Object* image = evas_object_image_filled_add(canvas);
	evas_object_image_size_set(image, 320, 320);
	auto* pixels = static_cast<uint32_t*>(evas_object_image_data_get(image, EINA_TRUE));
	for (int i = 0; pixels && i < 320 * 320; ++i)
		pixels[i] = i < 320 * 160 ? 0xFF3C78B4 : 0xFFE8A33C;
	evas_object_image_data_set(image, pixels);
	evas_object_image_save(image, path.c_str(), nullptr, nullptr);
	evas_object_del(image);
	return path;
}

// A picture, a status, its own number and two more, two e-mails, an address,
// a note, an event, a relationship, a web site and a messenger.
void storeProfile(const std::string& picture)
{
	contacts_record_h profile = nullptr;
	contacts_record_create(_contacts_my_profile._uri, &profile);
	contacts_record_set_str(addChild(profile, _contacts_my_profile.name, _contacts_name._uri), _contacts_name.first,
		"Benchmark");
	contacts_record_set_str(profile, _contacts_my_profile_ex.status, "Measuring");
	contacts_record_h image = addChild(profile, _contacts_my_profile.image, _contacts_image._uri);
	contacts_record_set_str(image, _contacts_image.path, picture.c_str());
	contacts_record_set_int(image, _contacts_image_ex.order, 1);
	for (const char* number : {"010-1111-0000", "010-2222-0000", "010-3333-0000"}) {
		contacts_record_h child = addChild(profile, _contacts_my_profile.number, _contacts_number._uri);
		contacts_record_set_str(child, _contacts_number.number, number);
		contacts_record_set_bool(child, _contacts_number.is_default, strcmp(number, "010-1111-0000") == 0);
	}
	for (const char* email : {"me@example.com", "work@example.com"})
		addText(profile, _contacts_my_profile.email, _contacts_email._uri, _contacts_email.email, email);
	addText(profile, _contacts_my_profile.address, _contacts_address._uri, _contacts_address.street, "1 Main St");
	addText(profile, _contacts_my_profile.note, _contacts_note._uri, _contacts_note.note, "Measured often");
	contacts_record_h event = addChild(profile, _contacts_my_profile.event, _contacts_event._uri);
	contacts_record_set_int(event, _contacts_event.date, 19900315);
	contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	addText(profile, _contacts_my_profile.relationship, _contacts_relationship._uri, _contacts_relationship.name, "Kim");
	addText(profile, _contacts_my_profile.url, _contacts_url._uri, _contacts_url.url, "example.org");
	addText(profile, _contacts_my_profile.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, "me.chat");
	int id = 0;
	if (contacts_db_insert_record(profile, &id) != CONTACTS_ERROR_NONE)
		fprintf(stderr, "cannot store the profile\n");
	contacts_record_destroy(profile, true);
}

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
		for (unsigned i = 0; i < kRows; ++i) {
			auto* row = new BareRow();
			row->setElmObjectItem(elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr));
		}
		return genlist;
	}
};

struct Timing {
	double pushed = -1.0;     // seconds from the factory call until push returned
	double firstFrame = -1.0; // until the first frame with every row was drawn; -1 when none
};

class Screen {
public:
	Screen()
		: m_window("bench", 360, 640)
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
	Evas* canvas() { return evas_object_evas_get(m_window.getEvasObj()); }

	template <class Make>
	Timing timeToFirstFrame(Make make)
	{
		struct Probe {
			Evas_Object* genlist = nullptr;
			Clock::time_point at;
			bool shown = false;
		} probe;
		auto renderPost = [](void* data, Evas*, void*) {
			auto* p = static_cast<Probe*>(data);
			if (!p->shown && p->genlist && elm_genlist_items_count(p->genlist) >= kRows) {
				p->shown = true;
				p->at = Clock::now();
			}
		};
		evas_event_callback_add(canvas(), EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		Clock::time_point start = Clock::now();
		app_assist::WView* view = make();
		m_naviframe->push(view);
		Timing timing;
		timing.pushed = std::chrono::duration<double>(Clock::now() - start).count();
		auto* profile = dynamic_cast<CtMyProfileDetailView*>(view);
		probe.genlist = profile ? profile->getGenlist() : view->getEvasObj();
		pumpUntil([&] { return probe.shown; }, 5.0);
		evas_event_callback_del_full(canvas(), EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		m_naviframe->getTopView()->destroy();
		pumpFor(0.02);
		if (probe.shown)
			timing.firstFrame = std::chrono::duration<double>(probe.at - start).count();
		return timing;
	}

private:
	app_assist::WWindow m_window;
	app_assist::WNaviframe* m_naviframe = nullptr;
};

double median(std::vector<double> values)
{
	std::sort(values.begin(), values.end());
	return values.empty() ? 0.0 : values[values.size() / 2];
}

void BM_MyProfileDetailViewFirstFrame(benchmark::State& state)
{
	Screen screen;
	storeProfile(writePicture(screen.canvas()));
	pumpFor(0.7); // the store's change notice, before anything listens
	std::vector<double> profile, bare, profilePushed, barePushed;
	for (auto _ : state) {
		Timing bareTiming = screen.timeToFirstFrame([] { return new BareListView(); });
		Timing profileTiming = screen.timeToFirstFrame([] { return createCtMyProfileDetailView(); });
		if (bareTiming.firstFrame < 0 || profileTiming.firstFrame < 0) {
			state.SkipWithError("no frame with every row was rendered");
			break;
		}
		bare.push_back(bareTiming.firstFrame);
		profile.push_back(profileTiming.firstFrame);
		barePushed.push_back(bareTiming.pushed);
		profilePushed.push_back(profileTiming.pushed);
		state.SetIterationTime(profileTiming.firstFrame);
	}
	state.counters["profile_median_ms"] = median(profile) * 1000;
	state.counters["bare_median_ms"] = median(bare) * 1000;
	// The canvas draws on animation ticks: the push times show the work itself.
	state.counters["profile_push_ms"] = median(profilePushed) * 1000;
	state.counters["bare_push_ms"] = median(barePushed) * 1000;
	state.counters["ratio"] = median(bare) > 0 ? median(profile) / median(bare) : 0;
}
BENCHMARK(BM_MyProfileDetailViewFirstFrame)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(30);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	setenv("CONTACTS_LOG_LEVEL", "error", 0);
	char pattern[] = "/tmp/my-profile-view-bench-XXXXXX";
	if (!mkdtemp(pattern))
		return 1;
	g_dataDir = pattern;
	setenv("CONTACTS_DATA_DIR", g_dataDir.c_str(), 1);
	elm_init(0, nullptr);
	elm_config_transition_duration_factor_set(0.0);
	if (contacts_connect() != CONTACTS_ERROR_NONE)
		return 1;
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	elm_shutdown();
	std::error_code ec;
	std::filesystem::remove_all(g_dataDir, ec);
	return 0;
}
