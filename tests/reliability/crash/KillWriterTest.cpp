// A process saving, updating, linking, unlinking and deleting contacts is
// killed with SIGKILL at random moments; after each kill the store must be
// whole and hold every write the process saw committed.
#include "../WriterProcess.h"
#include "StoreAudit.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <random>

namespace ct::test {
namespace {

constexpr int kKillsInSuite = 8;
constexpr int kKillsInLongMode = 250;
constexpr int kMostMicrosecondsBeforeKill = 40000;

struct KillCounts {
	int kills = 0;
	int duringWrite = 0;
	long long acknowledgedWrites = 0;
	int linkedPersonsSeen = 0;
};

TEST(KillWriterTest, KilledWriterLeavesAWholeStoreWithEveryAcknowledgedWrite)
{
	TempDataDir data;
	StoreAudit audit(data.file("contacts.db"));
	std::mt19937 rng(std::random_device{}());
	KillCounts counts;
	int kills = rounds(kKillsInSuite, kKillsInLongMode);
	for (int k = 0; k < kills; ++k) {
		WriterProcess writer({ "random", std::to_string(rng()) });
		ASSERT_TRUE(writer.started()) << WriterProcess::binary();
		ASSERT_EQ("ready", writer.readLine());
		usleep(rng() % kMostMicrosecondsBeforeKill);
		writer.kill();

		long long lastAcknowledged = 0;
		std::string last;
		for (const std::string& line : writer.readAvailable()) {
			if (line.rfind("ok ", 0) == 0) {
				lastAcknowledged = std::stoll(line.substr(3));
				++counts.acknowledgedWrites;
			}
			last = line;
		}
		++counts.kills;
		counts.duringWrite += last == "begin";

		std::vector<std::string> problems = audit.problems();
		EXPECT_TRUE(problems.empty()) << "after kill " << k << ": " << testing::PrintToString(problems);
		EXPECT_GE(audit.version(), lastAcknowledged) << "after kill " << k;
		counts.linkedPersonsSeen += audit.linkedPersons();
		if (HasFailure())
			break;
	}
	printf("kills %d, of which during a write %d; acknowledged writes %lld; linked persons seen %d; "
		   "persons at the end %d\n",
		counts.kills, counts.duringWrite, counts.acknowledgedWrites, counts.linkedPersonsSeen, audit.persons());
	EXPECT_GT(counts.duringWrite, 0);
	EXPECT_GT(counts.acknowledgedWrites, 0);
}

} // namespace
} // namespace ct::test
