// The list-item views of the model objects a ZitBlt list shows. Stateless code extensions: each
// reaches its object through the component model and keeps nothing.
#pragma once

#include "QELIListZitBltItem.h"
#include "VORExtension.h"

// Product inputs ("ProductInput") and manufacturing assemblies ("QELMfgAssy"): the consumed
// item's name, or an assembly's own name.
class QELEListZitBltItemPI : public VORExtension, public QELIListZitBltItem {
  VOR_DECLARE_CLASS(QELEListZitBltItemPI, VORExtension)
 public:
  HRESULT GetActivity(VORBaseUnknown*& activity) override;
  HRESULT GetItemName(VORUnicodeString& name) override;

 protected:
  ~QELEListZitBltItemPI() override = default;
};

// Product outputs ("ProductOutput"): the produced item's name; 1 without one.
class QELEListZitBltItemPO : public VORExtension, public QELIListZitBltItem {
  VOR_DECLARE_CLASS(QELEListZitBltItemPO, VORExtension)
 public:
  HRESULT GetActivity(VORBaseUnknown*& activity) override;
  HRESULT GetItemName(VORUnicodeString& name) override;

 protected:
  ~QELEListZitBltItemPO() override = default;
};

// Products ("ASMPRODUCT", parts and resources alike): their own name; always 0.
class QELEListZitBltItemResource : public VORExtension, public QELIListZitBltItem {
  VOR_DECLARE_CLASS(QELEListZitBltItemResource, VORExtension)
 public:
  HRESULT GetActivity(VORBaseUnknown*& activity) override;
  HRESULT GetItemName(VORUnicodeString& name) override;

 protected:
  ~QELEListZitBltItemResource() override = default;
};
