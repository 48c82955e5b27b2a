// contacts-ctl block add|remove|check|list
#include "CtlCommand.h"
#include "CtlText.h"

#include "phone_misc.h"

#include <cstdio>

namespace {

using namespace ct::ctl;

const char kName[] = "block";

class Connection {
public:
	Connection() { m_status = phone_misc_connect(&m_handle); }
	~Connection()
	{
		if (m_handle)
			phone_misc_disconnect(m_handle);
	}
	Connection(const Connection&) = delete;
	Connection& operator=(const Connection&) = delete;

	int status() const { return m_status; }
	phone_misc_h handle() const { return m_handle; }

private:
	phone_misc_h m_handle = nullptr;
	int m_status;
};

void printNumber(const char* number, void*)
{
	printf("%s\n", number);
}

int change(const Connection& connection, const std::string& verb, const std::string& number)
{
	int rc = verb == "add"
		? phone_misc_block_add(connection.handle(), PHONE_MISC_BLOCK_TYPE_CALL, number.c_str())
		: phone_misc_block_remove(connection.handle(), PHONE_MISC_BLOCK_TYPE_CALL, number.c_str());
	if (rc == PHONE_MISC_ERROR_ALREADY_EXISTS)
		return fail(number + " is already blocked");
	if (rc == PHONE_MISC_ERROR_NO_DATA)
		return fail(number + " is not blocked");
	if (rc == PHONE_MISC_ERROR_INVALID_PARAMETER)
		return usageError(kName, "'" + number + "' is not a phone number");
	return rc == PHONE_MISC_ERROR_NONE ? kExitOk : fail("block " + verb + " failed (" + std::to_string(rc) + ")");
}

int check(const Connection& connection, const std::string& number)
{
	int rc = phone_misc_block_find(connection.handle(), PHONE_MISC_BLOCK_TYPE_CALL, number.c_str(), nullptr);
	if (rc < 0)
		return fail("block check failed (" + std::to_string(rc) + ")");
	printf("%s\n", rc > 0 ? "blocked" : "not blocked");
	return kExitOk;
}

int run(const Args& args)
{
	bool isChange = args.size() == 2 && (args[0] == "add" || args[0] == "remove");
	bool isCheck = args.size() == 2 && args[0] == "check";
	bool isList = args.size() == 1 && args[0] == "list";
	if (!isChange && !isCheck && !isList)
		return usageError(kName, "bad block arguments");
	Connection connection;
	if (connection.status() != PHONE_MISC_ERROR_NONE)
		return fail("cannot open the call-block list (" + std::to_string(connection.status()) + ")");
	if (isList)
		return phone_misc_block_foreach(connection.handle(), PHONE_MISC_BLOCK_TYPE_CALL, printNumber, nullptr)
			== PHONE_MISC_ERROR_NONE ? kExitOk : fail("block list failed");
	return isCheck ? check(connection, args[1]) : change(connection, args[0], args[1]);
}

CtlCommandRegistration registration{{kName,
	"block add|remove|check NUMBER\n"
	"block list",
	run}};

} // namespace
