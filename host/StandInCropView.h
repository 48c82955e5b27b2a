// The image viewer's caller-id crop ("View Mode" "SETAS"): shows the picture
// of "Path"; "Set" writes its centred square, at the side length of
// "Resolution" ("480x480"), into a new file of the output folder and replies that path in
// APP_CONTROL_DATA_SELECTED (a one-element array). Without a readable
// picture only Cancel is offered.
#pragma once

#include "StandInView.h"

namespace ct::demo {

class StandInCropView : public StandInView {
public:
	StandInCropView(app_control_h request, ct::appcontrol::Reply reply, std::string outputFolder);

	const char* getClassName() override { return "StandInCropView"; }
	// Where "Set" writes the crop: a file not there yet ("" without a picture).
	std::string getCropPath() const;

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	int __side() const;
	static void __setClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::string m_outputFolder;
	std::string m_source;
};

} // namespace ct::demo
