// Any bytes as script lines: each line splits into words or is refused with a reason, and the
// words, quoted again, split back into the same words.
#include <cstdint>
#include <string>
#include <vector>

#include "FuzzSupport.h"
#include "VORFrameInit.h"
#include "VORScript.h"

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  VORInitFrame();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);
  size_t start = 0;
  while (start <= text.size()) {
    size_t end = text.find('\n', start);
    if (end == std::string::npos)
      end = text.size();
    const std::string line = text.substr(start, end - start);
    start = end + 1;
    std::vector<std::string> words;
    std::string error;
    if (!VORScript::Split(line, words, error)) {
      if (error.empty())
        pfvfuzz::Broken("a refused line without a reason");
      continue;
    }
    std::string quoted;
    bool plain = true;
    for (const std::string& w : words) {
      plain = plain && w.find("${") == std::string::npos;
      quoted += "\"" + w + "\" ";
    }
    if (!plain)
      continue;  // a word that spells a variable would be replaced the second time
    std::vector<std::string> again;
    if (!VORScript::Split(quoted, again, error) || again != words)
      pfvfuzz::Broken("quoted words did not split back: " + line);
  }
  return 0;
}
