// The share target: shows what it received, a person as a vCard
// (APP_CONTROL_OPERATION_SHARE with APP_CONTROL_DATA_ID = the person id and
// APP_CONTROL_DATA_TYPE = "person") or a text (APP_CONTROL_OPERATION_SHARE_TEXT
// with APP_CONTROL_DATA_TEXT); "Save" writes the vCard into the save folder
// ("contact-<person id>.vcf") and says where.
#pragma once

#include "StandInView.h"

namespace ct::demo {

class StandInShareView : public StandInView {
public:
	StandInShareView(app_control_h request, ct::appcontrol::Reply reply, std::string saveFolder);

	const char* getClassName() override { return "StandInShareView"; }
	// What was received (the vCard or the text; "" when nothing).
	const std::string& getShared() const { return m_shared; }
	// Where "Save" writes the vCard ("" for a text).
	std::string getSavePath() const;

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	void __readShared();
	static void __saveClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __closeClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::string m_saveFolder;
	std::string m_shared;
	int m_personId = 0;
	bool m_isVcard = false;
};

} // namespace ct::demo
