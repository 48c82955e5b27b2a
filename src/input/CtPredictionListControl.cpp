#include "CtPredictionListControl.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonTextUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtPredictionListModel.h"
#include "CtThemeMgr.h"
#include "WGenlistItem.h"
#include "efl_extension.h"

#include <contacts.h>

#include <cstring>

namespace {

const char* const kEdjFile = "contacts/contacts.edj";
const char* const kLayoutGroup = "layout/prediction_list";
const char* const kHighlightColor = "T1067";
const int kRowsSized = 3;
const int kOneLineHeight = 96;
const int kTwoLineHeight = 144;
const int kBorderHeight = 4;
const int kSideMargin = 32;
// The sizes above are units of the 720-wide design grid; the theme draws the
// prediction rows (48 and 72 pixels) at half of them on this 360-wide screen.
const double kPixelsPerUnit = 0.5;

bool isBlank(char c)
{
	return c == ' ' || c == '\t' || c == '\n';
}

// Byte offset and length of the first match of `search` that starts `name`
// or follows a blank; false when none does.
bool findWordStartMatch(const char* name, const char* search, int* offset, int* length)
{
	for (const char* p = name; *p; ++p) {
		if (p != name && !isBlank(p[-1]))
			continue;
		int len = 0;
		if (contacts_utils_strstr(p, search, &len) == 0 && len > 0) {
			*offset = static_cast<int>(p - name);
			*length = len;
			return true;
		}
	}
	return false;
}

std::string colorTag()
{
	int r = 0, g = 0, b = 0, a = 255;
	ctCommonGetThemeColor(kHighlightColor, &r, &g, &b, &a);
	char tag[32];
	snprintf(tag, sizeof(tag), "<color=#%02x%02x%02x%02x>", r & 0xff, g & 0xff, b & 0xff, a & 0xff);
	return tag;
}

} // namespace

// One existing contact: its name, and its default number on a second line.
class __PredictionListItem : public app_assist::WGenlistItem {
public:
	__PredictionListItem(CtPredictionListControl* control, const CtPredictionListModel::Prediction& prediction)
		: m_control(control), m_prediction(prediction)
	{
	}

	Elm_Genlist_Item_Class* getItemClassNew() override
	{
		Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
		WPRET_VM(!itc, nullptr, "elm_genlist_item_class_new() is fail");
		itc->item_style = m_prediction.number.empty() ? "prediction.1line" : "prediction.2line.top";
		itc->func.text_get = __textGetCb;
		return itc;
	}

	void onSelect(Elm_Object_Item* item) override
	{
		elm_genlist_item_selected_set(item, EINA_FALSE);
		m_control->__onRowSelected(m_prediction.contactId);
	}

private:
	std::string __getText(const char* part) const
	{
		if (!strcmp(part, "elm.text.main.left") || !strcmp(part, "elm.text.main.left.top")) {
			if (m_prediction.name.empty())
				return ContactsCommon::translate("IDS_LOGS_MBODY_UNKNOWN");
			return CtPredictionListControl::getSearchHighlightName(m_prediction.name.c_str(),
				m_control->m_model->getSearchName());
		}
		if (!strcmp(part, "elm.text.sub.left.bottom"))
			return ctCommonUtf8ToMarkup(m_prediction.number.c_str());
		return std::string();
	}

	static char* __textGetCb(void* data, Evas_Object*, const char* part)
	{
		std::string text = static_cast<__PredictionListItem*>(data)->__getText(part);
		return text.empty() ? nullptr : strdup(text.c_str());
	}

	CtPredictionListControl* m_control;
	CtPredictionListModel::Prediction m_prediction;
};

CtPredictionListControl::CtPredictionListControl(std::shared_ptr<CtPredictionListModel> model,
	Evas_Object* nameEntry, Elm_Object_Item* basicInfoRow, SelectedCallback onSelected)
	: m_model(std::move(model)), m_nameEntry(nameEntry), m_basicInfoRow(basicInfoRow),
	  m_onSelected(std::move(onSelected))
{
	if (m_nameEntry)
		evas_object_event_callback_add(m_nameEntry, EVAS_CALLBACK_DEL, __nameEntryDelCb, this);
}

CtPredictionListControl::~CtPredictionListControl()
{
	if (m_nameEntry)
		evas_object_event_callback_del_full(m_nameEntry, EVAS_CALLBACK_DEL, __nameEntryDelCb, this);
}

const char* CtPredictionListControl::getClassName()
{
	return "CtPredictionListControl";
}

Evas_Object* CtPredictionListControl::onCreate(Evas_Object* parent, void*)
{
	WPRET_VM(!parent, nullptr, "Invalid parameter: parent is NULL!");
	WPRET_VM(!m_model, nullptr, "Invalid param : model");
	std::string edj;
	if (ContactsCommon::getAppEdjePath(kEdjFile, edj, true))
		CtThemeMgr::getInstance()->addExtensionTheme(edj.c_str());
	Evas_Object* layout = ctCommonCreateLayout(parent, kEdjFile, kLayoutGroup);
	WPRET_VM(!layout, nullptr, "layout not made");
	CtThemeMgr::getInstance()->setObjectTheme(layout);

	Evas_Object* box = elm_box_add(layout);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_object_part_content_set(layout, "elm.swallow.content", box);

	m_genlist = elm_genlist_add(box);
	elm_genlist_homogeneous_set(m_genlist, EINA_TRUE);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	elm_object_focus_allow_set(m_genlist, EINA_FALSE);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_smart_callback_add(m_genlist, "realized", __realizedCb, this);
	elm_box_pack_end(box, m_genlist);
	evas_object_show(m_genlist);
	evas_object_show(box);

	eext_object_event_callback_add(layout, EEXT_CALLBACK_BACK, __backCb, this);
	__appendItems();
	evas_object_show(layout);
	return layout;
}

