// libcontacts-details.so, opened with dlopen, and the factories it exports.
// A missing library or factory is logged; its screens are not offered.
#pragma once

#include "DetailsFactories.h"

#include <map>
#include <string>
#include <vector>

namespace ct::demo {

class DetailsLibrary {
public:
	// $CONTACTS_DETAILS_LIBRARY, else the library of this build (may be empty).
	static std::string defaultPath();

	// Opens `path` and resolves every factory; an empty path opens nothing.
	explicit DetailsLibrary(const std::string& path);
	// Closes the handle; the code stays mapped, since views made by it may
	// still be on their way out of the main loop.
	~DetailsLibrary();
	DetailsLibrary(const DetailsLibrary&) = delete;
	DetailsLibrary& operator=(const DetailsLibrary&) = delete;

	bool isLoaded() const { return m_handle != nullptr; }
	const std::string& path() const { return m_path; }
	// Names of the factories found, in kFactoryNames order.
	std::vector<std::string> factoryNames() const;

	// Null when the library does not have them.
	CreateDetailViewFn detailViewFactory() const;
	CreateMyProfileDetailViewFn myProfileDetailViewFactory() const;
	// Any export by name, as the function type of DetailsFactories.h.
	template <typename Fn>
	Fn factory(const char* name) const
	{
		return reinterpret_cast<Fn>(__symbol(name));
	}

private:
	void* __symbol(const char* name) const;

	std::string m_path;
	void* m_handle = nullptr;
	std::map<std::string, void*> m_factories;
};

} // namespace ct::demo
