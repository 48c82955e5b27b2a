#include "CtInputViewSimControl.h"

#include "ContactsDebug.h"
#include "CtAddressbookPopup.h"
#include "CtInputView.h"
#include "CtInputViewAddrBookItem.h"
#include "CtInputViewSimEmailItem.h"
#include "CtInputViewSimNameItem.h"
#include "CtInputViewSimNumberItem.h"
#include "CtThemeMgr.h"
#include "WPopup.h"
#include "WUiTimer.h"

namespace {

const int kPrimaryEditType = 112;
const int kEmergencyContactType = 126;
// The list settles its own focus when it realizes its rows; the name entry takes it after that.
const double kKeypadDelay = 0.1;

contacts_record_h firstOf(Eina_List* list)
{
	auto* record = static_cast<contacts_record_h>(eina_list_data_get(list));
	eina_list_free(list);
	return record;
}

bool isEmpty(const char* text)
{
	return !text || !*text;
}

} // namespace

CtInputViewSimControl::CtInputViewSimControl(std::shared_ptr<CtData> data, CtInputView* view)
	: m_data(std::move(data)), m_view(view)
{
}

CtInputViewSimControl::~CtInputViewSimControl() = default;

Evas_Object* CtInputViewSimControl::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	WPRET_VM(!m_data, nullptr, "data is NULL");
	m_genlist = elm_genlist_add(parent);
	CtThemeMgr::getInstance()->setObjectTheme(m_genlist);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	__addSimAllItems();
	app_assist::WUiTimer::addTimer(kKeypadDelay, [](void* data) {
		__createKeypadTimerCb(data);
		return false;
	}, this, this);
	return m_genlist;
}

void CtInputViewSimControl::onDestroy()
{
	// The rows die with the list; nothing may reach them from now on.
	m_nameItem = nullptr;
	m_addrBookItem = nullptr;
	m_firstItem = m_numberItem = m_emailItem = m_addrBookElmItem = nullptr;
}

bool CtInputViewSimControl::getUgRequestIsForPrimaryOrNot()
{
	int type = m_view ? m_view->getInputType() : -1;
	return type == kPrimaryEditType || type == kEmergencyContactType;
}

bool CtInputViewSimControl::__hasEmailRoom()
{
	return m_data->getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_EMAIL) > 0
		&& m_data->getSimUnusedFieldCount(CONTACTS_SIM_FIELD_EMAIL) > 0;
}

bool CtInputViewSimControl::__needsEmailItem()
{
	if (getUgRequestIsForPrimaryOrNot() || !m_data->getSimFieldStatus(CONTACTS_SIM_FIELD_EMAIL))
		return false;
	if (__hasEmailRoom())
		return true;
	contacts_record_h email = firstOf(m_data->getEmailList());
	return m_data->getPersonId() != 0 && email && !isEmpty(m_data->getEmailEmail(email));
}

Elm_Object_Item* CtInputViewSimControl::__appendRow(app_assist::WGenlistItem* row, Elm_Object_Item* after)
{
	Elm_Object_Item* item = after
		? elm_genlist_item_insert_after(m_genlist, row->getItemClass(), row, nullptr, after, ELM_GENLIST_ITEM_NONE,
				row->getSelectCb(), nullptr)
		: elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr, ELM_GENLIST_ITEM_NONE,
				row->getSelectCb(), nullptr);
	if (!item) {
		WERROR("elm_genlist_item_append() is NULL");
		delete row;
		return nullptr;
	}
	row->setElmObjectItem(item);
	if (m_view)
		row->attachToView(m_view);
	return item;
}

void CtInputViewSimControl::__addSimAllItems()
{
	bool stored = m_data->getContactId() > 0;
	auto changed = [this] { __updateSaveBtn(); };

	std::string name = m_data->getFullName();
	m_nameItem = new CtInputViewSimNameItem(m_data, changed, stored ? name.c_str() : nullptr);
	m_firstItem = __appendRow(m_nameItem);
	if (!m_firstItem)
		m_nameItem = nullptr;

	contacts_record_h number = firstOf(m_data->getNumberList());
	if (!number)
		number = m_data->addNumber("");
	const char* numberText = m_data->getNumberNumber(number);
	m_numberItem = __appendRow(new CtInputViewSimNumberItem(m_data, number, changed,
			[this](bool empty) {
				if (getUgRequestIsForPrimaryOrNot())
					updateNumberSaveBtn(empty);
			},
			stored ? (numberText ? numberText : "") : nullptr));

	if (__needsEmailItem())
		__insertEmailItem(stored);

	m_addrBookItem = new CtInputViewAddrBookItem(m_data, [this] { __onAddrbookItemSelectedCb(); });
	m_addrBookElmItem = __appendRow(m_addrBookItem);
	if (!m_addrBookElmItem)
		m_addrBookItem = nullptr;
}

void CtInputViewSimControl::__insertEmailItem(bool stored)
{
	contacts_record_h email = firstOf(m_data->getEmailList());
	if (!email)
		email = m_data->addEmail("");
	const char* text = m_data->getEmailEmail(email);
	auto* row = new CtInputViewSimEmailItem(m_data, email, [this] { __updateSaveBtn(); },
			stored ? (text ? text : "") : nullptr);
	m_emailItem = __appendRow(row, m_numberItem);
}

void CtInputViewSimControl::__removeEmailItem()
{
	if (!m_emailItem)
		return;
	Elm_Object_Item* item = m_emailItem;
	m_emailItem = nullptr;
	elm_object_item_del(item);
}

