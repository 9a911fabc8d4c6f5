#include "VORScript.h"

#include <algorithm>
#include <cstdlib>
#include <functional>
#include <map>
#include <sstream>

#include "VORDlgCombo.h"
#include "VORDlgSelectorList.h"
#include "VORDriver.h"
#include "VORFileIO.h"
#include "VORModelChecker.h"
#include "VORWorkbench.h"

namespace {
// The dialog's description with OK's availability at the end of its first line.
std::string DialogWithOKState(const VORDriver& driver, const std::string& name) {
  std::string text = driver.DescribeDialog(name);
  const VORDlgDialog* dialog = driver.FindDialog(name);
  if (dialog == nullptr || !dialog->HasOKButton())
    return text;
  const size_t end = text.find('\n');
  text.insert(end == std::string::npos ? text.size() : end,
              dialog->GetOKSensitivity() ? " [OK sensitive]" : " [OK insensitive]");
  return text;
}

// One line per combo line: '  line <n> "<text>"', the selected one marked.
bool PrintCombo(const VORDriver& driver, const std::string& dialogName, const std::string& name,
                std::ostream& out, std::string& error) {
  const VORDlgDialog* dialog = driver.FindDialog(dialogName);
  const VORDlgControl* control = dialog ? dialog->FindControl(name) : nullptr;
  if (const auto* list = dynamic_cast<const VORDlgSelectorList*>(control)) {
    const std::vector<int>& selected = list->GetSelect();
    for (int i = 0; i < list->GetLineCount(); ++i)
      out << "  line " << i + 1 << " \"" << list->GetLine(i).ConvertToUTF8() << "\""
          << (std::find(selected.begin(), selected.end(), i) != selected.end() ? " [selected]" : "")
          << "\n";
    return true;
  }
  const auto* combo = dynamic_cast<const VORDlgCombo*>(control);
  if (combo == nullptr) {
    error = dialog ? "no combo \"" + name + "\" in dialog \"" + dialogName + "\""
                   : "no dialog \"" + dialogName + "\" is shown";
    return false;
  }
  for (int i = 0; i < combo->GetLineCount(); ++i)
    out << "  line " << i + 1 << " \"" << combo->GetLine(i).ConvertToUTF8() << "\""
        << (i == combo->GetSelect() ? " [selected]" : "") << "\n";
  return true;
}

bool ToNumber(const std::string& word, double& value) {
  char* end = nullptr;
  value = std::strtod(word.c_str(), &end);
  return !word.empty() && end != nullptr && *end == '\0';
}

// "<numbers...> [in <window>]": the numbers and the window (empty when not given).
bool Numbers(const std::vector<std::string>& words, size_t count, std::vector<double>& numbers,
             std::string& window, std::string& error) {
  const size_t expected = 1 + count;
  if (!(words.size() == expected || (words.size() == expected + 2 && words[expected] == "in"))) {
    error = "\"" + words[0] + "\" expects " + std::to_string(count) +
            " numbers, optionally followed by \"in <window>\"";
    return false;
  }
  for (size_t i = 1; i <= count; ++i) {
    double v = 0;
    if (!ToNumber(words[i], v)) {
      error = "\"" + words[i] + "\" is not a number";
      return false;
    }
    numbers.push_back(v);
  }
  window = words.size() == expected + 2 ? words[expected + 1] : std::string();
  return true;
}

std::map<std::string, VORScript::StepFunction>& ModuleSteps() {
  static std::map<std::string, VORScript::StepFunction> steps;
  return steps;
}
}  // namespace

VORScript::VORScript(VORDriver& driver, std::ostream& out) : _driver(driver), _out(out) {}

void VORScript::RegisterStep(const std::string& step, StepFunction function) {
  ModuleSteps()[step] = std::move(function);
}

void VORScript::UnregisterStep(const std::string& step) {
  ModuleSteps().erase(step);
}

