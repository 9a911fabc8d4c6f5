// What changed since the window last caught up, as a mask filled by notifications the layers
// already send: the layout's windows, the current editor's selections, commands starting and
// ending. A few scalars without a notification of their own (the document's modified flag, the
// running command's state, the count of shown messages) are compared, not rebuilt.
#pragma once

#include <cstdint>
#include <cstddef>

#include "VOREventPublisher.h"
#include "VORHandle.h"

class VORDriver;
class VORFrmEditor;

class VORQtChangeWatch {
 public:
  enum Change : std::uint32_t {
    Layout = 1u << 0,     // a window came, went or became current
    Selection = 1u << 1,  // the current editor's CSO or HSO changed, or another editor is current
    Command = 1u << 2,    // a command started or ended, or the running one changed state
    Document = 1u << 3,   // the document was modified, saved or replaced
    Messages = 1u << 4,   // a message was shown
    Everything = 0xffffffffu
  };

  explicit VORQtChangeWatch(VORDriver& driver);
  ~VORQtChangeWatch();
  VORQtChangeWatch(const VORQtChangeWatch&) = delete;
  VORQtChangeWatch& operator=(const VORQtChangeWatch&) = delete;

  // Adds changes found out another way (a step the window made itself).
  void Mark(std::uint32_t changes) { _mask |= changes; }
  // The changes since the last call; the mask starts again from nothing.
  std::uint32_t Take();
  // How many commands ended since the watch began (the tree is rebuilt after each).
  int CommandsEnded() const { return _commandsEnded; }

 private:
  void WatchEditor(VORFrmEditor* editor);
  void Unwatch();

  VORDriver& _driver;
  std::uint32_t _mask = Everything;
  int _commandsEnded = 0;
  VORFrmEditor* _editor = nullptr;
  VORHandle<VOREventPublisher> _cso;
  VORHandle<VOREventPublisher> _hso;
  VORCallbackId _csoCallback = 0;
  VORCallbackId _hsoCallback = 0;
  VORCallbackId _layoutCallback = 0;
  VORCallbackId _startCallback = 0;
  VORCallbackId _endCallback = 0;
  // Compared scalars.
  const void* _document = nullptr;
  bool _modified = false;
  const void* _commandState = nullptr;
  std::size_t _messages = 0;
};
