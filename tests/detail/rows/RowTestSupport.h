// A screen that shows detail rows for the row tests: a genlist in a pushed
// view that records what the rows ask of their owner, recording app-control
// handlers, and stored persons with pictures.
#pragma once

#include "../../data/detail/DetailTestStore.h"

#include "AppControlRouter.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "CtDetailData.h"
#include "CtDetailViewGenlistItem.h"
#include "CtDetailViewItemOwner.h"
#include "CtThemeMgr.h"
#include "ScreenHarness.h"
#include "UsageLog.h"
#include "WView.h"

namespace ct::test {

class RowHostView : public app_assist::WView, public CtDetailViewItemOwner {
public:
	const char* getClassName() override { return "RowHostView"; }

	Evas_Object* genlist = nullptr;
	int videoCalls = 0;
	std::vector<contacts_record_h> addresses;
	std::vector<int> imagePages;

	void onVideoCallSelected() override { ++videoCalls; }
	void onAddressSelected(contacts_record_h address) override { addresses.push_back(address); }
	void onImageSelected(int page) override { imagePages.push_back(page); }

	// Appends `row` (the list owns it) and returns its item.
	Elm_Object_Item* append(CtDetailViewGenlistItem* row)
	{
		Elm_Object_Item* item = elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr);
		row->setElmObjectItem(item);
		row->attachToView(this);
		return item;
	}

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		for (const char* edj : {"contacts/contacts.edj", "contacts/detail_layout.edj"}) {
			std::string path;
			ContactsCommon::getAppEdjePath(edj, path, true);
			CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
		}
		genlist = elm_genlist_add(parent);
		CtThemeMgr::getInstance()->setObjectTheme(genlist);
		elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
		evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
		evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
		return genlist;
	}
};

// Records every launch to the applications the rows start.
class LaunchRecorder {
public:
	LaunchRecorder()
	{
		auto accept = [](app_control_h, const appcontrol::Reply&) { return 0; };
		for (const char* op : {APP_CONTROL_OPERATION_CALL, APP_CONTROL_OPERATION_COMPOSE, APP_CONTROL_OPERATION_VIEW})
			m_registrations.push_back(appcontrol::registerOperationHandler(op, accept));
		for (const char* app : {MESSAGE_COMPOSER_APP_ID, FACEBOOK_APP_ID})
			m_registrations.push_back(appcontrol::registerAppHandler(app, accept));
		appcontrol::clearLaunches();
	}
	std::vector<appcontrol::LaunchRecord> launches() const { return appcontrol::launches(); }
	void clear() { appcontrol::clearLaunches(); }

private:
	std::vector<appcontrol::Registration> m_registrations;
};

// Usage-log records with `feature`.
std::vector<usagelog::Record> usageRecords(const std::string& feature);

// The rows' fixture: a fresh store, a shown host view, recording handlers.
class RowTest : public ::testing::Test {
protected:
	void SetUp() override;
	void TearDown() override;

	// Stores a contact and returns its person id.
	int storePerson(contacts_record_h contact) { return personOf(store(contact)); }
	// Loads the person's detail data (kept until the test ends).
	CtDetailData* load(int personId) { return m_data.emplace_back(std::make_unique<CtDetailData>(personId)).get(); }
	Elm_Object_Item* show(CtDetailViewGenlistItem* row);
	static contacts_record_h nth(Eina_List* list, int index = 0)
	{
		return static_cast<contacts_record_h>(eina_list_nth(list, index));
	}
	static CtDetailViewGenlistItem* rowOf(Elm_Object_Item* item)
	{
		return static_cast<CtDetailViewGenlistItem*>(elm_object_item_data_get(item));
	}
	std::string text(Elm_Object_Item* item, const char* part) { return ScreenHarness::itemText(item, part); }
	// The texts of the usual two-line row: the label above, the value below.
	std::vector<std::string> labelAndValue(Elm_Object_Item* item)
	{
		return {text(item, "elm.text.sub.left.top"), text(item, "elm.text.main.left.bottom")};
	}
	Evas_Object* content(Elm_Object_Item* item, const char* part) { return elm_object_item_part_content_get(item, part); }
	// Sends an edje mouse signal from `touchPart` of an icon layout.
	void tapIcon(Evas_Object* layout, const char* touchPart, const char* signal = "mouse,clicked,1");
	// Writes a `w` x `h` PNG of two colour bands and returns its path.
	std::string picture(const char* name, int w, int h, unsigned int top, unsigned int bottom);

	TempDataDir m_dir;
	std::unique_ptr<ScreenHarness> m_screen;
	RowHostView* m_view = nullptr;
	LaunchRecorder* m_launches = nullptr;
	std::vector<std::unique_ptr<CtDetailData>> m_data;
};

} // namespace ct::test
