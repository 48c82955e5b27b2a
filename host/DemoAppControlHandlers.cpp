#include "DemoAppControlHandlers.h"

#include "ContactsAppIds.h"
#include "ContactsCommon.h"
#include "ContactsData.h"
#include "ContactsDebug.h"
#include "CtDllViewFactory.h"
#include "CtEsuAgentMgr.h"
#include "DataDir.h"
#include "StandInCameraView.h"
#include "StandInCropView.h"
#include "StandInGalleryView.h"
#include "StandInGroupPickerView.h"
#include "StandInMapsView.h"
#include "StandInPresetEditorView.h"
#include "StandInRingtonePickerView.h"
#include "StandInShareView.h"

#include <notification.h>

#include <cstdlib>
#include <cstring>
#include <map>

namespace ct::demo {

namespace {

constexpr size_t kMaxNoticeLength = 200;
// The group picker's launch type; other types of the contacts list pick a person.
const char* const kGroupPickerType = "36";

// Who would have answered, by application id, then by operation.
std::string roleOf(const std::string& appId, const std::string& operation)
{
	static const std::map<std::string, std::string> apps = {
		{MAPS_APP_ID, "Maps"}, {GALLERY_APP_ID, "Gallery"}, {IMAGE_VIEWER_APP_ID, "Image viewer"},
		{IMAGE_EDITOR_APP_ID, "Image editor"}, {RINGTONE_PICKER_APP_ID, "Ringtone picker"},
		{MESSAGE_COMPOSER_APP_ID, "Message"}, {CONTACTS_LIST_APP_ID, "Contact picker"},
		{FACEBOOK_APP_ID, "Facebook"}, {CONTACTS_APP_ID, "Contacts"}, {ACCOUNT_SETTINGS_APP_ID, "Accounts"},
		{CtEsuAgentMgr::kSignUpAppId, "Sign-up"},
	};
	static const std::map<std::string, std::string> operations = {
		{APP_CONTROL_OPERATION_CALL, "Call"}, {APP_CONTROL_OPERATION_DIAL, "Dial"},
		{VIDEO_CALL_OPERATION, "Video call"}, {APP_CONTROL_OPERATION_COMPOSE, "Compose"},
		{APP_CONTROL_OPERATION_SHARE, "Share"}, {APP_CONTROL_OPERATION_SHARE_TEXT, "Share text"},
		{APP_CONTROL_OPERATION_VIEW, "Open"}, {APP_CONTROL_OPERATION_PICK, "Pick"},
		{APP_CONTROL_OPERATION_CREATE_CONTENT, "Camera"}, {APP_CONTROL_OPERATION_EDIT, "Edit"},
	};
	if (auto it = apps.find(appId); it != apps.end())
		return it->second;
	if (auto it = operations.find(operation); it != operations.end())
		return it->second;
	return operation.empty() ? "Launch" : operation;
}

// The role, told more precisely where the request's URI or mode says more.
std::string refinedRoleOf(const std::string& role, const std::string& uri, const std::string& mode)
{
	auto startsWith = [&uri](const char* prefix) { return uri.compare(0, strlen(prefix), prefix) == 0; };
	if (role == "Open" && (startsWith("http:") || startsWith("https:")))
		return "Browser";
	if (role == "Compose" && startsWith("mailto:"))
		return "E-mail";
	if (role == "Compose" && (startsWith("sms:") || startsWith("mmsto:")))
		return "Message";
	if (role == "Accounts" && mode == "add_account")
		return "Add account";
	return role;
}

// Runs one of the app-control getters that hand out a copy, and frees it.
template <typename Getter>
std::string textFrom(Getter getter)
{
	char* text = nullptr;
	int err = getter(&text);
	std::string out = (err == APP_CONTROL_ERROR_NONE && text) ? text : "";
	free(text);
	return out;
}

// The most telling detail of a request: its URI, else a known extra.
std::string detailOf(app_control_h request)
{
	std::string uri = textFrom([request](char** text) { return app_control_get_uri(request, text); });
	if (!uri.empty())
		return uri;
	// The message composer's "number/index" is the number, a slash and its record id.
	std::string numberIndex =
		textFrom([request](char** text) { return app_control_get_extra_data(request, "number/index", text); });
	if (!numberIndex.empty())
		return numberIndex.substr(0, numberIndex.rfind('/'));
	for (const char* key : {APP_CONTROL_DATA_TEXT, APP_CONTROL_DATA_PHONE, APP_CONTROL_DATA_EMAIL, APP_CONTROL_DATA_URL,
			 "path", "type"}) {
		std::string value =
			textFrom([request, key](char** text) { return app_control_get_extra_data(request, key, text); });
		if (!value.empty())
			return value;
	}
	return "";
}

std::string extraOf(app_control_h request, const char* key)
{
	return textFrom([request, key](char** text) { return app_control_get_extra_data(request, key, text); });
}

// Replies "cancelled" for a screen that closed without answering.
void replyCancelledOnDelCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* reply = static_cast<ct::appcontrol::Reply*>(data);
	if (reply->isPending())
		(*reply)(nullptr, APP_CONTROL_RESULT_CANCELED);
	delete reply;
}

} // namespace

