#include "InputRowTestSupport.h"

#include "CtCommonTextUtil.h"
#include "CtInputViewTypeSelector.h"

#include <ui_extension.h>

#include <clocale>

namespace ct::test {

Elm_Object_Item* InputRowHostView::append(CtInputViewGenlistItem* row)
{
	Elm_Object_Item* item = elm_genlist_item_append(genlist, row->getItemClass(), row, nullptr, ELM_GENLIST_ITEM_NONE,
			row->getSelectCb(), nullptr);
	row->setElmObjectItem(item);
	row->attachToView(this);
	return item;
}

Evas_Object* InputRowHostView::onCreate(Evas_Object* parent, void*)
{
	ContactsCommon::bindTextDomain();
	for (const char* edj : {"contacts/contacts.edj", "contacts/detail_layout.edj"}) {
		std::string path;
		ContactsCommon::getAppEdjePath(edj, path, true);
		CtThemeMgr::getInstance()->addExtensionTheme(path.c_str());
	}
	genlist = elm_genlist_add(parent);
	CtThemeMgr::getInstance()->setObjectTheme(genlist);
	elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
	evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	return genlist;
}

void InputRowHostView::onPushed(Elm_Object_Item*)
{
	m_conformant = getWindow()->getConformantEvasObj();
	evas_object_smart_callback_add(m_conformant, "virtualkeypad,state,on", __keypadOnCb, this);
	evas_object_smart_callback_add(m_conformant, "virtualkeypad,state,off", __keypadOffCb, this);
}

void InputRowHostView::onDestroy()
{
	// The window outlives the view.
	if (m_conformant) {
		evas_object_smart_callback_del_full(m_conformant, "virtualkeypad,state,on", __keypadOnCb, this);
		evas_object_smart_callback_del_full(m_conformant, "virtualkeypad,state,off", __keypadOffCb, this);
	}
	WView::onDestroy();
}

void InputRowHostView::__keypadOnCb(void* data, Evas_Object*, void*)
{
	++static_cast<InputRowHostView*>(data)->keypadOn;
}

void InputRowHostView::__keypadOffCb(void* data, Evas_Object*, void*)
{
	++static_cast<InputRowHostView*>(data)->keypadOff;
}

CtInputViewItemCallbacks RowCalls::callbacks()
{
	CtInputViewItemCallbacks out;
	out.changed = [this] { ++changed; };
	out.deleted = [this](Elm_Object_Item* item, bool heldText, contacts_record_h record) {
		deleted.push_back({item, heldText, record});
	};
	out.activated = [this](Evas_Object* entry, Elm_Object_Item*) { activated.push_back(entry); };
	out.focus = [this](bool focused) { focus.push_back(focused); };
	return out;
}

void InputRowTest::SetUp()
{
	InputStoreTest::SetUp();
	// Texts as a person reads them, so that a missing translation shows.
	m_previousLocale = setlocale(LC_ALL, nullptr);
	setlocale(LC_ALL, "en_US.UTF-8");
	m_screen = std::make_unique<ScreenHarness>(360, 640);
	m_view = new InputRowHostView();
	ASSERT_TRUE(m_screen->push(m_view));
}

void InputRowTest::TearDown()
{
	m_screen.reset();
	m_data.clear();
	setlocale(LC_ALL, m_previousLocale.c_str());
	InputStoreTest::TearDown();
}

std::shared_ptr<CtInputData> InputRowTest::edit(int contactId)
{
	return m_data.emplace_back(std::make_shared<CtInputData>(readContact(contactId)));
}

std::shared_ptr<CtInputData> InputRowTest::editNew()
{
	return m_data.emplace_back(std::make_shared<CtInputData>(nullptr));
}

Elm_Object_Item* InputRowTest::show(CtInputViewGenlistItem* row)
{
	Elm_Object_Item* item = m_view->append(row);
	m_screen->pumpUntil([this, item] {
		Eina_List* realized = elm_genlist_realized_items_get(m_view->genlist);
		bool found = eina_list_data_find(realized, item) != nullptr;
		eina_list_free(realized);
		return found;
	});
	m_screen->pumpUntilIdle();
	return item;
}

Evas_Object* InputRowTest::entryOf(Elm_Object_Item* item, const char* part)
{
	Evas_Object* field = content(item, part);
	return field ? uxt_edit_field_layout_get_entry(field) : nullptr;
}

void InputRowTest::type(Evas_Object* entry, const char* text)
{
	elm_entry_entry_insert(entry, ctCommonUtf8ToMarkup(text).c_str());
	m_screen->pumpUntilIdle();
}

void InputRowTest::replaceText(Evas_Object* entry, const char* text)
{
	elm_entry_select_all(entry);
	elm_entry_entry_insert(entry, ctCommonUtf8ToMarkup(text).c_str());
	m_screen->pumpUntilIdle();
}

std::vector<std::string> InputRowTest::menuLabels(Evas_Object* hoversel)
{
	std::vector<std::string> labels;
	// Filled as the first tap would, without opening the menu.
	if (!elm_hoversel_items_get(hoversel))
		CtInputViewTypeSelector::fill(hoversel);
	const Eina_List* node;
	void* item;
	EINA_LIST_FOREACH(elm_hoversel_items_get(hoversel), node, item)
		labels.push_back(elm_object_item_text_get(static_cast<Elm_Object_Item*>(item)));
	return labels;
}

bool InputRowTest::chooseMenu(Evas_Object* hoversel, const std::string& label)
{
	ScreenHarness::click(hoversel);
	m_screen->pumpUntilIdle();
	Evas_Object* button = m_screen->findButton(label);
	if (!button)
		return false;
	bool fired = ScreenHarness::click(button);
	m_screen->pumpUntilIdle();
	return fired;
}

} // namespace ct::test
