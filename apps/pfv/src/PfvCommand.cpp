#include "PfvCommand.h"

#include <unistd.h>

#include <algorithm>
#include <clocale>
#include <cstdlib>
#include <filesystem>

#include "VORFrameInit.h"
#include "VORModuleLoader.h"
#include "VORPertInit.h"

std::vector<PfvCommand>& PfvCommands() {
  static std::vector<PfvCommand> commands;
  return commands;
}

bool PfvRegisterCommand(PfvCommand command) {
  auto& commands = PfvCommands();
  auto at = std::lower_bound(commands.begin(), commands.end(), command.name,
                             [](const PfvCommand& c, const std::string& n) { return c.name < n; });
  commands.insert(at, std::move(command));
  return true;
}

void PfvRegisterCommands() {
  for (PfvCommand (*describe)() :
       {PfvCommand_check, PfvCommand_export, PfvCommand_gen, PfvCommand_script})
    PfvRegisterCommand(describe());
#ifdef PFV_WITH_QT
  PfvRegisterCommand(PfvCommand_gui());
  PfvRegisterQtWriters();
#endif
}

void PfvInitialiseProcess(const char* argv0) {
  // Parser strings are transcoded with the locale: make it UTF-8 whatever the user's is.
  if (std::setlocale(LC_ALL, "") == nullptr || std::setlocale(LC_CTYPE, "C.UTF-8") == nullptr) {
    std::setlocale(LC_CTYPE, "C.UTF-8");
  }
  namespace fs = std::filesystem;
  std::error_code ec;
  fs::path exe = fs::canonical("/proc/self/exe", ec);
  if (ec)
    exe = fs::absolute(argv0 ? argv0 : "pfv", ec);
  const fs::path binDir = exe.parent_path();
  // Built tree: <build>/bin/pfv, modules in <build>/lib, sources two levels up. Installed:
  // <prefix>/bin/pfv, modules in <prefix>/lib/pfv, resources in <prefix>/share/pfv/resources.
  const fs::path libDir = binDir.parent_path() / "lib";
  const fs::path installedLibDir = libDir / "pfv";
  VORModuleLoader::SetSearchPath(fs::is_directory(installedLibDir, ec) ? installedLibDir.string()
                                                                       : libDir.string());
  if (std::getenv("VORStartupPath") == nullptr) {
    for (const fs::path& candidate :
         {binDir.parent_path().parent_path().parent_path() / "resources",
          binDir.parent_path() / "share" / "pfv" / "resources"}) {
      if (fs::is_directory(candidate, ec)) {
        ::setenv("VORStartupPath", candidate.string().c_str(), 1);
        break;
      }
    }
  }
  VORInitFrame();
  VORInitPert();
}
