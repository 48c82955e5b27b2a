#include "StandInView.h"

#include "ContactsDebug.h"

#include <cstdlib>

namespace ct::demo {

namespace {

constexpr int kPadding = 12;

std::string captionMarkup(const std::string& caption)
{
	char* escaped = elm_entry_utf8_to_markup(caption.c_str());
	std::string markup = std::string("<font_size=15><color=#4B5563>") + (escaped ? escaped : "") + "</color></font_size>";
	free(escaped);
	return markup;
}

Evas_Object* addPadded(Evas_Object* box, Evas_Object* content)
{
	Evas_Object* frame = elm_box_add(box);
	elm_box_padding_set(frame, 0, 0);
	evas_object_size_hint_weight_set(frame, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(frame, EVAS_HINT_FILL, 0.0);
	evas_object_size_hint_padding_set(content, kPadding, kPadding, kPadding / 2, kPadding / 2);
	elm_box_pack_end(frame, content);
	evas_object_show(frame);
	elm_box_pack_end(box, frame);
	return frame;
}

} // namespace

StandInView::StandInView(app_control_h request, ct::appcontrol::Reply reply, const char* title, std::string caption)
	: m_reply(std::move(reply))
	, m_caption(std::move(caption))
{
	setTitle(title);
	if (request) {
		int err = app_control_clone(&m_request, request);
		if (err != APP_CONTROL_ERROR_NONE)
			WFAILED("app_control_clone", err);
	}
}

StandInView::~StandInView()
{
	__cancel();
	if (m_request)
		app_control_destroy(m_request);
}

Evas_Object* StandInView::onCreate(Evas_Object* parent, void*)
{
	m_box = elm_box_add(parent);
	evas_object_size_hint_weight_set(m_box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_box, EVAS_HINT_FILL, EVAS_HINT_FILL);

	m_captionLabel = elm_label_add(m_box);
	elm_label_line_wrap_set(m_captionLabel, ELM_WRAP_WORD);
	evas_object_size_hint_weight_set(m_captionLabel, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(m_captionLabel, EVAS_HINT_FILL, 0.0);
	elm_object_text_set(m_captionLabel, captionMarkup(m_caption).c_str());
	evas_object_show(m_captionLabel);
	addPadded(m_box, m_captionLabel);

	m_buttonRow = elm_box_add(m_box);
	elm_box_horizontal_set(m_buttonRow, EINA_TRUE);
	elm_box_homogeneous_set(m_buttonRow, EINA_TRUE);
	elm_box_padding_set(m_buttonRow, kPadding, 0);
	evas_object_size_hint_weight_set(m_buttonRow, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(m_buttonRow, EVAS_HINT_FILL, 1.0);
	evas_object_show(m_buttonRow);

	if (Evas_Object* content = createContent(m_box)) {
		evas_object_show(content);
		elm_box_pack_end(m_box, content);
	}
	addPadded(m_box, m_buttonRow);
	return m_box;
}

void StandInView::onPushed(Elm_Object_Item* naviItem)
{
	elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
}

void StandInView::onDestroy()
{
	__cancel();
	m_box = m_captionLabel = m_buttonRow = m_list = nullptr;
	m_buttons.clear();
}

std::string StandInView::getExtra(const char* key) const
{
	char* value = nullptr;
	if (!m_request || app_control_get_extra_data(m_request, key, &value) != APP_CONTROL_ERROR_NONE || !value)
		return "";
	std::string out = value;
	free(value);
	return out;
}

std::string StandInView::getUri() const
{
	char* uri = nullptr;
	if (!m_request || app_control_get_uri(m_request, &uri) != APP_CONTROL_ERROR_NONE || !uri)
		return "";
	std::string out = uri;
	free(uri);
	return out;
}

bool StandInView::isReplyRequested() const
{
	bool requested = false;
	return m_request && app_control_is_reply_requested(m_request, &requested) == APP_CONTROL_ERROR_NONE && requested;
}

void StandInView::answer(app_control_h answer)
{
	if (m_answered)
		return;
	m_answered = true;
	if (m_reply.isPending()) {
		int err = m_reply(answer, APP_CONTROL_RESULT_SUCCEEDED);
		if (err != APP_CONTROL_ERROR_NONE)
			WFAILED("app_control_reply_to_launch_request", err);
	}
	popOut();
}

void StandInView::answerText(const char* key, const std::string& value)
{
	app_control_h reply = nullptr;
	if (app_control_create(&reply) != APP_CONTROL_ERROR_NONE)
		return;
	app_control_add_extra_data(reply, key, value.c_str());
	answer(reply);
	app_control_destroy(reply);
}

void StandInView::answerSelected(const std::string& path)
{
	app_control_h reply = nullptr;
	if (app_control_create(&reply) != APP_CONTROL_ERROR_NONE)
		return;
	const char* paths[] = {path.c_str()};
	app_control_add_extra_data_array(reply, APP_CONTROL_DATA_SELECTED, paths, 1);
	answer(reply);
	app_control_destroy(reply);
}

Evas_Object* StandInView::addButton(const char* label, Evas_Smart_Cb onClick, bool main)
{
	WPRET_VM(!m_buttonRow, nullptr, "%s: buttons are added while the content is made", label);
	Evas_Object* button = elm_button_add(m_buttonRow);
	elm_object_style_set(button, main ? "bottom" : "popup");
	elm_object_text_set(button, label);
	evas_object_size_hint_weight_set(button, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(button, EVAS_HINT_FILL, 0.5);
	evas_object_size_hint_min_set(button, 0, 48);
	evas_object_smart_callback_add(button, "clicked", onClick, this);
	evas_object_show(button);
	elm_box_pack_end(m_buttonRow, button);
	m_buttons.push_back(button);
	return button;
}

Evas_Object* StandInView::createEntry(Evas_Object* parent, bool editable)
{
	Evas_Object* entry = elm_entry_add(parent);
	elm_entry_editable_set(entry, editable ? EINA_TRUE : EINA_FALSE);
	elm_entry_scrollable_set(entry, EINA_TRUE);
	elm_entry_line_wrap_set(entry, ELM_WRAP_MIXED);
	elm_entry_text_style_user_push(entry, "DEFAULT='font_size=15 color=#1F2328'");
	evas_object_size_hint_weight_set(entry, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(entry, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_size_hint_padding_set(entry, kPadding, kPadding, 0, 0);
	return entry;
}

Evas_Object* StandInView::createList(Evas_Object* parent)
{
	m_list = elm_genlist_add(parent);
	elm_genlist_mode_set(m_list, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(m_list, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_list, EVAS_HINT_FILL, EVAS_HINT_FILL);
	return m_list;
}

StandInListItem* StandInView::appendRow(StandInListItem* row)
{
	row->attachToView(this);
	row->setElmObjectItem(elm_genlist_item_append(m_list, row->getItemClass(), row, nullptr, ELM_GENLIST_ITEM_NONE,
			row->getSelectCb(), row));
	return row;
}

void StandInView::setCaption(const std::string& caption)
{
	m_caption = caption;
	if (m_captionLabel)
		elm_object_text_set(m_captionLabel, captionMarkup(m_caption).c_str());
}

void StandInView::__cancel()
{
	if (m_answered)
		return;
	m_answered = true;
	if (m_reply.isPending())
		m_reply(nullptr, APP_CONTROL_RESULT_CANCELED);
}

} // namespace ct::demo
