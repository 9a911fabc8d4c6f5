// Late types: named object types with single inheritance, declared at run time by the
// platform and by modules ("BIWActivityStation" is a kind of "PhysicalActivity").
#pragma once

#include <string>
#include <vector>

namespace VORLateTypes {
// Declares type with its parent (empty for a root type). Re-declaring replaces the parent.
void Declare(const std::string& type, const std::string& parent);
// The parent of type, or empty when it has none or is unknown.
std::string Parent(const std::string& type);
// True when type is ancestor or inherits from it.
bool IsKindOf(const std::string& type, const std::string& ancestor);
// type followed by its ancestors, nearest first.
std::vector<std::string> Chain(const std::string& type);
}  // namespace VORLateTypes
