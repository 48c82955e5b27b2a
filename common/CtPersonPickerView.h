#ifndef _CT_PERSON_PICKER_VIEW_H_
#define _CT_PERSON_PICKER_VIEW_H_

#include "CtView.h"
#include "WUiTimer.h"
#include "WView.h"

#include <string>
#include <vector>

// A searchable list of people (or of one person's contacts) on the contacts
// service: an entry on top filters the rows by name, tapping a row chooses
// it. The list follows changes of the store while the view lives.
// Subclasses say what the rows are and what choosing one does.
class CtPersonPickerView : public app_assist::WView, public CtView {
public:
	struct Entry {
		int id = 0;
		std::string name;
		std::string subText;
	};

	// The rows shown now, in list order (the filter applied).
	std::vector<Entry> getShownEntries() const;
	// Filters by `text` (plain UTF-8, matched case-insensitively anywhere in
	// the name); as typing in the search entry does.
	void setSearchText(const char* text);
	const std::string& getSearchText() const { return m_searchText; }
	Evas_Object* getSearchEntry() const { return m_entry; }
	Evas_Object* getGenlist() const { return m_genlist; }

protected:
	explicit CtPersonPickerView(const char* titleId);
	~CtPersonPickerView() override;

	// The rows to offer, read from the contacts service.
	virtual std::vector<Entry> loadEntries() = 0;
	// The user chose `entry` (runs after the tap, from the main loop).
	virtual void onChosen(const Entry& entry) = 0;

	// Reads the rows again and shows them with the current filter.
	void reload();
	// Every person of the contacts service but `excludedPersonId`, by
	// display name. Empty, logged, when the service cannot be read.
	static std::vector<Entry> loadPersons(int excludedPersonId);

	// app_assist::WView
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onPushed(Elm_Object_Item* naviItem) override;
	void onDestroy() override;
	// CtView
	void onLanguageChanged() override;

private:
	void __connectToStore();
	void __disconnectFromStore();
	Evas_Object* __createSearchEntry(Evas_Object* parent);
	Evas_Object* __createGenlist(Evas_Object* parent);
	void __fillList();
	void __choose(int id);
	static void __searchChangedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __personsChangedCb(const char* viewUri, void* data);

	std::string m_titleId;
	std::vector<Entry> m_entries;
	std::string m_searchText;
	Evas_Object* m_entry = nullptr;
	Evas_Object* m_genlist = nullptr;
	app_assist::WUiTimerHandle m_chooseIdler;
	bool m_connected = false;
	bool m_watching = false;
};

#endif
