#include "CtInputViewBasicInfoItem.h"

#include "ContactsDebug.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtInputViewCallerIdPicture.h"
#include "CtEsuAgentMgr.h"

#include <app_preference.h>
#include <ui_extension.h>

#include <cstring>

namespace {

using Field = CtInputViewBasicInfoItem::Field;

struct FieldInfo {
	const char* guideTextId;
	int maxChars;
	bool nameInput;
};

const FieldInfo kFields[] = {
	{"IDS_PB_BODY_NAME", 5005, true},
	{"IDS_PB_BODY_TITLE_M_NAMEPREFIX", 1000, true},
	{"IDS_PB_OPT_FIRST_NAME", 1000, true},
	{"IDS_PB_BODY_MIDDLE_NAME_ABB", 1000, true},
	{"IDS_PB_BODY_LAST_NAME_ABB", 1000, true},
	{"IDS_PB_BODY_NAME_SUFFIX_ABB", 1000, true},
	{"IDS_PB_BODY_PHONETIC_NAME_ABB", 3002, true},
	{"IDS_PB_NPBODY_PHON_1ST_NAME_ABB", 1000, true},
	{"IDS_PB_NPBODY_PHON_MID_NAME_ABB", 1000, true},
	{"IDS_PB_NPBODY_PHON_LAST_NAME_ABB", 1000, true},
	{"IDS_PB_BODY_NICKNAME_ABB", 1000, false},
	{"IDS_PB_BODY_COMPANY_ABB", 1000, false},
	{"IDS_PB_BODY_JOB_TITLE_ABB", 1000, false},
};


std::string text(const char* value)
{
	return value ? value : "";
}

} // namespace

CtInputViewBasicInfoItem::CtInputViewBasicInfoItem(std::shared_ptr<CtData> data, Evas_Object** nameEntrySlot,
		Callbacks callbacks, int launchType, Mode mode, bool withPicture)
	: m_data(std::move(data)), m_nameEntrySlot(nameEntrySlot), m_callbacks(std::move(callbacks)),
	  m_launchType(launchType), m_mode(mode), m_withPicture(withPicture)
{
	for (int i = 0; i < FIELD_COUNT; ++i) {
		m_slots[i] = {this, static_cast<Field>(i)};
		m_initial[i] = __readField(static_cast<Field>(i));
		m_hasText[i] = !m_initial[i].empty();
	}
	m_phoneticShown = groupHasText(PHONETIC_NAME);
	m_nicknameShown = groupHasText(NICKNAME);
	m_organisationShown = groupHasText(ORGANISATION);
}

CtInputViewBasicInfoItem::~CtInputViewBasicInfoItem()
{
	app_assist::WUiTimer::destroy(m_refresh);
	app_assist::WUiTimer::destroy(m_focusTimer);
	for (int i = 0; i < FIELD_COUNT; ++i)
		if (m_entries[i])
			evas_object_event_callback_del_full(m_entries[i], EVAS_CALLBACK_DEL, __entryDelCb, &m_slots[i]);
}

const char* CtInputViewBasicInfoItem::getGuideTextId(Field field)
{
	return kFields[field].guideTextId;
}

int CtInputViewBasicInfoItem::getMaxChars(Field field)
{
	return kFields[field].maxChars;
}

bool CtInputViewBasicInfoItem::isProfileSharingStorage() const
{
	const char* name = m_data->getAddressbookName();
	return name && strcmp(name, translate("IDS_PB_MBODY_PROFILE_SHARING")) == 0;
}

bool CtInputViewBasicInfoItem::isEasySignUpStorage() const
{
	int book = CtEsuAgentMgr::getInstance()->getEasySignUpAddressBookId();
	return book >= 0 && book == m_data->getAddressbookId();
}

std::string CtInputViewBasicInfoItem::__readField(Field field)
{
	switch (field) {
	case NAME: return m_data->getFullName();
	case PREFIX: return text(m_data->getPrefixName());
	case FIRST: return text(m_data->getFirstName());
	case MIDDLE: return text(m_data->getMiddleName());
	case LAST: return text(m_data->getLastName());
	case SUFFIX: return text(m_data->getSuffixName());
	case PHONETIC: return m_data->getPhoneticFullName();
	case PHONETIC_FIRST: return text(m_data->getPhoneticFirstName());
	case PHONETIC_MIDDLE: return text(m_data->getPhoneticMiddleName());
	case PHONETIC_LAST: return text(m_data->getPhoneticLastName());
	case NICKNAME_FIELD: return text(m_data->getNickname());
	case COMPANY: return m_data->getCompany();
	case JOB_TITLE: return text(m_data->getJobTitle());
	default: return std::string();
	}
}

