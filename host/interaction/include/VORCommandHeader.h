// Describes a command that can be created on demand: an identifier, the module (shared library
// "lib<module>.so") and class that implement it, an argument handed to its factory, and an
// availability state. Module commands come from "extern \"C\" VORBaseUnknown*
// fctCreate<Class>(VORBaseUnknown* argument)"; host commands (empty module) from factories
// registered with RegisterHostClass. Unknown modules or classes give null.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "VORCommand.h"

// The signature of a command factory exported by a module.
using VORCommandFactory = VORBaseUnknown* (*)(VORBaseUnknown* argument);

class VORCommandHeader : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORCommandHeader, VORBaseUnknown)
 public:
  enum State { Available = 0, Unavailable = 1 };

  VORCommandHeader(const VORString& id, const VORString& module, const VORString& className,
                   VORBaseUnknown* argument = nullptr, int state = Available);

  const VORString& GetID() const { return _id; }
  const VORString& GetModule() const { return _module; }
  const VORString& GetClassName() const { return _className; }
  VORBaseUnknown* GetArgument() const { return _argument.get(); }

  bool IsAvailable() const { return _state == Available; }
  void BecomeAvailable() { _state = Available; }
  void BecomeUnavailable() { _state = Unavailable; }

  // Creates the command with the argument. Returns a new command (one reference, the caller's),
  // null when unavailable or when the module, the factory or the class is unknown.
  virtual VORCommand* CreateCommand();
  // Creates the command and starts it through the command engine; null when not created.
  // The engine holds the command while it runs; the caller gets no reference.
  VORCommand* StartCommand();
  // Why the last CreateCommand gave null.
  const std::string& LastError() const { return _lastError; }

  // Named headers the module reaches by identifier ("CenterGraph", "TileWinH" ...). Declare
  // holds the header; a later header with the same id replaces it.
  static void Declare(VORCommandHeader* header);
  static VORCommandHeader* Find(const VORString& id);
  static void Undeclare(const VORString& id);
  static std::vector<VORString> DeclaredIds();

  // Host classes for headers with an empty module.
  using HostFactory = std::function<VORCommand*(VORBaseUnknown* argument)>;
  static void RegisterHostClass(const VORString& className, HostFactory factory);

 protected:
  ~VORCommandHeader() override = default;

 private:
  VORString _id;
  VORString _module;
  VORString _className;
  VORBaseUnknown_var _argument;
  int _state;
  std::string _lastError;
};

VOR_DECLARE_HANDLE(VORCommandHeader);

// Exports the factory of a command class whose constructor takes the argument.
#define VOR_EXPORT_COMMAND_FACTORY(Class)                                 \
  extern "C" VORBaseUnknown* fctCreate##Class(VORBaseUnknown* argument) { \
    return static_cast<VORCommand*>(new Class(argument));                 \
  }
// Exports the factory of a command class built without argument (the argument is ignored).
#define VOR_EXPORT_COMMAND_FACTORY_NOARG(Class)                               \
  extern "C" VORBaseUnknown* fctCreate##Class(VORBaseUnknown* /*argument*/) { \
    return static_cast<VORCommand*>(new Class());                             \
  }
