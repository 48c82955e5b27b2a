// The persistent call-block list behind phone_misc_*: blocked numbers by
// type, and change observers called on the main loop.
#pragma once

#include "SqliteDatabase.h"
#include "StoreChangeWatcher.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace ct::callblock {

class CallBlockList {
public:
	static constexpr size_t kMaxNumberBytes = 1024;

	CallBlockList();
	~CallBlockList();
	CallBlockList(const CallBlockList&) = delete;
	CallBlockList& operator=(const CallBlockList&) = delete;

	// Opens "callblock.db" in the data folder. 0 or a negative errno code.
	int open();

	// 1 blocked, 0 not, or a negative errno code.
	int find(int type, const std::string& number) const;
	// 0, -EEXIST when already there, or a storage error.
	int add(int type, const std::string& number);
	// 0, -ENODATA when not there, or a storage error.
	int remove(int type, const std::string& number);
	// Cleaned numbers of `type`, sorted.
	std::vector<std::string> numbers(int type) const;

	// One observer per tag; adding it again replaces the function.
	void addObserver(const void* tag, std::function<void()> observer);
	bool removeObserver(const void* tag);
	void removeAllObservers();
	// True while observers are being called.
	bool isDelivering() const { return m_delivering > 0; }

	// Digits and a leading '+'; empty when `number` has no digit.
	static std::string cleanNumber(const std::string& number);

private:
	struct Registration {
		const void* tag;
		std::function<void()> observer;
		bool active = true;
	};

	int __write(const char* sql, int type, const std::string& number);
	void __deliver();

	ct::db::Database m_db;
	std::unique_ptr<ct::db::StoreChangeWatcher> m_watcher;
	std::vector<std::shared_ptr<Registration>> m_observers;
	int m_delivering = 0;
};

} // namespace ct::callblock
