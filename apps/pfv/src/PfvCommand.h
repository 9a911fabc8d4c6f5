// Sub-commands of pfv ("check", "gen", "export", "script" ...): each lives in its own source file
// and registers itself with PFV_COMMAND.
#pragma once

#include <functional>
#include <string>
#include <vector>

struct PfvCommand {
  std::string name;
  std::string usage;    // one line: arguments
  std::string summary;  // one line: what it does
  // Arguments after the sub-command name. Returns the process exit code.
  std::function<int(const std::vector<std::string>& args)> run;
};

// Registered sub-commands in order of name.
std::vector<PfvCommand>& PfvCommands();
bool PfvRegisterCommand(PfvCommand command);

// Sets up the process for any command: UTF-8 locale, VORStartupPath and module path defaults.
void PfvInitialiseProcess(const char* argv0);

#define PFV_COMMAND(id, ...) \
  static const bool pfvCommand_##id = PfvRegisterCommand(PfvCommand{__VA_ARGS__})