std::vector<CtInputViewGenlistItem*> CtInputViewSimControl::__fieldRows() const
{
	std::vector<CtInputViewGenlistItem*> rows;
	for (Elm_Object_Item* item = m_firstItem; item && item != m_addrBookElmItem; item = elm_genlist_item_next_get(item)) {
		auto* base = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
		if (auto* row = dynamic_cast<CtInputViewGenlistItem*>(base))
			rows.push_back(row);
	}
	return rows;
}

bool CtInputViewSimControl::getIsEmpty()
{
	for (CtInputViewGenlistItem* row : __fieldRows()) {
		if (!row->getIsEmpty())
			return false;
	}
	return true;
}

bool CtInputViewSimControl::getIsChanged()
{
	// Rows made since the list was built have no stored text: they count as
	// changed exactly when they hold text.
	for (CtInputViewGenlistItem* row : __fieldRows()) {
		if (row->getIsChanged())
			return true;
	}
	return false;
}

void CtInputViewSimControl::updateNameRecordForSim()
{
	Evas_Object* entry = m_nameItem ? m_nameItem->getEntry() : nullptr;
	WPRET_M(!entry, "__nameEntry is NULL");
	std::string name = CtInputViewGenlistItem::getEntryUtf8(entry);
	m_data->setFirstName(name.c_str());
	m_data->setPrefixName("");
	m_data->setSuffixName("");
	m_data->setMiddleName("");
	m_data->setLastName("");
}

void CtInputViewSimControl::focusForRename()
{
	Evas_Object* entry = m_nameItem ? m_nameItem->getEntry() : nullptr;
	WPRET_M(!entry, "__nameEntry is NULL");
	elm_object_focus_set(entry, EINA_TRUE);
	elm_entry_cursor_end_set(entry);
}

void CtInputViewSimControl::updateNumberSaveBtn(bool disabled)
{
	if (m_view)
		m_view->updateSaveBtn(disabled);
}

void CtInputViewSimControl::__updateSaveBtn()
{
	if (m_view && !getUgRequestIsForPrimaryOrNot())
		m_view->updateSaveBtn(getIsEmpty());
}

void CtInputViewSimControl::updateAddrBookItem()
{
	if (m_addrBookItem)
		m_addrBookItem->update();
}

void CtInputViewSimControl::__createKeypadTimerCb(void* data)
{
	auto* self = static_cast<CtInputViewSimControl*>(data);
	Evas_Object* entry = self->m_nameItem ? self->m_nameItem->getEntry() : nullptr;
	if (entry)
		elm_object_focus_set(entry, EINA_TRUE);
}

void CtInputViewSimControl::__onAddrbookItemSelectedCb()
{
	WHIT();
	WPRET_M(!m_view, "view is NULL");
	if (m_data->getContactId() > 0)
		return;
	auto* popup = new CtAddressbookPopup(m_view->getInputType(), m_data->getAddressbookId());
	popup->setTitle("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB");
	popup->setTextTranslatable("contacts");
	std::weak_ptr<app_assist::WControl> self = getWeakPtr();
	std::weak_ptr<app_assist::WControl> popupAlive = popup->getWeakPtr();
	popup->setOnResultCb([this, self, popupAlive](int addressbookId) {
		// The popup's list is still in its selection callback: close it and act once that returned.
		app_assist::WUiTimer::addIdler([this, self, popupAlive, addressbookId](void*) {
			if (auto popup = popupAlive.lock())
				popup->destroy();
			if (!self.expired())
				__onStorageChosen(addressbookId);
			return false;
		}, nullptr, m_view);
	});
	m_view->attachPopup(popup);
}

void CtInputViewSimControl::__onStorageChosen(int addressbookId)
{
	if (addressbookId == m_data->getAddressbookId())
		return;
	if (m_data->checkAddressbookIsSimOrNot(addressbookId)) {
		__moveToOtherCard(addressbookId);
		return;
	}
	if (getIsEmpty())
		__switchToStorage(addressbookId);
	else
		__askChangeLocation(addressbookId);
}

void CtInputViewSimControl::__moveToOtherCard(int addressbookId)
{
	m_data->setAddressbookInfo(addressbookId);
	updateAddrBookItem();
	if (!__hasEmailRoom())
		__removeEmailItem();
	else if (!m_emailItem && m_data->getSimFieldStatus(CONTACTS_SIM_FIELD_EMAIL) && !getUgRequestIsForPrimaryOrNot())
		__insertEmailItem(false);
	// The new card may give each field another limit.
	for (CtInputViewGenlistItem* row : __fieldRows()) {
		if (auto* field = dynamic_cast<CtInputViewSimFieldItem*>(row))
			field->updateCounter();
	}
	__updateSaveBtn();
}

void CtInputViewSimControl::__askChangeLocation(int addressbookId)
{
	auto* popup = new app_assist::WPopup("IDS_PB_HEADER_CHANGE_SAVE_LOCATION_ABB",
			"IDS_PB_POP_SOME_CONTACT_INFORMATION_MAY_BE_LOST");
	popup->setTextTranslatable("contacts");
	popup->addButton("IDS_PB_BUTTON_CANCEL", [](bool*) {});
	std::weak_ptr<app_assist::WControl> self = getWeakPtr();
	popup->addButton("IDS_PB_BUTTON_CHANGE_ABB", [this, self, addressbookId](bool*) {
		if (!self.expired())
			__switchToStorage(addressbookId);
	});
	m_view->attachPopup(popup);
}

void CtInputViewSimControl::__switchToStorage(int addressbookId)
{
	m_data->setAddressbookInfo(addressbookId);
	// Replaces (and so destroys) this control: nothing of it may be used afterwards.
	m_view->createInputViewControl(m_view->getLayout(), m_data->checkAddressbookIsSimOrNot(addressbookId));
}
