// dynamic_cast for the hot paths: a dynamic_cast across the libraries walks the class graph and
// compares type names, and some callers cast once per node and change. The way from a pointer
// to T depends only on the complete object's dynamic type and on where the pointer sits in it,
// so each such pair is cast once per thread and its offset remembered.
#pragma once

#include <cstddef>
#include <cstdint>
#include <typeinfo>
#include <vector>

// dynamic_cast<T*>(object); null for a null object.
template <class T, class From>
T* VORDynamicCast(From* object) {
  if (object == nullptr)
    return nullptr;
  struct Way {
    const std::type_info* type;
    std::ptrdiff_t from;  // where object sits in its complete object
    std::ptrdiff_t to;    // where the T sits in it; kNone when the object is no T
  };
  constexpr std::ptrdiff_t kNone = PTRDIFF_MIN;
  thread_local std::vector<Way> ways;
  thread_local size_t last = 0;
  auto* top = static_cast<char*>(dynamic_cast<void*>(object));
  const std::type_info* type = &typeid(*object);
  const std::ptrdiff_t from = reinterpret_cast<char*>(object) - top;
  auto matches = [&](const Way& w) { return w.type == type && w.from == from; };
  if (last >= ways.size() || !matches(ways[last])) {
    last = 0;
    while (last < ways.size() && !matches(ways[last]))
      ++last;
    if (last == ways.size()) {
      T* cast = dynamic_cast<T*>(object);
      ways.push_back(Way{type, from, cast ? reinterpret_cast<char*>(cast) - top : kNone});
    }
  }
  const std::ptrdiff_t to = ways[last].to;
  return to == kNone ? nullptr : reinterpret_cast<T*>(top + to);
}
