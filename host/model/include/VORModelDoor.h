// The one door for changes of a process document: every mutation of the model (create,
// remove, link, assign, reparent, move, set) is made here. Each operation validates first and
// changes nothing when it fails, marks the document modified, emits its notifications after
// the change, and, while a change log is attached, records its inverse, so that whole user
// commands can be undone and redone.
#pragma once

#include <functional>
#include <optional>
#include <string>
#include <type_traits>
#include <vector>

#include "VORHandle.h"
#include "VORLists.h"
#include "VORModelTypes.h"

class VORProcess;
class VORModelDoor;
struct VORDocumentData;

// Inverses of the changes made while it was attached, in order. A log belongs to one document
// and must not be replayed after that document is gone.
class VORChangeLog {
 public:
  int Size() const { return static_cast<int>(_inverses.size()); }
  bool IsEmpty() const { return _inverses.empty(); }
  void Clear() { _inverses.clear(); }
  // Moves other's inverses after this log's own (a nested step joins its command).
  void Append(VORChangeLog&& other) {
    for (auto& f : other._inverses)
      _inverses.push_back(std::move(f));
    other._inverses.clear();
  }

 private:
  friend class VORModelDoor;
  std::vector<std::function<void()>> _inverses;
};

class VORModelDoor {
 public:
  explicit VORModelDoor(VORProcess* document) : _document(document) {}

  // Attaches a log (null detaches). Returns the previous one.
  VORChangeLog* SetRecorder(VORChangeLog* log);
  VORChangeLog* GetRecorder() const { return _recorder; }
  // Runs the inverses of log, newest first, through the door (notifying), empties log, and
  // records the inverse of the undo (the redo) into redo when given.
  void Undo(VORChangeLog& log, VORChangeLog* redo = nullptr);

  // Graph nodes. type: an activity type, "Start" or "Stop". position 0 appends.
  HRESULT CreateNode(VORBaseUnknown* father, const char* type, VORBaseUnknown_var& node,
                     int position = 0, const char* id = nullptr);
  // Removes the node with its subtree, flows, product IOs and every link to any of them.
  HRESULT RemoveNode(VORBaseUnknown* node);
  HRESULT AddFlow(VORBaseUnknown* from, VORBaseUnknown* to);
  // Removes from -> to (only that direction). S_FALSE when absent.
  HRESULT RemoveFlow(VORBaseUnknown* from, VORBaseUnknown* to);
  HRESULT SetLabel(VORBaseUnknown* node, const VORUnicodeString& label);
  HRESULT SetActivityTime(VORBaseUnknown* activity, double time);
  HRESULT SetStationCycleTime(VORBaseUnknown* station, double time);
  HRESULT SetPertPosition(VORBaseUnknown* node, bool has, double x, double y);
  HRESULT SetPertNodeState(VORBaseUnknown* node, int state);
  HRESULT SetPertNodeSize(VORBaseUnknown* node, double w, double h);
  HRESULT SetUserAttribute(VORBaseUnknown* activity, const VORUnicodeString& name,
                           const VORAttributeValue& value);
  // The recorded visibility of an activity's ZitBlt (or "All"); nullopt forgets it.
  HRESULT SetZitBltShown(VORBaseUnknown* activity, const VORUnicodeString& name,
                         std::optional<bool> shown);

  // Product inputs / outputs.
  HRESULT AddProductIO(VORBaseUnknown* activity, VORBaseUnknown* item, bool input,
                       VORBaseUnknown_var& productIO, const char* id = nullptr);
  HRESULT RemoveProductIO(VORBaseUnknown* productIO);
  HRESULT SetProductIOItem(VORBaseUnknown* productIO, VORBaseUnknown* item);

  // Assignments.
  HRESULT AssignItem(VORBaseUnknown* activity, VORBaseUnknown* item,
                     VORBaseUnknown* productInput = nullptr);
  HRESULT UnassignItem(VORBaseUnknown* activity, VORBaseUnknown* item);
  HRESULT AssignResource(VORBaseUnknown* activity, VORBaseUnknown* resource);
  HRESULT UnassignResource(VORBaseUnknown* activity, VORBaseUnknown* resource);

  // Products and resources.
  HRESULT CreateProduct(VORBaseUnknown* father, const VORUnicodeString& name,
                        VORBaseUnknown_var& product, const char* id = nullptr);
  // Removes the product with its subtree; first every product IO, assignment and component
  // link that refers to one of them.
  HRESULT RemoveProduct(VORBaseUnknown* product);
  HRESULT ReparentProduct(VORBaseUnknown* product, VORBaseUnknown* newFather);
  HRESULT SetPartNumber(VORBaseUnknown* product, const VORUnicodeString& name);
  HRESULT SetAlias(VORBaseUnknown* product, const VORUnicodeString& alias);
  HRESULT SetShown(VORBaseUnknown* product, bool shown);
  HRESULT SetReferenceProduct(VORBaseUnknown* product, VORBaseUnknown* reference);
  // Makes product a resource (S_FALSE when it already is one).
  HRESULT MakeResource(VORBaseUnknown* product, const VORUnicodeString& resourceClass,
                       const VORUnicodeString& planType);
  HRESULT SetResourcePlanType(VORBaseUnknown* resource, const VORUnicodeString& planType);

  // Manufacturing assemblies.
  HRESULT CreateMfgAssembly(const VORUnicodeString& name, VORBaseUnknown_var& assembly,
                            const char* id = nullptr);
  // Dispatches "MADeleting" first, then removes the assembly and every link to it.
  HRESULT DeleteMfgAssembly(VORBaseUnknown* assembly);
  HRESULT AddComponent(VORBaseUnknown* assembly, VORBaseUnknown* component);
  HRESULT RemoveComponent(VORBaseUnknown* assembly, VORBaseUnknown* component);

  // Planning data (hub mode).
  HRESULT SetEnvironmentName(const VORUnicodeString& name);
  HRESULT DefinePlanType(const VORUnicodeString& name, VORBaseUnknown_var& planType,
                         const char* id = nullptr);
  // name "name" renames; key empty for plain attributes.
  HRESULT SetPlanTypeAttribute(VORBaseUnknown* planType, const VORUnicodeString& key,
                               const VORUnicodeString& name, const VORUnicodeString& value);
  HRESULT SetPlanTypeBase(VORBaseUnknown* planType, VORBaseUnknown* base);
  HRESULT AddPlanTypeRelation(VORBaseUnknown* from, const VORUnicodeString& relation,
                              VORBaseUnknown* to);
  HRESULT RemovePlanTypeRelation(VORBaseUnknown* from, const VORUnicodeString& relation,
                                 VORBaseUnknown* to);
  HRESULT SetHubAttribute(VORBaseUnknown* object, const VORUnicodeString& name,
                          const VORAttributeValue& value);
  HRESULT DeleteHubObject(VORBaseUnknown* object);

  VORProcess* GetDocument() const { return _document; }
  // Number of successful changes since the document was made (tests, dirty tracking).
  long ChangeCount() const { return _changes; }

 private:
  void Record(std::function<void()> inverse);
  void Changed();
  VORDocumentData* Data() const;
  // The scalar setters' common body (defined with the door's private helpers).
  template <class Impl, class Owner, class Value, class Arg>
  HRESULT SetScalar(Impl* object, Value Owner::*field, std::type_identity_t<Arg> value,
                    const char* what, HRESULT (VORModelDoor::*again)(VORBaseUnknown*, Arg));

  VORProcess* _document;
  VORChangeLog* _recorder = nullptr;
  long _changes = 0;
};
