// Ids for signal listeners: unique for the process, never 0.
#pragma once

namespace app_assist {

class WSignalIdGenerator {
public:
	static unsigned int generate();
};

} // namespace app_assist
