// Items (products and manufacturing assemblies) assigned to an activity.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORISPPItemMgt : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPItemMgt)
 public:
  enum Mode {
    AssignedHere = 0,          // items assigned to this activity, in order of assignment
    AssignedHereAndBelow = 1,  // also those of every descendant activity, without duplicates
    FirstAssigned = 2,         // as AssignedHere (the mode the lists ask for)
  };
  // New list the caller deletes. type: "Item" for every item, or a late type ("ASMPRODUCT",
  // "QELMfgAssy") to keep only items of that kind.
  virtual HRESULT GetAssignedItems(VORListValVORBaseUnknown_var*& items, const char* type = "Item",
                                   int mode = AssignedHere) = 0;
  // As GetAssignedItems, appended to a list the caller holds (duplicates are only looked for
  // among the items appended).
  virtual HRESULT AppendAssignedItems(VORListValVORBaseUnknown_var& items,
                                      const char* type = "Item", int mode = AssignedHere) = 0;
  virtual bool IsItemAssigned(VORBaseUnknown* item) = 0;
  // Assigns item (optionally through one of this activity's product inputs). S_FALSE when it
  // is already assigned. Emits kind 17.
  virtual HRESULT AssignItem(VORBaseUnknown* item, VORBaseUnknown* productInput = nullptr) = 0;
  // S_FALSE when it was not assigned. Emits kind 18.
  virtual HRESULT UnassignItem(VORBaseUnknown* item) = 0;
  // The product input an assignment was made with (null when none).
  virtual HRESULT GetAssignmentInput(VORBaseUnknown* item, VORBaseUnknown_var& productInput) = 0;
};
VOR_DECLARE_HANDLE(VORISPPItemMgt);
