// The list screens of CtDllViewFactory, pushed headless: what they list, how
// the search entry filters, and what choosing a row does to the store, the
// caller's request and the registry signal.
#include "../CommonTestSupport.h"

#include "AppControlRouter.h"
#include "CtContactPickerView.h"
#include "CtDllViewFactory.h"
#include "CtPersonPickerItem.h"
#include "CtUnlinkContactView.h"
#include "ScreenHarness.h"

#include <glib.h>

using namespace ct::test;

namespace {

class PickerViewsTest : public StoreTest {
protected:
	static std::vector<std::string> names(CtPersonPickerView* view)
	{
		std::vector<std::string> out;
		for (Elm_Object_Item* item : ScreenHarness::genlistItems(view->getGenlist()))
			out.push_back(ScreenHarness::itemText(item, "elm.text"));
		return out;
	}

	// Taps the row named `name` and lets the choice run.
	void choose(ScreenHarness& screen, CtPersonPickerView* view, const std::string& name)
	{
		for (Elm_Object_Item* item : ScreenHarness::genlistItems(view->getGenlist()))
			if (ScreenHarness::itemText(item, "elm.text") == name) {
				ScreenHarness::selectItem(item);
				screen.pumpUntilIdle();
				// The choice runs from an idler, which a busy machine delays.
				screen.pumpFor(0.2);
				return;
			}
		ADD_FAILURE() << "no row " << name;
	}

	static CtPersonPickerView* relationshipPicker()
	{
		return static_cast<CtPersonPickerView*>(CtDllViewFactory::getInstance()->getCtListViewClassForRelationship());
	}

	// Types into the search entry, as markup, and lets the list follow.
	static std::vector<std::string> search(ScreenHarness& screen, CtPersonPickerView* view, const char* text)
	{
		elm_entry_entry_set(view->getSearchEntry(), text);
		screen.pumpUntilIdle();
		return names(view);
	}
};

} // namespace

TEST_F(PickerViewsTest, RelationshipPickerFiltersByNameAndRaisesTheChosenPerson)
{
	addSimplePerson("Anna");
	addSimplePerson("Bert");
	int aane = addSimplePerson("Åne");
	SignalRecorder signals;
	{
		ScreenHarness screen;
		auto* view = relationshipPicker();
		ASSERT_TRUE(screen.push(view));
		EXPECT_EQ(names(view), (std::vector<std::string>{"Anna", "Bert", "Åne"}));
		EXPECT_EQ(ScreenHarness::naviText(view), "IDS_PB_OPT_RELATIONSHIP_ABB2");
		EXPECT_TRUE(screen.savePng(shotPath("relationship-picker")));

		// Case does not matter.
		EXPECT_EQ(search(screen, view, "aN"), (std::vector<std::string>{"Anna"}));
		EXPECT_EQ(search(screen, view, "ÅN"), (std::vector<std::string>{"Åne"}));
		EXPECT_TRUE(search(screen, view, "zz").empty());
		ASSERT_EQ(search(screen, view, "").size(), 3u);

		choose(screen, view, "Åne");
		EXPECT_EQ(signals.signals, (std::vector<std::pair<ctRegistryKey, int>>{{CT_REGISTRY_KEY_RELATIONSHIP_PERSON, aane}}));
		EXPECT_TRUE(pumpUntil([&] { return screen.viewCount() == 0; }, 3.0));
	}
}

