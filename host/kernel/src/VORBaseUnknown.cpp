#include "VORBaseUnknown.h"

#include <utility>
#include <vector>

#include "VORAssert.h"
#include "VORExtension.h"
#include "VORExtensionRegistry.h"

namespace {
long liveInstances = 0;
}

// The data extensions of one object, created on first query.
class VORExtensionSet {
 public:
  ~VORExtensionSet() {
    // Destroy in reverse order of creation: later extensions may rely on earlier ones.
    for (auto it = _items.rbegin(); it != _items.rend(); ++it)
      delete it->second;
  }
  VORExtension* Find(std::string_view iid) const {
    for (const auto& [name, ext] : _items) {
      if (name == iid)
        return ext;
    }
    return nullptr;
  }
  void Add(std::string_view iid, VORExtension* ext) { _items.emplace_back(iid, ext); }

 private:
  std::vector<std::pair<std::string_view, VORExtension*>> _items;
};

VORBaseUnknown::VORBaseUnknown() {
  ++liveInstances;
}

VORBaseUnknown::~VORBaseUnknown() {
  --liveInstances;
}

long VORBaseUnknown::LiveInstances() {
  return liveInstances;
}

unsigned long VORBaseUnknown::AddRef() {
  VOR_ASSERT(_refCount > 0);
  return ++_refCount;
}

unsigned long VORBaseUnknown::Release() {
  VOR_ASSERT(_refCount > 0);
  if (--_refCount == 0) {
    delete this;
    return 0;
  }
  return _refCount;
}

HRESULT VORBaseUnknown::QueryInterface(const VORInterfaceId& iid, void** out) {
  *out = nullptr;
  if (void* self = iid.cast(this)) {
    AddRef();
    *out = self;
    return S_OK;
  }
  VORExtension* ext = FindDataExtension(iid);
  if (ext == nullptr) {
    VORExtensionRegistry::Entry entry = VORExtensionRegistry::Find(GetLateType(), iid);
    if (entry.factory == nullptr)
      return E_NOINTERFACE;
    ext = entry.factory();
    if (ext == nullptr)
      return E_NOINTERFACE;
    ext->Attach(this, entry.kind);
    if (entry.kind == VORExtensionKind::Data) {
      if (!_extensions)
        _extensions = std::make_unique<VORExtensionSet>();
      _extensions->Add(iid.name, ext);
    }
  } else {
    ext->AddRef();
  }
  void* seen = iid.cast(ext);
  if (seen == nullptr) {
    ext->Release();
    return E_NOINTERFACE;
  }
  *out = seen;
  return S_OK;
}

VORExtension* VORBaseUnknown::FindDataExtension(const VORInterfaceId& iid) {
  return _extensions ? _extensions->Find(iid.name) : nullptr;
}
