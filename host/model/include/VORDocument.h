// Documents. VORDocument is the generic part (storage name, environment, containers);
// VORProcess is the process-planning document: a root process, the product and resource trees,
// manufacturing assemblies and, in hub mode ("IPDDocEnv"), planning data.
// Every change goes through GetDoor() (the interfaces of the model objects call it).
#pragma once

#include <functional>

#include <memory>
#include <string>

#include "VORHandle.h"
#include "VORIDocInit.h"
#include "VORLists.h"
#include "VORString.h"

class VORModelDoor;
class VORUndoHistory;
struct VORDocumentData;

class VORDocument : public virtual VORBaseUnknown {
  VOR_DECLARE_CLASS(VORDocument, VORBaseUnknown)
 public:
  static constexpr const char* HubEnvironment = "IPDDocEnv";
  static constexpr const char* PPRContainer = "VORSPPPPRCont";
  static constexpr const char* BomContainer = "QELMBomNodesCont";
  static constexpr const char* ProcessContainer = "VORSPPProcessCont";
  static constexpr const char* RootProductAlias = "PPRProduct";
  static constexpr const char* ResourceRootAlias = "PPRResources";

  // File the document was loaded from or last saved to (empty for a new document).
  const std::string& GetStorageName() const { return _storageName; }
  void SetStorageName(std::string path) { _storageName = std::move(path); }

  // The environment name ("IPDDocEnv" in hub mode, empty otherwise).
  virtual HRESULT GetEnvironmentName(VORUnicodeString& name) = 0;
  virtual VORString GetEnvironment() = 0;
  bool IsHubMode() { return GetEnvironment() == VORString(HubEnvironment); }

  // One of the containers named above; E_FAIL and null for another name.
  virtual HRESULT GetContainer(const char* name, VORBaseUnknown_var& container) = 0;
  // The init object (answers VORIDocInit).
  virtual HRESULT GetInitObject(VORBaseUnknown_var& init) = 0;

 protected:
  VORDocument() = default;
  ~VORDocument() override = default;

 private:
  std::string _storageName;
};
VOR_DECLARE_HANDLE(VORDocument);

struct VORProcessStatistics {
  int activities = 0;  // root included
  int controlNodes = 0;
  int flows = 0;
  int productIOs = 0;
  int products = 0;  // every product, resources included
  int resources = 0;
  int assemblies = 0;
  int itemAssignments = 0;
  int resourceAssignments = 0;
  int planTypes = 0;
};

class VORProcess : public VORDocument, public virtual VORIDocInit {
  VOR_DECLARE_CLASS(VORProcess, VORDocument)
 public:
  // A new empty document: a root process labelled rootLabel, the product root "PPRProduct"
  // and the resource root "PPRResources". environment "IPDDocEnv" gives a hub document.
  // One reference, the caller's.
  static VORProcess* CreateNew(const VORUnicodeString& rootLabel = "Process",
                               const char* environment = "");

  // Loads a .pprx file. Null and a message naming the file and the line/column or the
  // offending id when the file is unreadable, ill-formed or inconsistent.
  static VORProcess* Load(const std::string& path, std::string& error);
  // Observer of every following load (the window's progress dialog): called with 0..100 while a
  // document loads; empty to stop. Loads run in the caller's thread, so the observer may pump
  // the event loop (without user input) to repaint.
  static void SetLoadProgress(std::function<void(int percent)> observer);
  // The same from text; name stands for the file in messages.
  static VORProcess* LoadFromString(const std::string& xml, const std::string& name,
                                    std::string& error);
  // Saves atomically to the storage name (keeping "<name>.bak"); false with the path and the
  // reason in error, the previous file then untouched.
  bool Save(std::string& error);
  // Saves to path and makes it the storage name on success.
  bool SaveAs(const std::string& path, std::string& error);
  // The document as .pprx text (deterministic: the same document gives the same text).
  std::string SaveToString();

  HRESULT GetEnvironmentName(VORUnicodeString& name) override;
  VORString GetEnvironment() override;
  HRESULT GetContainer(const char* name, VORBaseUnknown_var& container) override;
  HRESULT GetInitObject(VORBaseUnknown_var& init) override;
  HRESULT GetRootContainer(VORBaseUnknown_var& container) override;
  // Hub interfaces (VORIIPDAdapter, VORIIPDDataMgt, VORIIPDAttributeMgt) only in hub mode.
  HRESULT QueryInterface(const VORInterfaceId& iid, void** out) override;

  // The root process (answers VORISPPActivityRoot).
  VORBaseUnknown_var GetRootProcess();
  // The product aliased "PPRProduct" and the resource root aliased "PPRResources".
  VORBaseUnknown_var GetRootProduct();
  VORBaseUnknown_var GetResourceRoot();
  // The object with that id, or null.
  VORBaseUnknown* FindObject(const std::string& id);
  VORProcessStatistics GetStatistics();

  // The one door for changes.
  VORModelDoor& GetDoor();
  // The user steps made through the door, for undo and redo.
  VORUndoHistory& GetUndoHistory();
  // True after a change through the door since the last load or save.
  bool IsModified() const;
  void SetModified(bool modified);

  VORDocumentData& Data() { return *_data; }

 private:
  VORProcess();
  ~VORProcess() override;
  std::unique_ptr<VORDocumentData> _data;
};
VOR_DECLARE_HANDLE(VORProcess);
