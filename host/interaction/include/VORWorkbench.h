// The commands offered to the user (menus, toolbars, scripts): identifier, title, icon, module,
// class. Read from "PfvWorkbench.txt" on VORStartupPath: one command per line,
// "id | title | icon | module | class"; '#' starts a comment.
#pragma once

#include <string>
#include <vector>

#include "VORCommandHeader.h"

struct VORWorkbenchCommand {
  std::string id;
  std::string title;
  std::string icon;
  std::string module;
  std::string className;
};

namespace VORWorkbench {
// Adds or replaces (same id) a command.
void Register(const VORWorkbenchCommand& command);
// The registered commands in order of registration; reads the resource file on first use.
const std::vector<VORWorkbenchCommand>& Commands();
// Null when no command has that id.
const VORWorkbenchCommand* Find(const std::string& id);
// Reads a workbench file; false (and errorText) on a malformed line, nothing registered then.
bool LoadFile(const std::string& path, std::string* errorText = nullptr);
// True when the command's module loads and exports its factory (menus grey the others out).
bool IsInstalled(const VORWorkbenchCommand& command);
// A new header for the command with argument (caller's reference), or null for an unknown id.
VORCommandHeader* CreateHeader(const std::string& id, VORBaseUnknown* argument = nullptr);
// Forgets everything (tests).
void Clear();
}  // namespace VORWorkbench
