// The demo's contacts store: connected while the object lives; filled with
// the demo persons (and their blocked numbers) the first time it is empty.
#pragma once

namespace ct::demo {

class DemoDatabase {
public:
	DemoDatabase();
	// Disconnects from the contacts service.
	~DemoDatabase();
	DemoDatabase(const DemoDatabase&) = delete;
	DemoDatabase& operator=(const DemoDatabase&) = delete;

	// Connects and fills an empty store. Returns 0 or a negative contacts
	// error (logged); a store that already holds persons is left as it is.
	int open();
	bool wasCreated() const { return m_created; }
	// Persons in the store, or a negative error.
	static int personCount();

private:
	int __fill();

	bool m_connected = false;
	bool m_created = false;
};

} // namespace ct::demo
