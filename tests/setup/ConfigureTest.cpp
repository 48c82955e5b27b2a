#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <filesystem>
#include <string>
#include <sys/wait.h>

namespace ct::test {
namespace {

// The source tree: this file lives in <root>/tests/setup/.
std::string sourceRoot()
{
	std::string file = __FILE__;
	for (int i = 0; i < 3; ++i)
		file = file.substr(0, file.find_last_of('/'));
	return file;
}

int runConfigure(const std::string& buildDir, const std::string& env)
{
	std::string command = env + " " + sourceRoot() + "/scripts/configure '" + buildDir +
		"' -DCT_BUILD_BENCH=OFF >/dev/null 2>&1";
	int status = system(command.c_str());
	return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

TEST(ConfigureTest, AFailedConfigureLeavesNothingThatStopsTheNextOne)
{
	TempDataDir dir;
	const std::string build = dir.file("build");
	namespace fs = std::filesystem;

	EXPECT_NE(0, runConfigure(build, "CT_TEST_MISSING_PACKAGE=ct-no-such-package"));
	EXPECT_FALSE(fs::exists(build + "/CMakeCache.txt"));
	EXPECT_FALSE(fs::exists(build + "/Makefile"));

	ASSERT_EQ(0, runConfigure(build, ""));
	EXPECT_TRUE(fs::exists(build + "/Makefile"));
	// Configured folders are left alone.
	EXPECT_EQ(0, runConfigure(build, "CT_TEST_MISSING_PACKAGE=ct-no-such-package"));
}

} // namespace
} // namespace ct::test
