#include "ContactsSchema.h"

#include "contacts_types.h"
#include "contacts_views.h"

#include <algorithm>
#include <cstring>
#include <map>
#include <memory>

namespace ct::contacts {
namespace {

struct TableInfo {
	unsigned number;
	const char* table;
	const char* readSource;
	const char* baseWhere;
	bool isChild;
};

const TableInfo kTables[] = {
	{ 1, "address_books", "address_books", nullptr, false },
	{ 2, "groups", "groups", nullptr, false },
	{ 3, "persons", "persons", nullptr, false },
	{ 4, "contacts", "contacts", nullptr, false },
	{ 5, "contacts", "contacts", nullptr, false },
	{ 6, "my_profiles", "my_profiles", nullptr, false },
	{ 7, "names", "names", "owner=0", true },
	{ 8, "numbers", "numbers", "owner=0", true },
	{ 9, "emails", "emails", "owner=0", true },
	{ 10, "addresses", "addresses", "owner=0", true },
	{ 11, "messengers", "messengers", "owner=0", true },
	{ 12, "urls", "urls", "owner=0", true },
	{ 13, "relationships", "relationships", "owner=0", true },
	{ 14, "events", "events", "owner=0", true },
	{ 15, "notes", "notes", "owner=0", true },
	{ 16, "images", "images_v", "owner=0", true },
	{ 17, "nicknames", "nicknames", "owner=0", true },
	{ 18, "companies", "companies", "owner=0", true },
	{ 19, "group_relations", "group_relations_v", "owner=0", true },
	{ 20, "contact_changes", "contact_changes", nullptr, false },
	{ 21, "phone_logs", "phone_logs", nullptr, false },
	{ 22, "emergencies", "emergencies", nullptr, false },
	{ 23, "profiles", "profiles", "owner=0", true },
};

struct Registry {
	std::map<unsigned, std::unique_ptr<ViewInfo>> byNumber;
	std::map<std::string, ViewInfo*> byUri;
	std::map<const ViewInfo*, std::vector<const ViewInfo*>> children;

	ViewInfo& viewFor(unsigned number, const char* uri)
	{
		auto& slot = byNumber[number];
		if (!slot) {
			slot = std::make_unique<ViewInfo>();
			slot->uri = uri;
			slot->number = number;
			for (const TableInfo& t : kTables) {
				if (t.number == number) {
					slot->table = t.table;
					slot->readSource = t.readSource;
					slot->baseWhere = t.baseWhere;
					slot->isChild = t.isChild;
				}
			}
			byUri[uri] = slot.get();
		}
		return *slot;
	}

	void add(ViewInfo& v, unsigned id, const char* name, PropType type, bool readOnly, const char* child)
	{
		PropertyInfo p;
		p.id = id;
		p.name = name;
		p.type = type;
		p.readOnly = readOnly;
		p.childViewName = child;
		p.slot = static_cast<int>(v.props.size());
		v.slotById[id] = p.slot;
		v.props.push_back(p);
	}

