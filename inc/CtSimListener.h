#ifndef _CT_SIM_LISTENER_H_
#define _CT_SIM_LISTENER_H_

// Told by CtSimMgr when a SIM card was switched on or off.
class CtSimListener {
public:
	virtual ~CtSimListener() {}
	virtual void onSimChanged() = 0;
};

#endif
