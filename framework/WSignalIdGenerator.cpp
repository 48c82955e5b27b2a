#include "WSignalIdGenerator.h"

namespace app_assist {

unsigned int WSignalIdGenerator::generate()
{
	static unsigned int last = 0;
	if (++last == 0)
		++last;
	return last;
}

} // namespace app_assist
