// Item bookkeeping of a body-in-white station or grouping activity, computed from the model
// on every call. Terms, for an activity A with children C (activities only):
//  - A's own items: the items assigned to A (VORISPPItemMgt, mode AssignedHere).
//  - produced items: the items of the product outputs of A and of the children.
//  - consumed items: the items of the product inputs of A and of the children.
// The two item lists are what A's output list shows: the first holds what A produces (its own
// outputs), the second what A's children produce that nothing inside A consumes and that A
// does not declare itself (the sub-results a group hands on). The activity list and the
// covered items make A's full input list: the items assigned to the listed activities, less
// the covered ones, are what A takes from outside without an input of its own.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class QELIBIWItemInfo : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIBIWItemInfo)
 public:
  // New lists the caller deletes.
  // The product outputs of the activity itself ("ProductOutput" objects).
  virtual HRESULT GetFirstItemList(VORListValVORBaseUnknown_var*& items) = 0;
  // Product outputs of the child activities whose item neither a child nor the activity
  // consumes, and that no output of the activity itself produces.
  virtual HRESULT GetSecondItemList(VORListValVORBaseUnknown_var*& items) = 0;
  // The child activities (and for a station without children, the activity itself).
  virtual HRESULT GetActivityList(VORListValVORBaseUnknown_var*& activities) = 0;
  // The items the full input list does not repeat from the listed activities: the items they
  // produce (intermediate results made inside) and the items the activity takes through a
  // product input of its own and has assigned (listed already), without duplicates.
  virtual HRESULT GetCoveredItems(VORListValVORBaseUnknown_var*& items) = 0;
  // The four above appended to a list the caller holds (and may reuse): the ZitBlt lists of
  // every station read them when a level opens.
  virtual HRESULT AppendFirstItemList(VORListValVORBaseUnknown_var& items) = 0;
  virtual HRESULT AppendSecondItemList(VORListValVORBaseUnknown_var& items) = 0;
  virtual HRESULT AppendActivityList(VORListValVORBaseUnknown_var& activities) = 0;
  virtual HRESULT AppendCoveredItems(VORListValVORBaseUnknown_var& items) = 0;
  // The items consumed inside: the items of the product inputs of the activity and its
  // children, without duplicates.
  virtual HRESULT GetConsumedItems(VORListValVORBaseUnknown_var*& items) = 0;
  // The product inputs and outputs of the activity itself (what an item exchange may replace).
  virtual HRESULT GetReplaceableProductIOs(VORListValVORBaseUnknown_var*& productIOs) = 0;
  // True when productOutput is listed in the first or second list.
  virtual bool IsListedOutput(VORBaseUnknown* productOutput) = 0;
  // Whether a product output of this activity may be handed to target: target must be a
  // station, grouping or loading activity under the same root, and not this activity.
  virtual bool AcceptsOutputTransfer(VORBaseUnknown* productOutput, VORBaseUnknown* target) = 0;
  // Whether target is on the father chain of this activity up to the root (both included),
  // or a descendant of it: moves stay inside one branch of the tree.
  virtual bool IsInHierarchyOf(VORBaseUnknown* target) = 0;
};
VOR_DECLARE_HANDLE(QELIBIWItemInfo);