TEST_F(PickerViewsTest, SearchSurvivesInvalidUtf8AndOverlongTexts)
{
	addSimplePerson("Anna");
	addSimplePerson("Ann <b>&amp;</b>");
	ScreenHarness screen;
	auto* view = relationshipPicker();
	ASSERT_TRUE(screen.push(view));

	view->setSearchText("\xc3\x28\xff");
	EXPECT_TRUE(view->getShownEntries().empty());
	view->setSearchText("ANN\xff");
	EXPECT_TRUE(view->getShownEntries().empty());
	// Names are plain text: markup characters are matched and shown as typed.
	view->setSearchText("<b>&");
	ASSERT_EQ(view->getShownEntries().size(), 1u);
	Elm_Object_Item* row = ScreenHarness::genlistItems(view->getGenlist()).front();
	EXPECT_EQ(ScreenHarness::itemText(row, "elm.text"), "Ann &lt;b&gt;&amp;amp;&lt;/b&gt;");

	std::string huge(100000, 'a');
	huge += "\xc3\xa9";
	view->setSearchText(huge.c_str());
	EXPECT_TRUE(ScreenHarness::logContains("search text too long"));
	EXPECT_LE(view->getSearchText().size(), 256u);
	EXPECT_TRUE(g_utf8_validate(view->getSearchText().c_str(), -1, nullptr));
	EXPECT_TRUE(view->getShownEntries().empty());
	view->setSearchText(nullptr);
	EXPECT_EQ(view->getShownEntries().size(), 2u);
}

TEST_F(PickerViewsTest, LinkPickerLeavesOutTheBasePersonRefusesWithNoRoomAndLinksTheChoiceForGood)
{
	int baseContact = 0;
	int base = addSimplePerson("Base", &baseContact);
	int otherContact = 0;
	int other = addSimplePerson("Other", &otherContact);
	addSimplePerson("Third");
	for (int max : {0, 9}) {
		Request link = request(nullptr, {{"type", "131"}, {"ct_selected_person_id", std::to_string(base)},
			{"ct_max", std::to_string(max)}, {"hide_create_button", "1"}});
		ContactsData data{0, link.get(), nullptr, 0};
		ScreenHarness screen;
		auto* view = static_cast<CtContactPickerView*>(CtDllViewFactory::getInstance()->getCtListViewClass(&data));
		link.reset(); // the picker keeps its own copy
		ASSERT_TRUE(screen.push(view));
		EXPECT_EQ(view->getLaunchType(), CtContactPickerView::kTypeLinkContacts);
		EXPECT_EQ(view->getMaxCount(), max);
		EXPECT_EQ(names(view), (std::vector<std::string>{"Other", "Third"}));
		choose(screen, view, "Other");
		if (max == 0) {
			EXPECT_TRUE(pumpUntil([] { return ScreenHarness::logContains("ct_max 0"); }, 3.0));
			EXPECT_EQ(screen.viewCount(), 1);
			EXPECT_EQ(personOf(otherContact), other);
		} else {
			EXPECT_TRUE(pumpUntil([&] { return screen.viewCount() == 0; }, 3.0));
		}
	}
	reopenStore();
	EXPECT_EQ(personOf(otherContact), base);
	EXPECT_EQ(personOf(baseContact), base);
}

TEST_F(PickerViewsTest, PickerAnswersTheRequestThatStartedIt)
{
	int anna = addSimplePerson("Anna");
	app_control_h received = nullptr;
	auto registration = ct::appcontrol::registerAppHandler("org.test.picker", [&](app_control_h request, const auto&) {
		app_control_clone(&received, request);
		return 0;
	});
	Request launch = request(nullptr);
	app_control_set_app_id(launch.get(), "org.test.picker");
	app_control_h reply = nullptr;
	ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(launch.get(),
		[](app_control_h, app_control_h answer, app_control_result_e result, void* data) {
			EXPECT_EQ(result, APP_CONTROL_RESULT_SUCCEEDED);
			app_control_clone(static_cast<app_control_h*>(data), answer);
		},
		&reply));
	ASSERT_NE(received, nullptr);
	{
		ScreenHarness screen;
		ContactsData data{0, received, nullptr, 0};
		auto* view = static_cast<CtPersonPickerView*>(CtDllViewFactory::getInstance()->getCtListViewClass(&data));
		ASSERT_TRUE(screen.push(view));
		choose(screen, view, "Anna");
		screen.pumpFor(0.1);
	}
	ASSERT_NE(reply, nullptr);
	char** selected = nullptr;
	int count = 0;
	ASSERT_EQ(0, app_control_get_extra_data_array(reply, APP_CONTROL_DATA_SELECTED, &selected, &count));
	ASSERT_EQ(count, 1);
	EXPECT_EQ(selected[0], std::to_string(anna));
	free(selected[0]);
	free(selected);
	char* id = nullptr;
	ASSERT_EQ(0, app_control_get_extra_data(reply, APP_CONTROL_DATA_ID, &id));
	EXPECT_EQ(take(id).get(), std::to_string(anna));
	app_control_destroy(reply);
	app_control_destroy(received);
}

