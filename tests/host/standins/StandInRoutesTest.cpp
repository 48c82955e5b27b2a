// The host's stand-in applications answer the requests the library sends,
// through the same router route: each case sends a request made as the
// library makes it, acts on the stand-in's screen as a person would, and
// checks the reply (or the notice, or what the screen shows).
#include "../../data/detail/DetailTestStore.h"

#include "ContactsAppControlLauncher.h"
#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "CtContactPickerView.h"
#include "CtView.h"
#include "DataDir.h"
#include "DemoAppControlHandlers.h"
#include "DemoLook.h"
#include "DemoPictures.h"
#include "ScreenHarness.h"
#include "StandInCameraView.h"
#include "StandInGroupPickerView.h"
#include "StandInMapsView.h"
#include "StandInPictureFile.h"
#include "StandInShareView.h"
#include "StandInView.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <functional>
#include <map>
#include <sstream>

namespace ct::test {
namespace {

using demo::StandInListItem;
using demo::StandInView;

struct Captured {
	bool arrived = false;
	app_control_result_e result = APP_CONTROL_RESULT_FAILED;
	std::map<std::string, std::string> texts;   // arrays: their first element
};

void replyCb(app_control_h, app_control_h reply, app_control_result_e result, void* data)
{
	auto* captured = static_cast<Captured*>(data);
	captured->arrived = true;
	captured->result = result;
	for (const char* key : {APP_CONTROL_DATA_SELECTED, APP_CONTROL_DATA_ID, "path", "result", "position", "group_id_list"}) {
		char* text = nullptr;
		char** array = nullptr;
		int length = 0;
		if (app_control_get_extra_data(reply, key, &text) == APP_CONTROL_ERROR_NONE && text)
			captured->texts[key] = text;
		else if (app_control_get_extra_data_array(reply, key, &array, &length) == APP_CONTROL_ERROR_NONE && length > 0)
			captured->texts[key] = std::string("[") + array[0] + "]";
		free(text);
		for (int i = 0; i < length; ++i)
			free(array[i]);
		free(array);
	}
}

// A request as the library makes it: application id or operation, URI, extras.
struct Request {
	const char* appId = nullptr;
	const char* operation = nullptr;
	std::string uri;
	std::vector<std::pair<std::string, std::string>> extras;
};

app_control_h makeRequest(const Request& r)
{
	app_control_h request = nullptr;
	app_control_create(&request);
	if (r.appId)
		app_control_set_app_id(request, r.appId);
	if (r.operation)
		app_control_set_operation(request, r.operation);
	if (!r.uri.empty())
		app_control_set_uri(request, r.uri.c_str());
	for (const auto& extra : r.extras)
		app_control_add_extra_data(request, extra.first.c_str(), extra.second.c_str());
	app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
	return request;
}

// The centre pixel of a picture file as 0xAARRGGBB (0 when unreadable), and its size.
uint32_t centrePixel(Evas_Object* win, const std::string& path, int* w = nullptr, int* h = nullptr)
{
	Evas_Object* image = evas_object_image_add(evas_object_evas_get(win));
	evas_object_image_file_set(image, path.c_str(), nullptr);
	int width = 0, height = 0;
	evas_object_image_size_get(image, &width, &height);
	auto* data = static_cast<const uint32_t*>(evas_object_image_data_get(image, EINA_FALSE));
	uint32_t pixel = data ? data[(height / 2) * (evas_object_image_stride_get(image) / 4) + width / 2] : 0;
	evas_object_del(image);
	if (w)
		*w = width;
	if (h)
		*h = height;
	return pixel;
}

std::string fileText(const std::string& path)
{
	std::ifstream in(path, std::ios::binary);
	std::stringstream text;
	text << in.rdbuf();
	return text.str();
}

// The screen that sent the requests, under the stand-ins.
class SenderView : public app_assist::WView {
public:
	const char* getClassName() override { return "SenderView"; }

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override { return elm_box_add(parent); }
};

class StandInRoutesTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		CtView::changeLanguage("en_US.UTF-8");
		demo::DemoLook::apply();
		m_pictures = demo::DemoPictures::ensure();
		m_screen = std::make_unique<ScreenHarness>(360, 640);
		m_handlers = std::make_unique<demo::DemoAppControlHandlers>(m_screen->naviframe(),
				demo::DemoAppControlHandlers::Folders::defaults());
		m_screen->push(new SenderView());
		m_owner = m_screen->topView()->getEvasObj();
		evas_object_smart_callback_add(m_screen->naviframe()->getEvasObj(), "transition,finished", transitionCb,
				&m_transitions);
		ScreenHarness::clearNotices();
	}
	void TearDown() override
	{
		m_handlers.reset();
		m_screen.reset();
		contacts_disconnect();
	}

