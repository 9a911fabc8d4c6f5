// What a scroll list asks of the component that draws one of its items: where the item stands
// (its 1-based index and the list's location keyword), which list it belongs to, and the item
// and activity it shows. The rep itself comes through VORIVisu (BuildRep, GetRep).
#pragma once

#include "VORBaseUnknown.h"
#include "VORHandle.h"
#include "VORUnicodeString.h"

class QELIScrollListZitBltItemVisu : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIScrollListZitBltItemVisu)
 public:
  virtual void SetItemPos(int index, const VORUnicodeString& location) = 0;
  virtual int GetItemIndex() const = 0;
  virtual VORUnicodeString GetItemLocation() const = 0;
  // "ProductInput", "ProductOutput" or another item type.
  virtual void SetItemType(const VORUnicodeString& type) = 0;
  virtual VORUnicodeString GetItemType() const = 0;
  // The name of the ZitBlt whose list shows the item.
  virtual void SetZitBltName(const VORUnicodeString& name) = 0;
  virtual VORUnicodeString GetZitBltName() const = 0;
  // 247 or 249: the colour of the item's link.
  virtual unsigned int GetTypeCode() const = 0;
  // The activity of the PERT node and the list item (not new references).
  virtual VORBaseUnknown* GetAssociatedActivityNode() const = 0;
  virtual VORBaseUnknown* GetAssociatedPFItem() const = 0;
};
VOR_DECLARE_HANDLE(QELIScrollListZitBltItemVisu);