TEST_F(PickerViewsTest, UnlinkListSplitsContactsOffUntilOneIsLeft)
{
	int a = 0, b = 0, c = 0;
	addSimplePerson("Alpha", &a);
	addSimplePerson("Beta", &b);
	addSimplePerson("Gamma", &c);
	int person = linkContacts({a, b, c});
	{
		ScreenHarness screen;
		auto* view = static_cast<CtUnlinkContactView*>(
			CtDllViewFactory::getInstance()->getCtListUnlinkContactViewClass(person));
		ASSERT_TRUE(screen.push(view));
		EXPECT_EQ(names(view), (std::vector<std::string>{"Alpha", "Beta", "Gamma"}));
		Elm_Object_Item* first = ScreenHarness::genlistItems(view->getGenlist()).front();
		EXPECT_FALSE(ScreenHarness::itemText(first, "elm.text.sub").empty());

		choose(screen, view, "Beta");
		EXPECT_TRUE(pumpUntil([&] { return names(view).size() == 2; }, 3.0));
		EXPECT_EQ(names(view), (std::vector<std::string>{"Alpha", "Gamma"}));
		EXPECT_NE(personOf(b), person);
		choose(screen, view, "Gamma");
		EXPECT_TRUE(pumpUntil([&] { return screen.viewCount() == 0; }, 3.0));
	}
	reopenStore();
	EXPECT_EQ(personOf(a), person);
	EXPECT_NE(personOf(b), person);
	EXPECT_NE(personOf(c), person);
	EXPECT_NE(personOf(b), personOf(c));
}

TEST_F(PickerViewsTest, ListFollowsPersonsAddedAndDeletedElsewhereKeepingTheFilter)
{
	int anna = addSimplePerson("Anna");
	ScreenHarness screen;
	auto* view = relationshipPicker();
	ASSERT_TRUE(screen.push(view));
	view->setSearchText("an");
	addSimplePerson("Hannah");
	addSimplePerson("Bert");
	EXPECT_TRUE(pumpUntil([&] { return names(view).size() == 2; }, 2.0));
	EXPECT_EQ(names(view), (std::vector<std::string>{"Anna", "Hannah"}));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, anna));
	EXPECT_TRUE(pumpUntil([&] { return names(view).size() == 1; }, 2.0));
	EXPECT_EQ(names(view), (std::vector<std::string>{"Hannah"}));
}

TEST_F(PickerViewsTest, FactoryRefusesMissingRequestsAndPersons)
{
	auto* factory = CtDllViewFactory::getInstance();
	EXPECT_EQ(factory->getCtListViewClass(nullptr), nullptr);
	EXPECT_TRUE(ScreenHarness::logContains("* Critical * Invalid param : data"));
	ContactsData empty;
	EXPECT_EQ(factory->getCtListViewClass(&empty), nullptr);
	EXPECT_EQ(factory->getCtListUnlinkContactViewClass(0), nullptr);
	EXPECT_EQ(factory->getCtListUnlinkContactViewClass(-4), nullptr);

	// A person that does not exist gives an empty list, not a crash.
	ScreenHarness screen;
	auto* view = static_cast<CtUnlinkContactView*>(factory->getCtListUnlinkContactViewClass(999));
	ASSERT_TRUE(screen.push(view));
	EXPECT_TRUE(names(view).empty());
}