void CtInputViewBasicInfoItem::__writeField(Field field, const char* value)
{
	switch (field) {
	case NAME:
		if (m_data->getFullName() != value)
			m_data->setFullName(value);
		break;
	case PREFIX: m_data->setPrefixName(value); break;
	case FIRST: m_data->setFirstName(value); break;
	case MIDDLE: m_data->setMiddleName(value); break;
	case LAST: m_data->setLastName(value); break;
	case SUFFIX: m_data->setSuffixName(value); break;
	case PHONETIC:
		if (m_data->getPhoneticFullName() != value)
			m_data->setPhoneticFullName(value);
		break;
	case PHONETIC_FIRST: m_data->setPhoneticFirstName(value); break;
	case PHONETIC_MIDDLE: m_data->setPhoneticMiddleName(value); break;
	case PHONETIC_LAST: m_data->setPhoneticLastName(value); break;
	case NICKNAME_FIELD: m_data->setNickname(value); break;
	case COMPANY: m_data->setCompany(value); break;
	case JOB_TITLE: m_data->setJobTitle(value); break;
	default: break;
	}
}

bool CtInputViewBasicInfoItem::groupHasText(ITEM_DELETED group) const
{
	switch (group) {
	case PHONETIC_NAME:
		return m_hasText[PHONETIC] || m_hasText[PHONETIC_FIRST] || m_hasText[PHONETIC_MIDDLE] || m_hasText[PHONETIC_LAST];
	case NICKNAME: return m_hasText[NICKNAME_FIELD];
	case ORGANISATION: return m_hasText[COMPANY] || m_hasText[JOB_TITLE];
	}
	return false;
}

bool CtInputViewBasicInfoItem::__isShown(Field field) const
{
	switch (field) {
	case NAME: return !m_nameExpanded;
	case PREFIX: case FIRST: case MIDDLE: case LAST: case SUFFIX: return m_nameExpanded;
	case PHONETIC: return m_phoneticShown && !m_phoneticExpanded;
	case PHONETIC_FIRST: case PHONETIC_MIDDLE: case PHONETIC_LAST: return m_phoneticShown && m_phoneticExpanded;
	case NICKNAME_FIELD: return m_nicknameShown;
	case COMPANY: case JOB_TITLE: return m_organisationShown;
	default: return false;
	}
}

bool CtInputViewBasicInfoItem::__compareWithOldVal(Field field, const std::string& value) const
{
	return value != m_initial[field];
}

bool CtInputViewBasicInfoItem::getIsChanged()
{
	if (CtInputViewGenlistItem::getIsChanged())
		return true;
	for (int i = 0; i < FIELD_COUNT; ++i)
		if (__compareWithOldVal(static_cast<Field>(i), __readField(static_cast<Field>(i))))
			return true;
	return false;
}

bool CtInputViewBasicInfoItem::getIsEmpty()
{
	for (int i = 0; i < FIELD_COUNT; ++i)
		if (__isShown(static_cast<Field>(i)) && m_hasText[i])
			return false;
	return true;
}

Elm_Genlist_Item_Class* CtInputViewBasicInfoItem::getItemClassNew()
{
	const char* style;
	bool dim = isEasySignUpStorage();
	if (m_withPicture)
		style = dim ? "baseinfo.image.contract.dim" : "baseinfo.image.contract";
	else
		style = dim ? "baseinfo.contract.dim" : "baseinfo.contract";
	return createItemClass(style);
}

std::string CtInputViewBasicInfoItem::getText(Evas_Object*, const char* part)
{
	if (!m_withPicture && strcmp(part, "elm.text") == 0)
		return translate("IDS_PB_BODY_NAME");
	return std::string();
}

Evas_Object* CtInputViewBasicInfoItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.1") == 0)
		return __createFieldBox(genlist);
	if (strcmp(part, "elm.icon") == 0 && m_withPicture)
		return __createPicture(genlist);
	return nullptr;
}

Evas_Object* CtInputViewBasicInfoItem::__createFieldBox(Evas_Object* genlist)
{
	Evas_Object* box = elm_box_add(genlist);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, 0.0);
	for (int i = 0; i < FIELD_COUNT; ++i)
		if (__isShown(static_cast<Field>(i)))
			__addField(box, static_cast<Field>(i));
	if (m_phoneticShown && m_phoneticExpanded)
		ctCommonInsertUsageLog("0041", nullptr);
	if (m_nameEntrySlot)
		*m_nameEntrySlot = m_entries[m_nameExpanded ? FIRST : NAME];

	if (m_focusGroup >= 0 || m_focusAfterRebuild) {
		// The group's first entry takes the focus once the row is on screen.
		app_assist::WUiTimer::destroy(m_focusTimer);
		m_focusTimer = app_assist::WUiTimer::addTimer(0.1, [this](void*) {
			__focusFirstOfGroup();
			return false;
		}, nullptr, box);
	} else if (m_data->getContactId() <= 0 && !m_keypadRaised) {
		bool hide = false;
		preference_get_boolean("hide_storage_popup", &hide);
		if ((hide || m_mayRaiseKeypad) && m_callbacks.showKeypad) {
			m_keypadRaised = true;
			m_callbacks.showKeypad();
		}
	}
	evas_object_show(box);
	return box;
}