	static void transitionCb(void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); }

	// Sends as the library does and pumps until the stand-in has slid in.
	void send(const Request& r, Captured* captured, bool opensScreen = true)
	{
		int transitions = m_transitions;
		app_control_h request = makeRequest(r);
		EXPECT_TRUE(ContactsAppControlLauncher::getInstance()->sendLaunchRequest(request, captured ? replyCb : nullptr,
				captured, m_owner));
		app_control_destroy(request);
		if (opensScreen) {
			EXPECT_TRUE(m_screen->pumpUntil([&] { return m_transitions > transitions; }));
		}
		m_screen->pumpUntilIdle();
	}
	template <class View = StandInView>
	View* top() const
	{
		return dynamic_cast<View*>(m_screen->topView());
	}
	std::vector<StandInListItem*> rows() const
	{
		StandInView* view = top();
		return view && view->getList() ? ScreenHarness::rowsOf<StandInListItem>(view->getList())
										: std::vector<StandInListItem*>();
	}
	StandInListItem* row(const std::string& text) const
	{
		for (StandInListItem* row : rows())
			if (row->getText() == text)
				return row;
		ADD_FAILURE() << "no row " << text;
		return nullptr;
	}
	void tap(const std::string& rowText) const
	{
		if (StandInListItem* found = row(rowText))
			ScreenHarness::selectItem(found->getElmObjectItem());
	}
	// The top stand-in's button labelled `label` (null when it has none).
	Evas_Object* button(const std::string& label) const
	{
		StandInView* view = top();
		for (Evas_Object* b : view ? view->getButtons() : std::vector<Evas_Object*>())
			if (ScreenHarness::buttonLabel(b) == label)
				return b;
		return nullptr;
	}
	void press(const std::string& label) const
	{
		Evas_Object* found = button(label);
		ASSERT_NE(nullptr, found) << label;
		ScreenHarness::click(found);
	}
	void shoot(const std::string& name) const
	{
		const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
		std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/host-standins";
		std::filesystem::create_directories(dir);
		m_screen->pumpFrames(2);
		EXPECT_TRUE(m_screen->savePng(dir + "/" + name + ".png"));
	}
	// Until the stand-in is gone and its closing drawn: a push during a pop's
	// transition is not what a person can do.
	bool backToSender(int transitionsBefore) const
	{
		return m_screen->pumpUntil([&] { return m_screen->viewCount() == 1 && m_transitions > transitionsBefore; });
	}
	void closeTop() const
	{
		int before = m_transitions;
		m_screen->sendBackKey();
		EXPECT_TRUE(backToSender(before));
	}
	static std::string ringtone(const char* name)
	{
		return ContactsCommon::getResourceDir() + "/ringtones/" + name + ".wav";
	}

	std::vector<std::string> m_pictures;
	std::unique_ptr<ScreenHarness> m_screen;
	std::unique_ptr<demo::DemoAppControlHandlers> m_handlers;
	Evas_Object* m_owner = nullptr;
	int m_transitions = 0;
};

