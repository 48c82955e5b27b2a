// Starts the toolkit once for the whole program: repeated elm_init/shutdown
// cycles are not something the toolkit promises to survive.
#include <Elementary.h>
#include <gtest/gtest.h>

#include <cstdlib>

namespace {

class ToolkitEnvironment : public testing::Environment {
public:
	void SetUp() override
	{
		if (!getenv("CONTACTS_RES_DIR"))
			ADD_FAILURE() << "CONTACTS_RES_DIR must name the build's resource folder (ctest sets it)";
		elm_init(0, nullptr);
	}
	void TearDown() override { elm_shutdown(); }
};

const testing::Environment* const registered =
	testing::AddGlobalTestEnvironment(new ToolkitEnvironment);

} // namespace