	Registry();
};

bool accessIsReadOnly(const char* access) { return strcmp(access, "RO") == 0; }

std::string columnList(const ViewInfo& view, size_t width)
{
	std::string cols;
	for (const PropertyInfo* p : view.columns)
		cols += ", \"" + std::string(p->name) + "\"";
	for (size_t i = view.columns.size(); i < width; ++i)
		cols += ", NULL";
	return cols;
}

// See ViewInfo::selectWithChildrenSql. The id is repeated as column 1. An
// ORDER BY would sort every part in a temporary tree; the reader orders the
// few rows itself.
std::string selectWithChildren(const ViewInfo& view, const std::vector<const ViewInfo*>& children)
{
	size_t width = view.columns.size();
	for (const ViewInfo* child : children)
		width = std::max(width, child->columns.size());
	std::string sql = "SELECT 0, id" + columnList(view, width) + " FROM " + view.readSource + " WHERE id = ?1";
	if (view.baseWhere)
		sql += std::string(" AND ") + view.baseWhere;
	for (size_t i = 0; i < children.size(); ++i) {
		sql += " UNION ALL SELECT " + std::to_string(i + 1) + ", id" + columnList(*children[i], width) + " FROM "
			+ children[i]->readSource + " WHERE contact_id = ?1 AND owner = ?2";
	}
	return sql;
}

Registry::Registry()
{
	std::map<std::string, const char*> uriOfViewName;
	ViewInfo* current = nullptr;
#define CONTACTS_VIEW(view, number, uri, index_base) \
	current = &viewFor(number, uri); \
	uriOfViewName[#view] = uri;
#define CONTACTS_PROP(view, name, type, access) \
	add(*current, view.name, #name, PropType(CONTACTS_PROPERTY_TYPE_OF(view.name)), accessIsReadOnly(#access), nullptr);
#define CONTACTS_CHILD(view, name, child_view) add(*current, view.name, #name, PropType::Record, false, #child_view);
#define CONTACTS_VIEW_END(view)
#include "contacts_view_list.h"
#undef CONTACTS_VIEW
#undef CONTACTS_PROP
#undef CONTACTS_CHILD
#undef CONTACTS_VIEW_END
	for (auto& [number, view] : byNumber) {
		std::string cols;
		for (const PropertyInfo& p : view->props) {
			if (p.type == PropType::Record)
				continue;
			view->columns.push_back(&p);
			cols += (cols.empty() ? "\"" : ", \"") + std::string(p.name) + "\"";
		}
		view->selectSql = "SELECT " + cols + " FROM " + (view->readSource ? view->readSource : "");
		view->selectByIdSql = view->selectSql + " WHERE id = ?";
		if (view->baseWhere)
			view->selectByIdSql += std::string(" AND ") + view->baseWhere;
		for (PropertyInfo& p : view->props) {
			if (p.type != PropType::Record)
				continue;
			p.child = byUri[uriOfViewName[p.childViewName]];
			children[view.get()].push_back(p.child);
		}
	}
	for (auto& [number, view] : byNumber) {
		auto kids = children.find(view.get());
		if (kids != children.end())
			view->selectWithChildrenSql = selectWithChildren(*view, kids->second);
	}
}

const Registry& registry()
{
	static const Registry r;
	return r;
}

} // namespace

const PropertyInfo* ViewInfo::find(unsigned propertyId) const
{
	auto it = slotById.find(propertyId);
	return it == slotById.end() ? nullptr : &props[it->second];
}

const PropertyInfo* ViewInfo::findByName(const char* name) const
{
	for (const PropertyInfo& p : props)
		if (strcmp(p.name, name) == 0)
			return &p;
	return nullptr;
}

const ViewInfo* ContactsSchema::view(const char* uri)
{
	if (!uri)
		return nullptr;
	const auto& r = registry();
	auto it = r.byUri.find(uri);
	return it == r.byUri.end() ? nullptr : it->second;
}

const ViewInfo* ContactsSchema::viewOf(unsigned propertyId)
{
	const auto& r = registry();
	auto it = r.byNumber.find(propertyId >> 16);
	return it == r.byNumber.end() ? nullptr : it->second.get();
}

const std::vector<const ViewInfo*>& ContactsSchema::childViews(const ViewInfo& parent)
{
	static const std::vector<const ViewInfo*> none;
	const auto& r = registry();
	auto it = r.children.find(&parent);
	return it == r.children.end() ? none : it->second;
}

namespace {

const char* kContactFamilyKey = "contacts.view.contact+children";

bool isContactFamily(const ViewInfo& view)
{
	if (view.number == kPersonView || view.number == kSimpleContactView || view.number == kContactView)
		return true;
	const auto& kids = ContactsSchema::childViews(*ContactsSchema::view("contacts.view.contact"));
	return std::find(kids.begin(), kids.end(), &view) != kids.end();
}

} // namespace

std::string ContactsSchema::changeKeyOf(const ViewInfo& view)
{
	return isContactFamily(view) ? kContactFamilyKey : view.uri;
}

std::vector<std::string> ContactsSchema::urisOfChangeKey(const std::string& key)
{
	if (key != kContactFamilyKey) {
		const ViewInfo* v = view(key.c_str());
		return v ? std::vector<std::string>{ v->uri } : std::vector<std::string>{};
	}
	std::vector<std::string> uris = { "contacts.view.person", "contacts.view.simple_contact", "contacts.view.contact" };
	for (const ViewInfo* child : childViews(*view("contacts.view.contact")))
		uris.push_back(child->uri);
	return uris;
}

const char* ContactsSchema::schemaTag() { return "contacts-service/4"; }

namespace {

// Pictures as read: each with its extension flag (see contacts_view_list.h).
#define CT_IMAGES_VIEW_SQL \
	"CREATE VIEW IF NOT EXISTS images_v AS SELECT i.id AS id, i.contact_id AS contact_id, i.owner AS owner, i.type AS type,\n" \
	"	i.label AS label, i.path AS path, i.is_default AS is_default, i.\"order\" AS \"order\",\n" \
	"	(i.id = (SELECT j.id FROM images j WHERE j.contact_id = i.contact_id AND j.owner = i.owner\n" \
	"		ORDER BY j.\"order\", j.id LIMIT 1)) AS extension_flag FROM images i;\n"

} // namespace

const char* ContactsSchema::upgradeSql(const std::string& fromTag)
{
	// The built-in books were named like their providers before tag 4.
#define CT_RENAME_BUILT_IN_BOOKS \
	"UPDATE address_books SET name = '" CONTACTS_PHONE_ADDRESS_BOOK_NAME "' WHERE id = 0 AND name = 'Phone';\n" \
	"UPDATE address_books SET name = '" CONTACTS_SIM1_ADDRESS_BOOK_NAME "' WHERE account_id = 0 AND name = 'SIM1';\n" \
	"UPDATE address_books SET name = '" CONTACTS_SIM2_ADDRESS_BOOK_NAME "' WHERE account_id = 0 AND name = 'SIM2';\n"
	if (fromTag == "contacts-service/1")
		return R"SQL(
CREATE TABLE profiles(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, uid TEXT, text TEXT, service_operation TEXT, mime TEXT, app_id TEXT, uri TEXT, category TEXT,
	extra_data TEXT);
CREATE INDEX profiles_contact ON profiles(contact_id, owner);
)SQL" CT_IMAGES_VIEW_SQL CT_RENAME_BUILT_IN_BOOKS;
	if (fromTag == "contacts-service/2")
		return CT_IMAGES_VIEW_SQL CT_RENAME_BUILT_IN_BOOKS;
	if (fromTag == "contacts-service/3")
		return CT_RENAME_BUILT_IN_BOOKS;
#undef CT_RENAME_BUILT_IN_BOOKS
	return nullptr;
}

const char* ContactsSchema::createSql()
{
	return R"SQL(
CREATE TABLE meta(key TEXT PRIMARY KEY, value) WITHOUT ROWID;
CREATE TABLE view_versions(uri TEXT PRIMARY KEY, version INTEGER NOT NULL) WITHOUT ROWID;
CREATE TABLE ringtones(kind INTEGER, id INTEGER, path TEXT, flag INTEGER, position INTEGER, PRIMARY KEY(kind, id));
CREATE TABLE address_books(id INTEGER PRIMARY KEY AUTOINCREMENT, account_id INTEGER DEFAULT 0, name TEXT,
	mode INTEGER DEFAULT 0, provider_name TEXT, user_name TEXT);
CREATE TABLE groups(id INTEGER PRIMARY KEY AUTOINCREMENT, address_book_id INTEGER DEFAULT 0, name TEXT, ringtone_path TEXT,
	image_path TEXT, vibration TEXT, message_alert TEXT, system_id TEXT, is_read_only INTEGER DEFAULT 0);
CREATE TABLE persons(id INTEGER PRIMARY KEY AUTOINCREMENT, display_name TEXT, display_name_index TEXT,
	display_contact_id INTEGER DEFAULT 0, ringtone_path TEXT, image_thumbnail_path TEXT, vibration TEXT,
	message_alert TEXT, status TEXT, is_favorite INTEGER DEFAULT 0, favorite_priority REAL DEFAULT 0,
	link_count INTEGER DEFAULT 0, addressbook_ids TEXT, has_phonenumber INTEGER DEFAULT 0,
	has_email INTEGER DEFAULT 0, image_id INTEGER DEFAULT 0, changed_ver INTEGER DEFAULT 0);
CREATE INDEX persons_name ON persons(display_name);
CREATE VIRTUAL TABLE persons_fts USING fts5(display_name, content='persons', content_rowid='id', tokenize='trigram');
CREATE TRIGGER persons_fts_ai AFTER INSERT ON persons BEGIN
	INSERT INTO persons_fts(rowid, display_name) VALUES (new.id, new.display_name); END;
CREATE TRIGGER persons_fts_ad AFTER DELETE ON persons BEGIN
	INSERT INTO persons_fts(persons_fts, rowid, display_name) VALUES ('delete', old.id, old.display_name); END;
CREATE TRIGGER persons_fts_au AFTER UPDATE OF display_name ON persons BEGIN
	INSERT INTO persons_fts(persons_fts, rowid, display_name) VALUES ('delete', old.id, old.display_name);
	INSERT INTO persons_fts(rowid, display_name) VALUES (new.id, new.display_name); END;
CREATE TABLE contacts(id INTEGER PRIMARY KEY AUTOINCREMENT, display_name TEXT, display_source_type INTEGER DEFAULT 0,
	address_book_id INTEGER DEFAULT 0, ringtone_path TEXT, image_thumbnail_path TEXT, is_favorite INTEGER DEFAULT 0,
	has_phonenumber INTEGER DEFAULT 0, has_email INTEGER DEFAULT 0, person_id INTEGER NOT NULL, uid TEXT,
	vibration TEXT, message_alert TEXT, changed_time INTEGER DEFAULT 0, link_mode INTEGER DEFAULT 0,
	changed_ver INTEGER DEFAULT 0);
CREATE INDEX contacts_person ON contacts(person_id);
CREATE INDEX contacts_book ON contacts(address_book_id);
CREATE TABLE my_profiles(id INTEGER PRIMARY KEY AUTOINCREMENT, display_name TEXT, address_book_id INTEGER DEFAULT 0,
	image_thumbnail_path TEXT, uid TEXT, changed_time INTEGER DEFAULT 0, status TEXT, profile_type INTEGER DEFAULT 0,
	privacy INTEGER DEFAULT 0, sharing_enabled INTEGER DEFAULT 0);
CREATE TABLE names(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, first TEXT, last TEXT,
	addition TEXT, suffix TEXT, prefix TEXT, phonetic_first TEXT, phonetic_middle TEXT, phonetic_last TEXT);
CREATE TABLE numbers(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, is_default INTEGER DEFAULT 0, number TEXT, normalized_number TEXT, cleaned_number TEXT);
CREATE TABLE emails(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, is_default INTEGER DEFAULT 0, email TEXT);
CREATE TABLE addresses(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, postbox TEXT, postal_code TEXT, region TEXT, locality TEXT, street TEXT, country TEXT,
	extended TEXT, is_default INTEGER DEFAULT 0);
CREATE TABLE messengers(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0,
	type INTEGER DEFAULT 0, label TEXT, im_id TEXT);
CREATE TABLE urls(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, url TEXT);
CREATE TABLE relationships(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0,
	type INTEGER DEFAULT 0, label TEXT, name TEXT);
CREATE TABLE events(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, date INTEGER DEFAULT 0, calendar_type INTEGER DEFAULT 0, is_leap_month INTEGER DEFAULT 0);
CREATE TABLE notes(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, note TEXT);
CREATE TABLE images(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, path TEXT, is_default INTEGER DEFAULT 0, "order" INTEGER DEFAULT 0);
)SQL" CT_IMAGES_VIEW_SQL R"SQL(
CREATE TABLE nicknames(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, name TEXT);
CREATE TABLE profiles(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, uid TEXT, text TEXT, service_operation TEXT, mime TEXT, app_id TEXT, uri TEXT, category TEXT,
	extra_data TEXT);
CREATE TABLE companies(id INTEGER PRIMARY KEY, contact_id INTEGER, owner INTEGER DEFAULT 0, type INTEGER DEFAULT 0,
	label TEXT, name TEXT, department TEXT, job_title TEXT, assistant_name TEXT, role TEXT, logo TEXT,
	location TEXT, description TEXT, phonetic_name TEXT);
CREATE TABLE group_relations(id INTEGER PRIMARY KEY, group_id INTEGER, contact_id INTEGER, owner INTEGER DEFAULT 0);
CREATE VIEW group_relations_v AS SELECT r.id AS id, r.group_id AS group_id, r.contact_id AS contact_id,
	r.owner AS owner, g.name AS name FROM group_relations r LEFT JOIN groups g ON g.id = r.group_id;
CREATE INDEX names_contact ON names(contact_id, owner);
CREATE INDEX numbers_contact ON numbers(contact_id, owner);
CREATE INDEX emails_contact ON emails(contact_id, owner);
CREATE INDEX addresses_contact ON addresses(contact_id, owner);
CREATE INDEX messengers_contact ON messengers(contact_id, owner);
CREATE INDEX urls_contact ON urls(contact_id, owner);
CREATE INDEX relationships_contact ON relationships(contact_id, owner);
CREATE INDEX events_contact ON events(contact_id, owner);
CREATE INDEX notes_contact ON notes(contact_id, owner);
CREATE INDEX images_contact ON images(contact_id, owner);
CREATE INDEX nicknames_contact ON nicknames(contact_id, owner);
CREATE INDEX profiles_contact ON profiles(contact_id, owner);
CREATE INDEX companies_contact ON companies(contact_id, owner);
CREATE INDEX group_relations_contact ON group_relations(contact_id, owner);
CREATE INDEX group_relations_group ON group_relations(group_id);
CREATE INDEX numbers_number ON numbers(number);
CREATE TABLE contact_changes(contact_id INTEGER, address_book_id INTEGER, type INTEGER, version INTEGER,
	image_changed INTEGER DEFAULT 0);
CREATE INDEX contact_changes_version ON contact_changes(version);
CREATE TABLE phone_logs(id INTEGER PRIMARY KEY, person_id INTEGER DEFAULT 0, address TEXT, log_time INTEGER DEFAULT 0,
	log_type INTEGER DEFAULT 0, extra_data1 INTEGER DEFAULT 0, extra_data2 TEXT);
CREATE TABLE emergencies(id INTEGER PRIMARY KEY, person_id INTEGER, number_id INTEGER, value INTEGER DEFAULT 0);
INSERT INTO meta(key, value) VALUES ('version', 0), ('name_display_order', 0);
)SQL"
	"INSERT INTO address_books(id, account_id, name, mode, provider_name) VALUES (0, 0, '"
	CONTACTS_PHONE_ADDRESS_BOOK_NAME "', 0, '" CONTACTS_PHONE_PROVIDER_NAME "');\n";
}

} // namespace ct::contacts
