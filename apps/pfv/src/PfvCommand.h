// Sub-commands of pfv ("check", "gen", "export", "script" ...): each lives in its own source file
// and describes itself with PFV_COMMAND; PfvRegisterCommands registers them all, explicitly.
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
// Registers every sub-command of this build (and the image writers that come with them).
void PfvRegisterCommands();

// Sets up the process for any command: UTF-8 locale, VORStartupPath and module path defaults,
// and the initialisation of the platform layers.
void PfvInitialiseProcess(const char* argv0);

// Defines PfvCommand_<id>(), the description of a sub-command.
#define PFV_COMMAND(id, ...)        \
  PfvCommand PfvCommand_##id() {    \
    return PfvCommand{__VA_ARGS__}; \
  }

PfvCommand PfvCommand_check();
PfvCommand PfvCommand_export();
PfvCommand PfvCommand_gen();
PfvCommand PfvCommand_script();
// Built with the Qt shell only (PFV_WITH_QT), with the PNG and PDF chart writers.
PfvCommand PfvCommand_gui();
void PfvRegisterQtWriters();