DemoAppControlHandlers::Folders DemoAppControlHandlers::Folders::defaults()
{
	return {ct::platform::dataPath("demo-pictures"), ct::platform::dataPath("stand-ins"),
		ContactsCommon::getResourceDir() + "/ringtones"};
}

DemoAppControlHandlers::DemoAppControlHandlers(app_assist::WNaviframe* naviframe, Folders folders)
	: m_naviframe(naviframe)
	, m_naviframeAlive(naviframe ? naviframe->getWeakPtr() : std::weak_ptr<app_assist::WControl>())
	, m_folders(std::move(folders))
{
	for (const char* op : {APP_CONTROL_OPERATION_CALL, APP_CONTROL_OPERATION_DIAL, VIDEO_CALL_OPERATION,
			 APP_CONTROL_OPERATION_COMPOSE, APP_CONTROL_OPERATION_VIEW, APP_CONTROL_OPERATION_EDIT})
		__noticeByOperation(op);
	for (const char* app : {MESSAGE_COMPOSER_APP_ID, FACEBOOK_APP_ID, ACCOUNT_SETTINGS_APP_ID})
		__noticeByApp(app);
	// Signing up for profile sharing always succeeds on the demo device.
	__noticeByApp(CtEsuAgentMgr::kSignUpAppId);

	const Folders& f = m_folders;
	__screenByApp(GALLERY_APP_ID, [f](app_control_h request, const ct::appcontrol::Reply& reply) {
		return new StandInGalleryView(request, reply, f.pictures);
	});
	__screenByOperation(APP_CONTROL_OPERATION_PICK, [this](app_control_h request, const ct::appcontrol::Reply& reply) {
		return __makePick(request, reply);
	});
	__screenByOperation(APP_CONTROL_OPERATION_CREATE_CONTENT, [f](app_control_h request, const ct::appcontrol::Reply& reply) {
		return new StandInCameraView(request, reply, f.pictures);
	});
	__screenByApp(IMAGE_EDITOR_APP_ID, [f](app_control_h request, const ct::appcontrol::Reply& reply) {
		return new StandInPresetEditorView(request, reply, f.pictures, f.output + "/styles");
	});
	__screenByApp(IMAGE_VIEWER_APP_ID, [f](app_control_h request, const ct::appcontrol::Reply& reply) {
		return new StandInCropView(request, reply, f.output + "/crops");
	});
	__screenByApp(RINGTONE_PICKER_APP_ID, [f](app_control_h request, const ct::appcontrol::Reply& reply) {
		return new StandInRingtonePickerView(request, reply, f.ringtones);
	});
	__screenByApp(CONTACTS_LIST_APP_ID, [this](app_control_h request, const ct::appcontrol::Reply& reply) {
		return __makePicker(request, reply);
	});
	__screenByApp(MAPS_APP_ID, [](app_control_h request, const ct::appcontrol::Reply& reply) {
		return new StandInMapsView(request, reply);
	});
	for (const char* op : {APP_CONTROL_OPERATION_SHARE, APP_CONTROL_OPERATION_SHARE_TEXT}) {
		__screenByOperation(op, [f](app_control_h request, const ct::appcontrol::Reply& reply) {
			return new StandInShareView(request, reply, f.output + "/shared");
		});
	}
}

void DemoAppControlHandlers::__noticeByOperation(const char* operation)
{
	m_registrations.push_back(ct::appcontrol::registerOperationHandler(operation,
			[this](app_control_h request, const ct::appcontrol::Reply& reply) { return __notice(request, reply); }));
}

void DemoAppControlHandlers::__noticeByApp(const char* appId)
{
	m_registrations.push_back(ct::appcontrol::registerAppHandler(appId,
			[this](app_control_h request, const ct::appcontrol::Reply& reply) { return __notice(request, reply); }));
}