TEST_F(StandInRoutesTest, EachPickerAnswersTheLibrarysRequestWithWhatWasChosenOrACancel)
{
	int family = addGroup(0, "Family");
	int work = addGroup(0, "Work");
	std::string picture = m_pictures.at(0);
	std::string crop = ct::platform::dataPath("stand-ins/crops/portrait-1-crop.png");
	std::filesystem::remove(crop);
	const Request gallery{GALLERY_APP_ID, APP_CONTROL_OPERATION_PICK, "",
		{{"hide-personal", "true"}, {"launch-type", "select-setas"}, {"View Mode", "SETAS"}, {"Resolution", "720x720"}}};
	const Request ringtones{RINGTONE_PICKER_APP_ID, nullptr, "",
		{{"default", "default show"}, {"path", "/usr/share/sounds/ringtones"}, {"marked_mode", "default"}}};
	auto groups = [](const std::string& selected) {
		return Request{CONTACTS_LIST_APP_ID, nullptr, "",
			{{"type", "36"}, {"selected_group_id_list", selected}, {"addressbook_name", "addressbook/phone"}}};
	};
	const Request maps{MAPS_APP_ID, nullptr, "", {{"searchByName", "Main St &amp; 5th"}}};
	auto typeAddress = [this](const char* text) { elm_object_text_set(top<demo::StandInMapsView>()->getEntry(), text); };

	struct Case {
		const char* name;
		Request request;
		std::function<void()> act;
		app_control_result_e result;
		std::map<std::string, std::string> texts;
	};
	const Case cases[] = {
		{"gallery", gallery, [this] { tap("portrait-2.png"); }, APP_CONTROL_RESULT_SUCCEEDED,
			{{APP_CONTROL_DATA_SELECTED, "[" + m_pictures.at(1) + "]"}}},
		{"gallery-back", gallery, [this] { m_screen->sendBackKey(); }, APP_CONTROL_RESULT_CANCELED, {}},
		{"camera", {nullptr, APP_CONTROL_OPERATION_CREATE_CONTENT, "", {{"CALLER", "contacts"}}},
			[this] { press("Turn"); press("Shutter"); }, APP_CONTROL_RESULT_SUCCEEDED,
			{{APP_CONTROL_DATA_SELECTED, "[" + m_pictures.at(1) + "]"}}},
		{"preset-styles", {IMAGE_EDITOR_APP_ID, nullptr, "", {{"type", "individual"}}},
			[this] { tap("Mint"); press("Done"); }, APP_CONTROL_RESULT_SUCCEEDED,
			{{"path", ct::platform::dataPath("stand-ins/styles/portrait-1-Mint.png")}}},
		{"crop", {IMAGE_VIEWER_APP_ID, nullptr, "", {{"Path", picture}, {"View Mode", "SETAS"}, {"Resolution", "480x480"}}},
			[this] { press("Set"); }, APP_CONTROL_RESULT_SUCCEEDED, {{APP_CONTROL_DATA_SELECTED, "[" + crop + "]"}}},
		{"crop-again", {IMAGE_VIEWER_APP_ID, nullptr, "", {{"Path", picture}, {"Resolution", "480x480"}}},
			[this] { press("Set"); }, APP_CONTROL_RESULT_SUCCEEDED,
			{{APP_CONTROL_DATA_SELECTED, "[" + crop.substr(0, crop.size() - 4) + "-2.png]"}}},
		{"crop-no-picture", {IMAGE_VIEWER_APP_ID, nullptr, "", {{"Path", "/nowhere/x.png"}}},
			[this] { EXPECT_EQ(nullptr, button("Set")); press("Cancel"); }, APP_CONTROL_RESULT_CANCELED, {}},
		{"ringtones", ringtones, [this] { tap("Soft chime"); }, APP_CONTROL_RESULT_SUCCEEDED,
			{{"result", ringtone("Soft chime")}, {"position", "0"}}},
		{"ringtones-default", ringtones, [this] { tap("Default"); }, APP_CONTROL_RESULT_SUCCEEDED,
			{{"result", "default"}, {"position", "0"}}},
		{"groups", groups(demo::StandInGroupPickerView::encodeIds({work})), [this] { tap("Family"); press("Done"); },
			APP_CONTROL_RESULT_SUCCEEDED, {{"group_id_list", demo::StandInGroupPickerView::encodeIds({family, work})}}},
		{"groups-none-left", groups(demo::StandInGroupPickerView::encodeIds({work})), [this] { tap("Work"); press("Done"); },
			APP_CONTROL_RESULT_SUCCEEDED, {}},
		{"groups-malformed-list", groups("abcde"), [this] { press("Cancel"); }, APP_CONTROL_RESULT_CANCELED, {}},
		{"maps", maps, [&] { typeAddress("12 Elm Road"); press("Done"); }, APP_CONTROL_RESULT_SUCCEEDED,
			{{APP_CONTROL_DATA_SELECTED, "12 Elm Road"}}},
		{"maps-geo-pick", {nullptr, APP_CONTROL_OPERATION_PICK, "geo:0,0?q=\"Berlin%20Mitte\"", {}},
			[this] { press("Done"); }, APP_CONTROL_RESULT_SUCCEEDED, {{APP_CONTROL_DATA_SELECTED, "Berlin Mitte"}}},
		{"maps-emptied", maps, [&] { typeAddress(""); press("Done"); }, APP_CONTROL_RESULT_SUCCEEDED, {}},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		Captured captured;
		send(c.request, &captured);
		ASSERT_NE(nullptr, top()) << "no stand-in opened";
		shoot(c.name);
		int before = m_transitions;
		c.act();
		EXPECT_TRUE(m_screen->pumpUntil([&] { return captured.arrived; }));
		EXPECT_TRUE(backToSender(before)) << "the stand-in closed";
		EXPECT_EQ(c.result, captured.result);
		EXPECT_EQ(c.texts, captured.texts);
	}

	// The styled copy is tinted, the crop square at the asked size.
	uint32_t original = centrePixel(m_screen->win(), m_pictures.at(0));
	std::string styled = ct::platform::dataPath("stand-ins/styles/portrait-1-Mint.png");
	uint32_t tinted = centrePixel(m_screen->win(), styled);
	EXPECT_NE(original, tinted);
	EXPECT_LT((tinted >> 16) & 0xFF, (original >> 16) & 0xFF) << "mint lowers the red of the skin";
	int w = 0, h = 0;
	EXPECT_EQ(original, centrePixel(m_screen->win(), crop, &w, &h));
	EXPECT_EQ(480, w);
	EXPECT_EQ(480, h);
}

