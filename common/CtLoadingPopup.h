#ifndef _CT_LOADING_POPUP_H_
#define _CT_LOADING_POPUP_H_

#include "WPopup.h"

// A "processing" popup: a turning wheel and a text (a translation id of the
// "contacts" domain). Neither the back key nor a tap outside closes it; its
// owner destroys it when the work is done.
class CtLoadingPopup : public app_assist::WPopup {
public:
	explicit CtLoadingPopup(const char* textId);

	const char* getClassName() override;

protected:
	~CtLoadingPopup() override;

private:
	Evas_Object* __createContent(Evas_Object* parent);

	std::string m_textId;
};

#endif
