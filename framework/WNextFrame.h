// Runs a function once, right after the canvas of an object has drawn its
// next frame. It is dropped unrun when the object is deleted or the waiter
// is destroyed first.
#pragma once

#include <Evas.h>

#include <functional>

namespace app_assist {

class WNextFrame {
public:
	WNextFrame(Evas_Object* object, std::function<void()> callback);
	~WNextFrame();
	WNextFrame(const WNextFrame&) = delete;
	WNextFrame& operator=(const WNextFrame&) = delete;

	bool isPending() const { return m_canvas != nullptr; }

private:
	static void __renderPostCb(void* data, Evas* canvas, void* eventInfo);
	static void __objectDelCb(void* data, Evas* canvas, Evas_Object* object, void* eventInfo);
	void __unregister();

	Evas_Object* m_object = nullptr;
	Evas* m_canvas = nullptr;
	std::function<void()> m_callback;
};

} // namespace app_assist
