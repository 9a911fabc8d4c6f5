// Runs a command line through the shell and returns what it printed; tests of the pfv program,
// and the check of a `pfv script` run against its expected output.
#pragma once

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <utility>
#include <vector>

#include "VORFileIO.h"

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

inline void ReplaceAll(std::string& text, const std::string& from, const std::string& to) {
  for (size_t at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size()))
    text.replace(at, from.size(), to);
}

// Runs `pfv script script` and expects it to succeed printing the expected file, once each
// {text, name} of names is written back as the ${name} the script used.
inline void ExpectScriptPrints(const std::string& pfv, const std::string& script,
                               const std::string& expectedFile,
                               const std::vector<std::pair<std::string, std::string>>& names) {
  int status = 0;
  std::string output = RunProgram(pfv + " script " + script + " 2>&1", status);
  for (const auto& [text, name] : names)
    ReplaceAll(output, text, "${" + name + "}");
  std::string expected, error;
  ASSERT_TRUE(VORReadFile(expectedFile, expected, error)) << error;
  EXPECT_EQ(output, expected);
  EXPECT_EQ(status, 0);
}
