#include "VORCSO.h"

VORNotification* VORCSO::CreateChangeNotification(const VORListValVORBaseUnknown_var& added,
                                                  const VORListValVORBaseUnknown_var& removed) {
  return new VORCSOChangeNotification(this, added, removed);
}
