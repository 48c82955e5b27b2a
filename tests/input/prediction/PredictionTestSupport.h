// A fresh store per test with persons to predict, and a window holding a
// plain name entry that stands in for the edit form's name field.
#pragma once

#include "../../data/detail/DetailTestStore.h"

#include "CtView.h"
#include "ScreenHarness.h"
#include "WView.h"

#include <Ecore_Evas.h>
#include <Elementary.h>

#include <memory>
#include <string>

namespace ct::test {

// A screen holding one name entry at its top, standing in for the edit form.
class FormView : public app_assist::WView {
public:
	Evas_Object* form = nullptr;
	Evas_Object* entry = nullptr;

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		form = elm_box_add(parent);
		elm_box_align_set(form, 0.5, 0.0);
		evas_object_size_hint_weight_set(form, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
		entry = elm_entry_add(form);
		elm_entry_single_line_set(entry, EINA_TRUE);
		elm_object_part_text_set(entry, "elm.guide", "Name");
		evas_object_size_hint_weight_set(entry, EVAS_HINT_EXPAND, 0);
		evas_object_size_hint_align_set(entry, EVAS_HINT_FILL, 0);
		evas_object_size_hint_min_set(entry, 0, 80);
		elm_box_pack_end(form, entry);
		evas_object_show(entry);
		Evas_Object* rest = evas_object_rectangle_add(evas_object_evas_get(form));
		evas_object_color_set(rest, 0, 0, 0, 0);
		evas_object_size_hint_weight_set(rest, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
		elm_box_pack_end(form, rest);
		evas_object_show(rest);
		return form;
	}
};

class PredictionTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		m_screen = std::make_unique<ScreenHarness>(360, 640);
		CtView::changeLanguage("en_US.UTF-8");
		auto* view = new FormView;
		ASSERT_TRUE(m_screen->push(view));
		m_form = view->form;
		m_entry = view->entry;
	}
	void TearDown() override
	{
		m_screen.reset();
		contacts_disconnect();
	}

	// A phone person with `name` as first name and, when given, a default number.
	static int addPerson(const char* name, const char* defaultNumber = nullptr, int addressbookId = 0)
	{
		contacts_record_h contact = newContact(addressbookId, name);
		if (defaultNumber) {
			contacts_record_h other = addChild(contact, _contacts_contact.number, _contacts_number._uri);
			contacts_record_set_str(other, _contacts_number.number, "999");
			contacts_record_h number = addChild(contact, _contacts_contact.number, _contacts_number._uri);
			contacts_record_set_str(number, _contacts_number.number, defaultNumber);
			contacts_record_set_bool(number, _contacts_number.is_default, true);
		}
		int id = 0;
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(contact, &id));
		contacts_record_destroy(contact, true);
		return id;
	}

	void focusEntry(const char* text = "")
	{
		elm_object_focus_set(m_entry, EINA_TRUE);
		elm_entry_entry_set(m_entry, text);
		m_screen->pumpFrames(2);
	}

	TempDataDir m_dir;
	std::unique_ptr<ScreenHarness> m_screen;
	Evas_Object* m_form = nullptr;
	Evas_Object* m_entry = nullptr;
};

} // namespace ct::test
