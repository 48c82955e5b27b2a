// The gallery: the pictures of one folder; tapping one replies its path in
// APP_CONTROL_DATA_SELECTED (a one-element array).
#pragma once

#include "StandInView.h"

namespace ct::demo {

class StandInGalleryView : public StandInView {
public:
	StandInGalleryView(app_control_h request, ct::appcontrol::Reply reply, std::string folder);

	const char* getClassName() override { return "StandInGalleryView"; }

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	static void __cancelClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::string m_folder;
};

} // namespace ct::demo
