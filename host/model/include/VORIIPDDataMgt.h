// Planning-hub objects: the hub's record of a product (its user-defined planning attributes).
#pragma once

#include "VORHandle.h"
#include "VORModelTypes.h"

class VORIIPDDataMgt : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIIPDDataMgt)
 public:
  // The hub object of a model object; created on demand when create is true (an empty record
  // is not a change: it is neither saved nor undone). S_FALSE and null when there is none.
  virtual HRESULT GetHubObject(VORBaseUnknown* object, VORBaseUnknown_var& hubObject,
                               bool create = false) = 0;
  virtual HRESULT SetUserDefinedAttribute(VORBaseUnknown* object, const VORUnicodeString& name,
                                          const VORAttributeValue& value) = 0;
};
VOR_DECLARE_HANDLE(VORIIPDDataMgt);
