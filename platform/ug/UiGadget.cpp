// Host side of UI gadgets and the gadget calls ug_send_result / ug_destroy_me.
#include "UiGadget.h"

#include "ContactsDebug.h"

#include <cstdlib>
#include <map>

struct ui_gadget_s {
	ct::ug::UiGadget* owner;
};

namespace ct::ug {
namespace {

// Live gadgets by handle; a handle not in here is unknown or closed.
std::map<ui_gadget_h, UiGadget*>& liveGadgets()
{
	static auto* gadgets = new std::map<ui_gadget_h, UiGadget*>;
	return *gadgets;
}

UiGadget* findGadget(ui_gadget_h ug)
{
	auto it = liveGadgets().find(ug);
	return it == liveGadgets().end() ? nullptr : it->second;
}

} // namespace

UiGadget::UiGadget(std::string name, ResultCallback onResult, DestroyCallback onDestroy)
	: m_name(std::move(name)), m_onResult(std::move(onResult)), m_onDestroy(std::move(onDestroy))
{
	m_handle = new ui_gadget_s{this};
	liveGadgets()[m_handle] = this;
}

UiGadget::~UiGadget()
{
	liveGadgets().erase(m_handle);
	delete m_handle;
	for (app_control_h result : m_results)
		app_control_destroy(result);
}

std::string UiGadget::resultValue(size_t index, const std::string& key) const
{
	if (index >= m_results.size())
		return {};
	char* value = nullptr;
	if (app_control_get_extra_data(m_results[index], key.c_str(), &value) != APP_CONTROL_ERROR_NONE)
		return {};
	std::string out = value ? value : "";
	free(value);
	return out;
}

int UiGadget::receiveResult(app_control_h result)
{
	WPRET_VM(m_destroyed, UG_ERROR_INVALID_PARAMETER, "gadget %s is closed", m_name.c_str());
	app_control_h copy = nullptr;
	int err = app_control_clone(&copy, result);
	if (err != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_clone", err);
		return err == APP_CONTROL_ERROR_OUT_OF_MEMORY ? UG_ERROR_OUT_OF_MEMORY : UG_ERROR_INVALID_PARAMETER;
	}
	m_results.push_back(copy);
	if (m_onResult)
		m_onResult(copy);
	return UG_ERROR_NONE;
}

int UiGadget::requestDestroy()
{
	WPRET_VM(m_destroyed, UG_ERROR_INVALID_PARAMETER, "gadget %s is closed", m_name.c_str());
	if (m_destroyRequested)
		return UG_ERROR_NONE;
	m_destroyRequested = true;
	m_destroyJob = std::make_unique<appcontrol::MainLoopJob>([this] { __onDestroyJob(); });
	return UG_ERROR_NONE;
}

void UiGadget::__onDestroyJob()
{
	m_destroyed = true;
	// The host usually deletes the gadget here, so `this` is not used after.
	DestroyCallback onDestroy = m_onDestroy;
	if (onDestroy)
		onDestroy();
}

} // namespace ct::ug

int ug_send_result(ui_gadget_h ug, app_control_h result)
{
	WPRET_VM(!result, UG_ERROR_INVALID_PARAMETER, "Invalid param : result");
	ct::ug::UiGadget* gadget = ct::ug::findGadget(ug);
	WPRET_VM(!gadget, UG_ERROR_INVALID_PARAMETER, "Invalid param : ug %p", (void*)ug);
	return gadget->receiveResult(result);
}

int ug_destroy_me(ui_gadget_h ug)
{
	ct::ug::UiGadget* gadget = ct::ug::findGadget(ug);
	WPRET_VM(!gadget, UG_ERROR_INVALID_PARAMETER, "Invalid param : ug %p", (void*)ug);
	return gadget->requestDestroy();
}
