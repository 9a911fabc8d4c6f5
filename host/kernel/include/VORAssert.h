// Fatal assertions: print "AssertionFailed:<condition>", the source module path and the line
// to stderr, then abort.
#pragma once

[[noreturn]] void VORAssertionFailed(const char* condition, const char* module, int line);

#define VOR_ASSERT(cond) \
  ((cond) ? static_cast<void>(0) : VORAssertionFailed(#cond, __FILE__, __LINE__))
// With an explicit module path and line, for assertions whose report is part of the product.
#define VOR_ASSERT_AT(cond, module, line) \
  ((cond) ? static_cast<void>(0) : VORAssertionFailed(#cond, module, line))
