#ifndef _CT_PREDICTION_LIST_CONTROL_H_
#define _CT_PREDICTION_LIST_CONTROL_H_

#include "WControl.h"

#include <contacts.h>

#include <functional>
#include <memory>
#include <string>

class CtPredictionListModel;

// The floating list of existing contacts under the name field of a new
// contact. Choosing a row hands a new record of that contact (the callback
// destroys it) to the selected callback and closes the list; the back key
// closes it too. Sized for the first three rows, the rest scroll.
class CtPredictionListControl : public app_assist::WControl {
public:
	using SelectedCallback = std::function<void(contacts_record_h contact)>;

	// `basicInfoRow` holds the field of `nameEntry` in its "elm.icon.1" box;
	// without it the list is placed under `nameEntry` itself.
	CtPredictionListControl(std::shared_ptr<CtPredictionListModel> model, Evas_Object* nameEntry,
		Elm_Object_Item* basicInfoRow, SelectedCallback onSelected);

	// Loads `searchName` unless it is the text already shown; rebuilds the
	// rows and resizes when anything matches.
	void updatePredictionList(const std::string& searchName);
	// Places the list under the name field, as high as its first three rows.
	void resize();

	// False once a reload found nothing (the rows still show the last offer).
	bool hasPredictions() const;
	Evas_Object* getGenlist() const { return m_genlist; }
	Evas_Object* getNameEntry() const { return m_nameEntry; }
	// Units of height for the first three rows: 96 per one-line and 144 per
	// two-line row, plus 4 for the border, before scaling (a unit of the
	// 720-wide design grid is half a pixel at scale 1).
	int getUnscaledHeight() const;

	// The name with the first word-start match of `search` coloured, as
	// markup; the escaped plain name when nothing starts a word.
	static std::string getSearchHighlightName(const char* name, const std::string& search);

	// WControl
	const char* getClassName() override;

protected:
	~CtPredictionListControl() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;

private:
	friend class __PredictionListItem;
	void __appendItems();
	void __onRowSelected(int contactId);
	Evas_Object* __getFocusedEditfield();
	static void __backCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __realizedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __nameEntryDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	std::shared_ptr<CtPredictionListModel> m_model;
	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_nameEntry = nullptr;
	Elm_Object_Item* m_basicInfoRow = nullptr;
	SelectedCallback m_onSelected;
	int m_oneLineCount = 0;
	int m_twoLineCount = 0;
};

#endif
