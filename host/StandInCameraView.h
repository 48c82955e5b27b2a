// The camera: a viewfinder showing one of the demo pictures; the shutter
// "takes" it and replies its path in APP_CONTROL_DATA_SELECTED (a
// one-element array); "Turn" shows the next picture.
#pragma once

#include "StandInView.h"

#include <vector>

namespace ct::demo {

class StandInCameraView : public StandInView {
public:
	StandInCameraView(app_control_h request, ct::appcontrol::Reply reply, std::string folder);

	const char* getClassName() override { return "StandInCameraView"; }
	// The picture the shutter would take now ("" when the folder has none).
	std::string getFramedPicture() const;

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	void __showFrame();
	static void __shutterClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __turnClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::vector<std::string> m_pictures;
	size_t m_frame = 0;
	Evas_Object* m_viewfinder = nullptr;
};

} // namespace ct::demo
