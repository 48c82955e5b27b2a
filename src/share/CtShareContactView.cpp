#include "CtShareContactView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonTextUtil.h"
#include "CtDetailData.h"
#include "CtDetailViewBasicInfoItem.h"
#include "CtShareContactText.h"
#include "CtShareContactViewItem.h"
#include "CtThemeMgr.h"
#include "WNaviframe.h"

#include <app_control.h>
#include <ui_extension.h>

#include <cstdlib>
#include <string>

namespace {

constexpr const char* kEdjFiles[] = {"contacts/contacts.edj", "contacts/detail_layout.edj"};
constexpr const char* kResultKey = "person_info";
constexpr double kPreviewWeight = 0.4;
constexpr const char* kPreviewTitleOpen = "<left_margin=16 font_size=13 color=#6B7280FF>";
constexpr const char* kPreviewTitleClose = "</>";
constexpr const char* kPreviewTextOpen = "<align=left left_margin=16 right_margin=16 font_size=14 color=#1F2328FF>";
constexpr const char* kPreviewTextClose = "</>";

// The translated `pattern` with its "%d" replaced by `count`; a translation
// is never used as a printf format.
std::string formatCount(const char* pattern, int count)
{
	std::string text = pattern ? pattern : "";
	size_t at = text.find("%d");
	if (at != std::string::npos)
		text.replace(at, 2, std::to_string(count));
	return text;
}

CtShareContactViewItem* fieldRowOf(Elm_Object_Item* item)
{
	auto* base = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
	return dynamic_cast<CtShareContactViewItem*>(base);
}

bool hasText(const char* text)
{
	return text && *text;
}

} // namespace

CtShareContactView::CtShareContactView(int personId, CtLaunchRequest* request)
{
	WENTER();
	__initialize(request);
	m_personId = personId;
	if (personId < 1)
		WERROR("no person to share : %d", personId);
	m_detailData.reset(new CtDetailData(personId));
}

CtShareContactView::~CtShareContactView()
{
	WENTER();
	if (m_detailData)
		m_detailData->detachListener();
	m_detailData.reset();
}

void CtShareContactView::__initialize(CtLaunchRequest* request)
{
	m_request = request;
	m_genlist = nullptr;
	m_nameItem = nullptr;
	m_selectedCount = 0;
}

int CtShareContactView::getPersoinId()
{
	WPRET_VM(!m_detailData, 0, "WASSERT! __detailData is null");
	return m_detailData->getPersonId();
}

const char* CtShareContactView::getClassName()
{
	return "CtShareContactView";
}

Evas_Object* CtShareContactView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "createBaseLayout() failed");
	__addExtensionThemes();
	CtThemeMgr::getInstance()->setObjectTheme(layout);

	Evas_Object* box = elm_box_add(layout);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, EVAS_HINT_FILL);
	m_genlist = elm_genlist_add(box);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	evas_object_show(m_genlist);
	elm_box_pack_end(box, m_genlist);
	elm_box_pack_end(box, __createPreview(box));
	elm_object_part_content_set(layout, "elm.swallow.content", box);

	__addAllItems({});
	__countMarks();
	__updatePreview();
	return layout;
}

void CtShareContactView::__addExtensionThemes()
{
	for (const char* edj : kEdjFiles) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
}

