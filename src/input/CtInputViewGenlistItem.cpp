#include "CtInputViewGenlistItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonTextUtil.h"

#include <efl_assist.h>
#include <notification.h>
#include <ui_extension.h>

#include <cstdlib>
#include <cstring>

namespace {

const double kLimitNoticeSeconds = 3.5;
const char* const kLimitKey = "ct_limit_size";
const char* const kBackHookKey = "ea_entry";

void freeLimitCb(void* data, Evas*, Evas_Object*, void*)
{
	delete static_cast<Elm_Entry_Filter_Limit_Size*>(data);
}

Elm_Entry_Filter_Limit_Size* limitOf(Evas_Object* entry)
{
	return static_cast<Elm_Entry_Filter_Limit_Size*>(evas_object_data_get(entry, kLimitKey));
}

// The toolkit's size filter trims an over-long insert one character at a
// time (seconds for a pasted 100 KB); cut it to the limit first, on a whole
// character, so that filter only fine-tunes.
void capInsertCb(void* data, Evas_Object* entry, char** text)
{
	auto* limit = static_cast<Elm_Entry_Filter_Limit_Size*>(data);
	if (!text || !*text || limit->max_char_count <= 0 || strlen(*text) <= static_cast<size_t>(limit->max_char_count))
		return;
	char* plain = elm_entry_markup_to_utf8(*text);
	if (!plain)
		return;
	size_t pos = 0;
	for (int chars = 0; plain[pos] && chars < limit->max_char_count; ++chars)
		pos += ctCommonCheckUtf8(plain[pos]);
	if (plain[pos]) {
		plain[pos] = '\0';
		char* markup = elm_entry_utf8_to_markup(plain);
		free(*text);
		*text = markup;
		evas_object_smart_callback_call(entry, "maxlength,reached", nullptr);
	}
	free(plain);
}

} // namespace

CtInputViewGenlistItem::CtInputViewGenlistItem(const char* initialText)
	: m_hasInitialText(initialText != nullptr), m_initialText(initialText ? initialText : "")
{
}

CtInputViewGenlistItem::~CtInputViewGenlistItem()
{
	app_assist::WUiTimer::destroy(m_notificationTimer);
}

const char* CtInputViewGenlistItem::translate(const char* textId)
{
	return ContactsCommon::translate(textId);
}

bool CtInputViewGenlistItem::isEntryEmpty(Evas_Object* entry)
{
	const char* markup = entry ? elm_entry_entry_get(entry) : nullptr;
	return !markup || !*markup;
}

std::string CtInputViewGenlistItem::getEntryUtf8(Evas_Object* entry)
{
	if (!entry)
		return std::string();
	char* text = ctCommonMarkupToUtf8(elm_entry_entry_get(entry));
	std::string out(text ? text : "");
	free(text);
	return out;
}

Evas_Object* CtInputViewGenlistItem::createEditField(Evas_Object* parent, const char* guideTextId, bool multiline,
		int maxChars)
{
	Evas_Object* layout = uxt_edit_field_layout_add(parent,
			multiline ? UXT_EDIT_FIELD_LAYOUT_STYLE_MULTILINE : UXT_EDIT_FIELD_LAYOUT_STYLE_SINGLELINE);
	WPRET_VM(!layout, nullptr, "layout is NULL");
	Evas_Object* entry = uxt_edit_field_layout_get_entry(layout);
	elm_entry_input_panel_imdata_set(entry, "action=disable_emoticons", strlen("action=disable_emoticons"));
	evas_object_smart_callback_add(entry, "selection,start", __selectionStartCb, this);
	evas_object_smart_callback_add(entry, "selection,cleared", __selectionClearedCb, this);
	if (guideTextId)
		elm_object_domain_translatable_part_text_set(entry, "elm.guide", "contacts", guideTextId);
	if (multiline)
		uxt_edit_field_layout_set_clear_button_enabled(layout, EINA_FALSE);
	else
		elm_entry_input_panel_return_key_type_set(entry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_NEXT);

	addLengthLimit(entry, maxChars);

	elm_entry_cnp_mode_set(entry, ELM_CNP_MODE_PLAINTEXT);
	elm_entry_input_panel_layout_set(entry, ELM_INPUT_PANEL_LAYOUT_NORMAL);
	evas_object_smart_callback_add(entry, "maxlength,reached", __editfieldTextMaxReachedCb, this);
	elm_entry_autocapital_type_set(entry, ELM_AUTOCAPITAL_TYPE_WORD);
	return layout;
}

