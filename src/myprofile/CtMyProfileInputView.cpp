#include "CtMyProfileInputView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtMyProfileInputData.h"
#include "CtThemeMgr.h"
#include "WNaviframe.h"

namespace {

const char* const kCreateTitleId = "IDS_PB_HEADER_CREATE_PROFILE_ABB";
const char* const kEditTitleId = "IDS_PB_OPT_EDIT";

} // namespace

CtMyProfileInputView::CtMyProfileInputView(contacts_record_h record, CtLaunchRequest* request)
	: m_request(request), m_inputData(std::make_shared<CtMyProfileInputData>(record))
{
	WENTER();
	__init();
}

CtMyProfileInputView::CtMyProfileInputView(WizardCallback wizardCallback, void* wizardView)
	: m_inputData(std::make_shared<CtMyProfileInputData>()), m_wizardMode(true), m_wizardView(wizardView),
	  m_wizardCallback(std::move(wizardCallback))
{
	WENTER();
	__init();
}

CtMyProfileInputView::~CtMyProfileInputView()
{
	WENTER();
}

void CtMyProfileInputView::__init()
{
	m_isNew = m_inputData->getContactId() < 1;
}

std::shared_ptr<CtData> CtMyProfileInputView::getInputData() const
{
	return m_inputData;
}

Evas_Object* CtMyProfileInputView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	setTitle(ContactsCommon::translate(m_isNew || m_wizardMode ? kCreateTitleId : kEditTitleId));
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	std::string path;
	ContactsCommon::getAppEdjePath("contacts/contacts.edj", path, true);
	CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	CtThemeMgr::getInstance()->setObjectTheme(layout);
	m_genlist = elm_genlist_add(layout);
	WPRET_VM(!m_genlist, layout, "elm_genlist_add() is failed");
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_object_part_content_set(layout, "elm.swallow.content", m_genlist);
	return layout;
}

void CtMyProfileInputView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
	__addTitleButtons(naviItem);
	__addAllItems();
}

void CtMyProfileInputView::__addTitleButtons(Elm_Object_Item* naviItem)
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is NULL");
	Evas_Object* parent = naviframe->getEvasObj();
	m_cancelButton = ctCommonCreateButton(parent, "naviframe/title_left", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB",
		__cancelCb, this);
	if (Evas_Object* back = elm_object_item_part_content_unset(naviItem, "elm.swallow.prev_btn"))
		evas_object_del(back);
	elm_object_item_part_content_set(naviItem, "title_left_btn", m_cancelButton);
	m_doneButton = ctCommonCreateButton(parent, "naviframe/title_right", "IDS_TPLATFORM_ACBUTTON_DONE_ABB",
		__saveCb, this);
	elm_object_disabled_set(m_doneButton, m_isNew ? EINA_TRUE : EINA_FALSE);
	elm_object_item_part_content_set(naviItem, "title_right_btn", m_doneButton);
}

void CtMyProfileInputView::__addAllItems()
{
	CtInputViewBasicInfoItem::Callbacks callbacks;
	callbacks.changed = [this] {
		if (m_doneButton)
			elm_object_disabled_set(m_doneButton, EINA_FALSE);
	};
	auto* row = new CtInputViewBasicInfoItem(m_inputData, nullptr, std::move(callbacks), 0,
		CtInputViewBasicInfoItem::Mode::MyProfile, false);
	Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
		ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr);
	row->setElmObjectItem(item);
	row->attachToView(this);
}

bool CtMyProfileInputView::onPop()
{
	WENTER();
	return true;
}

void CtMyProfileInputView::onDestroy()
{
	WENTER();
	m_genlist = nullptr;
	m_doneButton = m_cancelButton = nullptr;
}

void CtMyProfileInputView::onLanguageChanged()
{
	setTitle(ContactsCommon::translate(m_isNew || m_wizardMode ? kCreateTitleId : kEditTitleId));
	if (Elm_Object_Item* naviItem = getNaviItem())
		elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
	if (m_genlist)
		elm_genlist_realized_items_update(m_genlist);
}

void CtMyProfileInputView::onDbChanged(const char*)
{
}

void CtMyProfileInputView::__save()
{
	WENTER();
	if (m_wizardCallback) {
		WizardCallback callback = std::move(m_wizardCallback);
		m_wizardCallback = nullptr;
		callback(m_wizardView);
	}
	int err = CONTACTS_ERROR_NONE;
	if (m_isNew) {
		int id = 0;
		err = m_inputData->insertContact(&id);
		if (err != CONTACTS_ERROR_NONE)
			WERROR("insert failed %d", err);
	} else {
		err = m_inputData->updateContact();
		if (err != CONTACTS_ERROR_NONE)
			WERROR("update failed %d", err);
	}
	m_saved = true;
	popOut();
}

void CtMyProfileInputView::__saveCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtMyProfileInputView*>(data)->__save();
}

void CtMyProfileInputView::__cancelCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtMyProfileInputView*>(data)->popOut();
}
