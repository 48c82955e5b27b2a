// A genlist row object; see WGenItem.
#pragma once

#include "WGenItem.h"

namespace app_assist {

class WGenlistItem : public WGenItem {
public:
	WGenlistItem()
		: WGenItem(Widget::Genlist)
	{
	}
};

} // namespace app_assist
