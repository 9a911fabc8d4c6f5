#include "VORQtChangeWatch.h"

#include "VORCommandEngine.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORFrmEditor.h"
#include "VORFrmLayout.h"
#include "VORStateCommand.h"

VORQtChangeWatch::VORQtChangeWatch(VORDriver& driver) : _driver(driver) {
  _layoutCallback = VORFrmLayout::GetCurrentLayout()->GetEventPublisher()->AddCallback(
      "VORFrmLayoutNotification", [this](VORBaseUnknown*, const std::string&, VORNotification*,
                                         void*, VORCallbackId) { _mask |= Layout | Selection; });
  VOREventPublisher* engine = VORCommandEngine::GetEventPublisher();
  _startCallback = engine->AddCallback(
      "VORCommandStarted", [this](VORBaseUnknown*, const std::string&, VORNotification*, void*,
                                  VORCallbackId) { _mask |= Command; });
  _endCallback = engine->AddCallback(
      "VORCommandEndNotification",
      [this](VORBaseUnknown*, const std::string&, VORNotification*, void*, VORCallbackId) {
        ++_commandsEnded;
        // A command may have changed what windows describe and what the tree shows.
        _mask |= Command | Layout | Document;
      });
}

VORQtChangeWatch::~VORQtChangeWatch() {
  Unwatch();
  VORFrmLayout::GetCurrentLayout()->GetEventPublisher()->RemoveCallback(_layoutCallback);
  VORCommandEngine::GetEventPublisher()->RemoveCallback(_startCallback);
  VORCommandEngine::GetEventPublisher()->RemoveCallback(_endCallback);
}

void VORQtChangeWatch::Unwatch() {
  if (_cso)
    _cso->RemoveCallback(_csoCallback);
  if (_hso)
    _hso->RemoveCallback(_hsoCallback);
  _cso = VORHandle<VOREventPublisher>();
  _hso = VORHandle<VOREventPublisher>();
  _editor = nullptr;
}

void VORQtChangeWatch::WatchEditor(VORFrmEditor* editor) {
  Unwatch();
  _editor = editor;
  if (editor == nullptr)
    return;
  const auto selectionChanged = [this](VORBaseUnknown*, const std::string&, VORNotification*, void*,
                                       VORCallbackId) { _mask |= Selection; };
  // The publishers are held: an editor closing never leaves a callback on a dead publisher.
  _cso = editor->GetCSO()->GetEventPublisher();
  _hso = editor->GetHSO()->GetEventPublisher();
  _csoCallback = _cso->AddCallback("VORSOChangeNotification", selectionChanged);
  _hsoCallback = _hso->AddCallback("VORSOChangeNotification", selectionChanged);
}

std::uint32_t VORQtChangeWatch::Take() {
  // A new window may come with a new editor (possibly where a closed one used to be).
  if (VORFrmEditor* editor = _driver.GetEditor(); editor != _editor || (_mask & Layout) != 0) {
    if (editor != _editor)
      _mask |= Selection | Document;
    WatchEditor(editor);
  }
  VORProcess* document = _driver.GetDocument();
  const bool modified = document != nullptr && document->IsModified();
  if (document != _document || modified != _modified)
    _mask |= Document;
  _document = document;
  _modified = modified;
  const void* state = nullptr;
  if (auto* running = dynamic_cast<VORStateCommand*>(_driver.GetRunningCommand()))
    state = running->GetCurrentState();
  if (state != _commandState)
    _mask |= Command;
  _commandState = state;
  const std::size_t messages = _driver.Notifications().size();
  if (messages != _messages)
    _mask |= Messages;
  _messages = messages;
  const std::uint32_t mask = _mask;
  _mask = 0;
  return mask;
}
