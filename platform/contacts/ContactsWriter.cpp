#include "ContactsWriter.h"

#include "ContactsDebug.h"

#include <ctime>
#include <cstring>
#include <set>

namespace ct::contacts {
namespace {

SqlParam paramOf(const PropertyInfo& p, const contacts_record_s::Value& v)
{
	SqlParam out;
	if (p.type == PropType::Str) {
		out.kind = v.s ? SqlParam::Kind::Text : SqlParam::Kind::Null;
		if (v.s)
			out.text = *v.s;
	} else if (p.type == PropType::Double) {
		out.kind = SqlParam::Kind::Double;
		out.d = v.d;
	} else {
		out.i = v.i;
	}
	return out;
}

SqlParam intParam(int64_t v)
{
	SqlParam p;
	p.i = v;
	return p;
}

SqlParam textParam(const std::string& s)
{
	SqlParam p;
	p.kind = SqlParam::Kind::Text;
	p.text = s;
	return p;
}

bool inExtra(const std::vector<std::pair<std::string, SqlParam>>& extra, const char* name)
{
	for (const auto& e : extra)
		if (e.first == name)
			return true;
	return false;
}

// Digits (and a leading +) of a phone number, for matching.
std::string cleanedNumber(const char* number)
{
	std::string out;
	for (const char* c = number ? number : ""; *c; ++c)
		if ((*c >= '0' && *c <= '9') || (*c == '+' && out.empty()))
			out += *c;
	return out;
}

SqlParam optionalText(const std::optional<std::string>& s)
{
	SqlParam p;
	p.kind = s ? SqlParam::Kind::Text : SqlParam::Kind::Null;
	if (s)
		p.text = *s;
	return p;
}

// A new contact of a new person: its first number and first e-mail become the
// defaults unless the record names one.
std::set<const contacts_record_s*> firstChildrenAsDefaults(const contacts_record_s& contact)
{
	std::set<const contacts_record_s*> out;
	for (const char* prop : { "number", "email" }) {
		const auto* list = contact.children(prop);
		bool named = false;
		for (const contacts_record_s* c : *list)
			named |= c->getInt("is_default") != 0;
		if (!named && !list->empty())
			out.insert(list->front());
	}
	return out;
}

bool isContactOwned(const ViewInfo& v) { return v.isChild; }

} // namespace

ContactsWriter::ContactsWriter(ContactsConnection& conn, WriteContext& ctx)
	: m_conn(conn), m_ctx(ctx), m_reader(conn), m_persons(conn, ctx)
{
}

int ContactsWriter::__run(const char* sql, std::initializer_list<int> values)
{
	CachedStatement st(m_conn.statement(sql));
	int index = 1;
	for (int v : values)
		st->bind(index++, v);
	int rc = st->run();
	return rc == SQLITE_DONE ? CONTACTS_ERROR_NONE : m_conn.failed(sql, rc);
}

int ContactsWriter::__insertRow(const ViewInfo& view, const contacts_record_s& record, const Extra& extra, int* id)
{
	std::string cols, marks;
	std::vector<SqlParam> params;
	auto add = [&](const std::string& name, const SqlParam& p) {
		cols += (cols.empty() ? "" : ", ") + quoted(name.c_str());
		marks += marks.empty() ? "?" : ", ?";
		params.push_back(p);
	};
	for (const PropertyInfo* p : view.columns)
		if (!p->readOnly && !inExtra(extra, p->name))
			add(p->name, paramOf(*p, record.values[p->slot]));
	for (const auto& e : extra)
		add(e.first, e.second);
	if (view.number == kNumberView) {
		std::string cleaned = cleanedNumber(record.getStr("number"));
		add("cleaned_number", textParam(cleaned));
		add("normalized_number", textParam(cleaned));
	}
	CachedStatement st(m_conn.statement(std::string("INSERT INTO ") + view.table + " (" + cols + ") VALUES (" + marks + ")"));
	bindParams(*st, params);
	int rc = st->run();
	if (rc != SQLITE_DONE)
		return m_conn.failed(view.table, rc);
	*id = static_cast<int>(m_conn.database().lastInsertRowId());
	return CONTACTS_ERROR_NONE;
}

int ContactsWriter::__updateRow(const ViewInfo& view, const contacts_record_s& record, const Extra& extra, int id,
	bool* found)
{
	std::string sets;
	std::vector<SqlParam> params;
	auto add = [&](const std::string& name, const SqlParam& p) {
		sets += (sets.empty() ? "" : ", ") + quoted(name.c_str()) + " = ?";
		params.push_back(p);
	};
	// Only what the record holds is written, so a record read with a
	// projection cannot clear the properties it did not read.
	for (const PropertyInfo* p : view.columns)
		if (!p->readOnly && !inExtra(extra, p->name) && record.values[p->slot].set)
			add(p->name, paramOf(*p, record.values[p->slot]));
	for (const auto& e : extra)
		add(e.first, e.second);
	if (view.number == kNumberView && record.value("number")->set) {
		std::string cleaned = cleanedNumber(record.getStr("number"));
		add("cleaned_number", textParam(cleaned));
		add("normalized_number", textParam(cleaned));
	}
	if (sets.empty())
		sets = "id = id";
	params.push_back(intParam(id));
	CachedStatement st(m_conn.statement(std::string("UPDATE ") + view.table + " SET " + sets + " WHERE id = ?"));
	bindParams(*st, params);
	int rc = st->run();
	if (rc != SQLITE_DONE)
		return m_conn.failed(view.table, rc);
	*found = m_conn.database().changes() > 0;
	return CONTACTS_ERROR_NONE;
}

int ContactsWriter::__setIdAfterCommit(contacts_record_s& record, int id)
{
	contacts_record_s* r = &record;
	m_ctx.onCommit.push_back([r, id]() { r->setInt("id", id); });
	return CONTACTS_ERROR_NONE;
}

int ContactsWriter::__checkChild(const ViewInfo& view, const contacts_record_s& child)
{
	if (view.number != kGroupRelationView)
		return CONTACTS_ERROR_NONE;
	static const ViewInfo* groups = ContactsSchema::view("contacts.view.group");
	WPRET_VM(!m_reader.exists(*groups, child.getInt("group_id")), CONTACTS_ERROR_INVALID_PARAMETER,
		"no group %d", child.getInt("group_id"));
	return CONTACTS_ERROR_NONE;
}

void ContactsWriter::__numberImageOrder(contacts_record_s& record)
{
	// Pictures keep their place in the picture order: one stored without an
	// order takes its position among the contact's.
	auto* images = record.children("image");
	if (!images)
		return;
	int position = 0;
	for (contacts_record_s* image : *images) {
		++position;
		if (image->getInt("order") <= 0)
			image->setInt("order", position);
	}
}

int ContactsWriter::__writeChildren(contacts_record_s& record, int ownerId, int owner, bool replace,
	const std::set<const contacts_record_s*>& defaults)
{
	__numberImageOrder(record);
	for (const PropertyInfo& p : record.view->props) {
		if (p.type != PropType::Record)
			continue;
		const ViewInfo& child = *p.child;
		std::set<int> stored;
		if (replace) {
			CachedStatement st(m_conn.statement(std::string("SELECT id FROM ") + child.table
				+ " WHERE contact_id = ? AND owner = ?"));
			st->bind(1, ownerId).bind(2, owner);
			while (st->step() == SQLITE_ROW)
				stored.insert(st->columnInt(0));
		}
		std::set<int> kept;
		for (contacts_record_s* c : record.childLists[p.slot]) {
			int err = __checkChild(child, *c);
			if (err != CONTACTS_ERROR_NONE)
				return err;
			Extra extra = { { "contact_id", intParam(ownerId) }, { "owner", intParam(owner) } };
			if (defaults.count(c))
				extra.push_back({ "is_default", intParam(1) });
			int id = c->getInt("id");
			if (stored.count(id) && !kept.count(id)) {
				bool found = false;
				err = __updateRow(child, *c, extra, id, &found);
				kept.insert(id);
			} else {
				err = __insertRow(child, *c, extra, &id);
				__setIdAfterCommit(*c, id);
			}
			if (err != CONTACTS_ERROR_NONE)
				return err;
			m_ctx.onCommit.push_back([c, ownerId]() { c->setInt("contact_id", ownerId); });
		}
		for (int id : stored) {
			if (kept.count(id))
				continue;
			CachedStatement st(m_conn.statement(std::string("DELETE FROM ") + child.table + " WHERE id = ?"));
			int rc = st->bind(1, id).run();
			if (rc != SQLITE_DONE)
				return m_conn.failed(child.table, rc);
		}
	}
	return CONTACTS_ERROR_NONE;
}

void ContactsWriter::__touchContactViews()
{
	static const char* uris[] = { "contacts.view.contact", "contacts.view.simple_contact", "contacts.view.person" };
	for (const char* uri : uris)
		m_ctx.touch(*ContactsSchema::view(uri));
	for (const ViewInfo* child : ContactsSchema::childViews(*ContactsSchema::view("contacts.view.contact")))
		m_ctx.touch(*child);
}

int ContactsWriter::__logChange(int contactId, contacts_changed_e change, int addressBookId)
{
	if (addressBookId < 0) {
		CachedStatement st(m_conn.statement("SELECT address_book_id FROM contacts WHERE id = ?"));
		addressBookId = st->bind(1, contactId).step() == SQLITE_ROW ? st->columnInt(0) : 0;
	}
	CachedStatement st(m_conn.statement(
		"INSERT INTO contact_changes(contact_id, address_book_id, type, version) VALUES (?, ?, ?, ?)"));
	int rc = st->bind(1, contactId).bind(2, addressBookId).bind(3, static_cast<int>(change)).bind(4, m_ctx.version).run();
	return rc == SQLITE_DONE ? CONTACTS_ERROR_NONE : m_conn.failed("change log", rc);
}

int ContactsWriter::__ensureDefaults(int contactId, int personId)
{
	for (const char* table : { "numbers", "emails" }) {
		std::string sql = std::string("UPDATE ") + table + " SET is_default = 1 WHERE id = (SELECT min(id) FROM "
			+ table + " WHERE contact_id = ? AND owner = 0) AND NOT EXISTS (SELECT 1 FROM " + table
			+ " t JOIN contacts c ON c.id = t.contact_id WHERE c.person_id = ? AND t.owner = 0 AND t.is_default = 1)";
		int err = __run(sql.c_str(), { contactId, personId });
		if (err != CONTACTS_ERROR_NONE)
			return err;
	}
	return CONTACTS_ERROR_NONE;
}

int ContactsWriter::touchContact(int contactId, contacts_changed_e change)
{
	static const ViewInfo* contactView = ContactsSchema::view("contacts.view.contact");
	contacts_record_s* raw = nullptr;
	int err = m_reader.readRecord(*contactView, contactId, &raw);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	std::unique_ptr<contacts_record_s> record(raw);
	ContactSummary summary = ContactsPersons::summaryOf(*record, __nameOrder());
	CachedStatement st(m_conn.statement("UPDATE contacts SET display_name = ?, display_source_type = ?, "
		"has_phonenumber = ?, has_email = ?, image_thumbnail_path = ?, changed_time = ?, changed_ver = ? WHERE id = ?"));
	st->bind(1, summary.name.text).bind(2, summary.name.source).bind(3, summary.hasNumber ? 1 : 0);
	st->bind(4, summary.hasEmail ? 1 : 0).bind(5, summary.thumbnail ? summary.thumbnail->c_str() : nullptr);
	st->bind(6, static_cast<int64_t>(time(nullptr))).bind(7, m_ctx.version).bind(8, contactId);
	int rc = st->run();
	if (rc != SQLITE_DONE)
		return m_conn.failed("update contact", rc);
	err = __ensureDefaults(contactId, record->getInt("person_id"));
	if (err == CONTACTS_ERROR_NONE)
		err = m_persons.refresh(record->getInt("person_id"));
	if (err == CONTACTS_ERROR_NONE)
		err = __logChange(contactId, change, record->getInt("address_book_id"));
	__touchContactViews();
	return err;
}

int ContactsWriter::__nameOrder()
{
	if (m_nameOrder < 0)
		m_nameOrder = m_conn.nameDisplayOrder();
	return m_nameOrder;
}

// A new contact founds its own person. Everything both rows derive is taken
// from the record in memory, so each row is written once and nothing is read
// back.
int ContactsWriter::__insertContact(contacts_record_s& record, int* id)
{
	static const ViewInfo* books = ContactsSchema::view("contacts.view.address_book");
	int book = record.getInt("address_book_id");
	WPRET_VM(!m_reader.exists(*books, book), CONTACTS_ERROR_INVALID_PARAMETER, "no address book %d", book);
	__numberImageOrder(record);
	ContactSummary summary = ContactsPersons::summaryOf(record, __nameOrder());
	int personId = 0, expectedId = 0;
	int err = m_persons.createFor(record, summary, &personId, &expectedId);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	Extra extra = { { "person_id", intParam(personId) }, { "display_name", textParam(summary.name.text) },
		{ "display_source_type", intParam(summary.name.source) }, { "has_phonenumber", intParam(summary.hasNumber) },
		{ "has_email", intParam(summary.hasEmail) }, { "image_thumbnail_path", optionalText(summary.thumbnail) },
		{ "changed_time", intParam(time(nullptr)) }, { "changed_ver", intParam(m_ctx.version) } };
	err = __insertRow(*record.view, record, extra, id);
	if (err == CONTACTS_ERROR_NONE && *id != expectedId)
		err = m_persons.setDisplayContact(personId, *id);
	if (err == CONTACTS_ERROR_NONE)
		err = __writeChildren(record, *id, 0, false, firstChildrenAsDefaults(record));
	if (err == CONTACTS_ERROR_NONE)
		err = __logChange(*id, CONTACTS_CHANGE_INSERTED, book);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	__touchContactViews();
	contacts_record_s* r = &record;
	m_ctx.onCommit.push_back([r, personId]() { r->setInt("person_id", personId); });
	return __setIdAfterCommit(record, *id);
}

int ContactsWriter::__updateContact(contacts_record_s& record)
{
	static const ViewInfo* books = ContactsSchema::view("contacts.view.address_book");
	int id = record.getInt("id");
	int book = record.getInt("address_book_id");
	WPRET_VM(!m_reader.exists(*books, book), CONTACTS_ERROR_INVALID_PARAMETER, "no address book %d", book);
	bool found = false;
	int err = __updateRow(*record.view, record, {}, id, &found);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	if (!found)
		return CONTACTS_ERROR_NO_DATA;
	if (record.view->number == kContactView)
		err = __writeChildren(record, id, 0, true);
	return err == CONTACTS_ERROR_NONE ? touchContact(id, CONTACTS_CHANGE_UPDATED) : err;
}

int ContactsWriter::__deleteContact(int id)
{
	int personId = 0, book = 0;
	{
		CachedStatement st(m_conn.statement("SELECT person_id, address_book_id FROM contacts WHERE id = ?"));
		if (st->bind(1, id).step() != SQLITE_ROW)
			return CONTACTS_ERROR_NO_DATA;
		personId = st->columnInt(0);
		book = st->columnInt(1);
	}
	for (const ViewInfo* child : ContactsSchema::childViews(*ContactsSchema::view("contacts.view.contact"))) {
		CachedStatement st(m_conn.statement(std::string("DELETE FROM ") + child->table
			+ " WHERE contact_id = ? AND owner = 0"));
		int rc = st->bind(1, id).run();
		if (rc != SQLITE_DONE)
			return m_conn.failed(child->table, rc);
	}
	int err = __run("DELETE FROM contacts WHERE id = ?", { id });
	if (err == CONTACTS_ERROR_NONE)
		err = __run("DELETE FROM ringtones WHERE kind = 1 AND id = ?", { id });
	if (err == CONTACTS_ERROR_NONE)
		err = __logChange(id, CONTACTS_CHANGE_DELETED, book);
	if (err == CONTACTS_ERROR_NONE)
		err = m_persons.refresh(personId);
	__touchContactViews();
	return err;
}

int ContactsWriter::__insertProfile(contacts_record_s& record, int* id)
{
	DisplayName name = ContactsPersons::displayNameOf(record, __nameOrder());
	int err = __insertRow(*record.view, record, { { "display_name", textParam(name.text) } }, id);
	if (err == CONTACTS_ERROR_NONE)
		err = __writeChildren(record, *id, 1, false);
	m_ctx.touch(*record.view);
	return err == CONTACTS_ERROR_NONE ? __setIdAfterCommit(record, *id) : err;
}

int ContactsWriter::__updateProfile(contacts_record_s& record)
{
	DisplayName name = ContactsPersons::displayNameOf(record, __nameOrder());
	int id = record.getInt("id");
	bool found = false;
	int err = __updateRow(*record.view, record, { { "display_name", textParam(name.text) } }, id, &found);
	if (err == CONTACTS_ERROR_NONE && !found)
		err = CONTACTS_ERROR_NO_DATA;
	if (err == CONTACTS_ERROR_NONE)
		err = __writeChildren(record, id, 1, true);
	m_ctx.touch(*record.view);
	return err;
}

int ContactsWriter::__deleteProfile(int id)
{
	if (!m_reader.exists(*ContactsSchema::view("contacts.view.my_profile"), id))
		return CONTACTS_ERROR_NO_DATA;
	for (const ViewInfo* child : ContactsSchema::childViews(*ContactsSchema::view("contacts.view.my_profile"))) {
		CachedStatement st(m_conn.statement(std::string("DELETE FROM ") + child->table
			+ " WHERE contact_id = ? AND owner = 1"));
		int rc = st->bind(1, id).run();
		if (rc != SQLITE_DONE)
			return m_conn.failed(child->table, rc);
	}
	m_ctx.touch(*ContactsSchema::view("contacts.view.my_profile"));
	return __run("DELETE FROM my_profiles WHERE id = ?", { id });
}

int ContactsWriter::__updatePerson(contacts_record_s& record)
{
	int personId = record.getInt("id");
	std::vector<int> contacts = m_reader.contactIdsOfPerson(personId);
	if (contacts.empty())
		return CONTACTS_ERROR_NO_DATA;
	// The person's own settings live in its contacts; only those the record holds are written.
	std::string sets = "changed_ver = ?";
	std::vector<SqlParam> params = { intParam(m_ctx.version) };
	for (const char* name : { "ringtone_path", "vibration", "message_alert", "is_favorite" }) {
		const contacts_record_s::Value* v = record.value(name);
		if (!v->set)
			continue;
		sets += std::string(", ") + name + " = ?";
		params.push_back(paramOf(*record.view->findByName(name), *v));
	}
	params.push_back(intParam(personId));
	CachedStatement st(m_conn.statement("UPDATE contacts SET " + sets + " WHERE person_id = ?"));
	bindParams(*st, params);
	int rc = st->run();
	if (rc != SQLITE_DONE)
		return m_conn.failed("update person", rc);
	for (int id : contacts) {
		int err = __logChange(id, CONTACTS_CHANGE_UPDATED);
		if (err != CONTACTS_ERROR_NONE)
			return err;
	}
	__touchContactViews();
	return m_persons.refresh(personId);
}

int ContactsWriter::__deletePerson(int id)
{
	std::vector<int> contacts = m_reader.contactIdsOfPerson(id);
	if (contacts.empty())
		return CONTACTS_ERROR_NO_DATA;
	for (int contactId : contacts) {
		int err = __deleteContact(contactId);
		if (err != CONTACTS_ERROR_NONE)
			return err;
	}
	return CONTACTS_ERROR_NONE;
}

int ContactsWriter::__insertStandaloneChild(contacts_record_s& record, int* id)
{
	int contactId = record.getInt("contact_id");
	WPRET_VM(!m_reader.exists(*ContactsSchema::view("contacts.view.contact"), contactId),
		CONTACTS_ERROR_INVALID_PARAMETER, "no contact %d", contactId);
	int err = __checkChild(*record.view, record);
	if (err == CONTACTS_ERROR_NONE)
		err = __insertRow(*record.view, record, { { "owner", intParam(0) } }, id);
	if (err == CONTACTS_ERROR_NONE)
		err = touchContact(contactId, CONTACTS_CHANGE_UPDATED);
	return err == CONTACTS_ERROR_NONE ? __setIdAfterCommit(record, *id) : err;
}

int ContactsWriter::__updateStandaloneChild(contacts_record_s& record)
{
	const ViewInfo& view = *record.view;
	int id = record.getInt("id");
	int contactId = 0;
	{
		CachedStatement st(m_conn.statement(std::string("SELECT contact_id FROM ") + view.table
			+ " WHERE id = ? AND owner = 0"));
		if (st->bind(1, id).step() != SQLITE_ROW)
			return CONTACTS_ERROR_NO_DATA;
		contactId = st->columnInt(0);
	}
	int err = __checkChild(view, record);
	bool found = false;
	if (err == CONTACTS_ERROR_NONE)
		err = __updateRow(view, record, { { "contact_id", intParam(contactId) } }, id, &found);
	return err == CONTACTS_ERROR_NONE ? touchContact(contactId, CONTACTS_CHANGE_UPDATED) : err;
}

int ContactsWriter::__deleteStandaloneChild(const ViewInfo& view, int id)
{
	int contactId = 0;
	{
		CachedStatement st(m_conn.statement(std::string("SELECT contact_id FROM ") + view.table
			+ " WHERE id = ? AND owner = 0"));
		if (st->bind(1, id).step() != SQLITE_ROW)
			return CONTACTS_ERROR_NO_DATA;
		contactId = st->columnInt(0);
	}
	CachedStatement st(m_conn.statement(std::string("DELETE FROM ") + view.table + " WHERE id = ?"));
	int rc = st->bind(1, id).run();
	if (rc != SQLITE_DONE)
		return m_conn.failed(view.table, rc);
	return touchContact(contactId, CONTACTS_CHANGE_UPDATED);
}

std::vector<int> ContactsWriter::__selectIds(const char* sql, int param)
{
	std::vector<int> ids;
	CachedStatement st(m_conn.statement(sql));
	st->bind(1, param);
	while (st->step() == SQLITE_ROW)
		ids.push_back(st->columnInt(0));
	return ids;
}

int ContactsWriter::__deleteAddressBook(int id)
{
	WPRET_VM(id == 0, CONTACTS_ERROR_INVALID_PARAMETER, "the phone address book cannot be deleted");
	if (!m_reader.exists(*ContactsSchema::view("contacts.view.address_book"), id))
		return CONTACTS_ERROR_NO_DATA;
	std::vector<int> contacts = __selectIds("SELECT id FROM contacts WHERE address_book_id = ?", id);
	for (int contactId : contacts) {
		int err = __deleteContact(contactId);
		if (err != CONTACTS_ERROR_NONE)
			return err;
	}
	std::vector<int> groups = __selectIds("SELECT id FROM groups WHERE address_book_id = ?", id);
	for (int groupId : groups) {
		int err = __deleteGroup(groupId);
		if (err != CONTACTS_ERROR_NONE)
			return err;
	}
	m_ctx.touch(*ContactsSchema::view("contacts.view.address_book"));
	return __run("DELETE FROM address_books WHERE id = ?", { id });
}

int ContactsWriter::__deleteGroup(int id)
{
	if (!m_reader.exists(*ContactsSchema::view("contacts.view.group"), id))
		return CONTACTS_ERROR_NO_DATA;
	std::vector<int> members = __selectIds("SELECT DISTINCT contact_id FROM group_relations WHERE group_id = ? AND owner = 0", id);
	int err = __run("DELETE FROM group_relations WHERE group_id = ?", { id });
	if (err == CONTACTS_ERROR_NONE)
		err = __run("DELETE FROM groups WHERE id = ?", { id });
	for (int contactId : members)
		if (err == CONTACTS_ERROR_NONE)
			err = touchContact(contactId, CONTACTS_CHANGE_UPDATED);
	m_ctx.touch(*ContactsSchema::view("contacts.view.group"));
	return err;
}

int ContactsWriter::insert(contacts_record_s& record, int* id)
{
	const ViewInfo& view = *record.view;
	*id = 0;
	switch (view.number) {
	case kContactView:
		return __insertContact(record, id);
	case kMyProfileView:
		return __insertProfile(record, id);
	case kPersonView:
	case kSimpleContactView:
	case kUpdatedInfoView:
		WERROR("records of %s cannot be inserted", view.uri);
		return CONTACTS_ERROR_INVALID_PARAMETER;
	default:
		break;
	}
	if (isContactOwned(view))
		return __insertStandaloneChild(record, id);
	if (view.number == kGroupView) {
		int book = record.getInt("address_book_id");
		WPRET_VM(!m_reader.exists(*ContactsSchema::view("contacts.view.address_book"), book),
			CONTACTS_ERROR_INVALID_PARAMETER, "no address book %d", book);
	}
	if (view.number == kEmergencyView) {
		WPRET_VM(m_reader.contactIdsOfPerson(record.getInt("person_id")).empty(), CONTACTS_ERROR_INVALID_PARAMETER,
			"no person %d", record.getInt("person_id"));
	}
	int err = __insertRow(view, record, {}, id);
	m_ctx.touch(view);
	return err == CONTACTS_ERROR_NONE ? __setIdAfterCommit(record, *id) : err;
}

int ContactsWriter::update(contacts_record_s& record)
{
	const ViewInfo& view = *record.view;
	int id = record.getInt("id");
	WPRET_VM(id < 0 || view.number == kUpdatedInfoView, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	switch (view.number) {
	case kContactView:
	case kSimpleContactView:
		return __updateContact(record);
	case kMyProfileView:
		return __updateProfile(record);
	case kPersonView:
		return __updatePerson(record);
	default:
		break;
	}
	if (isContactOwned(view))
		return __updateStandaloneChild(record);
	bool found = false;
	int err = __updateRow(view, record, {}, id, &found);
	if (err == CONTACTS_ERROR_NONE && !found)
		return CONTACTS_ERROR_NO_DATA;
	m_ctx.touch(view);
	return err;
}

int ContactsWriter::remove(const ViewInfo& view, int id)
{
	WPRET_VM(id < 0 || !view.table || view.number == kUpdatedInfoView, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : id %d", id);
	switch (view.number) {
	case kContactView:
	case kSimpleContactView:
		return __deleteContact(id);
	case kPersonView:
		return __deletePerson(id);
	case kMyProfileView:
		return __deleteProfile(id);
	case kAddressBookView:
		return __deleteAddressBook(id);
	case kGroupView:
		return __deleteGroup(id);
	default:
		break;
	}
	if (isContactOwned(view))
		return __deleteStandaloneChild(view, id);
	if (!m_reader.exists(view, id))
		return CONTACTS_ERROR_NO_DATA;
	m_ctx.touch(view);
	CachedStatement st(m_conn.statement(std::string("DELETE FROM ") + view.table + " WHERE id = ?"));
	int rc = st->bind(1, id).run();
	return rc == SQLITE_DONE ? CONTACTS_ERROR_NONE : m_conn.failed(view.table, rc);
}

int ContactsWriter::linkPersons(int basePersonId, int personId)
{
	WPRET_VM(basePersonId <= 0 || personId <= 0 || basePersonId == personId, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : %d, %d", basePersonId, personId);
	std::vector<int> moved = m_reader.contactIdsOfPerson(personId);
	if (moved.empty() || m_reader.contactIdsOfPerson(basePersonId).empty())
		return CONTACTS_ERROR_NO_DATA;
	int err = __run("UPDATE contacts SET person_id = ? WHERE person_id = ?", { basePersonId, personId });
	if (err == CONTACTS_ERROR_NONE)
		err = __run("UPDATE emergencies SET person_id = ? WHERE person_id = ?", { basePersonId, personId });
	for (int id : moved)
		if (err == CONTACTS_ERROR_NONE)
			err = __logChange(id, CONTACTS_CHANGE_UPDATED);
	if (err == CONTACTS_ERROR_NONE)
		err = m_persons.refresh(personId);
	if (err == CONTACTS_ERROR_NONE)
		err = m_persons.refresh(basePersonId);
	__touchContactViews();
	return err;
}

int ContactsWriter::unlinkContact(int personId, int contactId, int* newPersonId)
{
	std::vector<int> contacts = m_reader.contactIdsOfPerson(personId);
	if (contacts.empty())
		return CONTACTS_ERROR_NO_DATA;
	bool member = false;
	for (int id : contacts)
		member |= id == contactId;
	WPRET_VM(!member, CONTACTS_ERROR_INVALID_PARAMETER, "contact %d is not in person %d", contactId, personId);
	WPRET_VM(contacts.size() < 2, CONTACTS_ERROR_INVALID_PARAMETER, "the last contact cannot be unlinked");
	int err = m_persons.create(newPersonId);
	if (err == CONTACTS_ERROR_NONE)
		err = __run("UPDATE contacts SET person_id = ? WHERE id = ?", { *newPersonId, contactId });
	if (err == CONTACTS_ERROR_NONE)
		err = m_persons.refresh(*newPersonId);
	if (err == CONTACTS_ERROR_NONE)
		err = m_persons.refresh(personId);
	if (err == CONTACTS_ERROR_NONE)
		err = __logChange(contactId, CONTACTS_CHANGE_UPDATED);
	__touchContactViews();
	return err;
}

int ContactsWriter::setDefaultProperty(int property, int personId, int id)
{
	std::vector<int> contacts = m_reader.contactIdsOfPerson(personId);
	if (contacts.empty())
		return CONTACTS_ERROR_NO_DATA;
	const char* table = nullptr;
	switch (property) {
	case CONTACTS_PERSON_PROPERTY_NAME_CONTACT: table = "contacts"; break;
	case CONTACTS_PERSON_PROPERTY_NUMBER: table = "numbers"; break;
	case CONTACTS_PERSON_PROPERTY_EMAIL: table = "emails"; break;
	case CONTACTS_PERSON_PROPERTY_IMAGE: table = "images"; break;
	default:
		WERROR("Invalid param : property %d", property);
		return CONTACTS_ERROR_INVALID_PARAMETER;
	}
	std::string owned = property == CONTACTS_PERSON_PROPERTY_NAME_CONTACT
		? "SELECT 1 FROM contacts WHERE id = ? AND person_id = ?"
		: std::string("SELECT 1 FROM ") + table + " t JOIN contacts c ON c.id = t.contact_id "
			"WHERE t.id = ? AND t.owner = 0 AND c.person_id = ?";
	{
		CachedStatement st(m_conn.statement(owned));
		WPRET_VM(st->bind(1, id).bind(2, personId).step() != SQLITE_ROW, CONTACTS_ERROR_INVALID_PARAMETER,
			"%d is not a %s of person %d", id, table, personId);
	}
	int err = CONTACTS_ERROR_NONE;
	if (property == CONTACTS_PERSON_PROPERTY_NAME_CONTACT) {
		err = __run("UPDATE persons SET display_contact_id = ? WHERE id = ?", { id, personId });
	} else {
		std::string sql = std::string("UPDATE ") + table + " SET is_default = (id = ?) WHERE owner = 0 AND "
			"contact_id IN (SELECT id FROM contacts WHERE person_id = ?)";
		err = __run(sql.c_str(), { id, personId });
		if (err == CONTACTS_ERROR_NONE && property == CONTACTS_PERSON_PROPERTY_IMAGE)
			err = __run("UPDATE persons SET image_id = ? WHERE id = ?", { id, personId });
	}
	for (int contactId : contacts)
		if (err == CONTACTS_ERROR_NONE)
			err = __logChange(contactId, CONTACTS_CHANGE_UPDATED);
	__touchContactViews();
	return err == CONTACTS_ERROR_NONE ? m_persons.refresh(personId) : err;
}

} // namespace ct::contacts
