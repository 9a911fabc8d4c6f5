#include "VORWorkbench.h"

#include <sstream>

#include "VOREnv.h"
#include "VORFileIO.h"
#include "VORModuleLoader.h"

namespace {
struct Registry {
  std::vector<VORWorkbenchCommand> commands;
  bool resourceRead = false;
};
Registry& TheRegistry() {
  static Registry registry;
  return registry;
}

std::string Trim(const std::string& s) {
  const auto first = s.find_first_not_of(" \t\r");
  if (first == std::string::npos)
    return "";
  return s.substr(first, s.find_last_not_of(" \t\r") - first + 1);
}

void ReadResourceOnce() {
  if (TheRegistry().resourceRead)
    return;
  TheRegistry().resourceRead = true;
  const std::string path = VORFindResource("PfvWorkbench.txt").ConvertToUTF8();
  if (!path.empty())
    VORWorkbench::LoadFile(path);
}
}  // namespace

namespace VORWorkbench {

void Register(const VORWorkbenchCommand& command) {
  for (VORWorkbenchCommand& c : TheRegistry().commands) {
    if (c.id == command.id) {
      c = command;
      return;
    }
  }
  TheRegistry().commands.push_back(command);
}

const std::vector<VORWorkbenchCommand>& Commands() {
  ReadResourceOnce();
  return TheRegistry().commands;
}

const VORWorkbenchCommand* Find(const std::string& id) {
  for (const VORWorkbenchCommand& c : Commands()) {
    if (c.id == id)
      return &c;
  }
  return nullptr;
}

bool LoadFile(const std::string& path, std::string* errorText) {
  std::string text;
  std::string why;
  if (!VORReadFile(path, text, why)) {
    if (errorText)
      *errorText = why;
    return false;
  }
  std::vector<VORWorkbenchCommand> read;
  std::istringstream lines(text);
  int lineNumber = 0;
  for (std::string line; std::getline(lines, line);) {
    ++lineNumber;
    if (auto hash = line.find('#'); hash != std::string::npos)
      line.erase(hash);
    if (Trim(line).empty())
      continue;
    std::vector<std::string> fields;
    std::istringstream parts(line);
    for (std::string field; std::getline(parts, field, '|');)
      fields.push_back(Trim(field));
    if (fields.size() != 5 || fields[0].empty() || fields[4].empty()) {
      if (errorText)
        *errorText = path + ":" + std::to_string(lineNumber) +
                     ": expected \"id | title | icon | module | class\"";
      return false;
    }
    read.push_back(VORWorkbenchCommand{fields[0], fields[1], fields[2], fields[3], fields[4]});
  }
  for (const VORWorkbenchCommand& c : read)
    Register(c);
  return true;
}

bool IsInstalled(const VORWorkbenchCommand& command) {
  // Host classes have no module; module classes need their library and its factory.
  if (command.module.empty())
    return true;
  return VORModuleLoader::FindSymbol(command.module, "fctCreate" + command.className) != nullptr;
}

VORCommandHeader* CreateHeader(const std::string& id, VORBaseUnknown* argument) {
  const VORWorkbenchCommand* c = Find(id);
  if (c == nullptr)
    return nullptr;
  return new VORCommandHeader(c->id, c->module, c->className, argument);
}

void Clear() {
  TheRegistry().commands.clear();
  TheRegistry().resourceRead = true;
}

}  // namespace VORWorkbench
