#ifndef _CT_SHARE_CONTACT_VIEW_ITEM_H_
#define _CT_SHARE_CONTACT_VIEW_ITEM_H_

#include "CtDetailDataBase.h"
#include "WGenlistItem.h"

#include <string>

// One field of the share screen's list: a number, e-mail, address,
// messenger, web site, relationship, event or note of the person, with a
// check that shows whether it is marked for sharing.
class CtShareContactViewItem : public app_assist::WGenlistItem {
public:
	// `record` is owned by `data`, which must outlive the row; `kind` is the
	// view URI of the record's kind (such as _contacts_number._uri).
	CtShareContactViewItem(CtDetailDataBase* data, contacts_record_h record, const char* kind);

	bool isMarked() const { return m_marked; }
	// Updates the check of a shown row.
	void setMarked(bool marked);
	const std::string& getKind() const { return m_kind; }
	contacts_record_h getRecord() const { return m_record; }
	// The kind and the stored id of the field: stays the same across reloads
	// of the same person.
	std::string getFieldKey() const;

	// What the shared text says of the field: its label (empty for notes)
	// and its value, as plain text.
	std::string getShareLabel() const;
	std::string getShareValue() const;

public: // app_assist::WGenlistItem
	Elm_Gen_Item_Class* getItemClassStatic() override;

private:
	bool __isMultiline() const;
	bool __isKind(const char* uri) const;
	int __type(unsigned int typeProperty) const;
	const char* __custom(unsigned int labelProperty) const;
	std::string __eventDate() const;
	std::string __text(const char* part) const;
	Evas_Object* __content(Evas_Object* genlist, const char* part) const;

	static char* __textGetCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __contentGetCb(void* data, Evas_Object* obj, const char* part);

	CtDetailDataBase* m_data;
	contacts_record_h m_record;
	std::string m_kind;
	bool m_marked = false;
};

#endif
