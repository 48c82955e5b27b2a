#include "ScreenHarness.h"

#include "CanvasPng.h"
#include "EflEnvironment.h"
#include "LogSink.h"

#if __has_include("NotificationLog.h")
#include "NotificationLog.h"
#define CT_HAS_NOTIFICATION_LOG 1
#endif

#include <cctype>
#include <cstring>
#include <functional>

namespace ct::test {

namespace {

// Programs that use the harness start the toolkit once.
const bool kEflRegistered = EflEnvironment::registerOnce();

constexpr double kFrame = 1.0 / 60.0;
constexpr int kQuietFramesForIdle = 3;

// Class names read "elm_genlist", "Elm_Genlist" or "Elm.Genlist" depending on
// the API that made the object.
std::string normalizedType(const char* name)
{
	std::string type(name ? name : "");
	for (char& c : type)
		c = c == '.' ? '_' : static_cast<char>(tolower(static_cast<unsigned char>(c)));
	return type;
}

bool isType(Evas_Object* obj, const char* type)
{
	return normalizedType(evas_object_type_get(obj)) == normalizedType(type);
}

bool isShown(Evas_Object* obj)
{
	for (Evas_Object* o = obj; o; o = evas_object_smart_parent_get(o)) {
		if (!evas_object_visible_get(o))
			return false;
	}
	return true;
}

void collect(Evas_Object* obj, const std::function<void(Evas_Object*)>& visit)
{
	visit(obj);
	Eina_List* members = evas_object_smart_members_get(obj);
	Eina_List* reversed = eina_list_reverse(members);
	void* child;
	EINA_LIST_FREE(reversed, child)
	collect(static_cast<Evas_Object*>(child), visit);
}

void collectCanvas(Evas* canvas, const std::function<void(Evas_Object*)>& visit)
{
	for (Evas_Object* obj = evas_object_top_get(canvas); obj; obj = evas_object_below_get(obj))
		collect(obj, visit);
}

Eina_Bool wakeCb(void*)
{
	return ECORE_CALLBACK_RENEW;
}

void renderPostCb(void* data, Evas*, void*)
{
	++*static_cast<int*>(data);
}

Eina_Bool frameCountCb(void* data)
{
	++*static_cast<int*>(data);
	return ECORE_CALLBACK_RENEW;
}

} // namespace

ScreenHarness::ScreenHarness(int width, int height)
{
	(void)kEflRegistered;
	m_window = std::make_unique<app_assist::WWindow>("contacts-test", width, height);
	m_naviframe = new app_assist::WNaviframe(m_window.get());
	if (m_naviframe->create(m_window->getBaseLayoutEvasObj(), nullptr)) {
		m_window->setContent(m_naviframe->getEvasObj());
		m_naviframeAlive = m_naviframe->getWeakPtr();
	} else {
		m_naviframe = nullptr;
	}
#ifdef CT_HAS_NOTIFICATION_LOG
	ct::notification::setToastWindow(win());
#endif
	pumpUntilIdle(1.0);
}

ScreenHarness::~ScreenHarness()
{
#ifdef CT_HAS_NOTIFICATION_LOG
	ct::notification::setToastWindow(nullptr);
#endif
	if (auto naviframe = m_naviframeAlive.lock())
		naviframe->destroy();
	pumpFor(kFrame);
	m_window.reset();
	pumpFor(kFrame);
}

bool ScreenHarness::push(app_assist::WView* view, const char* name, void* param)
{
	if (!m_naviframe || m_naviframeAlive.expired())
		return false;
	bool pushed = m_naviframe->push(view, name, param);
	pumpUntilIdle();
	return pushed;
}

app_assist::WView* ScreenHarness::topView() const
{
	return m_naviframeAlive.expired() ? nullptr : m_naviframe->getTopView();
}

int ScreenHarness::viewCount() const
{
	return m_naviframeAlive.expired() ? 0 : m_naviframe->getViewCount();
}

template <class Done>
bool ScreenHarness::__runUntil(Done done, double maxSeconds)
{
	// The timer only makes sure a blocking iteration wakes up to check.
	Ecore_Timer* wake = ecore_timer_add(kFrame / 2, wakeCb, nullptr);
	double deadline = ecore_time_get() + maxSeconds;
	bool reached = false;
	while (!(reached = done()) && ecore_time_get() < deadline)
		ecore_main_loop_iterate_may_block(EINA_TRUE);
	ecore_timer_del(wake);
	return reached;
}

bool ScreenHarness::pumpUntilIdle(double maxSeconds)
{
	Evas* canvas = evas_object_evas_get(win());
	int renders = 0;
	evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, renderPostCb, &renders);
	int seenRenders = -1;
	double quietSince = ecore_time_get();
	bool idle = __runUntil([&] {
		if (renders != seenRenders) {
			seenRenders = renders;
			quietSince = ecore_time_get();
		}
		return ecore_time_get() - quietSince >= kQuietFramesForIdle * kFrame;
	}, maxSeconds);
	evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, renderPostCb, &renders);
	return idle;
}

void ScreenHarness::pumpFrames(int frames)
{
	int ticks = 0;
	Ecore_Animator* counter = ecore_animator_add(frameCountCb, &ticks);
	__runUntil([&] { return ticks >= frames; }, frames * kFrame * 10 + 1.0);
	ecore_animator_del(counter);
}

