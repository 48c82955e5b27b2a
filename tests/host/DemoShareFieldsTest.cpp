// The host's share-fields request: the screen opens by name for a person.
#include "DemoProcess.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

using namespace ct::test;

TEST(DemoShareFieldsTest, TheShareFieldsScreenOpensForAPersonAndNeedsOne)
{
	TempDataDir data;
	DemoRun run = runDemo(data.path(), "--screen share-fields --person 1 --hold 0.2");
	EXPECT_EQ(0, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("after holding: CtShareContactView")) << run.output;

	run = runDemo(data.path(), "--screen share-fields");
	EXPECT_EQ(2, run.exitCode) << run.output;
	EXPECT_NE(std::string::npos, run.output.find("--screen share-fields needs --person ID")) << run.output;
}
