// Helpers shared by the platform store tests: pumping the EFL main loop until
// something happened, an unusable data folder, and running contacts-ctl as a
// second process.
#pragma once

#include "TempDataDir.h"

#include <Ecore.h>

#include <chrono>
#include <cstdlib>
#include <cstdio>
#include <fstream>
#include <functional>
#include <string>
#include <thread>

#include <sys/wait.h>

namespace ct::test {

// Keeps ecore initialised for one scope.
class EcoreScope {
public:
	EcoreScope()
	{
		// The system modules only try to reach D-Bus and log about it.
		setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
		ecore_init();
	}
	~EcoreScope() { ecore_shutdown(); }
};

// Iterates the main loop until `done` holds or `limitSeconds` passed (a
// generous upper bound, not a timing assertion). Returns done().
inline bool pumpUntil(const std::function<bool()>& done, double limitSeconds = 5.0)
{
	auto deadline = std::chrono::steady_clock::now() + std::chrono::duration<double>(limitSeconds);
	while (!done()) {
		if (std::chrono::steady_clock::now() > deadline)
			return false;
		ecore_main_loop_iterate();
		std::this_thread::sleep_for(std::chrono::milliseconds(5));
	}
	return true;
}

// Runs the main loop for a while so that anything pending is delivered.
inline void pumpFor(double seconds)
{
	pumpUntil([] { return false; }, seconds);
}

// Points CONTACTS_DATA_DIR below a regular file for the scope, where nothing
// can be created (chmod does not stop root).
class UnusableDataDir {
public:
	explicit UnusableDataDir(const TempDataDir& dir) : m_restore(dir.path())
	{
		std::ofstream(dir.file("plain-file")) << "x";
		setenv("CONTACTS_DATA_DIR", dir.file("plain-file/data").c_str(), 1);
	}
	~UnusableDataDir() { setenv("CONTACTS_DATA_DIR", m_restore.c_str(), 1); }

private:
	std::string m_restore;
};

// The contacts-ctl built next to the tests, or "" when unknown.
inline std::string contactsCtlPath()
{
	const char* dir = getenv("CONTACTS_TEST_BIN_DIR");
	return dir && *dir ? std::string(dir) + "/tools/contacts-ctl" : std::string();
}

// Runs contacts-ctl with `args` in another process; its exit code, or -1.
inline int runContactsCtl(const std::string& args, std::string* output = nullptr)
{
	std::string command = contactsCtlPath() + " " + args + " 2>/dev/null";
	FILE* pipe = popen(command.c_str(), "r");
	if (!pipe)
		return -1;
	std::string text;
	for (char buffer[512]; fgets(buffer, sizeof buffer, pipe);)
		text += buffer;
	int status = pclose(pipe);
	if (output)
		*output = text;
	return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

} // namespace ct::test
