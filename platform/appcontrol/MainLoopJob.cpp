#include "MainLoopJob.h"

#include "ContactsDebug.h"

namespace ct::appcontrol {

MainLoopJob::MainLoopJob(std::function<void()> fn) : m_fn(std::move(fn))
{
	ecore_init();
	m_job = ecore_job_add(&MainLoopJob::__onJobCb, this);
	if (!m_job)
		WERROR("ecore_job_add() failed");
}

MainLoopJob::~MainLoopJob()
{
	if (m_job)
		ecore_job_del(m_job);
	ecore_shutdown();
}

void MainLoopJob::__onJobCb(void* data)
{
	auto* self = static_cast<MainLoopJob*>(data);
	self->m_job = nullptr;
	// Moved out first: the call may delete `self`.
	std::function<void()> fn = std::move(self->m_fn);
	if (fn)
		fn();
}

} // namespace ct::appcontrol
