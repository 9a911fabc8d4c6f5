// The named list types the module uses.
#pragma once

#include "VORHandle.h"
#include "VORList.h"
#include "VORUnicodeString.h"

struct VORSameObject {
  template <class T, class U>
  bool operator()(const VORHandle<T>& a, const VORHandle<U>& b) const {
    return a.Identity() == b.Identity();
  }
};

class VORListValVORBaseUnknown_var : public VORList<VORBaseUnknown_var, VORSameObject> {
 public:
  void RemoveDuplicates() { VORList::RemoveDuplicates<std::hash<VORBaseUnknown_var>>(); }
  // Drops null handles.
  void RemoveNulls() {
    for (int i = Size(); i >= 1; --i) {
      if ((*this)[i] == nullptr)
        RemovePosition(i);
    }
  }
};

using VORListValVORUnicodeString = VORList<VORUnicodeString>;
// Lists of raw pointers do not own what they point at.
using VORListPtrVORBaseUnknown = VORList<VORBaseUnknown*>;
using VORListPtrVORListValVORBaseUnknown_var = VORList<VORListValVORBaseUnknown_var*>;
using VORRawCollint = VORList<int>;
