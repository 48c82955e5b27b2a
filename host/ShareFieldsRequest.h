// The host's request to the share-fields screen: a UI gadget whose result
// (the chosen fields as text, "person_info") is printed and shown as a
// notice. Lives as long as the screen that keeps a pointer to it.
#pragma once

#include "UiGadget.h"

#include <ContactsDetails.h>

#include <string>

namespace ct::demo {

class ShareFieldsRequest {
public:
	ShareFieldsRequest();
	ShareFieldsRequest(const ShareFieldsRequest&) = delete;
	ShareFieldsRequest& operator=(const ShareFieldsRequest&) = delete;

	CtLaunchRequest* get() { return &m_request; }
	// The last text received ("" before any, or when the result had none).
	const std::string& lastText() const { return m_lastText; }

	// What the host shows for a result with `text`.
	static std::string describe(const std::string& text);

private:
	void __onResult(app_control_h result);

	ct::ug::UiGadget m_gadget;
	CtLaunchRequest m_request;
	std::string m_lastText;
};

} // namespace ct::demo
