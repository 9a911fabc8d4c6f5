// Routes the changes of an editor's selection to the scroll lists whose items they name. One
// subscription per selection set serves every list of the chart, so a pick costs the paths it
// changes, not the number of lists.
#pragma once

#include "VORCSO.h"

class QELBaseScrollListZitBltRep;

namespace QELScrollListSelectionWatch {
// Starts routing cso's changes to rep (by its activity and ZitBlt name).
void Add(VORCSO* cso, QELBaseScrollListZitBltRep* rep);
// Stops routing to rep.
void Remove(QELBaseScrollListZitBltRep* rep);
// Number of lists routed to, over every selection set (tests).
int WatchedListCount();
}  // namespace QELScrollListSelectionWatch
