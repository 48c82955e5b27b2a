#include "CtAddressbookPopup.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtSimMgr.h"
#include "CtThemeMgr.h"

#include <contacts.h>
#include <vconf.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

namespace {

const char* const kRadioGroupKey = "radioGroup";
const char* const kImageEdj = "contacts/image_layout.edj";
const char* const kListEdj = "contacts/list.edj";
const char* const kItemsEdj = "contacts/contacts.edj";
const int kOneLineHeight = 56;
const int kTwoLineHeight = 72;
const int kMaxVisibleHeight = 5 * 72;

const char* const kSimIcons[] = { "logs_icon_sim_1_62.png", "logs_icon_sim_2_62.png", "logs_icon_sim_phone_62.png",
	"logs_icon_sim_message_62.png", "logs_icon_sim_data_62.png", "logs_icon_sim_internet_62.png",
	"logs_icon_sim_home_62.png", "logs_icon_sim_office_62.png", "logs_icon_sim_heart_62.png" };
const int kSimIconCount = sizeof(kSimIcons) / sizeof(kSimIcons[0]);

enum class Storage { Device, Sim, Sim1, Sim2, Account };

int readInt(const char* key)
{
	int value = 0;
	int err = vconf_get_int(key, &value);
	if (err == VCONF_ERROR_WRONG_TYPE)
		err = vconf_get_bool(key, &value);
	if (err != VCONF_OK)
		return 0;
	return value;
}

std::string readText(const char* key)
{
	char* text = vconf_get_str(key);
	std::string result = text ? text : "";
	free(text);
	return result;
}

Storage storageOf(int addressbookId, const char* providerName)
{
	if (!strcmp(providerName, CONTACTS_SIM1_PROVIDER_NAME))
		return Storage::Sim1;
	if (!strcmp(providerName, CONTACTS_SIM2_PROVIDER_NAME))
		return Storage::Sim2;
	if (!strcmp(providerName, CONTACTS_SIM_PROVIDER_NAME))
		return Storage::Sim;
	// The phone's own book is book 0 whatever its provider is called.
	if (addressbookId == 0 || !strcmp(providerName, ContactsCommon::translate("IDS_PB_OPT_DEVICE")))
		return Storage::Device;
	return Storage::Account;
}

const char* simIconName(Storage storage)
{
	int slot = storage == Storage::Sim1 ? 0 : 1;
	int icon = readInt(slot == 0 ? VCONFKEY_SETAPPL_SIM1_ICON : VCONFKEY_SETAPPL_SIM2_ICON);
	if (icon < 0 || icon >= kSimIconCount)
		icon = slot;
	return kSimIcons[icon];
}

} // namespace

struct CtAddressbookPopup::Row {
	CtAddressbookPopup* popup = nullptr;
	int addressbookId = 0;
	char* providerName = nullptr;
	char* userName = nullptr;
	int radioIndex = 0;
	Storage storage = Storage::Account;

	~Row()
	{
		free(providerName);
		free(userName);
	}
};

CtAddressbookPopup::CtAddressbookPopup(int inputType, int selectedId)
	: m_selectedId(selectedId), m_inputType(inputType)
{
}

CtAddressbookPopup::~CtAddressbookPopup() = default;

const char* CtAddressbookPopup::getClassName()
{
	return "CtAddressbookPopup";
}

void CtAddressbookPopup::setOnResultCb(std::function<void(int)> onResult)
{
	m_onResult = std::move(onResult);
}

Evas_Object* CtAddressbookPopup::onCreate(Evas_Object* parent, void* param)
{
	WENTER();
	CtSimMgr::getInstance()->attach(this);
	setOnAddProperties([](Evas_Object* popup) { elm_popup_orient_set(popup, ELM_POPUP_ORIENT_CENTER); });
	setContent([this](Evas_Object* popupParent) { return __createContent(popupParent); });
	return WPopup::onCreate(parent, param);
}

void CtAddressbookPopup::onDestroy()
{
	CtSimMgr::getInstance()->detach(this);
	m_genlist = nullptr;
}

void CtAddressbookPopup::onSimChanged()
{
	WHIT();
	__updateGenlist();
}

Evas_Object* CtAddressbookPopup::__createContent(Evas_Object* parent)
{
	for (const char* name : { kItemsEdj, kListEdj }) {
		std::string edj;
		if (ContactsCommon::getAppEdjePath(name, edj, true))
			CtThemeMgr::getInstance()->addExtensionTheme(edj.c_str());
	}
	// The box gives the list its height: a popup sizes its content by the
	// content's minimum, which a scrolling list does not have.
	Evas_Object* box = elm_box_add(parent);
	WPRET_VM(!box, nullptr, "elm_box_add() failed");
	m_genlist = elm_genlist_add(box);
	WPRET_VM(!m_genlist, box, "elm_genlist_add() failed");
	CtThemeMgr::getInstance()->setObjectTheme(m_genlist);
	elm_object_style_set(m_genlist, "popup");
	elm_genlist_mode_set(m_genlist, ELM_LIST_SCROLL);
	elm_genlist_homogeneous_set(m_genlist, EINA_TRUE);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(m_genlist);
	elm_box_pack_end(box, m_genlist);
	evas_object_show(box);
	__addPopupItems();
	return box;
}