bool VORScript::Split(const std::string& line, std::vector<std::string>& words,
                      std::string& error) {
  words.clear();
  std::string word;
  bool inWord = false;
  bool quoted = false;
  for (size_t i = 0; i < line.size(); ++i) {
    const char c = line[i];
    if (c == '"') {
      quoted = !quoted;
      inWord = true;
    } else if (!quoted && c == '#') {
      break;
    } else if (!quoted && (c == ' ' || c == '\t' || c == '\r')) {
      if (inWord)
        words.push_back(word);
      word.clear();
      inWord = false;
    } else if (c == '$' && i + 1 < line.size() && line[i + 1] == '{') {
      const size_t close = line.find('}', i + 2);
      if (close == std::string::npos) {
        error = "unclosed ${";
        return false;
      }
      const char* value = std::getenv(line.substr(i + 2, close - i - 2).c_str());
      word += value ? value : "";
      inWord = true;
      i = close;
    } else {
      word += c;
      inWord = true;
    }
  }
  if (quoted) {
    error = "unclosed quote";
    return false;
  }
  if (inWord)
    words.push_back(word);
  return true;
}

bool VORScript::RunFile(const std::string& path) {
  std::string text;
  std::string error;
  if (!VORReadFile(path, text, error)) {
    _out << "error: " << error << "\n";
    return false;
  }
  return Run(text);
}

void VORScript::Flush() {
  for (const std::string& event : _driver.TakeEvents())
    _out << event << "\n";
}

bool VORScript::Run(const std::string& text) {
  std::istringstream lines(text);
  int number = 0;
  for (std::string line; std::getline(lines, line);) {
    ++number;
    std::vector<std::string> words;
    std::string error;
    if (!Split(line, words, error)) {
      _out << "line " << number << ": error: " << error << "\n";
      return false;
    }
    if (words.empty())
      continue;
    std::string echo;
    for (const std::string& w : words)
      echo += (echo.empty() ? "" : " ") + (w.find(' ') != std::string::npos ? "\"" + w + "\"" : w);
    _out << "> " << echo << "\n";
    const bool ok = Execute(words, error);
    Flush();
    if (!ok) {
      _out << "line " << number << ": error: " << error << "\n";
      return false;
    }
  }
  return true;
}

