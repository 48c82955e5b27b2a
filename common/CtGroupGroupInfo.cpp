#include "CtGroupGroupInfo.h"

#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"

#include <contacts.h>
#include <glib.h>

#include <algorithm>

namespace {

std::string validUtf8(const char* text)
{
	if (!text)
		return "";
	gchar* valid = g_utf8_make_valid(text, -1);
	std::string out = valid;
	g_free(valid);
	return out;
}

const char* textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	contacts_record_get_str_p(record, property, &value);
	return value;
}

} // namespace

CtGroupGroupInfo::CtGroupGroupInfo(std::string name)
	: m_name(std::move(name))
{
}

std::string CtGroupGroupInfo::getDisplayName(const char* name, const char* systemId)
{
	if (systemId && *systemId) {
		std::string shown = ctCommonGetDisplayGroupName(systemId);
		if (shown != systemId)
			return shown;
	}
	return validUtf8(name);
}

std::vector<CtGroupGroupInfo> CtGroupGroupInfo::gatherByDisplayName(const std::vector<int>& groupIds)
{
	std::vector<CtGroupGroupInfo> infos;
	std::vector<int> seen;
	for (int groupId : groupIds) {
		if (std::find(seen.begin(), seen.end(), groupId) != seen.end())
			continue;
		seen.push_back(groupId);
		contacts_record_h group = nullptr;
		int err = contacts_db_get_record(_contacts_group._uri, groupId, &group);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_db_get_record", err);
			continue;
		}
		const char* systemId = textOf(group, _contacts_group.system_id);
		std::string name = getDisplayName(textOf(group, _contacts_group.name), systemId);
		Member member{groupId, 0};
		contacts_record_get_int(group, _contacts_group.address_book_id, &member.addressbookId);
		if (name.empty()) {
			WERROR("group %d has no name", groupId);
		} else {
			auto it = std::find_if(infos.begin(), infos.end(), [&](const auto& info) { return info.m_name == name; });
			if (it == infos.end())
				it = infos.insert(infos.end(), CtGroupGroupInfo(name));
			if (it->m_systemId.empty() && systemId)
				it->m_systemId = systemId;
			it->m_members.push_back(member);
		}
		contacts_record_destroy(group, true);
	}
	return infos;
}

int CtGroupGroupInfo::findGroupInAddressbook(const std::string& displayName, int addressbookId)
{
	WPRET_VM(displayName.empty() || addressbookId < 0, 0, "Invalid param : name or addressbook %d", addressbookId);
	contacts_filter_h filter = nullptr;
	contacts_query_h query = nullptr;
	contacts_list_h list = nullptr;
	contacts_filter_create(_contacts_group._uri, &filter);
	contacts_filter_add_int(filter, _contacts_group.address_book_id, CONTACTS_MATCH_EQUAL, addressbookId);
	contacts_query_create(_contacts_group._uri, &query);
	contacts_query_set_filter(query, filter);
	int err = contacts_db_get_records_with_query(query, 0, 0, &list);
	contacts_query_destroy(query);
	contacts_filter_destroy(filter);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_records_with_query", err);
		return 0;
	}
	int found = 0;
	contacts_record_h group = nullptr;
	while (!found && contacts_list_get_current_record_p(list, &group) == CONTACTS_ERROR_NONE) {
		if (getDisplayName(textOf(group, _contacts_group.name), textOf(group, _contacts_group.system_id)) == displayName)
			contacts_record_get_int(group, _contacts_group.id, &found);
		if (contacts_list_next(list) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(list, true);
	return found;
}

int CtGroupGroupInfo::getGroupIdInAddressbook(int addressbookId) const
{
	for (const Member& member : m_members)
		if (member.addressbookId == addressbookId)
			return member.groupId;
	return 0;
}
