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

TEST(DemoCommandLineTest, AResourceFolderNamedRelativelyIsUsedAndAMissingOrEmptyOneIsAClearFailure)
{
	TempDataDir data;
	const char* built = getenv("CONTACTS_RES_DIR");
	ASSERT_TRUE(built && *built);
	std::filesystem::path res(built);
	std::string absoluteShot = data.file("absolute.png");
	DemoRun run = runDemo(data.path(), "--person 1 --screenshot " + shellQuoted(absoluteShot));
	ASSERT_EQ(0, run.exitCode) << run.output;

	// Started from the folder above the resources, naming them relatively.
	std::string relativeShot = data.file("relative.png");
	std::string fromParent = "cd " + shellQuoted(res.parent_path().string()) + " && CONTACTS_RES_DIR=" +
		shellQuoted(res.filename().string());
	run = runDemo(data.path(), "--person 1 --screenshot " + shellQuoted(relativeShot), fromParent);
	ASSERT_EQ(0, run.exitCode) << run.output;
	EXPECT_EQ(std::string::npos, run.output.find("* Critical *")) << run.output;
	ASSERT_TRUE(isPng(relativeShot));
	// The scrollbar may still be fading in either picture, so equal themes give nearly, not exactly, equal files.
	double absoluteSize = std::filesystem::file_size(absoluteShot);
	EXPECT_NEAR(absoluteSize, std::filesystem::file_size(relativeShot), absoluteSize * 0.05);

	TempDataDir empty;
	for (const std::string& dir : {data.file("no-such-folder"), empty.path()}) {
		std::string shot = data.file("none.png");
		run = runDemo(data.path(), "--person 1 --screenshot " + shellQuoted(shot), "CONTACTS_RES_DIR=" + shellQuoted(dir));
		EXPECT_EQ(1, run.exitCode) << dir << "\n" << run.output;
		EXPECT_NE(std::string::npos, run.output.find("contacts-demo: no resources in " + dir)) << run.output;
		EXPECT_FALSE(std::filesystem::exists(shot));
	}
}

TEST(DemoCommandLineTest, AHeldDetailScreenClosesWhenAnotherProgramDeletesItsPerson)
{
	TempDataDir data;
	ASSERT_EQ(0, runDemo(data.path(), "").exitCode);   // makes the demo store
	std::string shot = data.file("held.png");
	std::string command = "CONTACTS_DATA_DIR=" + shellQuoted(data.path()) + " ELM_ENGINE=buffer " +
		shellQuoted(hostBuildFile("contacts-demo")) + " --person 3 --hold 4 --screenshot " + shellQuoted(shot) + " 2>/dev/null";
	FILE* demo = popen(command.c_str(), "r");
	ASSERT_NE(nullptr, demo);
	std::string output;
	char line[512];
	while (output.find("holding") == std::string::npos && fgets(line, sizeof(line), demo))
		output += line;
	EXPECT_NE(std::string::npos, output.find("holding CtDetailView")) << output;

	std::string ctl = "CONTACTS_DATA_DIR=" + shellQuoted(data.path()) + " " +
		shellQuoted(hostBuildFile("../tools/contacts-ctl")) + " contacts delete 3 >/dev/null 2>&1";
	EXPECT_EQ(0, system(ctl.c_str()));
	while (fgets(line, sizeof(line), demo))
		output += line;
	int status = pclose(demo);
	EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0) << output;
	EXPECT_NE(std::string::npos, output.find("after holding: PersonListView")) << output;
	EXPECT_TRUE(isPng(shot));
}

TEST(DemoCommandLineTest, ScreensByNameOpenThroughTheLibraryOrSayTheyAreMissing)
{
	TempDataDir data;
	DemoRun run = runDemo(data.path(), "--screen detail --person 1 --hold 0.2");
	EXPECT_EQ(0, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("after holding: CtDetailView")) << run.output;

	// A library without an export of the screen: a clear message, not a crash.
	run = runDemo(data.path(), "--screen wizard --screenshot " + shellQuoted(data.file("w.png")),
		"CONTACTS_DETAILS_LIBRARY=" + shellQuoted(hostBuildFile("libcontacts-demo-stand-in-details.so")));
	EXPECT_EQ(1, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("the wizard screen is not part of this build")) << run.output;
}

TEST(DemoCommandLineTest, ProfileEditorAndWizardOpenThroughTheirFactories)
{
	TempDataDir data;
	const std::pair<const char*, const char*> cases[] = {
		{"--screen my-profile-edit", "after holding: CtMyProfileInputView"},
		{"--screen wizard", "after holding: CtProfileWizardView"},
	};
	for (const auto& [args, expected] : cases) {
		DemoRun run = runDemo(data.path(), std::string(args) + " --hold 0.2");
		EXPECT_EQ(0, run.exitCode) << run.output;
		EXPECT_NE(std::string::npos, run.output.find(expected)) << run.output;
	}
}

TEST(DemoCommandLineTest, PictureAndMarkAsDefaultScreensAreReachedFromTheDetailScreen)
{
	TempDataDir data;
	// Person 1 has a picture; person 15 is made of three linked contacts.
	const std::pair<const char*, const char*> cases[] = {
		{"--screen pictures --person 1", "after holding: CtDetailImageView"},
		{"--screen mark-as-default --person 15", "after holding: CtDetailMarkAsDefaultView"},
	};
	for (const auto& [args, expected] : cases) {
		DemoRun run = runDemo(data.path(), std::string(args) + " --hold 0.2");
		EXPECT_EQ(0, run.exitCode) << run.output;
		EXPECT_NE(std::string::npos, run.output.find(expected)) << run.output;
	}
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
		{"--screenshot a.png --screenshots dir", "--screenshots takes no other option"},
		{"--screen nowhere", "unknown screen 'nowhere'"},
		{"--screen detail", "--screen detail needs --person ID"},
		{"--hold 0", "--hold needs a number of seconds"},
		{"--hold -1", "--hold needs a number of seconds"},
		{"--hold nan", "--hold needs a number of seconds"},
		{"--hold 2x", "--hold needs a number of seconds"},
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