bool VORScript::Execute(const std::vector<std::string>& w, std::string& error) {
  const std::string& step = w[0];
  const size_t n = w.size() - 1;
  auto args = [&](size_t min, size_t max, const char* usage) {
    if (n >= min && n <= max)
      return true;
    error = "usage: " + std::string(usage);
    return false;
  };
  auto driverStep = [&](bool ok) {
    if (!ok)
      error = _driver.LastError();
    return ok;
  };
  auto arg = [&](size_t i) { return i <= n ? w[i] : std::string(); };

  if (step == "open")
    return args(1, 1, "open <document>") && driverStep(_driver.OpenDocument(w[1]));
  if (step == "save")
    return args(1, 1, "save <file>") && driverStep(_driver.SaveDocument(w[1]));
  if (step == "export") {
    if (!(n == 1 || (n == 3 && w[2] == "in"))) {
      error = "usage: export <file.svg> [in <window>]";
      return false;
    }
    return driverStep(_driver.ExportWindow(n == 3 ? w[3] : std::string(), w[1]));
  }
  if (step == "workbench") {
    if (!args(1, 1, "workbench <file>"))
      return false;
    return VORWorkbench::LoadFile(w[1], &error);
  }
  if (step == "start")
    return args(1, 1, "start <command id>") && driverStep(_driver.StartCommand(w[1]));
  if (step == "cancel")
    return args(0, 0, "cancel") && driverStep(_driver.CancelCommand());
  if (step == "undo")
    return args(0, 0, "undo") && driverStep(_driver.Undo());
  if (step == "redo")
    return args(0, 0, "redo") && driverStep(_driver.Redo());
  if (step == "pick")
    return args(1, 1, "pick <object id or label>") && driverStep(_driver.PickObject(w[1]));
  if (step == "select") {
    if (n == 0) {
      error = "usage: select <object> [<object> ...]";
      return false;
    }
    return driverStep(_driver.SelectObjects(std::vector<std::string>(w.begin() + 1, w.end())));
  }
  if (step == "pick-at" || step == "context") {
    std::vector<double> v;
    std::string window;
    if (!Numbers(w, 2, v, window, error))
      return false;
    return driverStep(step == "pick-at" ? _driver.PickInChart(window, v[0], v[1])
                                        : _driver.OpenContextMenu(window, v[0], v[1]));
  }
  if (step == "drag") {
    std::vector<double> v;
    std::string window;
    if (!Numbers(w, 4, v, window, error))
      return false;
    return driverStep(_driver.Drag(window, v[0], v[1], v[2], v[3]));
  }
  if (step == "menu")
    return args(1, 1, "menu <item>") && driverStep(_driver.ChooseMenuItem(w[1]));
  if (step == "ok")
    return args(0, 1, "ok [dialog]") && driverStep(_driver.PressOK(arg(1)));
  if (step == "cancel-dialog")
    return args(0, 1, "cancel-dialog [dialog]") && driverStep(_driver.PressCancel(arg(1)));
  if (step == "close-dialog")
    return args(0, 1, "close-dialog [dialog]") && driverStep(_driver.CloseDialog(arg(1)));
  if (step == "type")
    return args(3, 3, "type <dialog> <editor> <text>") &&
           driverStep(_driver.TypeText(w[1], w[2], w[3]));
  if (step == "choose")
    return args(3, 3, "choose <dialog> <combo> <line>") &&
           driverStep(_driver.ChooseComboLine(w[1], w[2], w[3]));
  if (step == "toggle")
    return args(2, 2, "toggle <dialog> <check button>") &&
           driverStep(_driver.ToggleCheckButton(w[1], w[2]));
  if (step == "activate")
    return args(1, 1, "activate <window>") && driverStep(_driver.ActivateWindow(w[1]));
  if (step == "close-window")
    return args(1, 1, "close-window <window>") && driverStep(_driver.CloseWindow(w[1]));
  if (step == "print") {
    // "print <what> ..." steps added by modules are registered as "print <what>".
    if (n >= 1) {
      if (auto found = ModuleSteps().find("print " + w[1]); found != ModuleSteps().end())
        return found->second(_driver, w, _out, error);
    }
    if (!args(1, 3, "print windows|window [w]|cso|dialog [d]|combo <d> <c>|menu|commands|check"))
      return false;
    const std::string& what = w[1];
    if (what == "windows") {
      _out << _driver.DescribeWindows();
    } else if (what == "window") {
      _out << _driver.DescribeWindow(arg(2));
    } else if (what == "cso") {
      _out << _driver.DescribeCSO();
    } else if (what == "dialog") {
      _out << DialogWithOKState(_driver, arg(2));
    } else if (what == "combo") {
      if (!args(3, 3, "print combo <dialog> <combo>"))
        return false;
      return PrintCombo(_driver, w[2], w[3], _out, error);
    } else if (what == "menu") {
      _out << _driver.DescribeMenu();
    } else if (what == "commands") {
      for (const VORWorkbenchCommand& c : VORWorkbench::Commands())
        _out << c.id << ": \"" << c.title << "\" (" << c.module << "/" << c.className << ")\n";
    } else if (what == "check") {
      VORProcess* document = _driver.GetDocument();
      if (document == nullptr) {
        error = "no document is open";
        return false;
      }
      std::vector<std::string> problems;
      if (VORModelChecker::Check(document, problems)) {
        _out << "model check: ok\n";
      } else {
        for (const std::string& p : problems)
          _out << "model check: " << p << "\n";
      }
    } else {
      error = "cannot print \"" + what + "\"";
      return false;
    }
    return true;
  }
  if (auto found = ModuleSteps().find(step); found != ModuleSteps().end())
    return found->second(_driver, w, _out, error);
  error = "unknown step \"" + step + "\"";
  return false;
}
