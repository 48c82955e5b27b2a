// The group picker (CONTACTS_LIST_APP_ID, "type" 36): every group of the
// store with a check, those of "selected_group_id_list" (Base64 of 32-bit
// ids in the device's byte order) checked at first. "Done" replies
// "group_id_list" in the same form, or a reply without it when no group is
// checked.
#pragma once

#include "StandInView.h"

#include <vector>

namespace ct::demo {

class StandInGroupPickerView : public StandInView {
public:
	StandInGroupPickerView(app_control_h request, ct::appcontrol::Reply reply);

	const char* getClassName() override { return "StandInGroupPickerView"; }

	// Base64 of `ids` as consecutive 32-bit integers, and back; a text that
	// is not such a list decodes to no ids.
	static std::string encodeIds(const std::vector<int>& ids);
	static std::vector<int> decodeIds(const std::string& base64);

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	static void __doneClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::vector<StandInListItem*> m_rows;
};

} // namespace ct::demo
