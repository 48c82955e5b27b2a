// The input rows' fixture: a fresh store, a pushed view holding a plain
// genlist that the rows are appended to, the contact loaded for editing and a
// recorder of what the rows ask of their owner.
#pragma once

#include "../../data/input/InputTestStore.h"

#include "ContactsCommon.h"
#include "CtInputData.h"
#include "CtInputViewGenlistItem.h"
#include "CtInputViewItemCallbacks.h"
#include "CtThemeMgr.h"
#include "ScreenHarness.h"
#include "WView.h"

#include <memory>

namespace ct::test {

class InputRowHostView : public app_assist::WView {
public:
	const char* getClassName() override { return "InputRowHostView"; }
	Evas_Object* genlist = nullptr;
	int keypadOn = 0;
	int keypadOff = 0;

	Elm_Object_Item* append(CtInputViewGenlistItem* row);

protected:
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onPushed(Elm_Object_Item* naviItem) override;
	void onDestroy() override;

private:
	static void __keypadOnCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __keypadOffCb(void* data, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_conformant = nullptr;
};

// What the rows told their owner.
struct RowCalls {
	int changed = 0;
	struct Deleted {
		Elm_Object_Item* item;
		bool heldText;
		contacts_record_h record;
	};
	std::vector<Deleted> deleted;
	std::vector<Evas_Object*> activated;
	std::vector<bool> focus;

	CtInputViewItemCallbacks callbacks();
};

class InputRowTest : public InputStoreTest {
protected:
	void SetUp() override;
	void TearDown() override;

	// The stored contact loaded for editing (kept until the test ends).
	std::shared_ptr<CtInputData> edit(int contactId);
	// A new contact in the phone's storage.
	std::shared_ptr<CtInputData> editNew();
	Elm_Object_Item* show(CtInputViewGenlistItem* row);
	static Evas_Object* content(Elm_Object_Item* item, const char* part)
	{
		return elm_object_item_part_content_get(item, part);
	}
	// The entry inside the edit field of `part`.
	static Evas_Object* entryOf(Elm_Object_Item* item, const char* part = "elm.icon.entry");
	// Types `text` into `entry` as the keypad would (insert at the cursor), then pumps.
	void type(Evas_Object* entry, const char* text);
	// Sets the entry's whole text as a paste over everything would, then pumps.
	void replaceText(Evas_Object* entry, const char* text);
	static std::string tr(const char* id) { return ContactsCommon::translate(id); }
	// The labels of the hoversel's menu (filled by a click when needed).
	std::vector<std::string> menuLabels(Evas_Object* hoversel);
	// Chooses the menu entry labelled `label` as a tap would.
	bool chooseMenu(Evas_Object* hoversel, const std::string& label);
	static std::string stored(contacts_record_h record, unsigned int property) { return textOf(record, property); }

	std::unique_ptr<ScreenHarness> m_screen;
	InputRowHostView* m_view = nullptr;
	RowCalls m_calls;
	std::vector<std::shared_ptr<CtInputData>> m_data;
	std::string m_previousLocale;
};

} // namespace ct::test