TEST_F(StandInRoutesTest, PickersShowWhatTheRequestAlreadyChoseAndTheirPicturesAreReal)
{
	int travel = addGroup(0, "Travel");
	addGroup(0, "Sport");
	send({CONTACTS_LIST_APP_ID, nullptr, "", {{"type", "36"}, {"selected_group_id_list",
		demo::StandInGroupPickerView::encodeIds({travel})}}}, nullptr);
	EXPECT_TRUE(row("Travel")->isMarked());
	EXPECT_FALSE(row("Sport")->isMarked());
	closeTop();

	send({RINGTONE_PICKER_APP_ID, nullptr, "", {{"path", "/usr/share/sounds/ringtones"},
		{"marked_mode", ringtone("Two beeps")}}}, nullptr);
	std::vector<std::string> shown;
	for (StandInListItem* r : rows())
		shown.push_back(r->getText() + (r->isMarked() ? "*" : ""));
	EXPECT_EQ((std::vector<std::string>{"Morning bell", "Soft chime", "Two beeps*"}), shown) << "no Default without \"default show\"";
	// Power saving ends the picker the way the library does: by terminating what it launched.
	int before = m_transitions;
	ContactsAppControlLauncher::getInstance()->terminate();
	EXPECT_TRUE(backToSender(before));

	send({MAPS_APP_ID, nullptr, "", {{"searchByName", "Main St &amp; 5th"}}}, nullptr);
	EXPECT_STREQ("Main St &amp; 5th", elm_object_text_get(top<demo::StandInMapsView>()->getEntry()));
	closeTop();
}

