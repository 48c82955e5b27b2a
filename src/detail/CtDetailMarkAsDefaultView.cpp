#include "CtDetailMarkAsDefaultView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtDetailDataBase.h"
#include "CtThemeMgr.h"
#include "WNaviframe.h"

#include <cstdlib>
#include <tuple>

namespace {

constexpr const char* kEdjFiles[] = {"contacts/contacts.edj", "contacts/detail_layout.edj"};
const char* const kTitleId = "IDS_PB_HEADER_SET_AS_DEFAULT_ABB2";

int intOf(contacts_record_h record, unsigned int property)
{
	int value = 0;
	int err = contacts_record_get_int(record, property, &value);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_get_int", err);
	return value;
}

std::string textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	contacts_record_get_str_p(record, property, &value);
	return value ? value : "";
}

// The linked contact with this id, owned by the data; null when none.
contacts_record_h contactOf(Eina_List* contacts, int contactId)
{
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		auto* contact = static_cast<contacts_record_h>(data);
		if (intOf(contact, _contacts_contact.id) == contactId)
			return contact;
	}
	return nullptr;
}

// The account texts of the contact's address book.
std::pair<std::string, std::string> accountTexts(contacts_record_h contact)
{
	if (!contact)
		return {};
	char* first = nullptr;
	char* second = nullptr;
	ctCommonGetAccountInforByAddressbookId(intOf(contact, _contacts_contact.address_book_id), &first, &second);
	std::pair<std::string, std::string> texts(first ? first : "", second ? second : "");
	free(first);
	free(second);
	return texts;
}

std::vector<contacts_record_h> recordsOf(Eina_List* list)
{
	std::vector<contacts_record_h> records;
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(list, l, data)
		records.push_back(static_cast<contacts_record_h>(data));
	return records;
}

// Pictures that stand for their contact: the service flags one per contact.
std::vector<contacts_record_h> choosablePictures(CtDetailDataBase* data)
{
	std::vector<contacts_record_h> pictures;
	std::vector<contacts_record_h> images = recordsOf(data->getImageList());
	if (images.size() < 2)
		return pictures;
	for (contacts_record_h image : images)
		if (intOf(image, _contacts_image_ex.extension_flag) == 1)
			pictures.push_back(image);
	return pictures;
}

} // namespace

CtDetailMarkAsDefaultView::CtDetailMarkAsDefaultView(CtDetailDataBase* data)
{
	WENTER();
	WPRET_M(!data, "Invalid param : data");
	m_personId = data->getPersonId();
	__collectPictures(data);
	__collectNames(data);
}

CtDetailMarkAsDefaultView::~CtDetailMarkAsDefaultView()
{
	WENTER();
}

bool CtDetailMarkAsDefaultView::hasChoice(CtDetailDataBase* data)
{
	return data && (choosablePictures(data).size() > 1 || eina_list_count(data->getNameList()) > 1);
}

void CtDetailMarkAsDefaultView::__collectPictures(CtDetailDataBase* data)
{
	std::vector<contacts_record_h> pictures = choosablePictures(data);
	if (pictures.size() < 2)
		return; // a single picture is no choice
	for (contacts_record_h image : pictures) {
		Entry entry;
		entry.kind = CtDetailMarkAsDefaultItem::Kind::Picture;
		entry.index = static_cast<int>(m_pictures.size());
		entry.id = intOf(image, _contacts_image.id);
		contacts_record_h contact = contactOf(data->getContactsList(), intOf(image, _contacts_image.contact_id));
		std::tie(entry.text1, entry.text2) = accountTexts(contact);
		// A book without a user name (the phone's own) says whose picture it is instead.
		if (entry.text2.empty() && contact)
			entry.text2 = textOf(contact, _contacts_contact.display_name);
		entry.path = textOf(image, _contacts_image.path);
		if (entry.id == data->getDefaultImageId())
			m_selectedPicture = m_initialPicture = entry.index;
		m_pictures.push_back(entry);
	}
	// Without a chosen default the person shows the picture of its thumbnail.
	const char* shown = data->getImageThumbnailPath();
	for (const Entry& entry : m_pictures)
		if (m_initialPicture < 0 && shown && entry.path == shown)
			m_selectedPicture = m_initialPicture = entry.index;
}

void CtDetailMarkAsDefaultView::__collectNames(CtDetailDataBase* data)
{
	std::vector<contacts_record_h> names = recordsOf(data->getNameList());
	if (names.size() < 2)
		return;
	for (contacts_record_h name : names) {
		Entry entry;
		entry.kind = CtDetailMarkAsDefaultItem::Kind::Name;
		entry.index = static_cast<int>(m_names.size());
		entry.id = intOf(name, _contacts_name.contact_id);
		contacts_record_h contact = contactOf(data->getContactsList(), entry.id);
		entry.text1 = contact ? textOf(contact, _contacts_contact.display_name) : "";
		entry.text2 = accountTexts(contact).first;
		if (entry.id == data->getNameContactId())
			m_selectedName = m_initialName = entry.index;
		m_names.push_back(entry);
	}
}

Evas_Object* CtDetailMarkAsDefaultView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	for (const char* edj : kEdjFiles) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "createBaseLayout() failed");
	CtThemeMgr::getInstance()->setObjectTheme(layout);
	m_genlist = elm_genlist_add(layout);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_object_part_content_set(layout, "elm.swallow.content", m_genlist);
	return layout;
}

