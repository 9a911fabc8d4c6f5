// A set of a few small values (object identities) that keeps its first ones inline and compares
// them one by one, and hashes only past that: the items and inputs of one activity are a
// handful, for which a hash set allocated a block per value.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <memory>
#include <unordered_set>

template <class T, std::size_t N = 8>
class VORSmallSet {
 public:
  // True when value was not in the set yet.
  bool Insert(const T& value) {
    if (_hashed)
      return _hashed->insert(value).second;
    if (Contains(value))
      return false;
    if (_count < N) {
      _inline[_count++] = value;
      return true;
    }
    _hashed = std::make_unique<std::unordered_set<T>>(_inline.begin(), _inline.end());
    return _hashed->insert(value).second;
  }
  bool Contains(const T& value) const {
    if (_hashed)
      return _hashed->count(value) != 0;
    const auto end = _inline.begin() + static_cast<std::ptrdiff_t>(_count);
    return std::find(_inline.begin(), end, value) != end;
  }
  std::size_t Size() const { return _hashed ? _hashed->size() : _count; }

 private:
  std::array<T, N> _inline {};
  std::size_t _count = 0;
  std::unique_ptr<std::unordered_set<T>> _hashed;  // once more than N values were inserted
};