void CtInputViewBasicInfoItem::__focusFirstOfGroup()
{
	Field first = NAME;
	switch (m_focusGroup) {
	case FOCUS_PHONETIC: first = m_phoneticExpanded ? PHONETIC_FIRST : PHONETIC; break;
	case FOCUS_NICKNAME: first = NICKNAME_FIELD; break;
	case FOCUS_ORGANISATION: first = COMPANY; break;
	default: first = m_nameExpanded ? PREFIX : NAME; break;
	}
	m_focusAfterRebuild = false;
	m_focusGroup = -1;
	if (Evas_Object* entry = m_entries[first]) {
		elm_object_focus_set(entry, EINA_TRUE);
		elm_entry_cursor_end_set(entry);
	}
}

void CtInputViewBasicInfoItem::__addField(Evas_Object* box, Field field)
{
	bool esu = isProfileSharingStorage() && (field == NAME || field == PHONETIC);
	Evas_Object* layout = ctCommonCreateLayout(box, "contacts/contacts.edj",
			esu ? "baseinfo_sub_layout_esu" : "baseinfo_sub_layout");
	WPRET_M(!layout, "ctCommonCreateLayout() is fail");
	evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(layout, EVAS_HINT_FILL, 0.0);
	Evas_Object* editField = createEditField(layout, kFields[field].guideTextId, false, kFields[field].maxChars);
	Evas_Object* entry = uxt_edit_field_layout_get_entry(editField);
	if (kFields[field].nameInput)
		elm_entry_input_panel_imdata_set(entry, "type=name&action=disable_emoticons",
				strlen("type=name&action=disable_emoticons"));
	std::string value = __readField(field);
	if (!value.empty())
		setEntryText(entry, value.c_str());
	if (isProfileSharingStorage() && (field == NAME || field == PHONETIC || (field >= PREFIX && field <= SUFFIX))) {
		elm_entry_editable_set(entry, EINA_FALSE);
		elm_object_disabled_set(entry, EINA_TRUE);
	}
	for (const char* signal : {"changed", "preedit,changed"})
		evas_object_smart_callback_add(entry, signal, __entryChangedCb, &m_slots[field]);
	evas_object_smart_callback_add(entry, "activated", __entryActivatedCb, &m_slots[field]);
	if (m_entries[field])
		evas_object_event_callback_del_full(m_entries[field], EVAS_CALLBACK_DEL, __entryDelCb, &m_slots[field]);
	m_entries[field] = entry;
	evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, __entryDelCb, &m_slots[field]);

	elm_object_part_content_set(layout, "elm.icon.1", editField);
	if (Evas_Object* button = __createFieldButton(layout, field))
		elm_object_part_content_set(layout, "elm.icon.2", button);
	elm_box_pack_end(box, layout);
	evas_object_show(layout);
}

Evas_Object* CtInputViewBasicInfoItem::__createFieldButton(Evas_Object* parent, Field field)
{
	const char* icon = nullptr;
	if (field == NAME || field == PHONETIC)
		icon = "core_icon_expand_close.png";
	else if (field == PREFIX || field == PHONETIC_FIRST)
		icon = "core_icon_expand_open.png";
	else if (field == NICKNAME_FIELD || field == COMPANY)
		return ctCommonCreateDeleteImage(parent, __fieldButtonClickedCb, &m_slots[field]);
	if (!icon)
		return nullptr;
	Evas_Object* button = uxt_button_add(parent, "arrow_btn_with_swallow");
	Evas_Object* image = ctCommonCreateImage(button, "contacts/image_layout.edj", icon, "A03O004");
	elm_object_content_set(button, image);
	evas_object_smart_callback_add(button, "clicked", __fieldButtonClickedCb, &m_slots[field]);
	return button;
}

Evas_Object* CtInputViewBasicInfoItem::__createPicture(Evas_Object* genlist)
{
	bool touchable = m_launchType != kCallerIdLaunchType && !isEasySignUpStorage();
	return CtInputViewCallerIdPicture::create(genlist, m_data->getImagePath(), touchable, __defaultImageClickedCb, this);
}

void CtInputViewBasicInfoItem::__entryTextChanged(Field field, Evas_Object* entry)
{
	std::string value = getEntryUtf8(entry);
	if (value == __readField(field) && m_hasText[field] == !value.empty())
		return;
	__writeField(field, value.c_str());
	m_hasText[field] = !value.empty();
	// Changed is what the fields hold now: a field typed into and emptied again is not.
	setIsChanged(false);
	setIsChanged(getIsChanged());
	if (m_callbacks.changed)
		m_callbacks.changed();
	if (field == NAME && m_callbacks.nameChanged)
		m_callbacks.nameChanged(entry);
}

