// Points the platform services at a fresh, empty data folder for one scope.
#pragma once

#include <cstdlib>
#include <filesystem>
#include <string>

namespace ct::test {

class TempDataDir {
public:
	TempDataDir()
	{
		const char* prev = getenv("CONTACTS_DATA_DIR");
		m_previous = prev ? prev : "";
		std::string base = m_previous.empty() ? "/tmp" : m_previous;
		std::string pattern = base + "/case-XXXXXX";
		if (mkdtemp(pattern.data()))
			m_path = pattern;
		setenv("CONTACTS_DATA_DIR", m_path.c_str(), 1);
	}
	~TempDataDir()
	{
		if (m_previous.empty())
			unsetenv("CONTACTS_DATA_DIR");
		else
			setenv("CONTACTS_DATA_DIR", m_previous.c_str(), 1);
		std::error_code ec;
		std::filesystem::remove_all(m_path, ec);
	}
	TempDataDir(const TempDataDir&) = delete;
	TempDataDir& operator=(const TempDataDir&) = delete;

	const std::string& path() const { return m_path; }
	std::string file(const std::string& name) const { return m_path + "/" + name; }

private:
	std::string m_previous;
	std::string m_path;
};

} // namespace ct::test
