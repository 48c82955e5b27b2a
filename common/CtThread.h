#ifndef _CT_THREAD_H_
#define _CT_THREAD_H_

#include <Ecore.h>

#include <functional>

// Runs one piece of work on a worker thread, then its end callback on the
// main loop. Deleting the object before the work ends cancels the end
// callback (the work itself runs to its end). Main loop only.
class CtThread {
public:
	CtThread(std::function<void()> work, std::function<void()> onEnd);
	~CtThread();
	CtThread(const CtThread&) = delete;
	CtThread& operator=(const CtThread&) = delete;

	// False when the toolkit refused to start the thread.
	bool start();
	bool isRunning() const { return m_thread != nullptr; }

private:
	struct Shared;
	static void __runCb(void* data, Ecore_Thread* thread);
	static void __endCb(void* data, Ecore_Thread* thread);
	static void __cancelCb(void* data, Ecore_Thread* thread);

	Shared* m_shared;
	Ecore_Thread* m_thread = nullptr;
};

#endif
