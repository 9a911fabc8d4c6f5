// User-defined attributes with typed values (long, double, string) on activities.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"
#include "VORModelTypes.h"

class VORIUserAttributes : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIUserAttributes)
 public:
  // S_OK and the value; S_FALSE and type VORAttributeNone (code 0) when absent.
  virtual HRESULT GetAttributeValue(const VORUnicodeString& name, VORAttributeValue& value) = 0;
  // A value of type VORAttributeNone removes the attribute.
  virtual HRESULT SetAttributeValue(const VORUnicodeString& name,
                                    const VORAttributeValue& value) = 0;
  virtual HRESULT GetAttributeNames(VORListValVORUnicodeString& names) = 0;
};
VOR_DECLARE_HANDLE(VORIUserAttributes);
