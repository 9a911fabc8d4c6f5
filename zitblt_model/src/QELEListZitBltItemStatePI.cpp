#include "QELEListZitBltItemStatePI.h"

#include "QELIListZitBltItem.h"
#include "VORISPPActivity.h"
#include "VORISPPChildManagement.h"
#include "VORISpecObject.h"

int QELEListZitBltItemStatePI::GetState(AssignState& state) {
  state = _state;
  return _state;
}

bool QELEListZitBltItemStatePI::CanAssignState(VORBaseUnknown* object) {
  QELIListZitBltItem_var item{VORBaseUnknown_var(object)};
  if (!item)
    return false;
  VORBaseUnknown* listedFor = nullptr;
  item->GetActivity(listedFor);
  const VORBaseUnknown_var activity(listedFor);
  if (!activity || !VORISPPActivity_var(activity))
    return false;
  VORUnicodeString typeName;
  if (VORISpecObject_var spec(activity); spec)
    spec->GetTypeName(typeName);
  if (typeName == VORUnicodeString("BIWActivityStation"))
    return true;
  if (typeName != VORUnicodeString("BIWActivityGrouping"))
    return false;
  // A grouping that holds a process of its own takes no states.
  VORISPPChildManagement_var children(activity);
  VORListValVORBaseUnknown_var* roots = nullptr;
  if (!children || FAILED(children->GetChildren(roots, "BIWActivityRoot")) || roots == nullptr)
    return false;
  const bool none = roots->Size() == 0;
  delete roots;
  return none;
}
