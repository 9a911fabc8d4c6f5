// "pfv script FILE": runs a script of user steps through the headless driver (docs/scripting.md).
#include <iostream>

#include "PfvCommand.h"
#include "VORDriver.h"
#include "VORScript.h"

namespace {
int RunScript(const std::vector<std::string>& args) {
  if (args.size() != 1) {
    std::cerr << "usage: pfv script FILE\n";
    return 2;
  }
  VORDriver driver;
  VORScript script(driver, std::cout);
  return script.RunFile(args[0]) ? 0 : 1;
}
}  // namespace

PFV_COMMAND(script, "script", "FILE",
            "run a script of user steps (open, start, pick, ok, print ...) headless", RunScript);
