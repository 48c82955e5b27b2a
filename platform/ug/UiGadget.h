// The host's side of a UI gadget: makes the handle a gadget screen uses, and
// receives its results and its request to close. Main thread only.
#pragma once

#include "ui-gadget.h"

#include "MainLoopJob.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace ct::ug {

class UiGadget {
public:
	// `result` is valid during the call only; clone it to keep it.
	using ResultCallback = std::function<void(app_control_h result)>;
	using DestroyCallback = std::function<void()>;

	explicit UiGadget(std::string name, ResultCallback onResult = {}, DestroyCallback onDestroy = {});
	// Afterwards the handle is unknown: calls with it fail without harm, and a
	// pending close is dropped.
	~UiGadget();
	UiGadget(const UiGadget&) = delete;
	UiGadget& operator=(const UiGadget&) = delete;

	ui_gadget_h handle() const { return m_handle; }
	const std::string& name() const { return m_name; }

	// Copies of every result sent so far, oldest first (owned by this object).
	const std::vector<app_control_h>& results() const { return m_results; }
	// The value of `key` in result `index`, or "" when absent.
	std::string resultValue(size_t index, const std::string& key) const;
	// Whether ug_destroy_me was called; the destroy callback may still be pending.
	bool isDestroyRequested() const { return m_destroyRequested; }
	bool isDestroyed() const { return m_destroyed; }

	// Called by ug_send_result / ug_destroy_me.
	int receiveResult(app_control_h result);
	int requestDestroy();

private:
	void __onDestroyJob();

	std::string m_name;
	ResultCallback m_onResult;
	DestroyCallback m_onDestroy;
	ui_gadget_h m_handle = nullptr;
	std::vector<app_control_h> m_results;
	std::unique_ptr<appcontrol::MainLoopJob> m_destroyJob;
	bool m_destroyRequested = false;
	bool m_destroyed = false;
};

} // namespace ct::ug