void ScreenHarness::pumpFor(double seconds)
{
	double end = ecore_time_get() + seconds;
	__runUntil([&] { return ecore_time_get() >= end; }, seconds + 1.0);
}

bool ScreenHarness::pumpUntil(const std::function<bool()>& done, double maxSeconds)
{
	__runUntil(done, maxSeconds);
	return done();
}

void ScreenHarness::__feedKey(const char* key)
{
	Evas* canvas = evas_object_evas_get(win());
	unsigned int stamp = static_cast<unsigned int>(ecore_time_get() * 1000);
	evas_event_feed_key_down(canvas, key, key, nullptr, nullptr, stamp, nullptr);
	evas_event_feed_key_up(canvas, key, key, nullptr, nullptr, stamp + 1, nullptr);
	pumpUntilIdle();
}

void ScreenHarness::raiseKeypad()
{
	m_window->getVirtualKeypad()->show();
	pumpUntilIdle();
}

void ScreenHarness::lowerKeypad()
{
	m_window->getVirtualKeypad()->hide();
	pumpUntilIdle();
}

bool ScreenHarness::isKeypadShown() const
{
	return m_window->getVirtualKeypad()->isShown();
}

void ScreenHarness::sendBackKey()
{
	__feedKey("Escape");
}

void ScreenHarness::sendMoreKey()
{
	__feedKey("Menu");
}

std::vector<Evas_Object*> ScreenHarness::findWidgets(const char* type) const
{
	std::vector<Evas_Object*> found;
	collectCanvas(evas_object_evas_get(win()), [&](Evas_Object* obj) {
		if (isType(obj, type) && isShown(obj))
			found.push_back(obj);
	});
	return found;
}

Evas_Object* ScreenHarness::findGenlist() const
{
	std::vector<Evas_Object*> lists = findWidgets("Elm_Genlist");
	return lists.empty() ? nullptr : lists.front();
}

Evas_Object* ScreenHarness::findButton(const std::string& label) const
{
	for (Evas_Object* button : findWidgets("Elm_Button")) {
		if (buttonLabel(button) == label)
			return button;
	}
	return nullptr;
}

std::vector<std::string> ScreenHarness::buttonLabels() const
{
	std::vector<std::string> labels;
	for (Evas_Object* button : findWidgets("Elm_Button"))
		labels.push_back(buttonLabel(button));
	return labels;
}

std::vector<Elm_Object_Item*> ScreenHarness::genlistItems(Evas_Object* genlist)
{
	std::vector<Elm_Object_Item*> items;
	if (!genlist)
		return items;
	for (Elm_Object_Item* it = elm_genlist_first_item_get(genlist); it; it = elm_genlist_item_next_get(it))
		items.push_back(it);
	return items;
}

std::string ScreenHarness::itemStyle(Elm_Object_Item* item)
{
	const Elm_Genlist_Item_Class* itc = item ? elm_genlist_item_item_class_get(item) : nullptr;
	return itc && itc->item_style ? itc->item_style : "";
}

std::string ScreenHarness::itemText(Elm_Object_Item* item, const char* part)
{
	const Elm_Genlist_Item_Class* itc = item ? elm_genlist_item_item_class_get(item) : nullptr;
	if (!itc || !itc->func.text_get || !part)
		return "";
	char* text = itc->func.text_get(elm_object_item_data_get(item), elm_object_item_widget_get(item), part);
	std::string result = text ? text : "";
	free(text);
	return result;
}

void ScreenHarness::selectItem(Elm_Object_Item* item)
{
	if (!item)
		return;
	elm_genlist_item_selected_set(item, EINA_FALSE);
	elm_genlist_item_selected_set(item, EINA_TRUE);
}

std::string ScreenHarness::naviText(app_assist::WView* view, const char* part)
{
	Elm_Object_Item* item = view ? view->getNaviItem() : nullptr;
	const char* text = item ? elm_object_item_part_text_get(item, part) : nullptr;
	return text ? text : "";
}

std::string ScreenHarness::buttonLabel(Evas_Object* button)
{
	const char* text = button ? elm_object_text_get(button) : nullptr;
	return text ? text : "";
}

bool ScreenHarness::isDisabled(Evas_Object* obj)
{
	return obj && elm_object_disabled_get(obj);
}

bool ScreenHarness::click(Evas_Object* button)
{
	if (!button || isDisabled(button))
		return false;
	evas_object_smart_callback_call(button, "clicked", nullptr);
	return true;
}

std::vector<std::string> ScreenHarness::notices()
{
#ifdef CT_HAS_NOTIFICATION_LOG
	auto posted = ct::notification::postedMessages();
	return std::vector<std::string>(posted.begin(), posted.end());
#else
	// Adapter: the notification service is not on this branch yet.
	return {};
#endif
}

void ScreenHarness::clearNotices()
{
#ifdef CT_HAS_NOTIFICATION_LOG
	ct::notification::clearPostedMessages();
#endif
}

bool ScreenHarness::logContains(const std::string& needle)
{
	return ct::log::contains(needle);
}

bool ScreenHarness::savePng(const std::string& path) const
{
	return ct::platform::saveCanvasPng(win(), path);
}

} // namespace ct::test
