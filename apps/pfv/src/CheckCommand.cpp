// pfv check <document>: loads a document (which runs the invariant checker) and prints a summary.
#include <cstdio>

#include "PfvCommand.h"
#include "VORModel.h"

namespace {
int RunCheck(const std::vector<std::string>& args) {
  if (args.size() != 1) {
    std::fprintf(stderr, "Usage: pfv check <document.pprx>\n");
    return 2;
  }
  std::string error;
  VORProcess_var doc = VORProcess_var::Adopt(VORProcess::Load(args[0], error));
  if (!doc) {
    std::fprintf(stderr, "pfv check: %s\n", error.c_str());
    return 1;
  }
  // Loading ran the invariant checker already: a document that breaks one does not load.
  const VORProcessStatistics s = doc->GetStatistics();
  std::printf("%s: %d activities, %d flows, %d products, %d resources\n", args[0].c_str(),
              s.activities, s.flows, s.products - s.resources, s.resources);
  return 0;
}
}  // namespace

PFV_COMMAND(check, "check", "<document.pprx>",
            "load a document, check its consistency and print a one-line summary", RunCheck);
