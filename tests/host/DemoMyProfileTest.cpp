// The host's profile screens: the user's own profile opens by name, and
// profile sharing is reached from its more menu.
#include "DemoProcess.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

using namespace ct::test;

TEST(DemoMyProfileTest, TheProfileScreenOpensByNameAndItsMoreMenuReachesProfileSharing)
{
	TempDataDir data;
	struct Case {
		const char* screen;
		const char* shownAfter;
	};
	const Case cases[] = {
		{"my-profile", "after holding: CtMyProfileDetailView"},
		{"profile-sharing", "after holding: CtProfileSharingView"},
	};
	for (const Case& c : cases) {
		std::string shot = data.file(std::string(c.screen) + ".png");
		DemoRun run = runDemo(data.path(), std::string("--screen ") + c.screen + " --hold 0.2 --screenshot " + shellQuoted(shot));
		EXPECT_EQ(0, run.exitCode) << run.output;
		EXPECT_NE(std::string::npos, run.output.find(c.shownAfter)) << run.output;
		EXPECT_TRUE(isPng(shot)) << c.screen;
	}
}