void CtAddressbookPopup::__updateGenlist()
{
	WPRET_M(!m_genlist, "no list yet");
	elm_genlist_clear(m_genlist);
	__addPopupItems();
}

void CtAddressbookPopup::__addPopupItems()
{
	contacts_list_h books = nullptr;
	int err = contacts_db_get_all_records(_contacts_address_book._uri, 0, 0, &books);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_all_records", err);
		return;
	}
	Evas_Object* group = static_cast<Evas_Object*>(evas_object_data_get(m_genlist, kRadioGroupKey));
	if (!group) {
		group = elm_radio_add(m_genlist);
		elm_object_style_set(group, "default");
		evas_object_data_set(m_genlist, kRadioGroupKey, group);
	}
	elm_radio_state_value_set(group, -1);
	elm_radio_value_set(group, -1);

	bool powerSaving = readInt(VCONFKEY_SETAPPL_PSMODE) != 0;
	m_isSim1Powered = readInt(VCONFKEY_TELEPHONY_SIM_POWER_STATE1) != 0;
	m_isSim2Powered = readInt(VCONFKEY_TELEPHONY_SIM_POWER_STATE2) != 0;

	std::vector<Row*> rows;
	int count = 0;
	contacts_list_get_count(books, &count);
	for (int i = 0; i < count; ++i, contacts_list_next(books)) {
		contacts_record_h book = nullptr;
		if (contacts_list_get_current_record_p(books, &book) != CONTACTS_ERROR_NONE)
			continue;
		int id = -1, mode = 0;
		contacts_record_get_int(book, _contacts_address_book.id, &id);
		contacts_record_get_int(book, _contacts_address_book.mode, &mode);
		auto* row = new Row;
		row->popup = this;
		row->addressbookId = id;
		ctCommonGetProviderNameByAddressbookId(id, &row->providerName, &row->userName);
		if (!row->providerName) {
			WERROR("%d addressbook name is NULL", id);
			delete row;
			continue;
		}
		row->storage = storageOf(id, row->providerName);
		bool shown = true;
		switch (row->storage) {
		case Storage::Sim1: shown = m_isSim1Powered && m_inputType != 41; break;
		case Storage::Sim2: shown = m_isSim2Powered && m_inputType != 41; break;
		case Storage::Account: shown = !powerSaving && !(mode & 1); break;
		default: break;
		}
		if (!shown) {
			delete row;
			continue;
		}
		rows.push_back(row);
	}
	contacts_list_destroy(books, true);

	auto sim1 = std::find_if(rows.begin(), rows.end(), [](Row* r) { return r->storage == Storage::Sim1; });
	auto sim2 = std::find_if(rows.begin(), rows.end(), [](Row* r) { return r->storage == Storage::Sim2; });
	if (sim1 != rows.end() && sim2 != rows.end() && sim2 < sim1)
		std::iter_swap(sim1, sim2);
	for (size_t i = 0; i < rows.size(); ++i) {
		rows[i]->radioIndex = static_cast<int>(i);
		bool twoLines = rows[i]->storage == Storage::Sim1 || rows[i]->storage == Storage::Sim2
			|| rows[i]->storage == Storage::Account;
		__appendRow(rows[i], twoLines);
	}
	__fitHeight();
}

void CtAddressbookPopup::__appendRow(Row* row, bool twoLines)
{
	static Elm_Genlist_Item_Class* classes[2] = { nullptr, nullptr };
	Elm_Genlist_Item_Class*& itc = classes[twoLines ? 1 : 0];
	if (!itc) {
		itc = elm_genlist_item_class_new();
		itc->item_style = twoLines ? "2line.top" : "1line";
		itc->func.text_get = __textGetCb;
		itc->func.content_get = __contentGetCb;
		itc->func.del = __rowDelCb;
	}
	if (row->addressbookId == m_selectedId) {
		auto* group = static_cast<Evas_Object*>(evas_object_data_get(m_genlist, kRadioGroupKey));
		elm_radio_value_set(group, row->radioIndex);
	}
	Elm_Object_Item* item = elm_genlist_item_append(m_genlist, itc, row, nullptr, ELM_GENLIST_ITEM_NONE,
		__itemSelectedCb, row);
	if (!item)
		delete row;
}

