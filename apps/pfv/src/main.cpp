// pfv: the planner's program. Sub-commands run headless; without one it opens the window.
#include <cstdio>
#include <cstring>
#include <string>
#include <vector>

#include "PfvCommand.h"

namespace {
void PrintUsage() {
  std::puts("Usage: pfv [document.pprx]      open the Product Flow Viewer window");
  std::puts("       pfv --help | --version");
  for (const PfvCommand& c : PfvCommands()) {
    std::printf("       pfv %s %s\n             %s\n", c.name.c_str(), c.usage.c_str(),
                c.summary.c_str());
  }
}
}  // namespace

int main(int argc, char** argv) {
  PfvInitialiseProcess(argv[0]);
  PfvRegisterCommands();
  const std::string first = argc > 1 ? argv[1] : "";
  if (first == "--help" || first == "-h" || first == "help") {
    PrintUsage();
    return 0;
  }
  if (first == "--version") {
    std::printf("pfv %s\n", PFV_VERSION);
    return 0;
  }
  for (const PfvCommand& c : PfvCommands()) {
    if (c.name == first)
      return c.run(std::vector<std::string>(argv + 2, argv + argc));
  }
  // The window, when it is built in, registers itself as "gui".
  for (const PfvCommand& c : PfvCommands()) {
    if (c.name == "gui")
      return c.run(std::vector<std::string>(argv + 1, argv + argc));
  }
  if (!first.empty() && first[0] == '-') {
    std::fprintf(stderr, "pfv: unknown option %s\n", first.c_str());
    PrintUsage();
    return 2;
  }
  std::fprintf(stderr, "pfv: this build has no window; use a sub-command.\n");
  PrintUsage();
  return first.empty() ? 0 : 2;
}
