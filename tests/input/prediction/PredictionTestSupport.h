// A fresh store per test with persons to predict, and a window holding a
// plain name entry that stands in for the edit form's name field.
#pragma once

#include "../../data/detail/DetailTestStore.h"

#include "CtView.h"
#include "ScreenHarness.h"

#include <Elementary.h>

#include <memory>
#include <string>

namespace ct::test {

class PredictionTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		m_screen = std::make_unique<ScreenHarness>(360, 640);
		CtView::changeLanguage("en_US.UTF-8");
		m_form = elm_box_add(m_screen->win());
		evas_object_size_hint_weight_set(m_form, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
		elm_win_resize_object_add(m_screen->win(), m_form);
		evas_object_show(m_form);
		m_entry = elm_entry_add(m_form);
		elm_entry_single_line_set(m_entry, EINA_TRUE);
		evas_object_size_hint_weight_set(m_entry, EVAS_HINT_EXPAND, 0);
		evas_object_size_hint_align_set(m_entry, EVAS_HINT_FILL, 0);
		evas_object_size_hint_min_set(m_entry, 0, 80);
		elm_box_align_set(m_form, 0.5, 0.0);
		elm_box_pack_end(m_form, m_entry);
		evas_object_show(m_entry);
		m_screen->pumpUntilIdle();
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
