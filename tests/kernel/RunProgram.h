// Runs a command line through the shell and returns what it printed; tests of the pfv program.
#pragma once

#include <cstdio>
#include <string>

inline std::string RunProgram(const std::string& command, int& status) {
  std::string output;
  FILE* pipe = ::popen(command.c_str(), "r");
  if (pipe == nullptr) {
    status = -1;
    return output;
  }
  char buffer[4096];
  for (size_t n; (n = std::fread(buffer, 1, sizeof buffer, pipe)) > 0;)
    output.append(buffer, n);
  status = ::pclose(pipe);
  return output;
}
