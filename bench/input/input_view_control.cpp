// The edit form, headless, on a stored contact of 50 field records: from the
// construction of the form (and of its list control alone) to the first drawn
// frame, against a bare genlist holding the same first row in the same run; and the main-loop
// work of typing one character into a number row while all 50 rows are listed.
#include "BenchLoop.h"
#include "ContactsCommon.h"
#include "CtInputData.h"
#include "CtInputView.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewControl.h"
#include "CtInputViewFieldItem.h"
#include "CtThemeMgr.h"
#include "WNaviframe.h"
#include "WView.h"
#include "WWindow.h"

#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <contacts.h>
#include <glib.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

using ct::bench::pumpFor;
using ct::bench::pumpUntil;
using Clock = std::chrono::steady_clock;

int g_contactId = 0;

void addText(contacts_record_h contact, unsigned int list, const char* uri, unsigned int property, const std::string& text)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_set_str(child, property, text.c_str());
	contacts_record_add_child_record(contact, list, child);
}

// A contact of 50 field records: numbers, e-mails, addresses, web sites and events.
int storeFiftyFieldContact()
{
	contacts_record_h contact = nullptr;
	contacts_record_create(_contacts_contact._uri, &contact);
	contacts_record_h name = nullptr;
	contacts_record_create(_contacts_name._uri, &name);
	contacts_record_set_str(name, _contacts_name.first, "Ada");
	contacts_record_set_str(name, _contacts_name.last, "Byron");
	contacts_record_add_child_record(contact, _contacts_contact.name, name);
	for (int i = 0; i < 20; ++i)
		addText(contact, _contacts_contact.number, _contacts_number._uri, _contacts_number.number,
				"0101234" + std::to_string(1000 + i));
	for (int i = 0; i < 15; ++i)
		addText(contact, _contacts_contact.email, _contacts_email._uri, _contacts_email.email,
				"ada" + std::to_string(i) + "@example.com");
	for (int i = 0; i < 5; ++i)
		addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street,
				std::to_string(i + 1) + " Analytical Street");
	for (int i = 0; i < 5; ++i)
		addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url,
				"https://example.com/" + std::to_string(i));
	for (int i = 0; i < 5; ++i) {
		contacts_record_h event = nullptr;
		contacts_record_create(_contacts_event._uri, &event);
		contacts_record_set_int(event, _contacts_event.date, 18151210 + i);
		contacts_record_add_child_record(contact, _contacts_contact.event, event);
	}
	int id = 0;
	contacts_db_insert_record(contact, &id);
	contacts_record_destroy(contact, true);
	return id;
}

std::shared_ptr<CtInputData> loadContact()
{
	contacts_record_h record = nullptr;
	contacts_db_get_record(_contacts_contact._uri, g_contactId, &record);
	return std::make_shared<CtInputData>(record);
}

// The edit form's body: the list control, or a bare genlist of the row the
// control shows in its first frame.
class FormView : public app_assist::WView {
public:
	explicit FormView(bool bare) : m_bare(bare) {}
	CtInputViewControl* getControl() const { return static_cast<CtInputViewControl*>(m_control.lock().get()); }
	Evas_Object* getGenlist() const { return m_genlist; }

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		m_data = loadContact();
		Evas_Object* box = elm_box_add(parent);
		if (m_bare) {
			m_genlist = elm_genlist_add(box);
			CtThemeMgr::getInstance()->setObjectTheme(m_genlist);
			elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
			auto* row = new CtInputViewBasicInfoItem(m_data, nullptr, {}, -1);
			row->setElmObjectItem(elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
					ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr));
		} else {
			auto* control = new CtInputViewControl(m_data, nullptr, nullptr, nullptr, nullptr);
			control->create(box, nullptr);
			m_control = control->getWeakPtr();
			m_genlist = control->getGenlist();
		}
		evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
		evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
		evas_object_show(m_genlist);
		elm_box_pack_end(box, m_genlist);
		return box;
	}

private:
	bool m_bare;
	std::shared_ptr<CtInputData> m_data;
	std::weak_ptr<app_assist::WControl> m_control;
	Evas_Object* m_genlist = nullptr;
};

