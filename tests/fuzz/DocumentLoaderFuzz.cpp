// Any bytes given to the document loader: refused with a message, or loaded into a document the
// checker accepts and that saves, loads and saves again to the same bytes.
#include <cstdint>
#include <string>
#include <vector>

#include "FuzzSupport.h"
#include "VORModelInit.h"
#include "VORDocument.h"
#include "VORModelChecker.h"

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  VORInitModel();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);
  std::string error;
  VORProcess_var doc = VORProcess_var::Adopt(VORProcess::LoadFromString(text, "fuzz.pprx", error));
  if (!doc) {
    if (error.rfind("fuzz.pprx", 0) != 0)
      pfvfuzz::Broken("a refusal that does not name the file: " + error);
    return 0;
  }
  std::vector<std::string> problems;
  if (!VORModelChecker::Check(doc.get(), problems))
    pfvfuzz::Broken("a loaded document the checker refuses: " + problems.front());
  const std::string first = doc->SaveToString();
  VORProcess_var again = VORProcess_var::Adopt(VORProcess::LoadFromString(first, "saved", error));
  if (!again)
    pfvfuzz::Broken("a saved document does not load: " + error);
  if (again->SaveToString() != first)
    pfvfuzz::Broken("save, load and save again changed the bytes");
  return 0;
}
