#include "CtInputViewTypeSelector.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"

namespace {

const char* const kSelectorKey = "ct_type_selector";

} // namespace

CtInputViewTypeSelector::CtInputViewTypeSelector(ChoicesProvider choices, SelectedHandler selected)
	: m_choices(std::move(choices)), m_selected(std::move(selected))
{
}

Evas_Object* CtInputViewTypeSelector::create(Evas_Object* parent, Evas_Object* hoverParent, const std::string& label,
		void* rowData, ChoicesProvider choices, SelectedHandler selected)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "input/number/type");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	Evas_Object* hoversel = elm_hoversel_add(layout);
	elm_hoversel_hover_parent_set(hoversel, hoverParent);
	elm_hoversel_horizontal_set(hoversel, EINA_FALSE);
	elm_hoversel_auto_update_set(hoversel, EINA_FALSE);
	elm_object_text_set(hoversel, label.c_str());
	evas_object_data_set(hoversel, "item_data", rowData);
	auto* self = new CtInputViewTypeSelector(std::move(choices), std::move(selected));
	evas_object_data_set(hoversel, kSelectorKey, self);
	evas_object_event_callback_add(hoversel, EVAS_CALLBACK_DEL, __delCb, self);
	evas_object_smart_callback_add(hoversel, "clicked", __clickedCb, self);
	evas_object_smart_callback_add(hoversel, "selected", __selectedCb, self);
	elm_object_part_content_set(layout, "elm.swallow.content", hoversel);
	evas_object_show(hoversel);
	return layout;
}

Evas_Object* CtInputViewTypeSelector::getHoversel(Evas_Object* layout)
{
	return layout ? elm_object_part_content_get(layout, "elm.swallow.content") : nullptr;
}

void CtInputViewTypeSelector::setLabel(Evas_Object* hoversel, const std::string& label)
{
	WPRET_M(!hoversel, "hoversel is NULL");
	elm_object_text_set(hoversel, label.c_str());
}

bool CtInputViewTypeSelector::fill(Evas_Object* hoversel)
{
	auto* self = hoversel ? static_cast<CtInputViewTypeSelector*>(evas_object_data_get(hoversel, kSelectorKey)) : nullptr;
	WPRET_VM(!self, false, "not a type selector");
	return self->__fill(hoversel);
}

bool CtInputViewTypeSelector::__fill(Evas_Object* hoversel)
{
	if (m_filled) {
		WDEBUG("item already added");
		return false;
	}
	m_filled = true;
	for (const Choice& choice : m_choices()) {
		elm_hoversel_item_add(hoversel, choice.label.c_str(), nullptr, ELM_ICON_NONE, nullptr, nullptr);
		m_values.push_back(choice.value);
	}
	return true;
}

void CtInputViewTypeSelector::__clickedCb(void* data, Evas_Object* obj, void*)
{
	static_cast<CtInputViewTypeSelector*>(data)->__fill(obj);
}

void CtInputViewTypeSelector::__selectedCb(void* data, Evas_Object* obj, void* eventInfo)
{
	auto* self = static_cast<CtInputViewTypeSelector*>(data);
	int index = 0;
	const Eina_List* node;
	void* item;
	EINA_LIST_FOREACH(elm_hoversel_items_get(obj), node, item) {
		if (item == eventInfo)
			break;
		++index;
	}
	WPRET_M(index >= static_cast<int>(self->m_values.size()), "item is NULL");
	if (self->m_selected)
		self->m_selected(self->m_values[index]);
}

void CtInputViewTypeSelector::__delCb(void* data, Evas*, Evas_Object*, void*)
{
	delete static_cast<CtInputViewTypeSelector*>(data);
}
