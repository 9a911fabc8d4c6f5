// Loads modules (shared libraries "lib<Name>.so") by name from the module search path and
// finds their extern "C" factories "fctCreate<Class>". Unknown names give null, never a crash.
#pragma once

#include <string>
#include <vector>

class VORBaseUnknown;

namespace VORModuleLoader {
// ':'-separated directories searched in order; VOR_MODULE_PATH is prepended when set.
void SetSearchPath(const std::string& path);
std::vector<std::string> SearchPath();

// Opens the module once; calls its optional "VORInitModule" on first load. Null when absent.
void* LoadModule(const std::string& module);
// Address of an exported symbol of the module, or null.
void* FindSymbol(const std::string& module, const std::string& symbol);
// Calls "fctCreate<className>" of the module with no argument. Returns a new object (one
// reference, the caller's), or null when the module or the class is unknown.
VORBaseUnknown* CreateObject(const std::string& module, const std::string& className);
// Why the last failed call failed.
std::string LastError();
}  // namespace VORModuleLoader
