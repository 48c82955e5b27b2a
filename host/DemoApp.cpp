#include "DemoApp.h"

#include "CanvasPng.h"
#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "DemoLook.h"
#include "DemoPictures.h"
#include "NotificationLog.h"
#include "PersonListView.h"

#include <contacts.h>
#include <notification.h>

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <filesystem>

namespace ct::demo {

namespace {

constexpr double kFrame = 1.0 / 60.0;
constexpr int kQuietFramesForIdle = 3;
// Persons whose detail screens --screenshots saves: picture and favourite,
// linked contacts, a SIM contact, long texts, a lunar birthday.
const char* const kScreenshotPersons[] = {"Anna", "Emma", "Taxi", "Maximiliana", "芳"};

void renderPostCb(void* data, Evas*, void*)
{
	++*static_cast<int*>(data);
}

Eina_Bool wakeCb(void*)
{
	return ECORE_CALLBACK_RENEW;
}

Eina_Bool holdEndCb(void* ended)
{
	*static_cast<bool*>(ended) = true;
	ecore_main_loop_quit();
	return ECORE_CALLBACK_CANCEL;
}

void transitionFinishedCb(void* pushing, Evas_Object*, void*)
{
	*static_cast<bool*>(pushing) = false;
}

void winDeleteRequestCb(void*, Evas_Object*, void*)
{
	elm_exit();
}

} // namespace

DemoApp::DemoApp(DemoOptions options)
	: m_options(std::move(options))
	, m_library(DetailsLibrary::defaultPath())
{
}

DemoApp::~DemoApp()
{
	ct::notification::setToastWindow(nullptr);
	if (auto naviframe = m_naviframeAlive.lock())
		naviframe->destroy();
	ecore_main_loop_iterate();
	m_window.reset();
	ecore_main_loop_iterate();
}

int DemoApp::run()
{
	if (!__start())
		return 1;
	if (!m_options.screenshotDir.empty())
		return __saveScreenshots(m_options.screenshotDir);
	const char* engine = getenv("ELM_ENGINE");
	bool headless = engine && std::string(engine) == "buffer";
	bool shooting = !m_options.screenshotFile.empty();
	if (!__openRequestedScreen() && (headless || shooting))
		return 1;
	if (m_options.holdSeconds > 0)
		__hold(m_options.holdSeconds);
	if (shooting)
		return __saveScreenshot(m_options.screenshotFile);
	if (headless)
		return m_options.holdSeconds > 0 ? 0 : __printPersons();
	return __runWindow();
}

bool DemoApp::__start()
{
	WENTER();
	int err = m_database.open();
	if (err != 0) {
		fprintf(stderr, "contacts-demo: cannot open the contacts store in %s (error %d)\n",
				getenv("CONTACTS_DATA_DIR") ? getenv("CONTACTS_DATA_DIR") : "the data folder", err);
		return false;
	}
	DemoLook::apply();
	// The gallery, camera and editor stand-ins offer the demo pictures.
	DemoPictures::ensure();

	m_window = std::make_unique<app_assist::WWindow>("Contacts", kWidth, kHeight);
	Evas_Object* win = m_window->getEvasObj();
	if (!win) {
		fprintf(stderr, "contacts-demo: cannot open a window (no display? set ELM_ENGINE=buffer)\n");
		return false;
	}
	evas_object_smart_callback_add(win, "delete,request", winDeleteRequestCb, nullptr);
	ct::notification::setToastWindow(win);

	m_naviframe = new app_assist::WNaviframe(m_window.get());
	if (!m_naviframe->create(m_window->getBaseLayoutEvasObj(), nullptr))
		return false;
	m_naviframeAlive = m_naviframe->getWeakPtr();
	m_handlers = std::make_unique<DemoAppControlHandlers>(m_naviframe, DemoAppControlHandlers::Folders::defaults());
	evas_object_smart_callback_add(m_naviframe->getEvasObj(), "transition,finished", transitionFinishedCb, &m_pushing);
	m_window->setContent(m_naviframe->getEvasObj());
	m_naviframe->setOnLastViewBack([](bool* popOut) {
		*popOut = false;
		elm_exit();
	});

	auto* list = new PersonListView([this](int personId) { __openPerson(personId); },
		[this] { __pushScreen(*findDemoScreen("create"), 0); },
		[this](int personId) { __pushScreen(*findDemoScreen("edit"), personId); });
	if (!m_naviframe->push(list))
		return false;
	m_listAlive = list->getWeakPtr();
	__settle();
	return true;
}

int DemoApp::__runWindow()
{
	elm_run();
	return 0;
}

int DemoApp::__printPersons()
{
	PersonListView* list = __list();
	if (!list)
		return 1;
	printf("%zu persons%s\n", list->persons().size(), m_database.wasCreated() ? " (demo store created)" : "");
	for (const PersonSummary& person : list->persons())
		printf("%d\t%s%s\n", person.id, person.name.c_str(), person.favourite ? "\t*" : "");
	return 0;
}

bool DemoApp::__openPerson(int personId)
{
	return __pushScreen(*findDemoScreen("detail"), personId);
}

bool DemoApp::__openRequestedScreen()
{
	if (m_options.screen.empty() && m_options.personId < 1)
		return true;
	const DemoScreen* screen = findDemoScreen(m_options.screen.empty() ? "detail" : m_options.screen);
	if (!screen)
		return false;
	if (m_options.personId > 0) {
		contacts_record_h person = nullptr;
		if (contacts_db_get_record(_contacts_person._uri, m_options.personId, &person) != CONTACTS_ERROR_NONE) {
			fprintf(stderr, "contacts-demo: there is no person %d\n", m_options.personId);
			return false;
		}
		contacts_record_destroy(person, true);
	}
	if (!__pushScreen(*screen, m_options.personId)) {
		fprintf(stderr, "contacts-demo: the %s screen is not part of this build\n", screen->name);
		return false;
	}
	return true;
}

bool DemoApp::__pushScreen(const DemoScreen& screen, int personId)
{
	DemoScreenContext context{m_library, personId, m_keepAlive};
	app_assist::WView* view = nullptr;
	try {
		view = screen.make(context);
	} catch (const std::exception& e) {
		WERROR("the %s screen threw: %s", screen.name, e.what());
	}
	if (!view || !m_naviframe || m_naviframeAlive.expired())
		return false;
	// A screen pushed over another one slides in; pictures wait for the end.
	m_pushing = m_naviframe->getViewCount() > 0;
	bool pushed = m_naviframe->push(view);
	if (!pushed) {
		m_pushing = false;
		return false;
	}
	if (screen.reach) {
		__settle();
		int below = m_naviframe->getViewCount();
		screen.reach(m_window->getEvasObj());
		m_pushing = m_naviframe->getViewCount() > below;
	}
	return true;
}

void DemoApp::__hold(double seconds)
{
	// Scripts driving the host from outside wait for the first line, printed
	// once the screen is up and listening, and read the second to learn what
	// the changes made of the screen.
	__settle();
	printf("holding %s for %g s\n", __topScreenName(), seconds);
	fflush(stdout);
	bool ended = false;
	Ecore_Timer* end = ecore_timer_add(seconds, holdEndCb, &ended);
	ecore_main_loop_begin();
	if (!ended)
		ecore_timer_del(end);   // the window was closed first
	__settle();
	printf("after holding: %s\n", __topScreenName());
	fflush(stdout);
}

void DemoApp::__popToList()
{
	while (!m_naviframeAlive.expired() && m_naviframe->getViewCount() > 1 && m_naviframe->pop())
		__settle();
}

const char* DemoApp::__topScreenName() const
{
	app_assist::WView* top = m_naviframeAlive.expired() ? nullptr : m_naviframe->getTopView();
	return top ? top->getClassName() : "nothing";
}

PersonListView* DemoApp::__list() const
{
	return m_listAlive.expired() ? nullptr : static_cast<PersonListView*>(m_listAlive.lock().get());
}

int DemoApp::__saveScreenshot(const std::string& path)
{
	__settle();
	if (!__save(path))
		return 1;
	printf("%s\n", path.c_str());
	return 0;
}

int DemoApp::__saveScreenshots(const std::string& dir)
{
	std::error_code ec;
	std::filesystem::create_directories(dir, ec);
	if (!__save(dir + "/01-person-list.png"))
		return 1;
	printf("%s/01-person-list.png\n", dir.c_str());
	if (!m_library.detailViewFactory()) {
		printf("(no detail screen in this build: only the person list)\n");
		return 0;
	}
	int shot = 2;
	for (const char* wanted : kScreenshotPersons) {
		PersonListView* list = __list();
		if (!list)
			break;
		for (const PersonSummary& person : list->persons()) {
			if (person.name.find(wanted) == std::string::npos)
				continue;
			char name[64];
			snprintf(name, sizeof(name), "/%02d-person-%d.png", shot++, person.id);
			if (__openPerson(person.id)) {
				// A screen that never stops drawing is still worth a picture.
				__settle();
				if (__save(dir + name))
					printf("%s%s\n", dir.c_str(), name);
			}
			__popToList();
			break;
		}
	}
	return 0;
}

bool DemoApp::__save(const std::string& path)
{
	if (!ct::platform::saveCanvasPng(m_window->getEvasObj(), path)) {
		fprintf(stderr, "contacts-demo: cannot write %s\n", path.c_str());
		return false;
	}
	return true;
}

bool DemoApp::__settle(double maxSeconds)
{
	// Settled: nothing was drawn for a few frames (rows built over animator
	// frames and transitions included).
	Evas* canvas = evas_object_evas_get(m_window->getEvasObj());
	int renders = 0, seen = -1;
	evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, renderPostCb, &renders);
	Ecore_Timer* wake = ecore_timer_add(kFrame / 2, wakeCb, nullptr);
	double deadline = ecore_time_get() + maxSeconds, quietSince = ecore_time_get();
	bool settled = false;
	while (!settled && ecore_time_get() < deadline) {
		ecore_main_loop_iterate_may_block(EINA_TRUE);
		if (renders != seen) {
			seen = renders;
			quietSince = ecore_time_get();
		}
		settled = !m_pushing && ecore_time_get() - quietSince >= kQuietFramesForIdle * kFrame;
	}
	ecore_timer_del(wake);
	evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, renderPostCb, &renders);
	return settled;
}

} // namespace ct::demo
