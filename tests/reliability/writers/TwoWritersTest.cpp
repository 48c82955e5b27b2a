// Two processes update the two linked contacts of a person while its detail
// screen is open: every committed update is kept, every commit is followed by
// a change notification here, and the screen ends showing the last of each.
#include "../../data/detail/DetailTestStore.h"
#include "../WriterProcess.h"
#include "ContactsDetails.h"
#include "CtDetailView.h"
#include "CtDetailViewNoteItem.h"
#include "ScreenHarness.h"

#include <vconf.h>

#include <cstdio>
#include <set>

namespace ct::test {
namespace {

constexpr int kUpdatesPerBurst = 4;
// Notifications come within a fraction of a second; this only keeps a
// broken build from hanging.
constexpr double kNotificationPatience = 10.0;
constexpr double kRebuildPatience = 10.0;

struct Writer {
	std::string tag;
	int contactId;
	std::unique_ptr<WriterProcess> process;
	int updates = 0;
};

void versionSeenCb(const char*, void* data)
{
	int version = 0;
	contacts_db_get_current_version(&version);
	*static_cast<int*>(data) = std::max(*static_cast<int*>(data), version);
}

std::string noteOf(int contactId)
{
	contacts_record_h contact = nullptr;
	if (contacts_db_get_record(_contacts_contact._uri, contactId, &contact) != CONTACTS_ERROR_NONE)
		return "";
	contacts_record_h note = nullptr;
	char* text = nullptr;
	contacts_record_get_child_record_at_p(contact, _contacts_contact.note, 0, &note);
	if (note)
		contacts_record_get_str_p(note, _contacts_note.note, &text);
	std::string result = text ? text : "";
	contacts_record_destroy(contact, true);
	return result;
}

std::set<std::string> shownNotes(CtDetailView* view)
{
	std::set<std::string> notes;
	for (auto* row : ScreenHarness::rowsOf<CtDetailViewNoteItem>(view->getGenlist()))
		notes.insert(row->getCopyText());
	return notes;
}

int currentVersion()
{
	int version = 0;
	contacts_db_get_current_version(&version);
	return version;
}

class TwoWritersTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		for (const char* tag : { "a", "b" }) {
			contacts_record_h contact = newContact(0, tag);
			addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, (std::string(tag) + " 0").c_str());
			m_writers.push_back({ tag, store(contact), nullptr });
		}
		m_personId = linkContacts({ m_writers[0].contactId, m_writers[1].contactId });
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_add_changed_cb(_contacts_contact._uri, versionSeenCb, &m_notified));
	}
	void TearDown() override
	{
		contacts_db_remove_changed_cb(_contacts_contact._uri, versionSeenCb, &m_notified);
		contacts_disconnect();
	}

	int m_personId = 0;
	int m_notified = 0;
	std::vector<Writer> m_writers;
};

TEST_F(TwoWritersTest, OpenDetailScreenMissesNoNotificationAndNoUpdateIsLost)
{
	ScreenHarness screen;
	auto* view = static_cast<CtDetailView*>(createCtDetailView(m_personId, nullptr));
	ASSERT_TRUE(screen.push(view));
	const int startVersion = currentVersion();
	for (Writer& w : m_writers) {
		w.process = std::make_unique<WriterProcess>(std::vector<std::string>{ "update", std::to_string(w.contactId), w.tag });
		ASSERT_EQ("ready", w.process->readLine());
	}

	const int bursts = rounds(10, 1500);
	int missed = 0;
	int lost = 0;
	for (int round = 0; round < bursts; ++round) {
		for (Writer& w : m_writers)
			w.process->send("burst " + std::to_string(kUpdatesPerBurst));
		int committed = 0;
		for (Writer& w : m_writers) {
			int version = 0;
			ASSERT_EQ(2, sscanf(w.process->readLine().c_str(), "ok %d %d", &w.updates, &version)) << w.tag;
			committed = std::max(committed, version);
			if (noteOf(w.contactId) != w.tag + " " + std::to_string(w.updates))
				++lost;
		}
		// Both writers committed: a notification must follow that sees them.
		if (!screen.pumpUntil([&] { return m_notified >= committed; }, kNotificationPatience))
			++missed;
	}
	for (Writer& w : m_writers) {
		w.process->send("quit");
		EXPECT_EQ(0, w.process->wait()) << w.tag;
	}

	EXPECT_EQ(0, missed) << "bursts without a notification after them, of " << bursts;
	EXPECT_EQ(0, lost) << "acknowledged updates not found in the store";
	const int writes = m_writers[0].updates + m_writers[1].updates;
	EXPECT_EQ(2 * bursts * kUpdatesPerBurst, writes);
	EXPECT_EQ(startVersion + writes, currentVersion()) << "every update is one commit";
	std::set<std::string> expected;
	for (const Writer& w : m_writers) {
		std::string last = w.tag + " " + std::to_string(w.updates);
		EXPECT_EQ(last, noteOf(w.contactId));
		expected.insert(last);
	}
	EXPECT_TRUE(screen.pumpUntil([&] { return shownNotes(view) == expected; }, kRebuildPatience))
		<< testing::PrintToString(shownNotes(view));
	printf("%d bursts of %d updates from each of two writers: %d commits, %d bursts without a notification, "
		   "%d acknowledged updates missing\n", bursts, kUpdatesPerBurst, writes, missed, lost);
}

} // namespace
} // namespace ct::test
