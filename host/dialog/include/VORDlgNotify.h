// A modal notification window ("display blocked"): title, text, style. It is shown through one
// replaceable presenter: a recorder when headless (it keeps what was shown and answers OK), a
// message box in the GUI.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "VORDlgControl.h"

class VORDlgNotify;

enum VORDlgNotifyAnswer { VORDlgNotifyOK = 1, VORDlgNotifyCancel = 2 };

class VORDlgNotifyPresenter {
 public:
  virtual ~VORDlgNotifyPresenter() = default;
  // Shows the notification until the user answers; returns the answer.
  virtual int Present(const VORDlgNotify& notify) = 0;
};

struct VORDlgNotifyRecord {
  std::string id;
  std::string title;
  std::string text;
  int style;
};

// The headless presenter: records and answers OK.
class VORDlgNotifyRecorder : public VORDlgNotifyPresenter {
 public:
  int Present(const VORDlgNotify& notify) override;
  const std::vector<VORDlgNotifyRecord>& Records() const { return _records; }
  void Clear() { _records.clear(); }

 private:
  std::vector<VORDlgNotifyRecord> _records;
};

class VORDlgNotify : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgNotify, VORDlgControl)
 public:
  // Not owned by parent: release with RequestDelayedDestruction after DisplayBlocked.
  VORDlgNotify(VORCommand* parent, const VORString& id, int style = VORDlgNfyError | VORDlgNfyOK);
  const char* GetKind() const override { return "Notify"; }
  VORUnicodeString GetValueText() const override { return _text; }

  void SetText(const VORUnicodeString& text) { _text = text; }
  VORUnicodeString GetText() const { return _text; }
  // Shows message with title through the presenter and waits for the answer.
  int DisplayBlocked(const VORUnicodeString& message, const VORUnicodeString& title);

  // The presenter in use (the shared recorder by default). Null restores the recorder.
  static void SetPresenter(std::shared_ptr<VORDlgNotifyPresenter> presenter);
  static VORDlgNotifyPresenter& GetPresenter();
  // The default recorder (also while another presenter is installed).
  static VORDlgNotifyRecorder& Recorder();

 private:
  VORUnicodeString _text;
};
