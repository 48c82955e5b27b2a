#ifndef _CT_PRIMARY_INPUT_VIEW_NAME_ITEM_H_
#define _CT_PRIMARY_INPUT_VIEW_NAME_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"

#include <functional>
#include <memory>

// The name row of the emergency-contact forms: the picture and one name field.
class CtPrimaryInputViewNameItem : public CtInputViewGenlistItem {
public:
	struct Callbacks {
		std::function<void()> changed;
		std::function<void(Evas_Object* entry, Elm_Object_Item* item)> activated;
		std::function<void(Evas_Object* entry)> nameChanged;
		std::function<void()> pictureClicked;
	};

	CtPrimaryInputViewNameItem(std::shared_ptr<CtData> data, Callbacks callbacks, int launchType);
	~CtPrimaryInputViewNameItem() override;

	Evas_Object* getEntry() const { return m_entry; }

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

public: // CtInputViewGenlistItem
	bool getIsChanged() override;
	bool getIsEmpty() override;

protected:
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	bool __compareWithOldVal(const std::string& text) const { return text != m_initialName; }
	static void __nameChangedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __activatedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __pictureClickedCb(void* data, Evas_Object* obj, const char* emission, const char* source);

	std::shared_ptr<CtData> m_data;
	Callbacks m_callbacks;
	int m_launchType;
	std::string m_initialName;
	Evas_Object* m_entry = nullptr;
};

#endif