void CtDetailMarkAsDefaultView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_object_item_part_text_set(naviItem, "elm.text.title", ContactsCommon::translate(kTitleId));
	__addTitleButtons(naviItem);
	__addGroup("IDS_PB_HEADER_CONTACT_PICTURE_ABB", m_pictures, &m_pictureRadio, m_selectedPicture);
	__addGroup("IDS_PB_BODY_NAME", m_names, &m_nameRadio, m_selectedName);
}

void CtDetailMarkAsDefaultView::__addTitleButtons(Elm_Object_Item* naviItem)
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is nullptr");
	Evas_Object* parent = naviframe->getEvasObj();
	Evas_Object* cancel = ctCommonCreateButton(parent, "naviframe/title_left", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB",
		__cancelClickedCb, this);
	// Cancel takes the place of the back button; themes without a left
	// title slot get it where Back would be.
	if (Evas_Object* back = elm_object_item_part_content_unset(naviItem, "elm.swallow.prev_btn"))
		evas_object_del(back);
	elm_object_item_part_content_set(naviItem, "title_left_btn", cancel);
	if (elm_object_item_part_content_get(naviItem, "title_left_btn") != cancel)
		elm_object_item_part_content_set(naviItem, "elm.swallow.prev_btn", cancel);
	m_doneButton = ctCommonCreateButton(parent, "naviframe/title_right", "IDS_TPLATFORM_ACBUTTON_DONE_ABB",
		__doneClickedCb, this);
	elm_object_disabled_set(m_doneButton, EINA_TRUE);
	elm_object_item_part_content_set(naviItem, "title_right_btn", m_doneButton);
}

void CtDetailMarkAsDefaultView::__addGroup(const char* titleId, const std::vector<Entry>& entries,
		Evas_Object** radio, int selected)
{
	if (entries.empty())
		return;
	*radio = elm_radio_add(m_genlist);
	elm_radio_state_value_set(*radio, -1);
	elm_radio_value_set(*radio, selected);
	evas_object_hide(*radio);
	Entry title;
	title.kind = CtDetailMarkAsDefaultItem::Kind::GroupIndex;
	title.text1 = titleId;
	Elm_Object_Item* titleItem = nullptr;
	__appendRow(title, nullptr);
	titleItem = elm_genlist_last_item_get(m_genlist);
	if (titleItem)
		elm_genlist_item_select_mode_set(titleItem, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
	for (const Entry& entry : entries)
		__appendRow(entry, *radio);
}

void CtDetailMarkAsDefaultView::__appendRow(const Entry& entry, Evas_Object* radio)
{
	auto* row = new CtDetailMarkAsDefaultItem(entry, radio,
		[this](CtDetailMarkAsDefaultItem* chosen) { __onRowSelected(chosen); });
	Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
		ELM_GENLIST_ITEM_NONE, row->getSelectCb(), nullptr);
	if (!item) {
		WERROR("elm_genlist_item_append() failed");
		delete row;
		return;
	}
	row->setElmObjectItem(item);
	row->attachToView(this);
}

void CtDetailMarkAsDefaultView::__onRowSelected(CtDetailMarkAsDefaultItem* row)
{
	const Entry& entry = row->getEntry();
	bool isPicture = entry.kind == CtDetailMarkAsDefaultItem::Kind::Picture;
	(isPicture ? m_selectedPicture : m_selectedName) = entry.index;
	if (Evas_Object* radio = isPicture ? m_pictureRadio : m_nameRadio)
		elm_radio_value_set(radio, entry.index);
	__updateDoneButton();
}

void CtDetailMarkAsDefaultView::__updateDoneButton()
{
	bool pictureChanged = m_selectedPicture != -1 && m_selectedPicture != m_initialPicture;
	bool nameChanged = m_selectedName != -1 && m_selectedName != m_initialName;
	if (m_doneButton)
		elm_object_disabled_set(m_doneButton, (pictureChanged || nameChanged) ? EINA_FALSE : EINA_TRUE);
}

// Only a choice that differs from the current one is written. A contact
// unlinked meanwhile is refused by the service and leaves the person as it was.
void CtDetailMarkAsDefaultView::__doSetDefault()
{
	WENTER();
	struct Choice {
		contacts_person_property_e property;
		const std::vector<Entry>& entries;
		int selected;
		int initial;
	};
	const Choice choices[] = {
		{CONTACTS_PERSON_PROPERTY_IMAGE, m_pictures, m_selectedPicture, m_initialPicture},
		{CONTACTS_PERSON_PROPERTY_NAME_CONTACT, m_names, m_selectedName, m_initialName},
	};
	for (const Choice& choice : choices) {
		if (choice.selected < 0 || choice.selected == choice.initial
			|| choice.selected >= static_cast<int>(choice.entries.size()))
			continue;
		int err = contacts_person_set_default_property(choice.property, m_personId, choice.entries[choice.selected].id);
		if (err != CONTACTS_ERROR_NONE)
			WWARNING("contacts_person_set_default_property() Failed(%d)", err);
	}
}

void CtDetailMarkAsDefaultView::__cancelClickedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtDetailMarkAsDefaultView*>(data)->popOut();
}

void CtDetailMarkAsDefaultView::__doneClickedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* view = static_cast<CtDetailMarkAsDefaultView*>(data);
	view->__doSetDefault();
	view->popOut();
}

void CtDetailMarkAsDefaultView::onLanguageChanged()
{
	WENTER();
	if (Elm_Object_Item* naviItem = getNaviItem())
		elm_object_item_part_text_set(naviItem, "elm.text.title", ContactsCommon::translate(kTitleId));
	if (m_genlist)
		elm_genlist_realized_items_update(m_genlist);
}
