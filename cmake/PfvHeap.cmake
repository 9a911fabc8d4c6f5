# The programs' heap: jemalloc with transparent huge pages (host/heap/VORHeapSettings.cpp says
# why). Sanitizer and fuzz builds keep their own allocator.
option(PFV_JEMALLOC "Link the programs, tests and benchmarks against jemalloc" ON)
if(PFV_SANITIZE OR PFV_FUZZ)
  set(PFV_JEMALLOC OFF)
endif()

if(PFV_JEMALLOC)
  find_package(PkgConfig REQUIRED)
  pkg_check_modules(JEMALLOC REQUIRED IMPORTED_TARGET jemalloc)
  add_library(pfv_heap OBJECT ${CMAKE_SOURCE_DIR}/host/heap/VORHeapSettings.cpp)
  target_link_libraries(pfv_heap PUBLIC PkgConfig::JEMALLOC PRIVATE pfv_warnings)
endif()

# pfv_use_product_heap(<executable>): the executable allocates as the pfv program does.
function(pfv_use_product_heap target)
  if(PFV_JEMALLOC)
    target_link_libraries(${target} PRIVATE pfv_heap)
  endif()
endfunction()
