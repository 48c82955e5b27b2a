// Small views and rows that record what the framework does to them.
#pragma once

#include "ScreenHarness.h"
#include "WGenlistItem.h"
#include "WView.h"

#include <gtest/gtest.h>

#include <cstring>
#include <functional>
#include <string>
#include <vector>

namespace ct::test {

using EventLog = std::vector<std::string>;

class RecordingView : public app_assist::WView {
public:
	RecordingView(EventLog& log, std::string tag)
		: m_log(log)
		, m_tag(std::move(tag))
	{
		m_log.push_back(m_tag + ":constructor");
	}

	const char* getClassName() override { return "RecordingView"; }

	bool allowPop = true;
	std::function<void()> onPopAction;
	int becameTop = 0;
	Evas_Object* layout = nullptr;

protected:
	~RecordingView() override { m_log.push_back(m_tag + ":destructor"); }
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		m_log.push_back(m_tag + ":onCreate");
		layout = elm_layout_add(parent);
		elm_layout_theme_set(layout, "layout", "application", "content-back");
		return layout;
	}
	void onCreated() override { m_log.push_back(m_tag + ":onCreated"); }
	void onPushed(Elm_Object_Item*) override { m_log.push_back(m_tag + ":onPushed"); }
	bool onPop() override
	{
		m_log.push_back(m_tag + ":onPop");
		if (onPopAction)
			onPopAction();
		return allowPop;
	}
	void onBecomeTop() override { ++becameTop; }
	void onDestroy() override { m_log.push_back(m_tag + ":onDestroy"); }

private:
	EventLog& m_log;
	std::string m_tag;
};

// Counts the live objects that hold one.
class LiveCount {
public:
	explicit LiveCount(int* live) : m_live(live) { ++*m_live; }
	~LiveCount() { --*m_live; }
	LiveCount(const LiveCount&) = delete;
	LiveCount& operator=(const LiveCount&) = delete;

private:
	int* m_live;
};

// A one-line row that counts live rows and selections. Its item class leaves
// the delete to the framework, or deletes the row itself: through the
// framework's callback, or by a plain delete as row classes do.
class CountingRow : public app_assist::WGenlistItem {
public:
	enum Deleter { kFramework, kClassCallback, kPlainDelete };
	CountingRow(int index, int* liveRows, int* selections, Deleter deleter = kFramework)
		: m_index(index), m_live(liveRows), m_selections(selections), m_deleter(deleter)
	{
	}

	Elm_Genlist_Item_Class* getItemClassStatic() override
	{
		static Elm_Genlist_Item_Class classes[] = {itemClass(nullptr), itemClass(deleteRowCb),
			itemClass([](void* data, Evas_Object*) { delete static_cast<CountingRow*>(data); })};
		return &classes[m_deleter];
	}
	void onSelect(Elm_Object_Item* item) override
	{
		elm_genlist_item_selected_set(item, EINA_FALSE);
		++*m_selections;
	}

private:
	static Elm_Genlist_Item_Class itemClass(Elm_Gen_Item_Del_Cb del)
	{
		Elm_Genlist_Item_Class c = {};
		c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
		c.item_style = "default";
		c.func.text_get = __textCb;
		c.func.del = del;
		return c;
	}
	static char* __textCb(void* data, Evas_Object*, const char* part)
	{
		int index = static_cast<CountingRow*>(data)->m_index;
		return strcmp(part, "elm.text") ? nullptr : strdup(("Row " + std::to_string(index)).c_str());
	}

	int m_index;
	LiveCount m_live;
	int* m_selections;
	Deleter m_deleter;
};

// A screen per test, with a helper to push a recording view onto it.
class ViewTest : public ::testing::Test {
protected:
	RecordingView* pushView(const char* tag = "v")
	{
		auto* view = new RecordingView(log, tag);
		screen.push(view);
		return view;
	}

	EventLog log; // outlives the screen, which records the views' ends
	ScreenHarness screen;
};

} // namespace ct::test
