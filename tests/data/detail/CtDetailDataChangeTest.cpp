// Change detection: which database changes reach the detail data's listener.
#include "CtDetailData.h"
#include "DetailTestStore.h"

#include "LogSink.h"

using namespace ct::test;

namespace {

class CtDetailDataChangeTest : public StoreTest {
protected:
	void SetUp() override
	{
		StoreTest::SetUp();
		contacts_record_h a = newContact(0, "Alpha");
		addImage(a, "/pics/a.jpg");
		m_contactA = store(a);
		contacts_record_h b = newContact(0, "Beta");
		addImage(b, "/pics/b.jpg");
		m_contactB = store(b);
		m_personId = linkContacts({m_contactA, m_contactB});
		m_otherPerson = addSimplePerson("Stranger", &m_otherContact);
		settle(0.3);
		m_data = std::make_unique<CtDetailData>(m_personId);
		m_data->attachListener(&m_listener);
	}
	void TearDown() override
	{
		m_data.reset();
		StoreTest::TearDown();
	}

	size_t callsAfterSettling(size_t before = 0)
	{
		pumpUntil([this, before] { return m_listener.uris.size() > before; }, 2.0);
		settle();
		return m_listener.uris.size();
	}

	RecordingListener m_listener;
	std::unique_ptr<CtDetailData> m_data;
	SignalRecorder m_signals;
	int m_contactA = 0;
	int m_contactB = 0;
	int m_personId = 0;
	int m_otherPerson = 0;
	int m_otherContact = 0;
};

} // namespace

TEST_F(CtDetailDataChangeTest, EachChangeOfThePersonNotifiesOnce)
{
	addNumberToStoredContact(m_contactB, "777");
	EXPECT_EQ(1u, callsAfterSettling());
	EXPECT_EQ(_contacts_person._uri, m_listener.uris.front());
	// The remembered version moved on: an unrelated change stays quiet now.
	addNumberToStoredContact(m_otherContact, "888");
	settle();
	EXPECT_EQ(1u, m_listener.uris.size());

	int other = m_data->getNameContactId() == m_contactA ? m_contactB : m_contactA;
	ASSERT_EQ(CONTACTS_ERROR_NONE,
		contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, m_personId, other));
	EXPECT_EQ(2u, callsAfterSettling(1));
	EXPECT_EQ(other, m_data->getNameContactId());

	CtDetailData elsewhere(m_personId);
	elsewhere.setFavorite(true);
	EXPECT_EQ(3u, callsAfterSettling(2));

	int otherImage = 0;
	for (Eina_List* l = m_data->getImageList(); l; l = eina_list_next(l)) {
		int id = 0;
		contacts_record_get_int(static_cast<contacts_record_h>(eina_list_data_get(l)), _contacts_image.id, &id);
		if (id != m_data->getDefaultImageId())
			otherImage = id;
	}
	ASSERT_GT(otherImage, 0);
	ASSERT_EQ(CONTACTS_ERROR_NONE,
		contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_IMAGE, m_personId, otherImage));
	EXPECT_EQ(4u, callsAfterSettling(3));
	EXPECT_EQ(otherImage, m_data->getDefaultImageId());

	// The moved contact is not among the remembered ones: only the person's
	// change marker tells that the person changed.
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(m_personId, m_otherPerson));
	EXPECT_EQ(5u, callsAfterSettling(4));
}

TEST_F(CtDetailDataChangeTest, UnrelatedContactsAndPhoneLogChangesDoNotNotify)
{
	contacts_record_h log = nullptr;
	contacts_record_create(_contacts_phone_log._uri, &log);
	contacts_record_set_str(log, _contacts_phone_log.address, "555");
	contacts_record_set_int(log, _contacts_phone_log.log_type, CONTACTS_PLOG_TYPE_VOICE_INCOMING);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(log, nullptr));
	contacts_record_destroy(log, true);
	EXPECT_TRUE(pumpUntil([this] { return !m_signals.signals.empty(); }, 2.0));
	settle();
	EXPECT_EQ(1u, m_signals.signals.size());
	EXPECT_EQ(1, m_signals.count(CT_REGISTRY_KEY_PHONELOG_CHANGED));
	addNumberToStoredContact(m_otherContact, "555");
	addSimplePerson("Newcomer");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, m_otherPerson));
	settle(1.0);
	EXPECT_TRUE(m_listener.uris.empty());
}

TEST_F(CtDetailDataChangeTest, DeletedPersonNotifiesOnceThenStaysQuiet)
{
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, m_personId));
	EXPECT_EQ(1u, callsAfterSettling());
	EXPECT_FALSE(m_data->isCurrentPersonValid());
	addNumberToStoredContact(m_otherContact, "999");
	settle();
	EXPECT_EQ(1u, m_listener.uris.size());
}

TEST_F(CtDetailDataChangeTest, ListenerMayDeleteTheDataInsideItsCallback)
{
	m_listener.onChange = [this] { m_data.reset(); };
	addNumberToStoredContact(m_contactA, "123");
	EXPECT_EQ(1u, callsAfterSettling());
	EXPECT_EQ(nullptr, m_data);
	addNumberToStoredContact(m_contactA, "456");
	settle();
	EXPECT_EQ(1u, m_listener.uris.size());
}

TEST_F(CtDetailDataChangeTest, GalEntryMissingPersonNullAndDetachedListenersHearNothing)
{
	ct::log::clear();
	m_data->attachListener(nullptr);
	EXPECT_TRUE(ct::log::contains("* Critical * listener is NULL", DLOG_ERROR));
	CtGalSearchData entry = {nullptr, nullptr, "Gal", "1", nullptr, nullptr, nullptr, nullptr};
	CtDetailData gal(&entry);
	RecordingListener galListener;
	gal.attachListener(&galListener);
	CtDetailData nobody(0);
	RecordingListener nobodyListener;
	nobody.attachListener(&nobodyListener);

	addNumberToStoredContact(m_contactA, "2");
	EXPECT_EQ(1u, callsAfterSettling());
	EXPECT_TRUE(galListener.uris.empty());
	EXPECT_TRUE(nobodyListener.uris.empty());
	m_data->detachListener();
	addNumberToStoredContact(m_contactA, "321");
	settle();
	EXPECT_EQ(1u, m_listener.uris.size());
}