class Screen {
public:
	Screen() : m_window("bench", 360, 640)
	{
		for (const char* edj : { "contacts/contacts.edj", "contacts/detail_layout.edj" }) {
			std::string path;
			if (ContactsCommon::getAppEdjePath(edj, path, true))
				CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
		}
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
	// Seconds the last timeToFirstFrame spent making and pushing the view
	// (the frame itself waits for the next animation tick).
	double lastPushed = 0.0;
	Evas* canvas() { return evas_object_evas_get(m_window.getEvasObj()); }

	// Seconds from making the view until the end of the first rendered frame
	// with a row in its list; -1 when none was drawn.
	template <class Make>
	double timeToFirstFrame(Make make)
	{
		struct Probe {
			app_assist::WView* view = nullptr;
			Clock::time_point at;
			bool shown = false;
		} probe;
		auto renderPost = [](void* data, Evas*, void*) {
			auto* p = static_cast<Probe*>(data);
			Evas_Object* genlist = p->view ? genlistOf(p->view) : nullptr;
			if (!p->shown && genlist && elm_genlist_items_count(genlist) > 0) {
				p->shown = true;
				p->at = Clock::now();
			}
		};
		evas_event_callback_add(canvas(), EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		Clock::time_point start = Clock::now();
		probe.view = make();
		m_naviframe->push(probe.view);
		lastPushed = std::chrono::duration<double>(Clock::now() - start).count();
		pumpUntil([&] { return probe.shown; }, 5.0);
		evas_event_callback_del_full(canvas(), EVAS_CALLBACK_RENDER_POST, renderPost, &probe);
		m_naviframe->getTopView()->destroy();
		pumpFor(0.02);
		return probe.shown ? std::chrono::duration<double>(probe.at - start).count() : -1.0;
	}

private:
	static Evas_Object* genlistOf(app_assist::WView* view)
	{
		if (auto* form = dynamic_cast<FormView*>(view))
			return form->getGenlist();
		auto* control = dynamic_cast<CtInputViewControl*>(static_cast<CtInputView*>(view)->getInputControl());
		return control ? control->getGenlist() : nullptr;
	}

	app_assist::WWindow m_window;
	app_assist::WNaviframe* m_naviframe = nullptr;
};

double median(std::vector<double> values)
{
	std::sort(values.begin(), values.end());
	return values.empty() ? 0.0 : values[values.size() / 2];
}

void BM_EditFormFirstFrame_FiftyRecords(benchmark::State& state)
{
	Screen screen;
	std::vector<double> form, bare, control, formPushed, barePushed;
	for (auto _ : state) {
		double bareTime = screen.timeToFirstFrame([] { return new FormView(true); });
		barePushed.push_back(screen.lastPushed);
		double controlTime = screen.timeToFirstFrame([] { return new FormView(false); });
		double formTime = screen.timeToFirstFrame([] {
			contacts_record_h record = nullptr;
			contacts_db_get_record(_contacts_contact._uri, g_contactId, &record);
			return new CtInputView(record);
		});
		formPushed.push_back(screen.lastPushed);
		if (bareTime < 0 || formTime < 0 || controlTime < 0) {
			state.SkipWithError("no frame with a row was rendered");
			break;
		}
		bare.push_back(bareTime);
		control.push_back(controlTime);
		form.push_back(formTime);
		state.SetIterationTime(formTime);
	}
	state.counters["form_median_ms"] = median(form) * 1000;
	state.counters["control_median_ms"] = median(control) * 1000;
	state.counters["bare_median_ms"] = median(bare) * 1000;
	state.counters["ratio"] = median(bare) > 0 ? median(form) / median(bare) : 0;
	state.counters["form_push_ms"] = median(formPushed) * 1000;
	state.counters["bare_push_ms"] = median(barePushed) * 1000;
}
BENCHMARK(BM_EditFormFirstFrame_FiftyRecords)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(30);

// One character typed into the first number row: the entry's change handling
// (the row writes the record, the control walks its rows for the Save button)
// and whatever the main loop then has to do before it would sleep.
void BM_TypeOneCharacter_FiftyRows(benchmark::State& state)
{
	Screen screen;
	auto* view = new FormView(false);
	screen.naviframe()->push(view);
	pumpUntil([view] { return view->getControl() && !view->getControl()->isAppending(); }, 10.0);
	pumpFor(0.2);
	Evas_Object* entry = nullptr;
	for (Elm_Object_Item* it = elm_genlist_first_item_get(view->getGenlist()); it && !entry;
			it = elm_genlist_item_next_get(it))
		if (auto* row = dynamic_cast<CtInputViewFieldItem*>(static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(it))))
			entry = row->getEntry();
	if (!entry) {
		state.SkipWithError("no number entry is shown");
		return;
	}
	int rows = elm_genlist_items_count(view->getGenlist());
	std::vector<double> times;
	for (auto _ : state) {
		Clock::time_point start = Clock::now();
		elm_entry_entry_insert(entry, "5");
		while (ecore_main_loop_iterate_may_block(EINA_FALSE))
			;
		times.push_back(std::chrono::duration<double>(Clock::now() - start).count());
		state.SetIterationTime(times.back());
		if (elm_entry_cursor_pos_get(entry) > 900)
			elm_entry_entry_set(entry, "");
	}
	state.counters["rows"] = rows;
	state.counters["median_ms"] = median(times) * 1000;
	view->destroy();
	pumpFor(0.05);
}
BENCHMARK(BM_TypeOneCharacter_FiftyRows)->UseManualTime()->Unit(benchmark::kMicrosecond)->Iterations(300);

} // namespace

int main(int argc, char** argv)
{
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	char folder[] = "/tmp/contacts-bench-form-XXXXXX";
	if (!g_mkdtemp(folder))
		return 1;
	setenv("CONTACTS_DATA_DIR", folder, 1);
	elm_init(0, nullptr);
	elm_config_transition_duration_factor_set(0.0);
	contacts_connect();
	g_contactId = storeFiftyFieldContact();
	benchmark::Initialize(&argc, argv);
	benchmark::RunSpecifiedBenchmarks();
	benchmark::Shutdown();
	contacts_disconnect();
	elm_shutdown();
	std::string remove = std::string("rm -rf '") + folder + "'";
	return system(remove.c_str()) == 0 ? 0 : 1;
}
