// pfv gen --activities N --out FILE [--hub] [--seed S] [--no-group]: writes a synthetic line.
#include <cstdio>
#include <cstdlib>
#include <string>

#include "PfvCommand.h"
#include "VORModel.h"
#include "VORModelGenerator.h"

namespace {
bool ParseInt(const std::string& text, long& value) {
  char* end = nullptr;
  value = std::strtol(text.c_str(), &end, 10);
  return !text.empty() && end != nullptr && *end == '\0';
}

int RunGen(const std::vector<std::string>& args) {
  VORModelGeneratorOptions options;
  std::string out;
  for (size_t i = 0; i < args.size(); ++i) {
    const std::string& a = args[i];
    long value = 0;
    const bool hasValue = i + 1 < args.size();
    if (a == "--activities" && hasValue && ParseInt(args[i + 1], value) && value > 0 &&
        value <= 2000000) {
      options.activities = static_cast<int>(value);
      ++i;
    } else if (a == "--seed" && hasValue && ParseInt(args[i + 1], value) && value >= 0) {
      options.seed = static_cast<std::uint32_t>(value);
      ++i;
    } else if (a == "--out" && hasValue) {
      out = args[++i];
    } else if (a == "--hub") {
      options.hub = true;
    } else if (a == "--no-group") {
      options.withGrouping = false;
    } else {
      std::fprintf(stderr, "pfv gen: bad argument '%s'\n", a.c_str());
      std::fprintf(stderr,
                   "Usage: pfv gen --activities N --out FILE [--hub] [--seed S] [--no-group]\n");
      return 2;
    }
  }
  if (out.empty()) {
    std::fprintf(stderr, "pfv gen: --out FILE is required\n");
    return 2;
  }
  VORProcess_var doc = VORProcess_var::Adopt(VORModelGenerator::Generate(options));
  std::string error;
  if (!doc->SaveAs(out, error)) {
    std::fprintf(stderr, "pfv gen: %s\n", error.c_str());
    return 1;
  }
  const VORProcessStatistics s = doc->GetStatistics();
  std::printf("%s: %d activities, %d flows, %d products, %d resources\n", out.c_str(), s.activities,
              s.flows, s.products - s.resources, s.resources);
  return 0;
}
}  // namespace

PFV_COMMAND(gen, "gen", "--activities N --out FILE [--hub] [--seed S] [--no-group]",
            "write a synthetic body-shop line of about N activities", RunGen);
