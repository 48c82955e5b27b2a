// The picture extension flag: the one picture that stands for its contact
// (or the profile) is flagged, whatever the order pictures were stored in,
// and the flag follows when that picture goes.
#include "ContactsTestSupport.h"

#include <map>

using namespace ct::test;

namespace {

// Pictures of a stored owner as path -> extension flag.
std::map<std::string, int> flagsOf(const char* uri, unsigned imageProperty, int id)
{
	std::map<std::string, int> flags;
	RecordPtr owner = getRecord(uri, id);
	for (int i = 0; contacts_record_h image = childAt(owner.get(), imageProperty, i); ++i)
		flags[strOf(image, _contacts_image.path)] = intOf(image, _contacts_image_ex.extension_flag);
	return flags;
}

void addPicture(contacts_record_h owner, unsigned imageProperty, const char* path, int order)
{
	contacts_record_h image = addChild(owner, imageProperty, _contacts_image._uri);
	contacts_record_set_str(image, _contacts_image.path, path);
	contacts_record_set_int(image, _contacts_image_ex.order, order);
}

} // namespace

TEST(ImageExtensionFlag, FirstPictureByOrderOfEachOwnerIsFlaggedOthersAndUnstoredAreNot)
{
	ConnectedStore store;
	struct Case {
		std::vector<std::pair<const char*, int>> pictures; // path, order (0: none)
		std::map<std::string, int> expected;
	};
	const Case cases[] = {
		{{{"a", 0}}, {{"a", 1}}},
		{{{"a", 3}, {"b", 1}, {"c", 2}}, {{"a", 0}, {"b", 1}, {"c", 0}}},
		// Without orders the stored position decides.
		{{{"a", 0}, {"b", 0}}, {{"a", 1}, {"b", 0}}},
		{{{"a", 2}, {"b", 2}}, {{"a", 1}, {"b", 0}}},
	};
	for (const Case& c : cases) {
		RecordPtr contact = makeContact({"Pic", ""});
		for (auto [path, order] : c.pictures)
			addPicture(contact.get(), _contacts_contact.image, path, order);
		EXPECT_EQ(0, intOf(childAt(contact.get(), _contacts_contact.image), _contacts_image_ex.extension_flag));
		int id = insertRecord(contact.get());
		EXPECT_EQ(c.expected, flagsOf(_contacts_contact._uri, _contacts_contact.image, id)) << c.pictures.size();
	}
}

TEST(ImageExtensionFlag, EachLinkedContactAndTheProfileKeepTheirOwnFlagAndItMovesOnRemoval)
{
	ConnectedStore store;
	RecordPtr first = makeContact({"One", ""});
	addPicture(first.get(), _contacts_contact.image, "one-a", 1);
	addPicture(first.get(), _contacts_contact.image, "one-b", 2);
	int firstId = insertRecord(first.get());
	RecordPtr second = makeContact({"Two", ""});
	addPicture(second.get(), _contacts_contact.image, "two-a", 1);
	int secondId = insertRecord(second.get());
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(personOf(firstId), personOf(secondId)));
	RecordPtr profile = newRecord(_contacts_my_profile._uri);
	addPicture(profile.get(), _contacts_my_profile.image, "me-a", 1);
	int profileId = insertRecord(profile.get());

	store.reopen();
	EXPECT_EQ((std::map<std::string, int>{{"one-a", 1}, {"one-b", 0}}),
		flagsOf(_contacts_contact._uri, _contacts_contact.image, firstId));
	EXPECT_EQ((std::map<std::string, int>{{"two-a", 1}}), flagsOf(_contacts_contact._uri, _contacts_contact.image, secondId));
	EXPECT_EQ((std::map<std::string, int>{{"me-a", 1}}),
		flagsOf(_contacts_my_profile._uri, _contacts_my_profile.image, profileId));

	RecordPtr stored = getRecord(_contacts_contact._uri, firstId);
	contacts_record_h flagged = childAt(stored.get(), _contacts_contact.image, 0);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_remove_child_record(stored.get(), _contacts_contact.image, flagged));
	contacts_record_destroy(flagged, true);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(stored.get()));
	EXPECT_EQ((std::map<std::string, int>{{"one-b", 1}}), flagsOf(_contacts_contact._uri, _contacts_contact.image, firstId));

	// The flag is the service's: a value set on a record is refused or ignored, never stored.
	contacts_record_set_int(childAt(stored.get(), _contacts_contact.image, 0), _contacts_image_ex.extension_flag, 0);
	contacts_db_update_record(stored.get());
	EXPECT_EQ((std::map<std::string, int>{{"one-b", 1}}), flagsOf(_contacts_contact._uri, _contacts_contact.image, firstId));
}

TEST(ImageExtensionFlag, StoreOfThePreviousSchemaGainsTheFlagKeepingItsPictures)
{
	TempDataDir dir;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	int id = insertContact({"Old", "", {}, {}, 0, "old.png"});
	contacts_disconnect();
	{
		ct::db::Database old;
		ASSERT_EQ(SQLITE_OK, old.open(dir.file("contacts.db"), ct::db::OpenMode::ReadWrite));
		ASSERT_EQ(SQLITE_OK, old.exec("DROP VIEW images_v; UPDATE meta SET value = 'contacts-service/2' WHERE key = 'schema';"))
			<< old.errorMessage();
	}
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	EXPECT_EQ((std::map<std::string, int>{{"old.png", 1}}), flagsOf(_contacts_contact._uri, _contacts_contact.image, id));
	contacts_disconnect();
}
