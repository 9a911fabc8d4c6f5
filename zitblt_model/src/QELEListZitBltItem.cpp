#include "QELEListZitBltItem.h"

#include "VORISPPItem.h"
#include "VORISPPProductIO.h"
#include "VORISpecObject.h"

namespace {
VORBaseUnknown_var Object(const VORExtension* extension) {
  return VORBaseUnknown_var(extension->GetExtendedObject());
}

// The name of item as an item; false when it is no item.
bool ItemName(const VORBaseUnknown_var& item, VORUnicodeString& name) {
  VORISPPItem_var asItem(item);
  if (!asItem)
    return false;
  VORUnicodeString text;
  asItem->GetName(text);
  name = text;
  return true;
}
}  // namespace

HRESULT QELEListZitBltItemPI::GetActivity(VORBaseUnknown*&) {
  return 0;
}

HRESULT QELEListZitBltItemPI::GetItemName(VORUnicodeString& name) {
  const VORBaseUnknown_var object = Object(this);
  VORUnicodeString typeName;
  if (VORISpecObject_var spec(object); spec)
    spec->GetTypeName(typeName);
  if (typeName == VORUnicodeString("QELMfgAssy")) {
    ItemName(object, name);
    return 0;
  }
  VORISPPProductIO_var io(object);
  VORBaseUnknown_var item;
  if (io)
    io->GetConsumedItem(item);
  return item && ItemName(item, name) ? 0 : E_FAIL;
}

HRESULT QELEListZitBltItemPO::GetActivity(VORBaseUnknown*&) {
  return 0;
}

HRESULT QELEListZitBltItemPO::GetItemName(VORUnicodeString& name) {
  VORISPPProductIO_var io(Object(this));
  VORBaseUnknown_var item;
  if (io)
    io->GetProducedItem(item);
  return item && ItemName(item, name) ? 0 : 1;
}

HRESULT QELEListZitBltItemResource::GetActivity(VORBaseUnknown*&) {
  return 1;
}

HRESULT QELEListZitBltItemResource::GetItemName(VORUnicodeString& name) {
  ItemName(Object(this), name);
  return 0;
}