void CtAddressbookPopup::__fitHeight()
{
	int height = 0;
	for (Elm_Object_Item* it = elm_genlist_first_item_get(m_genlist); it; it = elm_genlist_item_next_get(it)) {
		const Elm_Genlist_Item_Class* itc = elm_genlist_item_item_class_get(it);
		height += itc && !strcmp(itc->item_style, "1line") ? kOneLineHeight : kTwoLineHeight;
	}
	height = std::min(height, kMaxVisibleHeight);
	evas_object_size_hint_min_set(elm_object_parent_widget_get(m_genlist), 0, static_cast<int>(height * ctCommonGetScale()));
}

char* CtAddressbookPopup::__textGetCb(void* data, Evas_Object*, const char* part)
{
	auto* row = static_cast<Row*>(data);
	std::string text;
	bool slotSim = row->storage == Storage::Sim1 || row->storage == Storage::Sim2;
	if (!strcmp(part, "elm.text.main.left")) {
		text = row->storage == Storage::Device ? ContactsCommon::translate("IDS_PB_OPT_DEVICE") : row->providerName;
	} else if (!strcmp(part, "elm.text.main.left.top")) {
		text = slotSim ? ContactsCommon::translate("IDS_PB_OPT_SIM_CARD") : row->providerName;
	} else if (!strcmp(part, "elm.text.sub.left.bottom")) {
		std::string simName;
		if (slotSim)
			simName = readText(row->storage == Storage::Sim1 ? VCONFKEY_SETAPPL_SIM1_NAME : VCONFKEY_SETAPPL_SIM2_NAME);
		text = !simName.empty() ? simName : (row->userName ? row->userName : "");
	}
	return text.empty() ? nullptr : strdup(ctCommonUtf8ToMarkup(text.c_str()).c_str());
}

Evas_Object* CtAddressbookPopup::__contentGetCb(void* data, Evas_Object* obj, const char* part)
{
	auto* row = static_cast<Row*>(data);
	if (!strcmp(part, "elm.icon.2")) {
		Evas_Object* layout = ctCommonCreateLayout(obj, kListEdj, "list/C/type.2");
		if (!layout)
			return nullptr;
		Evas_Object* radio = elm_radio_add(layout);
		elm_radio_state_value_set(radio, row->radioIndex);
		elm_radio_group_add(radio, static_cast<Evas_Object*>(evas_object_data_get(obj, kRadioGroupKey)));
		elm_object_signal_emit(radio, "elm,event,pass,enabled", "elm");
		evas_object_propagate_events_set(radio, EINA_FALSE);
		evas_object_pass_events_set(radio, EINA_TRUE);
		elm_object_part_content_set(layout, "elm.swallow.content", radio);
		return layout;
	}
	if (strcmp(part, "elm.icon.1"))
		return nullptr;
	Evas_Object* layout = ctCommonCreateLayout(obj, kListEdj, "list/B/accountIcon");
	if (!layout)
		return nullptr;
	Evas_Object* icon = nullptr;
	switch (row->storage) {
	case Storage::Sim1:
	case Storage::Sim2: icon = ctCommonCreateImage(layout, kImageEdj, simIconName(row->storage)); break;
	case Storage::Sim: icon = ctCommonCreateImage(layout, kImageEdj, "logs_icon_sim_62.png"); break;
	case Storage::Device: icon = ctCommonCreateImage(layout, kImageEdj, "contacts_list_ic_device.png"); break;
	case Storage::Account: {
		std::string path = ctCommonGetAccountIconPathByAddressbookId(row->addressbookId);
		if (!path.empty())
			icon = ctCommonCreateImage(layout, path.c_str(), nullptr);
		break;
	}
	}
	if (icon)
		elm_object_part_content_set(layout, "elm.swallow.content", icon);
	return layout;
}

void CtAddressbookPopup::__rowDelCb(void* data, Evas_Object*)
{
	delete static_cast<Row*>(data);
}

void CtAddressbookPopup::__itemSelectedCb(void* data, Evas_Object*, void* eventInfo)
{
	WHIT();
	auto* row = static_cast<Row*>(data);
	row->popup->__onRowSelected(row, static_cast<Elm_Object_Item*>(eventInfo));
}

void CtAddressbookPopup::__onRowSelected(Row* row, Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	auto* group = static_cast<Evas_Object*>(evas_object_data_get(m_genlist, kRadioGroupKey));
	if (group)
		elm_radio_value_set(group, elm_genlist_item_index_get(item) - 1);
	m_selectedId = row->addressbookId;
	if (m_onResult) {
		auto onResult = m_onResult;
		onResult(m_selectedId);
	}
}
