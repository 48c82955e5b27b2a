#include "DemoProcess.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <filesystem>

namespace ct::test {
namespace {

TEST(DemoDetailLibraryTest, DetailScreensComeFromTheLoadedLibraryAndItsRequestsReachTheDemoHandlers)
{
	TempDataDir data;
	std::string library = hostBuildFile("libcontacts-demo-stand-in-details.so");
	std::string standIn = "CONTACTS_LOG_LEVEL=info CONTACTS_DETAILS_LIBRARY=" + shellQuoted(library);
	std::string shot = data.file("person.png");
	DemoRun run = runDemo(data.path(), "--person 2 --screenshot " + shellQuoted(shot), standIn);
	ASSERT_EQ(0, run.exitCode) << run.output;
	EXPECT_TRUE(isPng(shot));
	EXPECT_EQ(std::string::npos, run.output.find("no detail screen")) << run.output;
	// The stand-in's call request was answered by the demo's phone.
	EXPECT_NE(std::string::npos, run.output.find("demo handler: Call: tel:+person2")) << run.output;
	// Factories the library lacks are named, not fatal.
	EXPECT_NE(std::string::npos, run.output.find("createCtInputView is not exported")) << run.output;
	EXPECT_EQ(std::string::npos, run.output.find("createCtDetailView is not exported")) << run.output;

	// The screenshot series: the list, then the detail screens of chosen persons.
	std::string dir = data.file("shots");
	run = runDemo(data.path(), "--screenshots " + shellQuoted(dir), standIn);
	ASSERT_EQ(0, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find(dir + "/01-person-list.png")) << run.output;
	EXPECT_TRUE(isPng(dir + "/01-person-list.png"));
	int detailShots = 0;
	for (const auto& entry : std::filesystem::directory_iterator(dir)) {
		std::string name = entry.path().filename().string();
		if (name.find("-person-") != std::string::npos) {
			++detailShots;
			EXPECT_NE(std::string::npos, run.output.find(entry.path().string())) << name;
		}
	}
	EXPECT_GE(detailShots, 4) << run.output;
}

TEST(DemoDetailLibraryTest, UnloadableLibraryLeavesThePersonListAndRefusesItsScreens)
{
	TempDataDir data;
	std::string missing = "CONTACTS_DETAILS_LIBRARY=" + shellQuoted(data.file("missing.so"));
	DemoRun run = runDemo(data.path(), "--person 1 --screenshot " + shellQuoted(data.file("p.png")), missing);
	EXPECT_EQ(1, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("dlopen(")) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("the detail screen is not part of this build")) << run.output;

	run = runDemo(data.path(), "--screenshot " + shellQuoted(data.file("list.png")), missing);
	EXPECT_EQ(0, run.exitCode) << run.output;
	EXPECT_TRUE(isPng(data.file("list.png")));
}

} // namespace
} // namespace ct::test
