#include "CtInputViewRelationItem.h"

#include "CtCommonRecordUtil.h"
#include "CtCommonWidgetUtil.h"

#include <ui_extension.h>

#include <cstring>

CtInputViewRelationItem::CtInputViewRelationItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewRelationItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.3icon.2");
	return itc;
}

std::string CtInputViewRelationItem::readText()
{
	const char* text = m_data->getRelationshipRelationship(m_record);
	return text ? text : "";
}

void CtInputViewRelationItem::writeText(const char* text)
{
	m_data->setRelationshipRelationship(m_record, text);
}

std::vector<CtInputViewTypeSelector::Choice> CtInputViewRelationItem::getTypeChoices()
{
	std::vector<CtInputViewTypeSelector::Choice> choices;
	addCurrentCustomChoice(choices, _contacts_relationship.type, _contacts_relationship.label, CONTACTS_RELATIONSHIP_TYPE_CUSTOM);
	const std::pair<const char*, int> menu[] = {{"IDS_PB_OPT_ASSISTANT_M_CONTACTS", 1}, {"IDS_PB_OPT_BROTHER", 2}, {"IDS_PB_OPT_CHILD", 3}, {"IDS_PB_OPT_DOMESTIC_PARTNER_ABB2", 4}, {"IDS_PB_OPT_FATHER", 5}, {"IDS_PB_OPT_FRIEND", 6}, {"IDS_PB_OPT_MANAGER", 7}, {"IDS_PB_OPT_MOTHER", 8}, {"IDS_PB_OPT_PARENT", 9}, {"IDS_PB_OPT_PARTNER", 10}, {"IDS_PB_OPT_REFERRED_BY_ABB", 11}, {"IDS_PB_OPT_RELATIVE", 12}, {"IDS_PB_OPT_SISTER", 13}, {"IDS_PB_OPT_SPOUSE", 14}, {"IDS_PB_OPT_CUSTOM", 15}};
	for (const auto& [textId, type] : menu)
		choices.push_back(choice(textId, type));
	return choices;
}

std::string CtInputViewRelationItem::getTypeLabel()
{
	const char* label = CtCommonGetRelationshipTypeStr(m_record, m_data->getDataType(m_record, _contacts_relationship.type));
	return label ? label : "";
}

int CtInputViewRelationItem::getCustomType() const
{
	return CONTACTS_RELATIONSHIP_TYPE_CUSTOM;
}

void CtInputViewRelationItem::writeType(int type, const char* label)
{
	m_data->setRelationshipType(m_record, type, label);
}

void CtInputViewRelationItem::setRelationName(const char* name)
{
	Evas_Object* entry = getEntry();
	if (entry) {
		setEntryText(entry, name ? name : "");
		return; // the entry's change event writes it
	}
	writeText(name);
	updateChangedState(name);
	notifyChanged();
}

Evas_Object* CtInputViewRelationItem::getExtraContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.3") != 0 || isProfileSharingStorage())
		return nullptr;
	Evas_Object* button = uxt_button_add(genlist, "btn_with_swallow");
	Evas_Object* icon = ctCommonCreateImage(button, "contacts/image_layout.edj", "contacts_list_ic_device.png",
			"A03O004");
	elm_object_content_set(button, icon);
	evas_object_smart_callback_add(button, "clicked", __contactSelectClickedCb, this);
	return button;
}

void CtInputViewRelationItem::__contactSelectClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<CtInputViewRelationItem*>(data);
	if (self->m_contactSelectCallback)
		self->m_contactSelectCallback(self);
}