void CtInputViewBasicInfoItem::toggleNameExpanded()
{
	if (isProfileSharingStorage())
		return;
	m_nameExpanded = !m_nameExpanded;
	m_focusAfterRebuild = true;
	m_focusGroup = FOCUS_NAME;
	__scheduleRefresh();
}

void CtInputViewBasicInfoItem::togglePhoneticExpanded()
{
	if (isProfileSharingStorage())
		return;
	m_phoneticExpanded = !m_phoneticExpanded;
	m_focusAfterRebuild = true;
	m_focusGroup = FOCUS_PHONETIC;
	__scheduleRefresh();
}

void CtInputViewBasicInfoItem::removeGroup(ITEM_DELETED group)
{
	switch (group) {
	case PHONETIC_NAME:
		m_phoneticShown = false;
		for (Field field : {PHONETIC_FIRST, PHONETIC_MIDDLE, PHONETIC_LAST})
			__writeField(field, "");
		for (Field field : {PHONETIC, PHONETIC_FIRST, PHONETIC_MIDDLE, PHONETIC_LAST})
			m_hasText[field] = false;
		break;
	case NICKNAME:
		m_nicknameShown = false;
		__writeField(NICKNAME_FIELD, "");
		m_hasText[NICKNAME_FIELD] = false;
		break;
	case ORGANISATION:
		m_organisationShown = false;
		for (Field field : {COMPANY, JOB_TITLE}) {
			__writeField(field, "");
			m_hasText[field] = false;
		}
		break;
	}
	__scheduleRefresh();
}

void CtInputViewBasicInfoItem::refreshFields()
{
	Elm_Object_Item* item = getElmObjectItem();
	WPRET_M(!item, "getElmObjectItem() is NULL");
	elm_genlist_item_fields_update(item, "elm.icon.1", ELM_GENLIST_ITEM_FIELD_CONTENT);
}

void CtInputViewBasicInfoItem::__scheduleRefresh()
{
	Elm_Object_Item* item = getElmObjectItem();
	WPRET_M(!item, "getElmObjectItem() is NULL");
	// The pressed button is part of what the refresh deletes: rebuild after its callback.
	app_assist::WUiTimer::destroy(m_refresh);
	m_refresh = app_assist::WUiTimer::addIdler([this](void*) {
		refreshFields();
		return false;
	}, nullptr, elm_object_item_widget_get(item));
}

void CtInputViewBasicInfoItem::__entryChangedCb(void* data, Evas_Object* obj, void*)
{
	auto* slot = static_cast<FieldSlot*>(data);
	slot->row->__entryTextChanged(slot->field, obj);
}

void CtInputViewBasicInfoItem::__entryActivatedCb(void* data, Evas_Object* obj, void*)
{
	auto* slot = static_cast<FieldSlot*>(data);
	if (slot->row->m_callbacks.activated)
		slot->row->m_callbacks.activated(obj, slot->row->getElmObjectItem());
}

void CtInputViewBasicInfoItem::__fieldButtonClickedCb(void* data, Evas_Object*, void*)
{
	auto* slot = static_cast<FieldSlot*>(data);
	CtInputViewBasicInfoItem* row = slot->row;
	switch (slot->field) {
	case NAME: case PREFIX: row->toggleNameExpanded(); break;
	case PHONETIC: case PHONETIC_FIRST: row->togglePhoneticExpanded(); break;
	case NICKNAME_FIELD:
		if (row->m_callbacks.groupDeleted)
			row->m_callbacks.groupDeleted(NICKNAME);
		break;
	case COMPANY:
		if (row->m_callbacks.groupDeleted)
			row->m_callbacks.groupDeleted(ORGANISATION);
		break;
	default: break;
	}
}

void CtInputViewBasicInfoItem::__entryDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* slot = static_cast<FieldSlot*>(data);
	if (slot->row->m_entries[slot->field] == obj)
		slot->row->m_entries[slot->field] = nullptr;
	if (slot->row->m_nameEntrySlot && *slot->row->m_nameEntrySlot == obj)
		*slot->row->m_nameEntrySlot = nullptr;
}

void CtInputViewBasicInfoItem::__defaultImageClickedCb(void* data, Evas_Object* obj, const char*, const char*)
{
	auto* row = static_cast<CtInputViewBasicInfoItem*>(data);
	if (row->m_launchType == kCallerIdLaunchType) {
		WDEBUG("Set image as ug.");
		return;
	}
	elm_object_signal_emit(obj, "play,sound", "");
	if (row->m_callbacks.pictureClicked)
		row->m_callbacks.pictureClicked();
}