void CtInputViewGenlistItem::addLengthLimit(Evas_Object* entry, int maxChars)
{
	WPRET_M(!entry || limitOf(entry), "entry is NULL or limited already");
	auto* limit = new Elm_Entry_Filter_Limit_Size{maxChars, 0};
	evas_object_data_set(entry, kLimitKey, limit);
	evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, freeLimitCb, limit);
	elm_entry_markup_filter_append(entry, capInsertCb, limit);
	elm_entry_markup_filter_append(entry, elm_entry_filter_limit_size, limit);
}

void CtInputViewGenlistItem::setEntryText(Evas_Object* entry, const char* text)
{
	WPRET_M(!entry, "entry is NULL");
	WPRET_M(!text, "text is NULL");
	std::string markup = ctCommonUtf8ToMarkup(text);
	// The limit is for typing: a stored text must not be cut (and then saved cut).
	Elm_Entry_Filter_Limit_Size* limit = limitOf(entry);
	if (limit) {
		elm_entry_markup_filter_remove(entry, capInsertCb, limit);
		elm_entry_markup_filter_remove(entry, elm_entry_filter_limit_size, limit);
	}
	elm_entry_entry_set(entry, "");
	elm_entry_entry_insert(entry, markup.c_str());
	if (limit) {
		elm_entry_markup_filter_append(entry, capInsertCb, limit);
		elm_entry_markup_filter_append(entry, elm_entry_filter_limit_size, limit);
	}
}

void CtInputViewGenlistItem::updateChangedState(const char* text)
{
	bool empty = !text || !*text;
	m_isEmpty = empty;
	if (empty)
		m_isChanged = m_hasInitialText && !m_initialText.empty();
	else
		m_isChanged = !m_hasInitialText || m_initialText != text;
}

Elm_Genlist_Item_Class* CtInputViewGenlistItem::createItemClass(const char* style)
{
	Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
	itc->item_style = style;
	itc->func.text_get = __textGetCb;
	itc->func.content_get = __contentGetCb;
	itc->func.del = deleteRowCb;
	return itc;
}

std::string CtInputViewGenlistItem::getText(Evas_Object*, const char*)
{
	return std::string();
}

Evas_Object* CtInputViewGenlistItem::getContent(Evas_Object*, const char*)
{
	return nullptr;
}

char* CtInputViewGenlistItem::__textGetCb(void* data, Evas_Object* obj, const char* part)
{
	auto* row = static_cast<CtInputViewGenlistItem*>(data);
	std::string text = row->getText(obj, part);
	return text.empty() ? nullptr : strdup(text.c_str());
}

Evas_Object* CtInputViewGenlistItem::__contentGetCb(void* data, Evas_Object* obj, const char* part)
{
	return static_cast<CtInputViewGenlistItem*>(data)->getContent(obj, part);
}

void CtInputViewGenlistItem::__editfieldTextMaxReachedCb(void* data, Evas_Object* obj, void*)
{
	auto* row = static_cast<CtInputViewGenlistItem*>(data);
	if (app_assist::WUiTimer::isAlive(row->m_notificationTimer))
		return;
	int err = notification_status_message_post(translate("IDS_PB_POP_MAXIMUM_NUMBER_OF_CHARACTERS_REACHED"));
	if (err != NOTIFICATION_ERROR_NONE)
		WFAILED("notification_status_message_post", err);
	Elm_Object_Item* item = row->getElmObjectItem();
	Evas_Object* owner = item ? elm_object_item_widget_get(item) : obj;
	row->m_notificationTimer = app_assist::WUiTimer::addTimer(kLimitNoticeSeconds,
			[](void*) { return false; }, nullptr, owner);
}

void CtInputViewGenlistItem::__selectionStartCb(void*, Evas_Object* obj, void*)
{
	if (evas_object_data_get(obj, kBackHookKey))
		return;
	ea_object_event_callback_add(obj, EA_CALLBACK_BACK, __backKeyCb, nullptr);
	evas_object_data_set(obj, kBackHookKey, obj);
}

void CtInputViewGenlistItem::__selectionClearedCb(void*, Evas_Object* obj, void*)
{
	if (!evas_object_data_del(obj, kBackHookKey))
		return;
	ea_object_event_callback_del(obj, EA_CALLBACK_BACK, __backKeyCb);
}

void CtInputViewGenlistItem::__backKeyCb(void*, Evas_Object* obj, void*)
{
	// While text is selected, back first clears the selection.
	elm_entry_select_none(obj);
	__selectionClearedCb(nullptr, obj, nullptr);
}
