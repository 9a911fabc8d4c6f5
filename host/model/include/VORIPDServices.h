// Planning services of a document.
#pragma once

#include "VORIIPDAdapter.h"

class VORProcess;

class VORIPDServices {
 public:
  // The planning container ("VORSPPPPRCont", answers VORIResourceFactory).
  static HRESULT GetPPRContainer(VORProcess* document, VORBaseUnknown_var& container);
  // The plan-type object called name; index is the hub index (0). E_FAIL without an adapter,
  // S_FALSE and null when unknown.
  static HRESULT GetPlanTypeUnknowObject(const VORUnicodeString& name, int index,
                                         const VORIIPDAdapter_var& adapter,
                                         VORBaseUnknown_var& planType);
  static HRESULT GetPlanTypeObject(const VORUnicodeString& name, int index,
                                   const VORIIPDAdapter_var& adapter, VORBaseUnknown_var& planType);
};
