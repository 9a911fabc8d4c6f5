// A short list of plain values kept inside its owner up to N entries, on the heap beyond: a
// chart node has one or two links, and a heap block per node for them is what opening a large
// chart spends its time on.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <type_traits>
#include <vector>

template <class T, std::size_t N>
class QELPertInlineList {
  static_assert(std::is_trivially_copyable_v<T>);

 public:
  const T* begin() const { return _heap.empty() ? _inline.data() : _heap.data(); }
  const T* end() const { return begin() + _size; }
  std::size_t size() const { return _size; }
  bool empty() const { return _size == 0; }

  void push_back(T value) {
    if (_heap.empty() && _size < N) {
      _inline[_size++] = value;
      return;
    }
    // Once spilled, the heap holds every entry (until the list is emptied).
    if (_heap.empty()) {
      _heap.reserve(2 * N);
      _heap.assign(_inline.begin(), _inline.begin() + static_cast<std::ptrdiff_t>(_size));
    }
    _heap.push_back(value);
    ++_size;
  }
  // Removes every entry equal to value; the others keep their order.
  void Remove(T value) {
    T* first = _heap.empty() ? _inline.data() : _heap.data();
    _size = static_cast<std::size_t>(std::remove(first, first + _size, value) - first);
    if (!_heap.empty())
      _heap.resize(_size);
  }
  void clear() {
    _size = 0;
    _heap.clear();
  }

 private:
  std::array<T, N> _inline {};
  std::size_t _size = 0;
  std::vector<T> _heap;
};
