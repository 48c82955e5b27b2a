// The image editor's preset styles: one of the demo pictures under a choice
// of tints; "Done" writes the tinted copy into the output folder and replies
// its path in "path". "Picture" moves to the next picture.
#pragma once

#include "StandInView.h"

#include <vector>

namespace ct::demo {

class StandInPresetEditorView : public StandInView {
public:
	StandInPresetEditorView(app_control_h request, ct::appcontrol::Reply reply, std::string pictureFolder,
			std::string outputFolder);

	const char* getClassName() override { return "StandInPresetEditorView"; }
	// Where the tinted copy of the current picture and style is written.
	std::string getStyledPath() const;

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	void __chooseStyle(size_t style);
	void __showPreview();
	static void __doneClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __pictureClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::vector<std::string> m_pictures;
	std::string m_outputFolder;
	size_t m_picture = 0;
	size_t m_style = 0;
	Evas_Object* m_preview = nullptr;
	std::vector<StandInListItem*> m_styleRows;
};

} // namespace ct::demo
