#ifndef _CT_INPUT_VIEW_TYPE_SELECTOR_H_
#define _CT_INPUT_VIEW_TYPE_SELECTOR_H_

#include <Elementary.h>

#include <functional>
#include <string>
#include <vector>

// The type selector of an input row: a hoversel in the layout
// "input/number/type" whose menu is filled on the first click and whose
// choice is handed to the row. Lives as long as its hoversel.
class CtInputViewTypeSelector {
public:
	struct Choice {
		std::string label; // plain text shown in the menu
		int value;
	};
	using ChoicesProvider = std::function<std::vector<Choice>()>;
	using SelectedHandler = std::function<void(int value)>;

	// The selector layout under `parent` labelled `label`, its menu hovering
	// over `hoverParent`. `rowData` is stored on the hoversel as "item_data".
	// Null (logged) when the layout cannot be made.
	static Evas_Object* create(Evas_Object* parent, Evas_Object* hoverParent, const std::string& label, void* rowData,
			ChoicesProvider choices, SelectedHandler selected);
	// The hoversel inside a selector layout (null for anything else).
	static Evas_Object* getHoversel(Evas_Object* layout);
	static void setLabel(Evas_Object* hoversel, const std::string& label);
	// Fills the menu now (the first click does it otherwise); false when it
	// was filled already.
	static bool fill(Evas_Object* hoversel);

private:
	CtInputViewTypeSelector(ChoicesProvider choices, SelectedHandler selected);

	static void __clickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __selectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __delCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	bool __fill(Evas_Object* hoversel);

	ChoicesProvider m_choices;
	SelectedHandler m_selected;
	std::vector<int> m_values;
	bool m_filled = false;
};

#endif
