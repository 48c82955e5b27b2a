// What the service knows about its views: properties, types, tables, and the
// SQL schema of the database.
#pragma once

#include <string>
#include <unordered_map>
#include <vector>

namespace ct::contacts {

// View numbers (bits 16-31 of property ids) as contacts_view_list.h gives them.
enum ViewNumber : unsigned {
	kAddressBookView = 1, kGroupView = 2, kPersonView = 3, kSimpleContactView = 4, kContactView = 5,
	kMyProfileView = 6, kNameView = 7, kNumberView = 8, kEmailView = 9, kImageView = 16, kNicknameView = 17,
	kCompanyView = 18, kGroupRelationView = 19, kUpdatedInfoView = 20, kPhoneLogView = 21, kEmergencyView = 22
};

enum class PropType { Str = 1, Int = 2, Bool = 3, Lli = 4, Double = 5, Record = 6 };

struct ViewInfo;

struct PropertyInfo {
	unsigned id = 0;
	const char* name = nullptr;
	PropType type = PropType::Int;
	bool readOnly = false;
	const char* childViewName = nullptr; // for Record properties
	const ViewInfo* child = nullptr;
	int slot = 0;
};

struct ViewInfo {
	const char* uri = nullptr;
	unsigned number = 0;
	const char* table = nullptr;      // written to
	const char* readSource = nullptr; // read from (a table or an SQL view)
	const char* baseWhere = nullptr;  // rows of this view in readSource, or null
	bool isChild = false;             // rows carry contact_id and owner
	std::vector<PropertyInfo> props;

	// Null when the id is not a property of this view.
	const PropertyInfo* find(unsigned propertyId) const;
	const PropertyInfo* findByName(const char* name) const;
	bool hasRecords() const { return table != nullptr; }

	std::unordered_map<unsigned, int> slotById;
	std::vector<const PropertyInfo*> columns; // every non-record property
	std::string selectSql;                    // SELECT <columns> FROM readSource
	std::string selectByIdSql;                // ... WHERE id = ? [AND baseWhere]
	// For views with child records: the record (part 0) and its children
	// (part i: the i-th record property) in one statement, rows in no set
	// order. Columns: part, id, then the part's columns padded with NULLs; ?1
	// is the id, ?2 the owner kind of the children.
	std::string selectWithChildrenSql;
	static constexpr int kPartColumn = 0;
	static constexpr int kFirstValueColumn = 2;
};

class ContactsSchema {
public:
	// The view of a URI, or null.
	static const ViewInfo* view(const char* uri);
	// The view whose records a property id belongs to, or null.
	static const ViewInfo* viewOf(unsigned propertyId);
	// The child views of contacts (and of my profile) in load order.
	static const std::vector<const ViewInfo*>& childViews(const ViewInfo& parent);
	// The key under which changes of a view are versioned. Contacts, persons
	// and the children of contacts always change together and share one key.
	static std::string changeKeyOf(const ViewInfo& view);
	// The view URIs whose changes a stored key stands for (none when unknown).
	static std::vector<std::string> urisOfChangeKey(const std::string& key);
	// SQL that creates every table, index, trigger and default row.
	static const char* createSql();
	// SQL that brings a database of an older schema tag to the current one,
	// null when there is no way from `fromTag`.
	static const char* upgradeSql(const std::string& fromTag);
	// Stored in the meta table; a database without it is foreign.
	static const char* schemaTag();
};

} // namespace ct::contacts
