// The ZitBlts of a node as text, and the script step that prints them.
#pragma once

#include <string>

class VORBaseUnknown;

// One line per ZitBlt: name, location, translation (or "not placed"), status, open or closed.
std::string QELDescribeZitBlts(VORBaseUnknown* node);
// Registers "zitblts <node>" with the script runner (done when the module loads).
void QELRegisterZitBltScriptStep();
