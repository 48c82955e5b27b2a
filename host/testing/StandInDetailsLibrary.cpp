// A stand-in for libcontacts-details.so that the host tests load through
// CONTACTS_DETAILS_LIBRARY: it exports only createCtDetailView, whose view
// shows the person id and, once pushed, asks for a call the way the detail
// screen's call button does.
#include "WView.h"

#include <CtLaunchRequest.h>
#include <app_control.h>

#include <string>

namespace {

class StandInDetailView : public app_assist::WView {
public:
	explicit StandInDetailView(int personId) : m_personId(personId) {}
	const char* getClassName() override { return "StandInDetailView"; }

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		Evas_Object* label = elm_label_add(parent);
		std::string text = "stand-in detail of person " + std::to_string(m_personId);
		elm_object_text_set(label, text.c_str());
		return label;
	}

	void onPushed(Elm_Object_Item*) override
	{
		app_control_h request = nullptr;
		app_control_create(&request);
		app_control_set_operation(request, APP_CONTROL_OPERATION_CALL);
		std::string uri = "tel:+person" + std::to_string(m_personId);
		app_control_set_uri(request, uri.c_str());
		app_control_send_launch_request(request, nullptr, nullptr);
		app_control_destroy(request);
	}

private:
	int m_personId;
};

} // namespace

extern "C" __attribute__((visibility("default"))) app_assist::WView* createCtDetailView(int personId, CtLaunchRequest*)
{
	return new StandInDetailView(personId);
}
