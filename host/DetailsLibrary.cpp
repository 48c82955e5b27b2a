#include "DetailsLibrary.h"

#include "ContactsDebug.h"

#include <dlfcn.h>

#include <cstdlib>

#ifndef CT_DETAILS_LIBRARY
#define CT_DETAILS_LIBRARY ""
#endif

namespace ct::demo {

std::string DetailsLibrary::defaultPath()
{
	const char* env = getenv("CONTACTS_DETAILS_LIBRARY");
	return env && *env ? env : CT_DETAILS_LIBRARY;
}

DetailsLibrary::DetailsLibrary(const std::string& path)
	: m_path(path)
{
	if (path.empty()) {
		WWARNING("no contacts-details library in this build; only the person list is offered");
		return;
	}
	// RTLD_NODELETE: views made by the library may outlive this handle by a
	// main-loop turn, and the leak checker must still see its code.
	m_handle = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL | RTLD_NODELETE);
	if (!m_handle) {
		WERROR("dlopen(%s) failed: %s", path.c_str(), dlerror());
		return;
	}
	for (const char* name : kFactoryNames) {
		dlerror();
		void* symbol = dlsym(m_handle, name);
		if (symbol)
			m_factories[name] = symbol;
		else
			WINFO("%s is not exported by %s; its screens are not offered", name, path.c_str());
	}
}

DetailsLibrary::~DetailsLibrary()
{
	if (m_handle)
		dlclose(m_handle);
}

std::vector<std::string> DetailsLibrary::factoryNames() const
{
	std::vector<std::string> names;
	for (const char* name : kFactoryNames) {
		if (m_factories.count(name))
			names.push_back(name);
	}
	return names;
}

void* DetailsLibrary::__symbol(const char* name) const
{
	auto it = m_factories.find(name);
	return it == m_factories.end() ? nullptr : it->second;
}

CreateDetailViewFn DetailsLibrary::detailViewFactory() const
{
	return reinterpret_cast<CreateDetailViewFn>(__symbol("createCtDetailView"));
}

CreateMyProfileDetailViewFn DetailsLibrary::myProfileDetailViewFactory() const
{
	return reinterpret_cast<CreateMyProfileDetailViewFn>(__symbol("createCtMyProfileDetailView"));
}

} // namespace ct::demo
