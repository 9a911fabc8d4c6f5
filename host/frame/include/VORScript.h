// Runs scripts of user steps through the driver: one step per line, words separated by blanks,
// "double quotes" around words with blanks, ${NAME} replaced by the environment variable, '#'
// starts a comment. Each step is echoed ("> step") followed by what happened; a bad step stops
// the script with "line N: error: reason". The language is described in docs/scripting.md.
#pragma once

#include <functional>
#include <ostream>
#include <string>
#include <vector>

class VORDriver;

class VORScript {
 public:
  VORScript(VORDriver& driver, std::ostream& out);

  // Runs the text; name is used in messages. Returns true when every line succeeded.
  bool Run(const std::string& text);
  bool RunFile(const std::string& path);
  // Splits a line into words (quotes, ${NAME}); false and a reason for an unclosed quote.
  static bool Split(const std::string& line, std::vector<std::string>& words, std::string& error);

  // Steps added by modules when they load (for example "zitblts <node>"): the words of the line
  // (the step first); false with a reason in error. A later registration replaces an earlier.
  // A step registered as "print <what>" serves "print <what> ..." lines.
  using StepFunction = std::function<bool(VORDriver& driver, const std::vector<std::string>& words,
                                          std::ostream& out, std::string& error)>;
  static void RegisterStep(const std::string& step, StepFunction function);
  static void UnregisterStep(const std::string& step);

 private:
  bool Execute(const std::vector<std::string>& words, std::string& error);
  void Flush();

  VORDriver& _driver;
  std::ostream& _out;
};
