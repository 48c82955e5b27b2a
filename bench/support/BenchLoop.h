// Running the main loop from a benchmark: until a condition holds or a time
// has passed. A 1 ms timer keeps the loop from sleeping through a frame.
#pragma once

#include <Ecore.h>

namespace ct::bench {

template <class Done>
void pumpUntil(Done done, double maxSeconds)
{
	Ecore_Timer* wake = ecore_timer_add(0.001, [](void*) -> Eina_Bool { return ECORE_CALLBACK_RENEW; }, nullptr);
	double deadline = ecore_time_get() + maxSeconds;
	while (!done() && ecore_time_get() < deadline)
		ecore_main_loop_iterate_may_block(EINA_TRUE);
	ecore_timer_del(wake);
}

inline void pumpFor(double seconds)
{
	pumpUntil([] { return false; }, seconds);
}

} // namespace ct::bench
