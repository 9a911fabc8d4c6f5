// Environment and path look-up.
#pragma once

#include "VORTypes.h"
#include "VORString.h"
#include "VORUnicodeString.h"

// Value of an environment variable, or null when it is not set.
const char* VORGetEnv(const char* name);
// S_OK and the value when set; E_FAIL and value untouched otherwise.
HRESULT VORGetEnvValue(const char* name, VORString& value);
// Full path of the first regular file called fileName in a ':'-separated list of directories;
// empty when none holds it.
VORUnicodeString VORFindPath(const VORUnicodeString& fileName, const VORUnicodeString& searchPath);
// VORFindPath along VORStartupPath (and its "resources" sub-folders msgcatalog/, icons/).
VORUnicodeString VORFindResource(const VORUnicodeString& fileName);
