// Runs the contacts-demo binary of this build with a data folder of the
// test's choosing, and collects what it printed and its exit code.
#pragma once

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <sys/wait.h>

namespace ct::test {

struct DemoRun {
	int exitCode = -1;
	std::string output;   // stdout and stderr together
};

// A file the build put in its host folder.
inline std::string hostBuildFile(const char* name)
{
	const char* dir = getenv("CONTACTS_TEST_BIN_DIR");
	return std::string(dir ? dir : ".") + "/host/" + name;
}

// Quotes an argument for the shell.
inline std::string shellQuoted(const std::string& arg)
{
	std::string out = "'";
	for (char c : arg)
		out += c == '\'' ? std::string("'\\''") : std::string(1, c);
	return out + "'";
}

// `env` is put before the command as is ("NAME=value ...").
inline DemoRun runDemo(const std::string& dataDir, const std::string& args, const std::string& env = "")
{
	std::string command = env + " CONTACTS_DATA_DIR=" + shellQuoted(dataDir) + " ELM_ENGINE=buffer " +
		shellQuoted(hostBuildFile("contacts-demo")) + " " + args + " 2>&1";
	DemoRun run;
	FILE* pipe = popen(command.c_str(), "r");
	if (!pipe)
		return run;
	char buffer[4096];
	size_t n;
	while ((n = fread(buffer, 1, sizeof(buffer), pipe)) > 0)
		run.output.append(buffer, n);
	int status = pclose(pipe);
	run.exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
	return run;
}

// A PNG file of a real picture (more than a few bytes).
inline bool isPng(const std::string& path)
{
	std::ifstream in(path, std::ios::binary);
	char signature[8] = {};
	in.read(signature, sizeof(signature));
	return in && std::string(signature + 1, 3) == "PNG" && std::filesystem::file_size(path) > 1000;
}

} // namespace ct::test
