/* The contacts service: contacts, persons, groups, address books, my profile,
 * SIM cards and changes, over an SQLite database in the data folder. */
#ifndef CT_PLATFORM_CONTACTS_H
#define CT_PLATFORM_CONTACTS_H

#include "contacts_types.h"
#include "contacts_views.h"
#include "contacts_record.h"
#include "contacts_list.h"
#include "contacts_query.h"
#include "contacts_db.h"
#include "contacts_service.h"

#endif
