#include "DemoAppControlHandlers.h"

#include "ContactsAppIds.h"
#include "ContactsDebug.h"
#include "CtEsuAgentMgr.h"

#include <notification.h>

#include <cstdlib>
#include <cstring>
#include <map>

namespace ct::demo {

namespace {

constexpr size_t kMaxNoticeLength = 200;
constexpr const char* kDemoRingtone = "/usr/share/sounds/ringtones/Demo ringtone.ogg";

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
	for (const char* key : {APP_CONTROL_DATA_TEXT, APP_CONTROL_DATA_PHONE, APP_CONTROL_DATA_EMAIL, APP_CONTROL_DATA_URL,
			 "path", "type"}) {
		std::string value =
			textFrom([request, key](char** text) { return app_control_get_extra_data(request, key, text); });
		if (!value.empty())
			return value;
	}
	return "";
}

void replyWith(const ct::appcontrol::Reply& reply, const char* key, const char* value, bool asArray)
{
	app_control_h answer = nullptr;
	if (app_control_create(&answer) != APP_CONTROL_ERROR_NONE)
		return;
	if (asArray)
		app_control_add_extra_data_array(answer, key, &value, 1);
	else
		app_control_add_extra_data(answer, key, value);
	reply(answer, APP_CONTROL_RESULT_SUCCEEDED);
	app_control_destroy(answer);
}

} // namespace

DemoAppControlHandlers::DemoAppControlHandlers(std::string picturePath)
	: m_picturePath(std::move(picturePath))
{
	for (const char* op : {APP_CONTROL_OPERATION_CALL, APP_CONTROL_OPERATION_DIAL, VIDEO_CALL_OPERATION,
			 APP_CONTROL_OPERATION_COMPOSE, APP_CONTROL_OPERATION_SHARE, APP_CONTROL_OPERATION_SHARE_TEXT,
			 APP_CONTROL_OPERATION_VIEW, APP_CONTROL_OPERATION_EDIT})
		__byOperation(op, Answer::Done);
	__byOperation(APP_CONTROL_OPERATION_PICK, Answer::Picture);
	__byOperation(APP_CONTROL_OPERATION_CREATE_CONTENT, Answer::Picture);
	for (const char* app : {GALLERY_APP_ID, IMAGE_VIEWER_APP_ID, IMAGE_EDITOR_APP_ID})
		__byApp(app, Answer::Picture);
	__byApp(RINGTONE_PICKER_APP_ID, Answer::Ringtone);
	for (const char* app : {MAPS_APP_ID, MESSAGE_COMPOSER_APP_ID, FACEBOOK_APP_ID, ACCOUNT_SETTINGS_APP_ID})
		__byApp(app, Answer::Done);
	// Signing up for profile sharing always succeeds on the demo device.
	__byApp(CtEsuAgentMgr::kSignUpAppId, Answer::Done);
	// The demo has no contact or group picker to choose with.
	__byApp(CONTACTS_LIST_APP_ID, Answer::None);
}

void DemoAppControlHandlers::__byOperation(const char* operation, Answer answer)
{
	m_registrations.push_back(ct::appcontrol::registerOperationHandler(operation,
			[this, answer](app_control_h request, const ct::appcontrol::Reply& reply) {
				return __handle(request, reply, answer);
			}));
}

void DemoAppControlHandlers::__byApp(const char* appId, Answer answer)
{
	m_registrations.push_back(ct::appcontrol::registerAppHandler(appId,
			[this, answer](app_control_h request, const ct::appcontrol::Reply& reply) {
				return __handle(request, reply, answer);
			}));
}

std::string DemoAppControlHandlers::describe(app_control_h request)
{
	std::string appId = textFrom([request](char** text) { return app_control_get_app_id(request, text); });
	std::string operation = textFrom([request](char** text) { return app_control_get_operation(request, text); });
	std::string notice = roleOf(appId, operation);
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

int DemoAppControlHandlers::__handle(app_control_h request, const ct::appcontrol::Reply& reply, Answer answer) const
{
	std::string notice = describe(request);
	WINFO("demo handler: %s", notice.c_str());
	if (notification_status_message_post(notice.c_str()) != NOTIFICATION_ERROR_NONE)
		notification_status_message_post("A request the demo cannot show");
	bool wanted = false;
	app_control_is_reply_requested(request, &wanted);
	if (!wanted)
		return APP_CONTROL_ERROR_NONE;
	if (answer == Answer::Picture && !m_picturePath.empty())
		replyWith(reply, APP_CONTROL_DATA_SELECTED, m_picturePath.c_str(), true);
	else if (answer == Answer::Ringtone)
		replyWith(reply, "result", kDemoRingtone, false);
	else
		reply(nullptr, answer == Answer::Done ? APP_CONTROL_RESULT_SUCCEEDED : APP_CONTROL_RESULT_CANCELED);
	return APP_CONTROL_ERROR_NONE;
}

} // namespace ct::demo
