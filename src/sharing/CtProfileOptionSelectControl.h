#ifndef _CT_PROFILE_OPTION_SELECT_CONTROL_H_
#define _CT_PROFILE_OPTION_SELECT_CONTROL_H_

#include <Elementary.h>

#include <functional>

// Appends to a list the block where the user chooses which profile fields are
// shared besides name, status and picture: a group title, an explanation and
// one switch per field. The rows carry all they need; the control itself may
// be dropped after append().
class CtProfileOptionSelectControl {
public:
	CtProfileOptionSelectControl() = default;
	~CtProfileOptionSelectControl() = default;

	// Runs after each toggle of a field (e.g. to refresh a preview).
	void setOnChanged(std::function<void()> onChanged) { m_onChanged = std::move(onChanged); }
	// Returns the number of rows appended.
	int append(Evas_Object* genlist);

private:
	std::function<void()> m_onChanged;
};

#endif
