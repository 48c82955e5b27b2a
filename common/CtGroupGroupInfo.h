#ifndef _CT_GROUP_GROUP_INFO_H_
#define _CT_GROUP_GROUP_INFO_H_

#include <string>
#include <vector>

// Groups of several address books that a person sees as one: all groups
// with the same shown name ("Family" of the phone and "Family" of an
// account). The caller must be connected to the contacts service.
class CtGroupGroupInfo {
public:
	struct Member {
		int groupId = 0;
		int addressbookId = 0;
	};

	// Reads each group and gathers them by shown name, in first-seen order.
	// Ids that cannot be read, and groups without a name, are logged and
	// left out; repeated ids count once.
	static std::vector<CtGroupGroupInfo> gatherByDisplayName(const std::vector<int>& groupIds);
	// The shown name of a group record's values: the translated name of a
	// known system group, else its name (invalid UTF-8 repaired); empty when
	// it has neither.
	static std::string getDisplayName(const char* name, const char* systemId);
	// Id of the group of address book `addressbookId` whose shown name is
	// `displayName`, read from the service; 0 when there is none.
	static int findGroupInAddressbook(const std::string& displayName, int addressbookId);

	const std::string& getName() const { return m_name; }
	// The system id of the first member that has one (empty when none).
	const std::string& getSystemId() const { return m_systemId; }
	const std::vector<Member>& getMembers() const { return m_members; }
	// Id of the member in that address book; 0 when none.
	int getGroupIdInAddressbook(int addressbookId) const;

private:
	explicit CtGroupGroupInfo(std::string name);

	std::string m_name;
	std::string m_systemId;
	std::vector<Member> m_members;
};

#endif
