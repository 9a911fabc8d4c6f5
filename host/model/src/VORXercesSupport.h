// Pieces shared by the DOM parse and the streaming parse.
#pragma once

#include <xercesc/framework/MemoryManager.hpp>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/PlatformUtils.hpp>

#include <cstddef>
#include <cstdlib>

// Counts the bytes the parser holds and refuses more than the budget.
class VORBudgetMemoryManager : public xercesc::MemoryManager {
 public:
  explicit VORBudgetMemoryManager(std::size_t budget) : _budget(budget) {}
  xercesc::MemoryManager* getExceptionMemoryManager() override {
    return xercesc::XMLPlatformUtils::fgMemoryManager;
  }
  void* allocate(XMLSize_t size) override {
    if (_used + size > _budget)
      throw xercesc::OutOfMemoryException();
    auto* block = static_cast<std::size_t*>(std::malloc(size + sizeof(std::max_align_t)));
    if (block == nullptr)
      throw xercesc::OutOfMemoryException();
    *block = size;
    _used += size;
    return reinterpret_cast<char*>(block) + sizeof(std::max_align_t);
  }
  void deallocate(void* p) override {
    if (p == nullptr)
      return;
    auto* block = reinterpret_cast<std::size_t*>(static_cast<char*>(p) - sizeof(std::max_align_t));
    _used -= *block;
    std::free(block);
  }

 private:
  std::size_t _budget;
  std::size_t _used = 0;
};
