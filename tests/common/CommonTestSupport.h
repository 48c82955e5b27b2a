// Shared by the common-layer test programs: a store or a window per test,
// owned C texts, environment overrides and where pictures go.
#pragma once

#include "../data/detail/DetailTestStore.h"

#include <Elementary.h>

#include <cstdlib>
#include <filesystem>

namespace ct::test {

using CText = std::unique_ptr<char, decltype(&free)>;

inline CText take(char* text)
{
	return CText(text, free);
}

// The main loop per test.
class LoopTest : public ::testing::Test {
protected:
	void SetUp() override { ecore_init(); }
	void TearDown() override { ecore_shutdown(); }
};

// The toolkit and a plain window per test.
class WindowTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		elm_init(0, nullptr);
		m_window = elm_win_add(nullptr, "common-test", ELM_WIN_BASIC);
	}
	void TearDown() override
	{
		evas_object_del(m_window);
		elm_shutdown();
	}
	Evas_Object* m_window = nullptr;
};

// Sets an environment variable for the scope and restores it after.
class EnvScope {
public:
	EnvScope(const char* name, const char* value) : m_name(name)
	{
		const char* old = getenv(name);
		m_had = old != nullptr;
		m_old = old ? old : "";
		setenv(name, value, 1);
	}
	~EnvScope()
	{
		if (m_had)
			setenv(m_name.c_str(), m_old.c_str(), 1);
		else
			unsetenv(m_name.c_str());
	}
	EnvScope(const EnvScope&) = delete;
	EnvScope& operator=(const EnvScope&) = delete;

private:
	std::string m_name, m_old;
	bool m_had = false;
};

// Where a picture for review goes; the folder is kept after the run.
inline std::string shotPath(const std::string& name)
{
	const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
	std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/common";
	std::filesystem::create_directories(dir);
	return dir + "/" + name + ".png";
}

} // namespace ct::test
