// pfv: the planner's program. Sub-commands run headless; without one it opens the window.
#include <cstdio>
#include <cstring>
#include <string>

namespace {
void PrintUsage() {
  std::puts(
      "Usage: pfv [document.pprx]            open the Product Flow Viewer window\n"
      "       pfv --help | --version\n"
      "\n"
      "Sub-commands are added as the platform grows; see docs/ for the list.");
}
}  // namespace

int main(int argc, char** argv) {
  if (argc > 1 && (std::strcmp(argv[1], "--help") == 0 || std::strcmp(argv[1], "-h") == 0)) {
    PrintUsage();
    return 0;
  }
  if (argc > 1 && std::strcmp(argv[1], "--version") == 0) {
    std::printf("pfv %s\n", PFV_VERSION);
    return 0;
  }
  PrintUsage();
  return 0;
}
