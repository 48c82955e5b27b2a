#include "HandleCensus.h"

#include <Ecore.h>
#include <contacts.h>
#include <app_preference.h>
#include <sqlite3.h>
#include <vconf.h>

#include <dlfcn.h>
#include <malloc.h>
#include <unistd.h>

#include <cstdio>
#include <mutex>
#include <set>
#include <string>
#include <tuple>
#include <unordered_map>

namespace ct::test {
namespace {

enum class Kind { Timer, Idler, Animator, Job };

// A main-loop handle made by our code, with the callback it runs.
struct Handle {
	Kind kind;
	Ecore_Task_Cb task = nullptr;
	Ecore_Cb job = nullptr;
	const void* data = nullptr;
	void* ecoreHandle = nullptr;
	bool running = false;
	bool deleted = false;
};

// The registries live until the process ends (never destroyed), so that
// handles still open at exit are not taken for leaks.
std::unordered_map<void*, Handle*>& handles()
{
	static auto* live = new std::unordered_map<void*, Handle*>();
	return *live;
}

std::set<std::tuple<std::string, void*, void*>>& storeCallbacks()
{
	static auto* live = new std::set<std::tuple<std::string, void*, void*>>();
	return *live;
}

std::set<std::tuple<std::string, void*, void*>>& settingsListeners()
{
	static auto* live = new std::set<std::tuple<std::string, void*, void*>>();
	return *live;
}

std::set<std::string>& preferenceListeners()
{
	static auto* live = new std::set<std::string>();
	return *live;
}

// Statements are also prepared on worker threads.
std::mutex& statementsLock()
{
	static auto* lock = new std::mutex();
	return *lock;
}

std::set<sqlite3_stmt*>& statements()
{
	static auto* live = new std::set<sqlite3_stmt*>();
	return *live;
}

void forget(Handle* h)
{
	handles().erase(h->ecoreHandle);
	if (h->running)
		h->deleted = true;
	else
		delete h;
}

Eina_Bool taskTrampoline(void* data)
{
	auto* h = static_cast<Handle*>(data);
	h->running = true;
	Eina_Bool again = h->task(const_cast<void*>(h->data));
	h->running = false;
	if (h->deleted) {
		delete h;
		return ECORE_CALLBACK_CANCEL;
	}
	if (!again)
		forget(h);
	return again;
}

void jobTrampoline(void* data)
{
	auto* h = static_cast<Handle*>(data);
	h->running = true;
	h->job(const_cast<void*>(h->data));
	h->running = false;
	if (h->deleted)
		delete h;
	else
		forget(h);
}

template <typename Add>
void* track(Handle* h, Add add)
{
	void* ecoreHandle = add(h);
	if (!ecoreHandle) {
		delete h;
		return nullptr;
	}
	h->ecoreHandle = ecoreHandle;
	handles()[ecoreHandle] = h;
	return ecoreHandle;
}

template <typename Del>
void* untrack(void* ecoreHandle, Del del)
{
	auto it = handles().find(ecoreHandle);
	if (it == handles().end())
		return del(ecoreHandle);
	Handle* h = it->second;
	const void* data = h->data;
	del(ecoreHandle);
	forget(h);
	return const_cast<void*>(data);
}

// Whether the code that called us is the project's: this program or one of
// its layer libraries, not the toolkit.
bool calledByOurCode(void* returnAddress)
{
	static const std::string program = [] {
		Dl_info self{};
		dladdr(reinterpret_cast<void*>(&calledByOurCode), &self);
		return std::string(self.dli_fname ? self.dli_fname : "");
	}();
	Dl_info info{};
	if (!dladdr(returnAddress, &info) || !info.dli_fname)
		return false;
	std::string file = info.dli_fname;
	return file == program || file.find("/libct-") != std::string::npos;
}

template <typename Function>
Function real(const char* name)
{
	return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name));
}

#define CT_REAL(name) static const auto real_##name = ct::test::real<decltype(&name)>(#name)
#define CT_OURS ct::test::calledByOurCode(__builtin_return_address(0))

long countOf(Kind kind)
{
	long n = 0;
	for (const auto& [ecoreHandle, h] : handles())
		n += h->kind == kind;
	return n;
}

long statementCount()
{
	std::lock_guard<std::mutex> hold(statementsLock());
	return static_cast<long>(statements().size());
}

} // namespace

std::map<std::string, long> HandleCensus::now()
{
	return {
		{ "timers", countOf(Kind::Timer) },
		{ "idlers", countOf(Kind::Idler) },
		{ "animators", countOf(Kind::Animator) },
		{ "jobs", countOf(Kind::Job) },
		{ "store change callbacks", static_cast<long>(storeCallbacks().size()) },
		{ "settings listeners", static_cast<long>(settingsListeners().size()) },
		{ "preference listeners", static_cast<long>(preferenceListeners().size()) },
		{ "prepared statements", statementCount() },
	};
}

long HandleCensus::residentBytes()
{
	malloc_trim(0);
	long pages = 0, resident = 0;
	FILE* statm = fopen("/proc/self/statm", "r");
	if (!statm)
		return -1;
	int read = fscanf(statm, "%ld %ld", &pages, &resident);
	fclose(statm);
	return read == 2 ? resident * sysconf(_SC_PAGESIZE) : -1;
}

} // namespace ct::test

using ct::test::Handle;
using ct::test::Kind;

