// Pieces shared by the list commands.
#pragma once

#include "QELIListZitBltItemState.h"
#include "VORISPPFlowMgt.h"
#include "VORLists.h"

class QELBaseScrollListZitBltRep;

// The late type name of object ("" when it has none).
VORUnicodeString QELTypeNameOf(VORBaseUnknown* object);
// True when object is an item whose late type is one of types.
bool QELIsItemOfType(VORBaseUnknown* object, std::initializer_list<const char*> types);
// Appends each product input of flow whose item is still in assigned, with state, and takes
// that item out of assigned: an item is shown once, through its first input.
void QELAppendAssignedInputs(VORISPPFlowMgt* flow, VORListValVORBaseUnknown_var& assigned,
                             QELBaseScrollListZitBltRep* rep,
                             QELIListZitBltItemState::AssignState state);
