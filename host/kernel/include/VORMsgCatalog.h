// Message catalogues: one file "<Catalog>.msg" per reporting class along VORStartupPath (also in
// its msgcatalog/ sub-folders). Lines: Key = "text"; '#' starts a comment. /p1, /p2 ... in a
// text are replaced by the parameters.
#pragma once

#include "VORLists.h"
#include "VORUnicodeString.h"

class VORMsgCatalog {
 public:
  // The catalogue's text for key, or defaultText when the catalogue or the key is missing.
  static VORUnicodeString BuildMessage(const char* catalog, const char* key,
                                       const VORUnicodeString& defaultText,
                                       const VORListValVORUnicodeString* parameters = nullptr);
  // Forgets loaded catalogues (so a catalogue added later is read).
  static void ClearCache();
};
