// Starts the toolkit once for a test program and shuts it down at the end.
// Programs that use the screen harness get it registered automatically.
#pragma once

#include <gtest/gtest.h>

namespace ct::test {

class EflEnvironment : public testing::Environment {
public:
	void SetUp() override;
	void TearDown() override;

	// Registers one environment for this program (further calls do nothing).
	static bool registerOnce();
};

} // namespace ct::test
