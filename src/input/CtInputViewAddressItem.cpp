#include "CtInputViewAddressItem.h"

#include "CtCommonRecordUtil.h"
#include "CtCommonWidgetUtil.h"

#include <csc_feature.h>
#include <ui_extension.h>

#include <cstring>

CtInputViewAddressItem::CtInputViewAddressItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewAddressItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass(csc_feature_get_bool(CSC_FEATURE_CONTACTS_ADDRESS_INPUT_STYLE_2) ? "input.3icon.2" : "input.3icon");
	return itc;
}

std::string CtInputViewAddressItem::readText()
{
	char buffer[4096] = {};
	m_data->getAddressAddress(m_record, buffer, sizeof(buffer));
	return buffer;
}

void CtInputViewAddressItem::writeText(const char* text)
{
	m_data->setAddressAddress(m_record, text);
}

std::vector<CtInputViewTypeSelector::Choice> CtInputViewAddressItem::getTypeChoices()
{
	std::vector<CtInputViewTypeSelector::Choice> choices;
	addCurrentCustomChoice(choices, _contacts_address.type, _contacts_address.label, CONTACTS_ADDRESS_TYPE_CUSTOM);
	const std::pair<const char*, int> menu[] = {{"IDS_PB_OPT_HOME_ABB2", CONTACTS_ADDRESS_TYPE_HOME}, {"IDS_PB_OPT_WORK", CONTACTS_ADDRESS_TYPE_WORK}, {"IDS_PB_OPT_OTHER", CONTACTS_ADDRESS_TYPE_OTHER}, {"IDS_PB_OPT_CUSTOM", CONTACTS_ADDRESS_TYPE_CUSTOM}};
	for (const auto& [textId, type] : menu)
		choices.push_back(choice(textId, type));
	return choices;
}

std::string CtInputViewAddressItem::getTypeLabel()
{
	const char* label = CtCommonGetAddressTypeStr(m_record, m_data->getDataType(m_record, _contacts_address.type));
	return label ? label : "";
}

int CtInputViewAddressItem::getCustomType() const
{
	return CONTACTS_ADDRESS_TYPE_CUSTOM;
}

void CtInputViewAddressItem::writeType(int type, const char* label)
{
	m_data->setAddressType(m_record, type, label);
}

Evas_Object* CtInputViewAddressItem::getExtraContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.3") != 0 || isProfileSharingStorage())
		return nullptr;
	Evas_Object* button = uxt_button_add(genlist, "btn_with_swallow");
	Evas_Object* icon = ctCommonCreateImage(button, "contacts/image_layout.edj", "contacts_btn_ic_map.png",
			"A03O004");
	elm_object_content_set(button, icon);
	evas_object_smart_callback_add(button, "clicked", __locationClickedCb, this);
	return button;
}

void CtInputViewAddressItem::__locationClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<CtInputViewAddressItem*>(data);
	if (self->m_locationCallback)
		self->m_locationCallback(self->m_record);
}
