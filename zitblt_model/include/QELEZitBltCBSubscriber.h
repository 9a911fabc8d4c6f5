// The callback subscriber of one physical activity (data extension on "PhysicalActivity").
#pragma once

#include <utility>
#include <vector>

#include "QELIZitBltCBSubscriber.h"
#include "VOREventPublisher.h"
#include "VORExtension.h"

class QELEZitBltCBSubscriber : public VORExtension, public QELIZitBltCBSubscriber {
  VOR_DECLARE_CLASS(QELEZitBltCBSubscriber, VORExtension)
 public:
  QELEZitBltCBSubscriber() = default;

  HRESULT Subscribe() override;
  bool IsSubscribed() override { return _subscribed; }
  HRESULT Unsubscribe() override;
  HRESULT GetUpdateCommand(const VORUnicodeString& zitBltName,
                           QELBaseListZitBltCmd** command) override;
  void SetCallbacksSuspended(bool suspended) override;
  bool AreCallbacksSuspended() override;

  // The views-change callback (public for the tests that dispatch by hand).
  void OnViewsChange(const std::string& event, VORNotification* notification, void* clientData,
                     VORCallbackId id);
  // A command of the table ended with its activity: it releases the table's reference itself.
  void ForgetEndedCommand(QELBaseListZitBltCmd* command);

 protected:
  ~QELEZitBltCBSubscriber() override;

 private:
  void CreateUpdateCommands();
  // Hands every command of the table to deferred deletion and empties the table.
  void DeleteCommands();
  void DropCallback();

  bool _subscribed = false;
  // ZitBlt name -> update command (the creator's reference), in configuration order.
  std::vector<std::pair<VORUnicodeString, QELBaseListZitBltCmd*>> _commands;
  VORCallbackId _callbackHandle = 0;
  VORHandle<VOREventPublisher> _publisher;  // the root activity's, while a callback is held
  VORBaseUnknown* _root = nullptr;          // not held: only used in the callback
  const void* _key = nullptr;               // the activity the callback is filed under
};
