#include "WUgClient.h"

#include "ContactsDebug.h"

namespace app_assist {

WUgClient::WUgClient(std::function<void()> onDestroy)
	: m_onDestroy(std::move(onDestroy))
{
}

WUgClient::~WUgClient() = default;

void WUgClient::destroy()
{
	WPRET_M(m_destroying, "the gadget client is already being destroyed");
	m_destroying = true;
	std::function<void()> onDestroy = std::move(m_onDestroy);
	if (onDestroy)
		onDestroy();
	delete this;
}

} // namespace app_assist