void DemoAppControlHandlers::__screenByOperation(const char* operation, ScreenMaker make)
{
	m_screens.push_back(std::make_unique<Screen>(Screen{std::move(make), {}}));
	Screen* screen = m_screens.back().get();
	m_registrations.push_back(ct::appcontrol::registerOperationHandler(operation,
			[this, screen](app_control_h request, const ct::appcontrol::Reply& reply) {
				return __open(*screen, request, reply);
			},
			[screen] {
				if (auto open = screen->open.lock())
					static_cast<app_assist::WView*>(open.get())->popOut();
			}));
}

void DemoAppControlHandlers::__screenByApp(const char* appId, ScreenMaker make)
{
	m_screens.push_back(std::make_unique<Screen>(Screen{std::move(make), {}}));
	Screen* screen = m_screens.back().get();
	m_registrations.push_back(ct::appcontrol::registerAppHandler(appId,
			[this, screen](app_control_h request, const ct::appcontrol::Reply& reply) {
				return __open(*screen, request, reply);
			},
			[screen] {
				if (auto open = screen->open.lock())
					static_cast<app_assist::WView*>(open.get())->popOut();
			}));
}

app_assist::WView* DemoAppControlHandlers::__makePick(app_control_h request, const ct::appcontrol::Reply& reply) const
{
	std::string uri = textFrom([request](char** text) { return app_control_get_uri(request, text); });
	if (uri.compare(0, 4, "geo:") == 0)
		return new StandInMapsView(request, reply);
	return new StandInGalleryView(request, reply, m_folders.pictures);
}

app_assist::WView* DemoAppControlHandlers::__makePicker(app_control_h request, const ct::appcontrol::Reply& reply) const
{
	if (extraOf(request, "type") == kGroupPickerType)
		return new StandInGroupPickerView(request, reply);
	// The contacts application's own picker answers the other types itself.
	ContactsData data;
	data.appControl = request;
	return CtDllViewFactory::getInstance()->getCtListViewClass(&data);
}

int DemoAppControlHandlers::__open(Screen& screen, app_control_h request, const ct::appcontrol::Reply& reply)
{
	if (m_naviframeAlive.expired())
		return __notice(request, reply);
	WINFO("demo handler: %s", describe(request).c_str());
	app_assist::WView* view = screen.make(request, reply);
	if (!view || !m_naviframe->push(view)) {
		WERROR("the stand-in for \"%s\" did not open", describe(request).c_str());
		return APP_CONTROL_ERROR_LAUNCH_FAILED;
	}
	screen.open = view->getWeakPtr();
	if (!dynamic_cast<StandInView*>(view))
		evas_object_event_callback_add(view->getEvasObj(), EVAS_CALLBACK_DEL, replyCancelledOnDelCb,
				new ct::appcontrol::Reply(reply));
	return APP_CONTROL_ERROR_NONE;
}

std::string DemoAppControlHandlers::describe(app_control_h request)
{
	std::string appId = textFrom([request](char** text) { return app_control_get_app_id(request, text); });
	std::string operation = textFrom([request](char** text) { return app_control_get_operation(request, text); });
	std::string uri = textFrom([request](char** text) { return app_control_get_uri(request, text); });
	std::string notice = refinedRoleOf(roleOf(appId, operation), uri, extraOf(request, "mode"));
	std::string detail = detailOf(request);
	if (!detail.empty())
		notice += ": " + detail;
	if (notice.size() > kMaxNoticeLength) {
		size_t cut = kMaxNoticeLength;
		// Never cut inside a UTF-8 sequence.
		while (cut > 0 && (static_cast<unsigned char>(notice[cut]) & 0xC0) == 0x80)
			--cut;
		notice = notice.substr(0, cut) + "...";
	}
	return notice;
}

int DemoAppControlHandlers::__notice(app_control_h request, const ct::appcontrol::Reply& reply) const
{
	std::string notice = describe(request);
	WINFO("demo handler: %s", notice.c_str());
	if (notification_status_message_post(notice.c_str()) != NOTIFICATION_ERROR_NONE)
		notification_status_message_post("A request the demo cannot show");
	bool wanted = false;
	app_control_is_reply_requested(request, &wanted);
	if (wanted)
		reply(nullptr, m_naviframeAlive.expired() ? APP_CONTROL_RESULT_CANCELED : APP_CONTROL_RESULT_SUCCEEDED);
	return APP_CONTROL_ERROR_NONE;
}

} // namespace ct::demo
