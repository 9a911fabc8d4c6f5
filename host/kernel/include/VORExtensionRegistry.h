// Registry of extensions per (late type, interface). A lookup walks the late-type chain and,
// when nothing is registered, loads the module that the module dictionary names for it.
// Extensions are registered from a layer's VORInit<Layer>() or a module's VORInitModule(), never
// from a static initialiser.
#pragma once

#include <string>
#include <string_view>

#include "VORExtension.h"

using VORExtensionFactory = VORExtension* (*)();

namespace VORExtensionRegistry {
void Register(const std::string& lateType, const VORInterfaceId& iid, VORExtensionFactory factory,
              VORExtensionKind kind);
void Unregister(const std::string& lateType, const VORInterfaceId& iid);

struct Entry {
  VORExtensionFactory factory = nullptr;
  VORExtensionKind kind = VORExtensionKind::Data;
};
// Null factory when no extension answers iid for lateType or its ancestors.
Entry Find(std::string_view lateType, const VORInterfaceId& iid);

// Reads the module dictionary: lines "<late type> <interface> <module>", '#' starts a comment.
// Returns false (and keeps the previous dictionary) when the file cannot be read.
bool LoadDictionary(const std::string& path);
// Looks for "VORModules.dic" along VORStartupPath; quiet when there is none.
void LoadDictionaryFromStartupPath();
void ClearDictionary();
// Drops cached look-up answers (late types changed).
void ForgetAnswers();
}  // namespace VORExtensionRegistry
