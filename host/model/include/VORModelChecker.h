// Invariants of a process document: no dangling flow, link, item reference or resource
// assignment; flows join siblings; the product tree is a tree; ids are unique and indexed.
#pragma once

#include <string>
#include <vector>

class VORProcess;

namespace VORModelChecker {
// Appends one line per broken invariant to problems; true when there is none.
bool Check(VORProcess* document, std::vector<std::string>& problems);
}  // namespace VORModelChecker
