// Change versions, changes by version, and change callbacks on the main loop,
// for writes of this process and of another one.
#include "../contacts_db/ContactsTestSupport.h"
#include "../vconf/StoreTestSupport.h"

#include <sys/wait.h>
#include <unistd.h>

#include <set>
#include <thread>

using namespace ct::test;

namespace {

struct Change {
	int contactId;
	int type;
	int version;
};

std::vector<Change> changesSince(int version, int book = -1, int* current = nullptr)
{
	contacts_list_h list = nullptr;
	int now = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE,
		contacts_db_get_changes_by_version(_contacts_contact_updated_info._uri, book, version, &list, &now));
	ListPtr owner(list);
	if (current)
		*current = now;
	std::vector<Change> out;
	int count = 0;
	contacts_list_get_count(list, &count);
	for (int i = 0; i < count; ++i, contacts_list_next(list)) {
		contacts_record_h r = nullptr;
		contacts_list_get_current_record_p(list, &r);
		out.push_back({ intOf(r, _contacts_contact_updated_info.contact_id), intOf(r, _contacts_contact_updated_info.type),
			intOf(r, _contacts_contact_updated_info.version) });
	}
	return out;
}

struct Recorder {
	std::vector<std::string> uris;
	static void cb(const char* uri, void* data) { static_cast<Recorder*>(data)->uris.push_back(uri); }
};

} // namespace

TEST(Changes, EveryWriteGetsItsOwnVersionAndIsListedByVersion)
{
	ConnectedStore store;
	int v0 = 0;
	contacts_db_get_current_version(&v0);
	int a = insertContact({ "A", "" });
	int b = insertContact({ "B", "" });
	contacts_db_update_record(getRecord(_contacts_contact._uri, a).get());
	contacts_db_delete_record(_contacts_contact._uri, b);
	int current = 0;
	std::vector<Change> changes = changesSince(v0, -1, &current);
	std::vector<std::pair<int, int>> kinds;
	for (const Change& c : changes)
		kinds.push_back({ c.contactId, c.type });
	EXPECT_EQ((std::vector<std::pair<int, int>>{ { a, CONTACTS_CHANGE_INSERTED }, { b, CONTACTS_CHANGE_INSERTED },
		{ a, CONTACTS_CHANGE_UPDATED }, { b, CONTACTS_CHANGE_DELETED } }), kinds);
	EXPECT_EQ(v0 + 4, current);
	EXPECT_EQ(current, changes.back().version);
	int last = 0;
	contacts_db_get_last_change_version(&last);
	EXPECT_EQ(current, last);
	EXPECT_EQ(1u, changesSince(current - 1).size());
	EXPECT_TRUE(changesSince(0, 77).empty());

	// Many writes, no version lost or shared.
	for (int i = 0; i < 200; ++i)
		insertContact({ "N" + std::to_string(i), "" });
	std::set<int> versions;
	for (const Change& c : changesSince(current))
		versions.insert(c.version);
	EXPECT_EQ(200u, versions.size());
	store.reopen();
	int afterReopen = 0;
	contacts_db_get_current_version(&afterReopen);
	EXPECT_EQ(current + 200, afterReopen);

	contacts_list_h list = nullptr;
	int now = 0;
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_db_get_changes_by_version(_contacts_person._uri, -1, 0, &list, &now));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_db_get_changes_by_version(_contacts_contact_updated_info._uri, -1, -5, &list, &now));
}

namespace {

struct Disconnector {
	int calls = 0;
	static void cb(const char*, void* data)
	{
		auto* self = static_cast<Disconnector*>(data);
		++self->calls;
		contacts_db_remove_changed_cb(_contacts_person._uri, cb, data);
		contacts_disconnect();
	}
};

} // namespace

TEST(Changes, OwnWritesReachCallbacksOnTheNextIterationOncePerViewAndACallbackMayDisconnect)
{
	EcoreScope ecore;
	ConnectedStore store;
	Recorder person, contact, group;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_add_changed_cb(_contacts_person._uri, Recorder::cb, &person));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_add_changed_cb(_contacts_contact._uri, Recorder::cb, &contact));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_add_changed_cb(_contacts_group._uri, Recorder::cb, &group));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_add_changed_cb("bad", Recorder::cb, &group));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_add_changed_cb(_contacts_person._uri, nullptr, &group));

	insertContact({ "A", "" });
	EXPECT_TRUE(person.uris.empty()); // never inside the write
	ecore_main_loop_iterate();
	EXPECT_EQ(std::vector<std::string>{ _contacts_person._uri }, person.uris);
	EXPECT_EQ(1u, contact.uris.size());
	EXPECT_TRUE(group.uris.empty());

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_remove_changed_cb(_contacts_person._uri, Recorder::cb, &person));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_remove_changed_cb(_contacts_person._uri, Recorder::cb, &person));
	insertContact({ "B", "" });
	ecore_main_loop_iterate();
	EXPECT_EQ(1u, person.uris.size());
	EXPECT_EQ(2u, contact.uris.size());
	contacts_db_remove_changed_cb(_contacts_contact._uri, Recorder::cb, &contact);
	contacts_db_remove_changed_cb(_contacts_group._uri, Recorder::cb, &group);

	// A callback may unregister itself and disconnect.
	Disconnector d;
	contacts_db_add_changed_cb(_contacts_person._uri, Disconnector::cb, &d);
	insertContact({ "C", "" });
	ecore_main_loop_iterate();
	EXPECT_EQ(1, d.calls);
	int version = 0;
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_db_get_current_version(&version));
}

TEST(Changes, WritesOfAnotherProcessOrThreadReachCallbacks)
{
	EcoreScope ecore;
	ConnectedStore store;
	Recorder person;
	contacts_db_add_changed_cb(_contacts_person._uri, Recorder::cb, &person);
	int v0 = 0;
	contacts_db_get_current_version(&v0);

	pid_t child = fork();
	ASSERT_GE(child, 0);
	if (child == 0) {
		// The child has its own connection to the same file.
		int rc = contacts_connect();
		if (rc == CONTACTS_ERROR_NONE)
			rc = contacts_db_insert_record(makeContact({ "FromChild", "" }).get(), nullptr);
		_exit(rc == CONTACTS_ERROR_NONE ? 0 : 1);
	}
	int status = 0;
	waitpid(child, &status, 0);
	ASSERT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0) << status;
	EXPECT_TRUE(pumpUntil([&]() { return !person.uris.empty(); }));
	std::vector<Change> changes = changesSince(v0);
	EXPECT_TRUE(changes.size() == 1 && changes[0].type == CONTACTS_CHANGE_INSERTED);

	// Each thread has its own connection.
	person.uris.clear();
	int threadResult = -1;
	std::thread([&]() {
		threadResult = contacts_connect_on_thread();
		if (threadResult == CONTACTS_ERROR_NONE) {
			threadResult = contacts_db_insert_record(makeContact({ "Threaded", "" }).get(), nullptr);
			contacts_disconnect_on_thread();
		}
	}).join();
	ASSERT_EQ(CONTACTS_ERROR_NONE, threadResult);
	EXPECT_TRUE(pumpUntil([&]() { return !person.uris.empty(); }));
	EXPECT_EQ(2, countOf(_contacts_person._uri));
	contacts_db_remove_changed_cb(_contacts_person._uri, Recorder::cb, &person);
}
