// One row of every kind in one list, saved as a picture for review.
#include "RowTestSupport.h"

#include "CtDetailViewAddressItem.h"
#include "CtDetailViewBasicInfoItem.h"
#include "CtDetailViewEmailItem.h"
#include "CtDetailViewEventItem.h"
#include "CtDetailViewFacebookItem.h"
#include "CtDetailViewGroupsItem.h"
#include "CtDetailViewLinkItem.h"
#include "CtDetailViewMessengerItem.h"
#include "CtDetailViewMultiImageItem.h"
#include "CtDetailViewNoteItem.h"
#include "CtDetailViewNumberItem.h"
#include "CtDetailViewProfileMultiImageItem.h"
#include "CtDetailViewProfileSharingItem.h"
#include "CtDetailViewRelationItem.h"
#include "CtDetailViewRingtoneItem.h"
#include "CtDetailViewStatusItem.h"
#include "CtDetailViewVideoCallItem.h"
#include "CtDetailViewWebsiteItem.h"

#include <clocale>
#include <filesystem>
#include <set>

using namespace ct::test;

namespace {

contacts_record_h first(Eina_List* list)
{
	return static_cast<contacts_record_h>(eina_list_nth(list, 0));
}

std::string outputDir()
{
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	return std::string(bin ? bin : "/tmp") + "/test-output/detail/rows";
}

class AllRowsShotTest : public RowTest {
protected:
	void SetUp() override
	{
		// The picture shows the English texts whatever the machine's locale.
		m_savedLocale = setlocale(LC_MESSAGES, nullptr);
		setlocale(LC_MESSAGES, "en_US.UTF-8");
		m_screenHeight = 1900;
		RowTest::SetUp();
	}
	void TearDown() override
	{
		RowTest::TearDown();
		setlocale(LC_MESSAGES, m_savedLocale.c_str());
	}

	int richPerson()
	{
		contacts_record_h contact = newContact(0, "Mina");
		contacts_record_h name = static_cast<contacts_record_h>(nullptr);
		contacts_record_get_child_record_at_p(contact, _contacts_contact.name, 0, &name);
		contacts_record_set_str(name, _contacts_name.last, "Okafor");
		addNumber(contact, "+1 202-555-0147", CONTACTS_NUMBER_TYPE_CELL);
		addEmail(contact, "mina.okafor@example.com");
		contacts_record_h address = addChild(contact, _contacts_contact.address, _contacts_address._uri);
		contacts_record_set_int(address, _contacts_address.type, CONTACTS_ADDRESS_TYPE_HOME);
		contacts_record_set_str(address, _contacts_address.street, "221 Harbour Road");
		contacts_record_set_str(address, _contacts_address.locality, "Portsmouth");
		contacts_record_set_str(address, _contacts_address.postal_code, "PO1 3AX");
		contacts_record_set_str(address, _contacts_address.country, "United Kingdom");
		contacts_record_h im = addChild(contact, _contacts_contact.messenger, _contacts_messenger._uri);
		contacts_record_set_int(im, _contacts_messenger.type, CONTACTS_MESSENGER_TYPE_GOOGLE);
		contacts_record_set_str(im, _contacts_messenger.im_id, "mina.okafor");
		contacts_record_h url = addChild(contact, _contacts_contact.url, _contacts_url._uri);
		contacts_record_set_str(url, _contacts_url.url, "www.minaokafor.example");
		contacts_record_h relation = addChild(contact, _contacts_contact.relationship, _contacts_relationship._uri);
		contacts_record_set_int(relation, _contacts_relationship.type, CONTACTS_RELATIONSHIP_TYPE_SISTER);
		contacts_record_set_str(relation, _contacts_relationship.name, "Ada Okafor");
		contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
		contacts_record_set_int(event, _contacts_event.date, 19910723);
		contacts_record_h note = addChild(contact, _contacts_contact.note, _contacts_note._uri);
		contacts_record_set_str(note, _contacts_note.note, "Met at the harbour festival. Prefers calls after 6 pm.");
		contacts_record_h nickname = addChild(contact, _contacts_contact.nickname, _contacts_nickname._uri);
		contacts_record_set_str(nickname, _contacts_nickname.name, "Mimi");
		contacts_record_h company = addChild(contact, _contacts_contact.company, _contacts_company._uri);
		contacts_record_set_str(company, _contacts_company.name, "Velmora Labs");
		addImage(contact, picture("shot1.png", 480, 270, 0xFF2E7D9A, 0xFF1B4F63).c_str(), 1);
		addImage(contact, picture("shot2.png", 480, 270, 0xFF9A4E2E, 0xFF63321B).c_str(), 2);
		int base = store(contact);
		int second = store(newContact(0, "Mina"));
		int third = store(newContact(0, "M. Okafor"));
		return linkContacts({base, second, third});
	}

	std::string m_savedLocale;
};

} // namespace

TEST_F(AllRowsShotTest, ListWithOneRowOfEveryKindIsSavedForReview)
{
	CtDetailData* data = load(richPerson());
	std::string tone = m_dir.path() + "/Morning Tide.ogg";
	FILE* f = fopen(tone.c_str(), "w");
	ASSERT_NE(nullptr, f);
	fclose(f);
	data->setRingtone(tone.c_str());

	std::vector<CtDetailViewGenlistItem*> rows = {
		new CtDetailViewMultiImageItem(m_view, data, false),
		new CtDetailViewBasicInfoItem(data, 1),
		new CtDetailViewStatusItem(data),
		new CtDetailViewProfileSharingItem(data),
		new CtDetailViewNumberItem(data, first(data->getNumberList()), true, false),
		new CtDetailViewVideoCallItem(m_view, data, false),
		new CtDetailViewEmailItem(data, first(data->getEmailList()), false),
		new CtDetailViewFacebookItem(data),
		new CtDetailViewAddressItem(m_view, data, first(data->getAddressList()), true),
		new CtDetailViewMessengerItem(data, first(data->getMessengerList())),
		new CtDetailViewWebsiteItem(data, first(data->getUrlList())),
		new CtDetailViewRelationItem(data, first(data->getRelationshipList())),
		new CtDetailViewEventItem(data, first(data->getEventList())),
		new CtDetailViewNoteItem(data, first(data->getNoteList())),
		new CtDetailViewRingtoneItem(data),
		new CtDetailViewGroupsItem(data),
		new CtDetailViewLinkItem(data),
		new CtDetailViewProfileMultiImageItem(m_view, data, true),
	};
	std::set<int> kinds;
	std::vector<Elm_Object_Item*> items;
	for (CtDetailViewGenlistItem* row : rows) {
		kinds.insert(row->getItemType());
		items.push_back(m_view->append(row));
	}
	EXPECT_EQ(18u, kinds.size());
	m_screen->pumpUntilIdle(5.0);

	Eina_List* realized = elm_genlist_realized_items_get(m_view->genlist);
	EXPECT_EQ(items.size(), eina_list_count(realized));
	eina_list_free(realized);
	EXPECT_EQ("Mina Okafor", text(items[1], "main.name"));
	EXPECT_EQ("Mobile", text(items[4], "elm.text.sub.left.top"));

	std::filesystem::create_directories(outputDir());
	std::string path = outputDir() + "/all_rows.png";
	ASSERT_TRUE(m_screen->savePng(path));
	EXPECT_GT(std::filesystem::file_size(path), 10000u);
}