// A titled, scrolling, read-only text under the list.
Evas_Object* CtShareContactView::__createPreview(Evas_Object* parent)
{
	Evas_Object* panel = elm_box_add(parent);
	// The list keeps most of the height; the preview takes a share of it.
	evas_object_size_hint_weight_set(panel, EVAS_HINT_EXPAND, kPreviewWeight);
	evas_object_size_hint_align_set(panel, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_box_padding_set(panel, 0, ELM_SCALE_SIZE(4));

	m_previewTitle = elm_label_add(panel);
	__setPreviewTitle();
	evas_object_size_hint_weight_set(m_previewTitle, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(m_previewTitle, 0.0, 0.5);
	evas_object_show(m_previewTitle);
	elm_box_pack_end(panel, m_previewTitle);

	Evas_Object* scroller = elm_scroller_add(panel);
	elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_AUTO);
	evas_object_size_hint_weight_set(scroller, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(scroller, EVAS_HINT_FILL, EVAS_HINT_FILL);
	m_preview = elm_label_add(scroller);
	elm_label_line_wrap_set(m_preview, ELM_WRAP_MIXED);
	evas_object_size_hint_weight_set(m_preview, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(m_preview, EVAS_HINT_FILL, 0.0);
	evas_object_show(m_preview);
	elm_object_content_set(scroller, m_preview);
	evas_object_show(scroller);
	elm_box_pack_end(panel, scroller);
	evas_object_show(panel);
	return panel;
}

void CtShareContactView::__setPreviewTitle()
{
	std::string markup = std::string(kPreviewTitleOpen)
		+ ctCommonUtf8ToMarkup(ContactsCommon::translate("IDS_PB_HEADER_PREVIEW")) + kPreviewTitleClose;
	elm_object_text_set(m_previewTitle, markup.c_str());
}

void CtShareContactView::onDestroy()
{
	WENTER();
	__closeGadget();
}

void CtShareContactView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	__createTitleButtons(naviItem);
	__updateTitle();
	if (m_detailData)
		m_detailData->attachListener(this);
}

void CtShareContactView::__createTitleButtons(Elm_Object_Item* naviItem)
{
	WPRET_M(!naviItem, "naviItem is nullptr");
	app_assist::WNaviframe* naviframe = getNaviframe();
	Evas_Object* parent = naviframe ? naviframe->getEvasObj() : getEvasObj();
	// Cancel takes the place of the back button.
	elm_object_item_part_content_set(naviItem, "elm.swallow.prev_btn", nullptr);

	m_doneButton = uxt_button_add(parent, "naviframe/title_right");
	elm_object_text_set(m_doneButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_DONE_ABB"));
	evas_object_smart_callback_add(m_doneButton, "clicked", __saveCb, this);
	elm_object_disabled_set(m_doneButton, EINA_TRUE);
	elm_object_item_part_content_set(naviItem, "title_right_btn", m_doneButton);

	m_cancelButton = uxt_button_add(parent, "naviframe/title_left");
	elm_object_text_set(m_cancelButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"));
	evas_object_smart_callback_add(m_cancelButton, "clicked", __cancelCb, this);
	elm_object_item_part_content_set(naviItem, "title_left_btn", m_cancelButton);
}

void CtShareContactView::__addAllItems(const std::set<std::string>& keptMarks)
{
	WPRET_M(!m_genlist || !m_detailData, "no list or data");
	CtDetailData* data = m_detailData.get();
	__addNameItem();
	__addFieldItems(data->getNumberList(), _contacts_number._uri, keptMarks);
	__addFieldItems(data->getEmailList(), _contacts_email._uri, keptMarks);
	__addFieldItems(data->getAddressList(), _contacts_address._uri, keptMarks);
	__addFieldItems(data->getMessengerList(), _contacts_messenger._uri, keptMarks);
	__addFieldItems(data->getUrlList(), _contacts_url._uri, keptMarks);
	__addFieldItems(data->getRelationshipList(), _contacts_relationship._uri, keptMarks);
	__addFieldItems(data->getEventList(), _contacts_event._uri, keptMarks);
	__addFieldItems(data->getNoteList(), _contacts_note._uri, keptMarks);
}

void CtShareContactView::__addNameItem()
{
	CtDetailData* data = m_detailData.get();
	bool fourLines = hasText(data->getExtraName1Second()) || hasText(data->getExtraName1First())
		|| hasText(data->getCompany());
	auto* row = new CtDetailViewBasicInfoItem(data, fourLines ? 1 : 0);
	Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
			ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
	if (!item) {
		WERROR("elm_genlist_item_append() failed");
		delete row;
		return;
	}
	row->setElmObjectItem(item);
	row->attachToView(this);
	elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
	m_nameItem = row;
}

void CtShareContactView::__addFieldItems(Eina_List* records, const char* kind, const std::set<std::string>& keptMarks)
{
	Eina_List* l = nullptr;
	void* record = nullptr;
	EINA_LIST_FOREACH(records, l, record) {
		auto* row = new CtShareContactViewItem(m_detailData.get(), static_cast<contacts_record_h>(record), kind);
		if (keptMarks.count(row->getFieldKey()))
			row->setMarked(true);
		Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, __onItemSelectedCb, this);
		if (!item) {
			WERROR("elm_genlist_item_append() failed");
			delete row;
			continue;
		}
		row->setElmObjectItem(item);
		row->attachToView(this);
	}
}

std::set<std::string> CtShareContactView::__markedFieldKeys()
{
	std::set<std::string> keys;
	if (!m_genlist)
		return keys;
	for (Elm_Object_Item* item = elm_genlist_first_item_get(m_genlist); item; item = elm_genlist_item_next_get(item)) {
		CtShareContactViewItem* row = fieldRowOf(item);
		if (row && row->isMarked())
			keys.insert(row->getFieldKey());
	}
	return keys;
}

std::string CtShareContactView::composeText()
{
	WPRET_VM(!m_detailData, std::string(), "WASSERT! __detailData is null");
	CtShareContactText text(m_detailData->getDisplayName());
	if (!m_genlist)
		return text.getText();
	// The name row is not a field row: the walk starts with the fields.
	for (Elm_Object_Item* item = elm_genlist_first_item_get(m_genlist); item; item = elm_genlist_item_next_get(item)) {
		CtShareContactViewItem* row = fieldRowOf(item);
		if (row && row->isMarked())
			text.appendField(row->getShareLabel(), row->getShareValue());
	}
	return text.getText();
}

std::string CtShareContactView::getPreviewText() const
{
	if (!m_preview)
		return std::string();
	char* plain = elm_entry_markup_to_utf8(elm_object_text_get(m_preview));
	std::string text = plain ? plain : "";
	free(plain);
	return text;
}

void CtShareContactView::__onMarksChanged()
{
	__countMarks();
	__updateTitle();
	__updatePreview();
}

void CtShareContactView::__countMarks()
{
	m_selectedCount = static_cast<int>(__markedFieldKeys().size());
}

void CtShareContactView::__updateTitle()
{
	Elm_Object_Item* naviItem = getNaviItem();
	WPRET_M(!naviItem, "naviItem is nullptr");
	std::string title = formatCount(ContactsCommon::translate("IDS_PB_HEADER_PD_SELECTED_ABB3"), m_selectedCount);
	setTitle(ctCommonUtf8ToMarkup(title.c_str()).c_str());
	if (m_doneButton)
		elm_object_disabled_set(m_doneButton, m_selectedCount == 0 ? EINA_TRUE : EINA_FALSE);
}

void CtShareContactView::__updatePreview()
{
	WPRET_M(!m_preview, "preview is nullptr");
	std::string markup = kPreviewTextOpen + ctCommonUtf8ToMarkup(composeText().c_str()) + kPreviewTextClose;
	elm_object_text_set(m_preview, markup.c_str());
}

void CtShareContactView::onDbChanged(const char* viewUri)
{
	WDEBUG("changed : %s", viewUri ? viewUri : "");
	if (m_isClosing)
		return;
	// A favourite tap on the name row writes the person too, but the same
	// notification may carry changes made elsewhere: the list is rebuilt
	// anyway, and the marks stay.
	if (m_nameItem && m_nameItem->getSkipOnce())
		m_nameItem->clearSkipOnce();
	__updateGenlist();
}

void CtShareContactView::__updateGenlist()
{
	WENTER();
	contacts_record_h person = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, m_personId, &person);
	if (err != CONTACTS_ERROR_NONE) {
		WWARNING("contacts_db_get_record() Failed(%d)", err);
		m_isClosing = true;
		popOut();
		return;
	}
	contacts_record_destroy(person, true);
	std::set<std::string> keptMarks = __markedFieldKeys();
	m_detailData->detachListener();
	// The rows borrow the old data's records: they go before it does.
	m_nameItem = nullptr;
	elm_genlist_clear(m_genlist);
	m_detailData.reset(new CtDetailData(m_personId));
	m_detailData->attachListener(this);
	__addAllItems(keptMarks);
	++m_rebuildCount;
	__onMarksChanged();
}

void CtShareContactView::onCompleteGetContacts()
{
	WHIT();
}

void CtShareContactView::onConditionChagned()
{
	WHIT();
}

void CtShareContactView::onLanguageChanged()
{
	WHIT();
	__updateTitle();
	if (m_doneButton)
		elm_object_text_set(m_doneButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_DONE_ABB"));
	if (m_cancelButton)
		elm_object_text_set(m_cancelButton, ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"));
	if (m_previewTitle)
		__setPreviewTitle();
	if (m_genlist)
		elm_genlist_realized_items_update(m_genlist);
	__updatePreview();
}

void CtShareContactView::__save()
{
	WENTER();
	std::string text = composeText();
	app_control_h reply = nullptr;
	int err = app_control_create(&reply);
	if (err != APP_CONTROL_ERROR_NONE)
		WWARNING("app_control_create() Failed(%d)", err);
	if (reply && !text.empty())
		app_control_add_extra_data(reply, kResultKey, text.c_str());
	ui_gadget_h gadget = m_request ? m_request->ug : nullptr;
	if (gadget && reply) {
		err = ug_send_result(gadget, reply);
		if (err != UG_ERROR_NONE)
			WWARNING("ug_send_result() Failed(%d)", err);
	}
	if (reply)
		app_control_destroy(reply);
	m_isClosing = true;
	m_isGadgetClosed = true;
	popOut();
	if (gadget)
		ug_destroy_me(gadget);
}

// The gadget exists for this screen only: however the screen goes, the
// caller learns that it is over.
void CtShareContactView::__closeGadget()
{
	ui_gadget_h gadget = m_request ? m_request->ug : nullptr;
	if (!gadget || m_isGadgetClosed)
		return;
	m_isGadgetClosed = true;
	int err = ug_destroy_me(gadget);
	if (err != UG_ERROR_NONE)
		WDEBUG("ug_destroy_me() Failed(%d)", err);
}

void CtShareContactView::__onItemSelectedCb(void* data, Evas_Object*, void* eventInfo)
{
	WHIT();
	WPRET_M(!data, "data is null");
	auto* view = static_cast<CtShareContactView*>(data);
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	CtShareContactViewItem* row = item ? fieldRowOf(item) : nullptr;
	WPRET_M(!row, "viewItem is null");
	if (elm_genlist_item_select_mode_get(item) == ELM_OBJECT_SELECT_MODE_DEFAULT) {
		elm_genlist_item_selected_set(item, EINA_FALSE);
		row->setMarked(!row->isMarked());
	}
	view->__onMarksChanged();
}

void CtShareContactView::__saveCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "data is null");
	auto* view = static_cast<CtShareContactView*>(data);
	if (view->m_isClosing || view->m_selectedCount == 0)
		return;
	view->__save();
}

void CtShareContactView::__cancelCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WPRET_M(!data, "data is null");
	auto* view = static_cast<CtShareContactView*>(data);
	if (view->m_isClosing)
		return;
	view->m_isClosing = true;
	view->popOut();
}
