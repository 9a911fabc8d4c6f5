// Identifier of an interface: its name plus the cast that tells whether an object answers it.
#pragma once

#include <cstddef>
#include <string_view>

class VORBaseUnknown;

struct VORInterfaceId {
  std::string_view name;
  // Returns the object seen as the interface (type-erased), or null when it does not implement it.
  void* (*cast)(VORBaseUnknown*);

  bool operator==(const VORInterfaceId& other) const { return name == other.name; }
};

// Declares the static interface identifier of an interface class.
#define VOR_DECLARE_INTERFACE(Interface)                                             \
 public:                                                                             \
  static const VORInterfaceId& IID() {                                               \
    static const VORInterfaceId id{#Interface, [](VORBaseUnknown* object) -> void* { \
                                     return dynamic_cast<Interface*>(object);        \
                                   }};                                               \
    return id;                                                                       \
  }
