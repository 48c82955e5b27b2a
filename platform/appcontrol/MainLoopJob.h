// A one-shot call on the next EFL main-loop iteration, removed if its owner
// dies first. Keeps ecore initialised while it waits, so removal is always safe.
#pragma once

#include <Ecore.h>

#include <functional>

namespace ct::appcontrol {

class MainLoopJob {
public:
	// `fn` may delete this job's owner (and so the job) while it runs.
	explicit MainLoopJob(std::function<void()> fn);
	~MainLoopJob();
	MainLoopJob(const MainLoopJob&) = delete;
	MainLoopJob& operator=(const MainLoopJob&) = delete;

	bool isPending() const { return m_job != nullptr; }

private:
	static void __onJobCb(void* data);

	std::function<void()> m_fn;
	Ecore_Job* m_job = nullptr;
};

} // namespace ct::appcontrol
