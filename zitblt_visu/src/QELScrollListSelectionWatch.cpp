#include "QELScrollListSelectionWatch.h"

#include <map>
#include <string>
#include <unordered_map>
#include <utility>

#include "QELBaseScrollListZitBltRep.h"

namespace {
// A list is known by its activity and its ZitBlt name, which every item component carries. The
// few names a configuration uses are numbered once, so that registering the lists of a whole
// level hashes no text.
using ListKey = std::pair<const VORBaseUnknown*, int>;

struct ListKeyHash {
  size_t operator()(const ListKey& key) const {
    return std::hash<const void*>()(key.first) ^ (static_cast<size_t>(key.second) << 1);
  }
};

std::unordered_map<std::string, int>& NameNumbers() {
  static std::unordered_map<std::string, int> numbers;
  return numbers;
}

int NumberOf(const VORUnicodeString& name) {
  auto& numbers = NameNumbers();
  return numbers.try_emplace(name.ConvertToUTF8(), static_cast<int>(numbers.size())).first->second;
}

struct Watch {
  VORCSO_var cso;  // held: its address identifies the watch while lists use it
  VORCallbackId callback = 0;
  std::unordered_map<ListKey, QELBaseScrollListZitBltRep*, ListKeyHash> lists;
};

std::map<VORCSO*, Watch>& Watches() {
  static std::map<VORCSO*, Watch> watches;
  return watches;
}

// Where each list is routed from, so that Remove needs no search.
std::unordered_map<QELBaseScrollListZitBltRep*, std::pair<VORCSO*, ListKey>>& Routes() {
  static std::unordered_map<QELBaseScrollListZitBltRep*, std::pair<VORCSO*, ListKey>> routes;
  return routes;
}

ListKey KeyOf(QELIScrollListZitBltItemVisu* item) {
  return {item->GetAssociatedActivityNode(), NumberOf(item->GetZitBltName())};
}

// The list whose item the path names, or null.
QELBaseScrollListZitBltRep* ListOf(Watch& watch, VORBaseUnknown* element) {
  auto* path = dynamic_cast<VORPathElement*>(element);
  if (path == nullptr)
    return nullptr;
  QELIScrollListZitBltItemVisu_var item = path->SearchElement<QELIScrollListZitBltItemVisu>();
  if (!item)
    return nullptr;
  auto found = watch.lists.find(KeyOf(item));
  return found != watch.lists.end() ? found->second : nullptr;
}

void Route(VORCSO* cso, VORNotification* notification) {
  auto* change = dynamic_cast<VORCSOChangeNotification*>(notification);
  auto watch = Watches().find(cso);
  if (change == nullptr || watch == Watches().end())
    return;
  // Removals first, as a list does for its own notification.
  for (const VORBaseUnknown_var& element : change->GetRemovedElements()) {
    if (QELBaseScrollListZitBltRep* list = ListOf(watch->second, element))
      list->ValidateAddRemElem(dynamic_cast<VORPathElement*>(element.get()), 1);
  }
  for (const VORBaseUnknown_var& element : change->GetAddedElements()) {
    if (QELBaseScrollListZitBltRep* list = ListOf(watch->second, element))
      list->ValidateAddRemElem(dynamic_cast<VORPathElement*>(element.get()), 0);
  }
}
}  // namespace

namespace QELScrollListSelectionWatch {

void Add(VORCSO* cso, QELBaseScrollListZitBltRep* rep) {
  if (cso == nullptr || rep == nullptr)
    return;
  Remove(rep);
  Watch& watch = Watches()[cso];
  if (!watch.cso) {
    watch.cso = cso;
    watch.callback = cso->GetEventPublisher()->AddCallback(
        VORCSOChangeNotification::ClassName(),
        [cso](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
          Route(cso, n);
        },
        nullptr, &watch);
  }
  const ListKey key{rep->GetOwner(), NumberOf(rep->GetName())};
  watch.lists[key] = rep;
  Routes()[rep] = {cso, key};
}

void Remove(QELBaseScrollListZitBltRep* rep) {
  auto route = Routes().find(rep);
  if (route == Routes().end())
    return;
  auto watch = Watches().find(route->second.first);
  if (watch != Watches().end()) {
    auto list = watch->second.lists.find(route->second.second);
    if (list != watch->second.lists.end() && list->second == rep)
      watch->second.lists.erase(list);
    if (watch->second.lists.empty()) {
      watch->second.cso->GetEventPublisher()->RemoveCallback(watch->second.callback);
      Watches().erase(watch);
    }
  }
  Routes().erase(route);
}

int WatchedListCount() {
  return static_cast<int>(Routes().size());
}

}  // namespace QELScrollListSelectionWatch
