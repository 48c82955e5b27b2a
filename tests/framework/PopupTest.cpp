#include "ScreenHarness.h"
#include "TestViews.h"

#include "LogSink.h"
#include "WMenuPopup.h"
#include "WPopup.h"
#include "WToastPopup.h"

#include <gtest/gtest.h>

#include <functional>

using namespace ct::test;
using app_assist::WMenuPopup;
using app_assist::WPopup;
using app_assist::WToastPopup;

namespace {

WPopup* makeTwoButtonPopup(std::vector<std::string>& clicks, bool keepOnOk = false)
{
	auto* popup = new WPopup("Title", "Body text");
	popup->addButton("Cancel", [&clicks](bool*) { clicks.push_back("Cancel"); });
	popup->addButton("OK", [&clicks, keepOnOk](bool* destroyPopup) {
		clicks.push_back("OK");
		*destroyPopup = !keepOnOk;
	});
	return popup;
}

using Popup = ViewTest;
using MenuPopup = ViewTest;
using ToastPopup = ViewTest;

} // namespace

TEST_F(Popup, ButtonsAppearInCallOrderAndANewPopupTheBackKeyOrTheViewsEndCloseIt)
{
	auto* view = pushView("v");
	std::vector<std::string> clicks;
	WPopup* popup = makeTwoButtonPopup(clicks, true);
	view->attachPopup(popup);
	screen.pumpUntilIdle();
	auto alive = popup->getWeakPtr();
	EXPECT_EQ(view->getPopup(), popup);
	Evas_Object* obj = popup->getEvasObj();
	EXPECT_EQ((std::vector<std::string> { "Title", "Cancel", "OK" }),
		(std::vector<std::string> { elm_object_part_text_get(obj, "title,text"),
			ScreenHarness::buttonLabel(elm_object_part_content_get(obj, "button1")),
			ScreenHarness::buttonLabel(elm_object_part_content_get(obj, "button2")) }));
	ASSERT_TRUE(ScreenHarness::click(screen.findButton("OK")));
	EXPECT_FALSE(alive.expired()); // the callback kept it open
	ASSERT_TRUE(ScreenHarness::click(screen.findButton("Cancel")));
	screen.pumpUntilIdle();
	EXPECT_TRUE(alive.expired());
	EXPECT_EQ(clicks, (std::vector<std::string> { "OK", "Cancel" }));
	EXPECT_EQ(view->getPopup(), nullptr);
	EXPECT_EQ(screen.findButton("OK"), nullptr);

	WPopup* first = makeTwoButtonPopup(clicks);
	view->attachPopup(first);
	auto aliveFirst = first->getWeakPtr();
	popup = new WPopup("Second", nullptr);
	popup->setContent([](Evas_Object* parent) {
		Evas_Object* label = elm_label_add(parent);
		elm_object_text_set(label, "built content");
		return label;
	});
	int backs = 0;
	popup->setOnBack([&backs](bool*) { ++backs; });
	view->attachPopup(popup);
	EXPECT_TRUE(aliveFirst.expired());
	Evas_Object* content = elm_object_content_get(popup->getEvasObj());
	ASSERT_NE(content, nullptr);
	EXPECT_STREQ(elm_object_text_get(content), "built content");
	alive = popup->getWeakPtr();
	auto aliveView = view->getWeakPtr();
	screen.sendBackKey();
	EXPECT_EQ(backs, 1);
	EXPECT_TRUE(alive.expired());
	EXPECT_FALSE(aliveView.expired());

	view->attachPopup(popup = makeTwoButtonPopup(clicks));
	alive = popup->getWeakPtr();
	view->popOut();
	screen.pumpUntilIdle();
	EXPECT_TRUE(alive.expired());
	EXPECT_TRUE(aliveView.expired());
	EXPECT_EQ(clicks.size(), 2u);

	ct::log::clear();
	auto* crowded = new WPopup();
	for (int i = 0; i < 4; ++i)
		crowded->addButton("b", nullptr);
	EXPECT_TRUE(ct::log::contains("at most 3 buttons"));
	crowded->destroy();
}