void CtPredictionListControl::onDestroy()
{
	if (getEvasObj())
		eext_object_event_callback_del(getEvasObj(), EEXT_CALLBACK_BACK, __backCb);
	m_genlist = nullptr;
}

void CtPredictionListControl::updatePredictionList(const std::string& searchName)
{
	WPRET_M(!m_model, "Invalid param : model");
	if (searchName == m_model->getSearchName())
		return;
	m_model->reload(searchName);
	if (m_model->getCount() == 0)
		return;
	__appendItems();
	resize();
}

bool CtPredictionListControl::hasPredictions() const
{
	return m_model && m_model->getCount() > 0;
}

int CtPredictionListControl::getUnscaledHeight() const
{
	return kOneLineHeight * m_oneLineCount + kTwoLineHeight * m_twoLineCount + kBorderHeight;
}

void CtPredictionListControl::resize()
{
	Evas_Object* field = __getFocusedEditfield();
	WPRET_M(!field || !getEvasObj(), "no name field to place the list under");
	int x = 0, y = 0, w = 0, h = 0;
	evas_object_geometry_get(field, &x, &y, &w, &h);
	double scale = ctCommonGetScale() * kPixelsPerUnit;
	int margin = static_cast<int>(kSideMargin * scale);
	int height = static_cast<int>((kOneLineHeight * m_oneLineCount + kTwoLineHeight * m_twoLineCount) * scale)
		+ static_cast<int>(kBorderHeight * scale);
	evas_object_resize(getEvasObj(), w - 2 * margin, height);
	evas_object_move(getEvasObj(), x + margin, y + h);
	evas_object_raise(getEvasObj());
}

std::string CtPredictionListControl::getSearchHighlightName(const char* name, const std::string& search)
{
	WPRET_VM(!name, std::string(), "src string is null.");
	int offset = 0, length = 0;
	if (search.empty() || !ctCommonCheckHighlightSupported()
		|| !findWordStartMatch(name, search.c_str(), &offset, &length))
		return ctCommonUtf8ToMarkup(name);
	std::string text(name);
	return ctCommonUtf8ToMarkup(text.substr(0, offset).c_str()) + colorTag()
		+ ctCommonUtf8ToMarkup(text.substr(offset, length).c_str()) + "</color>"
		+ ctCommonUtf8ToMarkup(text.substr(offset + length).c_str());
}

void CtPredictionListControl::__appendItems()
{
	WPRET_M(!m_genlist, "no genlist");
	elm_genlist_clear(m_genlist);
	m_oneLineCount = 0;
	m_twoLineCount = 0;
	const auto& predictions = m_model->getPredictionList();
	for (size_t i = 0; i < predictions.size(); ++i) {
		auto* row = new __PredictionListItem(this, predictions[i]);
		Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
			ELM_GENLIST_ITEM_NONE, row->getSelectCb(), row);
		if (!item) {
			delete row;
			continue;
		}
		row->setElmObjectItem(item);
		if (i >= static_cast<size_t>(kRowsSized))
			continue;
		if (predictions[i].number.empty())
			++m_oneLineCount;
		else
			++m_twoLineCount;
	}
}

void CtPredictionListControl::__onRowSelected(int contactId)
{
	WHIT();
	// The callback may end this list's owner; the list ends after it either way.
	std::weak_ptr<app_assist::WControl> alive = getWeakPtr();
	contacts_record_h contact = CtPredictionListModel::getContactRecordByContactId(contactId);
	if (contact && m_onSelected) {
		SelectedCallback onSelected = m_onSelected;
		onSelected(contact);
	} else if (contact) {
		contacts_record_destroy(contact, true);
	}
	if (!alive.expired())
		destroy();
}

Evas_Object* CtPredictionListControl::__getFocusedEditfield()
{
	if (!m_nameEntry)
		return nullptr;
	Evas_Object* box = m_basicInfoRow ? elm_object_item_part_content_get(m_basicInfoRow, "elm.icon.1") : nullptr;
	if (!box)
		return m_nameEntry;
	Eina_List* children = elm_box_children_get(box);
	Evas_Object* found = nullptr;
	Eina_List* l = nullptr;
	void* child = nullptr;
	EINA_LIST_FOREACH(children, l, child) {
		auto* field = static_cast<Evas_Object*>(child);
		for (Evas_Object* o = m_nameEntry; o && !found; o = elm_object_parent_widget_get(o))
			if (o == field)
				found = field;
	}
	eina_list_free(children);
	return found ? found : m_nameEntry;
}

void CtPredictionListControl::__backCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtPredictionListControl*>(data)->destroy();
}

void CtPredictionListControl::__realizedCb(void*, Evas_Object* obj, void* eventInfo)
{
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	if (item && item == elm_genlist_last_item_get(obj))
		elm_object_item_signal_emit(item, "elm,state,bottomline,hide", "");
}

void CtPredictionListControl::__nameEntryDelCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* control = static_cast<CtPredictionListControl*>(data);
	control->m_nameEntry = nullptr;
	control->m_basicInfoRow = nullptr;
}
