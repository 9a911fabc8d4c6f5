// The rules the drag-and-drop extensions share: the planner's texts, the activity type
// families, and the body-in-white checks of a reassignment.
#pragma once

#include "VORDocument.h"
#include "VORHandle.h"
#include "VORLists.h"
#include "VORModelDoor.h"
#include "VORUnicodeString.h"

namespace QELItemDD {
// The texts shown to the planner.
inline constexpr const char* kNotAnActivity = "Item cannot be assigned to this activity .";
inline constexpr const char* kAlreadyAssigned = "This product is already assigned";
inline constexpr const char* kNoItemList = "Item list is not obtained";
inline constexpr const char* kValid = "Activities are valid";
inline constexpr const char* kProducedByTarget = "This product is produced by this activity";
inline constexpr const char* kComponentAssigned =
    "A component of this assembly is already assigned";
// "Product Input can not be ReAssigned from <from type> to <to type>" (outputs use it too).
VORUnicodeString TypeRefusal(const VORUnicodeString& fromType, const VORUnicodeString& toType);

bool IsActivity(VORBaseUnknown* object);
// The late type name through the object's feature; false when it has none.
bool TypeNameOf(VORBaseUnknown* object, VORUnicodeString& type);
// The opening rule of every item check: both ends are activities (else message is the
// refusal) whose type names are read into fromType and toType. False when either fails.
bool ReadActivityTypes(VORBaseUnknown* from, VORBaseUnknown* to, VORUnicodeString& fromType,
                       VORUnicodeString& toType, VORUnicodeString& message);
bool IsStationOrGrouping(const VORUnicodeString& type);
bool IsStationGroupingOrLoading(const VORUnicodeString& type);
bool IsWelding(const VORUnicodeString& type);

// The item a product input consumes or a product output produces (null when none).
VORBaseUnknown_var ItemOf(VORBaseUnknown* productIO);
// The display name of an item.
VORUnicodeString NameOf(VORBaseUnknown* item);

// The body-in-white check of an input moved away from a station or grouping: an activity never
// takes as input what it produces itself or, for a station or grouping, what the activities of
// its item information produce. True when to accepts item.
bool AcceptsInputOf(VORBaseUnknown* to, VORBaseUnknown* item);
// The assembly check: no component of the assembly (at any depth) may already be assigned to
// to, or it would be counted twice. True when to accepts assembly.
bool AcceptsAssembly(VORBaseUnknown* to, VORBaseUnknown* assembly);

// The last rule of a check: refused as already assigned when an entry of list (null for none)
// is the same as the dragged item, valid otherwise. Sets message; 1 when valid, 0 when refused.
template <typename Same>
int RefuseIfListed(VORListValVORBaseUnknown_var* list, Same same, VORUnicodeString& message) {
  if (list != nullptr) {
    for (const VORBaseUnknown_var& entry : *list) {
      if (same(entry)) {
        message = VORUnicodeString(kAlreadyAssigned);
        return 0;
      }
    }
  }
  message = VORUnicodeString(kValid);
  return 1;
}

// Keeps the changes made through the door of object's document while it lives apart: Commit
// hands them to whoever records around it (the user's undo step); without Commit they are
// undone, so a reassignment that fails half-way changes nothing.
class AllOrNothing {
 public:
  explicit AllOrNothing(VORBaseUnknown* object);
  ~AllOrNothing();
  AllOrNothing(const AllOrNothing&) = delete;
  AllOrNothing& operator=(const AllOrNothing&) = delete;
  bool IsValid() const { return _door != nullptr; }
  void Commit();

 private:
  VORModelDoor* _door = nullptr;
  VORChangeLog _log;
  VORChangeLog* _outer = nullptr;
  bool _committed = false;
};

// Opens an undo step of object's document for the planner's command name while it lives.
class UndoStep {
 public:
  UndoStep(VORBaseUnknown* object, const char* name);
  ~UndoStep();
  UndoStep(const UndoStep&) = delete;
  UndoStep& operator=(const UndoStep&) = delete;

 private:
  VORProcess_var _document;
};
}  // namespace QELItemDD
