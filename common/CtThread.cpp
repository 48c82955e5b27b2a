#include "CtThread.h"

#include "ContactsDebug.h"

// Lives until the toolkit reports the thread finished, so a CtThread deleted
// mid-work never leaves the thread with a dangling pointer.
struct CtThread::Shared {
	std::function<void()> work;
	std::function<void()> onEnd;
	CtThread* owner;
	bool ending = false;
};

CtThread::CtThread(std::function<void()> work, std::function<void()> onEnd)
	: m_shared(new Shared{std::move(work), std::move(onEnd), this})
{
}

CtThread::~CtThread()
{
	if (m_thread) {
		m_shared->owner = nullptr;
		ecore_thread_cancel(m_thread);
		return; // __endCb or __cancelCb frees the shared state.
	}
	if (m_shared->ending) {
		m_shared->owner = nullptr; // Deleted from its own end callback.
		return;
	}
	delete m_shared;
}

bool CtThread::start()
{
	WPRET_VM(m_thread, false, "thread already running");
	m_thread = ecore_thread_run(__runCb, __endCb, __cancelCb, m_shared);
	if (!m_thread)
		WERROR("ecore_thread_run() failed");
	return m_thread != nullptr;
}

void CtThread::__runCb(void* data, Ecore_Thread*)
{
	auto* shared = static_cast<Shared*>(data);
	if (shared->work)
		shared->work();
}

void CtThread::__endCb(void* data, Ecore_Thread*)
{
	auto* shared = static_cast<Shared*>(data);
	CtThread* owner = shared->owner;
	if (!owner) {
		delete shared;
		return;
	}
	owner->m_thread = nullptr;
	shared->ending = true;
	if (shared->onEnd)
		shared->onEnd();
	shared->ending = false;
	if (!shared->owner)
		delete shared;
}

void CtThread::__cancelCb(void* data, Ecore_Thread* thread)
{
	__endCb(data, thread);
}
