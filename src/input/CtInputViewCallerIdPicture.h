#ifndef _CT_INPUT_VIEW_CALLER_ID_PICTURE_H_
#define _CT_INPUT_VIEW_CALLER_ID_PICTURE_H_

#include <Elementary.h>

// The picture of the name rows: the contact's picture cut to the caller-id
// square, or the default picture (the setting's image, else the theme's).
class CtInputViewCallerIdPicture {
public:
	// The layout "layout/basicInfo/callerId" showing `imagePath` (null or
	// empty: the default picture). When `touchable`, its touch area is on and
	// a tap runs `clickedCb(data)`. Null (logged) when the layout is missing.
	static Evas_Object* create(Evas_Object* parent, const char* imagePath, bool touchable, Edje_Signal_Cb clickedCb,
			void* data);

	static constexpr int kSize = 96;
};

#endif
