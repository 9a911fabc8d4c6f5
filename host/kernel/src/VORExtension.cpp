#include "VORExtension.h"

#include "VORAssert.h"

void VORExtension::Attach(VORBaseUnknown* owner, VORExtensionKind kind) {
  _owner = owner;
  _kind = kind;
  // A new extension comes with one reference. A data extension lives inside the object and
  // lends out the object's references instead, so its own count stays at that one; a code
  // extension keeps its own count and holds the object alive.
  _owner->AddRef();
}

VORExtension::~VORExtension() = default;

unsigned long VORExtension::AddRef() {
  if (_kind == VORExtensionKind::Data)
    return _owner->AddRef();
  return VORBaseUnknown::AddRef();
}

unsigned long VORExtension::Release() {
  if (_kind == VORExtensionKind::Data)
    return _owner->Release();
  VORBaseUnknown* owner = _owner;
  unsigned long left = VORBaseUnknown::Release();
  if (left == 0)
    owner->Release();
  return left;
}

HRESULT VORExtension::QueryInterface(const VORInterfaceId& iid, void** out) {
  *out = nullptr;
  if (iid == VORBaseUnknown::IID())
    return _owner->QueryInterface(iid, out);
  if (void* self = iid.cast(this)) {
    AddRef();
    *out = self;
    return S_OK;
  }
  return _owner->QueryInterface(iid, out);
}
