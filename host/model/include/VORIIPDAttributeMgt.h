// Attributes of plan types and hub objects, and relations between plan types.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"
#include "VORModelTypes.h"

class VORIIPDAttributeMgt : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIIPDAttributeMgt)
 public:
  // Option that also follows the plan types a plan type is based on ("base").
  static constexpr const char* Recursive = "recursiv";

  // A plan-type attribute ("name", "compclass"...). S_FALSE and empty when absent.
  virtual HRESULT GetAttribute(VORBaseUnknown* planType, const VORUnicodeString& name,
                               VORUnicodeString& value) = 0;
  // An attribute read under a key: "plantype_name" under "type" is the plan type's type name.
  virtual HRESULT GetAttribute(VORBaseUnknown* planType, const VORUnicodeString& name,
                               const VORUnicodeString& key, VORUnicodeString& value) = 0;
  // New list the caller deletes: the plan types related to planType by relation (for example
  // "lumoplantypechild"), in document order, without duplicates. option "recursiv" adds the
  // relations of the plan types planType is based on.
  virtual HRESULT GetRelatedObjects(VORBaseUnknown* planType, const VORUnicodeString& relation,
                                    const char* option, VORListValVORBaseUnknown_var*& related) = 0;
  // A user-defined attribute of a model object kept by the hub (VORAttributeNone when absent).
  virtual HRESULT GetUserDefinedAttribute(VORBaseUnknown* object, const VORUnicodeString& name,
                                          VORAttributeValue& value) = 0;
};
VOR_DECLARE_HANDLE(VORIIPDAttributeMgt);
