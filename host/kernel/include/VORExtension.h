// Extensions add interfaces to objects of a late type without the object's class knowing them.
// A data extension holds state: it is created once per object on first query, shares the
// object's reference count and dies with it. A code extension is stateless: every query makes
// a fresh one that holds its own reference on the object.
#pragma once

#include "VORBaseUnknown.h"

enum class VORExtensionKind { Data, Code };

class VORExtension : public virtual VORBaseUnknown {
  VOR_DECLARE_CLASS(VORExtension, VORBaseUnknown)
 public:
  // The object this extension extends (never null once attached).
  VORBaseUnknown* GetExtendedObject() const { return _owner; }

  unsigned long AddRef() override;
  unsigned long Release() override;
  HRESULT QueryInterface(const VORInterfaceId& iid, void** out) override;
  VORBaseUnknown* GetIdentity() override { return _owner->GetIdentity(); }
  const char* GetLateType() const override { return _owner->GetLateType(); }

 protected:
  VORExtension() = default;
  ~VORExtension() override;

 private:
  friend class VORBaseUnknown;
  friend class VORExtensionSet;
  void Attach(VORBaseUnknown* owner, VORExtensionKind kind);

  VORBaseUnknown* _owner = nullptr;
  VORExtensionKind _kind = VORExtensionKind::Data;
};
