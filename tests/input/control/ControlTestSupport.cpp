#include "ControlTestSupport.h"

#include "CtInputViewAddrBookItem.h"
#include "CtInputViewAddressItem.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewEmailItem.h"
#include "CtInputViewEventItem.h"
#include "CtInputViewGroupsItem.h"
#include "CtInputViewImportantFieldsItem.h"
#include "CtInputViewMessengerItem.h"
#include "CtInputViewNoteItem.h"
#include "CtInputViewNumberItem.h"
#include "CtInputViewRelationItem.h"
#include "CtInputViewRingtoneItem.h"
#include "CtInputViewWebsiteItem.h"

#include <vconf.h>

#include <clocale>
#include <typeinfo>

namespace ct::test {

namespace {

std::string kindOf(CtInputViewGenlistItem* row)
{
	const std::pair<const std::type_info&, const char*> kinds[] = {
		{ typeid(CtInputViewBasicInfoItem), "basic" }, { typeid(CtInputViewNumberItem), "number" },
		{ typeid(CtInputViewEmailItem), "email" }, { typeid(CtInputViewNoteItem), "note" },
		{ typeid(CtInputViewAddressItem), "address" }, { typeid(CtInputViewEventItem), "event" },
		{ typeid(CtInputViewRelationItem), "relationship" }, { typeid(CtInputViewWebsiteItem), "website" },
		{ typeid(CtInputViewMessengerItem), "messenger" }, { typeid(CtInputViewRingtoneItem), "ringtone" },
		{ typeid(CtInputViewGroupsItem), "groups" }, { typeid(CtInputViewAddrBookItem), "storage" },
		{ typeid(CtInputViewImportantFieldsItem), "buttons" },
	};
	for (const auto& kind : kinds)
		if (typeid(*row) == kind.first)
			return kind.second;
	return "other";
}

} // namespace

void InputControlTest::SetUp()
{
	InputStoreTest::SetUp();
	m_previousLocale = setlocale(LC_ALL, nullptr);
	CtView::changeLanguage("en_US.UTF-8");
	preference_set_boolean("hide_storage_popup", true);
	vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
	vconf_set_str("db/csc/country_iso", "GB");
	appcontrol::clearLaunches();
	m_screen = std::make_unique<ScreenHarness>(360, 640);
}

void InputControlTest::TearDown()
{
	m_screen.reset();
	m_registrations.clear();
	m_received.clear();
	setlocale(LC_ALL, m_previousLocale.c_str());
	InputStoreTest::TearDown();
}

CtInputViewControl* InputControlTest::open(int contactId, CtLaunchRequest* request, bool settle)
{
	contacts_record_h record = contactId > 0 ? readContact(contactId) : nullptr;
	m_view = request ? new CtInputView(record, request) : new CtInputView(record);
	m_viewAlive = m_view->getWeakPtr();
	if (settle) {
		EXPECT_TRUE(m_screen->push(m_view));
		// A new contact's form puts the focus on the name entry (keypad up) a
		// moment after it is shown; the tests start once that has happened.
		if (contactId <= 0 && m_screen->pumpUntil([this] { return m_screen->isKeypadShown(); }, 1.0)) {
			control()->hideInputPanel();
			m_screen->lowerKeypad();
		}
	} else
		m_screen->naviframe()->push(m_view);
	return control();
}

CtInputViewControl* InputControlTest::control() const
{
	if (!m_view || m_viewAlive.expired())
		return nullptr;
	return dynamic_cast<CtInputViewControl*>(m_view->getInputControl());
}

void InputControlTest::close()
{
	if (m_view && !m_viewAlive.expired())
		m_view->destroy();
	m_view = nullptr;
	m_screen->pumpUntilIdle();
}

std::string InputControlTest::popupText() const
{
	for (Evas_Object* popup : m_screen->findWidgets("Elm_Popup")) {
		const char* text = elm_object_text_get(popup);
		if (text && *text)
			return text;
	}
	return "";
}

std::vector<std::string> InputControlTest::kinds() const
{
	std::vector<std::string> out;
	for (CtInputViewGenlistItem* row : ScreenHarness::rowsOf<CtInputViewGenlistItem>(genlist()))
		out.push_back(kindOf(row));
	return out;
}

CtInputViewGenlistItem* InputControlTest::rowAt(const std::string& kind, int index) const
{
	for (CtInputViewGenlistItem* row : ScreenHarness::rowsOf<CtInputViewGenlistItem>(genlist()))
		if (kindOf(row) == kind && index-- == 0)
			return row;
	return nullptr;
}

Elm_Object_Item* InputControlTest::itemAt(const std::string& kind, int index) const
{
	CtInputViewGenlistItem* row = rowAt(kind, index);
	return row ? row->getElmObjectItem() : nullptr;
}

Evas_Object* InputControlTest::addButton(int button) const
{
	auto* row = dynamic_cast<CtInputViewImportantFieldsItem*>(rowAt("buttons"));
	return row ? row->getButton(static_cast<CtInputViewImportantFieldsItem::Button>(button)) : nullptr;
}

void InputControlTest::openMorePopup()
{
	// Entries of new rows take the focus when first shown; while the keypad
	// is up the popup waits for it to go down, so the tap is made with the
	// keypad down (as the tap itself would do) and the keypad is lowered
	// again when an entry took the focus meanwhile.
	for (int tries = 0; tries < 3 && !popupList(); ++tries) {
		control()->hideInputPanel();
		m_screen->lowerKeypad();
		if (!popupList())
			ScreenHarness::click(addButton(3));
		m_screen->pumpUntilIdle();
	}
	ASSERT_NE(nullptr, popupList());
}

Evas_Object* InputControlTest::popupList() const
{
	for (Evas_Object* list : m_screen->findWidgets("Elm_Genlist"))
		if (list != genlist() && evas_object_visible_get(list))
			return list;
	return nullptr;
}

std::vector<std::pair<std::string, bool>> InputControlTest::popupRows() const
{
	std::vector<std::pair<std::string, bool>> rows;
	for (Elm_Object_Item* item : ScreenHarness::genlistItems(popupList()))
		rows.emplace_back(ScreenHarness::itemText(item, "elm.text.main.left"), elm_object_item_disabled_get(item));
	return rows;
}

bool InputControlTest::choosePopupRow(const std::string& label)
{
	for (Elm_Object_Item* item : ScreenHarness::genlistItems(popupList())) {
		if (ScreenHarness::itemText(item, "elm.text.main.left") == label
				|| ScreenHarness::itemText(item, "elm.text.main.left.top") == label) {
			ScreenHarness::selectItem(item);
			m_screen->pumpUntilIdle();
			return true;
		}
	}
	for (const auto& row : popupRows())
		ADD_FAILURE() << "no \"" << label << "\" among the popup's \"" << row.first << "\"";
	if (!popupList())
		ADD_FAILURE() << "no popup list for \"" << label << "\"";
	return false;
}

void InputControlTest::standIn(const std::string& appId)
{
	m_registrations.push_back(appcontrol::registerAppHandler(appId,
			[this, appId](app_control_h, const appcontrol::Reply& reply) {
				m_received[appId].push_back(reply);
				return 0;
			}));
}

void InputControlTest::answer(const std::string& appId, const std::map<std::string, std::string>& extras,
		const std::vector<std::string>& arrays, app_control_result_e result)
{
	ASSERT_FALSE(m_received[appId].empty()) << appId << " got no request";
	app_control_h reply = nullptr;
	app_control_create(&reply);
	for (const auto& extra : extras) {
		if (std::find(arrays.begin(), arrays.end(), extra.first) != arrays.end()) {
			const char* values[] = { extra.second.c_str() };
			app_control_add_extra_data_array(reply, extra.first.c_str(), values, 1);
		} else {
			app_control_add_extra_data(reply, extra.first.c_str(), extra.second.c_str());
		}
	}
	m_received[appId].back()(reply, result);
	app_control_destroy(reply);
	m_screen->pumpUntilIdle();
}

} // namespace ct::test
