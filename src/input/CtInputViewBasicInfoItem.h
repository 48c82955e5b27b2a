#ifndef _CT_INPUT_VIEW_BASIC_INFO_ITEM_H_
#define _CT_INPUT_VIEW_BASIC_INFO_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"

#include <array>
#include <functional>
#include <memory>
#include <string>

// The first row of the contact edit list: the picture and every name field
// (the name or its five parts, the phonetic name or its three parts, the
// nickname, company and job title) stacked in one row. Field groups other
// than the name are shown when they hold text or when the owner shows them.
class CtInputViewBasicInfoItem : public CtInputViewGenlistItem {
public:
	enum ITEM_DELETED { PHONETIC_NAME = 0, NICKNAME = 1, ORGANISATION = 2 };
	enum FocusGroup { FOCUS_NAME = 0, FOCUS_PHONETIC = 1, FOCUS_NICKNAME = 2, FOCUS_ORGANISATION = 3 };
	enum Field {
		NAME, PREFIX, FIRST, MIDDLE, LAST, SUFFIX,
		PHONETIC, PHONETIC_FIRST, PHONETIC_MIDDLE, PHONETIC_LAST,
		NICKNAME_FIELD, COMPANY, JOB_TITLE, FIELD_COUNT
	};
	enum class Mode { Contact, MyProfile };

	struct Callbacks {
		std::function<void()> changed;
		std::function<void(ITEM_DELETED group)> groupDeleted;
		std::function<void(Evas_Object* entry, Elm_Object_Item* item)> activated;
		std::function<void()> showKeypad;
		std::function<void(Evas_Object* entry)> nameChanged;
		std::function<void()> pictureClicked;
	};

	static constexpr int kCallerIdLaunchType = 41;

	// `nameEntrySlot` (may be null) receives the current name entry.
	CtInputViewBasicInfoItem(std::shared_ptr<CtData> data, Evas_Object** nameEntrySlot, Callbacks callbacks,
			int launchType, Mode mode = Mode::Contact, bool withPicture = true);
	~CtInputViewBasicInfoItem() override;

	void setPhoneticShown(bool shown) { m_phoneticShown = shown; }
	bool getPhoneticShown() const { return m_phoneticShown; }
	void setNicknameShown(bool shown) { m_nicknameShown = shown; }
	bool getNicknameShown() const { return m_nicknameShown; }
	void setOrganisationShown(bool shown) { m_organisationShown = shown; }
	bool getOrganisationShown() const { return m_organisationShown; }
	void setFocusGroup(FocusGroup group) { m_focusGroup = group; }
	// Whether any field of the group holds text.
	bool groupHasText(ITEM_DELETED group) const;
	// The keypad may come up when the name entry of a new contact is first shown.
	void setMayRaiseKeypad(bool may) { m_mayRaiseKeypad = may; }

	bool isNameExpanded() const { return m_nameExpanded; }
	bool isPhoneticExpanded() const { return m_phoneticExpanded; }
	// Presses the expand (or collapse) button of the name or phonetic name.
	void toggleNameExpanded();
	void togglePhoneticExpanded();
	// Hides the group, clears its values and rebuilds the fields (the owner's
	// answer to the group's delete button).
	void removeGroup(ITEM_DELETED group);
	// Rebuilds the field stack (after a group was shown or hidden).
	void refreshFields();
	// The entry of `field` while it is shown (null otherwise).
	Evas_Object* getFieldEntry(Field field) const { return m_entries[field]; }
	bool isProfileSharingStorage() const;
	bool isEasySignUpStorage() const;

	static const char* getGuideTextId(Field field);
	static int getMaxChars(Field field);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassNew() override;

public: // CtInputViewGenlistItem
	bool getIsChanged() override;
	bool getIsEmpty() override;

protected:
	std::string getText(Evas_Object* genlist, const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	struct FieldSlot {
		CtInputViewBasicInfoItem* row;
		Field field;
	};
	std::string __readField(Field field);
	void __writeField(Field field, const char* text);
	Evas_Object* __createFieldBox(Evas_Object* genlist);
	void __addField(Evas_Object* box, Field field);
	Evas_Object* __createFieldButton(Evas_Object* parent, Field field);
	Evas_Object* __createPicture(Evas_Object* genlist);
	void __entryTextChanged(Field field, Evas_Object* entry);
	bool __compareWithOldVal(Field field, const std::string& text) const;
	bool __isShown(Field field) const;
	void __focusFirstOfGroup();
	void __scheduleRefresh();
	static void __entryChangedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryActivatedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __fieldButtonClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __defaultImageClickedCb(void* data, Evas_Object* obj, const char* emission, const char* source);

	std::shared_ptr<CtData> m_data;
	Evas_Object** m_nameEntrySlot;
	Callbacks m_callbacks;
	int m_launchType;
	Mode m_mode;
	bool m_withPicture;
	bool m_mayRaiseKeypad = false;
	bool m_keypadRaised = false;
	bool m_nameExpanded = false;
	bool m_phoneticExpanded = false;
	bool m_phoneticShown = false;
	bool m_nicknameShown = false;
	bool m_organisationShown = false;
	int m_focusGroup = -1;
	bool m_focusAfterRebuild = false;
	std::array<bool, FIELD_COUNT> m_hasText = {};
	std::array<std::string, FIELD_COUNT> m_initial;
	std::array<Evas_Object*, FIELD_COUNT> m_entries = {};
	std::array<FieldSlot, FIELD_COUNT> m_slots;
	app_assist::WUiTimerHandle m_refresh;
	app_assist::WUiTimerHandle m_focusTimer;
};

#endif
