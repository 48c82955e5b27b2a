// The application window as views see it.
#pragma once

#include <Elementary.h>

namespace app_assist {

class IWWindow {
public:
	virtual ~IWWindow() = default;
	virtual Evas_Object* getEvasObj() const = 0;
	virtual Evas_Object* getConformantEvasObj() const = 0;
	virtual Evas_Object* getBaseLayoutEvasObj() const = 0;
};

} // namespace app_assist
