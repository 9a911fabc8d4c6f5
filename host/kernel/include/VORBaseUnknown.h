// Root of the component model: intrusive reference count, interface query, late type, meta-object.
// A new object starts with one reference, owned by its creator; handles add their own.
#pragma once

#include <memory>

#include "VORInterfaceId.h"
#include "VORMetaObject.h"
#include "VORTypes.h"

class VORExtension;
class VORExtensionSet;

class VORBaseUnknown {
 public:
  static const VORInterfaceId& IID() {
    static const VORInterfaceId id{"VORBaseUnknown",
                                   [](VORBaseUnknown* o) -> void* { return o->GetIdentity(); }};
    return id;
  }
  static const char* ClassName() { return "VORBaseUnknown"; }
  static const char* ClassId() { return "VORBaseUnknown"; }
  static const VORMetaObject* MetaObject() {
    static const VORMetaObject meta("VORBaseUnknown", nullptr);
    return &meta;
  }

  VORBaseUnknown();
  VORBaseUnknown(const VORBaseUnknown&) = delete;
  VORBaseUnknown& operator=(const VORBaseUnknown&) = delete;

  virtual unsigned long AddRef();
  virtual unsigned long Release();
  unsigned long RefCount() const { return _refCount; }

  // On success *out holds the object seen as iid, with one more reference; null and
  // E_NOINTERFACE when neither the object nor an extension of its late type answers it.
  virtual HRESULT QueryInterface(const VORInterfaceId& iid, void** out);

  // The object an interface pointer stands for; extensions answer their extended object.
  virtual VORBaseUnknown* GetIdentity() { return this; }

  // Late type used to find extensions; by default the class name.
  virtual const char* GetLateType() const { return IsA(); }

  virtual const char* IsA() const { return "VORBaseUnknown"; }
  virtual const VORMetaObject* GetMetaObject() const { return MetaObject(); }
  bool IsAKindOf(const char* className) const { return GetMetaObject()->IsAKindOf(className); }

  // Number of component objects alive in the process; tests use it to find leaks.
  static long LiveInstances();
  // Interface casts that were not among the recent answers; tests use it to see that repeated
  // casts stay cheap.
  static long CastAnswerLookups();

 protected:
  virtual ~VORBaseUnknown();

 private:
  friend class VORExtension;
  VORExtension* FindDataExtension(const VORInterfaceId& iid);

  unsigned long _refCount = 1;
  std::unique_ptr<VORExtensionSet> _extensions;
};
