#ifndef _CT_DETAIL_VIEW_UTIL_H_
#define _CT_DETAIL_VIEW_UTIL_H_

#include "CtDetailDataBase.h"

#include <Elementary.h>

class CtDetailViewGenlistItem;

// What the detail screens of a person and of the user's own profile do alike.

// Adds the detail screens' edje files as extension themes.
void ctDetailAddExtensionThemes();
// The navigation title: the display name (or "Unknown"), and a subtitle of
// phonetic name, nickname and company joined by "," (cleared when empty).
void ctDetailUpdateTitle(Elm_Object_Item* naviItem, CtDetailDataBase* data);
// Rows of one height: at most one address and one note, the rows that wrap.
bool ctDetailHasCompactRows(CtDetailDataBase* data);
// One picture only, and smaller than the picture area.
bool ctDetailIsLowSizePicture(CtDetailDataBase* data, Evas_Object* obj);
// The icon part a row of `itemType` greys while power saving is on; null for
// rows that power saving leaves alone.
const char* ctDetailPowerSavingIconPart(int itemType);
// Gives every row that power saving greys the new state, and redraws its icon.
void ctDetailApplyPowerSaving(Evas_Object* genlist, bool on);
// The detail row behind a genlist item; null for other rows.
CtDetailViewGenlistItem* ctDetailRowOf(Elm_Object_Item* item);
// Opens the maps application at `address` (owned by `data`).
void ctDetailOpenAddressInMaps(CtDetailDataBase* data, contacts_record_h address);

#endif
