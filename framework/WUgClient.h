// A UI gadget launched by a view. destroy() ends the gadget (its end
// callback runs once) and deletes the client.
#pragma once

#include <functional>

namespace app_assist {

class WUgClient {
public:
	explicit WUgClient(std::function<void()> onDestroy = nullptr);

	void destroy();
	bool isDestroying() const { return m_destroying; }

private:
	~WUgClient();

	std::function<void()> m_onDestroy;
	bool m_destroying = false;
};

} // namespace app_assist
