// The toolkit's smart objects that clip their members (every edje object,
// and so every layout, button and list row) keep a small record of their
// clipper. The toolkit release this library runs on (1.26) forgets that
// record when such an object is deleted instead of freeing it: 16 bytes per
// object, about 1.5 kB each time a detail screen is opened and closed. This
// frees the forgotten records of an object tree as it is deleted.
#pragma once

#include <Elementary.h>

namespace app_assist {

class WClippedSmartData {
public:
	// Frees, as each object under `root` (and `root` itself) is freed, the
	// clipper record the toolkit forgot. Does nothing on a toolkit that does
	// not forget it, and for objects whose smart data is their own.
	static void reclaimOnDelete(Evas_Object* root);
	// The same, done when `root` starts being deleted (for trees the toolkit
	// deletes on its own, such as a naviframe page with its title buttons).
	static void reclaimWhenDeleted(Evas_Object* root);
	// Whether this toolkit forgets the records (and so reclaimOnDelete acts).
	static bool isNeeded();
};

} // namespace app_assist
