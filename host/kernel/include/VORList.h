// The host's 1-based lists. Locate returns 0 when a value is absent; positions out of range are
// fatal. Lists of handles compare by object identity. A list returned through a pointer is owned
// by the receiver.
#pragma once

#include <algorithm>
#include <cstddef>
#include <unordered_set>
#include <utility>
#include <vector>

#include "VORAssert.h"

template <class T, class Equal = std::equal_to<T>>
class VORList {
 public:
  using value_type = T;

  int Size() const { return static_cast<int>(_items.size()); }
  bool IsEmpty() const { return _items.empty(); }

  void Append(const T& value) { _items.push_back(value); }
  void Append(T&& value) { _items.push_back(std::move(value)); }
  void Append(const VORList& other) {
    _items.insert(_items.end(), other._items.begin(), other._items.end());
  }
  // Inserts before position (1..Size()+1).
  void InsertAt(int position, const T& value) {
    VOR_ASSERT(position >= 1 && position <= Size() + 1);
    _items.insert(_items.begin() + (position - 1), value);
  }

  T& operator[](int position) { return _items[Index(position)]; }
  const T& operator[](int position) const { return _items[Index(position)]; }

  // Position (1-based) of the first value equal to value at or after from, 0 when absent.
  int Locate(const T& value, int from = 1) const {
    for (int i = std::max(from, 1); i <= Size(); ++i) {
      if (Equal()(_items[static_cast<size_t>(i - 1)], value))
        return i;
    }
    return 0;
  }
  // Removes the first value equal to value; returns its former position, 0 when absent.
  int RemoveValue(const T& value) {
    int position = Locate(value);
    if (position != 0)
      RemovePosition(position);
    return position;
  }
  void RemovePosition(int position) { _items.erase(_items.begin() + Index(position)); }
  void RemoveAll() { _items.clear(); }

  // Keeps the first occurrence of every value, in order.
  template <class Hash = std::hash<T>>
  void RemoveDuplicates() {
    if (_items.size() <= kCompareInPlace) {
      // A short list (a ZitBlt's few rows) is compared in place: no set, no second vector.
      size_t kept = 0;
      for (size_t i = 0; i < _items.size(); ++i) {
        bool seen = false;
        for (size_t j = 0; j < kept && !seen; ++j)
          seen = Equal()(_items[j], _items[i]);
        if (seen)
          continue;
        if (kept != i)
          _items[kept] = std::move(_items[i]);
        ++kept;
      }
      _items.erase(_items.begin() + static_cast<std::ptrdiff_t>(kept), _items.end());
      return;
    }
    std::unordered_set<T, Hash, Equal> seen;
    std::vector<T> kept;
    kept.reserve(_items.size());
    for (const T& v : _items) {
      if (seen.insert(v).second)
        kept.push_back(v);
    }
    _items.swap(kept);
  }

  // Appends to result the values of this list that other also holds, in this list's order.
  void Intersection(const VORList& other, VORList& result) const {
    for (const T& v : _items) {
      if (other.Locate(v) != 0)
        result.Append(v);
    }
  }

  void Swap(int i, int j) { std::swap(_items[Index(i)], _items[Index(j)]); }

  auto begin() { return _items.begin(); }
  auto end() { return _items.end(); }
  auto begin() const { return _items.begin(); }
  auto end() const { return _items.end(); }
  void Reserve(int n) { _items.reserve(static_cast<size_t>(n)); }

 private:
  // Lists up to this long drop duplicates by comparing each value with those kept.
  static constexpr size_t kCompareInPlace = 16;

  size_t Index(int position) const {
    VOR_ASSERT(position >= 1 && position <= Size());
    return static_cast<size_t>(position - 1);
  }

  std::vector<T> _items;
};
