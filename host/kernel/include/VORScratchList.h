// A list of handles borrowed for the length of a scope. Queries that fill a list only to walk it
// once (the ZitBlt lists of every station of a level) reuse the lists, and their room, of earlier
// borrowers instead of allocating new ones. Borrowers nest freely: each gets a list of its own,
// empty, and what it holds is released when the scope ends.
#pragma once

#include <memory>

#include "VORLists.h"

class VORScratchList {
 public:
  VORScratchList();
  ~VORScratchList();
  VORScratchList(const VORScratchList&) = delete;
  VORScratchList& operator=(const VORScratchList&) = delete;

  VORListValVORBaseUnknown_var& operator*() const { return *_list; }
  VORListValVORBaseUnknown_var* operator->() const { return _list.get(); }

 private:
  std::unique_ptr<VORListValVORBaseUnknown_var> _list;
};