extern "C" {

Ecore_Timer* ecore_timer_add(double in, Ecore_Task_Cb func, const void* data)
{
	CT_REAL(ecore_timer_add);
	if (!CT_OURS)
		return real_ecore_timer_add(in, func, data);
	return static_cast<Ecore_Timer*>(ct::test::track(new Handle{ Kind::Timer, func, nullptr, data },
		[in](Handle* h) -> void* { return real_ecore_timer_add(in, ct::test::taskTrampoline, h); }));
}

void* ecore_timer_del(Ecore_Timer* timer)
{
	CT_REAL(ecore_timer_del);
	return ct::test::untrack(timer, [](void* t) { return real_ecore_timer_del(static_cast<Ecore_Timer*>(t)); });
}

Ecore_Idler* ecore_idler_add(Ecore_Task_Cb func, const void* data)
{
	CT_REAL(ecore_idler_add);
	if (!CT_OURS)
		return real_ecore_idler_add(func, data);
	return static_cast<Ecore_Idler*>(ct::test::track(new Handle{ Kind::Idler, func, nullptr, data },
		[](Handle* h) -> void* { return real_ecore_idler_add(ct::test::taskTrampoline, h); }));
}

void* ecore_idler_del(Ecore_Idler* idler)
{
	CT_REAL(ecore_idler_del);
	return ct::test::untrack(idler, [](void* i) { return real_ecore_idler_del(static_cast<Ecore_Idler*>(i)); });
}

Ecore_Animator* ecore_animator_add(Ecore_Task_Cb func, const void* data)
{
	CT_REAL(ecore_animator_add);
	if (!CT_OURS)
		return real_ecore_animator_add(func, data);
	return static_cast<Ecore_Animator*>(ct::test::track(new Handle{ Kind::Animator, func, nullptr, data },
		[](Handle* h) -> void* { return real_ecore_animator_add(ct::test::taskTrampoline, h); }));
}

void* ecore_animator_del(Ecore_Animator* animator)
{
	CT_REAL(ecore_animator_del);
	return ct::test::untrack(animator,
		[](void* a) { return real_ecore_animator_del(static_cast<Ecore_Animator*>(a)); });
}

Ecore_Job* ecore_job_add(Ecore_Cb func, const void* data)
{
	CT_REAL(ecore_job_add);
	if (!CT_OURS)
		return real_ecore_job_add(func, data);
	return static_cast<Ecore_Job*>(ct::test::track(new Handle{ Kind::Job, nullptr, func, data },
		[](Handle* h) -> void* { return real_ecore_job_add(ct::test::jobTrampoline, h); }));
}

void* ecore_job_del(Ecore_Job* job)
{
	CT_REAL(ecore_job_del);
	return ct::test::untrack(job, [](void* j) { return real_ecore_job_del(static_cast<Ecore_Job*>(j)); });
}

int contacts_db_add_changed_cb(const char* uri, contacts_db_changed_cb cb, void* data)
{
	CT_REAL(contacts_db_add_changed_cb);
	int err = real_contacts_db_add_changed_cb(uri, cb, data);
	if (err == CONTACTS_ERROR_NONE)
		ct::test::storeCallbacks().emplace(uri, reinterpret_cast<void*>(cb), data);
	return err;
}

int contacts_db_remove_changed_cb(const char* uri, contacts_db_changed_cb cb, void* data)
{
	CT_REAL(contacts_db_remove_changed_cb);
	int err = real_contacts_db_remove_changed_cb(uri, cb, data);
	if (err == CONTACTS_ERROR_NONE)
		ct::test::storeCallbacks().erase({ uri, reinterpret_cast<void*>(cb), data });
	return err;
}

int vconf_notify_key_changed(const char* key, vconf_callback_fn cb, void* data)
{
	CT_REAL(vconf_notify_key_changed);
	int err = real_vconf_notify_key_changed(key, cb, data);
	if (err == 0)
		ct::test::settingsListeners().emplace(key, reinterpret_cast<void*>(cb), data);
	return err;
}

int vconf_ignore_key_changed(const char* key, vconf_callback_fn cb)
{
	CT_REAL(vconf_ignore_key_changed);
	int err = real_vconf_ignore_key_changed(key, cb);
	auto& live = ct::test::settingsListeners();
	for (auto it = live.begin(); err == 0 && it != live.end();) {
		bool same = std::get<0>(*it) == key && std::get<1>(*it) == reinterpret_cast<void*>(cb);
		it = same ? live.erase(it) : std::next(it);
	}
	return err;
}

int preference_set_changed_cb(const char* key, preference_changed_cb cb, void* data)
{
	CT_REAL(preference_set_changed_cb);
	int err = real_preference_set_changed_cb(key, cb, data);
	if (err == 0)
		ct::test::preferenceListeners().insert(key);
	return err;
}

int preference_unset_changed_cb(const char* key)
{
	CT_REAL(preference_unset_changed_cb);
	int err = real_preference_unset_changed_cb(key);
	if (err == 0)
		ct::test::preferenceListeners().erase(key);
	return err;
}

int sqlite3_prepare_v2(sqlite3* db, const char* sql, int bytes, sqlite3_stmt** stmt, const char** tail)
{
	CT_REAL(sqlite3_prepare_v2);
	bool ours = CT_OURS;
	int rc = real_sqlite3_prepare_v2(db, sql, bytes, stmt, tail);
	if (ours && rc == SQLITE_OK && stmt && *stmt) {
		std::lock_guard<std::mutex> hold(ct::test::statementsLock());
		ct::test::statements().insert(*stmt);
	}
	return rc;
}

int sqlite3_finalize(sqlite3_stmt* stmt)
{
	CT_REAL(sqlite3_finalize);
	{
		std::lock_guard<std::mutex> hold(ct::test::statementsLock());
		ct::test::statements().erase(stmt);
	}
	return real_sqlite3_finalize(stmt);
}

} // extern "C"
