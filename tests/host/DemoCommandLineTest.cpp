#include "DemoProcess.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

namespace ct::test {
namespace {

TEST(DemoCommandLineTest, ScreenshotOfAPersonIsWrittenAndAnUnknownPersonOrUnwritablePictureIsAFailureNotACrash)
{
	TempDataDir data;
	std::string person = data.file("person 1.png");
	DemoRun run = runDemo(data.path(), "--person 1 --screenshot " + shellQuoted(person));
	ASSERT_EQ(0, run.exitCode) << run.output;
	EXPECT_TRUE(isPng(person));

	run = runDemo(data.path(), "--person 4000 --screenshot " + shellQuoted(data.file("x.png")));
	EXPECT_EQ(1, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("there is no person 4000")) << run.output;

	// A folder below a regular file cannot exist.
	std::ofstream(data.file("plain")) << "x";
	run = runDemo(data.path(), "--screenshot " + shellQuoted(data.file("plain/shot.png")));
	EXPECT_EQ(1, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("cannot write")) << run.output;
}

TEST(DemoCommandLineTest, BadArgumentsGiveAClearMessageAndExitCodeTwo)
{
	TempDataDir data;
	struct Case {
		const char* args;
		const char* message;
	};
	const Case cases[] = {
		{"--person abc", "--person needs a person id"},
		{"--person 99999999999999999999", "--person needs a person id"},
		{"--person 0", "--person needs a person id"},
		{"--person -5", "--person needs a person id"},
		{"--person", "--person needs a value"},
		{"--screenshot", "--screenshot needs a value"},
		{"--screenshot ''", "--screenshot needs a value"},
		{"--screenshots", "--screenshots needs a value"},
		{"--frobnicate", "unknown argument: --frobnicate"},
		{"--screenshot a.png --screenshots dir", "either --screenshot or --screenshots"},
	};
	for (const Case& c : cases) {
		DemoRun run = runDemo(data.path(), c.args);
		EXPECT_EQ(2, run.exitCode) << c.args << "\n" << run.output;
		EXPECT_NE(std::string::npos, run.output.find(c.message)) << c.args << "\n" << run.output;
		EXPECT_NE(std::string::npos, run.output.find("usage: contacts-demo")) << c.args;
	}
	// Nothing was started, so nothing was stored.
	EXPECT_FALSE(std::filesystem::exists(data.file("a.png")));
}

} // namespace
} // namespace ct::test
