// A gengrid row object; see WGenItem.
#pragma once

#include "WGenItem.h"

namespace app_assist {

class WGengridItem : public WGenItem {
public:
	WGengridItem()
		: WGenItem(Widget::Gengrid)
	{
	}
};

} // namespace app_assist
