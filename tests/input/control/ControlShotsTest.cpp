// Pictures of the edit form and of each popup it opens, for review
// (test-output/input-control/*.png): a new contact, a stored contact with
// every row kind, the add-field popup, the picture popup, the event date
// popup with its solar/lunar button and the change-location question.
#include "ControlTestSupport.h"

#include "CtInputViewFieldItem.h"
#include "CtInputViewImportantFieldsItem.h"

#include <Edje.h>
#include <vconf.h>

#include <filesystem>

using namespace ct::test;

namespace {

class ControlShotsTest : public InputControlTest {
protected:
	void shoot(const std::string& name)
	{
		m_screen->pumpUntilIdle();
		const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
		std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/input-control";
		std::filesystem::create_directories(dir);
		EXPECT_TRUE(m_screen->savePng(dir + "/" + name + ".png")) << name;
	}
};

int storeEveryKind()
{
	contacts_record_h contact = newContact(0, "Ada");
	contacts_record_set_str(contact, _contacts_contact.ringtone_path, "/usr/share/sounds/ringtones/Over the horizon.ogg");
	addText(contact, _contacts_contact.number, _contacts_number._uri, _contacts_number.number, "01012345678");
	addText(contact, _contacts_contact.email, _contacts_email._uri, _contacts_email.email, "ada@example.com");
	addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "Met at the analytical society");
	addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, "12 St James's Square");
	contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
	contacts_record_set_int(event, _contacts_event.date, 18151210);
	contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	addText(contact, _contacts_contact.relationship, _contacts_relationship._uri, _contacts_relationship.name, "Annabella");
	addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url, "https://example.com/ada");
	addText(contact, _contacts_contact.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, "ada.lovelace");
	int id = store(contact);
	contacts_group_add_contact(addGroup(0, "Family"), id);
	return id;
}

} // namespace

TEST_F(ControlShotsTest, FormAndPopups)
{
	open(0);
	shoot("new_contact");
	openMorePopup();
	shoot("add_field_popup");
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_EVENT_HEG_BIRTHDAY_ABB")));
	shoot("event_date_popup");
	close();

	vconf_set_str(VCONFKEY_CSC_COUNTRY_ISO, "KR");
	open(0);
	openMorePopup();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_EVENT_HEG_BIRTHDAY_ABB")));
	shoot("event_date_popup_lunar");
	close();

	open(storeEveryKind());
	shoot("stored_contact_top");
	Evas_Object* picture = elm_object_item_part_content_get(itemAt("basic"), "elm.icon");
	ASSERT_NE(nullptr, picture);
	elm_layout_signal_emit(picture, "mouse,clicked,1", "touch_area");
	edje_object_message_signal_process(elm_layout_edje_get(picture));
	shoot("picture_popup");
	m_view->destroyPopup();
	elm_genlist_item_show(elm_genlist_last_item_get(genlist()), ELM_GENLIST_ITEM_SCROLLTO_IN);
	shoot("stored_contact_bottom");
	close();

	addAddressbook("mail", 0, 7, "Mail");
	open(0);
	openMorePopup();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB")));
	shoot("storage_popup");
	ASSERT_TRUE(choosePopupRow("Mail"));
	elm_entry_entry_insert(static_cast<CtInputViewFieldItem*>(rowAt("number"))->getEntry(), "0102");
	ScreenHarness::selectItem(itemAt("storage"));
	m_screen->pumpUntilIdle();
	ASSERT_TRUE(choosePopupRow(tr("IDS_PB_OPT_DEVICE")));
	shoot("change_location_popup");
}
