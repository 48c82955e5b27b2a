#ifndef _I_CT_CHANGE_LISTENER_H_
#define _I_CT_CHANGE_LISTENER_H_

// Told by a data object when what a screen shows changed. Data objects call
// onDbChanged(); the other two serve the list screens.
class ICtChangeListener {
public:
	virtual ~ICtChangeListener() {}
	// `viewUri` is the contacts-service view whose change was detected.
	virtual void onDbChanged(const char* viewUri) = 0;
	virtual void onCompleteGetContacts() = 0;
	virtual void onConditionChagned() = 0;
};

#endif