TEST_F(StandInRoutesTest, TheShareTargetShowsAVcardOrATextAndSavesTheVcard)
{
	int person = addSimplePerson("Zoë");
	send({nullptr, APP_CONTROL_OPERATION_SHARE, "", {{APP_CONTROL_DATA_ID, std::to_string(person)},
		{APP_CONTROL_DATA_TYPE, "person"}}}, nullptr);
	auto* share = top<demo::StandInShareView>();
	ASSERT_NE(nullptr, share);
	EXPECT_EQ(0u, share->getShared().find("BEGIN:VCARD"));
	EXPECT_NE(std::string::npos, share->getShared().find("Zoë"));
	shoot("share-vcard");
	std::string shared = share->getShared(), path = share->getSavePath();
	press("Save");
	EXPECT_EQ(shared, fileText(path));
	EXPECT_FALSE(std::filesystem::exists(path + ".part"));
	EXPECT_EQ("Saved to " + path, ScreenHarness::notices().back());
	int before = m_transitions;
	press("Close");
	EXPECT_TRUE(backToSender(before));

	const Request texts[] = {
		{nullptr, APP_CONTROL_OPERATION_SHARE_TEXT, "", {{APP_CONTROL_DATA_TEXT, "Zoë\n+49 30 1234 <b>"}}},
		{nullptr, APP_CONTROL_OPERATION_SHARE, "", {{APP_CONTROL_DATA_ID, "999999"}, {APP_CONTROL_DATA_TYPE, "person"}}},
		{nullptr, APP_CONTROL_OPERATION_SHARE, "", {{APP_CONTROL_DATA_ID, "1x"}, {APP_CONTROL_DATA_TYPE, "person"}}},
	};
	const std::string expected[] = {"Zoë\n+49 30 1234 <b>", "", ""};
	for (size_t i = 0; i < 3; ++i) {
		send(texts[i], nullptr);
		ASSERT_NE(nullptr, top<demo::StandInShareView>());
		EXPECT_EQ(expected[i], top<demo::StandInShareView>()->getShared());
		EXPECT_EQ(nullptr, button("Save")) << "only a vCard is saved";
		if (i == 0)
			shoot("share-text");
		before = m_transitions;
		press("Close");
		EXPECT_TRUE(backToSender(before));
	}
}

TEST_F(StandInRoutesTest, TheContactPickerLinksThroughTheListAppAndOtherRequestsShowANotice)
{
	int base = addSimplePerson("Linda");
	Captured captured;
	send({CONTACTS_LIST_APP_ID, nullptr, "", {{"type", "131"}, {"ct_selected_person_id", std::to_string(base)},
		{"ct_max", "9"}, {"person_linked_count", "1"}}}, &captured);
	auto* picker = dynamic_cast<CtContactPickerView*>(m_screen->topView());
	ASSERT_NE(nullptr, picker);
	EXPECT_EQ(9, picker->getMaxCount());
	EXPECT_EQ(base, picker->getBasePersonId());
	shoot("contact-picker");
	closeTop();
	EXPECT_TRUE(m_screen->pumpUntil([&] { return captured.arrived; }));
	EXPECT_EQ(APP_CONTROL_RESULT_CANCELED, captured.result) << "a picker left without a choice says so";

	struct Notice {
		Request request;
		const char* notice;
	};
	const Notice notices[] = {
		{{nullptr, VIDEO_CALL_OPERATION, "tel:+4930123", {{"ctindex", "3"}}}, "Video call: tel:+4930123"},
		{{nullptr, APP_CONTROL_OPERATION_VIEW, "http://example.org", {}}, "Browser: http://example.org"},
		{{nullptr, APP_CONTROL_OPERATION_CALL, "tel:112", {}}, "Call: tel:112"},
		{{MESSAGE_COMPOSER_APP_ID, APP_CONTROL_OPERATION_COMPOSE, "", {{"number/index", "+4930123/7"}}}, "Message: +4930123"},
		{{nullptr, APP_CONTROL_OPERATION_COMPOSE, "mailto:a@example.org", {}}, "E-mail: mailto:a@example.org"},
		{{ACCOUNT_SETTINGS_APP_ID, nullptr, "", {{"mode", "add_account"}}}, "Add account"},
	};
	for (const Notice& n : notices) {
		ScreenHarness::clearNotices();
		Captured answered;
		send(n.request, &answered, false);
		EXPECT_EQ(std::vector<std::string>{n.notice}, ScreenHarness::notices());
		EXPECT_TRUE(m_screen->pumpUntil([&] { return answered.arrived; }));
		EXPECT_EQ(APP_CONTROL_RESULT_SUCCEEDED, answered.result);
		EXPECT_EQ(1, m_screen->viewCount()) << "a notice opens no screen";
	}
}

} // namespace
} // namespace ct::test
