#include "CtPredictionListTrigger.h"

#include "ContactsDebug.h"
#include "CtPredictionListModel.h"

#include <glib.h>

namespace {

bool isBlankText(const std::string& text)
{
	for (char c : text)
		if (!g_ascii_isspace(c))
			return false;
	return true;
}

// The window's focused widget counts too: a window that no window manager
// ever activated (headless) reports no widget as focused itself.
bool hasFocus(Evas_Object* entry)
{
	if (elm_object_focus_get(entry))
		return true;
	Evas_Object* top = elm_object_top_widget_get(entry);
	return top && elm_object_focused_object_get(top) == entry;
}

} // namespace

CtPredictionListTrigger::CtPredictionListTrigger(Evas_Object* listParent, Evas_Object* inputList,
	bool isNewContact, CtPredictionListControl::SelectedCallback onSelected)
	: m_listParent(listParent), m_inputList(inputList), m_isNewContact(isNewContact),
	  m_onSelected(std::move(onSelected))
{
	if (m_listParent)
		evas_object_event_callback_add(m_listParent, EVAS_CALLBACK_DEL, __watchedObjDelCb, this);
	if (m_inputList) {
		evas_object_event_callback_add(m_inputList, EVAS_CALLBACK_DEL, __watchedObjDelCb, this);
		evas_object_event_callback_add(m_inputList, EVAS_CALLBACK_MOUSE_DOWN, __inputListMouseDownCb, this);
	}
}

CtPredictionListTrigger::~CtPredictionListTrigger()
{
	app_assist::WUiTimer::destroy(m_typingTimer);
	app_assist::WUiTimer::destroy(m_resizeTimer);
	__watchPendingEntry(nullptr);
	destroyPredictionList();
	if (m_listParent)
		evas_object_event_callback_del_full(m_listParent, EVAS_CALLBACK_DEL, __watchedObjDelCb, this);
	if (m_inputList) {
		evas_object_event_callback_del_full(m_inputList, EVAS_CALLBACK_DEL, __watchedObjDelCb, this);
		evas_object_event_callback_del_full(m_inputList, EVAS_CALLBACK_MOUSE_DOWN, __inputListMouseDownCb, this);
	}
}

void CtPredictionListTrigger::onNameChanged(Evas_Object* entry, Elm_Object_Item* basicInfoRow,
	const std::string& fullName)
{
	WPRET_M(!entry, "Invalid param : entry");
	if (!hasFocus(entry)) {
		WERROR("entry doesn't have focus");
		return;
	}
	if (!m_isNewContact)
		return;
	app_assist::WUiTimer::destroy(m_typingTimer);
	if (isBlankText(fullName)) {
		destroyPredictionList();
		return;
	}
	WPRET_M(!m_listParent, "the form is gone");
	__watchPendingEntry(entry);
	m_pendingRow = basicInfoRow;
	m_pendingText = fullName;
	m_typingTimer = app_assist::WUiTimer::addTimer(kTypingPause,
		[this](void*) { return __onTypingPaused(); }, nullptr, m_listParent);
}

bool CtPredictionListTrigger::__onTypingPaused()
{
	Evas_Object* entry = m_pendingEntry;
	if (!entry || !hasFocus(entry)) {
		WERROR("entry doesn't have focus");
		return false;
	}
	++m_loadCount;
	if (CtPredictionListControl* list = getPredictionList()) {
		list->updatePredictionList(m_pendingText);
		// Rows of an earlier text must not stay up as if they matched.
		if (!list->hasPredictions())
			destroyPredictionList();
	} else
		__showPredictionList(entry, m_pendingRow, m_pendingText);
	return false;
}

void CtPredictionListTrigger::__showPredictionList(Evas_Object* entry, Elm_Object_Item* basicInfoRow,
	const std::string& text)
{
	auto model = std::make_shared<CtPredictionListModel>(text);
	if (model->getCount() == 0) {
		destroyPredictionList();
		return;
	}
	if (basicInfoRow)
		elm_genlist_item_show(basicInfoRow, ELM_GENLIST_ITEM_SCROLLTO_TOP);
	auto* list = new CtPredictionListControl(model, entry, basicInfoRow, m_onSelected);
	if (!list->create(m_listParent, nullptr)) {
		list->destroy();
		return;
	}
	m_list = list->getWeakPtr();
	list->resize();
}

void CtPredictionListTrigger::resizePredictionList(bool delayed)
{
	app_assist::WUiTimer::destroy(m_resizeTimer);
	if (!delayed) {
		if (CtPredictionListControl* list = getPredictionList())
			list->resize();
		return;
	}
	WPRET_M(!m_listParent, "the form is gone");
	m_resizeTimer = app_assist::WUiTimer::addTimer(kResizeDelay,
		[this](void*) {
			resizePredictionList(false);
			return false;
		},
		nullptr, m_listParent);
}

void CtPredictionListTrigger::destroyPredictionList()
{
	if (CtPredictionListControl* list = getPredictionList())
		list->destroy();
	m_list.reset();
}

CtPredictionListControl* CtPredictionListTrigger::getPredictionList() const
{
	auto list = m_list.lock();
	if (!list || list->isDestroying())
		return nullptr;
	return static_cast<CtPredictionListControl*>(list.get());
}

void CtPredictionListTrigger::__watchPendingEntry(Evas_Object* entry)
{
	if (m_pendingEntry == entry)
		return;
	if (m_pendingEntry)
		evas_object_event_callback_del_full(m_pendingEntry, EVAS_CALLBACK_DEL, __watchedObjDelCb, this);
	m_pendingEntry = entry;
	if (m_pendingEntry)
		evas_object_event_callback_add(m_pendingEntry, EVAS_CALLBACK_DEL, __watchedObjDelCb, this);
}

void CtPredictionListTrigger::__inputListMouseDownCb(void* data, Evas*, Evas_Object*, void*)
{
	static_cast<CtPredictionListTrigger*>(data)->destroyPredictionList();
}

void CtPredictionListTrigger::__watchedObjDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* trigger = static_cast<CtPredictionListTrigger*>(data);
	if (obj == trigger->m_pendingEntry) {
		trigger->m_pendingEntry = nullptr;
		trigger->m_pendingRow = nullptr;
		app_assist::WUiTimer::destroy(trigger->m_typingTimer);
	}
	if (obj == trigger->m_inputList)
		trigger->m_inputList = nullptr;
	if (obj == trigger->m_listParent) {
		trigger->m_listParent = nullptr;
		trigger->m_list.reset();
	}
}
