#include "CtInputViewSimFieldItem.h"

#include "ContactsDebug.h"
#include "CtInputViewSimTextSize.h"

#include <notification.h>
#include <ui_extension.h>

#include <cstring>

namespace {

// Typing stops here long before any card's limit; the card's own limit is
// what refuses a text.
const int kEntryMaxChars = 1000;

// `pattern` with "%1$d" and "%2$d" (or two "%d" in order) replaced: a
// translation cannot make this read arguments that are not there.
std::string formatTwo(const char* pattern, int first, int second)
{
	std::string text = pattern ? pattern : "";
	const std::pair<const char*, int> slots[] = {{"%1$d", first}, {"%2$d", second}};
	for (const auto& [token, value] : slots) {
		size_t at = text.find(token);
		if (at != std::string::npos)
			text.replace(at, strlen(token), std::to_string(value));
	}
	for (int value : {first, second}) {
		size_t at = text.find("%d");
		if (at != std::string::npos)
			text.replace(at, 2, std::to_string(value));
	}
	return text;
}

} // namespace

CtInputViewSimFieldItem::CtInputViewSimFieldItem(std::shared_ptr<CtData> data, int fieldType,
		std::function<void()> changed, const char* initialText)
	: CtInputViewGenlistItem(initialText), m_data(std::move(data)), m_fieldType(fieldType),
	  m_acceptedText(initialText ? initialText : ""), m_changed(std::move(changed))
{
	updateChangedState(initialText);
}

CtInputViewSimFieldItem::~CtInputViewSimFieldItem()
{
	if (m_entry)
		evas_object_event_callback_del_full(m_entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
}

Elm_Genlist_Item_Class* CtInputViewSimFieldItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.sim");
	return itc;
}

int CtInputViewSimFieldItem::getMaxLength()
{
	return m_data ? m_data->getSimFieldTextMaxLen(m_fieldType) : 0;
}

int CtInputViewSimFieldItem::measure(const std::string& text)
{
	return CtInputViewSimTextSize::getUcs2CodeSize(text.c_str(), static_cast<int>(text.size()));
}

int CtInputViewSimFieldItem::limitFor(const std::string&)
{
	return getMaxLength();
}

int CtInputViewSimFieldItem::getRoomLeft()
{
	return limitFor(m_acceptedText) - measure(m_acceptedText);
}

std::string CtInputViewSimFieldItem::getCounterText()
{
	if (measure(m_acceptedText) < 0)
		return translate("IDS_MUSIC_POP_INVALID_CHARACTER");
	int left = getRoomLeft();
	if (left < 0)
		return formatTwo(translate("IDS_PB_BODY_PD_OVER_THE_LIMIT_OF_PD"), -left, getMaxLength());
	return formatTwo(translate("IDS_PB_BODY_PD_OF_PD_LEFT"), left, getMaxLength());
}

void CtInputViewSimFieldItem::updateCounter()
{
	if (Elm_Object_Item* item = getElmObjectItem())
		elm_genlist_item_fields_update(item, "elm.text.sub", ELM_GENLIST_ITEM_FIELD_TEXT);
}

std::string CtInputViewSimFieldItem::getText(Evas_Object*, const char* part)
{
	return strcmp(part, "elm.text.sub") == 0 ? getCounterText() : std::string();
}

Evas_Object* CtInputViewSimFieldItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.entry") != 0)
		return nullptr;
	Evas_Object* field = createEditField(genlist, getGuideTextId(), false, kEntryMaxChars);
	WPRET_VM(!field, nullptr, "layout is NULL");
	Evas_Object* entry = uxt_edit_field_layout_get_entry(field);
	elm_entry_input_panel_layout_set(entry, getPanelLayout());
	m_acceptedText = readText();
	if (!m_acceptedText.empty())
		setEntryText(entry, m_acceptedText.c_str());
	evas_object_smart_callback_add(entry, "changed", __entryChangedCb, this);
	if (m_entry)
		evas_object_event_callback_del_full(m_entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
	m_entry = entry;
	evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, __entryDelCb, this);
	return field;
}

void CtInputViewSimFieldItem::onTextChanged(Evas_Object* entry)
{
	std::string text = getEntryUtf8(entry);
	if (text == m_acceptedText)
		return;
	int size = measure(text);
	if (size < 0 || size > limitFor(text)) {
		rewriteEntry(entry, m_acceptedText);
		postNotice(size < 0 ? "IDS_MUSIC_POP_INVALID_CHARACTER" : "IDS_PB_POP_MAXIMUM_NUMBER_OF_CHARACTERS_REACHED");
		return;
	}
	accept(text);
	if (text.empty())
		elm_object_signal_emit(entry, "elm,state,guide,enabled", "elm");
}

void CtInputViewSimFieldItem::accept(const std::string& text)
{
	m_acceptedText = text;
	writeText(text.c_str());
	updateChangedState(text.c_str());
	updateCounter();
	if (m_changed)
		m_changed();
}

void CtInputViewSimFieldItem::rewriteEntry(Evas_Object* entry, const std::string& text, int cursor)
{
	m_rewriting = true;
	setEntryText(entry, text.c_str());
	if (cursor >= 0)
		elm_entry_cursor_pos_set(entry, cursor);
	m_rewriting = false;
}

void CtInputViewSimFieldItem::postNotice(const char* textId)
{
	int err = notification_status_message_post(translate(textId));
	if (err != NOTIFICATION_ERROR_NONE)
		WFAILED("notification_status_message_post", err);
}

void CtInputViewSimFieldItem::__entryChangedCb(void* data, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtInputViewSimFieldItem*>(data);
	if (!self->m_rewriting)
		self->onTextChanged(obj);
}

void CtInputViewSimFieldItem::__entryDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* self = static_cast<CtInputViewSimFieldItem*>(data);
	if (self->m_entry == obj)
		self->m_entry = nullptr;
}
