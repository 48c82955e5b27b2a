#include "CtInputViewFieldItem.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtInputDataTypeCustomPopup.h"

#include <ui_extension.h>

#include <cstring>

namespace {

// The list settles its own focus when it realizes a row; the entry takes it after that.
const double kFocusDelay = 0.1;

} // namespace

CtInputViewFieldItem::CtInputViewFieldItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewGenlistItem(initialText), m_data(std::move(data)), m_record(record), m_addKind(addKind),
	  m_callbacks(std::move(callbacks))
{
	updateChangedState(initialText);
}

CtInputViewFieldItem::~CtInputViewFieldItem()
{
	// A custom-label popup still open would write into a dead row.
	if (auto popup = m_customPopup.lock())
		popup->destroy();
	if (m_entry)
		evas_object_event_callback_del_full(m_entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
	if (m_hoversel)
		evas_object_event_callback_del_full(m_hoversel, EVAS_CALLBACK_DEL, __hoverselDelCb, this);
}

bool CtInputViewFieldItem::isProfileSharingStorage() const
{
	const char* name = m_data ? m_data->getAddressbookName() : nullptr;
	return name && strcmp(name, translate("IDS_PB_MBODY_PROFILE_SHARING")) == 0;
}

CtInputViewTypeSelector::Choice CtInputViewFieldItem::choice(const char* textId, int value)
{
	return {translate(textId), value};
}

void CtInputViewFieldItem::addCurrentCustomChoice(std::vector<CtInputViewTypeSelector::Choice>& choices,
		unsigned int typeProperty, unsigned int labelProperty, int customType)
{
	if (m_data->getDataType(m_record, typeProperty) != customType)
		return;
	const char* label = m_data->getDataTypeCustom(m_record, labelProperty);
	if (label && *label)
		choices.push_back({label, -1});
}

Evas_Object* CtInputViewFieldItem::getContent(Evas_Object* genlist, const char* part)
{
	EntryTraits traits = getEntryTraits();
	if (strcmp(part, "elm.icon.entry") == 0)
		return __createEntry(genlist);
	if (strcmp(part, "elm.icon.1") == 0 && hasTypes())
		return __createSelector(genlist);
	if (traits.deletePart && strcmp(part, traits.deletePart) == 0) {
		if (isProfileSharingStorage())
			return nullptr;
		return ctCommonCreateDeleteImage(genlist, __deleteClickedCb, this);
	}
	return getExtraContent(genlist, part);
}

Evas_Object* CtInputViewFieldItem::__createEntry(Evas_Object* genlist)
{
	EntryTraits traits = getEntryTraits();
	Evas_Object* field = createEditField(genlist, traits.guideTextId, traits.multiline, traits.maxChars);
	WPRET_VM(!field, nullptr, "layout is NULL");
	Evas_Object* entry = uxt_edit_field_layout_get_entry(field);
	elm_entry_input_panel_layout_set(entry, traits.panelLayout);
	m_lastText = readText();
	if (!m_lastText.empty())
		setEntryText(entry, m_lastText.c_str());
	if (isProfileSharingStorage()) {
		elm_entry_editable_set(entry, EINA_FALSE);
		elm_object_disabled_set(entry, EINA_TRUE);
	}
	for (const char* signal : {"changed", "preedit,changed"})
		evas_object_smart_callback_add(entry, signal, __entryChangedCb, this);
	if (traits.passesReturnKey)
		evas_object_smart_callback_add(entry, "activated", __entryActivatedCb, this);
	evas_object_smart_callback_add(entry, "focused", __entryFocusedCb, this);
	if (traits.focusAddKind && m_addKind == traits.focusAddKind && !m_focusedOnShow) {
		// The field is shown as soon as it is made: focus it once the row is on screen.
		app_assist::WUiTimer::addTimer(kFocusDelay, [this, entry](void*) {
			__focusOnFirstShow(entry);
			return false;
		}, nullptr, entry);
	}
	if (m_entry)
		evas_object_event_callback_del_full(m_entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
	m_entry = entry;
	evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
	return field;
}

Evas_Object* CtInputViewFieldItem::__createSelector(Evas_Object* genlist)
{
	Evas_Object* layout = CtInputViewTypeSelector::create(genlist, genlist, getTypeLabel(), this,
			[this] { return getTypeChoices(); }, [this](int value) { selectType(value); });
	WPRET_VM(!layout, nullptr, "layout is NULL");
	Evas_Object* hoversel = CtInputViewTypeSelector::getHoversel(layout);
	if (isProfileSharingStorage())
		elm_object_disabled_set(hoversel, EINA_TRUE);
	if (m_hoversel)
		evas_object_event_callback_del_full(m_hoversel, EVAS_CALLBACK_DEL, __hoverselDelCb, this);
	m_hoversel = hoversel;
	evas_object_event_callback_add(hoversel, EVAS_CALLBACK_DEL, __hoverselDelCb, this);
	return layout;
}

void CtInputViewFieldItem::notifyChanged()
{
	if (m_callbacks.changed)
		m_callbacks.changed();
}

void CtInputViewFieldItem::onTextChanged(Evas_Object* entry)
{
	std::string text = getEntryUtf8(entry);
	if (text == m_lastText)
		return;
	m_lastText = text;
	writeText(text.c_str());
	updateChangedState(text.c_str());
	notifyChanged();
}

void CtInputViewFieldItem::selectType(int value)
{
	int type = mapChoiceToType(value);
	if (value < 0)
		return; // the current custom label: nothing changes
	if (type == getCustomType()) {
		__openCustomPopup();
		return;
	}
	setIsChanged(true);
	writeType(type, nullptr);
	if (m_hoversel)
		CtInputViewTypeSelector::setLabel(m_hoversel, getTypeLabel());
	if (m_entry)
		elm_object_focus_set(m_entry, EINA_TRUE);
	notifyChanged();
}

void CtInputViewFieldItem::setCustomType(const char* label)
{
	WPRET_M(!label || !*label, "label is NULL");
	setIsChanged(true);
	writeType(getCustomType(), label);
	if (m_hoversel)
		CtInputViewTypeSelector::setLabel(m_hoversel, getTypeLabel());
	notifyChanged();
}

void CtInputViewFieldItem::__openCustomPopup()
{
	app_assist::WControl* view = getAttachedView();
	WPRET_M(!view, "view is NULL");
	auto* popup = new CtInputDataTypeCustomPopup();
	popup->setResultCallback([this](const char* label) { setCustomType(label); });
	view->attachPopup(popup);
	m_customPopup = popup->getWeakPtr();
}

void CtInputViewFieldItem::deleteRow()
{
	Elm_Object_Item* item = getElmObjectItem();
	WPRET_M(!item, "item is NULL");
	updateChangedState(nullptr);
	if (m_callbacks.deleted)
		m_callbacks.deleted(item, getIsChanged(), m_record);
	elm_object_item_del(item); // deletes this row
}

void CtInputViewFieldItem::showGuideWhenEmpty(Evas_Object* entry)
{
	if (isEntryEmpty(entry))
		elm_object_signal_emit(entry, "elm,state,guide,enabled", "elm");
}

void CtInputViewFieldItem::__entryChangedCb(void* data, Evas_Object* obj, void*)
{
	static_cast<CtInputViewFieldItem*>(data)->onTextChanged(obj);
}

void CtInputViewFieldItem::__entryActivatedCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtInputViewFieldItem*>(data);
	if (self->m_callbacks.activated)
		self->m_callbacks.activated(obj, self->getElmObjectItem());
}

void CtInputViewFieldItem::__entryFocusedCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtInputViewFieldItem*>(data);
	evas_object_smart_callback_del_full(obj, "focused", __entryFocusedCb, data);
	if (self->m_callbacks.focus)
		self->m_callbacks.focus(true);
}

void CtInputViewFieldItem::__focusOnFirstShow(Evas_Object* entry)
{
	if (m_focusedOnShow)
		return;
	m_focusedOnShow = true;
	if (m_callbacks.focus)
		m_callbacks.focus(false);
	elm_object_focus_set(entry, EINA_TRUE);
}

void CtInputViewFieldItem::__entryDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtInputViewFieldItem*>(data);
	if (self->m_entry == obj)
		self->m_entry = nullptr;
}

void CtInputViewFieldItem::__hoverselDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtInputViewFieldItem*>(data);
	if (self->m_hoversel == obj)
		self->m_hoversel = nullptr;
}

void CtInputViewFieldItem::__deleteClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputViewFieldItem*>(data)->deleteRow();
}
