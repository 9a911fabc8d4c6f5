#include "VORScratchList.h"

#include <vector>

namespace {
// Lists kept for reuse, and the most of them: nested borrowers are few.
constexpr size_t kKeptLists = 16;
// A list that held more than this gives its room back rather than keep it for a short list.
constexpr int kKeptRoom = 256;

std::vector<std::unique_ptr<VORListValVORBaseUnknown_var>>& FreeLists() {
  thread_local std::vector<std::unique_ptr<VORListValVORBaseUnknown_var>> lists;
  return lists;
}
}  // namespace

VORScratchList::VORScratchList() {
  auto& free = FreeLists();
  if (free.empty()) {
    _list = std::make_unique<VORListValVORBaseUnknown_var>();
  } else {
    _list = std::move(free.back());
    free.pop_back();
  }
}

VORScratchList::~VORScratchList() {
  auto& free = FreeLists();
  if (_list->Size() > kKeptRoom || free.size() >= kKeptLists)
    return;  // the list goes with its room
  _list->RemoveAll();
  if (free.empty())
    free.reserve(kKeptLists);
  free.push_back(std::move(_list));
}