TEST_F(Popup, ButtonThatDestroysItsOwnViewDoesNotCrash)
{
	auto* below = pushView("below");
	auto* view = pushView("v");
	auto* popup = new WPopup();
	popup->setTextTranslatable("contacts");
	popup->setTitle("IDS_PB_HEADER_DISCARD_CHANGES_ABB");
	popup->addButton("Discard", [view](bool*) { view->destroy(); });
	auto* second = new WPopup();
	second->addButton("Leave", [below](bool*) { below->popOut(); });
	view->attachPopup(popup);
	auto aliveView = view->getWeakPtr();
	auto alivePopup = popup->getWeakPtr();

	ASSERT_TRUE(ScreenHarness::click(screen.findButton("Discard")));
	screen.pumpUntilIdle();
	EXPECT_TRUE(aliveView.expired());
	EXPECT_TRUE(alivePopup.expired());
	EXPECT_EQ(screen.topView(), below);

	// The same through popOut, from a popup attached to the view below.
	below->attachPopup(second);
	auto aliveBelow = below->getWeakPtr();
	ASSERT_TRUE(ScreenHarness::click(screen.findButton("Leave")));
	screen.pumpUntilIdle();
	EXPECT_TRUE(aliveBelow.expired());
}

TEST_F(MenuPopup, MoreKeyOpensTheMenuWithItemsInAppendOrderAndDisabledItemsDoNothing)
{
	auto* view = pushView("v");
	std::vector<std::string> chosen;
	std::weak_ptr<app_assist::WControl> menuAlive;
	std::function<void()> openMenu = [&] {
		auto* menu = new WMenuPopup(view->getWindow(), view->getNaviframe());
		for (const char* label : { "Edit", "Delete", "Share" })
			menu->appendItem(label, [&chosen, label] { chosen.push_back(label); },
				strcmp(label, "Share") ? WMenuPopup::ItemState::Enabled : WMenuPopup::ItemState::Disabled);
		view->attachPopup(menu);
		menuAlive = menu->getWeakPtr();
	};
	EXPECT_TRUE(view->enableMoreButton(view->getNaviItem(), [](void* data, Evas_Object*, void*) {
		(*static_cast<std::function<void()>*>(data))();
	}, &openMenu));
	EXPECT_FALSE(view->enableMoreButton(nullptr, nullptr, nullptr));

	screen.sendMoreKey();
	auto menus = screen.findWidgets("Elm_Ctxpopup");
	ASSERT_EQ(menus.size(), 1u);
	std::vector<std::string> labels;
	for (Elm_Object_Item* it = elm_ctxpopup_first_item_get(menus[0]); it; it = elm_ctxpopup_item_next_get(it))
		labels.push_back(std::string(elm_object_item_text_get(it)) + (elm_object_item_disabled_get(it) ? " (off)" : ""));
	EXPECT_EQ(labels, (std::vector<std::string> { "Edit", "Delete", "Share (off)" }));

	// Choosing the disabled item neither runs it nor closes the menu.
	elm_ctxpopup_item_selected_set(elm_ctxpopup_last_item_get(menus[0]), EINA_TRUE);
	screen.pumpUntilIdle();
	EXPECT_TRUE(chosen.empty());
	ASSERT_FALSE(menuAlive.expired());

	Elm_Object_Item* second = elm_ctxpopup_item_next_get(elm_ctxpopup_first_item_get(menus[0]));
	elm_ctxpopup_item_selected_set(second, EINA_TRUE);
	screen.pumpUntilIdle();
	EXPECT_EQ(chosen, (std::vector<std::string> { "Delete" }));
	EXPECT_TRUE(menuAlive.expired());

	screen.sendMoreKey();
	ASSERT_FALSE(menuAlive.expired());
	screen.sendBackKey(); // closes the menu, not the view
	EXPECT_TRUE(menuAlive.expired());
	EXPECT_EQ(screen.viewCount(), 1);
}

TEST_F(ToastPopup, ClosesItselfAfterItsTimeout)
{
	auto* toast = new WToastPopup("Saved", 0.2);
	ASSERT_TRUE(toast->create(screen.win(), nullptr));
	auto alive = toast->getWeakPtr();
	EXPECT_STREQ(elm_object_text_get(toast->getEvasObj()), "Saved");
	EXPECT_TRUE(screen.pumpUntil([&] { return alive.expired(); }));
}
