#include "CtPrimaryInputViewNameItem.h"

#include "ContactsDebug.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewCallerIdPicture.h"

#include <ui_extension.h>

#include <cstring>

CtPrimaryInputViewNameItem::CtPrimaryInputViewNameItem(std::shared_ptr<CtData> data, Callbacks callbacks,
		int launchType)
	: m_data(std::move(data)), m_callbacks(std::move(callbacks)), m_launchType(launchType),
	  m_initialName(m_data->getFullName())
{
}

CtPrimaryInputViewNameItem::~CtPrimaryInputViewNameItem()
{
	if (m_entry)
		evas_object_event_callback_del_full(m_entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
}

Elm_Genlist_Item_Class* CtPrimaryInputViewNameItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("baseinfo.image.contract");
	return itc;
}

bool CtPrimaryInputViewNameItem::getIsChanged()
{
	return __compareWithOldVal(m_data->getFullName());
}

bool CtPrimaryInputViewNameItem::getIsEmpty()
{
	return m_data->getFullName().empty();
}

Evas_Object* CtPrimaryInputViewNameItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon") == 0) {
		bool touchable = m_launchType != CtInputViewBasicInfoItem::kCallerIdLaunchType;
		return CtInputViewCallerIdPicture::create(genlist, m_data->getImagePath(), touchable, __pictureClickedCb, this);
	}
	if (strcmp(part, "elm.icon.1") != 0)
		return nullptr;
	using Row = CtInputViewBasicInfoItem;
	Evas_Object* field = createEditField(genlist, Row::getGuideTextId(Row::NAME), false, Row::getMaxChars(Row::NAME));
	WPRET_VM(!field, nullptr, "layout is NULL");
	Evas_Object* entry = uxt_edit_field_layout_get_entry(field);
	elm_entry_input_panel_imdata_set(entry, "type=name&action=disable_emoticons",
			strlen("type=name&action=disable_emoticons"));
	std::string name = m_data->getFullName();
	if (!name.empty())
		setEntryText(entry, name.c_str());
	for (const char* signal : {"changed", "preedit,changed"})
		evas_object_smart_callback_add(entry, signal, __nameChangedCb, this);
	evas_object_smart_callback_add(entry, "activated", __activatedCb, this);
	if (m_entry)
		evas_object_event_callback_del_full(m_entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
	m_entry = entry;
	evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
	return field;
}

void CtPrimaryInputViewNameItem::__nameChangedCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtPrimaryInputViewNameItem*>(data);
	std::string text = getEntryUtf8(obj);
	if (text == self->m_data->getFullName())
		return;
	self->m_data->setFullName(text.c_str());
	self->updateChangedState(text.c_str());
	if (self->m_callbacks.changed)
		self->m_callbacks.changed();
	if (self->m_callbacks.nameChanged)
		self->m_callbacks.nameChanged(obj);
}

void CtPrimaryInputViewNameItem::__activatedCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtPrimaryInputViewNameItem*>(data);
	if (self->m_callbacks.activated)
		self->m_callbacks.activated(obj, self->getElmObjectItem());
}

void CtPrimaryInputViewNameItem::__entryDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtPrimaryInputViewNameItem*>(data);
	if (self->m_entry == obj)
		self->m_entry = nullptr;
}

void CtPrimaryInputViewNameItem::__pictureClickedCb(void* data, Evas_Object* obj, const char*, const char*)
{
	auto* self = static_cast<CtPrimaryInputViewNameItem*>(data);
	elm_object_signal_emit(obj, "play,sound", "");
	if (self->m_callbacks.pictureClicked)
		self->m_callbacks.pictureClicked();
}
