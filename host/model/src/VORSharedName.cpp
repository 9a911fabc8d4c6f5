#include "VORSharedName.h"

#include <deque>
#include <mutex>
#include <unordered_map>

namespace {
// Spellings are few (the late types and link types in use) and live as long as the process:
// the pool is never freed, so a name stays valid in objects destroyed at exit.
struct Pool {
  std::mutex mutex;
  std::deque<VORSharedName::Entry> entries;  // a deque keeps addresses when it grows
  std::unordered_map<std::string_view, const VORSharedName::Entry*> index;
};

Pool& ThePool() {
  static Pool* pool = new Pool;
  return *pool;
}

const VORSharedName::Entry* Intern(std::string_view name) {
  Pool& pool = ThePool();
  const std::lock_guard<std::mutex> lock(pool.mutex);
  auto it = pool.index.find(name);
  if (it != pool.index.end())
    return it->second;
  VORSharedName::Entry& entry =
      pool.entries.emplace_back(VORSharedName::Entry{std::string(name), VORUnicodeString()});
  entry.decoded = VORUnicodeString(entry.name);
  pool.index.emplace(entry.name, &entry);
  return &entry;
}
}  // namespace

VORSharedName::VORSharedName() {
  static const Entry* const empty = Intern({});
  _entry = empty;
}

VORSharedName::VORSharedName(std::string_view name) : _entry(Intern(name)) {}
